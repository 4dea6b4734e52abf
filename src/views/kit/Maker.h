#pragma once

#include "views/kit/Theme.h"

#include <QBoxLayout>
#include <QFrame>
#include <QGridLayout>
#include <QLabel>
#include <QPushButton>

#include <functional>
#include <initializer_list>

namespace lumora {

// What a row or a column holds: a widget or a layout with its share of the room that is left over, or room alone.
struct Item {
    Item(QWidget* made, int share = 0, Qt::Alignment at = {})
        : widget(made)
        , stretch(share)
        , alignment(at) {}
    Item(QLayout* made, int share = 0)
        : layout(made)
        , stretch(share) {}
    Item(Space fixed)
        : space(fixed) {}
    static Item room(int share = 1) { return {static_cast<QWidget*>(nullptr), share}; }

    QWidget* widget = nullptr;
    QLayout* layout = nullptr;
    int stretch = 0;
    Qt::Alignment alignment;
    Space space = Space::None;
};

// A frame with rounded corners and the column inside it.
struct Card {
    QFrame* frame;
    QVBoxLayout* column;
};

// Of parts that an upright window has one below the other.
enum class Upright { FirstOnTop, LastOnTop };

// Makes the plain parts of a page in the look of the theme. They belong to one parent until a layout takes them.
class Maker {
public:
    Maker(const Theme& theme, QWidget* parent)
        : m_theme(theme)
        , m_parent(parent) {}

    QHBoxLayout* inRow(Space gap, std::initializer_list<Item> items = {}) const;
    QVBoxLayout* inColumn(Space gap, std::initializer_list<Item> items = {}) const;
    // Side by side, and one below the other on an upright window.
    QBoxLayout* across(Space gap, std::initializer_list<Item> items, Upright order = Upright::FirstOnTop) const;
    QGridLayout* inGrid(Space gap) const;
    // A widget that holds the layout and nothing around it.
    QWidget* inBox(QLayout* inside) const;
    // The same with the layout's own direction from left to right in every language.
    QWidget* leftToRight(QLayout* inside) const;
    // Room at both sides of the widget, which takes share parts of the width against one part each; on an upright
    // window three times as many.
    QWidget* inMiddle(QWidget* inside, int share) const;
    // role: card, well, notice, alarm or success.
    Card makeCard(const char* role, Pad pad, Space gap = Space::Small) const;
    // The same with a sign beside its column, and rarely more than two lines in it.
    Card makeSignedCard(const char* role, const QString& icon, QColor colour) const;
    void add(QBoxLayout& to, std::initializer_list<Item> items) const;

    QLabel* words(const char* type, const QString& text = {}) const;
    QLabel* oneLine(const char* type) const;
    QLabel* sign(const QString& icon, IconSize size, QColor colour = Theme::Colour::Primary) const;
    // A button that no control of a page is bound to.
    QPushButton* plainButton(const QString& name, const char* role, std::function<void()> clicked) const;

private:
    const Theme& m_theme;
    QWidget* m_parent;
};

// The label with its words in the middle.
QLabel* centred(QLabel* label);
// What lies beside the widget stays where it is when the widget hides.
void keepPlaceWhenHidden(QWidget& widget);
// Where the widget shows or hides, a person sees something else: a press that comes right behind it is not meant for
// it.
void changesSight(QWidget& widget);
// Labels take their look from the theme by this.
QLabel* makeLabel(QWidget* parent, const char* type);
void setRole(QWidget* widget, const char* role);
// The same for a widget that may have been shown, which takes its new look at once.
void changeRole(QWidget* widget, const char* role);
// Of any property that the style sheet asks for: the look follows it only when the sheet is set anew.
void changeLook(QWidget* widget, const char* property, const QVariant& value);
// The theme's icon in the theme's size for buttons.
void setButtonIcon(QAbstractButton* button, const Theme& theme, const QString& icon, QColor colour);

} // namespace lumora
