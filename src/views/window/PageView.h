#pragma once

#include "session/Caption.h"
#include "session/Page.h"
#include "session/SessionState.h"
#include "session/TextList.h"
#include "views/kit/Theme.h"
#include "views/window/PageFrame.h"

#include <QElapsedTimer>
#include <QPointer>
#include <QTimer>
#include <QWidget>

#include <functional>
#include <type_traits>
#include <utility>
#include <vector>

class QAbstractButton;
class QCheckBox;
class QComboBox;
class QLineEdit;
class QListWidget;
class QListWidgetItem;
class QPushButton;

namespace lumora {

class CardButton;
class ChoiceCards;
class Files;
class Overlay;

// The base of all views. A control is bound to the page's state under its design name: text, visible, enabled and hint
// follow the Caption at each rendering, and what the customer does calls the page's handler. render() sets what is more
// than that.
class PageView : public QWidget, protected Maker {
    Q_OBJECT
public:
    PageView(Page& page, const SessionState& state, const Theme& theme);

    const Page& page() const { return m_page; }

    // What a person reads in place of the page's text.
    using Reading = std::function<QString(const QString&)>;
    // One control of the page, seen or not.
    struct Control {
        QString name;
        QPointer<QWidget> widget;         // null for what the page holds and nobody sees
        const Caption* caption = nullptr; // one of the two tells what the control says
        const TextList* list = nullptr;
        std::function<QString()> text; // in place of the caption's
        Reading reading = {};          // of a row of the list, or of the caption
    };
    const Control* control(const QString& name) const;

    // Renders now if something has changed since the last time.
    void renderNow();
    // The page is gone or about to go, and is not read any more.
    void detach();
    bool isDetached() const { return m_detached; }
    // A panel is docked at the bottom of the window over the view of the page shown before it, which stays visible and
    // active where it is not covered. A panel shows its content alone, without header and bars.
    virtual bool isPanel() const { return false; }
    // pixels: height of this view's lower part that is behind a panel; 0 without one.
    virtual void setCoveredHeight(int) {}
    // Esc on the page itself.
    virtual void escape() {}
    // The page's own exit, which asks where it asks; also closing the window comes here. False where the page has none.
    virtual bool leave() { return false; }
    // What has the keyboard when the page comes to the front.
    virtual QWidget* firstFocus() const { return nullptr; }

protected:
    enum class Role { Main, Secondary, Plain, Quiet, Danger };

    // To be called at the end of the constructor of each view.
    void start();
    virtual void render() = 0;

    const Theme& theme() const { return m_theme; }
    const SessionState& state() const { return m_state; }
    QString wording(const QString& hebrew, const QString& english) const { return m_state.wording(hebrew, english); }
    PageFrame& frame() const { return *m_frame; }
    void keyPressEvent(QKeyEvent* event) override;

    // Makers of bound controls. Each takes the name of its caption, and its parent from the layout that it is added to.
    QPushButton* button(const Caption& caption, Role role, std::function<void()> clicked, const QString& icon = {});
    QLabel* label(const Caption& caption, const char* type = "body");
    QLabel* label(const Caption& caption, const char* type, Reading reading);
    // Shows the caption at a second place, without its name.
    QLabel* echo(const Caption& caption, const char* type = "body");
    // A label that is never broken into lines.
    QLabel* lineLabel(const Caption& caption, const char* type = "body");
    QLineEdit* field(const Caption& caption, std::function<void(const QString&)> edited);
    QCheckBox* checkBox(const CheckCaption& caption, std::function<void(bool)> clicked);
    // Rows from the list; what the box says from the caption, which may be a text that is no row.
    QComboBox* comboBox(const TextList& list, const Caption& caption, std::function<void(int)> activated);
    // The same as large cards, of which all rows are in sight.
    ChoiceCards* choiceCards(const TextList& list, const Caption& caption, int columns,
                             std::function<CardButton*(int)> maker, std::function<void(int)> activated);

    // A list to look at, and one whose rows answer to a touch and to Enter alike.
    QListWidget* listing(const TextList& rows, Reading reading = {});
    QListWidget* list(const TextList& rows, std::function<void(int)> picked, Reading reading = {});

    // The widget shows where the caption does, and keeps no name.
    void follow(QWidget* widget, const Caption& caption);
    // Binds a widget of the view's own making.
    void bind(QWidget* widget, const Caption& caption);
    // A button of the view's own making that can be chosen.
    void bindChoice(QAbstractButton* button, const CheckCaption& caption, std::function<void()> clicked);
    void bind(const QString& name, QWidget* widget, std::function<QString()> text);
    // The widget has the control's name; the view itself renders what it says.
    void bindName(QWidget* widget, const Caption& caption);
    void bindList(const QString& name, const TextList& list, QWidget* widget = nullptr, Reading reading = {});
    void bindList(QWidget* widget, const TextList& list, Reading reading = {}) {
        bindList(m_page.controls().nameOf(list), list, widget, std::move(reading));
    }
    QString nameOf(const Caption& caption) const { return m_page.controls().nameOf(caption); }
    // The icon of a button that points along the reading direction or against it.
    enum class Way { Back, Forwards };
    void setDirectedIcon(QPushButton* button, Way way);

    void setIcon(QAbstractButton* button, const QString& icon, QColor colour);
    void setIcon(QListWidgetItem* row, const QString& icon, QColor colour);

    // A spoken meaning for a control whose text does not tell enough.
    void speak(QWidget* widget, const QString& text) const;

private:
    void schedule();
    void renderBindings();

    Page& m_page;
    const SessionState& m_state;
    const Theme& m_theme;
    PageFrame* m_frame = nullptr;
    std::vector<Control> m_controls;
    QTimer m_soon;
    QElapsedTimer m_sinceRender;
    bool m_dirty = true;
    bool m_detached = false;
};

// The base of the view of one page, whose controls are c.
template <class P, class Base = PageView>
class ViewOf : public Base {
protected:
    template <class... More>
    ViewOf(P& page, const SessionState& state, const Theme& theme, const More&... more)
        : Base(page, state, theme, more...)
        , m_page(page)
        , c(page.controls()) {}

    // A button that calls the page's handler, for one of an array with its index.
    using Base::button;
    QPushButton* button(const Caption& caption, PageView::Role role, void (P::*clicked)(), const QString& icon = {}) {
        return Base::button(caption, role, toPage(clicked), icon);
    }
    QPushButton* button(const Caption& caption, PageView::Role role, void (P::*clicked)(int), int index,
                        const QString& icon = {}) {
        return Base::button(
            caption, role, [&page = m_page, clicked, index] { (page.*clicked)(index); }, icon);
    }
    using Base::list;
    QListWidget* list(const TextList& rows, void (P::*picked)(int), PageView::Reading reading = {}) {
        return Base::list(rows, toPage(picked), std::move(reading));
    }
    // The page's handler as a function.
    auto toPage(void (P::*handler)()) const {
        return [&page = m_page, handler] { (page.*handler)(); };
    }
    template <class Value>
    auto toPage(void (P::*handler)(Value)) const {
        return [&page = m_page, handler](Value value) { (page.*handler)(value); };
    }

    P& m_page;
    const std::remove_cvref_t<decltype(std::declval<const P&>().controls())>& c;
};

// The picture at a drive path, null where there is none.
QImage loadedPicture(const Files& files, const DrivePath& path);

} // namespace lumora
