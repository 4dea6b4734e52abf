#include "views/sending/UploadFormView.h"

#include "common/FixedText.h"
#include "views/kit/Gauge.h"
#include "views/sending/SendingCards.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The count begins there; the ring is full then.
constexpr double countdownFrom = 5;

} // namespace

UploadFormView::UploadFormView(UploadForm& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page) {
    frame().steps().setStep(OrderStep::Sending);
    QWidget* progress = makeProgress(); // the keyboard goes the way the controls are made
    QWidget* side = makeSide();
    frame().content()->addLayout(layOutSending(theme, progress, side), 1);
    makeBars();
    bindTheRest();
    start();
}

QWidget* UploadFormView::makeProgress() {
    const ProgressColumn progress = makeProgressColumn(theme(), this);
    QWidget* box = progress.box;
    QVBoxLayout* column = progress.column;
    m_gauge = progress.gauge;
    const auto line = [&](QLabel* made) {
        made->setAlignment(Qt::AlignCenter);
        column->addWidget(made);
        return made;
    };
    m_countdown = line(makeLabel(box, "title"));
    line(label(u"Label4File"_s, m_page.Label4File, "muted"));
    line(label(u"Label4Do"_s, m_page.Label4Do, "body"));
    column->addStretch(1);

    // The same words in two dresses: on the way they are no reason to worry.
    const auto words = [&](const char* role, const QString& icon, QColor colour) {
        const SendingCard made = makeSignedCard(theme(), box, role, icon, colour);
        column->addWidget(made.frame);
        return made;
    };
    const auto [trouble, troubleWords] = words("notice", u"resend"_s, Theme::Colour::Ink);
    m_trouble = trouble;
    m_troubleLine = makeLabel(trouble, "strong");
    troubleWords->addWidget(m_troubleLine);
    m_troubleReason = makeLabel(trouble, "body");
    troubleWords->addWidget(m_troubleReason);
    const auto [failure, failureWords] = words("alarm", u"warning"_s, Theme::Colour::Danger);
    m_failure = failure;
    failureWords->addWidget(label(u"Label1"_s, m_page.Label1, "strong"));
    failureWords->addWidget(label(u"Label4Reason"_s, m_page.Label4Reason));
    return box;
}

QWidget* UploadFormView::makeSide() {
    const CardColumn cards = makeCardColumn(theme(), this);
    const auto [order, orderLines] = cards.add("card");
    m_order = order;
    m_orderHead = makeLabel(order, "smallMuted");
    orderLines->addWidget(m_orderHead);
    m_orderName = makeLabel(order, "strong");
    bind(u"Label15"_s, m_orderName, [this] { return m_page.Label15.text; });
    orderLines->addWidget(m_orderName);
    m_left = makeLabel(order, "body");
    bind(u"Label12"_s, m_left, [this] { return m_page.Label12.text; });
    orderLines->addWidget(m_left);
    m_phone = makeLabel(order, "body");
    bind(u"Label10"_s, m_phone, [this] { return m_page.Label10.text; });
    orderLines->addWidget(m_phone);

    const auto [end, endLines] = cards.add("notice");
    m_end = end;
    endLines->addWidget(label(u"Label4Alu"_s, m_page.Label4Alu, "large"));
    endLines->addWidget(label(u"Label4Rshom"_s, m_page.Label4Rshom, "body"));
    m_endName = makeLabel(end, "large");
    bind(u"Label16"_s, m_endName, [this] { return m_page.Label16.text; });
    endLines->addWidget(m_endName);
    endLines->addWidget(label(u"Label4Tashlum"_s, m_page.Label4Tashlum, "body"));
    m_endPhone = makeLabel(end, "large");
    endLines->addWidget(m_endPhone);
    cards.column->addStretch(1);
    m_refresh = button(
        u"Command2"_s, m_page.Command2, Role::Quiet, [this] { m_page.Command2_Click(); }, u"resend"_s);
    cards.column->addWidget(m_refresh, 0, Qt::AlignLeading);
    return cards.box;
}

void UploadFormView::makeBars() {
    frame().addHeaderAction(button(
        u"Image3"_s, m_page.Image3, Role::Quiet, [this] { m_page.Image3_Click(); }, u"exit"_s));
    m_stop = button(
        u"Command3"_s, m_page.Command3, Role::Secondary, [this] { m_page.Command3_Click(); }, u"pause"_s);
    frame().addSecondaryAction(m_stop);
    m_goOn = button(u"Command10"_s, m_page.Command10, Role::Main, [this] { m_page.Command10_Click(); });
    m_again = button(u"Image5"_s, m_page.Image5, Role::Main, [this] { m_page.Image5_Click(); });
    m_close = button(u"endClose"_s, m_page.Image3, Role::Secondary, [this] { m_page.Image3_Click(); });
    m_newOrder = button(u"Command28"_s, m_page.Command28, Role::Secondary, [this] { m_page.Command28_Click(); });
    frame().addSecondaryAction(m_close);
    for (QPushButton* main : {m_newOrder, m_goOn, m_again})
        frame().addMainAction(main);
}

