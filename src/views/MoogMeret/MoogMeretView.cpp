#include "views/MoogMeret/MoogMeretView.h"

#include "common/DrivePathText.h"
#include "order/FinishedOrder.h"
#include "order/OrderNames.h"
#include "views/kit/Gauge.h"
#include "views/kit/ScrolledPicture.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QVBoxLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// A row answers to a touch and to Enter alike.
template <class F>
void whenPicked(QListWidget* list, F handler) {
    const auto picked = [list, handler](QListWidgetItem* item) { handler(list->row(item)); };
    QObject::connect(list, &QListWidget::itemClicked, list, picked);
    QObject::connect(list, &QListWidget::itemActivated, list, picked);
}

} // namespace

MoogMeretView::MoogMeretView(MoogMeret& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page) {
    frame().steps().setStep(OrderStep::Sending);
    auto* row = new QHBoxLayout;
    row->setSpacing(theme.px(16));
    row->addWidget(makeOrders(), 4);
    row->addWidget(makeHint(), 8);
    row->addWidget(makeFiles(), 5);
    row->addWidget(makeWalk(), 9);
    row->addWidget(makeWays());
    frame().content()->addLayout(row, 1);
    makeBars();
    bindTheRest();
    start();
}

QString MoogMeretView::orderRow(const QString& folderName) const {
    const auto order = FinishedOrderOf(folderName);
    if (!order)
        return folderName;
    return wording(u"מס' %1   %2"_s, u"No. %1   %2"_s).arg(order->number, order->date.toString(u"dd.MM.yyyy"_s));
}

QWidget* MoogMeretView::makeOrders() {
    const auto [card, column] = makeCard("card", Pad::Normal);
    m_ordersCard = card;
    column->addWidget(label(u"Label4Shalav1"_s, c.Label4Shalav1, "strong"));
    m_orders = new QListWidget(card);
    m_orders->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    whenPicked(m_orders, [&page = m_page](int row) { page.List3_Click(row); });
    bindList(u"List3"_s, c.List3, m_orders, [this](const QString& name) { return orderRow(name); });
    column->addWidget(m_orders, 1);
    column->addWidget(button(
        u"Command5"_s, c.Command5, Role::Plain, [this] { m_page.Command5_Click(); }, u"resend"_s));
    column->addWidget(button(
        u"Command4Pieces"_s, c.Command4Pieces, Role::Plain, [this] { m_page.Command4Pieces_Click(); },
        u"layers"_s));
    return card;
}

// What stands in the place of the files until there are any to show.
QWidget* MoogMeretView::makeHint() {
    m_hint = new QWidget(this);
    auto* column = new QVBoxLayout(m_hint);
    column->setSpacing(theme().px(14));
    column->addStretch(1);
    auto* sign = new QLabel(m_hint);
    sign->setPixmap(theme().icon(u"pictures"_s, theme().px(96), Theme::Colour::Edge));
    column->addWidget(sign, 0, Qt::AlignCenter);
    for (QLabel* text :
         {label(u"Label4Rek"_s, c.Label4Rek, "large"), label(u"Label4Bhar"_s, c.Label4Bhar, "large")}) {
        text->setAlignment(Qt::AlignCenter);
        column->addWidget(text);
    }
    column->addStretch(1);
    return m_hint;
}

