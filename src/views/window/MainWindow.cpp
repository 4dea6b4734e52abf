#include "views/window/MainWindow.h"

#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/kit/FingerMoves.h"
#include "views/kit/FocusRing.h"
#include "views/kit/LiftedStack.h"
#include "views/kit/Overlay.h"
#include "views/kit/TouchPointer.h"
#include "views/window/FieldKeyboard.h"
#include "views/window/PageView.h"
#include "views/window/PressFilter.h"

#include <QApplication>
#include <QCloseEvent>
#include <QScreen>
#include <QTimer>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

MainWindow::MainWindow(PageChain& chain, const SessionState& state)
    : m_chain(chain)
    , m_state(state)
    , m_theme(std::make_unique<Theme>(Theme::Fit{}))
    , m_keyboard(new FieldKeyboard(*this, *m_theme, state))
    , m_presses(new PressFilter(this)) {
    setObjectName(u"lumoraWindow"_s);
    setAttribute(Qt::WA_StyledBackground);
    setWindowTitle(u"Lumora"_s);
    setMinimumSize(QSize(640, 480).boundedTo(screen()->availableSize()));
    m_stack = new LiftedStack(this);
    m_stack->setContentsMargins(0, 0, 0, 0);
    setStyleSheet(m_theme->styleSheet());
    new FocusRing(*m_theme, this);
    new TouchPointer(this);
    new FingerMoves(this,
                    [this] { return m_presses->refuses(); }); // behind the other filters, which are asked later then
    connect(&chain, &PageChain::shown, this, &MainWindow::pageShown);
    connect(&chain, &PageChain::unloaded, this, &MainWindow::pageUnloaded);
}

MainWindow::~MainWindow() {
    for (const auto& [page, view] : m_views)
        view->detach();
}

void MainWindow::registerView(PageId id, ViewMaker maker) {
    m_makers[id] = std::move(maker);
}

DoubledPress& MainWindow::presses() {
    return m_presses->rule;
}

PageView* MainWindow::viewOf(const Page& page) const {
    const auto at = m_views.find(&page);
    return at == m_views.end() ? nullptr : at->second;
}

void MainWindow::renderNow() {
    for (PageView* view : {m_below, m_front}) {
        if (view)
            view->renderNow();
    }
}

PageView* MainWindow::make(Page& page) {
    const auto maker = m_makers.find(page.id());
    if (maker == m_makers.end())
        return nullptr;
    PageView* view = maker->second(page, *m_theme).release();
    m_views[&page] = view;
    if (view->isPanel()) {
        view->setParent(this);
        view->hide();
        view->installEventFilter(this);
    } else {
        m_stack->addWidget(view);
    }
    // The view goes with its page. A signal of one of its widgets may still be on its way back through it.
    connect(&page, &QObject::destroyed, view, [this, view, &page] {
        m_views.erase(&page);
        view->deleteLater();
    });
    return view;
}

void MainWindow::pageShown(Page* page) {
    PageView* view = viewOf(*page);
    if (!view)
        view = make(*page);
    if (view)
        bringToFront(view);
}

void MainWindow::bringToFront(PageView* view) {
    PageView* const before = std::exchange(m_front, view);
    PageView* const uncovered = view->isPanel() ? nullptr : std::exchange(m_below, nullptr);
    setWindowTitle(u"Lumora"_s); // a page with a title of its own sets it as it renders
    setLayoutDirection(m_state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    if (before && before != view && before->isPanel())
        before->hide();
    if (uncovered)
        uncovered->setCoveredHeight(0);
    if (view->isPanel()) {
        if (!m_below && before != view) {
            m_below = before;
            m_focusBelow = QApplication::focusWidget();
        }
        view->renderNow();
        view->show();
        view->raise();
        placePanel();
    } else {
        m_stack->setCurrentWidget(view);
        view->renderNow();
    }
    if (Overlay* box = frontOverlay(*this)) {
        box->raise();
        // A panel that opened while its page was made has not taken the keyboard.
        if (!box->isAncestorOf(QApplication::focusWidget()))
            (box->focusWidget() ? box->focusWidget() : box)->setFocus(Qt::OtherFocusReason);
        return;
    }
    QWidget* first = uncovered == view && m_focusBelow ? m_focusBelow.data() : view->firstFocus();
    if (first)
        first->setFocus(Qt::OtherFocusReason);
}

void MainWindow::placePanel() {
    if (!m_front || !m_front->isPanel())
        return;
    const int wanted = std::min(std::max(m_front->sizeHint().height(), m_front->minimumSizeHint().height()), height());
    m_front->setGeometry(0, height() - wanted, width(), wanted);
    if (m_below)
        m_below->setCoveredHeight(wanted);
}

bool MainWindow::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::LayoutRequest && watched == m_front)
        QTimer::singleShot(0, this, &MainWindow::placePanel);
    return QWidget::eventFilter(watched, event);
}

void MainWindow::pageUnloaded(Page* page) {
    PageView* view = viewOf(*page);
    if (!view)
        return;
    view->detach();
    m_stack->removeWidget(view);
    view->hide();
    if (m_front == view)
        m_front = nullptr;
    if (m_below == view)
        m_below = nullptr;
}

void MainWindow::resizeEvent(QResizeEvent*) {
    placePanel();
    m_keyboard->place();
    if (Theme::fitFor(size()) != m_theme->fit())
        QTimer::singleShot(0, this, &MainWindow::rebuild);
}

void MainWindow::rebuild() {
    const Theme::Fit fit = Theme::fitFor(size());
    if (fit == m_theme->fit())
        return;
    m_keyboard->forget();
    *m_theme = Theme(fit);
    setStyleSheet(m_theme->styleSheet());
    const Page* front = m_front ? &m_front->page() : nullptr;
    const Page* below = m_below ? &m_below->page() : nullptr;
    const auto old = std::exchange(m_views, {});
    m_front = nullptr;
    m_below = nullptr;
    for (const auto& [page, view] : old) {
        view->hide(); // before it is detached, so that a held button is released
        view->detach();
        m_stack->removeWidget(view);
        view->deleteLater();
    }
    for (const auto& [page, view] : old) {
        disconnect(page, &QObject::destroyed, view, nullptr);
        if (m_chain.find(page->id()) == page)
            make(*m_chain.find(page->id()));
    }
    for (const Page* page : {below, front}) {
        if (PageView* fresh = page ? viewOf(*page) : nullptr)
            bringToFront(fresh);
    }
}

void MainWindow::closeEvent(QCloseEvent* event) {
    event->ignore();
    if (m_asking || (m_front && m_front->leave()))
        return;
    m_asking = true;
    const bool ends = !mayEnd || mayEnd();
    m_asking = false;
    if (ends)
        m_chain.endProgram();
}

} // namespace lumora
