#include "views/sending/FtpFrmView.h"

#include "common/DrivePathText.h"
#include "imaging/files/PictureFile.h"
#include "views/kit/Cards.h"
#include "views/kit/Overlay.h"
#include "views/sending/SendingCards.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QProgressBar>
#include <QPushButton>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

FtpFrmView::FtpFrmView(FtpFrm& page, const SessionState& state, const Theme& theme, const Files& files)
    : SendingView(page, state, theme)
    , m_page(page)
    , m_shown(page.controls())
    , m_files(files) {
    QWidget* progress = makeProgress(); // the keyboard goes the way the controls are made
    QWidget* side = makeSide();
    frame().content()->addLayout(layOutSending(theme, progress, side), 1);
    makeBars();
    makePanels();
    bindLists(page.lists().named());
    start();
}

QWidget* FtpFrmView::makeProgress() {
    const auto [box, column] = makeProgressColumn();
    const auto line = [this, column = column](const Caption& caption, const char* type) {
        auto* made = label(caption, type);
        made->setAlignment(Qt::AlignCenter);
        column->addWidget(made);
        return made;
    };
    line(m_shown.Label3, "title");
    line(m_shown.Label4File, "muted");
    line(m_shown.Label34, "strong");
    m_minutes = new QWidget(box);
    auto* minutes = new QHBoxLayout(m_minutes);
    minutes->setContentsMargins(0, 0, 0, 0);
    minutes->addStretch(1);
    QLabel* title = label(m_shown.Label4DiffTitle, "muted");
    title->setWordWrap(false);
    minutes->addWidget(title);
    minutes->addWidget(label(m_shown.Label4Diff, "strong"));
    QLabel* unit = label(m_shown.Label4Minutes, "muted");
    unit->setWordWrap(false);
    minutes->addWidget(unit);
    minutes->addStretch(1);
    m_pieces = new QProgressBar(box);
    m_pieces->setRange(0, FtpFrmControls::Pic4ProgWidth);
    m_pieces->setTextVisible(false);
    m_pieces->setFixedWidth(theme().px(360));
    bind(u"PicInProgKatan"_s, m_pieces,
         [this] { return u"%1 %"_s.arg(m_shown.PicInProgKatanWidth * 100 / FtpFrmControls::Pic4ProgWidth); });
    column->addWidget(m_pieces, 0, Qt::AlignHCenter);
    column->addWidget(m_minutes);
    line(m_shown.Label4Do, "body");
    column->addStretch(1);

    SendingCard failure = makeSignedCard(theme(), box, "alarm", u"warning"_s, Theme::Colour::Danger);
    column->addWidget(bindFailure(failure));
    failure.column->addWidget(label(m_shown.Picture6, "strong"));
    failure.column->addWidget(label(m_shown.Label2));
    failure.column->addWidget(label(m_shown.Label4Reason));
    failure.column->addWidget(label(m_shown.Label9));
    return box;
}

QWidget* FtpFrmView::makeSide() {
    const CardColumn cards = makeCardColumn(theme(), this);
    const auto [order, orderLines] = cards.add("card");
    m_order = order;
    orderLines->addWidget(label(m_shown.Label4Order, "smallMuted"));
    m_orderName = makeLabel(order, "strong");
    bind(u"Label46"_s, m_orderName, [this] { return m_shown.Label46.text; });
    orderLines->addWidget(m_orderName);
    orderLines->addWidget(label(m_shown.Label4Counts));
    orderLines->addWidget(button(
                              m_shown.Image4, Role::Plain, [this] { m_page.Image4_Click(); }, u"folder"_s),
                          0, Qt::AlignLeading);

    const auto [delivery, deliveryLines] = cards.add("notice");
    m_delivery = delivery;
    deliveryLines->addWidget(label(m_shown.Label15, "strong"));
    deliveryLines->addWidget(label(m_shown.Label4Ktovet));

    const auto [summary, summaryLines] = cards.add("card");
    m_summary = summary;
    auto* head = new QHBoxLayout;
    auto* sign = new QLabel(summary);
    sign->setPixmap(theme().icon(u"document"_s, theme().px(28), Theme::Colour::Primary));
    head->addWidget(sign);
    head->addWidget(label(m_shown.Label4Summary, "large"), 1);
    summaryLines->addLayout(head);
    m_summaryLines = makeLabel(summary, "body");
    bind(u"Picture2"_s, m_summaryLines, [this] { return m_shown.Picture2Lines.join(u'\n'); });
    summaryLines->addWidget(m_summaryLines);

    m_proof = new PictureBox(theme(), cards.box);
    m_proof->setMinimumHeight(theme().px(120));
    bind(u"Picture13"_s, m_proof, m_shown.Picture13);
    cards.column->addWidget(m_proof, 1);
    cards.column->addStretch(1);
    auto* fault = button(
        m_shown.Command22, Role::Plain, [this] { m_page.Command22_Click(); }, u"resend"_s);
    cards.column->addWidget(fault, 0, Qt::AlignLeading);
    cards.column->addWidget(button(
                                m_shown.Command24, Role::Quiet, [this] { m_page.Command24_Click(); }, u"info"_s),
                            0, Qt::AlignLeading);
    return cards.box;
}

