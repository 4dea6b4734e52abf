#include "views/tFrmNew/FilmStrip.h"

namespace lumora {

using namespace Qt::StringLiterals;

StripCell::StripCell(const Theme& theme, QWidget* parent)
    : CardButton(theme, parent) {
    setCardSize({64, 62});
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
}

void StripCell::show(const Look& look) {
    m_look = look;
    setEnabled(look.filled);
    update();
}

void StripCell::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    const bool lively = underMouse() && m_look.filled;
    const QRectF card = drawCard(painter, rect(),
                                 m_look.open ? Theme::Colour::SunEdge
                                 : lively    ? Theme::Colour::Primary
                                             : Theme::Colour::Line,
                                 m_look.open     ? Theme::Colour::SunSoft
                                 : m_look.filled ? Theme::Colour::Surface
                                                 : Theme::Colour::Paper,
                                 m_look.open ? theme().thick()
                                 : lively    ? theme().hair()
                                             : theme().edge(),
                                 theme().px(9));
    if (!m_look.filled)
        return;
    const double inset = theme().px(5);
    const QRectF room = card.adjusted(inset, inset, -inset, -inset);
    if (m_look.picture.isNull())
        drawIcon(painter, room.center(), theme().icon(u"picture"_s, theme().px(28), Theme::Colour::Edge));
    else
        drawImage(painter, room, m_look.picture);
    painter.setLayoutDirection(layoutDirection());
    if (m_look.open)
        drawMark(painter, theme(), card,
                 {.icon = u"edit"_s,
                  .disc = Theme::Colour::Sun,
                  .ink = Theme::Colour::Ink,
                  .radius = 10,
                  .inset = 2,
                  .rim = 1});
    else if (m_look.ordered)
        drawMark(painter, theme(), card,
                 {.icon = u"tick"_s, .disc = Theme::Colour::Primary, .radius = 10, .inset = 2, .rim = 1});
}

} // namespace lumora
