#pragma once

#include "views/kit/Theme.h"

#include <QAbstractScrollArea>
#include <QImage>

namespace lumora {

// A window on a picture that is larger than it. The picture is moved by two scroll bars, or by dragging it.
class ScrolledPicture : public QAbstractScrollArea {
    Q_OBJECT
public:
    // Size of the window, and how far a step of a scroll bar moves the picture, in pixels of a 1024 by 768 window.
    ScrolledPicture(const Theme& theme, QWidget* parent, QSize window, int step);

    void setPicture(const QImage& picture);
    // Steps from the top left corner, and as many as there are.
    void setScroll(QPoint value, QPoint max);

Q_SIGNALS:
    void movedAcross(int steps);
    void movedDown(int steps);

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;

private:
    void paintPicture(QPainter& painter) const;

    const Theme& m_theme;
    int m_step;
    QImage m_picture;
    QPoint m_grabbed; // where the finger went down
    QPoint m_from;    // where the scroll bars stood then
};

} // namespace lumora
