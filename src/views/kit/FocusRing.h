#pragma once

#include "views/kit/Theme.h"

#include <QPointer>
#include <QWidget>

namespace lumora {

// The ring around the control that has the keyboard. It shows as soon as a person uses the keyboard and goes with the
// next press of the mouse or a finger.
class FocusRing : public QWidget {
    Q_OBJECT
public:
    FocusRing(const Theme& theme, QWidget* window);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    void follow();

    const Theme& m_theme;
    QPointer<QWidget> m_target;
    bool m_keyboard = false;
};

} // namespace lumora
