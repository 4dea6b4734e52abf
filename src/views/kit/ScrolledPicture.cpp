#include "views/kit/ScrolledPicture.h"

#include "views/kit/Painting.h"

#include <QMouseEvent>
#include <QScrollBar>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

ScrolledPicture::ScrolledPicture(const Theme& theme, QWidget* parent, QSize window, int step)
    : QAbstractScrollArea(parent)
    , m_theme(theme)
    , m_step(step) {
    // A picture has no reading direction.
    setLayoutDirection(Qt::LeftToRight);
    setFrameShape(QFrame::NoFrame);
    setFocusPolicy(Qt::NoFocus);
    setProperty("ownDrag", true);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    setFixedSize(theme.px(window.width()) + verticalScrollBar()->sizeHint().width(),
                 theme.px(window.height()) + horizontalScrollBar()->sizeHint().height());
    setCornerWidget(new QWidget(this));
    connect(horizontalScrollBar(), &QScrollBar::valueChanged, this, &ScrolledPicture::movedAcross);
    connect(verticalScrollBar(), &QScrollBar::valueChanged, this, &ScrolledPicture::movedDown);
}

void ScrolledPicture::setPicture(const QImage& picture) {
    if (picture.cacheKey() == m_picture.cacheKey())
        return;
    m_picture = picture;
    viewport()->update();
}

void ScrolledPicture::setScroll(QPoint value, QPoint max) {
    const auto set = [](QScrollBar& bar, int to, int last) {
        const QSignalBlocker quiet(bar);
        bar.setRange(0, last);
        bar.setValue(to);
    };
    set(*horizontalScrollBar(), value.x(), max.x());
    set(*verticalScrollBar(), value.y(), max.y());
    // A bar that can't be moved says nothing.
    const auto policy = [](int last) { return last > 0 ? Qt::ScrollBarAlwaysOn : Qt::ScrollBarAlwaysOff; };
    setHorizontalScrollBarPolicy(policy(max.x()));
    setVerticalScrollBarPolicy(policy(max.y()));
    viewport()->update();
}

void ScrolledPicture::paintEvent(QPaintEvent*) {
    QPainter painter(viewport());
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    painter.fillRect(viewport()->rect(), Theme::Colour::Sunken);
    paintPicture(painter);
    painter.setPen(Theme::Colour::Line);
    painter.drawRect(viewport()->rect().adjusted(0, 0, -1, -1));
}

void ScrolledPicture::paintPicture(QPainter& painter) const {
    if (m_picture.isNull()) {
        drawIcon(painter, QRectF(viewport()->rect()).center(),
                 m_theme.icon(u"document"_s, m_theme.size(IconSize::Page), Theme::Colour::Edge));
        return;
    }
    const double scale = m_theme.factor();
    QRectF place(QPointF(-horizontalScrollBar()->value(), -verticalScrollBar()->value()) * m_step * scale,
                 QSizeF(m_picture.size()) * scale);
    if (place.width() < viewport()->width())
        place.moveLeft((viewport()->width() - place.width()) / 2);
    if (place.height() < viewport()->height())
        place.moveTop((viewport()->height() - place.height()) / 2);
    painter.drawImage(place, m_picture);
}

void ScrolledPicture::mousePressEvent(QMouseEvent* event) {
    m_grabbed = event->position().toPoint();
    m_from = {horizontalScrollBar()->value(), verticalScrollBar()->value()};
}

void ScrolledPicture::mouseMoveEvent(QMouseEvent* event) {
    const QPoint way = event->position().toPoint() - m_grabbed;
    const int step = std::max(1, m_theme.px(m_step));
    horizontalScrollBar()->setValue(m_from.x() - way.x() / step);
    verticalScrollBar()->setValue(m_from.y() - way.y() / step);
}

} // namespace lumora
