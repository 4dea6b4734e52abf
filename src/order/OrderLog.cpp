#include "order/OrderLog.h"

#include "common/FixedText.h"
#include "common/ListOutput.h"
#include "order/OrderFields.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "platform/files/Files.h"

#include <QList>

#include <algorithm>
#include <utility>
#include <variant>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

using Layout = OrderLog::Layout;

// A log line: its key, and the field with its value. Quoted is an integer written as a text, Fixed a text that is the
// same in every log.
struct Quoted {
    std::int16_t* number;
};
struct Fixed {
    QString text;
};
struct Line {
    QString key;
    std::variant<QString*, std::int16_t*, Quoted, OrderKind*, std::optional<QDateTime>*, Fixed> value;
};
using Lines = QList<Line>;

const QString totalFailed = u"-----------Total Failed"_s;
const QString failedPath = u"fail_"_s;
const QString editedFailedPath = u"Failed  "_s;
const QString basketLine = u"Shoora"_s;

const Line zeros{u"00"_s, Fixed{u"00"_s}};
const Line stars{u"***"_s, Fixed{QString(45, u'*')}};

// No page sets these three; the lab's reader expects their lines.
Lines serverLines(OrderLog& log, const QString& sign) {
    return {{u"KeSherLaSharat"_s + sign, Quoted{&log.KeSherLaSharat}},
            {u"HitKasherDerech"_s + sign, &log.HitKasherDerech},
            {u"TaooyotBaHaShvaa"_s + sign, &log.TaooyotBaHaShvaa}};
}

Lines nameLines(OrderLog& log, const QString& prefix) {
    return {{prefix + u"Girsa"_s, &log.shemot.Girsa}, {u"Time"_s, &log.Time}, {u"Hazmana"_s, &log.Hazmana}};
}

Lines linesOf(const OrderFields& fields) {
    Lines lines;
    for (const OrderField& field : fields)
        lines += std::visit([&](auto* value) { return Line{field.key, value}; }, field.value);
    return lines;
}

Lines albumLines(OrderLog& log) {
    return Lines{{u"ser"_s, &log.shemot.ser}, {u"TotalPics"_s, &log.shemot.TotalPics}} +
           linesOf(albumFields(log.album));
}

// The lines above the failed pictures, in the order of the log.
Lines headLines(OrderLog& log, Layout layout) {
    // The lab's reader of an edited order accepts only the kind 5.
    if (layout == Layout::Edited)
        return serverLines(log, u" = "_s) + Lines{zeros} + nameLines(log, u"Shemot."_s) +
               Lines{{u"Option"_s, Fixed{u"5"_s}}} + linesOf(detailFields(log.shemot)) + Lines{stars};
    const bool album = layout == Layout::Album;
    return (album ? Lines{zeros, zeros} : Lines{zeros}) + serverLines(log, {}) +
           Lines{{QString(12, u'-'), Fixed{QString(9, u'-')}}} + nameLines(log, album ? QString() : u"Shemot."_s) +
           Lines{{u"Optint"_s, &log.Optint}} + (album ? albumLines(log) : linesOf(detailFields(log.shemot))) +
           Lines{{u"More Comp = "_s, &log.DchisaAmoka}, stars};
}

struct Writer {
    ListOutput& output;

    void operator()(const QString* text) const { output.text(*text); }
    void operator()(const std::int16_t* number) const { output.number(*number); }
    void operator()(Quoted quoted) const { output.text(QString::number(*quoted.number)); }
    void operator()(const OrderKind* kind) const { output.number(static_cast<std::int16_t>(*kind)); }
    void operator()(const std::optional<QDateTime>* date) const { output.date(*date); }
    void operator()(const Fixed& fixed) const { output.text(fixed.text); }
};

struct Reader {
    const QString& value;

