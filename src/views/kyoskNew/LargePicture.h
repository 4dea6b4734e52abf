#pragma once

#include "selection/pictures/kyoskNewControls.h"
#include "views/kit/Theme.h"

#include <QWidget>

#include <algorithm>

namespace lumora {

// The large view of the picture page: the picture on its paper with the warning of low quality, or lines of guidance. A
// picture can be pressed.
class LargePicture : public QWidget {
    Q_OBJECT
public:
    LargePicture(const Theme& theme, QWidget* parent);
    void show(const LargeView& view);
    // In pixels of the screen.
    int longerSide() const { return static_cast<int>(std::max(width(), height()) * devicePixelRatioF()); }

Q_SIGNALS:
    void clicked();
    void resized();

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent*) override { Q_EMIT resized(); }
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    QRectF pictureRoom() const;
    void drawCut(QPainter& painter, const QRectF& picture) const;

    const Theme& m_theme;
    LargeView m_view;
    bool m_pressed = false;
};

} // namespace lumora