QWidget* MoogMeretView::makeFiles() {
    // The messages call it the yellow window.
    const auto [card, column] = makeCard("notice", Pad::Normal);
    m_files = card;
    bind(u"Picture2"_s, m_files, c.Picture2);
    column->addWidget(label(u"Label4Shalav2"_s, c.Label4Shalav2, "strong"));
    column->addWidget(label(u"Label4Lakoach"_s, c.Label4Lakoach));
    column->addWidget(label(u"Label4Reka"_s, c.Label4Reka, "danger"));
    m_fileList = new QListWidget(card);
    m_fileList->setTextElideMode(Qt::ElideMiddle);
    m_fileList->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    whenPicked(m_fileList, [&page = m_page](int row) { page.File1_Click(row); });
    bindList(u"File1"_s, m_page.File1.names(), m_fileList, [](const QString& name) { return fromLeft(name); });
    column->addWidget(m_fileList, 1);
    m_counts = makeLabel(card, "muted");
    bind(u"Label5"_s, m_counts, [this] { return c.Label5.text; });
    column->addWidget(m_counts);
    column->addWidget(label(u"Label4Pieces"_s, c.Label4Pieces, "smallMuted"));
    column->addWidget(button(
        u"Command1"_s, c.Command1, Role::Plain, [this] { m_page.Command1_Click(); }, u"tick"_s));
    column->addWidget(button(
        u"Command21"_s, c.Command21, Role::Plain, [this] { m_page.Command21_Click(); }, u"undo"_s));
    return card;
}

QWidget* MoogMeretView::makeWays() {
    m_ways = new QWidget(this);
    auto* column = new QVBoxLayout(m_ways);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(theme().px(12));
    m_preview = new ScrolledPicture(theme(), m_ways, {MoogMeret::previewWidth, MoogMeret::previewHeight},
                                    MoogMeret::scrollStep);
    connect(m_preview, &ScrolledPicture::movedAcross, this, [this](int steps) { m_page.HScroll1_Change(steps); });
    connect(m_preview, &ScrolledPicture::movedDown, this, [this](int steps) { m_page.VScroll1_Change(steps); });
    bind(u"Picture1"_s, m_preview,
         [this] { return u"%1 x %2"_s.arg(c.Picture1.width()).arg(c.Picture1.height()); });
    column->addWidget(m_preview);
    m_end = new Gauge(theme(), m_ways);
    m_end->setFixedSize(theme().px(180), theme().px(180));
    column->addStretch(1);
    column->addWidget(m_end, 0, Qt::AlignCenter);
    column->addStretch(1);
    m_pickFirst = label(u"Label4Shalav3"_s, c.Label4Shalav3, "strong");
    column->addWidget(m_pickFirst);
    column->addWidget(button(
        u"Command4"_s, c.Command4, Role::Main, [this] { m_page.Command4_Click(); }, u"send"_s));
    column->addWidget(button(
        u"Command2"_s, c.Command2, Role::Secondary, [this] { m_page.Command2_Click(); }, u"mail"_s));
    m_ways->setFixedWidth(m_preview->width());
    return m_ways;
}

QWidget* MoogMeretView::makeWalk() {
    m_walk = new QWidget(this);
    auto* column = new QVBoxLayout(m_walk);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(theme().px(8));
    const auto centred = [&](QLabel* made) {
        made->setAlignment(Qt::AlignCenter);
        column->addWidget(made);
        return made;
    };
    m_gauge = new Gauge(theme(), m_walk);
    column->addWidget(m_gauge, 3, Qt::AlignCenter);
    m_inHand = centred(label(u"Label4Mana"_s, c.Label4Mana, "large"));
    m_nameInHand = centred(label(u"Label4Shem"_s, c.Label4Shem, "muted"));
    m_parts = centred(makeLabel(m_walk, "body"));
    m_minutes = button(
        u"Label13"_s, c.Label13, Role::Plain, [this] { m_page.Label13_Click(); }, u"clock"_s);
    column->addWidget(m_minutes, 0, Qt::AlignCenter);

    const auto [answer, words] = makeCard("card", Pad::Normal);
    m_answer = answer;
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().px(14));
    m_answerSign = new QLabel(answer);
    row->addWidget(m_answerSign, 0, Qt::AlignTop);
    auto* texts = new QVBoxLayout;
    texts->addWidget(label(u"Label4Sof"_s, c.Label4Sof, "strong"));
    texts->addWidget(label(u"Label4Doar"_s, c.Label4Doar));
    row->addLayout(texts, 1);
    words->addLayout(row);
    column->addWidget(answer);

    m_packages = new QListWidget(m_walk);
    m_packages->setTextElideMode(Qt::ElideMiddle);
    whenPicked(m_packages, [&page = m_page](int at) { page.List1_Click(at); });
    bindList(u"List1"_s, c.List1, m_packages, [](const QString& path) { return fromLeft(LeafName(path)); });
    column->addWidget(m_packages, 4);
    centred(label(u"Label24"_s, c.Label24, "muted"));
    return m_walk;
}

