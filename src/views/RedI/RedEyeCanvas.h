#pragma once

#include "editing/redeye/RedI.h"
#include "views/kit/Theme.h"

#include <QTimer>
#include <QWidget>

#include <array>

namespace lumora {

// The picture of the red-eye page with the yellow circle. The middle of the widget is the middle of the page's viewing
// area. A tap picks, a drag moves the picture, the wheel sizes the circle; the right button or a long press opens the
// menu; with the keyboard the arrows move the circle, plus and minus size it.
class RedEyeCanvas : public QWidget {
    Q_OBJECT
public:
    RedEyeCanvas(RedI& page, const Theme& theme, QWidget* parent);

    // The part of the picture in sight, in its pixels.
    QRectF visiblePart() const;
    // Where a point of the picture lies on the widget.
    QPointF onWidget(QPointF picture) const;

Q_SIGNALS:
    void resized();

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    double scale() const { return m_theme.factor() * m_page.sight().Magnification; }
    QPointF inPicture(QPointF widget) const;
    void tap(void (RedI::*arrowDown)());

    RedI& m_page;
    const Theme& m_theme;
    QTimer m_longPress;
    QPointF m_pressedAt;
    int m_wheel = 0; // turns that have not made a whole step yet
};

// The overview: the whole picture, with what the canvas shows of it. A press brings the circle there.
class RedEyeOverview : public QWidget {
    Q_OBJECT
public:
    RedEyeOverview(RedI& page, const Theme& theme, const RedEyeCanvas& canvas, QWidget* parent);
    // Takes the size of the page's overview, as large as the column has room for.
    void fit();

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    RedI& m_page;
    const Theme& m_theme;
    const RedEyeCanvas& m_canvas;
};

// The four steps in a row, the present one marked.
class RedEyeSteps : public QWidget {
    Q_OBJECT
public:
    RedEyeSteps(const Theme& theme, QWidget* parent);
    void show(const std::array<QString, 4>& steps, int current);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    const Theme& m_theme;
    std::array<QString, 4> m_steps;
    int m_current = 1;
};

} // namespace lumora
