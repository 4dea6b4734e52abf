#pragma once

#include "views/kit/Painting.h"

#include <QAbstractButton>
#include <QImage>
#include <QWidget>

#include <functional>

namespace lumora {

// A large button that draws more than a text: a card with rounded corners, marked when it is chosen.
class CardButton : public QAbstractButton {
    Q_OBJECT
public:
    CardButton(const Theme& theme, QWidget* parent);

    // Of a 1024 by 768 window.
    void setCardSize(QSizeF size);
    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;
    virtual void paintInside(QPainter& painter, const QRectF& room) = 0;
    const Theme& theme() const { return m_theme; }

private:
    const Theme& m_theme;
    QSizeF m_size{200, 120};
};

// A tile of a menu: a sign, a word, and a line that explains it.
class Tile : public CardButton {
    Q_OBJECT
public:
    Tile(const Theme& theme, QWidget* parent, QString icon);
    void setExplanation(const QString& text);
    void setMarked(bool marked);

protected:
    void paintInside(QPainter& painter, const QRectF& room) override;

private:
    void paintDisc(QPainter& painter, const QRectF& disc) const;
    void paintUpright(QPainter& painter, const QRectF& room);

    QString m_icon;
    QString m_explanation;
    bool m_marked = false;
};

// A choice that is told by a drawing and by its words below it.
class DrawingCard : public CardButton {
    Q_OBJECT
public:
    using Drawing = std::function<void(QPainter& painter, const QRectF& place, const QString& words)>;
    enum class Words { Strong, Small, Size }; // a size, "10/15", runs from left to right
    // Size of a 1024 by 768 window.
    DrawingCard(const Theme& theme, QWidget* parent, Drawing drawing, QSizeF size, Words words = Words::Strong);

    // The colour of the ribbon that hangs from the card; none until it is set.
    void setRibbon(QColor colour);

protected:
    void paintInside(QPainter& painter, const QRectF& room) override;

private:
    Drawing m_drawing;
    Words m_words;
    QColor m_ribbon;
};

// The sample picture, large, with the border of the given code.
class BorderSample : public QWidget {
    Q_OBJECT
public:
    using QWidget::QWidget;
    void setCode(const QString& code);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QString m_code;
};

// A picture, as large as its proportions allow, never mirrored.
class PictureBox : public QWidget {
    Q_OBJECT
public:
    PictureBox(const Theme& theme, QWidget* parent);
    void setPicture(const QImage& picture);
    bool hasPicture() const { return !m_picture.isNull(); }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    const Theme& m_theme;
    QImage m_picture;
    QPixmap m_scaled; // for the size that is on the screen
};

} // namespace lumora
