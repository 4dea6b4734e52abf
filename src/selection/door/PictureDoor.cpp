#include "selection/door/PictureDoor.h"

#include "common/AnsiCodePage.h"
#include "common/Background.h"
#include "common/HostFile.h"
#include "common/PictureName.h"
#include "common/Warning.h"
#include "door/PictureDraft.h"
#include "platform/files/Files.h"
#include "selection/door/DoorNames.h"

#include <QCryptographicHash>
#include <QSet>
#include <QThreadPool>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The decoder is a process of its own and works on one processor.
constexpr int madeAtOnce = 2;

// Folders of one name on two cards get two folders here.
QString keyOf(const HostPath& folder) {
    const QByteArray path = QByteArray::fromStdString(folder.native());
    return QString::fromLatin1(QCryptographicHash::hash(path, QCryptographicHash::Sha1).toHex().left(8));
}

bool isThePictures(const Failure& failure) {
    using Kind = Failure::Kind;
    return failure.kind == Kind::Damaged || failure.kind == Kind::TooLarge || failure.kind == Kind::TimedOut ||
           failure.kind == Kind::Unsupported;
}

// Gives the bytes of the made file. It gets the time of the customer's, by which it is known again.
Result<qint64> makePicture(const DoorDecoder& decoder, const HostPath& source, const HostPath& target,
                           const std::stop_token& stop) {
    std::error_code untold;
    const auto time = std::filesystem::last_write_time(source, untold);
    const Result<DoorDecoder::Made> made = decoder.make(source, target, stop);
    if (!made)
        return made.failure();
    if (made->profileIgnored)
        writeWarning(toText(source) + profileIgnoredWords.toString());
    std::error_code passedOver;
    if (!untold && std::filesystem::last_write_time(source, passedOver) == time)
        std::filesystem::last_write_time(target, time, passedOver);
    const auto bytes = std::filesystem::file_size(target, passedOver);
    return passedOver ? 0 : static_cast<qint64>(bytes);
}

// Not the pool in which small pictures are drawn: a damaged file may hold its thread for half a minute.
QThreadPool& decoders() {
    static QThreadPool& pool = backgroundPool(madeAtOnce);
    return pool;
}

} // namespace

PictureDoor::PictureDoor(const Files& files, DoorDecoder decoder, DoorRules rules)
    : m_files(files)
    , m_decoder(std::move(decoder))
    , m_rules(rules)
    , m_kept(files, {}) {}

PictureDoor::~PictureDoor() {
    m_stop.request_stop();
}

PictureDoor::Picture* PictureDoor::find(const QString& worked) {
    return m_byWorked.value(worked);
}

const PictureDoor::Picture* PictureDoor::find(const QString& worked) const {
    return m_byWorked.value(worked);
}

void PictureDoor::setFolder(const DrivePath& folder, bool keepsCards) {
    m_folder = folder;
    m_keepsCards = keepsCards;
    m_kept.setOrderFolder(keepsCards ? folder : DrivePath());
}

// No other picture has the path, and what lies there was made of this one.
bool PictureDoor::isFree(const DrivePath& made, const HostPath& source) const {
    const HostPath file = m_files.drives().toHost(made).value_or(HostPath());
    std::error_code none;
    return !m_byWorked.contains(made.text()) &&
           (!std::filesystem::exists(file, none) || stampOf(file).time == stampOf(source).time);
}

QString PictureDoor::planned(const DrivePath& listed, const HostPath& source) {
    const DrivePath folder = listed.folder();
    QHash<QString, QString>& names = m_names[folder.text()];
    if (!names.contains(listed.leaf())) {
        // A name that is known stays: files may have come to the folder meanwhile.
        const QStringList all = m_files.storedNames(folder, picturePatterns(m_rules.everyFormat));
        const QStringList behind = doorNames(all);
        for (qsizetype i = 0; i < all.size(); ++i) {
            if (!names.contains(all[i]))
                names[all[i]] = behind[i];
        }
    }
    const DrivePath made = m_folder / keyOf(source.parent_path());
    const QString name = names.value(listed.leaf());
    if (!name.isEmpty() && isFree(made / name, source))
        return (made / name).text();
    return (made / freeDoorName(listed.leaf(), [&](const QString& next) { return !isFree(made / next, source); }))
        .text();
}

