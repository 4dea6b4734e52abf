#include "views/sending/FtpFrmView.h"

#include "common/DrivePathText.h"
#include "common/FixedText.h"
#include "imaging/files/PictureFile.h"
#include "views/kit/Cards.h"
#include "views/kit/Gauge.h"
#include "views/kit/Overlay.h"
#include "views/sending/SendingCards.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QProgressBar>
#include <QPushButton>
#include <QVBoxLayout>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The count begins there; the ring is full then.
constexpr double countdownFrom = 15;

} // namespace

FtpFrmView::FtpFrmView(FtpFrm& page, const SessionState& state, const Theme& theme, const Files& files)
    : PageView(page, state, theme)
    , m_page(page)
    , m_files(files) {
    frame().steps().setStep(OrderStep::Sending);
    QWidget* progress = makeProgress(); // the keyboard goes the way the controls are made
    QWidget* side = makeSide();
    frame().content()->addLayout(layOutSending(theme, progress, side), 1);
    makeBars();
    makePanels();
    bindTheRest();
    start();
}

QWidget* FtpFrmView::makeProgress() {
    const ProgressColumn progress = makeProgressColumn(theme(), this);
    QWidget* box = progress.box;
    QVBoxLayout* column = progress.column;
    m_gauge = progress.gauge;
    const auto line = [&](const QString& name, const Caption& caption, const char* type) {
        auto* made = label(name, caption, type);
        made->setAlignment(Qt::AlignCenter);
        column->addWidget(made);
        return made;
    };
    line(u"Label3"_s, m_page.Label3, "title");
    line(u"Label4File"_s, m_page.Label4File, "muted");
    line(u"Label34"_s, m_page.Label34, "strong");
    m_minutes = new QWidget(box);
    auto* minutes = new QHBoxLayout(m_minutes);
    minutes->setContentsMargins(0, 0, 0, 0);
    minutes->addStretch(1);
    QLabel* title = label(u"Label4DiffTitle"_s, m_page.Label4DiffTitle, "muted");
    title->setWordWrap(false);
    minutes->addWidget(title);
    minutes->addWidget(label(u"Label4Diff"_s, m_page.Label4Diff, "strong"));
    m_minutesUnit = makeLabel(box, "muted");
    m_minutesUnit->setWordWrap(false);
    minutes->addWidget(m_minutesUnit);
    minutes->addStretch(1);
    m_pieces = new QProgressBar(box);
    m_pieces->setRange(0, FtpBoard::Pic4ProgWidth);
    m_pieces->setTextVisible(false);
    m_pieces->setFixedWidth(theme().px(360));
    bind(u"PicInProgKatan"_s, m_pieces,
         [this] { return u"%1 %"_s.arg(m_page.PicInProgKatanWidth * 100 / FtpBoard::Pic4ProgWidth); });
    column->addWidget(m_pieces, 0, Qt::AlignHCenter);
    column->addWidget(m_minutes);
    line(u"Label4Do"_s, m_page.Label4Do, "body");
    column->addStretch(1);

    const auto [failure, failureWords] = makeSignedCard(theme(), box, "alarm", u"warning"_s, Theme::Colour::Danger);
    column->addWidget(failure);
    m_failure = failure;
    m_failureLine = makeLabel(failure, "strong");
    failureWords->addWidget(m_failureLine);
    failureWords->addWidget(label(u"Label2"_s, m_page.Label2));
    failureWords->addWidget(label(u"Label4Reason"_s, m_page.Label4Reason));
    failureWords->addWidget(label(u"Label9"_s, m_page.Label9));
    bind(u"Picture6"_s, m_failureLine, [this] { return m_failureLine->text(); });
    return box;
}

