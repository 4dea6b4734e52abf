#include "views/MoogMeret/MoogMeretView.h"

#include "common/DrivePathText.h"
#include "views/kit/Gauge.h"
#include "views/kit/ScrolledPicture.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QVBoxLayout>

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
    , m_page(page)
    , c(page.controls()) {
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
    start();
}

QWidget* MoogMeretView::makeOrders() {
    const auto [card, column] = makeCard("card", Pad::Normal);
    bind(card, c.Picture3);
    column->addWidget(label(c.Label4Shalav1, "strong"));
    m_orders = new QListWidget(card);
    m_orders->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    whenPicked(m_orders, [&page = m_page](int row) { page.List3_Click(row); });
    bindList(m_orders, c.List3, [&page = m_page](const QString& name) { return page.orderRow(name).text; });
    column->addWidget(m_orders, 1);
    column->addWidget(button(
        c.Command5, Role::Plain, [this] { m_page.Command5_Click(); }, u"resend"_s));
    column->addWidget(button(
        c.Command4Pieces, Role::Plain, [this] { m_page.Command4Pieces_Click(); }, u"layers"_s));
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
    for (QLabel* text : {label(c.Label4Rek, "large"), label(c.Label4Bhar, "large")}) {
        text->setAlignment(Qt::AlignCenter);
        column->addWidget(text);
    }
    column->addStretch(1);
    return m_hint;
}

QWidget* MoogMeretView::makeFiles() {
    // The messages call it the yellow window.
    const auto [card, column] = makeCard("notice", Pad::Normal);
    bind(card, c.Picture2);
    column->addWidget(label(c.Label4Shalav2, "strong"));
    column->addWidget(label(c.Label4Lakoach));
    column->addWidget(label(c.Label4Reka, "danger"));
    m_fileList = new QListWidget(card);
    m_fileList->setTextElideMode(Qt::ElideMiddle);
    m_fileList->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    whenPicked(m_fileList, [&page = m_page](int row) { page.File1_Click(row); });
    bindList(m_fileList, c.File1, [](const QString& name) { return fromLeft(name); });
    column->addWidget(m_fileList, 1);
    m_counts = makeLabel(card, "muted");
    bind(u"Label5"_s, m_counts, [this] { return c.Label5.text; });
    column->addWidget(m_counts);
    column->addWidget(label(c.Label4Pieces, "smallMuted"));
    column->addWidget(button(
        c.Command1, Role::Plain, [this] { m_page.Command1_Click(); }, u"tick"_s));
    column->addWidget(button(
        c.Command21, Role::Plain, [this] { m_page.Command21_Click(); }, u"undo"_s));
    return card;
}

QWidget* MoogMeretView::makeWays() {
    m_ways = new QWidget(this);
    auto* column = new QVBoxLayout(m_ways);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(theme().px(12));
    m_preview =
        new ScrolledPicture(theme(), m_ways, {MoogMeretControls::previewWidth, MoogMeretControls::previewHeight},
                            MoogMeretControls::scrollStep);
    connect(m_preview, &ScrolledPicture::movedAcross, this, [this](int steps) { m_page.HScroll1_Change(steps); });
    connect(m_preview, &ScrolledPicture::movedDown, this, [this](int steps) { m_page.VScroll1_Change(steps); });
    bind(u"Picture1"_s, m_preview, [this] { return u"%1 x %2"_s.arg(c.Picture1.width()).arg(c.Picture1.height()); });
    column->addWidget(m_preview);
    m_end = new Gauge(theme(), m_ways);
    m_end->setFixedSize(theme().px(180), theme().px(180));
    column->addStretch(1);
    column->addWidget(m_end, 0, Qt::AlignCenter);
    column->addStretch(1);
    column->addWidget(label(c.Label4Shalav3, "strong"));
    column->addWidget(button(
        c.Command4, Role::Main, [this] { m_page.Command4_Click(); }, u"send"_s));
    column->addWidget(button(
        c.Command2, Role::Secondary, [this] { m_page.Command2_Click(); }, u"mail"_s));
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
    centred(label(c.Label4Mana, "large"));
    centred(label(c.Label4Shem, "muted"));
    m_parts = centred(makeLabel(m_walk, "body"));
    m_minutes = button(
        c.Label13, Role::Plain, [this] { m_page.Label13_Click(); }, u"clock"_s);
    column->addWidget(m_minutes, 0, Qt::AlignCenter);

    const auto [answer, words] = makeCard("card", Pad::Normal);
    m_answer = answer;
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().px(14));
    m_answerSign = new QLabel(answer);
    row->addWidget(m_answerSign, 0, Qt::AlignTop);
    auto* texts = new QVBoxLayout;
    texts->addWidget(label(c.Label4Sof, "strong"));
    texts->addWidget(label(c.Label4Doar));
    row->addLayout(texts, 1);
    words->addLayout(row);
    column->addWidget(answer);

    m_packages = new QListWidget(m_walk);
    m_packages->setTextElideMode(Qt::ElideMiddle);
    whenPicked(m_packages, [&page = m_page](int at) { page.List1_Click(at); });
    bindList(m_packages, c.List1, [](const QString& path) { return fromLeft(LeafName(path)); });
    column->addWidget(m_packages, 4);
    centred(label(c.Label24, "muted"));
    return m_walk;
}

