#pragma once

#include <QStringList>
#include <QWidget>

#include <functional>

class QAbstractButton;
class QGridLayout;

namespace lumora {

class CardButton;
class Theme;

// The rows of a list as large cards of which one is chosen: a choice that a person sees whole, where a drop-down list
// would hide it.
class ChoiceCards : public QWidget {
    Q_OBJECT
public:
    // maker makes the card of a row; the row's text is set here.
    using Maker = std::function<CardButton*(int row)>;
    ChoiceCards(const Theme& theme, QWidget* parent, int columns, Maker maker);

    // current -1: none is chosen.
    void display(const QStringList& rows, int current);
    // The card of the row with this text, null when there is none.
    QAbstractButton* card(const QString& text) const;

Q_SIGNALS:
    void activated(int row);

private:
    QGridLayout* m_grid;
    int m_columns;
    Maker m_maker;
    QList<CardButton*> m_cards;
};

} // namespace lumora
