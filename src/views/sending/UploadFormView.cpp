#include "views/sending/UploadFormView.h"

#include <QFrame>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

UploadFormView::UploadFormView(UploadForm& page, const SessionState& state, const Theme& theme)
    : SendingView(page, state, theme)
    , m_page(page)
    , m_shown(page.controls()) {
    QWidget* progress = makeProgress(); // the keyboard goes the way the controls are made
    QWidget* side = makeSide();
    frame().content()->addLayout(layOutSending(theme, progress, side), 1);
    makeBars();
    bindLists(page.lists().named());
    start();
}

QWidget* UploadFormView::makeProgress() {
    const auto [box, column] = makeProgressColumn();
    const auto line = [this, column = column](const Caption& caption, const char* type) {
        QLabel* made = label(caption, type);
        made->setAlignment(Qt::AlignCenter);
        column->addWidget(made);
    };
    line(m_shown.Label4Count, "title");
    line(m_shown.Label4File, "muted");
    line(m_shown.Label4Do, "body");
    column->addStretch(1);

    // The same words in two dresses: on the way they are no reason to worry.
    const SendingCard trouble = makeSignedCard(theme(), box, "notice", u"resend"_s, Theme::Colour::Ink);
    column->addWidget(trouble.frame);
    m_trouble = trouble.frame;
    m_troubleLine = makeLabel(trouble.frame, "strong");
    trouble.column->addWidget(m_troubleLine);
    m_troubleReason = makeLabel(trouble.frame, "body");
    trouble.column->addWidget(m_troubleReason);
    const SendingCard failure = makeSignedCard(theme(), box, "alarm", u"warning"_s, Theme::Colour::Danger);
    column->addWidget(bindFailure(failure));
    failure.column->addWidget(label(m_shown.Label1, "strong"));
    failure.column->addWidget(label(m_shown.Label4Reason));
    return box;
}

QWidget* UploadFormView::makeSide() {
    const CardColumn cards = makeCardColumn(theme(), this);
    const auto [order, orderLines] = cards.add("card");
    m_order = order;
    orderLines->addWidget(label(m_shown.Label4Order, "smallMuted"));
    m_orderName = makeLabel(order, "strong");
    bind(u"Label15"_s, m_orderName, [this] { return m_shown.Label15.text; });
    orderLines->addWidget(m_orderName);
    orderLines->addWidget(label(m_shown.Label4Left));
    orderLines->addWidget(label(m_shown.Label4Tel));

    const auto [end, endLines] = cards.add("notice");
    m_end = end;
    endLines->addWidget(label(m_shown.Label4Alu, "large"));
    endLines->addWidget(label(m_shown.Label4Rshom, "body"));
    m_endName = makeLabel(end, "large");
    bind(u"Label16"_s, m_endName, [this] { return m_shown.Label16.text; });
    endLines->addWidget(m_endName);
    endLines->addWidget(label(m_shown.Label4Tashlum, "body"));
    m_endPhone = makeLabel(end, "large");
    endLines->addWidget(m_endPhone);
    cards.column->addStretch(1);
    cards.column->addWidget(button(
                                m_shown.Command2, Role::Quiet, [this] { m_page.Command2_Click(); }, u"resend"_s),
                            0, Qt::AlignLeading);
    return cards.box;
}

void UploadFormView::makeBars() {
    frame().addHeaderAction(button(
        m_shown.Image3, Role::Quiet, [this] { m_page.Image3_Click(); }, u"exit"_s));
    m_stop = button(
        m_shown.Command3, Role::Secondary, [this] { m_page.Command3_Click(); }, u"pause"_s);
    frame().addSecondaryAction(asMain(SendingButton::Hold, m_stop));
    auto* goOn = button(m_shown.Command10, Role::Main, [this] { m_page.Command10_Click(); });
    auto* again = button(m_shown.Image5, Role::Main, [this] { m_page.Image5_Click(); });
    frame().addSecondaryAction(button(m_shown.endClose, Role::Secondary, [this] { m_page.Image3_Click(); }));
    frame().addMainAction(newOrderButton(m_shown.Command28, [this] { m_page.Command28_Click(); }));
    frame().addMainAction(asMain(SendingButton::GoOn, goOn));
    frame().addMainAction(asMain(SendingButton::SendAgain, again));
}

QWidget* UploadFormView::firstFocus() const {
    return m_stop;
}

void UploadFormView::render() {
    renderPhase();
    m_trouble->setVisible(m_shown.Pic4Trouble.visible);
    m_troubleLine->setText(m_shown.Label1.text);
    m_troubleLine->setVisible(!m_shown.Label1.text.isEmpty());
    m_troubleReason->setText(isolated(m_shown.Label4Reason.text));
    m_troubleReason->setVisible(m_shown.Label4Reason.visible);
    m_orderName->setText(orderNameLine(m_shown.Label15.text, state().english()));
    m_order->setVisible(!m_shown.Label15.text.isEmpty() && !m_shown.Picture6.visible);
    m_end->setVisible(m_shown.Picture6.visible);
    m_endName->setText(orderNameLine(m_shown.Label16.text, state().english()));
    m_endPhone->setText(isolated(m_shown.Label4Tel.text));
    m_endPhone->setVisible(m_shown.Label4Tel.visible);
}

} // namespace lumora
