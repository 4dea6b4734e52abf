#pragma once

#include "common/Result.h"
#include "drive/KeyHand.h"

#include <QPoint>
#include <QPointF>
#include <QPointer>
#include <QString>
#include <QWidget>

#include <optional>

class QComboBox;

namespace lumora {

class MainWindow;
class PageView;

// What a person presses with. The finger types on the keys of the screen, and who has only keys comes to a control by
// Tab and the arrows.
enum class Hand { Mouse, Finger, Keys };

// Finds controls by their design names ("Command12", "Picture1(3)") and uses them as a person does: each operation
// fails with a reason unless the control is there, visible, enabled and not covered.
class ControlFinder {
public:
    explicit ControlFinder(MainWindow& window, Hand hand = Hand::Mouse);

    // The name of the page in front, "" if there is none.
    QString frontPage() const;

    // Each operation takes the page's name and fails if that page is neither in front nor visible below a panel. For a
    // finger the page "keyboard" is the keys on the screen.
    Result<void> press(const QString& page, const QString& control) const;
    // A mouse button, a finger or the blank held down on a control, which may vanish before it is released.
    struct Held {
        QPointer<QWidget> widget;
        QPoint at;
        Qt::MouseButton button = Qt::LeftButton;
        Hand hand = Hand::Mouse;
        QPointer<QWidget> window; // where a finger is lifted, whatever lies below it by then
        QPoint place;             // in that window
    };
    // Points are in per cent of the control's width and height. Keys know no points but the fields of a palette, and
    // drag nothing.
    Result<Held> hold(const QString& page, const QString& control) const;
    Result<Held> hold(const QString& page, const QString& control, QPointF percent, Qt::MouseButton button) const;
    void letGo(const Held& held) const;
    Result<void> pressAt(const QString& page, const QString& control, QPointF percent,
                         Qt::MouseButton button = Qt::LeftButton) const;
    // Moves the mouse in dragMoves equal steps, so that a control that counts moves gives the same result each time.
    static constexpr int dragMoves = 20;
    Result<void> drag(const QString& page, const QString& control, QPointF from, QPointF to) const;
    // Replaces the contents of a text box.
    Result<void> type(const QString& page, const QString& control, const QString& text) const;
    // With a finger, behind what the box holds: touches the box, and then the keys on the screen, also those that bring
    // other letters.
    Result<void> touchType(const QString& page, const QString& control, const QString& text) const;
    // Chooses the row with this text in a list or a combo box.
    Result<void> choose(const QString& page, const QString& control, const QString& text) const;
    Result<void> tick(const QString& page, const QString& control, bool on) const;

    // What the page holds for a control, hidden ones too: its caption, the text of a box, the current row of a list.
    Result<QString> text(const QString& page, const QString& control) const;
    Result<bool> visible(const QString& page, const QString& control) const;
    Result<bool> enabled(const QString& page, const QString& control) const;
    // Number of rows of a list; working lists without a widget too.
    Result<int> count(const QString& page, const QString& control) const;
    Result<QString> item(const QString& page, const QString& control, int index) const;

    // Why a mouse press in the middle of the widget would not reach it; empty if it would.
    static QString whyNotPressable(const QWidget& widget);

    // Presses once more where the hand was last.
    void pressAgain() const;

private:
    Held pressDown(QWidget& widget, QPoint at, Qt::MouseButton button = Qt::LeftButton) const;
    void click(QWidget& widget, QPoint at) const { letGo(pressDown(widget, at)); }
    Result<void> chooseRow(QComboBox& box, int row) const;
    Result<void> pressFieldByKeys(const QString& page, const QString& control, QPointF percent) const;
    Result<void> touchKey(const QString& name) const;
    Result<PageView*> view(const QString& page) const;
    Result<QWidget*> inSight(const QString& page, const QString& control) const;
    Result<QWidget*> pressable(const QString& page, const QString& control) const;
    // What a press at this point of a control would hit, and where.
    struct Hit {
        QWidget* widget;
        QPoint at;
    };
    Result<Hit> hitAt(const QString& page, const QString& control, QPointF percent) const;

    MainWindow& m_window;
    Hand m_hand;
    KeyHand m_keys;
    mutable std::optional<QPoint> m_last; // in the window, where the hand was
};

} // namespace lumora
