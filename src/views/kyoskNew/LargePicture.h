#pragma once

#include "selection/pictures/kyoskNew.h"
#include "views/kit/Theme.h"

#include <QWidget>

namespace lumora {

// The large view of the picture page: the picture with the warning of low quality, or lines of guidance. A picture can
// be pressed.
class LargePicture : public QWidget {
    Q_OBJECT
public:
    LargePicture(const Theme& theme, QWidget* parent);
    // meaning: what a press on the picture does, for who hears the page.
    void show(const kyoskNew::LargeView& view, const QString& warning, const QString& meaning);

Q_SIGNALS:
    void clicked();

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    const Theme& m_theme;
    kyoskNew::LargeView m_view;
    QString m_warning;
    bool m_pressed = false;
};

} // namespace lumora
