#include "views/kit/Cards.h"

#include <QPainter>
#include <QPainterPath>
#include <QTextLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

CardButton::CardButton(const Theme& theme, QWidget* parent)
    : QAbstractButton(parent)
    , m_theme(theme) {
    setFocusPolicy(Qt::TabFocus);
    setAttribute(Qt::WA_Hover);
    setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred);
}

void CardButton::setCardSize(double width, double height) {
    m_size = {width, height};
    updateGeometry();
}

QSize CardButton::sizeHint() const {
    return {m_theme.px(m_size.width()), m_theme.px(m_size.height())};
}

QSize CardButton::minimumSizeHint() const {
    return {std::max(m_theme.px(m_size.width() * 0.7), m_theme.target()),
            std::max(m_theme.px(m_size.height() * 0.8), m_theme.target())};
}

void CardButton::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    const double thick = isChecked() ? m_theme.px(3) : underMouse() && isEnabled() ? m_theme.px(2) : 1;
    const QRectF card = QRectF(rect()).adjusted(thick / 2, thick / 2, -thick / 2, -thick / 2);
    const bool lively = isEnabled() && (underMouse() || isDown());
    painter.setPen(QPen(isChecked() || lively ? Theme::Colour::Primary : Theme::Colour::Line, thick));
    painter.setBrush(!isEnabled()              ? Theme::Colour::Sunken
                     : isChecked() || isDown() ? Theme::Colour::PrimarySoft
                                               : Theme::Colour::Surface);
    painter.drawRoundedRect(card, m_theme.px(16), m_theme.px(16));
    painter.setPen(isEnabled() ? Theme::Colour::Ink : Theme::Colour::Muted);
    paintInside(painter, card.adjusted(m_theme.px(12), m_theme.px(12), -m_theme.px(12), -m_theme.px(12)));
    if (isChecked()) {
        const double radius = m_theme.px(13);
        const double side = layoutDirection() == Qt::RightToLeft ? card.left() + radius + m_theme.px(8)
                                                                 : card.right() - radius - m_theme.px(8);
        const QPointF at(side, card.top() + radius + m_theme.px(8));
        painter.setPen(Qt::NoPen);
        painter.setBrush(Theme::Colour::Primary);
        painter.drawEllipse(at, radius, radius);
        const int size = m_theme.px(18);
        painter.drawPixmap(at - QPointF(size / 2.0, size / 2.0), m_theme.icon(u"tick"_s, size, Qt::white));
    }
}

Tile::Tile(const Theme& theme, QWidget* parent, QString icon)
    : CardButton(theme, parent)
    , m_icon(std::move(icon)) {
    setCardSize(290, 150);
}

void Tile::setExplanation(const QString& text) {
    if (m_explanation == text)
        return;
    m_explanation = text;
    setAccessibleDescription(text);
    update();
}

void Tile::setMarked(bool marked) {
    m_marked = marked;
    update();
}

void Tile::paintInside(QPainter& painter, const QRectF& room) {
    if (room.height() > theme().px(170)) {
        paintUpright(painter, room);
        return;
    }
    const bool rightToLeft = layoutDirection() == Qt::RightToLeft;
    const double disc = std::min<double>(theme().px(60), room.height() * 0.7);
    const double gap = theme().px(16);
    QRectF mark(0, 0, disc, disc);
    mark.moveCenter({rightToLeft ? room.right() - disc / 2 - theme().px(4) : room.left() + disc / 2 + theme().px(4),
                     room.center().y()});
    painter.save();
    painter.setPen(Qt::NoPen);
    painter.setBrush(m_marked ? Theme::Colour::Primary : Theme::Colour::PrimarySoft);
    painter.drawEllipse(mark);
    const int size = static_cast<int>(disc * 0.56);
    painter.drawPixmap(mark.center() - QPointF(size / 2.0, size / 2.0),
                       theme().icon(m_icon, size, m_marked ? QColor(Qt::white) : Theme::Colour::PrimaryDark));
    painter.restore();

    QRectF words = room;
    if (rightToLeft)
        words.setRight(mark.left() - gap);
    else
        words.setLeft(mark.right() + gap);
    const int flags =
        Qt::TextWordWrap | (rightToLeft ? Qt::AlignRight : Qt::AlignLeft) | Qt::AlignAbsolute | Qt::AlignTop;
    painter.setLayoutDirection(layoutDirection());
    const QFont head = theme().font(Theme::Type::Large);
    const QFont body = theme().font(Theme::Type::Small);
    const QRectF headBox = QFontMetricsF(head).boundingRect(words, flags, text());
    const QRectF bodyBox =
        m_explanation.isEmpty() ? QRectF() : QFontMetricsF(body).boundingRect(words, flags, m_explanation);
    const double between = m_explanation.isEmpty() ? 0 : theme().px(4);
    double y = words.top() + std::max(0.0, (words.height() - headBox.height() - between - bodyBox.height()) / 2);
    painter.setFont(head);
    painter.drawText(QRectF(words.left(), y, words.width(), headBox.height() + 2), flags, text());
    y += headBox.height() + between;
    painter.setFont(body);
    painter.setPen(Theme::Colour::Muted);
    painter.drawText(QRectF(words.left(), y, words.width(), words.bottom() - y + theme().px(8)), flags, m_explanation);
}

