#pragma once

#include "common/Result.h"
#include "desk/Book.h"
#include "desk/HotFolder.h"
#include "desk/PrintLayout.h"
#include "order/PrintFile.h"

#include <QSet>
#include <QString>

#include <filesystem>
#include <functional>

namespace lumora {

// The lab's desk: orders that arrive in a folder are judged, and the prints of whole ones go to the hot folder, each
// exactly once. Several processes may do it side by side; each may be ended at any moment.
class DeskWatch {
public:
    struct Settings {
        std::filesystem::path folder; // of the orders
        PrintLayout layout;
        PrintFileShape shape;
        qint64 quiet = 30000; // milliseconds without a change before an order is judged
    };
    enum class Tone { Done, Fault };
    using Tell = std::function<void(Tone, const QString&)>;

    DeskWatch(Settings settings, Book& book, const HotFolder& hotFolder, Tell tell)
        : m_settings(std::move(settings))
        , m_book(book)
        , m_hotFolder(hotFolder)
        , m_tell(std::move(tell)) {}

    // Tells the orders that are faulty, and removes what ended processes have left in the hot folder.
    Result<void> begin();
    // Enters the orders of the folder into the book.
    Result<void> look();
    // One step of one order that is due. False when there is none. A failure is one of the book.
    Result<bool> step();
    // Whether no order waits any more for being judged or placed.
    Result<bool> allDone();

    // The line of an order in the list of the day on which it was made ready.
    static QString listOf(const DeskOrder& order);
    static QByteArray lineOf(const DeskOrder& order);
    static inline const QByteArray listHead = "time,order,number,prints,copies,failed,sheet";

private:
    Result<bool> lookAt(DeskOrder order);
    Result<bool> judge(DeskOrder order);
    Result<bool> makeReady(DeskOrder order, const QString& room, const ArrivedOrder& arrived);
    Result<bool> place(DeskOrder order);
    Result<bool> save(DeskOrder& order, qint64 after, const Book::Entries& entries = {});
    Result<bool> putOff(DeskOrder order, const QString& why);
    qint64 pause(const DeskOrder& order) const; // before the next try
    qint64 shortPause() const;                  // before the next look at the names of a faulty order
    std::filesystem::path folderOf(const DeskOrder& order) const;
    bool hasChanged(const DeskOrder& order) const; // since it was looked at

    Settings m_settings;
    Book& m_book;
    const HotFolder& m_hotFolder;
    Tell m_tell;
    QSet<QString> m_seen;
};

// Judges one order and places it at once, as a lab does by hand; no book is asked. The failure tells what is missing.
// What was cut off goes on with the next call: what has moved to its place is not placed again.
Result<DeskOrder> exportOrder(const std::filesystem::path& folder, const HotFolder& hotFolder,
                              const PrintLayout& layout, PrintFileShape shape);

} // namespace lumora
