#include "views/MainWindow.h"

#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/FocusRing.h"
#include "views/Overlay.h"
#include "views/PageView.h"

#include <QCloseEvent>
#include <QStackedLayout>
#include <QTimer>

namespace lumora {

MainWindow::MainWindow(PageChain& chain, const SessionState& state)
    : m_chain(chain)
    , m_state(state)
    , m_theme(std::make_unique<Theme>(1.0)) {
    setObjectName(QStringLiteral("lumoraWindow"));
    setAttribute(Qt::WA_StyledBackground);
    setWindowTitle(QStringLiteral("Lumora"));
    setMinimumSize(800, 600);
    m_stack = new QStackedLayout(this);
    m_stack->setContentsMargins(0, 0, 0, 0);
    setStyleSheet(m_theme->styleSheet());
    new FocusRing(*m_theme, this);
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

PageView* MainWindow::viewOf(const Page& page) const {
    const auto at = m_views.find(&page);
    return at == m_views.end() ? nullptr : at->second;
}

void MainWindow::renderNow() {
    if (m_front)
        m_front->renderNow();
}

PageView* MainWindow::make(Page& page) {
    const auto maker = m_makers.find(page.id());
    if (maker == m_makers.end())
        return nullptr;
    PageView* view = maker->second(page, *m_theme).release();
    m_views[&page] = view;
    m_stack->addWidget(view);
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
    m_front = view;
    setWindowTitle(QStringLiteral("Lumora")); // a page with a title of its own sets it as it renders
    m_stack->setCurrentWidget(view);
    setLayoutDirection(m_state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    view->renderNow();
    const Overlay* panel = frontOverlay(*this);
    if (!panel) {
        if (QWidget* first = view->firstFocus())
            first->setFocus(Qt::OtherFocusReason);
    }
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
}

void MainWindow::resizeEvent(QResizeEvent*) {
    const double factor = Theme::factorFor(size());
    if (factor != m_theme->factor())
        QTimer::singleShot(0, this, &MainWindow::rebuild);
}

void MainWindow::rebuild() {
    const double factor = Theme::factorFor(size());
    if (factor == m_theme->factor())
        return;
    *m_theme = Theme(factor);
    setStyleSheet(m_theme->styleSheet());
    const Page* front = m_front ? &m_front->page() : nullptr;
    const auto old = std::exchange(m_views, {});
    m_front = nullptr;
    for (const auto& [page, view] : old) {
        view->detach();
        m_stack->removeWidget(view);
        view->hide();
        view->deleteLater();
    }
    for (const auto& [page, view] : old) {
        disconnect(page, &QObject::destroyed, view, nullptr);
        if (m_chain.find(page->id()) == page) {
            PageView* fresh = make(*m_chain.find(page->id()));
            if (page == front)
                bringToFront(fresh);
        }
    }
}

void MainWindow::closeEvent(QCloseEvent* event) {
    event->ignore();
    m_chain.endProgram();
}

} // namespace lumora