void Tile::paintUpright(QPainter& painter, const QRectF& room) {
    const double disc = theme().px(84);
    const int flags = Qt::TextWordWrap | Qt::AlignHCenter | Qt::AlignTop;
    painter.setLayoutDirection(layoutDirection());
    const QFont head = theme().font(Theme::Type::Large);
    const QFont body = theme().font(Theme::Type::Body);
    const QRectF words = room.adjusted(theme().px(4), 0, -theme().px(4), 0);
    const double headHeight = QFontMetricsF(head).boundingRect(words, flags, text()).height();
    const double bodyHeight =
        m_explanation.isEmpty() ? 0 : QFontMetricsF(body).boundingRect(words, flags, m_explanation).height();
    double y = room.center().y() - (disc + theme().px(18) + headHeight + theme().px(6) + bodyHeight) / 2;
    const QRectF mark(room.center().x() - disc / 2, y, disc, disc);
    painter.save();
    painter.setPen(Qt::NoPen);
    painter.setBrush(m_marked ? Theme::Colour::Primary : Theme::Colour::PrimarySoft);
    painter.drawEllipse(mark);
    const int size = static_cast<int>(disc * 0.54);
    painter.drawPixmap(mark.center() - QPointF(size / 2.0, size / 2.0),
                       theme().icon(m_icon, size, m_marked ? QColor(Qt::white) : Theme::Colour::PrimaryDark));
    painter.restore();
    y += disc + theme().px(18);
    painter.setFont(head);
    painter.drawText(QRectF(words.left(), y, words.width(), headHeight + 2), flags, text());
    y += headHeight + theme().px(6);
    painter.setFont(body);
    painter.setPen(Theme::Colour::Muted);
    painter.drawText(QRectF(words.left(), y, words.width(), bodyHeight + 2), flags, m_explanation);
}

void drawSamplePicture(QPainter& painter, const QRectF& box) {
    painter.save();
    painter.setPen(Qt::NoPen);
    painter.setClipRect(box, Qt::IntersectClip);
    QLinearGradient sky(box.topLeft(), box.bottomLeft());
    sky.setColorAt(0, QColor(0xBF, 0xDD, 0xE6));
    sky.setColorAt(1, QColor(0xF7, 0xE9, 0xCF));
    painter.fillRect(box, sky);
    painter.setBrush(Theme::Colour::Sun);
    const double unit = std::min(box.width(), box.height());
    painter.drawEllipse(QPointF(box.left() + box.width() * 0.30, box.top() + box.height() * 0.34), unit * 0.12,
                        unit * 0.12);
    const auto hill = [&](QColor colour, double a, double b, double c) {
        QPainterPath path(box.bottomLeft());
        path.lineTo(box.left(), box.top() + box.height() * a);
        path.quadTo(box.left() + box.width() * 0.45, box.top() + box.height() * b, box.right(),
                    box.top() + box.height() * c);
        path.lineTo(box.bottomRight());
        path.closeSubpath();
        painter.setBrush(colour);
        painter.drawPath(path);
    };
    hill(QColor(0x6F, 0xA6, 0xA0), 0.72, 0.34, 0.60);
    hill(QColor(0x2F, 0x7A, 0x77), 0.66, 0.88, 0.74);
    painter.restore();
}