QWidget* FtpFrmView::makeSide() {
    const CardColumn cards = makeCardColumn(theme(), this);
    const auto [order, orderLines] = cards.add("card");
    m_order = order;
    m_orderHead = makeLabel(order, "smallMuted");
    orderLines->addWidget(m_orderHead);
    m_orderName = makeLabel(order, "strong");
    bind(u"Label46"_s, m_orderName, [this] { return m_page.Label46.text; });
    orderLines->addWidget(m_orderName);
    m_counts = makeLabel(order, "body");
    orderLines->addWidget(m_counts);
    orderLines->addWidget(button(
                              u"Image4"_s, m_page.Image4, Role::Plain, [this] { m_page.Image4_Click(); }, u"folder"_s),
                          0, Qt::AlignLeading);

    const auto [delivery, deliveryLines] = cards.add("notice");
    m_delivery = delivery;
    deliveryLines->addWidget(label(u"Label15"_s, m_page.Label15, "strong"));
    deliveryLines->addWidget(label(u"Label4Ktovet"_s, m_page.Label4Ktovet));

    const auto [summary, summaryLines] = cards.add("card");
    m_summary = summary;
    auto* head = new QHBoxLayout;
    auto* sign = new QLabel(summary);
    sign->setPixmap(theme().icon(u"document"_s, theme().px(28), Theme::Colour::Primary));
    head->addWidget(sign);
    m_successLine = makeLabel(summary, "large");
    head->addWidget(m_successLine, 1);
    summaryLines->addLayout(head);
    m_summaryLines = makeLabel(summary, "body");
    bind(u"Picture2"_s, m_summaryLines, [this] { return m_page.Picture2Lines.join(u'\n'); });
    summaryLines->addWidget(m_summaryLines);

    m_proof = new PictureBox(theme(), cards.box);
    m_proof->setMinimumHeight(theme().px(120));
    bind(u"Picture13"_s, m_proof, m_page.Picture13);
    cards.column->addWidget(m_proof, 1);
    cards.column->addStretch(1);
    auto* fault = button(
        u"Command22"_s, m_page.Command22, Role::Plain, [this] { m_page.Command22_Click(); }, u"resend"_s);
    cards.column->addWidget(fault, 0, Qt::AlignLeading);
    cards.column->addWidget(
        button(
            u"Command24"_s, m_page.Command24, Role::Quiet, [this] { m_page.Command24_Click(); }, u"info"_s),
        0, Qt::AlignLeading);
    return cards.box;
}

void FtpFrmView::makeBars() {
    frame().addHeaderAction(button(
        u"Image3"_s, m_page.Image3, Role::Quiet, [this] { m_page.Image3_Click(); }, u"exit"_s));
    m_exit = button(u"Command11"_s, m_page.Command11, Role::Secondary, [this] { m_page.Command11_Click(); });
    frame().addSecondaryAction(m_exit);
    m_stop = button(
        u"Command15"_s, m_page.Command15, Role::Secondary, [this] { m_page.Command15_Click(); }, u"stop"_s);
    frame().addSecondaryAction(m_stop);
    m_count = button(
        u"Command23"_s, m_page.Command23, Role::Secondary, [this] { m_page.Command23_Click(); }, u"pause"_s);
    frame().addSecondaryAction(m_count);
    m_status = makeLabel(this, "large");
    m_status->setWordWrap(false);
    bind(u"Label21"_s, m_status, [this] { return m_page.Label21.text; });
    frame().addStatus(m_status);
    m_sendAgain = button(u"Command10"_s, m_page.Command10, Role::Main, [this] { m_page.Command10_Click(); });
    m_sendNow = button(u"Image5"_s, m_page.Image5, Role::Main, [this] { m_page.Image5_Click(); });
    m_newOrder = button(u"Command28"_s, m_page.Command28, Role::Secondary, [this] { m_page.Command28_Click(); });
    frame().addMainAction(m_newOrder);
    frame().addMainAction(m_sendAgain);
    frame().addMainAction(m_sendNow);
}

