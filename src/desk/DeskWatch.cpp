#include "desk/DeskWatch.h"

#include "common/HostFile.h"
#include "desk/FolderTrace.h"
#include "order/FinishedOrder.h"
#include "order/OrderNames.h"
#include "platform/files/HostPath.h"

#include <QDateTime>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;
using State = DeskOrder::State;

namespace {

constexpr qint64 hour = 3600000;
const QString byHand = u"~export"_s; // ends the key of a room that an export has
constexpr qint64 shortest = 100;     // of a pause; else an order that stays faulty would keep the others waiting

// The prints of an order, one row for all of the same words.
QList<DeskOrder::Prints> printsOf(const ArrivedOrder& order) {
    QList<DeskOrder::Prints> rows;
    for (const ArrivedOrder::Print& print : order.prints) {
        const PrintWords words = PrintWords::of(print.name);
        const auto same = std::find_if(rows.begin(), rows.end(), [&](const DeskOrder::Prints& row) {
            return row.size == words.size && row.paper == words.paper && row.border == words.border &&
                   row.copies == words.copies;
        });
        if (same != rows.end())
            ++same->files;
        else
            rows += {words.size, words.paper, words.border, words.copies, 1};
    }
    return rows;
}

void count(DeskOrder& order, const QList<DeskOrder::Prints>& prints, const ArrivedOrder& arrived) {
    order.prints = order.copies = 0;
    for (const DeskOrder::Prints& row : prints) {
        order.prints += row.files;
        order.copies += row.files * row.copies;
    }
    order.failed = arrived.findings.failed;
}

struct ExportRoom {
    QString room;
    Descriptor lock;
    bool goesOn; // it is ready: an earlier export was cut off behind that, and only the rest moves
};

Result<ExportRoom> takeExportRoom(const HotFolder& hotFolder, const QString& key) {
    for (const QString& left : hotFolder.rooms()) {
        if (HotFolder::keyOf(left) != key)
            continue;
        Result<Descriptor> lock = hotFolder.hold(left);
        if (!lock)
            return lock.failure();
        if (hotFolder.isReady(left))
            return ExportRoom{left, std::move(*lock), true};
        hotFolder.clear(left);
    }
    const Result<QString> room = hotFolder.makeRoom(key);
    if (!room)
        return room.failure();
    Result<Descriptor> lock = hotFolder.hold(*room);
    if (!lock)
        return lock.failure();
    return ExportRoom{*room, std::move(*lock), false};
}

} // namespace

Result<void> DeskWatch::begin() {
    // Before the book is asked: a room of an order that is taken up after that is none of these.
    const QStringList rooms = m_hotFolder.rooms();
    const Result<QList<DeskOrder>> orders = m_book.list({State::Faulty, State::Placed, State::Gone});
    if (!orders)
        return orders.failure();
    QSet<QString> ended;
    for (const DeskOrder& order : *orders) {
        if (order.state == State::Faulty)
            m_tell(Tone::Fault, u"%1: %2"_s.arg(order.name, order.words));
        else
            ended += order.name;
    }
    for (const QString& room : rooms) {
        const QString key = HotFolder::keyOf(room);
        const bool isExport = key.endsWith(byHand);
        if (isExport && m_hotFolder.isReady(room) && m_hotFolder.hold(room))
            m_tell(Tone::Fault, u"%1: its export was cut off; repeat it, and what is still missing comes out"_s.arg(
                                    key.chopped(byHand.size())));
        else if (ended.contains(key) || (isExport && !m_hotFolder.isReady(room) && m_hotFolder.isOld(room)))
            m_hotFolder.clear(room);
    }
    return {};
}

Result<void> DeskWatch::look() {
    std::error_code error;
    fs::directory_iterator at(m_settings.folder, error);
    QSet<QString> names;
    QStringList fresh;
    for (const fs::directory_iterator end; !error && at != end; at.increment(error)) {
        std::error_code gone;
        const QString name = toText(at->path().filename());
        if (!at->is_directory(gone) || name.startsWith(u'.'))
            continue;
        names += name;
        if (m_seen.contains(name))
            continue;
        if (FinishedOrderOf(name))
            fresh += name;
        else
            m_tell(Tone::Fault, u"%1: not the name of an order, passed over"_s.arg(name));
    }
    if (error)
        return fileFailure(m_settings.folder, u"the orders can't be listed"_s, error.value());
    fresh.sort();
    if (const auto entered = m_book.enter(fresh); !entered)
        return entered;
    const Result<QList<DeskOrder>> gone = m_book.list({State::Gone});
    if (!gone)
        return gone.failure();
    for (const DeskOrder& order : *gone) {
        if (!names.contains(order.name))
            continue;
        if (const auto taken = m_book.takeUp(order.name); !taken)
            return taken;
    }
    m_seen = names;
    return {};
}

