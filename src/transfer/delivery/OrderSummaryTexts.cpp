#include "transfer/delivery/OrderSummary.h"

#include "session/SessionState.h"

#include <QPainter>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int pictureWidth = 320;
constexpr int lineHeight = 20;
constexpr int margin = 10;
constexpr int letterHeight = 14;

} // namespace

QStringList OrderSummaryLines(const SessionState& state, const QDate& date) {
    QStringList lines{date.toString(u"dd/MM/yyyy"_s)};
    const bool resend = state.transfer.SugMishloah == Sending::Resend;
    if (resend)
        lines += state.wording(u" משלוח חוזר "_s, u" Resend "_s);
    // The button that these lines name opens the operator's area.
    if (resend && state.mayOpenOperatorArea())
        lines += {state.wording(u" כדי לראות פרטי הזמנה לחץ על "_s, u" To see the order's details press "_s),
                  state.wording(u" הצג יותר פרטים "_s, u" Show more details "_s)};
    if (!resend)
        lines += {state.shemot.n1, state.shemot.n2};
    if (state.MishloachHabaita)
        lines += state.wording(u" משלוח עד הבית "_s, u" Home delivery "_s);
    lines += state.shemot.ppr + state.shemot.Bord + u' ' + state.shemot.maat;
    lines += state.shemot.Hearot;
    lines += state.wording(u" סך תמונות "_s, u" Total pictures "_s) + QString::number(state.shemot.TotalPics);
    lines += QStringList(4, QString());
    return lines;
}

Bitmap OrderSummaryPicture(const QStringList& lines, Qt::LayoutDirection direction) {
    Bitmap picture(pictureWidth, margin * 2 + lineHeight * static_cast<int>(lines.size()), Qt::white);
    if (picture.isNull())
        return picture;
    QPainter painter(&picture.image());
    QFont font(u"David"_s);
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
