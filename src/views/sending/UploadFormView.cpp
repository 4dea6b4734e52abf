#include "views/sending/UploadFormView.h"

namespace lumora {

using namespace Qt::StringLiterals;

UploadFormView::UploadFormView(UploadForm& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme) {
    // Both cards show the same words: the first during the sending, which goes on, the second at the end.
    const Card trouble = makeSignedCard("notice", u"resend"_s, Theme::Colour::Ink);
    add(*trouble.column, {echo(c.Label1, "strong"), echo(c.Label4Reason)});
    bind(trouble.frame, c.Pic4Trouble);
    const Card failure = makeSignedCard("alarm", u"warning"_s, Theme::Colour::Danger);
    add(*failure.column, {label(c.Label1, "strong"), label(c.Label4Reason)});
    bind(failure.frame, c.Pic4Failure);
    layOut({centred(label(c.Label4Count, "title")), centred(label(c.Label4File, "muted")), centred(label(c.Label4Do))},
           {trouble.frame, failure.frame}, makeSide());
    makeBars();
    bindLists(page.lists().named());
    start();
}

QLayout* UploadFormView::makeSide() {
    const Card order = makeCard("card", Pad::Normal);
    bind(order.frame, c.Pic4Order);
    add(*order.column,
        {label(c.Label4Order, "smallMuted"), orderName(c.Label15, "strong"), label(c.Label4Left), label(c.Label4Tel)});
    const Card end = makeCard("notice", Pad::Normal);
    bind(end.frame, c.Picture6);
    add(*end.column, {label(c.Label4Alu, "large"), label(c.Label4Rshom), orderName(c.Label16, "large"),
                      label(c.Label4Tashlum), echo(c.Label4Tel, "large")});
    QPushButton* refresh = button(c.Command2, Role::Quiet, &UploadForm::Command2_Click, u"resend"_s);
    return inColumn(Space::Normal, {order.frame, end.frame, Item::room(), {refresh, 0, Qt::AlignLeading}});
}

void UploadFormView::makeBars() {
    frame().addHeaderAction(button(c.Image3, Role::Quiet, &UploadForm::Image3_Click, u"exit"_s));
    m_stop = button(c.Command3, Role::Secondary, &UploadForm::Command3_Click, u"pause"_s);
    QPushButton* goOn = button(c.Command10, Role::Main, &UploadForm::Command10_Click);
    QPushButton* again = button(c.Image5, Role::Main, &UploadForm::Image5_Click);
    frame().addSecondaryActions(
        {asMain(SendingButton::Hold, m_stop), button(c.endClose, Role::Secondary, &UploadForm::Image3_Click)});
    frame().addMainActions(
        {asMain(SendingButton::NewOrder, button(c.Command28, Role::Secondary, &UploadForm::Command28_Click)),
         asMain(SendingButton::GoOn, goOn), asMain(SendingButton::SendAgain, again)});
}

} // namespace lumora