Result<bool> DeskWatch::allDone() {
    const Result<QList<DeskOrder>> open = m_book.list({State::Waiting, State::Ready}, m_hotFolder.id());
    if (!open)
        return open.failure();
    return open->isEmpty();
}

fs::path DeskWatch::folderOf(const DeskOrder& order) const {
    return m_settings.folder / toHostPath(order.name);
}

bool DeskWatch::hasChanged(const DeskOrder& order) const {
    const Result<QString> trace = folderTrace(folderOf(order));
    return !trace || *trace != order.trace;
}

Result<bool> DeskWatch::step() {
    const Result<std::optional<DeskOrder>> claimed = m_book.claim(m_hotFolder.id());
    if (!claimed)
        return claimed.failure();
    if (!*claimed)
        return false;
    const Result<bool> saved = (*claimed)->state == State::Ready ? place(**claimed) : lookAt(**claimed);
    return saved ? Result<bool>(true) : saved;
}

// Writes the order, which is due again after so many milliseconds.
Result<bool> DeskWatch::save(DeskOrder& order, qint64 after, const Book::Entries& entries) {
    const Result<qint64> now = m_book.now();
    if (!now)
        return now.failure();
    order.due = *now + after;
    return m_book.save(order, Book::Then::Drop, entries);
}

qint64 DeskWatch::pause(const DeskOrder& order) const {
    return std::clamp(2 * m_settings.quiet * std::max(1, order.tries), shortest, hour);
}

qint64 DeskWatch::shortPause() const {
    return std::clamp<qint64>(m_settings.quiet, shortest, 10000);
}

Result<bool> DeskWatch::putOff(DeskOrder order, const QString& why) {
    const bool news = order.words != why;
    order.words = why;
    const Result<bool> saved = save(order, pause(order), {{}, news ? why : QString()});
    if (saved && *saved)
        m_tell(Tone::Fault, u"%1: put off: %2"_s.arg(order.name, why));
    return saved;
}

Result<bool> DeskWatch::lookAt(DeskOrder order) {
    const Result<QString> trace = folderTrace(folderOf(order));
    if (!trace) {
        if (trace.failure().kind != Failure::Kind::NotFound)
            return putOff(order, trace.failure().message);
        order.state = State::Gone;
        return save(order, 0);
    }
    const bool changed = *trace != order.trace;
    order.trace = *trace;
    if (changed) {
        order.state = State::Waiting;
        return save(order, m_settings.quiet);
    }
    const Result<qint64> now = m_book.now();
    if (!now)
        return now.failure();
    if (order.state == State::Faulty && *now < order.recheck)
        return save(order, shortPause());
    // An order that ends this process is not the first one of the next process again.
    ++order.tries;
    order.due = *now + pause(order);
    // Rooms of earlier tries. They are listed before the save: once it is confirmed, no other process can make the
    // order ready with one of them, but may with a room that comes later.
    QStringList old = m_hotFolder.rooms();
    old.removeIf([&](const QString& room) { return HotFolder::keyOf(room) != order.name; });
    const Result<bool> held = m_book.save(order, Book::Then::Hold);
    if (!held || !*held)
        return held;
    for (const QString& room : old)
        m_hotFolder.clear(room);
    return judge(order);
}

Result<bool> DeskWatch::judge(DeskOrder order) {
    const Result<QString> room = m_hotFolder.makeRoom(order.name);
    if (!room)
        return putOff(order, room.failure().message);
    const Result<ArrivedOrder> arrived =
        ArrivedOrder::judge(folderOf(order), m_settings.shape, m_hotFolder.pathOf(*room));
    if (arrived && arrived->missing.isEmpty())
        return makeReady(order, *room, *arrived);
    m_hotFolder.clear(*room);
    if (!arrived)
        return putOff(order, arrived.failure().message);
    if (hasChanged(order)) {
        order.state = State::Waiting;
        return save(order, 0); // it changed meanwhile, and is told once it is quiet
    }
    const QString words = arrived->missing.join(u"; "_s);
    const bool news = order.words != words;
    const Result<qint64> now = m_book.now();
    if (!now)
        return now.failure();
    order.state = State::Faulty;
    order.words = words;
    // The fault may have been this machine's, as a full disk.
    order.recheck = *now + std::min(24 * hour, 30 * m_settings.quiet * order.tries);
    const Result<bool> saved = save(order, shortPause(), {{}, news ? words : QString()});
    if (saved && *saved && news)
        m_tell(Tone::Fault, u"%1: %2"_s.arg(order.name, words));
    return saved;
}

