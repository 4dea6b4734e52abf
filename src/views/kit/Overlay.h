#pragma once

#include "views/kit/Maker.h"

#include <QPointer>
#include <QWidget>

namespace lumora {

// A panel over a page: a veil over everything below, a card in the middle, and the keyboard kept inside while it is
// open.
class Overlay : public QWidget, protected Maker {
    Q_OBJECT
public:
    // Covers parent and follows its size. Closed at first.
    Overlay(const Theme& theme, QWidget* parent, std::initializer_list<Item> items = {});

    void setOpen(bool open);
    bool isOpen() const { return m_open; }
    // Closes it for good.
    void dismiss();
    // How much of the card's width is unfolded, from 0 to 1. The rest of the card neither shows nor answers.
    void setReveal(double share);
    QVBoxLayout* column() const { return m_column; }
    QFrame* card() const { return m_card; }
    void addRow(std::initializer_list<Item> items, Space gap = Space::Normal) const;
    // The last row: the way back at its beginning, what goes on at its end. One of the two has the keyboard first.
    enum class First { Back, Main };
    void addButtons(QWidget* back, QWidget* main, First first = First::Main);
    void addButton(QWidget* only, Qt::Alignment side = Qt::AlignTrailing);
    void whenEscaped(std::function<void()> handler);
    // Of the card, if the window has that much.
    enum class Width { Normal, Wide, Full };
    void setWidth(Width width);
    // The card takes all the room that the margins leave.
    void setFilling();
    // What has the keyboard when the panel opens.
    void setFirstFocus(QWidget* widget) { m_firstFocus = widget; }
    // What has it once the panel has closed, in place of what had it before.
    void setFocusBehind(QWidget* widget) { m_before = widget; }

Q_SIGNALS:
    void escaped();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    bool focusNextPrevChild(bool next) override;
    void keyPressEvent(QKeyEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    bool event(QEvent* event) override;

private:
    void place();
    void cutCard();
    void pressMain();

    const Theme& m_theme;
    QFrame* m_card;
    QVBoxLayout* m_column;
    QPointer<QWidget> m_firstFocus;
    QPointer<QWidget> m_before;
    Width m_width = Width::Normal;
    double m_reveal = 1;
    bool m_filling = false;
    bool m_open = false;
};

// The open panel that lies in front within root, null when there is none.
Overlay* frontOverlay(const QWidget& root);

// Gives the keyboard to the widget: at once, or, while a panel lies before it, when that panel closes. A page asks for
// a box right behind the message that tells why, and the message must keep the keyboard until it is read.
void giveFocus(QWidget& widget);

} // namespace lumora
