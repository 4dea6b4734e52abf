#include "views/Havharot/HavharotView.h"

#include <QScrollArea>

namespace lumora {

using namespace Qt::StringLiterals;

HavharotView::HavharotView(Havharot& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme) {
    frame().steps().setStep(OrderStep::Details);
    QLabel* text = label(page.controls().Label1, "body");
    text->setAlignment(Qt::AlignTop | Qt::AlignLeading);
    auto* scroll = new QScrollArea(this);
    scroll->setWidgetResizable(true);
    scroll->setFrameShape(QFrame::NoFrame);
    scroll->setFocusPolicy(Qt::NoFocus);
    scroll->setWidget(text);
    const Card card = makeCard("card", Pad::Wide, Space::Wide);
    add(*card.column,
        {{scroll, 1},
         inRow(Space::Normal,
               {button(page.controls().Command3, Role::Plain, &Havharot::Command3_Click, u"mail"_s),
                button(page.controls().Command4, Role::Plain, &Havharot::Command4_Click, u"gear"_s), Item::room()})});
    frame().content()->addWidget(card.frame, 1);
    frame().addHeaderAction(button(page.controls().Command2, Role::Quiet, &Havharot::Command2_Click, u"exit"_s));
    m_goOn = button(page.controls().Command1, Role::Main, &Havharot::Command1_Click);
    frame().addMainAction(m_goOn);
    start();
}

QWidget* HavharotView::firstFocus() const {
    return m_goOn;
}

bool HavharotView::leave() {
    m_page.Command2_Click();
    return true;
}

void HavharotView::render() {
    frame().setTitle(m_page.controls().Title.text);
}

} // namespace lumora
