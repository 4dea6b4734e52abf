#pragma once

#include "common/Result.h"

#include <Qt>

class QComboBox;
class QListWidget;
class QWidget;

namespace lumora {

class MainWindow;
class PaletteBar;

// A person with a keyboard and nothing else: gets to a control by Tab and the arrows, and uses it by Enter and blank.
// The key events take the way of real ones, from whatever has the keyboard.
class KeyHand {
public:
    explicit KeyHand(MainWindow& window)
        : m_window(window) {}

    // Until the control has the keyboard.
    Result<void> moveTo(QWidget& control) const;
    // One key of what has the keyboard, pressed and let go.
    void hit(int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier) const;
    void press(int key) const;
    void letGo(int key) const;
    void type(const QString& text) const;

    // By the key that presses such a control.
    Result<void> use(QWidget& control) const;
    Result<void> choose(QComboBox& box, int row) const;
    Result<void> choose(QListWidget& list, int row) const;
    Result<void> choose(PaletteBar& bar, int field) const;

private:
    QWidget& focus() const;

    MainWindow& m_window;
};

} // namespace lumora
