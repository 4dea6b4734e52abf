#include "selection/door/PictureDoor.h"

#include "common/AnsiCodePage.h"
#include "common/FixedText.h"
#include "common/PictureName.h"
#include "door/PictureDraft.h"
#include "platform/files/Files.h"
#include "selection/door/DoorNames.h"

#include <QCryptographicHash>
#include <QThreadPool>

#include <algorithm>
#include <mutex>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The decoder is a process of its own and works on one processor.
constexpr int madeAtOnce = 2;
constexpr qint64 room = qint64(2) << 30;

bool isInCodePage(const QString& path) {
    return !HasQuestionMark(AnsiCodePage::squeeze(path));
}

// Folders of one name on two cards get two folders here.
QString keyOf(const HostPath& folder) {
    const QByteArray path = QByteArray::fromStdString(folder.native());
    return QString::fromLatin1(QCryptographicHash::hash(path, QCryptographicHash::Sha1).toHex().left(8));
}

bool isThePictures(Failure::Kind kind) {
    using Kind = Failure::Kind;
    return kind == Kind::Damaged || kind == Kind::TooLarge || kind == Kind::TimedOut || kind == Kind::Unsupported ||
           kind == Kind::NotFound;
}

// The time of the customer's file, by which a picture that was made of another one is told.
bool isOfTheTime(const HostPath& made, const HostPath& source) {
    std::error_code none;
    const auto time = std::filesystem::last_write_time(made, none);
    return !none && time == std::filesystem::last_write_time(source, none) && !none;
}

Result<qint64> makePicture(const DoorDecoder& decoder, const HostPath& source, const HostPath& target) {
    const Result<DoorDecoder::Made> made = decoder.make(source, target);
    if (!made)
        return made.failure();
    std::error_code passedOver; // without the time the file is made once more at the next need
    std::filesystem::last_write_time(target, std::filesystem::last_write_time(source, passedOver), passedOver);
    const auto bytes = std::filesystem::file_size(target, passedOver);
    return passedOver ? 0 : static_cast<qint64>(bytes);
}

// Not the pool in which small pictures are drawn: a damaged file may hold its thread for half a minute.
QThreadPool& decoders() {
    static QThreadPool pool;
    pool.setMaxThreadCount(madeAtOnce);
    return pool;
}

} // namespace

struct PictureDoor::Desk {
    std::mutex mutex;
    PictureDoor* door;
};

PictureDoor::PictureDoor(const Files& files, DoorDecoder decoder, DoorRules rules)
    : m_files(files)
    , m_decoder(std::move(decoder))
    , m_rules(rules)
    , m_desk(std::make_shared<Desk>()) {
    m_desk->door = this;
}

PictureDoor::~PictureDoor() {
    const std::lock_guard lock(m_desk->mutex);
    m_desk->door = nullptr;
}

PictureDoor::Picture* PictureDoor::find(const QString& worked) {
    return m_byWorked.value(worked);
}

const PictureDoor::Picture* PictureDoor::find(const QString& worked) const {
    return m_byWorked.value(worked);
}

DrivePath PictureDoor::planned(const DrivePath& listed) {
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
    const HostPath host = m_files.drives().toHost(folder).value_or(HostPath());
    return m_folder / keyOf(host) / names.value(listed.leaf(), doorNames({listed.leaf()}).first());
}

PictureDoor::Picture& PictureDoor::enter(const QString& listed) {
    Picture& picture = m_pictures.emplace_back();
    const DrivePath path(listed);
    picture.listed = listed;
    picture.source = m_files.drives().toHost(path).value_or(HostPath());
    const bool inCodePage = isInCodePage(listed);
    judge(picture, inCodePage);
    picture.worked = picture.state == State::InPlace || (picture.state == State::Unreadable && inCodePage)
                         ? listed
                         : planned(path).text();
    if (picture.state == State::Waiting) {
        const HostPath made = m_files.drives().toHost(DrivePath(picture.worked)).value_or(HostPath());
        if (isOfTheTime(made, picture.source))
            picture.state = State::Ready;
    }
    m_byListed[listed] = m_byWorked[picture.worked] = &picture;
    return picture;
}

