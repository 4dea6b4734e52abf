#include "views/window/KioskPanels.h"

#include "kiosk/IdleEnd.h"
#include "kiosk/StaffCode.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/window/MainWindow.h"
#include "views/window/StaffPanel.h"
#include "views/window/StillTherePanel.h"

#include <QApplication>
#include <QMouseEvent>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int holdFor = 3000; // milliseconds

} // namespace

KioskPanels::KioskPanels(MainWindow& window, SessionState& state, PageChain& chain, IdleEnd& idle, StaffCode& code)
    : m_window(window)
    , m_state(state)
    , m_chain(chain)
    , m_idle(idle)
    , m_code(code) {
    m_held.setObjectName(u"cornerHeld"_s);
    m_held.setSingleShot(true);
    m_held.setInterval(holdFor);
    m_held.setParent(&window);
    connect(&m_held, &QTimer::timeout, this, &KioskPanels::askForCode);
    // A press that answers must have gone its way before what it meets goes.
    connect(&idle, &IdleEnd::changed, this, &KioskPanels::showQuestion, Qt::QueuedConnection);
    connect(&chain, &PageChain::shown, this, &KioskPanels::closeDoor);
    qApp->installEventFilter(this);
}

void KioskPanels::showQuestion() {
    if (!m_idle.asks()) {
        if (m_question)
            std::exchange(m_question, nullptr)->dismiss();
        return;
    }
    closeDoor();
    if (!m_question) {
        m_question = new StillTherePanel(m_window.theme(), &m_window, m_state);
        connect(m_question, &StillTherePanel::answered, &m_idle, &IdleEnd::stay);
        m_question->setOpen(true);
    }
    const int seconds = m_idle.secondsLeft();
    m_question->tell(seconds, static_cast<double>(seconds) / static_cast<double>(IdleWatch::answerTime.count()));
}

// At the beginning of the reading direction, where the program's sign stands.
bool KioskPanels::isCorner(QPoint place) const {
    const int side = m_window.theme().px(80);
    const QRect corner(m_state.english() ? 0 : m_window.width() - side, 0, side, side);
    return corner.contains(place);
}

bool KioskPanels::eventFilter(QObject* watched, QEvent* event) {
    const auto* widget = qobject_cast<QWidget*>(watched);
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseMove:
        if (widget && widget->window() == &m_window) {
            const QPoint place =
                m_window.mapFromGlobal(static_cast<const QMouseEvent*>(event)->globalPosition().toPoint());
            if (!isCorner(place))
                m_held.stop();
            else if (event->type() == QEvent::MouseButtonPress && !m_held.isActive() && m_state.closedToCustomers() &&
                     !m_state.kiosk.code.isEmpty() && !m_door)
                m_held.start();
        }
        break;
    case QEvent::MouseButtonRelease:
    case QEvent::TouchCancel:
        m_held.stop();
        break;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

void KioskPanels::askForCode() {
    if (m_door || m_idle.asks())
        return;
    m_door = new StaffPanel(m_window.theme(), &m_window, m_state, m_code);
    connect(m_door, &StaffPanel::closed, this, &KioskPanels::closeDoor);
    connect(m_door, &StaffPanel::opened, this, &KioskPanels::letStaffIn);
    m_door->setOpen(true);
}

void KioskPanels::closeDoor() {
    if (m_door)
        std::exchange(m_door, nullptr)->dismiss();
}

void KioskPanels::letStaffIn() {
    closeDoor();
    m_state.staff = true;
    m_chain.setAllTexts();
    if (staffCameIn)
        staffCameIn();
}

} // namespace lumora