// What the book says decides: before it has the room, the prints may be made anew; from then on they only move.
Result<bool> DeskWatch::makeReady(DeskOrder order, const QString& room, const ArrivedOrder& arrived) {
    if (const auto made = m_hotFolder.makeReady(room, arrived, m_settings.layout, m_settings.shape); !made) {
        m_hotFolder.clear(room);
        return putOff(order, made.failure().message);
    }
    if (hasChanged(order)) {
        m_hotFolder.clear(room);
        order.state = State::Waiting;
        return save(order, 0);
    }
    const Result<qint64> now = m_book.now();
    if (!now)
        return now.failure();
    const QList<DeskOrder::Prints> prints = printsOf(arrived);
    count(order, prints, arrived);
    order.state = State::Ready;
    order.words.clear();
    order.desk = m_hotFolder.id();
    order.room = room;
    order.ready = *now;
    const Result<bool> saved = save(order, 0, {prints, {}});
    if (saved && !*saved)
        m_hotFolder.clear(room);
    return saved;
}

Result<bool> DeskWatch::place(DeskOrder order) {
    if (const auto placed = m_hotFolder.place(order.room); !placed)
        return putOff(order, placed.failure().message);
    if (const auto added = m_hotFolder.addLine(listOf(order), listHead, lineOf(order)); !added)
        return putOff(order, added.failure().message);
    order.state = State::Placed;
    order.words.clear();
    const Result<bool> saved = save(order, 0);
    if (saved && *saved) {
        m_hotFolder.clear(order.room);
        m_tell(Tone::Done, u"%1: placed, %2 prints, %3 copies"_s.arg(order.name).arg(order.prints).arg(order.copies));
    }
    return saved;
}

QString DeskWatch::listOf(const DeskOrder& order) {
    return u"orders-%1.csv"_s.arg(QDateTime::fromMSecsSinceEpoch(order.ready).date().toString(Qt::ISODate));
}

QByteArray DeskWatch::lineOf(const DeskOrder& order) {
    const QString name = plainName(order.name);
    const FinishedOrder parts = FinishedOrderOf(order.name).value_or(FinishedOrder());
    return QStringList{QDateTime::fromMSecsSinceEpoch(order.ready).toString(Qt::ISODate),
                       u'"' + order.name + u'"',
                       parts.number,
                       QString::number(order.prints),
                       QString::number(order.copies),
                       QString::number(order.failed),
                       u"sheets/%1.jpg"_s.arg(name)}
        .join(u',')
        .toUtf8();
}

Result<DeskOrder> exportOrder(const fs::path& folder, const HotFolder& hotFolder, const PrintLayout& layout,
                              PrintFileShape shape) {
    std::error_code error;
    const QString key = toText(fs::weakly_canonical(folder, error).filename()) + byHand;
    const Result<ExportRoom> taken = takeExportRoom(hotFolder, key);
    if (!taken)
        return taken.failure();
    const QString& room = taken->room;
    DeskOrder order;
    const auto work = [&]() -> Result<void> {
        const Result<ArrivedOrder> arrived = ArrivedOrder::judge(folder, shape, hotFolder.pathOf(room));
        if (!arrived)
            return arrived.failure();
        if (!arrived->missing.isEmpty())
            return Failure{Failure::Kind::Damaged, u"%1: %2"_s.arg(arrived->name, arrived->missing.join(u"; "_s))};
        order.name = arrived->name;
        order.ready = QDateTime::currentMSecsSinceEpoch();
        count(order, printsOf(*arrived), *arrived);
        if (!taken->goesOn) {
            if (const auto made = hotFolder.makeReady(room, *arrived, layout, shape); !made)
                return made;
        }
        if (const auto placed = hotFolder.place(room); !placed)
            return placed;
        return hotFolder.addLine(DeskWatch::listOf(order), DeskWatch::listHead, DeskWatch::lineOf(order));
    };
    const Result<void> done = work();
    const bool keeps = !done && hotFolder.isReady(room);
    if (!keeps)
        hotFolder.clear(room);
    if (done)
        return order;
    Failure failure = done.failure();
    if (keeps)
        failure.message += u"; repeat the export once that is mended: it goes on from there"_s;
    return failure;
}

} // namespace lumora
