#pragma once

#include "common/HostFile.h"
#include "common/Result.h"

#include <QList>
#include <QString>
#include <QStringList>
#include <QVariantList>

#include <memory>
#include <optional>

class QSqlQuery;

namespace lumora {

// What the book knows of one order.
struct DeskOrder {
    enum class State {
        Waiting, // seen; it is judged once nothing of it has changed for a while
        Faulty,  // judged; words tell what is missing
        Ready,   // its prints lie in a room of the hot folder with the id desk, and move from there to their places
        Placed,  // done for good
        Gone,    // its folder is no longer there
    };
    // A row of prints: how many print files of the order have these words.
    struct Prints {
        QString size, paper, border;
        int copies = 0;
        int files = 0;
    };

    QString name;
    State state = State::Waiting;
    QString trace; // of its folder when it was last looked at
    QString words; // what is missing, or why it was put off; empty once that is mended
    QString desk, room;
    int tries = 0;      // how often it was begun
    int prints = 0;     // print files
    int copies = 0;     // sheets of paper
    int failed = 0;     // pictures that the customer's side could not prepare
    qint64 seen = 0;    // times in milliseconds since 1970, by the book's clock
    qint64 due = 0;     // when it is looked at next
    qint64 recheck = 0; // when a faulty order is judged again although nothing has changed
    qint64 ready = 0;   // when its prints were made ready
    qint64 version = 0;
};

// The state of each order, in an SQLite file or in PostgreSQL, for several processes at once. Of an order that is
// claimed no other process gets a claim until it is saved, dropped, or this process ends in any way.
class Book {
public:
    // where: the path of a file, or postgresql://user@host/name.
    static Result<std::unique_ptr<Book>> open(const QString& where);
    ~Book();
    Book(const Book&) = delete;
    Book& operator=(const Book&) = delete;

    Result<qint64> now();

    // Enters the orders that the book does not know.
    Result<void> enter(const QStringList& names);
    // An order that was gone is there again.
    Result<void> takeUp(const QString& name);

    // The order that is due first; ready ones of this hot folder come first of all. No value when none is due or others
    // have them.
    Result<std::optional<DeskOrder>> claim(const QString& desk);

    enum class Then { Drop, Hold };
    struct Entries {
        QList<DeskOrder::Prints> prints; // of an order that is made ready
        QString fault;                   // words for the list of faults
    };
    // Writes the order; no part of it without the other. False, and nothing is written, when another process has had it
    // since it was claimed, as after a line to the server that was cut. With Hold the claim goes on.
    Result<bool> save(DeskOrder& order, Then then, const Entries& entries = {});
    void drop();

    // Orders in these states; Ready counts only those of this hot folder.
    Result<QList<DeskOrder>> list(const QList<DeskOrder::State>& states, const QString& desk = {});

    // For reports: orders by the time when they were made ready, faults by the time when they were told.
    struct Fault {
        QString name;
        qint64 at = 0;
        QString words;
        bool mended = false; // nothing of the order is at fault any more
    };
    struct Period {
        QList<DeskOrder> orders;
        QList<DeskOrder::Prints> prints; // summed up by size, paper and border; copies are sheets of paper
        QList<Fault> faults;
    };
    Result<Period> period(qint64 from, qint64 before);

private:
    Book(QString connection, bool server);
    Result<void> prepare(const QString& where);
    Result<QSqlQuery> run(const QString& sql, const QVariantList& values = {});
    Result<void> begin();
    Result<void> end(const char* word);
    Result<std::optional<DeskOrder>> claimRow(const QString& desk, qint64 now);
    bool lock(const QString& name);

    QString m_connection;
    bool m_server;                     // PostgreSQL
    std::optional<Descriptor> m_locks; // SQLite locks no rows: a byte of this file stands for each
    std::optional<qint64> m_locked;
    bool m_open = false; // a transaction is
};

} // namespace lumora