void MoogMeretView::makeBars() {
    frame().addHeaderAction(button(
        u"Command6"_s, c.Command6, Role::Quiet, [this] { m_page.Command6_Click(); }, u"exit"_s));
    frame().addSecondaryAction(button(
        u"Command28"_s, c.Command28, Role::Secondary, [this] { m_page.Command28_Click(); }, u"home"_s));
    frame().addSecondaryAction(
        button(u"Command18"_s, c.Command18, Role::Secondary, [this] { m_page.Command18_Click(); }));
    m_time = label(u"Label4Shaa"_s, c.Label4Shaa, "large");
    frame().addStatus(m_time);
    frame().addMainAction(
        button(u"Command4Orders"_s, c.Command4Orders, Role::Main, [this] { m_page.Command4Orders_Click(); }));
    frame().addMainAction(button(
        u"Command19"_s, c.Command19, Role::Secondary, [this] { m_page.Command19_Click(); }, u"stop"_s));
}

void MoogMeretView::bindTheRest() {
    const std::pair<const char*, const Caption*> captions[] = {
        {"Title", &c.Title},         {"Picture3", &c.Picture3},       {"Label1", &c.Label1},
        {"Label2", &c.Label2},       {"Label3", &c.Label3},           {"Label9", &c.Label9},
        {"Label7", &c.Label7},       {"Label10", &c.Label10},         {"Label20", &c.Label20},
        {"Label23", &c.Label23},     {"Label4Files", &c.Label4Files}, {"Label4Prints", &c.Label4Prints},
        {"Command13", &c.Command13}, {"Label4Dakot", &c.Label4Dakot}};
    for (const auto& [name, caption] : captions)
        bindHidden(QString::fromLatin1(name), *caption);
    bindList(u"Dir1"_s, c.Dir1);
    bindList(u"List2"_s, c.List2);
}

QWidget* MoogMeretView::firstFocus() const {
    return m_orders;
}

void MoogMeretView::render() {
    const bool walk = m_page.walkShown();
    const bool picked = c.Picture2.visible && !walk;
    frame().setTitle(c.Title.text, c.Label23.text);
    m_ordersCard->setVisible(c.Picture3.visible && !walk);
    m_hint->setVisible(!c.Picture2.visible && !walk);
    m_files->setVisible(picked);
    m_walk->setVisible(walk);
    m_ways->setVisible(picked || (walk && !m_page.walking()));
    m_preview->setVisible(picked);
    m_pickFirst->setVisible(picked);
    m_end->setVisible(walk);
    m_time->setVisible(walk);
    if (c.List3.currentIndex() < 0 && m_orders->count() > 0)
        m_orders->scrollToBottom(); // the latest order
    m_orders->setAccessibleName(c.Label4Shalav1.text);
    const int size = theme().px(24);
    m_orders->setIconSize({size, size});
    for (int row = 0; row < m_orders->count(); ++row) {
        QListWidgetItem* item = m_orders->item(row);
        const bool inPieces = TravelsInPieces(c.List3.item(row));
        item->setIcon(theme().icon(inPieces ? u"layers"_s : u"pictures"_s, size, Theme::Colour::Primary));
        item->setToolTip(inPieces ? wording(u"הזמנה בחלקים"_s, u"An order in pieces"_s) : QString());
    }
    if (picked)
        renderFiles();
    if (walk)
        renderWalk();
}

