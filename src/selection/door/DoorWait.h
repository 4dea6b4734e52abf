#pragma once

#include <QString>
#include <QStringList>

#include <functional>

namespace lumora {

class PictureDoor;
struct SessionState;

// The end of choosing waits until all that is chosen is made: what the panel of this wait counts, what follows, and
// what is told of pictures that can't be made. Knows no control.
class DoorWait {
public:
    DoorWait(const SessionState& state, const PictureDoor& door);

    enum class Then { Wait, GoOn, TellNotMade };
    // The customer has pressed "finish", or one of the chosen paths has settled in a wait.
    // isCopied: of one that is being copied from a card, which is waited for too.
    Then count(const QStringList& chosen, const std::function<bool(const QString&)>& isCopied = {});
    // The customer goes back to the pictures.
    void stop() { m_waits = false; }
    bool waits() const { return m_waits; }
    // Of the chosen pictures, those that wait no more: from 0 to 1, and as words.
    double share() const;
    QString counted() const;

    // A picture that the disk has not taken is told at once, before "finish", but once only.
    bool tellsAtOnce(const QString& path);
    // The first that is not made after a count.
    const QString& notMade() const { return m_notMade; }
    QString notMadeWords(const QString& path) const;

    void takeOut(const QString& name) { m_takenOut += name; }
    // What was taken out of the order since the last time; empty where there was nothing.
    QString takenOutWords();

private:
    const SessionState& m_state;
    const PictureDoor& m_door;
    bool m_waits = false;
    bool m_toldAtOnce = false;
    qsizetype m_chosen = 0;
    qsizetype m_waiting = 0;
    QString m_notMade;
    QStringList m_takenOut; // names
};

} // namespace lumora