void UploadFormView::bindTheRest() {
    const std::pair<const char*, const Caption*> captions[] = {
        {"Label4", &m_page.Label4},         {"Label7", &m_page.Label7},           {"Label8", &m_page.Label8},
        {"Label9", &m_page.Label9},         {"Label11", &m_page.Label11},         {"Label13", &m_page.Label13},
        {"Label14", &m_page.Label14},       {"Label4Notru", &m_page.Label4Notru}, {"Picture1", &m_page.Picture1},
        {"Picture5", &m_page.Picture5},     {"Picture6", &m_page.Picture6},       {"Pic4Timer", &m_page.Pic4Timer},
        {"Pic4Hamten", &m_page.Pic4Hamten}, {"Image4", &m_page.Image4},           {"Command15", &m_page.Command15},
        {"TxtWeb", &m_page.TxtWeb},         {"TxtFromWeb", &m_page.TxtFromWeb},   {"TxtUrl", &m_page.TxtUrl}};
    for (const auto& [name, caption] : captions)
        bindHidden(QString::fromLatin1(name), *caption);
    const std::pair<const char*, const TextList*> lists[] = {{"List4Kvazim", &m_page.List4Kvazim},
                                                             {"List4Hossarim", &m_page.List4Hossarim},
                                                             {"ListAfterWeb", &m_page.ListAfterWeb},
                                                             {"ListInOrder", &m_page.ListInOrder}};
    for (const auto& [name, list] : lists)
        bindList(QString::fromLatin1(name), *list);
}

QWidget* UploadFormView::firstFocus() const {
    return m_stop;
}

void UploadFormView::render() {
    const bool counting = m_page.Picture1.visible && m_page.Command3.visible && !m_page.failed;
    const bool waiting = m_page.Command10.visible;
    const bool checking = !m_page.done && !m_page.failed && !m_page.sending && !counting && !waiting;
    window()->setWindowTitle(m_page.caption.trimmed().isEmpty() ? u"Lumora"_s : m_page.caption.simplified());
    frame().steps().setStep(m_page.done ? OrderStep::Done : OrderStep::Sending);
    frame().setTitle(m_page.done     ? wording(u"ההזמנה נשלחה"_s, u"Your order was sent"_s)
                     : m_page.failed ? wording(u"השליחה לא הושלמה"_s, u"The sending is not complete"_s)
                     : counting ? wording(u"ההזמנה מוכנה לשליחה"_s, u"Your order is ready to be sent"_s)
                     : waiting  ? wording(u"המשלוח נעצר"_s, u"The sending is stopped"_s)
                                : wording(u"שליחת ההזמנה"_s, u"Sending your order"_s));
    if (m_page.done)
        m_gauge->showSign(Gauge::Mood::Good);
    else if (m_page.failed)
        m_gauge->showSign(Gauge::Mood::Bad);
    else if (waiting)
        m_gauge->showSign(Gauge::Mood::Held);
    else if (counting)
        m_gauge->show(Val(m_page.Label8.text) / countdownFrom, m_page.Label8.text.trimmed(),
                      m_page.Label14.text.trimmed());
    else if (checking || m_page.verifying) // the share of the last file that began says nothing any more
        m_gauge->show(m_page.verifying ? 1 : 0, u"…"_s, wording(u"בודקים"_s, u"checking"_s));
    else
        m_gauge->show(m_page.percent / 100.0, u"%1%"_s.arg(m_page.percent), wording(u"נשלחו"_s, u"sent"_s));
    m_gauge->setAccessibleName(m_page.Label4Do.text);
    m_countdown->setText(counting ? m_page.Label13.text.trimmed() + u' ' + m_page.Label8.text + u' ' +
                                        m_page.Label14.text.trimmed()
                         : m_page.Label11.visible ? m_page.Label11.text
                                                  : QString());
    m_countdown->setVisible(!m_countdown->text().isEmpty());
    const bool told = !m_page.Label1.text.isEmpty() || m_page.Label4Reason.visible;
    m_failure->setVisible(told && m_page.failed);
    m_trouble->setVisible(told && m_page.sending);
    m_troubleLine->setText(m_page.Label1.text);
    m_troubleLine->setVisible(!m_page.Label1.text.isEmpty());
    m_troubleReason->setText(isolated(m_page.Label4Reason.text));
    m_troubleReason->setVisible(m_page.Label4Reason.visible);
    m_orderHead->setText(wording(u"ההזמנה שלך"_s, u"Your order"_s));
    m_orderName->setText(orderNameLine(m_page.Label15.text, state().english()));
    m_left->setText(isolated(m_page.Label4Notru.text.trimmed() + u": "_s + m_page.Label12.text));
    m_left->setVisible(!m_page.Label12.text.isEmpty() && !m_page.done);
    const QString phone = m_page.Label10.text.trimmed();
    const QString phoneLine = isolated(wording(u"טלפון החנות: %1"_s, u"The shop's telephone: %1"_s).arg(phone));
    m_phone->setText(phoneLine);
    m_phone->setVisible(!phone.isEmpty());
    m_order->setVisible(!m_page.Label15.text.isEmpty() && !m_page.Picture6.visible);
    m_end->setVisible(m_page.Picture6.visible);
    m_endName->setText(orderNameLine(m_page.Label16.text, state().english()));
    m_endPhone->setText(phoneLine);
    m_endPhone->setVisible(!phone.isEmpty());
    m_stop->setVisible(counting);
    m_refresh->setVisible(!m_page.sending && (waiting || m_page.failed));
    const bool ended = m_page.done || (m_page.failed && !m_page.Image5.visible);
    m_close->setVisible(ended);
    m_newOrder->setVisible(m_page.Command28.visible);
    changeRole(m_newOrder, ended ? "main" : "secondary");
    // While files travel nothing is chosen; afterwards the main action is.
    QWidget* main = m_page.Image5.visible ? static_cast<QWidget*>(m_again)
                    : waiting             ? m_goOn
                    : counting            ? m_stop
                    : ended               ? m_newOrder
                                          : static_cast<QWidget*>(this);
    if (std::exchange(m_main, main) != main)
        main->setFocus(Qt::OtherFocusReason);
}

} // namespace lumora
