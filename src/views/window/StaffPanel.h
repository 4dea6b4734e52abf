#pragma once

#include "views/kit/Overlay.h"

#include <functional>

class QTimer;

namespace lumora {

class StaffCode;
struct SessionState;

// Asks for the staff's code, by digits on the screen or on a keyboard.
class StaffPanel : public Overlay {
    Q_OBJECT
public:
    StaffPanel(const Theme& theme, QWidget* parent, const SessionState& state, StaffCode& code);

Q_SIGNALS:
    void opened();
    void closed();

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    void type(const QString& digit);
    void takeBack();
    void give();
    void render();

    const SessionState& m_state;
    StaffCode& m_code;
    QString m_typed;
    QString m_told;
    QLabel* m_dots;
    QLabel* m_words;
    QPushButton* m_enter;
    QTimer* m_second;
};

} // namespace lumora