void drawSamplePrint(QPainter& painter, const QRectF& paper, PaperFinish finish) {
    drawSamplePicture(painter, paper);
    painter.save();
    painter.setClipRect(paper, Qt::IntersectClip);
    switch (finish) {
    case PaperFinish::Matte:
        painter.fillRect(paper, QColor(255, 255, 255, 70));
        break;
    case PaperFinish::Glossy: {
        QPainterPath shine(paper.topLeft() + QPointF(paper.width() * 0.52, 0));
        shine.lineTo(paper.left() + paper.width() * 0.80, paper.top());
        shine.lineTo(paper.left() + paper.width() * 0.46, paper.bottom());
        shine.lineTo(paper.left() + paper.width() * 0.18, paper.bottom());
        shine.closeSubpath();
        painter.fillPath(shine, QColor(255, 255, 255, 110));
        break;
    }
    case PaperFinish::Silk: {
        // Woven: two sets of fine lines across one another.
        painter.setPen(QPen(QColor(255, 255, 255, 95), 1));
        const double pace = paper.height() / 28;
        for (double at = paper.left() - paper.height(); at < paper.right(); at += pace) {
            painter.drawLine(QPointF(at, paper.top()), QPointF(at + paper.height(), paper.bottom()));
            painter.drawLine(QPointF(at + paper.height(), paper.top()), QPointF(at, paper.bottom()));
        }
        break;
    }
    }
    painter.restore();
}

void PaperCard::paintInside(QPainter& painter, const QRectF& room) {
    QString size = text();
    size.remove(QChar(0x2066)).remove(QChar(0x2069)); // set apart for a Hebrew sentence
    const QStringList sides = size.split(u'/');
    double first = sides.value(0).toDouble();
    double second = sides.value(1).toDouble();
    if (first <= 0 || second <= 0)
        first = second = 1;
    const double textHeight = theme().px(34);
    const QRectF place = room.adjusted(0, 0, 0, -textHeight);
    // All papers at one scale, so that a larger one looks larger; the largest that the lab cuts is 50 by 70.
    const double longer = std::max(first, second);
    const double share = std::clamp(0.62 + 0.38 * (longer - 10) / 30.0, 0.62, 1.0);
    const QSizeF paper =
        QSizeF(std::max(first, second), std::min(first, second)).scaled(place.size() * share, Qt::KeepAspectRatio);
    QRectF box(QPointF(), paper);
    box.moveCenter(place.center());
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(0, 0, 0, 28));
    painter.drawRect(box.translated(theme().px(3), theme().px(3)));
    painter.fillRect(box, Qt::white);
    drawSamplePicture(painter, box);
    painter.setPen(QPen(Theme::Colour::Edge, 1));
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(box);
    painter.setPen(isEnabled() ? Theme::Colour::Ink : Theme::Colour::Muted);
    painter.setFont(theme().font(Theme::Type::Large));
    painter.setLayoutDirection(Qt::LeftToRight);
    painter.drawText(QRectF(room.left(), room.bottom() - textHeight, room.width(), textHeight), Qt::AlignCenter,
                     text());
}

DrawingCard::DrawingCard(const Theme& theme, QWidget* parent, Drawing drawing)
    : CardButton(theme, parent)
    , m_drawing(drawing) {}

void DrawingCard::paintInside(QPainter& painter, const QRectF& room) {
    const double textHeight = theme().px(34);
    const QRectF place = room.adjusted(0, 0, 0, -textHeight);
    QRectF paper(QPointF(), QSizeF(3, 2).scaled(place.size(), Qt::KeepAspectRatio));
    paper.moveCenter(place.center());
    painter.fillRect(paper, Qt::white);
    painter.save();
    switch (m_drawing) {
    case Drawing::Fit: {
        QRectF inside(QPointF(), QSizeF(4, 3).scaled(paper.size(), Qt::KeepAspectRatio));
        inside.moveCenter(paper.center());
        drawSamplePicture(painter, inside);
        break;
    }
    case Drawing::Fill:
        drawSamplePicture(painter, paper);
        break;
    case Drawing::Matte:
        drawSamplePrint(painter, paper, PaperFinish::Matte);
        break;
    case Drawing::Glossy:
        drawSamplePrint(painter, paper, PaperFinish::Glossy);
        break;
    }
    painter.restore();
    painter.setPen(QPen(Theme::Colour::Edge, 1));
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(paper);
    painter.setPen(isEnabled() ? Theme::Colour::Ink : Theme::Colour::Muted);
    painter.setFont(theme().font(Theme::Type::Strong));
    painter.setLayoutDirection(layoutDirection());
    painter.drawText(QRectF(room.left(), room.bottom() - textHeight, room.width(), textHeight), Qt::AlignCenter,
                     text());
}

