#pragma once

#include <QMap>
#include <QString>
#include <QStringList>

#include <optional>

namespace lumora {

class OrderFolder;
class SilenceLimit;
struct OrderCompleteness;
struct Platform;
struct SendingStop;
struct SessionState;

// What proves that files lie whole on the web server: their names in its list and, where HEAD tells one, their lengths.
// As built in nothing is asked, and the list decides. Of a post that was not confirmed half a file may lie there under
// its name.
class HttpArrival {
public:
    HttpArrival(const SessionState& state, const Platform& platform, const SendingStop& stop, SilenceLimit& silence)
        : m_state(state)
        , m_platform(platform)
        , m_stop(stop)
        , m_silence(silence) {}

    // inHand: files whose post an ended program did not confirm. All names are full local paths.
    void beginOrder(const QStringList& inHand);
    // Around each post. A file that is posted again is no longer proven by an earlier check.
    void postBegins(const QString& path);
    void postConfirmed(const QString& path) { m_leftBehind.removeAll(path); }
    // The post was cut, or answered outside 200 to 299. As built in, a list that names the file confirms it.
    void postUnconfirmed(const QString& path);
    bool isLeftBehind(const QString& path) const { return m_leftBehind.contains(path); }

    // What the list tells of the order's folder: its entries, and the folder's address with its last slash.
    struct Listed {
        QStringList entries;
        QString uploads;
    };
    // Of the files that the list names, those that were left behind and that HEAD does not prove.
    QStringList remains(const QStringList& paths, const Listed& there);
    // Of the files that the list names, those that are shorter or longer there, that HEAD does not find, or whose
    // asking was cut. A file that is proven is not asked for again.
    QStringList unproven(const QStringList& paths, const Listed& there);

    // The prints that the order's log names and those of these names, where names are fewer; as built in, never.
    std::optional<OrderCompleteness> lacking(const OrderFolder& order, const QStringList& names) const;
    // True when the name alone proved at least one file.
    bool byNameOnly() const;

private:
    struct Asked;
    Asked ask(const QString& name, const Listed& there);
    std::optional<bool> knowsHead(const Listed& there); // no value where the asking was cut

    const SessionState& m_state;
    const Platform& m_platform;
    const SendingStop& m_stop;
    SilenceLimit& m_silence;
    QStringList m_leftBehind;
    QMap<QString, qint64> m_proven;  // lengths by path
    std::optional<bool> m_knowsHead; // once it was asked for
    bool m_byName = false;
};

} // namespace lumora
