#pragma once

#include "session/Page.h"
#include "views/kit/Theme.h"

#include <QPointer>
#include <QWidget>

#include <functional>
#include <map>
#include <memory>
#include <vector>

class QStackedLayout;

namespace lumora {

class DoubledPress;
class FieldKeyboard;
class PageChain;
class PageView;
class PressFilter;
struct SessionState;

// The program's one window. It follows the page chain: the view of the page in front is shown, a view lives as long as
// its page, and a page that nobody sees has none. A panel lies over the view that was shown before it. All sizes of a
// view come from one factor and shape, which follow the window; when they change, the views are built anew from their
// pages.
class MainWindow : public QWidget {
    Q_OBJECT
public:
    using ViewMaker = std::function<std::unique_ptr<PageView>(Page&, const Theme&)>;

    MainWindow(PageChain& chain, const SessionState& state);
    ~MainWindow() override;

    void registerView(PageId id, ViewMaker maker);

    PageView* frontView() const { return m_front; }
    // The view that a panel in front leaves in sight, null when none is.
    PageView* viewBelow() const { return m_below; }
    PageView* viewOf(const Page& page) const;
    const Theme& theme() const { return *m_theme; }
    DoubledPress& presses();

    // Asked where the window is closed on a page without an exit of its own; unset: the program ends.
    std::function<bool()> mayEnd;

    // Renders what waits for the next turn of the event loop, at once.
    void renderNow();

protected:
    void resizeEvent(QResizeEvent* event) override;
    void closeEvent(QCloseEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void pageShown(Page* page);
    void pageUnloaded(Page* page);
    PageView* make(Page& page);
    void rebuild();
    void bringToFront(PageView* view);
    void placePanel();

    PageChain& m_chain;
    const SessionState& m_state;
    std::unique_ptr<Theme> m_theme;
    std::map<PageId, ViewMaker> m_makers;
    std::map<const Page*, PageView*> m_views;
    FieldKeyboard* m_keyboard; // before the filter, which is asked first then
    PressFilter* m_presses;
    QStackedLayout* m_stack = nullptr;
    PageView* m_front = nullptr;
    PageView* m_below = nullptr;
    bool m_asking = false;          // the question whether to end stands
    QPointer<QWidget> m_focusBelow; // what had the keyboard when the panel came
};

} // namespace lumora
