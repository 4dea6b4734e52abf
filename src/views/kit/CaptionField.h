#pragma once

#include <QLineEdit>

#include <functional>

namespace lumora {

// Shows a caption as it is drawn, on one line, and takes a real keyboard: what is typed goes to the page one character
// at a time ('\r' for Enter, '\b' for the key that takes back), and the page's text comes back. Ctrl+A and then a key
// replaces all of it.
class CaptionField : public QLineEdit {
    Q_OBJECT
public:
    struct Handlers {
        std::function<void(QChar)> typed;
        std::function<void()> cleared;
    };
    CaptionField(Handlers handlers, QWidget* parent);

    // Lines end in CR LF.
    void showCaption(const QString& text);
    // True when the key was one of the caption.
    bool take(const QKeyEvent& event);

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void inputMethodEvent(QInputMethodEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent*) override {}
    void mouseReleaseEvent(QMouseEvent*) override {}
    void mouseDoubleClickEvent(QMouseEvent*) override {}

private:
    void type(QChar character);

    Handlers m_handlers;
};

} // namespace lumora
