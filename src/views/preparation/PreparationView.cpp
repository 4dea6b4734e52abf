#include "views/preparation/PreparationView.h"

#include "views/kit/Cards.h"
#include "views/kit/Gauge.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

PreparationView::PreparationView(PreparationPage& page, const SessionState& state, const Theme& theme,
                                 const NamedCaption& warning, const NamedCaption& warningBelow)
    : PageView(page, state, theme)
    , m_page(page) {
    frame().steps().setStep(OrderStep::Preparing);
    auto* row = new QHBoxLayout;
    row->setSpacing(theme.px(28));
    auto* column = new QVBoxLayout;
    column->setSpacing(theme.px(12));
    column->addStretch(1);
    m_gauge = new Gauge(theme, this);
    column->addWidget(m_gauge, 6, Qt::AlignCenter);
    auto* progress = label(u"Label4Progress"_s, page.controls().Label4Progress, "title");
    progress->setAlignment(Qt::AlignCenter);
    column->addWidget(progress);
    auto* picture = label(u"Label4Picture"_s, page.controls().Label4Picture, "muted");
    picture->setAlignment(Qt::AlignCenter);
    column->addWidget(picture);
    m_trouble = new QFrame(this);
    setRole(m_trouble, "notice");
    m_troubleColumn = new QVBoxLayout(m_trouble);
    m_troubleColumn->setContentsMargins(theme.px(18), theme.px(12), theme.px(18), theme.px(12));
    m_troubleColumn->addWidget(label(u"Label4fail"_s, page.controls().Label4fail, "strong"));
    column->addWidget(m_trouble);
    column->addStretch(1);
    auto* keep = new QFrame(this);
    setRole(keep, "card");
    auto* keepRow = new QHBoxLayout(keep);
    keepRow->setContentsMargins(theme.px(20), theme.px(14), theme.px(20), theme.px(14));
    keepRow->setSpacing(theme.px(16));
    auto* sign = new QLabel(keep);
    sign->setPixmap(theme.icon(u"info"_s, theme.px(34), Theme::Colour::Primary));
    keepRow->addWidget(sign);
    auto* words = new QVBoxLayout;
    words->setSpacing(0);
    words->addWidget(label(warning.name, warning.caption));
    words->addWidget(label(warningBelow.name, warningBelow.caption, "strong"));
    keepRow->addLayout(words, 1);
    column->addWidget(keep);
    row->addLayout(column, 3);
    m_side = new QVBoxLayout;
    m_side->setSpacing(theme.px(12));
    row->addLayout(m_side, 2);
    frame().content()->addLayout(row, 1);

    m_total = makeLabel(this, "large");
    m_total->setWordWrap(false);
    frame().addStatus(m_total);
    bind(u"Label5"_s, m_total, [this] { return m_page.controls().Label5.text; });
    bindHidden(u"Label16"_s, page.controls().Label16);
    bindHidden(u"Label17"_s, page.controls().Label17);
    bindList(u"List4fail"_s, page.controls().List4fail);
}

PreparationView::Card PreparationView::addCard(int stretch) {
    auto* card = new QFrame(this);
    setRole(card, "card");
    auto* column = new QVBoxLayout(card);
    column->setContentsMargins(theme().px(16), theme().px(12), theme().px(16), theme().px(16));
    m_side->addWidget(card, stretch);
    return {card, column};
}

void PreparationView::addSheet(int stretch) {
    const Card card = addCard(stretch);
    m_sheetCard = card.frame;
    card.column->addWidget(label(u"Picture5Title"_s, m_page.controls().Picture5, "smallMuted"));
    m_sheet = new PictureBox(theme(), m_sheetCard);
    m_sheet->setMinimumHeight(theme().px(150));
    bind(u"Picture5"_s, m_sheet, m_page.controls().Picture5);
    card.column->addWidget(m_sheet, 1);
}

void PreparationView::renderProgress(const QString& title) {
    frame().setTitle(title);
    const PreparationControls& shown = m_page.controls();
    m_gauge->show(m_page.share(), m_page.positionText(), m_page.countText());
    m_gauge->setAccessibleName(shown.Label4Progress.text.isEmpty() ? title : shown.Label4Progress.text);
    m_total->setVisible(!m_page.totalText().isEmpty());
    m_total->setText(m_page.totalText());
    m_sheet->setPicture(shown.Picture5Image.image());
    m_sheetCard->setVisible(m_page.isSheetShown());
    speak(m_sheet, shown.Picture5.text);
    m_trouble->setVisible(shown.Label4fail.visible);
}

} // namespace lumora
