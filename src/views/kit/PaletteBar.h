#pragma once

#include "views/kit/Theme.h"

#include <QImage>
#include <QPoint>
#include <QWidget>

#include <functional>

namespace lumora {

// A palette: a picture made of equal square fields side by side. A press tells the pixel pressed; the arrow keys go
// from field to field.
class PaletteBar : public QWidget {
    Q_OBJECT
public:
    PaletteBar(const Theme& theme, std::function<void(QPoint)> pressed, QWidget* parent);
    // chosen: the colour that is marked, if a field has it.
    void show(const QImage& palette, QRgb chosen);
    int fields() const;

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    int chosenField() const;
    void press(QPointF at);

    const Theme& m_theme;
    std::function<void(QPoint)> m_pressed;
    QImage m_palette;
    QRgb m_chosen = 0;
};

} // namespace lumora
