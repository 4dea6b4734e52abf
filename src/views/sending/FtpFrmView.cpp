#include "views/sending/FtpFrmView.h"

#include "common/DrivePath.h"
#include "views/kit/CardButtons.h"
#include "views/kit/Overlay.h"
#include "views/kit/PrintFan.h"

#include <QProgressBar>

namespace lumora {

using namespace Qt::StringLiterals;

FtpFrmView::FtpFrmView(FtpFrm& page, const SessionState& state, const Theme& theme, const Files& files)
    : ViewOf(page, state, theme)
    , m_files(files) {
    makeProgress();
    makeBars();
    m_leave = new Overlay(theme, this, {label(c.Picture7, "large")});
    m_leave->addButtons(button(c.Command16, Role::Danger, &FtpFrm::Command16_Click),
                        button(c.Command14, Role::Main, &FtpFrm::Command14_Click));
    m_leave->setWidth(Overlay::Width::Full);
    m_leave->whenEscaped(toPage(&FtpFrm::Command14_Click));
    makeLabArea();
    bindLists(page.lists().named());
    start();
}

void FtpFrmView::makeProgress() {
    m_pieces = new QProgressBar(this);
    m_pieces->setRange(0, FtpFrmControls::Pic4ProgWidth);
    m_pieces->setTextVisible(false);
    m_pieces->setFixedWidth(theme().size(Extent::Bar));
    bind(u"PicInProgKatan"_s, m_pieces,
         [this] { return u"%1 %"_s.arg(c.PicInProgKatanWidth * 100 / FtpFrmControls::Pic4ProgWidth); });
    QWidget* minutes = inBox(
        inRow(Space::Small, {Item::room(), lineLabel(c.Label4DiffTitle, "muted"), lineLabel(c.Label4Diff, "strong"),
                             lineLabel(c.Label4Minutes, "muted"), Item::room()}));
    follow(minutes, c.Label4Diff);
    const Card failure = makeSignedCard("alarm", u"warning"_s, Theme::Colour::Danger);
    bind(failure.frame, c.Pic4Failure);
    add(*failure.column, {label(c.Picture6, "strong"), label(c.Label2), label(c.Label4Reason), label(c.Label9)});
    makeThanks(c.numberPrompt, c.wholeNumber);
    m_pause = movingBar(FtpFrmControls::Picture1Full);
    bind(u"Picture1"_s, m_pause, [this] { return QString::number(c.Picture1Width); });
    layOut({{blinkingSigns(), 0, Qt::AlignHCenter},
            centred(label(c.Label3, "title")),
            {m_pause, 0, Qt::AlignHCenter},
            centred(label(c.Label4File, "muted")),
            centred(lineLabel(c.Label4Bytes, "muted")),
            centred(label(c.Label34, "strong")),
            {m_pieces, 0, Qt::AlignHCenter},
            minutes,
            centred(label(c.Label4Do))},
           {failure.frame}, makeSide());
}

// One of the two signs is visible at a time.
QWidget* FtpFrmView::blinkingSigns() {
    QHBoxLayout* signs = inRow(Space::Normal);
    for (const Caption* caption : {&c.Image10, &c.Image11}) {
        QWidget* box = inBox(inRow(Space::None, {sign(u"upload"_s, IconSize::Line)}));
        keepPlaceWhenHidden(*box);
        bind(box, *caption);
        signs->addWidget(box);
    }
    QWidget* both = inBox(signs);
    follow(both, c.Pic4Blink);
    return both;
}

QLayout* FtpFrmView::makeSide() {
    const Card order = makeCard("card", Pad::Normal);
    bind(order.frame, c.Pic4Order);
    QWidget* facts = inBox(makeFacts());
    bind(u"Picture2"_s, facts, [this] { return c.Picture2Lines.join(u'\n'); });
    add(*order.column, {label(c.Label4Order, "smallMuted"),
                        facts,
                        orderName(c.Label46, "smallMuted"),
                        label(c.Label4Counts, "smallMuted"),
                        {button(c.Image4, Role::Plain, &FtpFrm::Image4_Click, u"folder"_s), 0, Qt::AlignLeading}});

    const Card delivery = makeCard("notice", Pad::Normal);
    follow(delivery.frame, c.Label15);
    add(*delivery.column, {label(c.Label15, "strong"), label(c.Label4Ktovet)});

    m_proof = new PictureBox(theme(), this);
    m_proof->setMinimumHeight(theme().size(Extent::Drawing));
    bind(m_proof, c.Picture13);
    QPushButton* fault = button(c.Command22, Role::Plain, &FtpFrm::Command22_Click, u"resend"_s);
    QPushButton* details = button(c.Command24, Role::Quiet, &FtpFrm::Command24_Click, u"info"_s);
    return inColumn(Space::Normal, {printFan(),
                                    order.frame,
                                    delivery.frame,
                                    {m_proof, 1},
                                    Item::room(),
                                    {fault, 0, Qt::AlignLeading},
                                    {details, 0, Qt::AlignLeading}});
}

void FtpFrmView::makeBars() {
    frame().addHeaderAction(button(c.Image3, Role::Quiet, &FtpFrm::Image3_Click, u"exit"_s));
    QPushButton* close = button(c.Command11, Role::Secondary, &FtpFrm::Command11_Click);
    QPushButton* stop = button(c.Command15, Role::Secondary, &FtpFrm::Command15_Click, u"stop"_s);
    m_count = button(c.Command23, Role::Secondary, &FtpFrm::Command23_Click, u"pause"_s);
    frame().addSecondaryActions({close, stop, m_count, makeChange()});
    frame().addStatus(lineLabel(c.Label4Prints, "large"));
    QPushButton* again = button(c.Command10, Role::Main, &FtpFrm::Command10_Click);
    m_sendNow = button(c.Image5, Role::Main, &FtpFrm::Image5_Click);
    QPushButton* newOrder = button(c.Command28, Role::Secondary, &FtpFrm::Command28_Click);
    frame().addMainActions({asMain(SendingButton::NewOrder, newOrder), asMain(SendingButton::SendAgain, again),
                            asMain(SendingButton::SendNow, m_sendNow)});
}

bool FtpFrmView::leave() {
    m_page.Image3_Click();
    return true;
}

void FtpFrmView::render() {
    SendingView::render();
    m_pause->setVisible(c.Picture1.visible);
    m_pause->setValue(c.Picture1Width);
    m_chain->setVisible(!m_page.lists().ListRezefFiles.isEmpty());
    m_pieces->setVisible(c.PicInProgKatan.visible);
    m_pieces->setValue(c.PicInProgKatanWidth);
    m_pieces->setAccessibleName(c.PicInProgKatan.text);
    if (std::exchange(m_proofFile, c.Picture13File) != c.Picture13File)
        m_proof->setPicture(loadedPicture(m_files, m_proofFile));
    setIcon(m_count, m_page.look().buttons.testFlag(SendingButton::GoOn) ? u"play"_s : u"pause"_s, Theme::Colour::Ink);
    m_leave->setOpen(c.Picture7.visible);
    m_labArea->setOpen(c.Frame2.visible);
}

} // namespace lumora
