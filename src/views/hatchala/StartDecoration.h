#pragma once

#include "views/kit/Theme.h"

#include <QImage>
#include <QPixmap>
#include <QPointer>
#include <QWidget>

namespace lumora {

// The moving decoration of the start page. Each piece repaints only itself, so that a step of its motion needs no
// layout and no other widget.

// Three prints on a table.
class Prints : public QWidget {
    Q_OBJECT
public:
    using QWidget::QWidget;
    // The two at the back, and the one in front of them.
    void show(bool back, bool front);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    bool m_back = true;
    bool m_front = true;
};

// Three small arrows that drift down towards a button below the strip.
class ArrowStrip : public QWidget {
    Q_OBJECT
public:
    ArrowStrip(const Theme& theme, QWidget* target, QWidget* parent);
    // From 0 to 1; 1 looks like 0.
    void setPhase(double phase);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QRect place() const;

    const Theme& m_theme;
    QPointer<QWidget> m_target;
    double m_phase = 0;
};

// A picture behind a curtain that opens and closes from its middle.
class AdvertisingPicture : public QWidget {
    Q_OBJECT
public:
    AdvertisingPicture(const Theme& theme, QWidget* parent);
    void setPicture(const QImage& picture);
    bool hasPicture() const { return !m_picture.isNull(); }
    // How much of the width is open, from 0 to 1.
    void setOpening(double share);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    const Theme& m_theme;
    QImage m_picture;
    QPixmap m_card; // the picture with rounded corners, for the size that is on the screen
    double m_opening = 1;
};

} // namespace lumora
