#include "views/kit/ChoiceCards.h"

#include "session/TextList.h"
#include "views/kit/Cards.h"
#include "views/kit/Theme.h"

#include <QGridLayout>

#include <algorithm>

namespace lumora {

ChoiceCards::ChoiceCards(const Theme& theme, QWidget* parent, int columns, Maker maker)
    : QWidget(parent)
    , m_grid(new QGridLayout(this))
    , m_columns(columns)
    , m_maker(std::move(maker)) {
    m_grid->setContentsMargins(0, 0, 0, 0);
    m_grid->setSpacing(theme.px(16));
}

void ChoiceCards::display(const TextList& list) {
    while (m_cards.size() > list.count())
        m_cards.takeLast()->deleteLater();
    for (int row = static_cast<int>(m_cards.size()); row < list.count(); ++row) {
        CardButton* card = m_maker(row);
        card->setParent(this);
        card->setCheckable(true);
        card->setObjectName(QStringLiteral("%1(%2)").arg(objectName()).arg(row));
        connect(card, &QAbstractButton::clicked, this, [this, row] { Q_EMIT activated(row); });
        m_grid->addWidget(card, row / m_columns, row % m_columns);
        m_cards += card;
    }
    for (int row = 0; row < list.count(); ++row) {
        CardButton* card = m_cards[row];
        card->setText(isolated(list.item(row)));
        card->setAccessibleName(list.item(row).simplified());
        card->setProperty("row", list.item(row));
        card->setChecked(row == list.currentIndex());
    }
    setFocusProxy(m_cards.value(std::max(list.currentIndex(), 0)));
}

QAbstractButton* ChoiceCards::card(const QString& text) const {
    const auto at = std::find_if(m_cards.begin(), m_cards.end(),
                                 [&](const CardButton* card) { return card->property("row").toString() == text; });
    return at == m_cards.end() ? nullptr : *at;
}

} // namespace lumora
