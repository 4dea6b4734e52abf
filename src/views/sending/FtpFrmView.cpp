#include "views/sending/FtpFrmView.h"

#include "common/DrivePath.h"
#include "views/kit/Cards.h"
#include "views/kit/Overlay.h"

#include <QListWidget>
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
    layOut({centred(label(c.Label3, "title")),
            centred(label(c.Label4File, "muted")),
            centred(label(c.Label34, "strong")),
            {m_pieces, 0, Qt::AlignHCenter},
            minutes,
            centred(label(c.Label4Do))},
           {failure.frame}, makeSide());
}

QLayout* FtpFrmView::makeSide() {
    const Card order = makeCard("card", Pad::Normal);
    bind(order.frame, c.Pic4Order);
    add(*order.column, {label(c.Label4Order, "smallMuted"),
                        orderName(c.Label46, "strong"),
                        label(c.Label4Counts),
                        {button(c.Image4, Role::Plain, &FtpFrm::Image4_Click, u"folder"_s), 0, Qt::AlignLeading}});

    const Card delivery = makeCard("notice", Pad::Normal);
    follow(delivery.frame, c.Label15);
    add(*delivery.column, {label(c.Label15, "strong"), label(c.Label4Ktovet)});

    const Card summary = makeCard("card", Pad::Normal);
    follow(summary.frame, c.Picture2);
    m_summary = words("body");
    bind(u"Picture2"_s, m_summary, [this] { return c.Picture2Lines.join(u'\n'); });
    add(*summary.column,
        {inRow(Space::Small, {sign(u"document"_s, IconSize::Line), {label(c.Label4Summary, "large"), 1}}), m_summary});

    m_proof = new PictureBox(theme(), this);
    m_proof->setMinimumHeight(theme().size(Extent::Drawing));
    bind(m_proof, c.Picture13);
    QPushButton* fault = button(c.Command22, Role::Plain, &FtpFrm::Command22_Click, u"resend"_s);
    QPushButton* details = button(c.Command24, Role::Quiet, &FtpFrm::Command24_Click, u"info"_s);
    return inColumn(Space::Normal, {order.frame,
                                    delivery.frame,
                                    summary.frame,
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
    frame().addSecondaryActions({close, stop, m_count});
    frame().addStatus(lineLabel(c.Label4Prints, "large"));
    QPushButton* again = button(c.Command10, Role::Main, &FtpFrm::Command10_Click);
    m_sendNow = button(c.Image5, Role::Main, &FtpFrm::Image5_Click);
    QPushButton* newOrder = button(c.Command28, Role::Secondary, &FtpFrm::Command28_Click);
    frame().addMainActions({asMain(SendingButton::NewOrder, newOrder), asMain(SendingButton::SendAgain, again),
                            asMain(SendingButton::SendNow, m_sendNow)});
}

// The lists of the sending and its manual steps, for the lab's people.
void FtpFrmView::makeLabArea() {
    QGridLayout* lists = inGrid(Space::Small);
    const auto show = [&](int column, const QString& name, const TextList& of, const Caption& head) {
        QLabel* title = label(head, "smallMuted");
        QListWidget* made =
            listing(of, [](const QString& item) { return item.contains(u'\\') ? LeafName(item) : item; });
        lists->addWidget(title, 0, column);
        lists->addWidget(made, 1, column);
        title->setBuddy(made);
        made->setAccessibleName(name);
    };
    const FtpLists& of = m_page.lists();
    show(0, u"List3"_s, of.List3, c.Label4ToSend);
    show(1, u"List6"_s, of.List6, c.Label4OnServer);
    show(2, u"List7"_s, of.List7, c.Label4Failed);
    show(3, u"LogList"_s, of.LogList, c.Label4Log);
    QGridLayout* manual = inGrid(Space::Small);
    const std::pair<const Caption&, void (FtpFrm::*)()> steps[] = {
        {c.Command13, &FtpFrm::Command13_Click}, {c.Command1, &FtpFrm::Command1_Click},
        {c.Command2, &FtpFrm::Command2_Click},   {c.Command4, &FtpFrm::Command4_Click},
        {c.Command17, &FtpFrm::Command17_Click}, {c.Command19, &FtpFrm::Command19_Click},
        {c.Command25, &FtpFrm::Command25_Click}};
    for (int at = 0; const auto& [caption, pressed] : steps) {
        manual->addWidget(button(caption, Role::Plain, pressed), at / 5, at % 5);
        ++at;
    }
    m_labArea = new Overlay(theme(), this, {{lists, 1}, manual});
    m_labArea->setFilling();
    m_labArea->addButton(button(c.Command9, Role::Main, &FtpFrm::Command9_Click));
    m_labArea->whenEscaped(toPage(&FtpFrm::Command9_Click));
}

void FtpFrmView::render() {
    SendingView::render();
    m_pieces->setVisible(c.PicInProgKatan.visible);
    m_pieces->setValue(c.PicInProgKatanWidth);
    m_pieces->setAccessibleName(c.PicInProgKatan.text);
    QStringList lines;
    for (const QString& line : c.Picture2Lines) {
        if (!line.trimmed().isEmpty())
            lines += isolated(line.trimmed());
    }
    m_summary->setText(lines.join(u'\n'));
    if (std::exchange(m_proofFile, c.Picture13File) != c.Picture13File)
        m_proof->setPicture(loadedPicture(m_files, m_proofFile));
    setIcon(m_count, m_page.look().buttons.testFlag(SendingButton::GoOn) ? u"play"_s : u"pause"_s, Theme::Colour::Ink);
    m_leave->setOpen(c.Picture7.visible);
    m_labArea->setOpen(c.Frame2.visible);
}

} // namespace lumora