PictureDoor::Picture& PictureDoor::enter(const QString& listed) {
    Picture& picture = m_pictures.emplace_back();
    const DrivePath path(listed);
    picture.listed = listed;
    picture.source.file = m_files.drives().toHost(path).value_or(HostPath());
    picture.source.stamp = stampOf(picture.source.file);
    judge(picture);
    const bool another = isOfAnotherCard(picture);
    if (another && picture.state == State::InPlace)
        picture.state = State::Waiting;
    const bool stays = !another && (picture.state == State::InPlace || picture.state == State::Unreadable);
    picture.worked = stays ? listed : planned(path, picture.source.file);
    if (picture.state == State::Waiting &&
        stampOf(m_files.drives().toHost(DrivePath(picture.worked)).value_or(HostPath())).time ==
            picture.source.stamp.time)
        picture.state = State::Ready;
    m_byListed[listed] = m_byWorked[picture.worked] = &picture;
    return picture;
}

// A chosen picture keeps its path, whichever card lies there by now.
bool PictureDoor::isOfAnotherCard(const Picture& picture) const {
    if (!m_keepsCards || !picture.source.stamp.isThere)
        return false;
    if (const PictureStamp copied = m_kept.copiedStamp(DrivePath(picture.listed)); copied.isThere)
        return copied != picture.source.stamp;
    const Picture* before = find(picture.listed);
    return before && before->source.stamp.isThere && before->source.stamp != picture.source.stamp && m_isChosen &&
           m_isChosen(picture.listed);
}

// The copy of what lay on a card, where there is one.
HostPath PictureDoor::fileToRead(const Picture& picture) const {
    const DrivePath worked(picture.worked);
    return m_kept.has(worked) ? m_files.drives().toHost(m_kept.copyOf(worked)).value_or(HostPath())
                              : picture.source.file;
}

// A card that is pulled in the middle gives half a picture, which is no fault of the picture.
bool PictureDoor::canBeRead(const Picture& picture) const {
    return !m_keepsCards || stampOf(picture.source.file) == picture.source.stamp;
}

void PictureDoor::judge(Picture& picture) {
    if (!isOpen())
        return;
    const Result<DoorNeed> need = DoorDecoder::needOf(picture.source.file, m_rules);
    if (need) {
        const bool stays = *need == DoorNeed::Nothing && AnsiCodePage::holds(picture.listed);
        picture.state = stays ? State::InPlace : State::Waiting;
        return;
    }
    picture.failure = need.failure();
    picture.state = !m_rules.everyFormat            ? State::InPlace
                    : isThePictures(need.failure()) ? State::Unreadable
                                                    : State::NotMade;
}

QString PictureDoor::worked(const QString& listed) {
    if (m_folder.isEmpty() || listed.isEmpty() || listed.startsWith(m_folder.text() + u'\\'))
        return listed;
    const Picture* known = m_byListed.value(listed);
    if (known) {
        const PictureStamp now = stampOf(known->source.file);
        if (now == known->source.stamp || (m_keepsCards && !now.isThere))
            return known->worked;
    }
    return enter(listed).worked;
}

const PictureSource* PictureDoor::sourceOf(const QString& worked) const {
    const Picture* picture = find(worked);
    return picture ? &picture->source : nullptr;
}

QString PictureDoor::shown(const QString& worked) const {
    const Picture* picture = find(worked);
    if (picture)
        return picture->listed;
    // Of an order that was begun by another run the name alone is known.
    return !m_folder.isEmpty() && worked.startsWith(m_folder.text() + u'\\') ? LeafName(worked) : worked;
}

PictureDoor::State PictureDoor::stateOf(const QString& worked) const {
    const Picture* picture = find(worked);
    return picture ? picture->state : State::InPlace;
}

Failure PictureDoor::failureOf(const QString& worked) const {
    const Picture* picture = find(worked);
    return picture ? picture->failure : Failure();
}

Bitmap PictureDoor::draft(const QString& worked, int cell) {
    Picture* picture = find(worked);
    const HostPath source =
        picture ? fileToRead(*picture) : m_files.drives().toHost(DrivePath(worked)).value_or(HostPath());
    const bool isWaiting = picture && picture->state == State::Waiting;
    Bitmap draft = isWaiting && !picture->draft.isEmpty()
                       ? pictureDraft(picture->draft, cell)
                       : pictureDraft(source, cell, m_rules.upright ? Held::Upright : Held::AsStored);
    if (draft.isNull() && isWaiting && !std::exchange(picture->draftAsked, true))
        m_draftsWanted += worked;
    return draft;
}

