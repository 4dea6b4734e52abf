#pragma once

#include <QObject>

#include <functional>

class QWidget;

namespace lumora {

// Tells of each press outside a small panel and the button that opens it, by mouse, finger or key, while the panel
// shows. The press itself goes on to where it was meant for.
class PressElsewhere : public QObject {
    Q_OBJECT
public:
    // Belongs to the panel.
    PressElsewhere(QWidget& panel, QWidget& opener, std::function<void()> pressed);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QWidget& m_panel;
    QWidget& m_opener;
    std::function<void()> m_pressed;
};

} // namespace lumora
