#include "desk/DeskReport.h"

#include <QDateTime>
#include <QMap>
#include <QStringList>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

QString timeText(qint64 moment, const QString& form) {
    return QDateTime::fromMSecsSinceEpoch(moment).toString(form);
}

QByteArray csvLine(const QStringList& fields) {
    QStringList quoted;
    for (QString field : fields) {
        const bool bare = !field.contains(u'"') && !field.contains(u',') && !field.contains(u'\n');
        quoted += bare ? field : u'"' + field.replace(u'"', u"\"\""_s) + u'"';
    }
    return quoted.join(u',').toUtf8() + "\r\n";
}

QString row(const QStringList& cells) {
    QString text = u"<tr>"_s;
    for (const QString& cell : cells)
        text += u"<td>"_s + cell.toHtmlEscaped() + u"</td>"_s;
    return text + u"</tr>\n"_s;
}

const QString reportHead = uR"(<!DOCTYPE html>
<html lang="en"><head><meta charset="utf-8"><title>%1</title><style>
body { font: 15px/1.5 "Noto Sans", sans-serif; color: #22303c; max-width: 52rem; margin: 2rem auto; padding: 0 1rem; }
h1 { font-size: 1.5rem; margin: 0; } h2 { font-size: 1.05rem; margin: 1.6rem 0 .4rem; }
p.when { color: #5b6b78; margin: 0 0 1.2rem; }
.sums { display: flex; gap: 1rem; } .sums div { flex: 1; background: #eef3f6; border-radius: 8px; padding: .7rem 1rem; }
.sums b { display: block; font-size: 1.7rem; line-height: 1.2; }
table { border-collapse: collapse; width: 100%; } td, th { text-align: start; padding: .25rem .8rem .25rem 0;
border-bottom: 1px solid #dbe3e8; vertical-align: top; } th { color: #5b6b78; font-weight: normal; }
svg { width: 100%; height: auto; } svg text { font-size: 12px; fill: #5b6b78; } .bar { fill: #2f7f86; }
</style></head><body>
)"_s;

// The next of 1, 2, 5, 10, 20, 50 ... that is not below the number.
int roundUp(int number) {
    for (int step = 1;; step *= 10) {
        for (const int factor : {1, 2, 5}) {
            if (step * factor >= number)
                return step * factor;
        }
    }
}

} // namespace

Result<DeskReport> DeskReport::of(Book& book, const QDate& from, const QDate& to) {
    Result<Book::Period> period =
        book.period(from.startOfDay().toMSecsSinceEpoch(), to.addDays(1).startOfDay().toMSecsSinceEpoch());
    if (!period)
        return period.failure();
    DeskReport report;
    report.m_from = from;
    report.m_to = to;
    report.m_period = *period;
    return report;
}

int DeskReport::copies() const {
    int sum = 0;
    for (const DeskOrder& order : m_period.orders)
        sum += order.copies;
    return sum;
}

QByteArray DeskReport::csv() const {
    QByteArray text = "part,time,order,size,paper,border,prints,copies,words\r\n";
    const QString form = u"yyyy-MM-ddTHH:mm:ss"_s;
    for (const DeskOrder& order : m_period.orders)
        text += csvLine({u"order"_s,
                         timeText(order.ready, form),
                         order.name,
                         {},
                         {},
                         {},
                         QString::number(order.prints),
                         QString::number(order.copies),
                         order.failed > 0 ? u"%1 pictures failed at the customer's"_s.arg(order.failed) : QString()});
    for (const DeskOrder::Prints& prints : m_period.prints)
        text += csvLine({u"size"_s,
                         {},
                         {},
                         prints.size,
                         prints.paper,
                         prints.border,
                         QString::number(prints.files),
                         QString::number(prints.copies),
                         {}});
    for (const Book::Fault& fault : m_period.faults)
        text += csvLine({u"fault"_s,
                         timeText(fault.at, form),
                         fault.name,
                         {},
                         {},
                         {},
                         {},
                         {},
                         (fault.mended ? u"mended: "_s : u"open: "_s) + fault.words});
    return text;
}

// The copies of each day as bars.
QString DeskReport::plot() const {
    constexpr double left = 44, top = 10, width = 750, height = 200;
    QMap<QDate, int> days;
    for (const DeskOrder& order : m_period.orders)
        days[QDateTime::fromMSecsSinceEpoch(order.ready).date()] += order.copies;
    const qint64 count = m_from.daysTo(m_to) + 1;
    const int most = roundUp(days.isEmpty() ? 1 : *std::max_element(days.cbegin(), days.cend()));
    QString svg = u"<svg viewBox=\"0 0 800 240\" role=\"img\" aria-label=\"Copies by day\">\n"_s;
    for (const double part : {0.0, 0.5, 1.0}) {
        const double y = top + height * (1 - part);
        svg += u"<line x1=\"%1\" x2=\"%2\" y1=\"%3\" y2=\"%3\" stroke=\"#dbe3e8\"/>"
               u"<text x=\"%4\" y=\"%5\" text-anchor=\"end\">%6</text>\n"_s.arg(left)
                   .arg(left + width)
                   .arg(y)
                   .arg(left - 6)
                   .arg(y + 4)
                   .arg(most * part);
    }
    const double step = width / static_cast<double>(count);
    const qint64 labelEach = std::max<qint64>(1, (count + 9) / 10);
    for (qint64 i = 0; i < count; ++i) {
        const QDate day = m_from.addDays(i);
        const double x = left + step * static_cast<double>(i);
        const double bar = height * days.value(day) / most;
        if (bar > 0)
            svg +=
                u"<rect class=\"bar\" x=\"%1\" y=\"%2\" width=\"%3\" height=\"%4\" rx=\"2\"><title>%5: %6</title></rect>\n"_s
                    .arg(x + step * 0.1)
                    .arg(top + height - bar)
                    .arg(std::min(step * 0.8, 60.0))
                    .arg(bar)
                    .arg(day.toString(Qt::ISODate))
                    .arg(days.value(day));
        if (i % labelEach == 0)
            svg += u"<text x=\"%1\" y=\"%2\" text-anchor=\"start\">%3</text>\n"_s.arg(x + step * 0.1)
                       .arg(top + height + 18)
                       .arg(day.toString(u"d.M."_s));
    }
    return svg + u"</svg>\n"_s;
}

QByteArray DeskReport::html() const {
    const QString title = u"Orders of the lab's desk"_s;
    QString text = reportHead.arg(title);
    text += u"<h1>%1</h1><p class=\"when\">%2 to %3</p>\n"_s.arg(title, m_from.toString(Qt::ISODate),
                                                                 m_to.toString(Qt::ISODate));
    int prints = 0;
    for (const DeskOrder& order : m_period.orders)
        prints += order.prints;
    text += u"<div class=\"sums\"><div><b>%1</b>orders</div><div><b>%2</b>pictures</div><div><b>%3</b>copies</div>"
            u"<div><b>%4</b>faults</div></div>\n"_s.arg(orders())
                .arg(prints)
                .arg(copies())
                .arg(faults());
    text += u"<h2>Copies by day</h2>\n"_s + plot();
    text += u"<h2>Prints by size</h2>\n<table><tr><th>Size</th><th>Paper</th><th>Border</th><th>Pictures</th>"
            u"<th>Copies</th></tr>\n"_s;
    for (const DeskOrder::Prints& one : m_period.prints)
        text += row({one.size, one.paper, one.border, QString::number(one.files), QString::number(one.copies)});
    text += u"</table>\n<h2>Faults</h2>\n"_s;
    if (m_period.faults.isEmpty())
        return (text + u"<p>None.</p>\n</body></html>\n"_s).toUtf8();
    text += u"<table><tr><th>Told</th><th>Order</th><th>What was wrong</th><th></th></tr>\n"_s;
    for (const Book::Fault& fault : m_period.faults)
        text += row({timeText(fault.at, u"yyyy-MM-dd HH:mm"_s), fault.name, fault.words,
                     fault.mended ? u"mended"_s : u"open"_s});
    return (text + u"</table>\n</body></html>\n"_s).toUtf8();
}

} // namespace lumora
