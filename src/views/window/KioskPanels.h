#pragma once

#include <QObject>
#include <QPointer>
#include <QTimer>

#include <functional>

namespace lumora {

class IdleEnd;
class MainWindow;
class PageChain;
class StaffCode;
class StaffPanel;
class StillTherePanel;
struct SessionState;

// What the window of a kiosk has beside its pages: the question whether anybody is there, and the staff's door, which
// opens where the corner with the program's sign is held for a while.
class KioskPanels : public QObject {
    Q_OBJECT
public:
    KioskPanels(MainWindow& window, SessionState& state, PageChain& chain, IdleEnd& idle, StaffCode& code);

    // Runs once the staff is in.
    std::function<void()> staffCameIn;

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void showQuestion();
    bool isCorner(QPoint place) const;
    void askForCode();
    void closeDoor();
    void letStaffIn();

    MainWindow& m_window;
    SessionState& m_state;
    PageChain& m_chain;
    IdleEnd& m_idle;
    StaffCode& m_code;
    QPointer<StillTherePanel> m_question;
    QPointer<StaffPanel> m_door;
    QTimer m_held;
};

} // namespace lumora
