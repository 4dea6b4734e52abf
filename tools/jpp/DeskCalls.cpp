#include "DeskCalls.h"

#include "common/HostFile.h"
#include "desk/Book.h"
#include "desk/DeskReport.h"
#include "desk/DeskWatch.h"
#include "desk/HotFolder.h"
#include "desk/PrintLayout.h"
#include "platform/files/HostPath.h"

#include <QCommandLineParser>
#include <QDate>
#include <QDeadlineTimer>
#include <QDir>
#include <QFileInfo>
#include <QTextStream>
#include <QThread>

#include <algorithm>

using namespace Qt::StringLiterals;

namespace lumora {

namespace {

enum ExitCode { allWell = 0, faultFound = 1, notUnderstood = 2 };

constexpr unsigned long longestRest = 2000; // milliseconds between two looks at the folder

int tell(ExitCode code, const QString& text) {
    QTextStream(code == allWell ? stdout : stderr) << text << Qt::endl;
    return code;
}

} // namespace

void DeskCalls::addOptions(QCommandLineParser& parser) {
    const QString folder = u"FOLDER"_s;
    parser.addOptions({
        {u"into"_s, u"watch, export: the hot folder of the minilabs. report: where it writes (here)."_s, folder},
        {u"layout"_s,
         u"The folders in the hot folder: the words size, paper, border, copies and order, with -, _ or / "
         u"between them (%1)."_s.arg(PrintLayout::usual),
         u"LAYOUT"_s, PrintLayout::usual},
        {u"book"_s,
         u"Where the desk notes what it has done: a file, or postgresql://USER@HOST/NAME where several "
         u"machines work (FOLDER/.desk/book.sqlite)."_s,
         u"BOOK"_s},
        {u"quiet"_s, u"watch: seconds without a change before an order is judged (30)."_s, u"SECONDS"_s, u"30"_s},
        {u"once"_s, u"watch: ends when no order waits any more; 1 when some are faulty."_s},
        {u"from"_s, u"report: first day, YYYY-MM-DD (the first of this month)."_s, u"DAY"_s},
        {u"to"_s, u"report: last day, YYYY-MM-DD (today)."_s, u"DAY"_s},
    });
}

// In the folder of the orders, so that two desks over one folder have one book.
QString DeskCalls::bookOf(const QString& folder) const {
    return m_parser.isSet(u"book"_s) ? m_parser.value(u"book"_s) : QDir(folder).filePath(u".desk/book.sqlite"_s);
}

int DeskCalls::watch(const QString& folder) const {
    bool understood = false;
    const double quiet = m_parser.value(u"quiet"_s).toDouble(&understood);
    if (!understood || quiet < 0 || quiet > 86400)
        return tell(notUnderstood, u"--quiet takes seconds, 0 to 86400."_s);
    if (!m_parser.isSet(u"into"_s))
        return tell(notUnderstood, u"watch needs --into HOTFOLDER."_s);
    const Result<PrintLayout> layout = PrintLayout::parse(m_parser.value(u"layout"_s));
    if (!layout)
        return tell(notUnderstood, layout.failure().message);
    if (!QFileInfo(folder).isDir())
        return tell(faultFound, u"%1: no such folder"_s.arg(folder));
    const Result<HotFolder> hotFolder = HotFolder::open(toHostPath(m_parser.value(u"into"_s)));
    if (!hotFolder)
        return tell(faultFound, hotFolder.failure().message);
    if (!m_parser.isSet(u"book"_s))
        QDir(folder).mkpath(u".desk"_s);

    const DeskWatch::Settings settings{toHostPath(folder), *layout, m_shape, static_cast<qint64>(quiet * 1000)};
    const auto say = [](DeskWatch::Tone tone, const QString& text) {
        tell(tone == DeskWatch::Tone::Done ? allWell : faultFound, text);
    };
    const auto rest = std::clamp(static_cast<unsigned long>(quiet * 500), 20UL, longestRest);
    const bool once = m_parser.isSet(u"once"_s);
    // A server that is restarted must not end the desk: the book is opened anew.
    const auto work = [&](bool& opened) -> Result<bool> {
        const Result<std::unique_ptr<Book>> book = Book::open(bookOf(folder));
        if (!book)
            return book.failure();
        DeskWatch desk(settings, **book, *hotFolder, say);
        if (const auto begun = desk.begin(); !begun)
            return begun.failure();
        opened = true;
        for (;;) {
            if (const auto looked = desk.look(); !looked)
                return looked.failure();
            // Faulty orders are due again and again; they must not keep the new ones from being seen.
            bool due = true;
            for (const QDeadlineTimer turn(static_cast<qint64>(rest)); due && !turn.hasExpired();) {
                const Result<bool> stepped = desk.step();
                if (!stepped)
                    return stepped.failure();
                due = *stepped;
            }
            if (once) {
                const Result<bool> done = desk.allDone();
                if (!done)
                    return done.failure();
                if (*done) {
                    const Result<QList<DeskOrder>> faulty = (*book)->list({DeskOrder::State::Faulty});
                    return faulty ? Result<bool>(faulty->isEmpty()) : Result<bool>(faulty.failure());
                }
            }
            if (!due)
                QThread::msleep(rest);
        }
    };
    for (bool opened = false;;) {
        const Result<bool> ended = work(opened);
        if (ended)
            return *ended ? allWell : faultFound;
        tell(faultFound, ended.failure().message);
        if (once || !opened)
            return faultFound;
        QThread::msleep(5 * longestRest);
    }
}

int DeskCalls::exportOrders(const QStringList& orders) const {
    if (!m_parser.isSet(u"into"_s))
        return tell(notUnderstood, u"export needs --into FOLDER."_s);
    const Result<PrintLayout> layout = PrintLayout::parse(m_parser.value(u"layout"_s));
    if (!layout)
        return tell(notUnderstood, layout.failure().message);
    const Result<HotFolder> target = HotFolder::open(toHostPath(m_parser.value(u"into"_s)));
    if (!target)
        return tell(faultFound, target.failure().message);
    int code = allWell;
    for (const QString& order : orders) {
        const Result<DeskOrder> placed = exportOrder(toHostPath(order), *target, *layout, m_shape);
        if (placed)
            tell(allWell,
                 u"%1: placed, %2 prints, %3 copies"_s.arg(placed->name).arg(placed->prints).arg(placed->copies));
        else
            code = tell(faultFound, placed.failure().message);
    }
    return code;
}

int DeskCalls::report(const QString& folder) const {
    const QDate today = QDate::currentDate();
    const auto day = [&](const QString& option, const QDate& usual) {
        return m_parser.isSet(option) ? QDate::fromString(m_parser.value(option), Qt::ISODate) : usual;
    };
    const QDate from = day(u"from"_s, QDate(today.year(), today.month(), 1));
    const QDate to = day(u"to"_s, today);
    if (!from.isValid() || !to.isValid() || to < from || from.daysTo(to) > 3660)
        return tell(notUnderstood, u"--from and --to take days as 2026-11-30, in this order, ten years at most."_s);
    const QString where = bookOf(folder);
    if (!where.contains(u"://"_s) && !QFileInfo::exists(where))
        return tell(faultFound, u"%1: there is no book of the desk"_s.arg(where));
    const Result<std::unique_ptr<Book>> book = Book::open(where);
    if (!book)
        return tell(faultFound, book.failure().message);
    const Result<DeskReport> report = DeskReport::of(**book, from, to);
    if (!report)
        return tell(faultFound, report.failure().message);
    const QString into = m_parser.value(u"into"_s).isEmpty() ? u"."_s : m_parser.value(u"into"_s);
    std::error_code error;
    if (std::filesystem::create_directories(toHostPath(into), error); error)
        return tell(faultFound, fileFailure(toHostPath(into), u"the folder can't be made"_s, error.value()).message);
    const QString base =
        QDir(into).filePath(u"report-%1-%2"_s.arg(from.toString(Qt::ISODate), to.toString(Qt::ISODate)));
    for (const auto& [ending, bytes] : {std::pair(u".csv"_s, report->csv()), {u".html"_s, report->html()}}) {
        if (const auto written = writeWholeFile(toHostPath(base + ending), bytes); !written)
            return tell(faultFound, written.failure().message);
    }
    return tell(allWell, u"%1 orders, %2 copies, %3 faults: %4.csv, %4.html"_s.arg(report->orders())
                             .arg(report->copies())
                             .arg(report->faults())
                             .arg(base));
}

} // namespace lumora
