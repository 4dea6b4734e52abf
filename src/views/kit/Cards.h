#pragma once

#include "imaging/Bitmap.h"
#include "views/kit/Theme.h"

#include <QAbstractButton>
#include <QImage>
#include <QWidget>

namespace lumora {

// A large button that draws more than a text: a card with rounded corners, marked when it is chosen.
class CardButton : public QAbstractButton {
    Q_OBJECT
public:
    CardButton(const Theme& theme, QWidget* parent);

    // Of a 1024 by 768 window.
    void setCardSize(double width, double height);
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
    void paintUpright(QPainter& painter, const QRectF& room);

    QString m_icon;
    QString m_explanation;
    bool m_marked = false;
};

// A paper size, drawn in its true proportions. The text is the size, "10/15".
class PaperCard : public CardButton {
    Q_OBJECT
public:
    using CardButton::CardButton;

protected:
    void paintInside(QPainter& painter, const QRectF& room) override;
};

// A choice that is told by a small drawing and a word.
class DrawingCard : public CardButton {
    Q_OBJECT
public:
    enum class Drawing { Matte, Glossy, Fit, Fill };
    DrawingCard(const Theme& theme, QWidget* parent, Drawing drawing);

protected:
    void paintInside(QPainter& painter, const QRectF& room) override;

private:
    Drawing m_drawing;
};

// A border around a sample picture, by the border's code.
class BorderCard : public CardButton {
    Q_OBJECT
public:
    BorderCard(const Theme& theme, QWidget* parent, QString code);
    static void drawSample(QPainter& painter, const QRectF& room, const QString& code);

protected:
    void paintInside(QPainter& painter, const QRectF& room) override;

private:
    QString m_code;
};

// The same sample picture, large.
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

// A landscape with a sun: the picture in all drawings of the program.
void drawSamplePicture(QPainter& painter, const QRectF& box);

// The same as a print on paper of this finish.
enum class PaperFinish { Glossy, Matte, Silk };
void drawSamplePrint(QPainter& painter, const QRectF& paper, PaperFinish finish);

} // namespace lumora
