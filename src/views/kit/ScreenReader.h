#pragma once

class QAbstractButton;
class QWidget;

namespace lumora {

// What screen readers are told of the kit's own widgets, once for the application: a panel is a dialog and hides what
// it covers, a card of the role "alarm" is an alert, a choice that excludes its neighbours is a radio button.
void tellScreenReaders();

// The button is one of several choices of which one holds.
void excludeOthers(QAbstractButton& button);
// The panel tells of something that went wrong.
void setAlert(QWidget& panel);
// An alert is read out as it appears.
void tellAlert(QWidget& widget);

} // namespace lumora
