#pragma once

class QKeyEvent;
class QWidget;

namespace lumora {

// Enter presses what has the keyboard, as Space does: a button, a tick box, the list of a combo box. False when the key
// is another one or nothing there can be pressed.
bool pressByEnter(const QKeyEvent& event, QWidget* focus);

// Enter in a box that is typed in goes on, by the main button of the page or panel.
bool endsTyping(const QKeyEvent& event, const QWidget* focus);

} // namespace lumora