void FtpFrmView::makePanels() {
    m_leave = new Overlay(theme(), this);
    m_leaveText = label(u"Picture7"_s, m_page.Picture7, "large");
    m_leave->column()->addWidget(m_leaveText);
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().gap());
    row->addWidget(button(u"Command16"_s, m_page.Command16, Role::Danger, [this] { m_page.Command16_Click(); }));
    row->addStretch(1);
    auto* stay = button(u"Command14"_s, m_page.Command14, Role::Main, [this] { m_page.Command14_Click(); });
    row->addWidget(stay);
    m_leave->column()->addLayout(row);
    m_leave->setCardWidth(900);
    m_leave->setFirstFocus(stay);
    connect(m_leave, &Overlay::escaped, this, [this] { m_page.Command14_Click(); });

    // For the lab's own people: the lists of the sending and its manual steps.
    m_hiddenArea = new Overlay(theme(), this);
    m_hiddenArea->setFilling();
    auto* lists = new QGridLayout;
    lists->setSpacing(theme().px(8));
    const auto show = [&](int column, const QString& name, const TextList& list, const QString& hebrew,
                          const QString& english) {
        auto* title = makeLabel(m_hiddenArea, "smallMuted");
        auto* widget = new QListWidget(m_hiddenArea);
        widget->setFocusPolicy(Qt::NoFocus);
        bindList(name, list, widget, [](const QString& item) { return item.contains(u'\\') ? LeafName(item) : item; });
        lists->addWidget(title, 0, column);
        lists->addWidget(widget, 1, column);
        m_listTitles.push_back({title, {hebrew, english}});
        title->setBuddy(widget);
        widget->setAccessibleName(name);
    };
    show(0, u"List3"_s, m_page.List3, u"קבצים לשליחה"_s, u"Files to be sent"_s);
    show(1, u"List6"_s, m_page.List6, u"נמצאים בשרת"_s, u"On the server"_s);
    show(2, u"List7"_s, m_page.List7, u"שליחה שנכשלה"_s, u"Failed"_s);
    show(3, u"LogList"_s, m_page.LogList, u"יומן"_s, u"Log"_s);
    m_hiddenArea->column()->addLayout(lists, 1);
    auto* manual = new QGridLayout;
    manual->setSpacing(theme().px(8));
    int at = 0;
    const auto add = [&](const QString& name, const Caption& caption, void (FtpFrm::*handler)()) {
        manual->addWidget(button(name, caption, Role::Plain, [&page = m_page, handler] { (page.*handler)(); }), at / 5,
                          at % 5);
        ++at;
    };
    add(u"Command13"_s, m_page.Command13, &FtpFrm::Command13_Click);
    add(u"Command1"_s, m_page.Command1, &FtpFrm::Command1_Click);
    add(u"Command2"_s, m_page.Command2, &FtpFrm::Command2_Click);
    add(u"Command4"_s, m_page.Command4, &FtpFrm::Command4_Click);
    add(u"Command17"_s, m_page.Command17, &FtpFrm::Command17_Click);
    add(u"Command19"_s, m_page.Command19, &FtpFrm::Command19_Click);
    add(u"Command25"_s, m_page.Command25, &FtpFrm::Command25_Click);
    m_hiddenArea->column()->addLayout(manual);
    auto* close = button(u"Command9"_s, m_page.Command9, Role::Main, [this] { m_page.Command9_Click(); });
    m_hiddenArea->column()->addWidget(close, 0, Qt::AlignTrailing);
    m_hiddenArea->setFirstFocus(close);
    connect(m_hiddenArea, &Overlay::escaped, this, [this] { m_page.Command9_Click(); });
}

