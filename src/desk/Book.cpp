#include "desk/Book.h"

#include "platform/files/HostPath.h"

#include <QCryptographicHash>
#include <QDateTime>
#include <QSet>
#include <QSqlDatabase>
#include <QSqlError>
#include <QSqlQuery>
#include <QUrl>
#include <QUrlQuery>
#include <QVariant>

#include <fcntl.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <cerrno>

namespace lumora {

using namespace Qt::StringLiterals;
using State = DeskOrder::State;

namespace {

const std::array<QString, 5> stateWords{u"waiting"_s, u"faulty"_s, u"ready"_s, u"placed"_s, u"gone"_s};

QString wordOf(State state) {
    return stateWords[static_cast<std::size_t>(state)];
}

const QString columns = u"name, state, trace, words, desk, room, tries, prints, copies, failed, seen, due, recheck, "
                        u"ready, version"_s;

DeskOrder orderOf(const QSqlQuery& row) {
    DeskOrder order;
    const auto found = std::find(stateWords.begin(), stateWords.end(), row.value(1).toString());
    order.state = static_cast<State>(found - stateWords.begin());
    order.name = row.value(0).toString();
    order.trace = row.value(2).toString();
    order.words = row.value(3).toString();
    order.desk = row.value(4).toString();
    order.room = row.value(5).toString();
    order.tries = row.value(6).toInt();
    order.prints = row.value(7).toInt();
    order.copies = row.value(8).toInt();
    order.failed = row.value(9).toInt();
    order.seen = row.value(10).toLongLong();
    order.due = row.value(11).toLongLong();
    order.recheck = row.value(12).toLongLong();
    order.ready = row.value(13).toLongLong();
    order.version = row.value(14).toLongLong();
    return order;
}

// A time beyond a day comes from a clock that was wrong.
const QString dueOnes = u"(state IN ('waiting', 'faulty') OR (state = 'ready' AND desk = ?)) AND "
                        u"(due <= ? OR due - 86400000 > ?) ORDER BY CASE state WHEN 'ready' THEN 0 ELSE 1 END, due"_s;

Failure bookFailure(const QSqlError& error) {
    return {Failure::Kind::Other, u"the desk's book: %1"_s.arg(error.text().simplified())};
}

} // namespace

Book::Book(QString connection, bool server)
    : m_connection(std::move(connection))
    , m_server(server) {}

Book::~Book() {
    drop();
    QSqlDatabase::database(m_connection, false).close();
    QSqlDatabase::removeDatabase(m_connection);
}

Result<std::unique_ptr<Book>> Book::open(const QString& where) {
    static std::atomic<int> count{0};
    const bool server = where.startsWith(u"postgresql://"_s) || where.startsWith(u"postgres://"_s);
    if (!server && where.contains(u"://"_s))
        return Failure{Failure::Kind::Unsupported, u"%1: a book is a file or postgresql://..."_s.arg(where)};
    const QString driver = server ? u"QPSQL"_s : u"QSQLITE"_s;
    if (!QSqlDatabase::isDriverAvailable(driver))
        return Failure{Failure::Kind::NoProgram, u"Qt has no %1 here: install %2"_s.arg(
                                                     driver, server ? u"libqt6sql6-psql"_s : u"libqt6sql6-sqlite"_s)};
    std::unique_ptr<Book> book(new Book(u"desk-%1"_s.arg(++count), server));
    QSqlDatabase::addDatabase(driver, book->m_connection);
    if (const auto prepared = book->prepare(where); !prepared)
        return prepared.failure();
    return book;
}

Result<void> Book::prepare(const QString& where) {
    QSqlDatabase database = QSqlDatabase::database(m_connection, false);
    if (m_server) {
        const QUrl url(where);
        if (!url.isValid())
            return Failure{Failure::Kind::Unsupported, u"the desk's book: %1"_s.arg(url.errorString())};
        QStringList options{u"connect_timeout=10"_s};
        database.setHostName(url.host());
        database.setPort(url.port(-1));
        database.setUserName(url.userName(QUrl::FullyDecoded));
        database.setPassword(url.password(QUrl::FullyDecoded));
        database.setDatabaseName(url.path(QUrl::FullyDecoded).mid(1));
        for (const auto& [key, value] : QUrlQuery(url).queryItems(QUrl::FullyDecoded))
            options += key + u'=' + value;
        database.setConnectOptions(options.join(u';'));
    } else {
        const HostPath locks = toHostPath(where + u".claims"_s);
        m_locks = Descriptor(::open(locks.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0600));
        if (!m_locks->valid())
            return fileFailure(locks, u"the desk's book can't be kept here"_s, errno);
        database.setDatabaseName(where);
        database.setConnectOptions(u"QSQLITE_BUSY_TIMEOUT=60000"_s);
    }
    if (!database.open())
        return bookFailure(database.lastError());

    // A server learns in a minute that a machine with a claim has lost its line. What makes the tables waits for
    // others.
    const QStringList first =
        m_server ? QStringList{u"SET client_min_messages = warning"_s, u"SET tcp_keepalives_idle = 30"_s,
                               u"SET tcp_keepalives_interval = 10"_s, u"SET tcp_keepalives_count = 3"_s,
                               u"SELECT pg_advisory_lock(717171)"_s}
                 : QStringList{u"PRAGMA journal_mode = WAL"_s, u"PRAGMA synchronous = FULL"_s};
    QStringList statements = first;
    statements +=
        {u"CREATE TABLE IF NOT EXISTS desk_orders (name TEXT PRIMARY KEY, state TEXT NOT NULL, trace TEXT NOT NULL, "
         u"words TEXT NOT NULL, desk TEXT NOT NULL, room TEXT NOT NULL, tries INTEGER NOT NULL, prints INTEGER NOT "
         u"NULL, copies INTEGER NOT NULL, failed INTEGER NOT NULL, seen BIGINT NOT NULL, due BIGINT NOT NULL, recheck "
         u"BIGINT NOT NULL, ready BIGINT NOT NULL, version BIGINT NOT NULL)"_s,
         u"CREATE INDEX IF NOT EXISTS desk_orders_due ON desk_orders (state, due)"_s,
         u"CREATE TABLE IF NOT EXISTS desk_prints (name TEXT NOT NULL, size TEXT NOT NULL, paper TEXT NOT NULL, border "
         u"TEXT NOT NULL, copies INTEGER NOT NULL, files INTEGER NOT NULL, PRIMARY KEY (name, size, paper, border, "
         u"copies))"_s,
         u"CREATE TABLE IF NOT EXISTS desk_faults (name TEXT NOT NULL, at BIGINT NOT NULL, words TEXT NOT NULL)"_s};
    if (m_server)
        statements += u"SELECT pg_advisory_unlock(717171)"_s;
    for (const QString& statement : statements) {
        if (const auto done = run(statement); !done)
            return done.failure();
    }
    return {};
}

Result<QSqlQuery> Book::run(const QString& sql, const QVariantList& values) {
    QSqlQuery query(QSqlDatabase::database(m_connection, false));
    // PostgreSQL prepares only what reads and changes rows.
    if (values.isEmpty() ? !query.exec(sql) : !query.prepare(sql))
        return bookFailure(query.lastError());
    if (values.isEmpty())
        return query;
    // A text that was never set would be bound as none at all.
    for (const QVariant& value : values)
        query.addBindValue(value.typeId() == QMetaType::QString && value.toString().isEmpty() ? u""_s : value);
    if (!query.exec())
        return bookFailure(query.lastError());
    return query;
}

Result<void> Book::begin() {
    if (m_open)
        return {};
    // SQLite would else take the lock for writing in the middle, and could have to give up there.
    const auto begun = run(m_server ? u"BEGIN"_s : u"BEGIN IMMEDIATE"_s);
    if (!begun)
        return begun.failure();
    m_open = true;
    return {};
}

Result<void> Book::end(const char* word) {
    m_open = false;
    const auto ended = run(QString::fromLatin1(word));
    if (ended)
        return {};
    (void)run(u"ROLLBACK"_s);
    return ended.failure();
}

void Book::drop() {
    if (m_open)
        (void)end("ROLLBACK");
    if (m_locked) {
        struct flock whole {};
        whole.l_type = F_UNLCK;
        whole.l_whence = SEEK_SET;
        whole.l_start = *m_locked;
        whole.l_len = 1;
        ::fcntl(m_locks->number(), F_OFD_SETLK, &whole);
        m_locked.reset();
    }
}

bool Book::lock(const QString& name) {
    const QByteArray hash = QCryptographicHash::hash(name.toUtf8(), QCryptographicHash::Sha1);
    struct flock byte {};
    byte.l_type = F_WRLCK;
    byte.l_whence = SEEK_SET;
    byte.l_start = static_cast<off_t>(hash.first(7).toHex().toULongLong(nullptr, 16));
    byte.l_len = 1;
    if (::fcntl(m_locks->number(), F_OFD_SETLK, &byte) != 0)
        return false;
    m_locked = byte.l_start;
    return true;
}

Result<qint64> Book::now() {
    if (!m_server)
        return QDateTime::currentMSecsSinceEpoch();
    auto row = run(u"SELECT (extract(epoch FROM clock_timestamp()) * 1000)::bigint"_s);
    if (!row)
        return row.failure();
    return row->next() ? row->value(0).toLongLong() : 0;
}

Result<void> Book::enter(const QStringList& names) {
    const Result<qint64> moment = now();
    if (!moment)
        return moment.failure();
    if (names.isEmpty())
        return {};
    auto rows = run(u"SELECT name FROM desk_orders"_s);
    if (!rows)
        return rows.failure();
    QSet<QString> known;
    while (rows->next())
        known += rows->value(0).toString();
    rows->finish();
    for (const QString& name : names) {
        if (known.contains(name))
            continue;
        const auto entered =
            run(u"INSERT INTO desk_orders (name, state, trace, words, desk, room, tries, prints, copies, failed, seen, "
                u"due, recheck, ready, version) VALUES (?, 'waiting', '', '', '', '', 0, 0, 0, 0, ?, ?, 0, 0, 0) "
                u"ON CONFLICT (name) DO NOTHING"_s,
                {name, *moment, *moment});
        if (!entered)
            return entered.failure();
    }
    return {};
}

Result<void> Book::takeUp(const QString& name) {
    const auto changed = run(u"UPDATE desk_orders SET state = 'waiting', trace = '', due = 0, version = version + 1 "
                             u"WHERE name = ? AND state = 'gone'"_s,
                             {name});
    return changed ? Result<void>() : Result<void>(changed.failure());
}

Result<std::optional<DeskOrder>> Book::claim(const QString& desk) {
    drop();
    const Result<qint64> moment = now();
    if (!moment)
        return moment.failure();
    if (m_server) {
        if (const auto begun = begin(); !begun)
            return begun.failure();
    }
    auto claimed = claimRow(desk, *moment);
    if (!claimed || !*claimed)
        drop();
    return claimed;
}

Result<std::optional<DeskOrder>> Book::claimRow(const QString& desk, qint64 moment) {
    const QString select = u"SELECT "_s + columns + u" FROM desk_orders WHERE "_s;
    const QString limit = m_server ? u" LIMIT 1 FOR UPDATE SKIP LOCKED"_s : u" LIMIT 64"_s;
    auto rows = run(select + dueOnes + limit, {desk, moment, moment});
    if (!rows)
        return rows.failure();
    QList<DeskOrder> orders;
    while (rows->next())
        orders += orderOf(*rows);
    rows->finish();
    if (m_server)
        return orders.isEmpty() ? std::nullopt : std::optional(orders[0]);
    for (const DeskOrder& order : orders) {
        if (!lock(order.name))
            continue;
        // Who had it may have saved it between the list and the lock.
        auto row = run(select + u"name = ? AND version = ?"_s, {order.name, order.version});
        if (!row)
            return row.failure();
        if (row->next())
            return std::optional(order);
        drop();
    }
    return std::optional<DeskOrder>();
}

Result<bool> Book::save(DeskOrder& order, Then then, const Entries& entries) {
    const auto write = [&]() -> Result<bool> {
        auto changed =
            run(u"UPDATE desk_orders SET state = ?, trace = ?, words = ?, desk = ?, room = ?, tries = ?, prints = ?, "
                u"copies = ?, failed = ?, due = ?, recheck = ?, ready = ?, version = version + 1 WHERE name = ? AND "
                u"version = ?"_s,
                {wordOf(order.state), order.trace, order.words, order.desk, order.room, order.tries, order.prints,
                 order.copies, order.failed, order.due, order.recheck, order.ready, order.name, order.version});
        if (!changed)
            return changed.failure();
        if (changed->numRowsAffected() != 1)
            return false;
        if (!entries.prints.isEmpty()) {
            if (const auto removed = run(u"DELETE FROM desk_prints WHERE name = ?"_s, {order.name}); !removed)
                return removed.failure();
        }
        for (const DeskOrder::Prints& row : entries.prints) {
            const auto added = run(u"INSERT INTO desk_prints (name, size, paper, border, copies, files) VALUES (?, ?, "
                                   u"?, ?, ?, ?)"_s,
                                   {order.name, row.size, row.paper, row.border, row.copies, row.files});
            if (!added)
                return added.failure();
        }
        if (!entries.fault.isEmpty()) {
            const Result<qint64> moment = now();
            if (!moment)
                return moment.failure();
            const auto added = run(u"INSERT INTO desk_faults (name, at, words) VALUES (?, ?, ?)"_s,
                                   {order.name, *moment, entries.fault});
            if (!added)
                return added.failure();
        }
        return true;
    };
    if (const auto begun = begin(); !begun)
        return begun.failure();
    const Result<bool> written = write();
    if (!written || !*written) {
        drop();
        return written;
    }
    if (const auto ended = end("COMMIT"); !ended) {
        drop();
        return ended.failure();
    }
    ++order.version;
    if (then == Then::Drop) {
        drop();
        return true;
    }
    if (!m_server)
        return true; // the byte is still locked
    if (const auto begun = begin(); !begun)
        return begun.failure();
    auto row = run(u"SELECT version FROM desk_orders WHERE name = ? AND version = ? FOR UPDATE SKIP LOCKED"_s,
                   {order.name, order.version});
    if (!row || !row->next()) {
        drop();
        return row ? Result<bool>(false) : Result<bool>(row.failure());
    }
    return true;
}

Result<QList<DeskOrder>> Book::list(const QList<State>& states, const QString& desk) {
    QList<DeskOrder> orders;
    for (const State state : states) {
        const bool own = state == State::Ready && !desk.isEmpty();
        auto rows = run(u"SELECT "_s + columns +
                            u" FROM desk_orders WHERE state = ? AND (1 = ? OR desk = ?) ORDER BY "_s + u"name"_s,
                        {wordOf(state), own ? 0 : 1, desk});
        if (!rows)
            return rows.failure();
        while (rows->next())
            orders += orderOf(*rows);
    }
    return orders;
}

Result<Book::Period> Book::period(qint64 from, qint64 before) {
    Period period;
    const QVariantList ends{from, before};
    auto rows = run(u"SELECT "_s + columns +
                        u" FROM desk_orders WHERE state IN ('ready', 'placed') AND ready >= ? AND ready < ? ORDER BY "
                        u"ready, name"_s,
                    ends);
    if (!rows)
        return rows.failure();
    while (rows->next())
        period.orders += orderOf(*rows);
    rows =
        run(u"SELECT p.size, p.paper, p.border, SUM(p.copies * p.files), SUM(p.files) FROM desk_prints p JOIN "
            u"desk_orders o ON o.name = p.name WHERE o.state IN ('ready', 'placed') AND o.ready >= ? AND o.ready < ? "
            u"GROUP BY p.size, p.paper, p.border ORDER BY 4 DESC, 1, 2, 3"_s,
            ends);
    if (!rows)
        return rows.failure();
    while (rows->next())
        period.prints += {rows->value(0).toString(), rows->value(1).toString(), rows->value(2).toString(),
                          rows->value(3).toInt(), rows->value(4).toInt()};
    rows = run(u"SELECT f.name, f.at, f.words, o.state, o.words FROM desk_faults f JOIN desk_orders o ON o.name = "
               u"f.name WHERE "
               u"f.at >= ? AND f.at < ? ORDER BY f.at, f.name"_s,
               ends);
    if (!rows)
        return rows.failure();
    while (rows->next()) {
        const QString state = rows->value(3).toString();
        period.faults +=
            {rows->value(0).toString(), rows->value(1).toLongLong(), rows->value(2).toString(),
             state == wordOf(State::Placed) || (state == wordOf(State::Ready) && rows->value(4).toString().isEmpty())};
    }
    return period;
}

} // namespace lumora