void MoogMeretView::renderFiles() {
    for (int row = 0; row < m_fileList->count(); ++row) {
        QListWidgetItem* item = m_fileList->item(row);
        item->setFlags(item->flags() & ~Qt::ItemIsUserCheckable); // the page turns the mark over
        item->setFont(theme().font(Theme::Type::Small));          // a name says much, and its end most
        item->setCheckState(m_page.File1.isMarked(row) ? Qt::Checked : Qt::Unchecked);
    }
    m_fileList->setAccessibleName(c.Label4Shalav2.text);
    m_counts->setText(isolated(c.Label1.text + u' ' + c.Label4Files.text + u'\n' + c.Label5.text + u' ' +
                               c.Label4Prints.text));
    m_preview->setPicture(c.Picture1.image());
    m_preview->setScroll({c.HScroll1.value, c.VScroll1.value}, {c.HScroll1.max, c.VScroll1.max});
    m_preview->setAccessibleName(wording(u"תצוגה של הקובץ הראשון"_s, u"A look at the first file"_s));
}

void MoogMeretView::renderWalk() {
    const bool walking = m_page.walking();
    const int count = c.List1.count();
    const int index = c.List1.currentIndex();
    bool failed = false;
    int sent = 0;
    for (int i = 0; i < count; ++i) {
        failed = failed || m_page.package(i) == MoogMeret::Package::Failed;
        sent += m_page.package(i) == MoogMeret::Package::Sent ? 1 : 0;
    }
    m_gauge->setVisible(walking);
    const double ofPackage = std::min(c.Label13.text.toInt(), 3) / 3.0;
    m_gauge->show(count == 0 ? 0 : (index + ofPackage) / count, u"%1 / %2"_s.arg(index + 1).arg(count),
                  c.Label3.text);
    // Where nothing is sent the ring tells how far the walk came.
    const int done = c.Label4Sof.text.isEmpty() ? index + 1 : sent;
    if (failed)
        m_end->showSign(Gauge::Mood::Bad);
    else if (sent > 0 && sent == count)
        m_end->showSign(Gauge::Mood::Good);
    else
        m_end->show(count == 0 ? 0 : double(done) / count, u"%1 / %2"_s.arg(done).arg(count), c.Label3.text);
    m_inHand->setVisible(walking);
    m_nameInHand->setVisible(walking);
    m_parts->setVisible(walking);
    m_parts->setText(isolated(c.Label9.text + u'\n' + c.Label2.text + u' ' + QString::number(count) + u' ' +
                              c.Label3.text));
    m_minutes->setVisible(walking);
    m_minutes->setText(c.Label4Dakot.text + u' ' + c.Label13.text);
    speak(m_minutes, m_minutes->text());

    const bool sending = m_page.sending();
    m_answer->setVisible(!c.Label4Doar.text.isEmpty() || !c.Label4Sof.text.isEmpty());
    // Good is what the server has taken, be it the package in hand or, once the walk has ended, all of them.
    const bool good = !failed && (walking ? sent > 0 : sent > 0 && sent == count);
    changeRole(m_answer, sending ? "card" : failed ? "alarm" : good ? "success" : "notice");
    m_answerSign->setPixmap(theme().icon(sending  ? u"mail"_s
                                         : failed ? u"warning"_s
                                         : good   ? u"check-circle"_s
                                                  : u"info"_s,
                                         theme().px(32),
                                         failed && !sending ? Theme::Colour::Danger
                                         : good && !sending ? Theme::Colour::Good
                                                            : Theme::Colour::Primary));

    m_packages->setVisible(c.List1Shown.visible);
    m_packages->setEnabled(c.List1Shown.enabled && !sending);
    m_packages->setAccessibleName(c.Label3.text);
    const int size = theme().px(24);
    for (int row = 0; row < m_packages->count(); ++row) {
        const MoogMeret::Package is = m_page.package(row);
        m_packages->item(row)->setIcon(
            is == MoogMeret::Package::Sent     ? theme().icon(u"check-circle"_s, size, Theme::Colour::Good)
            : is == MoogMeret::Package::Failed ? theme().icon(u"warning"_s, size, Theme::Colour::Danger)
                                               : theme().icon(u"document"_s, size, Theme::Colour::Muted));
    }
    m_packages->setIconSize({size, size});
}

} // namespace lumora