    void operator()(QString* text) const { *text = value; }
    void operator()(std::int16_t* number) const { *number = Val16(value); }
    void operator()(Quoted quoted) const { *quoted.number = Val16(value); }
    void operator()(OrderKind* kind) const { *kind = static_cast<OrderKind>(Val16(value)); }
    void operator()(std::optional<QDateTime>* date) const { *date = ListOutputDate(value); }
    void operator()(const Fixed&) const {}
};

void writeFailed(ListOutput& output, const QStringList& failed) {
    const auto blank = [&output] { output.text(u" "_s).endLine(); };
    output.pair(totalFailed, QString::number(failed.size()) + QString(11, u'-'));
    blank();
    for (const QString& path : failed)
        output.pair(failedPath, path);
    blank();
    output.pair(u"-----------End"_s, u"Of Failed List-------------"_s);
    blank();
    output.pair(QString(11, u'-'), QString(30, u'-'));
    blank();
}

void writeEditedFailed(ListOutput& output, const QStringList& failed) {
    output.pair(stars.key, u"****    Failed    ***************************"_s);
    for (const QString& path : failed)
        output.pair(editedFailedPath, path);
    output.pair(stars.key, std::get<Fixed>(stars.value).text);
}

Layout layoutOf(const QList<ListOutputEntry>& entries) {
    const auto opens = [&](qsizetype at, const QString& key) { return at < entries.size() && entries[at].key == key; };
    if (opens(0, u"KeSherLaSharat = "_s))
        return Layout::Edited;
    return opens(0, zeros.key) && opens(1, zeros.key) ? Layout::Album : Layout::Plain;
}

} // namespace

OrderLog OrderLog::of(const SessionState& state, Layout layout, const QStringList& items, const QStringList& failed,
                      const QDateTime& now) {
    OrderLog log;
    log.layout = layout;
    log.Time = now;
    log.Hazmana = OrderName(state.shemot.TimeOfJob, state.MisparHazmana);
    log.Optint = state.Optint;
    log.DchisaAmoka = state.DchisaAmoka;
    log.KeSherLaSharat = state.transfer.KeSherLaSharat;
    log.HitKasherDerech = state.transfer.HitKasherDerech;
    log.TaooyotBaHaShvaa = state.transfer.TaooyotBaHaShvaa;
    log.shemot = state.shemot;
    log.album = state.album;
    log.failed = failed;
    log.items = items;
    return log;
}

QByteArray OrderLog::write() const {
    ListOutput output;
    OrderLog log = *this; // the lines point to mutable fields
    for (const Line& line : headLines(log, layout)) {
        output.text(line.key);
        std::visit(Writer{output}, line.value);
        output.endLine();
    }
    if (layout == Layout::Edited)
        writeEditedFailed(output, failed);
    else
        writeFailed(output, failed);
    for (const QString& item : items)
        output.pair(basketLine, item);
    return output.bytes();
}

void OrderLog::read(const QByteArray& bytes) {
    const QList<ListOutputEntry> entries = ReadListOutput(bytes);
    layout = layoutOf(entries);
    const Lines lines =
        headLines(*this, Layout::Plain) + headLines(*this, Layout::Album) + headLines(*this, Layout::Edited);
    for (const auto& [key, value] : entries) {
        if (key == basketLine)
            items += value;
        else if (key == failedPath || key == editedFailedPath)
            failed += value;
        else if (key == totalFailed)
            countOfFailed = Val16(value);
        else if (const auto line = std::find_if(lines.begin(), lines.end(),
                                                [&name = key](const Line& one) { return one.key == name; });
                 line != lines.end())
            std::visit(Reader{value}, line->value);
    }
    if (layout == Layout::Edited)
        Optint = OrderKind::EditedPrint;
}

std::optional<OrderLog> ReadOrderLog(const Files& files, const OrderFolder& folder) {
    OrderLog log;
    if (const Result<QByteArray> bytes = files.read(folder.logPath()))
        log.read(*bytes);
    return log.Hazmana.isEmpty() ? std::nullopt : std::optional(std::move(log));
}

} // namespace lumora
