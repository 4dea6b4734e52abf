#pragma once

#include "order/ArrivalProof.h"

#include <QStringList>

#include <optional>

namespace lumora {

class Files;
class FtpConnection;
struct SessionState;

// What proves that files lie whole on the FTP server: their names in a listing of the order's folder and, where the
// listing or SIZE tells one, their lengths. As built in nothing is asked, and the count of names decides.
// Wherever a connection is given, it stands in the order's folder, and "there" is the listing of that folder.
class FtpArrival {
public:
    FtpArrival(const SessionState& state, const Files& files)
        : m_state(state)
        , m_files(files) {}

    void beginOrder();

    // True when the proof decides in place of the count.
    bool decides() const;
    // A file that the server has under another length. Never 000.jpg, which all orders share.
    bool isOther(FtpConnection& connection, const QString& path, const QList<RemoteFile>& there);
    // A file that is proven to lie there by its length.
    bool isWhole(FtpConnection& connection, const QString& path, const QList<RemoteFile>& there);
    // Of the files of a sending: full local paths. No value as built in, and where the line was cut meanwhile.
    std::optional<ArrivalProof> proofOf(FtpConnection& connection, const QStringList& paths,
                                        const QList<RemoteFile>& there);
    // After a put that was answered well: true where the server has stored it with other line ends. Asked for the
    // first file of an order alone.
    bool lineEndsChanged(FtpConnection& connection, const QString& path, const QStringList& paths,
                         const QList<RemoteFile>& there);
    // True when one way of changing line ends explains each file of the proof that is broken, of which there is one at
    // least, and no file that lies there whole disproves it.
    bool lineEndsExplain(const ArrivalProof& proof, const QStringList& paths) const;

private:
    struct Found {
        qint64 here = 0;
        std::optional<qint64> there;
    };
    std::optional<Found> lengthsOf(FtpConnection& connection, const QString& path, const QList<RemoteFile>& there);
    std::optional<qint64> ask(FtpConnection& connection, const QString& name);
    std::optional<qint64> lengthAfterPut(FtpConnection& connection, const QString& name);
    bool oneWayExplains(const QStringList& changed, const QList<RemoteFile>& there, const QStringList& whole) const;

    const SessionState& m_state;
    const Files& m_files;
    bool m_cut = false;      // the line, while SIZE was asked
    int m_unanswered = 0;    // names for which SIZE told no length, before it told one
    bool m_answered = false; // SIZE has told a length of this order
    bool m_firstLooked = false;
    QList<RemoteFile> m_lengths; // of the last proof
};

} // namespace lumora
