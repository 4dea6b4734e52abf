#include "views/sending/UploadFormView.h"

#include "views/kit/Overlay.h"
#include "views/kit/PrintFan.h"

#include <QPlainTextEdit>
#include <QProgressBar>

#include <tuple>

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
    makeThanks(c.Label4Rshom, c.Label16);
    m_count = movingBar(UploadFormControls::Picture1FullWidth);
    bind(u"Picture1"_s, m_count, [this] { return QString::number(c.Picture1Width); });
    m_pause = movingBar(UploadFormControls::Pic4HamtenFull);
    bind(u"Pic4Hamten"_s, m_pause, [this] { return QString::number(c.Pic4HamtenWidth); });
    QWidget* starts = inBox(inRow(Space::None, {sign(u"upload"_s, IconSize::Line)}));
    bind(starts, c.Picture5);
    layOut({inRow(Space::Small, {Item::room(), starts, lineLabel(c.Label4Count, "title"), Item::room()}),
            centred(label(c.Label9, "strong")),
            {m_count, 0, Qt::AlignHCenter},
            {m_pause, 0, Qt::AlignHCenter},
            centred(label(c.Label4File, "muted")),
            centred(label(c.Label4Do))},
           {trouble.frame, failure.frame}, makeSide());
    makeBars();
    makeLabArea();
    bindLists(page.lists().named());
    start();
}

QLayout* UploadFormView::makeSide() {
    const Card order = makeCard("card", Pad::Normal);
    bind(order.frame, c.Pic4Order);
    m_telephone = echo(c.Label4Tel, "smallMuted");
    add(*order.column, {label(c.Label4Order, "smallMuted"), makeFacts(), orderName(c.Label15, "smallMuted"),
                        label(c.Label4Left, "smallMuted"), m_telephone});
    const Card end = makeCard("notice", Pad::Normal);
    bind(end.frame, c.Picture6);
    add(*end.column, {label(c.Label4Alu, "large"), label(c.Label4Tashlum), label(c.Label4Tel, "large")});
    QPushButton* refresh = button(c.Command2, Role::Quiet, &UploadForm::Command2_Click, u"resend"_s);
    QPushButton* details = button(c.Command24, Role::Quiet, &UploadForm::Command24_Click, u"info"_s);
    return inColumn(Space::Normal, {printFan(),
                                    order.frame,
                                    end.frame,
                                    Item::room(),
                                    {refresh, 0, Qt::AlignLeading},
                                    {details, 0, Qt::AlignLeading}});
}

void UploadFormView::makeBars() {
    frame().addHeaderAction(button(c.Image3, Role::Quiet, &UploadForm::Image3_Click, u"exit"_s));
    m_sendNow = button(c.sendNow, Role::Main, &UploadForm::sendNow_Click);
    QPushButton* goOn = button(c.Command10, Role::Main, &UploadForm::Command10_Click);
    QPushButton* again = button(c.Image5, Role::Main, &UploadForm::Image5_Click);
    frame().addSecondaryActions({button(c.Command3, Role::Secondary, &UploadForm::Command3_Click, u"pause"_s),
                                 button(c.Command15, Role::Secondary, &UploadForm::Command15_Click, u"stop"_s),
                                 button(c.endClose, Role::Secondary, &UploadForm::Image3_Click), makeChange()});
    frame().addMainActions(
        {asMain(SendingButton::NewOrder, button(c.Command28, Role::Secondary, &UploadForm::Command28_Click)),
         asMain(SendingButton::GoOn, goOn), asMain(SendingButton::SendNow, m_sendNow),
         asMain(SendingButton::SendAgain, again)});
}

QPlainTextEdit* UploadFormView::answer(const Caption& caption) {
    auto* made = new QPlainTextEdit(this);
    setRole(made, "lab");
    made->setReadOnly(true);
    made->setFocusPolicy(Qt::NoFocus);
    made->setLayoutDirection(Qt::LeftToRight);
    made->setMinimumHeight(theme().px(LabBoxHeight));
    bindName(made, caption);
    return made;
}

void UploadFormView::makeLabArea() {
    const HttpLists& of = m_page.lists();
    QGridLayout* lists = inGrid(Space::Small);
    addLabList(*lists, c.Label4Kvazim, u"List4Kvazim", of.List4Kvazim);
    addLabList(*lists, c.Label4Hossarim, u"List4Hossarim", of.List4Hossarim);
    addLabList(*lists, c.Label4AfterWeb, u"ListAfterWeb", of.ListAfterWeb);
    addLabList(*lists, c.Label4InOrder, u"ListInOrder", of.ListInOrder);
    m_answer = answer(c.TxtWeb);
    m_listFile = answer(c.TxtFromWeb);
    QLayout* answers =
        inRow(Space::Small, {{inColumn(Space::Tight, {label(c.Label4Answer, "smallMuted"), {m_answer, 1}}), 1},
                             {inColumn(Space::Tight, {label(c.Label4ListFile, "smallMuted"), {m_listFile, 1}}), 1}});
    QLayout* query =
        inRow(Space::Small, {lineLabel(c.Label4Query, "smallMuted"), lineLabel(c.TxtUrl, "small"), Item::room()});
    QLayout* tests = inRow(Space::Small, {button(c.Command1, Role::Plain, &UploadForm::Command1_Click),
                                          button(c.Command5, Role::Plain, &UploadForm::Command5_Click),
                                          button(c.Command6, Role::Plain, &UploadForm::Command6_Click),
                                          button(c.Command7, Role::Plain, &UploadForm::Command7_Click),
                                          button(c.Command8, Role::Plain, &UploadForm::Command8_Click), Item::room()});
    m_labArea = makeLabPanel({{lists, 3}, {answers, 2}, query, tests, makeReporting()},
                             button(c.Command9, Role::Main, &UploadForm::Command9_Click));
    m_labArea->whenEscaped(toPage(&UploadForm::Command9_Click));
}

bool UploadFormView::leave() {
    m_page.Image3_Click();
    return true;
}

void UploadFormView::render() {
    SendingView::render();
    if (c.Picture6.visible)
        m_telephone->hide(); // the end panel has it
    m_count->setVisible(c.Pic4Timer.visible);
    m_count->setValue(c.Picture1Width);
    m_pause->setVisible(c.Pic4Hamten.visible);
    m_pause->setValue(c.Pic4HamtenWidth);
    for (const auto& [shown, text, heading] :
         {std::tuple(m_answer, &c.TxtWeb, &c.Label4Answer), std::tuple(m_listFile, &c.TxtFromWeb, &c.Label4ListFile)}) {
        if (shown->toPlainText() != text->text)
            shown->setPlainText(text->text);
        speak(shown, heading->text);
    }
    m_labArea->setOpen(c.Frame2.visible);
}

} // namespace lumora
