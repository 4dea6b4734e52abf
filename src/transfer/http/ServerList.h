#pragma once

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <optional>

namespace lumora {

// The text of a script's answer or of a list file, without the byte order mark that some scripts begin with.
QString ServerText(const QByteArray& bytes);

// The entries of a listing by the lab's scripts: names separated by "~~", among them the folder's name and "total:"
// with a number. A text of at most 35 characters is no listing and has no entries.
QStringList ParseServerList(const QString& text);

enum class ListMatch {
    Part, // an entry stands for a name that contains it, so that a short entry also stands for a longer name
    Whole,
};

// The files of the order that a listing lacks, as full paths. A file has arrived when an entry matches its name,
// regardless of case. The folder's name and the total are skipped: the log's name begins with the folder's name.
QStringList MarkHossarim(const QStringList& files, const QStringList& entries, const QString& folderName,
                         ListMatch match = ListMatch::Part);

// The result of a check of the server.
enum class ServerVerdict : int {
    OtherFolder = -1, // the first file does not lie in the order's folder
    NotVerified = 0,  // no list of the folder, or one without a total
    Listed = 1,
};

// What an answer of the server tells about a folder.
struct ServerAnswer {
    ServerVerdict verdict = ServerVerdict::NotVerified; // Listed: the list names the folder and has a total
    QStringList entries;                                // empty when the folder is unknown to the server
    bool namesFolder = false;                           // with or without a total, whose number is not compared
    // Names in the folder but for the server's own lists; empty where there is no folder. No value: the answer does
    // not tell. A listing that is too short to have entries can still tell of an empty folder.
    std::optional<QStringList> files;
};
// A script's words that it has no such folder: "not" in a text of at most 35 characters that is neither a list nor a
// page of a web server.
bool TellsUnknownFolder(const QString& answer);
ServerAnswer ReadServerAnswer(const QString& answer, const QString& folderName);

// The name of the server's list file 0 to 3; empty for any other number.
QString ListFileName(int number);
// The second list file, which is kept beside the orders.
QString SecondListName();

// The name, then the entries that differ from it in letter case alone: a server that changes the case may know the file
// under the name of its list only.
QStringList NamesAsListed(const QString& name, const QStringList& entries);

// A leaf name as it stands in an address: "%", "#" and "?" would end its path or begin an escape.
QString NameInAddress(const QString& name);

} // namespace lumora