void MoogMeretView::makeBars() {
    frame().addHeaderAction(button(
        c.Command6, Role::Quiet, [this] { m_page.Command6_Click(); }, u"exit"_s));
    frame().addSecondaryAction(button(
        c.Command28, Role::Secondary, [this] { m_page.Command28_Click(); }, u"home"_s));
    frame().addSecondaryAction(button(c.Command18, Role::Secondary, [this] { m_page.Command18_Click(); }));
    frame().addStatus(label(c.Label4Shaa, "large"));
    frame().addMainAction(button(c.Command4Orders, Role::Main, [this] { m_page.Command4Orders_Click(); }));
    frame().addMainAction(button(
        c.Command19, Role::Secondary, [this] { m_page.Command19_Click(); }, u"stop"_s));
}

QWidget* MoogMeretView::firstFocus() const {
    return m_orders;
}

void MoogMeretView::render() {
    using Phase = MoogMeret::Phase;
    const Phase phase = m_page.phase();
    if (phase == Phase::Leaving)
        return;
    const bool picked = phase == Phase::Picked;
    const bool walk = phase == Phase::Walking || phase == Phase::Walked;
    frame().setTitle(c.Title.text, c.Label23.text);
    m_hint->setVisible(phase == Phase::Orders);
    m_walk->setVisible(walk);
    m_ways->setVisible(picked || phase == Phase::Walked);
    m_preview->setVisible(picked);
    m_end->setVisible(phase == Phase::Walked);
    if (c.List3.currentIndex() < 0 && m_orders->count() > 0)
        m_orders->scrollToBottom(); // the latest order
    m_orders->setAccessibleName(c.Label4Shalav1.text);
    const int size = theme().px(24);
    m_orders->setIconSize({size, size});
    for (int row = 0; row < m_orders->count(); ++row) {
        QListWidgetItem* item = m_orders->item(row);
        const QString hint = m_page.orderRow(c.List3.item(row)).hint;
        item->setIcon(theme().icon(hint.isEmpty() ? u"pictures"_s : u"layers"_s, size, Theme::Colour::Primary));
        item->setToolTip(hint);
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
        item->setCheckState(m_page.files().isMarked(row) ? Qt::Checked : Qt::Unchecked);
    }
    m_fileList->setAccessibleName(c.Label4Shalav2.text);
    m_counts->setText(
        isolated(c.Label1.text + u' ' + c.Label4Files.text + u'\n' + c.Label5.text + u' ' + c.Label4Prints.text));
    m_preview->setPicture(c.Picture1.image());
    m_preview->setScroll({c.HScroll1.value, c.VScroll1.value}, {c.HScroll1.max, c.VScroll1.max});
    m_preview->setAccessibleName(c.Label4Tmuna.text);
}

void MoogMeretView::renderWalk() {
    using Answer = MoogMeret::Answer;
    using Fate = PackageWalk::Fate;
    const bool walking = m_page.phase() == MoogMeret::Phase::Walking;
    const Answer answer = m_page.answer();
    const PackageWalk& walk = m_page.walk();
    const int count = c.List1.count();
    const int index = c.List1.currentIndex();
    const auto of = [count](int done) { return u"%1 / %2"_s.arg(done).arg(count); };
    m_gauge->setVisible(walking);
    m_gauge->show(walk.share(index), of(index + 1), c.Label3.text);
    const int done = m_page.packagesDone();
    if (answer == Answer::Bad)
        m_end->showSign(Gauge::Mood::Bad);
    else if (answer == Answer::Good)
        m_end->showSign(Gauge::Mood::Good);
    else
        m_end->show(count == 0 ? 0 : double(done) / count, of(done), c.Label3.text);
    m_parts->setVisible(walking);
    m_parts->setText(
        isolated(c.Label9.text + u'\n' + c.Label2.text + u' ' + QString::number(count) + u' ' + c.Label3.text));
    m_minutes->setText(c.Label4Dakot.text + u' ' + c.Label13.text);
    speak(m_minutes, m_minutes->text());

    const struct {
        const char* role;
        QString icon;
        QColor colour;
    } looks[] = {{"notice", u"info"_s, Theme::Colour::Primary}, // by Answer
                 {"card", u"mail"_s, Theme::Colour::Primary},
                 {"success", u"check-circle"_s, Theme::Colour::Good},
                 {"alarm", u"warning"_s, Theme::Colour::Danger}};
    const auto& look = looks[static_cast<int>(answer)];
    m_answer->setVisible(!c.Label4Doar.text.isEmpty() || !c.Label4Sof.text.isEmpty());
    changeRole(m_answer, look.role);
    m_answerSign->setPixmap(theme().icon(look.icon, theme().px(32), look.colour));

    m_packages->setVisible(!walking);
    m_packages->setEnabled(answer != Answer::Sending);
    m_packages->setAccessibleName(c.Label3.text);
    const int size = theme().px(24);
    for (int row = 0; row < m_packages->count(); ++row) {
        const Fate fate = walk.fate(row);
        m_packages->item(row)->setIcon(fate == Fate::Sent ? theme().icon(u"check-circle"_s, size, Theme::Colour::Good)
                                       : fate == Fate::Failed
                                           ? theme().icon(u"warning"_s, size, Theme::Colour::Danger)
                                           : theme().icon(u"document"_s, size, Theme::Colour::Muted));
    }
    m_packages->setIconSize({size, size});
}

} // namespace lumora
