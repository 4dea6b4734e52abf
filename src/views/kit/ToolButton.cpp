#include "views/kit/ToolButton.h"

#include "views/kit/Maker.h"
#include "views/kit/Painting.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

ToolButton::ToolButton(const Theme& theme, QString icon, QSizeF size, QWidget* parent, Handlers handlers)
    : HoldButton(std::move(handlers), parent)
    , m_theme(theme)
    , m_icon(std::move(icon))
    , m_size(size) {
    setRole(this, "tool");
    setAttribute(Qt::WA_Hover);
    setMouseTracking(true);
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
}

void ToolButton::setInk(QColor colour) {
    m_ink = colour;
    update();
}

void ToolButton::setPicture(const QImage& picture) {
    m_picture = picture;
    update();
}

void ToolButton::setMarked(bool marked) {
    if (m_marked == marked)
        return;
    m_marked = marked;
    update();
}

QFont ToolButton::words() const {
    QFont font = m_theme.font(Theme::Type::Small);
    font.setBold(false); // the painter would otherwise use the weight of a button
    // A word that would be cut by the key does not grow with the desktop's letters.
    int longest = 0;
    for (const QString& word : said().split(u' '))
        longest = std::max(longest, QFontMetrics(font).horizontalAdvance(word));
    if (longest > m_theme.px(m_size.width() - 4))
        font.setPixelSize(static_cast<int>(font.pixelSize() / m_theme.growth()));
    return font;
}

QString ToolButton::said() const {
    QString words = text();
    words.replace(u"&&"_s, u"&"_s);
    return withoutIsolation(words);
}

// One line where it fits, else two, broken at the blank that leaves the longer one shortest.
QStringList ToolButton::lines() const {
    const QString whole = said();
    const QFontMetrics metrics(words());
    const int room = m_theme.px(m_size.width()) - m_theme.px(6);
    if (metrics.horizontalAdvance(whole) <= room || !whole.contains(u' '))
        return {whole};
    QStringList best;
    int least = 0;
    for (qsizetype at = whole.indexOf(u' '); at >= 0; at = whole.indexOf(u' ', at + 1)) {
        const QStringList two{whole.left(at), whole.mid(at + 1)};
        const int longer = std::max(metrics.horizontalAdvance(two[0]), metrics.horizontalAdvance(two[1]));
        if (best.isEmpty() || longer < least) {
            best = two;
            least = longer;
        }
    }
    return best;
}

QSize ToolButton::sizeHint() const {
    const QFontMetrics metrics(words());
    int width = m_theme.px(m_size.width());
    for (const QString& line : lines())
        width = std::max(width, metrics.horizontalAdvance(line) + m_theme.px(4));
    return {width, m_theme.px(m_size.height())};
}

QSize ToolButton::minimumSizeHint() const {
    return {std::max(m_theme.least(), m_theme.px(m_size.width() * 0.8)),
            std::max(m_theme.least(), m_theme.px(m_size.height() * 0.9))};
}

void ToolButton::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    const bool lively = isEnabled() && (underMouse() || isDown());
    drawCard(painter, rect(), m_marked || lively ? Theme::Colour::Primary : Theme::Colour::Line,
             !isEnabled()           ? Theme::Colour::Sunken
             : isDown() || m_marked ? Theme::Colour::PrimarySoft
                                    : Theme::Colour::Surface,
             m_marked || isDown() ? m_theme.hair() : m_theme.edge(), m_theme.px(11), m_theme.edgeStyle(isEnabled()));
    if (isDown()) // sunk
        painter.translate(0, m_theme.px(1));

    const QStringList shown = lines();
    const double lineHeight = m_theme.px(16 * m_theme.growth());
    const double under = shown.first().isEmpty() ? 0 : lineHeight * static_cast<double>(shown.size());
    const double signHeight =
        std::min<double>(m_theme.px(m_picture.isNull() ? 26 : 40), height() - under - m_theme.px(6));
    const double gap = m_theme.px(2);
    const double top = (height() - signHeight - gap - under) / 2;
    if (m_picture.isNull()) {
        drawIcon(painter, {width() / 2.0, top + signHeight / 2},
                 m_theme.icon(m_icon, static_cast<int>(signHeight), isEnabled() ? m_ink : Theme::Colour::Muted));
    } else {
        drawImage(painter, QRectF(m_theme.px(6), top, width() - m_theme.px(12), signHeight), m_picture);
    }
    painter.setFont(words());
    painter.setPen(isEnabled() ? Theme::Colour::Ink : Theme::Colour::Muted);
    painter.setLayoutDirection(layoutDirection());
    for (qsizetype i = 0; i < shown.size(); ++i)
        painter.drawText(QRectF(0, top + signHeight + gap + lineHeight * static_cast<double>(i), width(), lineHeight),
                         Qt::AlignCenter | Qt::TextDontClip, shown[i]);
}

} // namespace lumora