void FtpFrmView::bindTheRest() {
    const std::pair<const char*, const Caption*> captions[] = {{"Label7", &m_page.Label7},
                                                               {"Label20", &m_page.Label20},
                                                               {"Label33", &m_page.Label33},
                                                               {"LabelProg", &m_page.LabelProg},
                                                               {"Label4Nichshal", &m_page.Label4Nichshal},
                                                               {"Label31", &m_page.Label31},
                                                               {"Label4Missing", &m_page.Label4Missing},
                                                               {"Label4Mitoch", &m_page.Label4Mitoch},
                                                               {"Label12", &m_page.Label12},
                                                               {"Label4Yooadoo", &m_page.Label4Yooadoo},
                                                               {"Label4Hamtana", &m_page.Label4Hamtana},
                                                               {"Label4siem", &m_page.Label4siem},
                                                               {"Command12", &m_page.Command12},
                                                               {"Command18", &m_page.Command18},
                                                               {"Command21", &m_page.Command21},
                                                               {"Command8", &m_page.Command8},
                                                               {"Image6", &m_page.Image6},
                                                               {"Image10", &m_page.Image10},
                                                               {"Image11", &m_page.Image11},
                                                               {"Frame9", &m_page.Frame9},
                                                               {"Label4", &m_page.Label4},
                                                               {"Frame2", &m_page.Frame2}};
    for (const auto& [name, caption] : captions)
        bindHidden(QString::fromLatin1(name), *caption);
    const std::pair<const char*, const TextList*> lists[] = {{"List1", &m_page.List1},
                                                             {"List2", &m_page.List2},
                                                             {"List4", &m_page.List4},
                                                             {"List5", &m_page.List5},
                                                             {"List8", &m_page.List8},
                                                             {"List9", &m_page.List9},
                                                             {"List4Makor", &m_page.List4Makor},
                                                             {"List4Broken", &m_page.List4Broken},
                                                             {"List4BrokenB", &m_page.List4BrokenB},
                                                             {"ListRezefFiles", &m_page.ListRezefFiles},
                                                             {"List4Tikiyot", &m_page.List4Tikiyot}};
    for (const auto& [name, list] : lists)
        bindList(QString::fromLatin1(name), *list);
}

QWidget* FtpFrmView::firstFocus() const {
    return m_sendNow;
}

// A button that hides hands the keyboard to its neighbour: the second half of a double press would stop what the first
// half has started. While files travel nothing is chosen; in the end the main action is.
void FtpFrmView::moveFocus(bool sending, QWidget* mainAction) {
    if (frontOverlay(*window()) || std::exchange(m_wasSending, sending) == sending)
        return;
    if (sending)
        setFocus(Qt::OtherFocusReason);
    else
        mainAction->setFocus(Qt::OtherFocusReason);
}