void FtpFrmView::makeBars() {
    frame().addHeaderAction(button(
        m_shown.Image3, Role::Quiet, [this] { m_page.Image3_Click(); }, u"exit"_s));
    frame().addSecondaryAction(button(m_shown.Command11, Role::Secondary, [this] { m_page.Command11_Click(); }));
    frame().addSecondaryAction(button(
        m_shown.Command15, Role::Secondary, [this] { m_page.Command15_Click(); }, u"stop"_s));
    m_count = button(
        m_shown.Command23, Role::Secondary, [this] { m_page.Command23_Click(); }, u"pause"_s);
    frame().addSecondaryAction(m_count);
    QLabel* prints = label(m_shown.Label4Prints, "large");
    prints->setWordWrap(false);
    frame().addStatus(prints);
    auto* again = button(m_shown.Command10, Role::Main, [this] { m_page.Command10_Click(); });
    m_sendNow = button(m_shown.Image5, Role::Main, [this] { m_page.Image5_Click(); });
    frame().addMainAction(newOrderButton(m_shown.Command28, [this] { m_page.Command28_Click(); }));
    frame().addMainAction(asMain(SendingButton::SendAgain, again));
    frame().addMainAction(asMain(SendingButton::SendNow, m_sendNow));
}

void FtpFrmView::makePanels() {
    m_leave = new Overlay(theme(), this);
    m_leave->column()->addWidget(label(m_shown.Picture7, "large"));
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().gap());
    row->addWidget(button(m_shown.Command16, Role::Danger, [this] { m_page.Command16_Click(); }));
    row->addStretch(1);
    auto* stay = button(m_shown.Command14, Role::Main, [this] { m_page.Command14_Click(); });
    row->addWidget(stay);
    m_leave->column()->addLayout(row);
    m_leave->setCardWidth(900);
    m_leave->setFirstFocus(stay);
    connect(m_leave, &Overlay::escaped, this, [this] { m_page.Command14_Click(); });

    // The lists of the sending and its manual steps, for the lab's people.
    m_labArea = new Overlay(theme(), this);
    m_labArea->setFilling();
    auto* lists = new QGridLayout;
    lists->setSpacing(theme().px(8));
    const auto show = [&](int column, const QString& name, const TextList& list, const Caption& head) {
        QLabel* title = label(head, "smallMuted");
        auto* widget = new QListWidget(m_labArea);
        widget->setFocusPolicy(Qt::NoFocus);
        bindList(name, list, widget, [](const QString& item) { return item.contains(u'\\') ? LeafName(item) : item; });
        lists->addWidget(title, 0, column);
        lists->addWidget(widget, 1, column);
        title->setBuddy(widget);
        widget->setAccessibleName(name);
    };
    const FtpLists& of = m_page.lists();
    show(0, u"List3"_s, of.List3, m_shown.Label4ToSend);
    show(1, u"List6"_s, of.List6, m_shown.Label4OnServer);
    show(2, u"List7"_s, of.List7, m_shown.Label4Failed);
    show(3, u"LogList"_s, of.LogList, m_shown.Label4Log);
    m_labArea->column()->addLayout(lists, 1);
    auto* manual = new QGridLayout;
    manual->setSpacing(theme().px(8));
    int at = 0;
    const auto addButton = [&](const Caption& caption, void (FtpFrm::*handler)()) {
        manual->addWidget(button(caption, Role::Plain, [&page = m_page, handler] { (page.*handler)(); }), at / 5,
                          at % 5);
        ++at;
    };
    addButton(m_shown.Command13, &FtpFrm::Command13_Click);
    addButton(m_shown.Command1, &FtpFrm::Command1_Click);
    addButton(m_shown.Command2, &FtpFrm::Command2_Click);
    addButton(m_shown.Command4, &FtpFrm::Command4_Click);
    addButton(m_shown.Command17, &FtpFrm::Command17_Click);
    addButton(m_shown.Command19, &FtpFrm::Command19_Click);
    addButton(m_shown.Command25, &FtpFrm::Command25_Click);
    m_labArea->column()->addLayout(manual);
    auto* close = button(m_shown.Command9, Role::Main, [this] { m_page.Command9_Click(); });
    m_labArea->column()->addWidget(close, 0, Qt::AlignTrailing);
    m_labArea->setFirstFocus(close);
    connect(m_labArea, &Overlay::escaped, this, [this] { m_page.Command9_Click(); });
}

QWidget* FtpFrmView::firstFocus() const {
    return m_sendNow;
}

void FtpFrmView::render() {
    renderPhase();
    const SendingPhase phase = m_page.phase();
    m_pieces->setVisible(m_shown.PicInProgKatan.visible);
    m_pieces->setValue(m_shown.PicInProgKatanWidth);
    m_pieces->setAccessibleName(m_shown.PicInProgKatan.text);
    m_minutes->setVisible(m_shown.Label4Diff.visible);
    m_orderName->setText(orderNameLine(m_shown.Label46.text, state().english()));
    m_orderName->setVisible(!m_shown.Label46.text.isEmpty());
    m_order->setVisible(phase != SendingPhase::Success);
    m_delivery->setVisible(m_shown.Label15.visible);
    m_summary->setVisible(m_shown.Picture2.visible);
    QStringList lines;
    for (const QString& line : m_shown.Picture2Lines) {
        if (!line.trimmed().isEmpty())
            lines += isolated(line.trimmed());
    }
    m_summaryLines->setText(lines.join(u'\n'));
    showProof();
    setIcon(m_count, phase == SendingPhase::Countdown ? u"pause"_s : u"play"_s, Theme::Colour::Ink);
    m_leave->setOpen(m_shown.Picture7.visible);
    m_labArea->setOpen(m_shown.Frame2.visible);
}

void FtpFrmView::showProof() {
    if (m_proofFile == m_shown.Picture13File)
        return;
    m_proofFile = m_shown.Picture13File;
    QImage picture;
    if (const auto path = m_files.drives().toHost(m_proofFile)) {
        if (const auto loaded = loadPicture(*path))
            picture = loaded->image();
    }
    m_proof->setPicture(picture);
}

} // namespace lumora
