#include "views/kit/ChoiceCards.h"

#include "views/kit/CardButtons.h"
#include "views/kit/ScreenReader.h"
#include "views/kit/Theme.h"

#include <QGridLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

ChoiceCards::ChoiceCards(const Theme& theme, QWidget* parent, int columns, Maker maker)
    : QWidget(parent)
    , m_grid(new QGridLayout(this))
    , m_columns(columns)
    , m_maker(std::move(maker)) {
    m_grid->setContentsMargins(0, 0, 0, 0);
    m_grid->setSpacing(theme.size(Space::Wide));
}

void ChoiceCards::display(const QStringList& rows, int current) {
    setFocusProxy(nullptr);
    setFocusPolicy(Qt::TabFocus); // without it the cards can't have their turn behind this
    while (m_cards.size() > rows.size())
        m_cards.takeLast()->deleteLater();
    for (int row = static_cast<int>(m_cards.size()); row < rows.size(); ++row) {
        CardButton* card = m_maker(row);
        card->setParent(this);
        card->setCheckable(true);
        excludeOthers(*card);
        card->setObjectName(u"%1(%2)"_s.arg(objectName()).arg(row));
        connect(card, &QAbstractButton::clicked, this, [this, row] { Q_EMIT activated(row); });
        m_grid->addWidget(card, row / m_columns, row % m_columns);
        // A card that is made late has its turn where the cards stand, not behind the whole page.
        setTabOrder(m_cards.isEmpty() ? static_cast<QWidget*>(this) : m_cards.back(), card);
        m_cards += card;
    }
    for (int row = 0; row < rows.size(); ++row) {
        CardButton* card = m_cards[row];
        card->setText(isolated(rows[row]));
        card->setAccessibleName(rows[row].simplified());
        card->setProperty("row", rows[row]);
        card->setChecked(row == current);
    }
    setFocusPolicy(Qt::NoFocus);
    setFocusProxy(m_cards.value(std::max(current, 0)));
}

QAbstractButton* ChoiceCards::card(const QString& text) const {
    const auto at = std::find_if(m_cards.begin(), m_cards.end(),
                                 [&](const CardButton* card) { return card->property("row").toString() == text; });
    return at == m_cards.end() ? nullptr : *at;
}

} // namespace lumora
