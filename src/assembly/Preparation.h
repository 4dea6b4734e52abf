#pragma once

#include "assembly/OrderSheet.h"
#include "assembly/PrintPacker.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "order/OrderLog.h"
#include "session/SessionState.h"

#include <QSet>
#include <QStringList>

#include <functional>
#include <optional>
#include <vector>

namespace lumora {

struct Platform;

// What the preparation of an order tells its page.
class PreparationEvents {
public:
    // Print: a print that failed lies in the folder and can't be removed.
    enum class NotWritten { Folder, File, Print, Sheet, Counter, Log };

    // position: of the picture in work, from 1.
    virtual void packing(int position) = 0;
    virtual void drawingSheet(int position) = 0; // 0 before the first picture
    virtual void closing() = 0;                  // the counter and the order log are written
    virtual void counted() = 0;                  // TotalPics of the session
    virtual void inWork(const DrivePath& picture) = 0;
    virtual void printed(const Bitmap& /* small */) {}
    virtual void notPrepared(const DrivePath& picture) = 0;
    // Of several File failures only the first; filesNotWritten() tells their number at the end.
    virtual void notWritten(NotWritten what, const Failure& failure) = 0;
    virtual void filesNotWritten(int count) = 0;
    // False where the page saves the sheet and could not.
    virtual bool sheetDrawn(const Bitmap& sheet) = 0;
    // Processes paint and input events. False when a click ended the program.
    virtual bool yield() = 0;

protected:
    ~PreparationEvents() = default;
};

// What plain and edited orders share when the lines of a basket become an order folder: print files, order sheet, order
// log and the next order's number. Each kind has its own prepare().
class Preparation {
public:
    Preparation(SessionState& state, const Platform& platform, PreparationEvents& events)
        : m_state(state)
        , m_platform(platform)
        , m_events(events) {}

    // Takes from the hand-over which unfinished order goes on, or which order this one is prepared again from.
    void takeHandOver();
    bool goesOn() const { return m_goesOn; }
    // Sets TotalPics, the sum of the copies.
    void count(const QStringList& lines);
    // The preparation has ended without a print file, and the order does not go on.
    bool endedWithoutPrints() const { return m_withoutPrints; }

protected:
    void begin(const QStringList& lines);
    // Claims a free order number by making its folder, and names that folder to the senders. A second start keeps both
    // and removes the print files of the first. An order that goes on keeps its print files too, as long as its basket
    // and the shape of print files are the same. by: the sender that the order is made for. False when the folder can't
    // be made.
    bool claimFolder(OrderFolder::Ending ending, Sender by);
    // Calls step(i) and yields for each line. False when a click ended the program.
    bool forEachPicture(const std::function<void(int)>& step);
    // True for a line whose print the order has from before.
    bool isThere(int index) const { return m_there.contains(index); }
    // True for a line at whose path another picture stands by now; it is told as not prepared.
    bool isGivenUp(int index, const DrivePath& picture);
    // The lines of which no print is made.
    QSet<int> notMade() const { return m_there | m_others; }
    bool pack(PrintPacker& packer, const PrintPacker::Line& line, const std::function<Result<QByteArray>()>& picture);
    void notPrepared(const DrivePath& picture, LeftOut::Why why);
    // The order is held back: it has a print that failed, no print file, or no sheet. As built in, it goes on in the
    // last two cases.
    bool isHeldBackForPrints();
    bool isHeldBackForSheet(const Failure& failure);
    void notWritten(const Failure& failure);
    // Tells of what is kept for going on with the order: it can be sent without.
    void keep(const Result<void>& written);
    // pictures: of the cells, where somebody else makes them. No value when a click ended the program.
    std::optional<Bitmap> drawSheet(SheetKind kind, const QStringList& lines, const QList<SheetLine>& texts,
                                    const std::vector<SheetCell>& cells, const OrderSheet::NextPicture& pictures = {});
    // Writes the next order's number.
    void countOrder();
    // False when the log can't be written: an order is not sent without it.
    bool writeLog(OrderLog::Layout layout);

    SessionState& m_state;
    const Platform& m_platform;
    PreparationEvents& m_events;
    QStringList m_lines;
    QList<LeftOut> m_noJpeg;             // what was left out for its ending, also before the order went on
    std::optional<OrderFolder> m_folder; // set by claimFolder()
    QSet<int> m_there;                   // indices of the lines whose print is there
    bool m_sheetSaved = true;            // or the page does not save it

private:
    Result<void> readyFolder(OrderFolder::Ending ending);
    Result<void> findPrints();
    Result<void> removePrints() const;
    void removeWhatIsNotNeeded();

    std::optional<OrderJournal> m_journal; // of m_folder
    QStringList m_failed;                  // paths of the pictures that could not be prepared
    QSet<int> m_others;                    // indices of the lines with another picture in their place
    int m_prints = 0;                      // print files that this preparation has made
    bool m_withoutPrints = false;
    bool m_failedPrintStays = false;
    int m_writeFailures = 0;
    bool m_goesOn = false;
    DrivePath m_replaced; // folder of the order that this one is prepared again from, or empty
};

} // namespace lumora