BorderCard::BorderCard(const Theme& theme, QWidget* parent, QString code)
    : CardButton(theme, parent)
    , m_code(std::move(code)) {
    setCardSize(150, 140);
}

void BorderCard::drawSample(QPainter& painter, const QRectF& room, const QString& code) {
    QRectF paper(QPointF(), QSizeF(3, 2).scaled(room.size(), Qt::KeepAspectRatio));
    paper.moveCenter(room.center());
    const double unit = paper.height();
    painter.save();
    painter.fillRect(paper, Qt::white);
    QRectF picture = paper;
    const auto inset = [&](double share) {
        picture = paper.adjusted(unit * share, unit * share, -unit * share, -unit * share);
    };
    const auto frame = [&](double share, QColor colour) {
        painter.fillRect(paper, colour);
        inset(share);
    };
    const QColor black(0x22, 0x22, 0x22);
    if (code == u"WB"_s) {
        inset(0.08);
    } else if (code == u"B7"_s) {
        frame(0.07, black);
    } else if (code == u"BB"_s) {
        frame(0.11, black);
    } else if (code == u"BB1"_s || code == u"BB2"_s) {
        inset(code == u"BB1"_s ? 0.10 : 0.14);
        const double line = unit * (code == u"BB1"_s ? 0.015 : 0.035);
        painter.fillRect(picture.adjusted(-line, -line, line, line), black);
    } else if (code == u"CA1"_s || code == u"CA9"_s) {
        frame(0.10, code == u"CA1"_s ? QColor(0xF0, 0xE4, 0xCB) : QColor(0x8B, 0x5E, 0x3C));
    } else if (code == u"BL1"_s) {
        frame(0.08, QColor(0x2F, 0x5F, 0xA8));
    } else if (code == u"FA9"_s) {
        inset(0.10);
        for (int i = 0; i < 3; ++i) {
            const double out = unit * (0.02 + 0.03 * i);
            painter.setPen(QPen(QColor(0xB8, 0x8A, 0x3A), unit * 0.012));
            painter.setBrush(Qt::NoBrush);
            painter.drawRect(picture.adjusted(-out, -out, out, out));
        }
    }
    drawSamplePicture(painter, picture);
    painter.setPen(QPen(Theme::Colour::Edge, 1));
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(paper);
    painter.restore();
}

void BorderCard::paintInside(QPainter& painter, const QRectF& room) {
    const double textHeight = theme().px(40);
    drawSample(painter, room.adjusted(0, 0, 0, -textHeight), m_code);
    painter.setPen(Theme::Colour::Ink);
    painter.setFont(theme().font(Theme::Type::Small));
    painter.setLayoutDirection(layoutDirection());
    painter.drawText(QRectF(room.left() - theme().px(8), room.bottom() - textHeight + theme().px(4),
                            room.width() + theme().px(16), textHeight),
                     Qt::AlignCenter | Qt::TextWordWrap, text());
}

void BorderSample::setCode(const QString& code) {
    if (m_code == code)
        return;
    m_code = code;
    update();
}

void BorderSample::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    if (!m_code.isEmpty())
        BorderCard::drawSample(painter, QRectF(rect()).adjusted(4, 4, -4, -4), m_code);
}

PictureBox::PictureBox(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme) {}

void PictureBox::setPicture(const QImage& picture) {
    if (picture.cacheKey() == m_picture.cacheKey())
        return;
    m_picture = picture;
    m_scaled = {};
    update();
}

void PictureBox::paintEvent(QPaintEvent*) {
    if (m_picture.isNull())
        return;
    QPainter painter(this);
    const double ratio = devicePixelRatioF();
    const QSize fit = m_picture.size().scaled(size() * ratio, Qt::KeepAspectRatio);
    if (m_scaled.size() != fit) {
        m_scaled = QPixmap::fromImage(fit == m_picture.size()
                                          ? m_picture
                                          : m_picture.scaled(fit, Qt::IgnoreAspectRatio, Qt::SmoothTransformation));
        m_scaled.setDevicePixelRatio(ratio);
    }
    const QSizeF at = m_scaled.deviceIndependentSize();
    painter.drawPixmap(QPointF((width() - at.width()) / 2, (height() - at.height()) / 2), m_scaled);
}

} // namespace lumora
