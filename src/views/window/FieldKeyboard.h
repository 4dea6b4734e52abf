#pragma once

#include <QObject>
#include <QPointer>
#include <QStringList>

class QComboBox;
class QLineEdit;
class QWidget;

namespace lumora {

class TouchKeyboard;
class Theme;
struct SessionState;

// Brings the keys on the screen for the field that a person touches, where the lab wants them, and moves what holds the
// field so that it is seen above them. They go with the focus, at a key of a real keyboard, and by their own "done".
// A field is a box that text can be typed into; none where what is typed is hidden, or that has keys of its own
// (property "ownKeys").
class FieldKeyboard : public QObject {
    Q_OBJECT
public:
    FieldKeyboard(QWidget& window, const Theme& theme, const SessionState& state);

    // The keys are made anew when they rise next, as after a change of the theme.
    void forget();
    // After a change of the window's size.
    void place();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void lookSoon();
    void look();
    void make();
    void rise(QWidget& field);
    void sink();
    void lift(QWidget* part, int pixels);
    void setUp();
    void capitalise();
    void type(const QString& text);
    void takeBack();
    void goOn();
    void takeOffer(const QString& text);
    QWidget* nextField() const;

    QWidget& m_window;
    const Theme& m_theme;
    const SessionState& m_state;
    TouchKeyboard* m_keys = nullptr;
    QPointer<QWidget> m_field;   // the one that the keys are for
    QPointer<QWidget> m_touched; // since the last look
    QPointer<QWidget> m_lifted;  // the page or panel that was moved
    bool m_waits = false;        // a look is due
};

} // namespace lumora
