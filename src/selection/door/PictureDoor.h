#pragma once

#include "common/DoorRules.h"
#include "common/DrivePath.h"
#include "common/Result.h"
#include "common/ResultDesk.h"
#include "door/DoorDecoder.h"
#include "imaging/Bitmap.h"
#include "order/KeptPictures.h"
#include "platform/files/HostPath.h"

#include <QHash>
#include <QObject>
#include <QStringList>

#include <deque>
#include <functional>
#include <stop_token>
#include <utility>

namespace lumora {

// Stands between the pictures that a customer brings and the pages: a page lists the customer's own files, and works
// with a .jpg in the code page in the place of each. That is the file itself where it needs nothing; else a file of the
// order's folder, which is made in the background, once it is wanted. Lives in one thread.
class PictureDoor : public QObject {
    Q_OBJECT
public:
    enum class State {
        InPlace,    // the file itself
        Waiting,    // not made yet
        Ready,      // made
        Unreadable, // no picture, or a damaged one
        NotMade,    // the disk did not take it, or the file is not there; tried again when it is wanted again
    };

    PictureDoor(const Files& files, DoorDecoder decoder, DoorRules rules);
    ~PictureDoor() override;

    // The folder of the order. A page calls it before anything else. With keepsCards a picture whose card was taken out
    // stays what it was, and one of another card at the path of a chosen one gets a path of its own.
    void setFolder(const DrivePath& folder, bool keepsCards);
    const DrivePath& folder() const { return m_folder; }
    // As built in, each file stands for itself.
    bool isOpen() const { return m_rules.any(); }

    // The path that the pages work with in the place of a listed one; a path that is one already stays. Reads the
    // header of a file that it has not seen before.
    QString worked(const QString& listed);
    // Null for a path that no folder has shown.
    const PictureSource* sourceOf(const QString& worked) const;
    // The customer's own path.
    QString shown(const QString& worked) const;

    State stateOf(const QString& worked) const;
    bool isWaiting(const QString& worked) const { return stateOf(worked) == State::Waiting; }
    bool isNotMade(const QString& worked) const { return stateOf(worked) == State::NotMade; }
    bool isUnreadable(const QString& worked) const { return stateOf(worked) == State::Unreadable; }
    // The small picture that the camera has put into the file, in the place of a small picture of cell pixels; null
    // where there is none. One that has to be decoded is null until drafted(), and is decoded before what is wanted
    // next.
    Bitmap draft(const QString& worked, int cell);
    // Why a file is unreadable or was not made.
    Failure failureOf(const QString& worked) const;
    // A file that is used in its place can't be shown. Only where all kinds of pictures are offered; as built in such
    // a file can be chosen.
    void foundUnreadable(const QString& worked, const Failure& why);

    // What is waiting among these is made in this order, and nothing else any more.
    void want(const QStringList& worked);

    // The order's folder has room for so many bytes: what was made first goes first, but for what is chosen or in view.
    using Is = std::function<bool(const QString& worked)>;
    void setKept(Is isChosen, Is isInView, qint64 room = qint64(2) << 30) {
        m_isChosen = std::move(isChosen);
        m_isInView = std::move(isInView);
        m_room = room;
    }

Q_SIGNALS:
    // Ready, unreadable or not made.
    void settled(const QString& worked);
    // A picture that is waiting has a draft now.
    void drafted(const QString& worked);

private:
    struct Picture {
        QString listed;
        QString worked;
        PictureSource source;
        State state = State::InPlace;
        Failure failure;
        qint64 bytes = 0;
        bool inHand = false;   // it is being made
        bool fromCopy = false; // of what lay on a card
        bool draftAsked = false;
        QByteArray draft; // a JPEG file, while the picture is waiting
    };

    Picture* find(const QString& worked);
    const Picture* find(const QString& worked) const;
    Picture& enter(const QString& listed);
    QString planned(const DrivePath& listed, const HostPath& source);
    bool isFree(const DrivePath& made, const HostPath& source) const;
    bool isOfAnotherCard(const Picture& picture) const;
    HostPath fileToRead(const Picture& picture) const;
    bool canBeRead(const Picture& picture) const;
    void judge(Picture& picture);
    void startNext();
    void start(Picture& picture);
    void startDraft(const Picture& picture);
    void settleDraft(const QString& worked, const Result<QByteArray>& draft);
    Result<HostPath> targetOf(const DrivePath& made) const;
    void settle(const QString& worked, const Result<qint64>& made);
    void makeRoom();

    const Files& m_files;
    DoorDecoder m_decoder;
    DoorRules m_rules;
    DrivePath m_folder;
    bool m_keepsCards = false;
    KeptPictures m_kept;
    std::deque<Picture> m_pictures;
    QHash<QString, Picture*> m_byListed;
    QHash<QString, Picture*> m_byWorked;
    QHash<QString, QHash<QString, QString>> m_names; // of each folder, by the listed name
    QStringList m_wanted;
    QStringList m_draftsWanted;
    QStringList m_made; // the oldest first
    Is m_isChosen;
    Is m_isInView;
    qint64 m_room = qint64(2) << 30;
    int m_running = 0;
    std::stop_source m_stop; // of what is being made
    ResultDesk<PictureDoor> m_desk{this};
};

} // namespace lumora