void FtpFrmView::render() {
    const bool done = m_page.AllDone == 1;
    const bool counting = m_page.Timer1.running();
    const bool failed = !done && !m_page.sending && (m_page.Picture6.visible || m_page.Command10.visible);
    const bool nothing = !done && !failed && !m_page.sending && m_page.Command28.visible;
    window()->setWindowTitle(m_page.caption.trimmed().isEmpty() ? u"Lumora"_s : m_page.caption.simplified());
    frame().steps().setStep(done ? OrderStep::Done : OrderStep::Sending);
    frame().setTitle(done       ? wording(u"ההזמנה נשלחה"_s, u"Your order was sent"_s)
                     : failed   ? wording(u"השליחה לא הושלמה"_s, u"The sending is not complete"_s)
                     : nothing  ? wording(u"אין מה לשלוח"_s, u"Nothing can be sent"_s)
                     : counting ? wording(u"ההזמנה מוכנה לשליחה"_s, u"Your order is ready to be sent"_s)
                                : wording(u"שליחת ההזמנה"_s, u"Sending your order"_s));
    if (done)
        m_gauge->showSign(Gauge::Mood::Good);
    else if (failed || nothing)
        m_gauge->showSign(Gauge::Mood::Bad);
    else if (m_page.sending)
        m_gauge->show(m_page.percent / 100.0, u"%1%"_s.arg(m_page.percent), wording(u"נשלחו"_s, u"sent"_s));
    else
        m_gauge->show(Val(m_page.Label33.text) / countdownFrom, m_page.Label33.text.trimmed(),
                      wording(u"שניות"_s, u"seconds"_s));
    m_gauge->setAccessibleName(m_page.sending ? m_page.LabelProg.text : m_page.Label4Do.text);

    // The small bar counts the pieces of an order that travels in them; the minutes are known from the second one on.
    const bool inPieces = m_page.sending && m_page.Label4Diff.visible;
    m_pieces->setVisible(inPieces);
    m_pieces->setValue(m_page.PicInProgKatanWidth);
    m_pieces->setAccessibleName(wording(u"חלקי ההזמנה"_s, u"Pieces of the order"_s));
    m_minutes->setVisible(inPieces && !m_page.Label4Diff.text.isEmpty());
    m_minutesUnit->setText(wording(u"דקות"_s, u"minutes"_s));

    m_failure->setVisible(failed && (m_page.Picture6.visible || m_page.Label4Reason.visible));
    const auto join = [](std::initializer_list<const Caption*> parts) {
        QStringList words;
        for (const Caption* part : parts)
            words += part->text.trimmed();
        return words.join(u' ');
    };
    m_failureLine->setText(isolated(join({&m_page.Label4Nichshal, &m_page.Label4Missing, &m_page.Label4Mitoch,
                                          &m_page.Label12, &m_page.Label4Yooadoo})));
    m_failureLine->setVisible(m_page.Picture6.visible);

    m_orderHead->setText(wording(u"ההזמנה שלך"_s, u"Your order"_s));
    m_orderName->setText(orderNameLine(m_page.Label46.text, state().english()));
    m_counts->setText(isolated(wording(u"%1 תמונות, %2 קבצים"_s, u"%1 prints, %2 files"_s)
                                   .arg(m_page.Label21.text.trimmed(), m_page.Label7.text.trimmed())));
    m_orderName->setVisible(!m_page.Label46.text.isEmpty());
    m_counts->setVisible(!m_page.Label21.text.trimmed().isEmpty());
    m_order->setVisible(!done);
    m_delivery->setVisible(m_page.Label15.visible);
    m_summary->setVisible(m_page.Picture2.visible);
    m_successLine->setText(wording(u"סיכום ההזמנה"_s, u"Summary of your order"_s));
    QStringList lines;
    for (const QString& line : m_page.Picture2Lines) {
        if (!line.trimmed().isEmpty())
            lines += isolated(line.trimmed());
    }
    m_summaryLines->setText(lines.join(u'\n'));
    if (m_proofFile != m_page.Picture13File) {
        m_proofFile = m_page.Picture13File;
        QImage picture;
        if (const auto path = m_files.drives().toHost(m_proofFile)) {
            if (const auto loaded = loadPicture(*path))
                picture = loaded->image();
        }
        m_proof->setPicture(picture);
    }

    const QString total = m_page.Label21.text.trimmed();
    m_status->setText(total.isEmpty() ? QString()
                                      : wording(u"תמונות בהזמנה: %1"_s, u"Prints in this order: %1"_s).arg(total));
    // One main action at a time; the others that the page allows stand beside it or wait.
    m_sendNow->setVisible(m_page.Image5.visible && !failed && !done && !m_page.sending);
    m_sendAgain->setVisible(m_page.Command10.visible && failed);
    changeRole(m_newOrder, done || nothing ? "main" : "secondary");
    m_newOrder->setVisible(m_page.Command28.visible);
    m_stop->setVisible(m_page.Command15.visible && m_page.sending);
    m_count->setVisible(m_page.Command23.visible && !m_page.sending && !failed && !done && !nothing);
    moveFocus(m_page.sending, m_sendAgain->isVisibleTo(this) ? m_sendAgain : m_newOrder);
    setIcon(m_count, counting ? u"pause"_s : u"play"_s, Theme::Colour::Ink);
    m_exit->setVisible(done && m_page.Command11.visible);
    for (const auto& [label, texts] : m_listTitles)
        label->setText(wording(texts.first, texts.second));
    m_leave->setOpen(m_page.Picture7.visible);
    m_hiddenArea->setOpen(m_page.Frame2.visible);
}

} // namespace lumora
