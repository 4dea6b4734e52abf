#include "views/Havharot/HavharotView.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QScrollArea>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

HavharotView::HavharotView(Havharot& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page) {
    frame().steps().setStep(OrderStep::Details);
    bindHidden(u"Title"_s, page.Title);
    auto* card = new QFrame(this);
    setRole(card, "card");
    auto* column = new QVBoxLayout(card);
    column->setContentsMargins(theme.px(28), theme.px(24), theme.px(28), theme.px(24));
    column->setSpacing(theme.px(20));
    auto* scroll = new QScrollArea(card);
    scroll->setWidgetResizable(true);
    scroll->setFrameShape(QFrame::NoFrame);
    scroll->setFocusPolicy(Qt::NoFocus);
    auto* text = label(u"Label1"_s, page.Label1, "body");
    text->setAlignment(Qt::AlignTop | Qt::AlignLeading);
    scroll->setWidget(text);
    column->addWidget(scroll, 1);
    auto* row = new QHBoxLayout;
    row->setSpacing(theme.gap());
    row->addWidget(button(
        u"Command3"_s, page.Command3, Role::Plain, [this] { m_page.Command3_Click(); }, u"mail"_s));
    row->addWidget(button(
        u"Command4"_s, page.Command4, Role::Plain, [this] { m_page.Command4_Click(); }, u"gear"_s));
    row->addStretch(1);
    column->addLayout(row);
    frame().content()->addWidget(card, 1);
    frame().addHeaderAction(button(
        u"Command2"_s, page.Command2, Role::Quiet, [this] { m_page.Command2_Click(); }, u"exit"_s));
    m_goOn = button(u"Command1"_s, page.Command1, Role::Main, [this] { m_page.Command1_Click(); });
    frame().addMainAction(m_goOn);
    start();
}

QWidget* HavharotView::firstFocus() const {
    return m_goOn;
}

void HavharotView::render() {
    frame().setTitle(m_page.Title.text);
}

} // namespace lumora
