#include "views/preparation/PreparationView.h"

#include "views/kit/CardButtons.h"
#include "views/kit/Gauge.h"

namespace lumora {

using namespace Qt::StringLiterals;

PreparationView::PreparationView(PreparationPage& page, const SessionState& state, const Theme& theme,
                                 const Caption& title, const Caption& warning, const Caption& warningBelow)
    : LeftOutView(
          page, state, theme, page.controls().leftOut, [&page] { page.Command4Bli_Click(); },
          [&page] { page.Command4Hazor_Click(); },
          [&page](int index, int cell) { return page.smallLeftOut(index, cell); })
    , m_page(page)
    , m_title(title)
    , m_gauge(new Gauge(theme, this))
    , m_trouble(makeCard("notice", Pad::Normal))
    , m_sheetCard(makeCard("card", Pad::Slim))
    , m_sheet(pictureBox())
    , m_side(inColumn(Space::Normal))
    , m_total(oneLine("large")) {
    const PreparationControls& c = page.controls();
    frame().steps().setStep(OrderStep::Preparing);
    m_trouble.column->addWidget(label(c.Label4fail, "strong"));
    const Card keep = makeCard("card", Pad::Normal);
    keep.column->addLayout(
        inRow(Space::Wide, {sign(u"info"_s, IconSize::Line),
                            {inColumn(Space::None, {label(warning), label(warningBelow, "strong")}), 1}}));
    QLayout* progress = inColumn(Space::Normal, {Item::room(),
                                                 {m_gauge, 6, Qt::AlignCenter},
                                                 centred(label(c.Label4Progress, "title")),
                                                 centred(label(c.Label4Picture, "muted")),
                                                 m_trouble.frame,
                                                 Item::room(),
                                                 keep.frame});
    frame().content()->addLayout(across(Space::Far, {{progress, 3}, {m_side, 2}}), 1);
    bind(m_sheet, c.Picture5);
    add(*m_sheetCard.column, {echo(c.Picture5, "smallMuted"), {m_sheet, 1}});
    frame().addStatus(m_total);
    bindName(m_total, c.Label5);
}

PictureBox* PreparationView::pictureBox() {
    auto* made = new PictureBox(theme(), this);
    made->setMinimumHeight(theme().size(Extent::Field));
    return made;
}

void PreparationView::render() {
    LeftOutView::render();
    const PreparationControls& c = m_page.controls();
    frame().setTitle(m_title.text);
    m_gauge->show(m_page.share(), m_page.positionText(), m_page.countText());
    m_gauge->setAccessibleName(c.Label4Progress.text.isEmpty() ? m_title.text : c.Label4Progress.text);
    m_total->setVisible(!m_page.totalText().isEmpty());
    m_total->setText(m_page.totalText());
    m_sheet->setPicture(c.Picture5Image.image());
    m_sheetCard.frame->setVisible(m_page.isSheetShown());
    speak(m_sheet, c.Picture5.text);
    m_trouble.frame->setVisible(c.Label4fail.visible);
}

} // namespace lumora
