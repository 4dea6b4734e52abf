#pragma once

#include "common/Result.h"

#include <QPoint>
#include <QPointF>
#include <QPointer>
#include <QString>
#include <QWidget>

namespace lumora {

class MainWindow;
class PageView;

// Controls by their design names ("Command12", "Picture1(3)"), used as a person uses them: an operation fails, and
// tells why, unless the control is there, visible, enabled and not covered by anything else.
class ControlFinder {
public:
    explicit ControlFinder(MainWindow& window)
        : m_window(window) {}

    // The name of the page in front, "" when there is none.
    QString frontPage() const;

    // Each takes the page's name; a page that is neither in front nor in sight below a panel is a failure.
    Result<void> press(const QString& page, const QString& control) const;
    // A mouse that is down on a control, until it is let go. The control may vanish meanwhile.
    struct Held {
        QPointer<QWidget> widget;
        QPoint at;
        Qt::MouseButton button = Qt::LeftButton;
    };
    // Places are in percent of the control's width and height.
    Result<Held> hold(const QString& page, const QString& control) const;
    Result<Held> hold(const QString& page, const QString& control, QPointF percent, Qt::MouseButton button) const;
    void letGo(const Held& held) const;
    Result<void> pressAt(const QString& page, const QString& control, QPointF percent,
                         Qt::MouseButton button = Qt::LeftButton) const;
    // Moves the mouse in dragMoves equal moves, so that what counts moves comes out the same each time.
    static constexpr int dragMoves = 20;
    Result<void> drag(const QString& page, const QString& control, QPointF from, QPointF to) const;
    // Replaces what the text box holds.
    Result<void> type(const QString& page, const QString& control, const QString& text) const;
    // The row of a list or of a combo box with this text.
    Result<void> choose(const QString& page, const QString& control, const QString& text) const;
    Result<void> tick(const QString& page, const QString& control, bool on) const;

    // What the page says of the control: its caption, the text of a box, the current row of a list. Also for controls
    // that are hidden.
    Result<QString> text(const QString& page, const QString& control) const;
    Result<bool> visible(const QString& page, const QString& control) const;
    Result<bool> enabled(const QString& page, const QString& control) const;
    // Of lists, also of working lists that nobody sees.
    Result<int> count(const QString& page, const QString& control) const;
    Result<QString> item(const QString& page, const QString& control, int index) const;

    // Why a mouse press in the middle of the widget would not reach it; empty when it would.
    static QString whyNotPressable(const QWidget& widget);

private:
    Result<PageView*> view(const QString& page) const;
    Result<QWidget*> inSight(const QString& page, const QString& control) const;
    Result<QWidget*> pressable(const QString& page, const QString& control) const;

    MainWindow& m_window;
};

} // namespace lumora
