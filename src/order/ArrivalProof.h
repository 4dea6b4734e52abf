#pragma once

#include <QList>
#include <QString>
#include <QStringList>

#include <optional>

namespace lumora {

// How much of an order its sending has brought to the server.
enum class Arrival {
    Whole,  // all that belongs to it
    Agreed, // all files of its folder; the customer has agreed that its log names more pictures
    Part,   // less, as a chosen part
};

// A file of an order as it lies here, and an entry of what the lab's server has: leaf names, lengths in bytes.
struct LocalFile {
    QString name;
    qint64 length = 0;
};
struct RemoteFile {
    QString name;
    std::optional<qint64> length; // of a listing, SIZE or HEAD; none where nothing tells it
};

// What proves that an order has arrived: each of its names lies on the server, and each as long as the file here where
// a length is told. Further names there prove and disprove nothing.
struct ArrivalProof {
    // After so many names in a row without a length told a server is not asked for further ones.
    static constexpr int mostUnanswered = 3;

    // FTP takes names as they stand; HTTP servers may change their letter case.
    enum class Names { Exact, WithoutCase };
    // here: names that come twice count once. there: where a name comes twice, the longest length is believed, and an
    // entry of the very name is taken before one of another letter case.
    static ArrivalProof of(const QList<LocalFile>& here, const QList<RemoteFile>& there, Names names);

    // Not there, or without a length though the server tells that of another file of the same ending: one refused
    // answer is no proof. A server may pack texts and tell no lengths of them alone.
    QStringList missing;
    QStringList broken;     // shorter or longer than here: to be removed and sent again
    QStringList byLength;   // proven
    QStringList byName;     // there, with no length told
    QStringList commonName; // 000.jpg, which all orders of a workspace share: proven by its name alone

    bool proven() const { return missing.isEmpty() && broken.isEmpty(); }
    bool provenByNameOnly() const { return proven() && !byName.isEmpty(); }
};

} // namespace lumora