void PictureDoor::judge(Picture& picture, bool inCodePage) {
    const Result<DoorNeed> need = DoorDecoder::needOf(picture.source, m_rules);
    if (!need) {
        picture.failure = need.failure();
        picture.state = m_rules.everyFormat ? State::Unreadable : State::InPlace;
    } else {
        picture.state = *need == DoorNeed::Nothing && inCodePage ? State::InPlace : State::Waiting;
    }
}

QString PictureDoor::worked(const QString& listed) {
    if (!isOpen() || listed.isEmpty() || m_byWorked.contains(listed) || listed.startsWith(m_folder.text() + u'\\'))
        return listed;
    if (const Picture* known = m_byListed.value(listed))
        return known->worked;
    return enter(listed).worked;
}

QString PictureDoor::shown(const QString& worked) const {
    const Picture* picture = find(worked);
    return picture ? picture->listed : worked;
}

PictureDoor::State PictureDoor::stateOf(const QString& worked) const {
    const Picture* picture = find(worked);
    return picture ? picture->state : State::InPlace;
}

Failure PictureDoor::failureOf(const QString& worked) const {
    const Picture* picture = find(worked);
    return picture ? picture->failure : Failure();
}

Bitmap PictureDoor::draft(const QString& worked, int cell) const {
    const Picture* picture = find(worked);
    const HostPath source = picture ? picture->source : m_files.drives().toHost(DrivePath(worked)).value_or(HostPath());
    return pictureDraft(source, cell, m_rules.upright ? Held::Upright : Held::AsStored);
}

void PictureDoor::foundUnreadable(const QString& worked) {
    Picture* picture = find(worked);
    if (!picture || !m_rules.everyFormat || picture->state == State::Unreadable)
        return;
    picture->state = State::Unreadable;
    picture->failure = {Failure::Kind::Damaged, shown(worked)};
}

void PictureDoor::want(const QStringList& worked) {
    m_wanted.clear();
    for (const QString& path : worked) {
        Picture* picture = find(path);
        if (picture && picture->state == State::NotMade)
            picture->state = State::Waiting;
        if (picture && picture->state == State::Waiting && !picture->inHand && !m_wanted.contains(path))
            m_wanted += path;
    }
    startNext();
}

void PictureDoor::startNext() {
    while (m_running < madeAtOnce && !m_wanted.isEmpty()) {
        Picture* next = find(m_wanted.takeFirst());
        if (next && next->state == State::Waiting && !next->inHand)
            start(*next);
    }
}

void PictureDoor::start(Picture& picture) {
    const DrivePath path(picture.worked);
    picture.inHand = true;
    ++m_running;
    const Result<void> ready = m_files.makeFolder(path.folder());
    const Result<HostPath> target = ready ? m_files.host(path) : ready.failure();
    decoders().start([desk = m_desk, decoder = m_decoder, worked = picture.worked, source = picture.source, target] {
        const Result<qint64> made = target ? makePicture(decoder, source, *target) : target.failure();
        const std::lock_guard lock(desk->mutex);
        PictureDoor* door = desk->door;
        if (door)
            QMetaObject::invokeMethod(
                door, [door, worked, made] { door->settle(worked, made); }, Qt::QueuedConnection);
    });
}

void PictureDoor::settle(const QString& worked, const Result<qint64>& made) {
    --m_running;
    Picture& picture = *find(worked);
    picture.inHand = false;
    if (made) {
        picture.state = State::Ready;
        picture.bytes = *made;
        m_made += worked;
        makeRoom();
    } else {
        picture.failure = made.failure();
        picture.state = isThePictures(made.failure().kind) ? State::Unreadable : State::NotMade;
    }
    startNext();
    Q_EMIT settled(worked);
}

void PictureDoor::makeRoom() {
    qint64 taken = 0;
    for (const QString& worked : m_made)
        taken += find(worked)->bytes;
    for (qsizetype i = 0; i + 1 < m_made.size() && taken > room;) {
        Picture& picture = *find(m_made[i]);
        if ((m_isKept && m_isKept(picture.worked)) || !m_files.removeFile(DrivePath(picture.worked))) {
            ++i;
            continue;
        }
        taken -= picture.bytes;
        picture.state = State::Waiting;
        m_made.removeAt(i);
    }
}

} // namespace lumora
