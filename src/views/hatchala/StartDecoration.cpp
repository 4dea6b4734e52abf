#include "views/hatchala/StartDecoration.h"

#include "start/StartMotion.h"
#include "views/kit/CardButtons.h"

#include <QPainter>
#include <QPainterPath>

#include <cmath>
#include <numbers>

namespace lumora {

void Prints::show(bool back, bool front) {
    if (m_back == back && m_front == front)
        return;
    m_back = back;
    m_front = front;
    update();
}

void Prints::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const double unit = std::min(width() / 1.25, height() / 1.0);
    const auto print = [&](QPointF at, double angle, double w, double h) {
        painter.save();
        painter.translate(rect().center() + at * unit);
        painter.rotate(angle);
        const QRectF paper(-w * unit / 2, -h * unit / 2, w * unit, h * unit);
        for (int i = 4; i > 0; --i) {
            painter.setPen(Qt::NoPen);
            painter.setBrush(QColor(0x1D, 0x25, 0x2C, 9));
            painter.drawRoundedRect(paper.adjusted(-i, -i + 3, i, i + 4), 4, 4);
        }
        painter.fillRect(paper, Qt::white);
        const double edge = unit * 0.022;
        drawSamplePicture(painter, paper.adjusted(edge, edge, -edge, -edge));
        painter.restore();
    };
    if (m_back) {
        print({-0.22, -0.10}, -9, 0.62, 0.43);
        print({0.26, -0.03}, 8, 0.40, 0.58);
    }
    if (m_front)
        print({-0.03, 0.17}, -2, 0.66, 0.45);
}

ArrowStrip::ArrowStrip(const Theme& theme, QWidget* target, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme)
    , m_target(target) {
    setFixedHeight(theme.px(26));
    setAttribute(Qt::WA_TransparentForMouseEvents);
}

QRect ArrowStrip::place() const {
    if (!m_target)
        return {};
    QRect place(0, 0, m_theme.px(84), height());
    place.moveCenter({mapFromGlobal(m_target->mapToGlobal(m_target->rect().center())).x(), height() / 2});
    return place;
}

void ArrowStrip::setPhase(double phase) {
    if (m_phase == phase)
        return;
    m_phase = phase;
    update(place());
}

void ArrowStrip::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const QRectF at = place();
    const double arm = m_theme.px(6);
    QColor colour = Theme::Colour::Primary;
    // The arrows are faint at both ends of their way, so that their return to the top is not seen.
    colour.setAlphaF(static_cast<float>(0.25 + 0.6 * std::sin(m_phase * std::numbers::pi)));
    painter.setPen(QPen(colour, m_theme.thick(), Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    const double top = at.top() + m_theme.px(6) + m_phase * m_theme.px(6);
    for (const int i : {-1, 0, 1}) {
        const double x = at.center().x() + i * arm * 4;
        const QPointF points[] = {{x - arm, top}, {x, top + arm}, {x + arm, top}};
        painter.drawPolyline(points, 3);
    }
}

AdvertisingPicture::AdvertisingPicture(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme) {
    setFixedSize(theme.px(StartMotion::pictureWidth), theme.px(112));
}

void AdvertisingPicture::setPicture(const QImage& picture) {
    m_picture = picture;
    m_card = {};
    update();
}

void AdvertisingPicture::setOpening(double share) {
    if (m_opening == share)
        return;
    m_opening = share;
    update();
}

void AdvertisingPicture::paintEvent(QPaintEvent*) {
    if (m_picture.isNull())
        return;
    const double ratio = devicePixelRatioF();
    if (m_card.size() != size() * ratio) {
        m_card = QPixmap(size() * ratio);
        m_card.setDevicePixelRatio(ratio);
        m_card.fill(Qt::transparent);
        QPainter painter(&m_card);
        painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
        QRectF box(QPointF(), QSizeF(m_picture.size()).scaled(size(), Qt::KeepAspectRatio));
        box.moveCenter(QRectF(rect()).center());
        QPainterPath corners;
        corners.addRoundedRect(box, m_theme.gap(), m_theme.gap());
        painter.setClipPath(corners);
        const QImage scaled =
            m_picture.scaled((box.size() * ratio).toSize(), Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
        painter.drawImage(box, scaled);
    }
    QPainter painter(this);
    const double open = QSizeF(m_picture.size()).scaled(size(), Qt::KeepAspectRatio).width() * m_opening;
    painter.setClipRect(QRectF((width() - open) / 2, 0, open, height()));
    painter.drawPixmap(0, 0, m_card);
}

} // namespace lumora
