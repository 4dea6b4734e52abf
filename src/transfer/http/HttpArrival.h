#pragma once

#include <QMap>
#include <QString>
#include <QStringList>

namespace lumora {

class OrderFolder;
struct Platform;
struct SendingStop;
struct SessionState;

// What proves that files lie whole on the web server: their names in its list and, where HEAD tells one, their lengths.
// As built in nothing is asked, and the list decides.
class HttpArrival {
public:
    HttpArrival(const SessionState& state, const Platform& platform, const SendingStop& stop)
        : m_state(state)
        , m_platform(platform)
        , m_stop(stop) {}

    void beginOrder();
    // The file is put on the line again, so that an earlier proof of it is none any more.
    void forget(const QString& path);
    // paths: full local paths, each of which the list names. entries: of the list. uploads: address of the order's
    // folder on the server, with its last slash. Gives the paths that are shorter or longer there, and those whose
    // asking was cut; none as built in. A file that is proven is not asked for again.
    QStringList unproven(const QStringList& paths, const QStringList& entries, const QString& uploads);
    // True when files of these names hold all that the order's log names; as built in, always.
    bool isWholeOrder(const OrderFolder& order, const QStringList& names) const;
    // A file at least was proven by its name alone.
    bool byNameOnly() const;

private:
    struct Asked;
    Asked ask(const QString& name, const QStringList& entries, const QString& uploads) const;

    const SessionState& m_state;
    const Platform& m_platform;
    const SendingStop& m_stop;
    QMap<QString, qint64> m_proven; // lengths by path
    bool m_byName = false;
};

} // namespace lumora
