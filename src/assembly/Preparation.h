#pragma once

#include "assembly/OrderSheet.h"
#include "assembly/PrintPacker.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "order/OrderLog.h"

#include <QStringList>

#include <functional>
#include <optional>
#include <vector>

namespace lumora {

struct Platform;
struct SessionState;

enum class PreparationStage { Waiting, Checking, Sheet, Pictures, Closing, Done };

// What the preparation of an order tells the page in front of it.
class PreparationEvents {
public:
    enum class NotWritten { Folder, File, Counter, Log };

    // position: of the picture in work, from 1; 0 before the first.
    virtual void reached(PreparationStage stage, int position) = 0;
    virtual void counted() = 0; // TotalPics of the session
    virtual void inWork(const DrivePath& picture) = 0;
    virtual void printed(const Bitmap& /* small */) {}
    virtual void notPrepared(const DrivePath& picture) = 0;
    // Of several files the first alone is told, and their number at the end.
    virtual void notWritten(NotWritten what, const Failure& failure) = 0;
    virtual void filesNotWritten(int count) = 0;
    virtual void sheetDrawn(const Bitmap& sheet) = 0;
    // Lets the page paint and a click through. False when that click ended the program.
    virtual bool yield() = 0;

protected:
    ~PreparationEvents() = default;
};

// Turns the lines of a basket into an order folder: print files, order sheet, order log and the next order's number.
// What both kinds of order share; each kind has its own prepare().
class Preparation {
public:
    Preparation(SessionState& state, const Platform& platform, PreparationEvents& events)
        : m_state(state)
        , m_platform(platform)
        , m_events(events) {}

    // Sets the copies in all.
    void count(const QStringList& lines);

protected:
    void begin(const QStringList& lines);
    // Claims a free number by making its folder, which the senders are told too. A second start keeps number and
    // folder, less the print files of the first. by: the sender that the order is made for. False when the folder can't
    // be made.
    bool claimFolder(OrderFolder::Ending ending, Sender by);
    // step(i) for each line, and the page painted behind each. False when a click ended the program.
    bool forEachPicture(const std::function<void(int)>& step);
    bool pack(PrintPacker& packer, const PrintPacker::Line& line, const std::function<Result<QByteArray>()>& picture);
    void notPrepared(const DrivePath& picture);
    void notWritten(const Failure& failure);
    // No value when a click ended the program.
    std::optional<Bitmap> drawSheet(SheetKind kind, const QStringList& lines, const QStringList& texts,
                                    const std::vector<SheetCell>& cells);
    // The next order's number.
    void countOrder();
    // False when it can't be written: an order does not leave without its log.
    bool writeLog(OrderLog::Layout layout);

    SessionState& m_state;
    const Platform& m_platform;
    PreparationEvents& m_events;
    QStringList m_lines;
    std::optional<OrderFolder> m_folder; // once it is claimed

private:
    Result<void> readyFolder(OrderFolder::Ending ending);
    void keep(const Result<void>& written);

    std::optional<OrderJournal> m_journal; // of m_folder
    QStringList m_failed;                  // paths of the pictures that could not be prepared
    int m_writeFailures = 0;
};

} // namespace lumora