void PictureDoor::foundUnreadable(const QString& worked, const Failure& why) {
    Picture* picture = find(worked);
    if (!picture || picture->state != State::InPlace || !m_rules.everyFormat || !isThePictures(why) ||
        !canBeRead(*picture))
        return;
    picture->state = State::Unreadable;
    picture->failure = why;
}

void PictureDoor::want(const QStringList& worked) {
    m_wanted.clear();
    // Of pages that were left.
    m_draftsWanted.removeIf([&](const QString& path) {
        const bool gone = !worked.contains(path);
        find(path)->draftAsked = !gone;
        return gone;
    });
    QSet<QString> taken;
    for (const QString& path : worked) {
        Picture* picture = find(path);
        if (picture && picture->state == State::NotMade)
            picture->state = State::Waiting;
        if (!picture || picture->state != State::Waiting || picture->inHand || taken.contains(path))
            continue;
        taken += path;
        m_wanted += path;
    }
    startNext();
}

void PictureDoor::startNext() {
    while (m_running < madeAtOnce && !m_draftsWanted.isEmpty())
        startDraft(*find(m_draftsWanted.takeFirst()));
    while (m_running < madeAtOnce && !m_wanted.isEmpty())
        start(*find(m_wanted.takeFirst()));
}

void PictureDoor::start(Picture& picture) {
    const DrivePath path(picture.worked);
    picture.inHand = true;
    picture.fromCopy = m_kept.has(path);
    ++m_running;
    const Result<HostPath> target = targetOf(path);
    decoders().start([ticket = m_desk.ticket(), decoder = m_decoder, worked = picture.worked,
                      source = fileToRead(picture), target, stop = m_stop.get_token()] {
        const Result<qint64> made = target ? makePicture(decoder, source, *target, stop) : target.failure();
        ticket.handIn([worked, made](PictureDoor& door) { door.settle(worked, made); });
    });
}

void PictureDoor::startDraft(const Picture& picture) {
    ++m_running;
    decoders().start([ticket = m_desk.ticket(), decoder = m_decoder, worked = picture.worked,
                      source = fileToRead(picture), stop = m_stop.get_token()] {
        const Result<QByteArray> draft = decoder.draft(source, stop);
        ticket.handIn([worked, draft](PictureDoor& door) { door.settleDraft(worked, draft); });
    });
}

void PictureDoor::settleDraft(const QString& worked, const Result<QByteArray>& draft) {
    --m_running;
    Picture& picture = *find(worked);
    startNext();
    if (!draft || picture.state != State::Waiting)
        return;
    picture.draft = *draft;
    Q_EMIT drafted(worked);
}

// A folder that can't be made is no fault of the picture.
Result<HostPath> PictureDoor::targetOf(const DrivePath& made) const {
    for (const DrivePath& folder : {m_folder.folder(), m_folder, made.folder()}) {
        if (const Result<void> there = m_files.makeFolder(folder); !there)
            return targetFailure(there.failure());
    }
    return m_files.host(made);
}

void PictureDoor::settle(const QString& worked, const Result<qint64>& made) {
    --m_running;
    Picture& picture = *find(worked);
    picture.inHand = false;
    picture.draft.clear();
    if (made) {
        picture.state = State::Ready;
        picture.bytes = *made;
        m_made += worked;
        makeRoom();
    } else {
        if (!picture.fromCopy && m_kept.has(DrivePath(worked))) {
            m_wanted.prepend(worked); // the card went meanwhile
            return startNext();
        }
        picture.failure = made.failure();
        picture.state = isThePictures(made.failure()) && (picture.fromCopy || canBeRead(picture)) ? State::Unreadable
                                                                                                  : State::NotMade;
    }
    startNext();
    Q_EMIT settled(worked);
}

void PictureDoor::makeRoom() {
    qint64 taken = 0;
    for (const QString& worked : m_made)
        taken += find(worked)->bytes;
    for (qsizetype i = 0; i + 1 < m_made.size() && taken > m_room;) {
        Picture& picture = *find(m_made[i]);
        if ((m_isChosen && m_isChosen(picture.worked)) || (m_isInView && m_isInView(picture.worked)) ||
            !m_files.removeFile(DrivePath(picture.worked))) {
            ++i;
            continue;
        }
        taken -= picture.bytes;
        picture.state = State::Waiting;
        m_made.removeAt(i);
    }
}

} // namespace lumora
