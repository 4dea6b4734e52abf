#include "transfer/delivery/OrderSummary.h"

#include "session/SessionState.h"

#include <QPainter>

namespace lumora {

namespace {

constexpr int pictureWidth = 320;
constexpr int lineHeight = 20;
constexpr int margin = 10;
constexpr int letterHeight = 14;

} // namespace

QStringList OrderSummaryLines(const SessionState& state, const QDate& date) {
    QStringList lines{date.toString(QStringLiteral("dd/MM/yyyy"))};
    if (state.transfer.SugMishloah == Sending::Resend)
        lines += {state.wording(QStringLiteral(" משלוח חוזר "), QStringLiteral(" Resend ")),
                  state.wording(QStringLiteral(" כדי לראות פרטי הזמנה לחץ על "),
                                QStringLiteral(" To see the order's details press ")),
                  state.wording(QStringLiteral(" הצג יותר פרטים "), QStringLiteral(" Show more details "))};
    else
        lines += {state.shemot.n1, state.shemot.n2};
    if (state.MishloachHabaita)
        lines += state.wording(QStringLiteral("  משלוח עד הבית  "), QStringLiteral("  Home delivery  "));
    lines += state.shemot.ppr + state.shemot.Bord + u' ' + state.shemot.maat;
    lines += state.shemot.Hearot;
    lines += state.wording(QStringLiteral(" סך תמונות "), QStringLiteral(" Total pictures ")) +
             QString::number(state.shemot.TotalPics);
    lines += QStringList(4, QString());
    return lines;
}

Bitmap OrderSummaryPicture(const QStringList& lines, Qt::LayoutDirection direction) {
    Bitmap picture(pictureWidth, margin * 2 + lineHeight * static_cast<int>(lines.size()), Qt::white);
    if (picture.isNull())
        return picture;
    QPainter painter(&picture.image());
    QFont font(QStringLiteral("David"));
    font.setPixelSize(letterHeight);
    painter.setFont(font);
    painter.setPen(Qt::black);
    painter.setLayoutDirection(direction);
    QRect line(margin, margin, pictureWidth - margin * 2, lineHeight);
    for (const QString& text : lines) {
        painter.drawText(line, Qt::AlignLeading | Qt::AlignVCenter | Qt::TextSingleLine, text);
        line.translate(0, lineHeight);
    }
    return picture;
}

} // namespace lumora
