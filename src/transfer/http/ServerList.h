#pragma once

#include <QString>
#include <QStringList>

namespace lumora {

// The entries of a listing that the lab's scripts write: names parted by "~~", the folder's own name and "total:" with
// a number among them. A text of 35 characters or fewer is an answer and no listing: it has no entries.
QStringList ParseServerList(const QString& text);

// The files of the order that a listing does not name. A file counts as arrived when its name contains an entry, letter
// case aside: a short entry thus takes a longer name with it. The folder's own name and the total name no file and are
// passed over, or the folder's name would take the order's log, which begins with it. files are full paths.
QStringList MarkHossarim(const QStringList& files, const QStringList& entries, const QString& folderName);

// What a check of the server said of an order.
enum class ServerVerdict : int {
    OtherFolder = -1, // the first file lies elsewhere than in the order's folder
    NotVerified = 0,  // no list of this folder, or one without a total
    Listed = 1,
};

// What an answer says of a folder.
struct ServerAnswer {
    ServerVerdict verdict = ServerVerdict::NotVerified; // Listed: the list names the folder and carries a total
    QStringList entries;                                // none where the answer says that the folder is unknown
    bool namesFolder = false; // with or without a total; the number behind the total is compared with nothing
};
ServerAnswer ReadServerAnswer(const QString& answer, const QString& folderName);

// The list file of a number on the server: 0 to 3; any other has none and gives an empty name.
QString ListFileName(int number);

} // namespace lumora
