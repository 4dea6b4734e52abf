#pragma once

#include "common/ResultDesk.h"
#include "order/KeptPictures.h"

#include <QHash>
#include <QObject>

#include <deque>
#include <stop_token>

namespace lumora {

// Copies what is chosen from cards into the folder of the order, byte for byte, in the background and one after the
// other. Lives in one thread; a card that hangs holds nobody.
class CardCopies : public QObject {
    Q_OBJECT
public:
    enum class State {
        Unknown, // never wanted
        Waiting,
        Kept,    // whole, and on the disk
        Missing, // the card does not give it any more: it was taken out, or another one lies there
        NotKept, // this machine's disk did not take it
    };
    struct Picture {
        QString path; // as the basket has it
        PictureSource source;
    };

    CardCopies(const Files& files, const DrivePath& orderFolder);
    ~CardCopies() override;

    // These in this order, and nothing else any more. again: also what has failed before.
    void want(const std::vector<Picture>& chosen, bool again);
    State stateOf(const QString& path) const { return m_copies.value(path).state; }
    Failure failureOf(const QString& path) const { return m_copies.value(path).failure; }

Q_SIGNALS:
    // Kept, missing or not kept.
    void settled(const QString& path);

private:
    struct Copy {
        State state = State::Unknown;
        Failure failure;
        bool inHand = false;
        PictureStamp stamp = {}; // of the picture that is meant
    };

    static Copy copyWhole(const Picture& picture, const HostPath& target, const std::stop_token& stop);
    bool isKept(const Picture& picture) const;
    void startNext();
    void settle(const QString& path, const Copy& copy);

    KeptPictures m_kept;
    QHash<QString, Copy> m_copies;
    std::deque<Picture> m_queue;
    bool m_running = false;
    std::stop_source m_stop;
    ResultDesk<CardCopies> m_desk{this};
};

} // namespace lumora
