#include "views/kit/PaletteBar.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>

#include <algorithm>

namespace lumora {

PaletteBar::PaletteBar(const Theme& theme, std::function<void(QPoint)> pressed, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme)
    , m_pressed(std::move(pressed)) {
    setFocusPolicy(Qt::TabFocus);
    setLayoutDirection(Qt::LeftToRight);
}

void PaletteBar::show(const QImage& palette, QRgb chosen) {
    if (palette.cacheKey() == m_palette.cacheKey() && chosen == m_chosen)
        return;
    m_palette = palette;
    m_chosen = chosen;
    update();
}

int PaletteBar::fields() const {
    return m_palette.isNull() ? 0 : m_palette.width() / m_palette.height();
}

int PaletteBar::chosenField() const {
    for (int field = 0; field < fields(); ++field) {
        const int middle = m_palette.height() / 2;
        if ((m_palette.pixel(field * m_palette.height() + middle, middle) | 0xFF000000) == (m_chosen | 0xFF000000))
            return field;
    }
    return -1;
}

void PaletteBar::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const double step = fields() > 0 ? double(width()) / fields() : width();
    for (int field = 0; field < fields(); ++field) {
        const double inset = m_theme.size(Space::Tight);
        const QRectF box = QRectF(field * step, 0, step, height()).adjusted(inset, inset, -inset, -inset);
        const double corner = m_theme.size(Space::Small);
        const QColor colour(m_palette.pixel(field * m_palette.height(), 0));
        painter.setPen(QPen(Theme::Colour::Edge, m_theme.edge()));
        painter.setBrush(colour);
        painter.drawRoundedRect(box, corner, corner);
        if (field == chosenField()) {
            painter.setPen(QPen(Theme::Colour::Primary, m_theme.thick()));
            painter.setBrush(Qt::NoBrush);
            const double out = m_theme.hair();
            painter.drawRoundedRect(box.adjusted(-out, -out, out, out), corner, corner);
        }
    }
}

void PaletteBar::press(QPointF at) {
    if (m_palette.isNull() || !rect().contains(at.toPoint()))
        return;
    const int x = static_cast<int>(at.x() * m_palette.width() / width());
    const int y = static_cast<int>(at.y() * m_palette.height() / height());
    m_pressed({std::clamp(x, 0, m_palette.width() - 1), std::clamp(y, 0, m_palette.height() - 1)});
}

void PaletteBar::mousePressEvent(QMouseEvent* event) {
    if (event->button() == Qt::LeftButton)
        press(event->position());
}

void PaletteBar::keyPressEvent(QKeyEvent* event) {
    const int step = event->key() == Qt::Key_Right ? 1 : event->key() == Qt::Key_Left ? -1 : 0;
    if (step == 0 || fields() == 0)
        return QWidget::keyPressEvent(event);
    const int middle = m_palette.height() / 2;
    const QPoint pixel(std::clamp(chosenField() + step, 0, fields() - 1) * m_palette.height() + middle, middle);
    m_chosen = m_palette.pixel(pixel); // the next key may come before the page is drawn
    update();
    m_pressed(pixel);
}

} // namespace lumora
