#include "views/MoogMeret/MoogMeretView.h"

#include "common/DrivePath.h"
#include "views/kit/Gauge.h"
#include "views/kit/ScrolledPicture.h"

#include <QListWidget>

namespace lumora {

using namespace Qt::StringLiterals;

MoogMeretView::MoogMeretView(MoogMeret& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme) {
    frame().steps().setStep(OrderStep::Sending);
    QLayout* parts = inRow(Space::Wide, {{makeOrders(), 4}, {makeHint(), 8}, {makeFiles(), 5}, {makeWalk(), 9}});
    frame().content()->addLayout(across(Space::Wide, {{parts, 1}, makeWays()}), 1);
    makeBars();
    start();
}

QWidget* MoogMeretView::makeOrders() {
    m_orders = list(c.List3, &MoogMeret::List3_Click, [&page = m_page](const QString& name) {
        const MoogMeret::OrderRow row = page.orderRow(name);
        return row.mark.isEmpty() ? row.text : row.text + u'\n' + row.mark;
    });
    m_orders->setProperty("names", true); // the date beside the number is seen whole
    m_orders->setTextElideMode(Qt::ElideRight);
    const Card card = makeCard("card", Pad::Normal);
    bind(card.frame, c.Picture3);
    add(*card.column, {label(c.Label4Shalav1, "strong"),
                       {m_orders, 1},
                       button(c.Command5, Role::Plain, &MoogMeret::Command5_Click, u"resend"_s),
                       button(c.Command4Pieces, Role::Plain, &MoogMeret::Command4Pieces_Click, u"layers"_s)});
    return card.frame;
}

// Stands in place of the files until an order is picked.
QWidget* MoogMeretView::makeHint() {
    QWidget* hint =
        inBox(inColumn(Space::Normal, {Item::room(),
                                       {sign(u"pictures"_s, IconSize::Page, Theme::Colour::Edge), 0, Qt::AlignCenter},
                                       centred(label(c.Label4Rek, "large")),
                                       centred(label(c.Label4Bhar, "large")),
                                       Item::room(),
                                       {makeWaiting(), 4}}));
    follow(hint, c.hintPanel);
    return hint;
}

// What is sent by itself, for the staff.
QWidget* MoogMeretView::makeWaiting() {
    m_waiting = list(c.List4Mamtinot, &MoogMeret::List4Mamtinot_Click);
    m_waiting->setWordWrap(true);
    const Card card = makeCard("card", Pad::Normal);
    add(*card.column,
        {label(c.Label4Mamtinot, "strong"),
         {m_waiting, 1},
         inRow(Space::Normal,
               {button(c.Command4Vater, Role::Quiet, &MoogMeret::Command4Vater_Click, u"trash"_s), Item::room(),
                button(c.Command4Nase, Role::Secondary, &MoogMeret::Command4Nase_Click, u"send"_s)})});
    follow(card.frame, c.waitingPanel);
    return card.frame;
}

QWidget* MoogMeretView::makeFiles() {
    m_fileList = list(c.File1, &MoogMeret::File1_Click, fromLeft);
    m_counts = words("muted");
    bindName(m_counts, c.Label5);
    // The messages call it the yellow window.
    const Card card = makeCard("notice", Pad::Normal);
    bind(card.frame, c.Picture2);
    add(*card.column, {label(c.Label4Shalav2, "strong"),
                       label(c.Label4Lakoach),
                       label(c.Label4Reka, "danger"),
                       {m_fileList, 1},
                       m_counts,
                       label(c.Label4Pieces, "smallMuted"),
                       button(c.Command1, Role::Plain, &MoogMeret::Command1_Click, u"tick"_s),
                       button(c.Command21, Role::Plain, &MoogMeret::Command21_Click, u"undo"_s)});
    return card.frame;
}

QWidget* MoogMeretView::makeWalk() {
    m_gauge = new Gauge(theme(), this);
    follow(m_gauge, c.Label4Mana);
    m_parts = centred(words("body"));
    m_minutes = button(c.Label13, Role::Plain, &MoogMeret::Label13_Click, u"clock"_s);
    const Card answer = makeCard("card", Pad::Normal);
    m_answer = answer.frame;
    m_answerSign = new QLabel(m_answer);
    answer.column->addLayout(
        inRow(Space::Normal, {{m_answerSign, 0, Qt::AlignTop},
                              {inColumn(Space::Tight, {label(c.Label4Sof, "strong"), label(c.Label4Doar)}), 1}}));
    m_packages = list(c.List1, &MoogMeret::List1_Click, [](const QString& path) { return fromLeft(LeafName(path)); });
    QWidget* walk = inBox(inColumn(Space::Small, {{m_gauge, 3, Qt::AlignCenter},
                                                  centred(label(c.Label4Mana, "large")),
                                                  centred(label(c.Label4Shem, "muted")),
                                                  m_parts,
                                                  {m_minutes, 0, Qt::AlignCenter},
                                                  m_answer,
                                                  {m_packages, 4},
                                                  centred(label(c.Label24, "muted"))}));
    follow(walk, c.walkPanel);
    return walk;
}

QWidget* MoogMeretView::makeWays() {
    using Shown = MoogMeretControls;
    m_preview = new ScrolledPicture(theme(), this, {Shown::previewWidth, Shown::previewHeight}, Shown::scrollStep);
    connect(m_preview, &ScrolledPicture::movedAcross, this, toPage(&MoogMeret::HScroll1_Change));
    connect(m_preview, &ScrolledPicture::movedDown, this, toPage(&MoogMeret::VScroll1_Change));
    bind(u"Picture1"_s, m_preview, [this] { return u"%1 x %2"_s.arg(c.Picture1.width()).arg(c.Picture1.height()); });
    follow(m_preview, c.Picture2);
    m_end = new Gauge(theme(), this);
    follow(m_end, c.endPanel);
    QLayout* answers =
        inColumn(Space::Normal, {Item::room(),
                                 {m_end, 0, Qt::AlignCenter},
                                 Item::room(),
                                 label(c.Label4Shalav3, "strong"),
                                 button(c.Command4, Role::Main, &MoogMeret::Command4_Click, u"send"_s),
                                 button(c.Command2, Role::Secondary, &MoogMeret::Command2_Click, u"mail"_s),
                                 label(c.Label4EinDoar, "smallMuted")});
    if (theme().isTall()) {
        QWidget* ways = inBox(inRow(Space::Wide, {m_preview, {answers, 1}}));
        follow(ways, c.waysPanel);
        return ways;
    }
    QWidget* ways = inBox(inColumn(Space::Normal, {m_preview, {answers, 1}}));
    ways->setFixedWidth(m_preview->width());
    follow(ways, c.waysPanel);
    return ways;
}

void MoogMeretView::makeBars() {
    frame().addHeaderAction(button(c.Command6, Role::Quiet, &MoogMeret::Command6_Click, u"exit"_s));
    frame().addSecondaryActions({button(c.Command28, Role::Secondary, &MoogMeret::Command28_Click, u"home"_s),
                                 button(c.Command18, Role::Secondary, &MoogMeret::Command18_Click)});
    frame().addStatus(label(c.Label4Shaa, "large"));
    frame().addMainActions({button(c.Command4Orders, Role::Main, &MoogMeret::Command4Orders_Click),
                            button(c.Command19, Role::Secondary, &MoogMeret::Command19_Click, u"stop"_s)});
}

QWidget* MoogMeretView::firstFocus() const {
    return m_orders;
}

bool MoogMeretView::leave() {
    m_page.Command6_Click();
    return true;
}

void MoogMeretView::render() {
    if (m_page.phase() == MoogMeret::Phase::Leaving)
        return;
    frame().setTitle(c.Title.text, c.Label23.text);
    renderOrders();
    if (c.Picture2.visible)
        renderFiles();
    if (c.walkPanel.visible)
        renderWalk();
}

void MoogMeretView::renderOrders() {
    if (c.List3.currentIndex() < 0 && m_orders->count() > 0)
        m_orders->scrollToBottom(); // the latest order
    m_orders->setAccessibleName(c.Label4Shalav1.text);
    m_waiting->setAccessibleName(c.Label4Mamtinot.text);
    for (int row = 0; row < m_orders->count(); ++row) {
        QListWidgetItem* item = m_orders->item(row);
        const MoogMeret::OrderRow order = m_page.orderRow(c.List3.item(row));
        if (order.mark.isEmpty())
            setIcon(item, order.hint.isEmpty() ? u"pictures"_s : u"layers"_s, Theme::Colour::Primary);
        else
            setIcon(item, u"warning"_s, Theme::Colour::Danger);
        item->setToolTip(order.hint);
    }
}

void MoogMeretView::renderFiles() {
    for (int row = 0; row < m_fileList->count(); ++row) {
        QListWidgetItem* item = m_fileList->item(row);
        item->setFlags(item->flags() & ~Qt::ItemIsUserCheckable); // the page turns the mark over
        item->setFont(theme().font(Theme::Type::Small));          // small letters show more of a long name
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
    const MoogMeret::Answer answer = m_page.answer();
    const int count = c.List1.count();
    const auto of = [count](int done) { return u"%1 / %2"_s.arg(done).arg(count); };
    m_gauge->show(m_page.walk().share(c.List1.currentIndex()), of(c.List1.currentIndex() + 1), c.Label3.text);
    const int done = m_page.packagesDone();
    if (answer == MoogMeret::Answer::Bad || answer == MoogMeret::Answer::Good)
        m_end->showSign(answer == MoogMeret::Answer::Bad ? Gauge::Mood::Bad : Gauge::Mood::Good);
    else
        m_end->show(count == 0 ? 0 : double(done) / count, of(done), c.Label3.text);
    m_parts->setVisible(c.Label4Mana.visible);
    m_parts->setText(
        isolated(c.Label9.text + u'\n' + c.Label2.text + u' ' + QString::number(count) + u' ' + c.Label3.text));
    m_minutes->setText(c.Label4Dakot.text + u' ' + c.Label13.text);
    speak(m_minutes, m_minutes->text());
    renderAnswer();

    m_packages->setVisible(c.endPanel.visible);
    m_packages->setEnabled(answer != MoogMeret::Answer::Sending);
    m_packages->setAccessibleName(c.Label3.text);
    const std::pair<QString, QColor> icons[] = {{u"document"_s, Theme::Colour::Muted}, // by PackageWalk::Fate
                                                {u"document"_s, Theme::Colour::Muted},
                                                {u"check-circle"_s, Theme::Colour::Good},
                                                {u"warning"_s, Theme::Colour::Danger}};
    for (int row = 0; row < m_packages->count(); ++row) {
        const auto& [icon, colour] = icons[static_cast<int>(m_page.walk().fate(row))];
        setIcon(m_packages->item(row), icon, colour);
    }
}

void MoogMeretView::renderAnswer() {
    const struct {
        const char* role;
        QString icon;
        QColor colour;
    } looks[] = {{"notice", u"info"_s, Theme::Colour::Primary}, // by MoogMeret::Answer
                 {"card", u"mail"_s, Theme::Colour::Primary},
                 {"success", u"check-circle"_s, Theme::Colour::Good},
                 {"alarm", u"warning"_s, Theme::Colour::Danger}};
    const auto& look = looks[static_cast<int>(m_page.answer())];
    m_answer->setVisible(!c.Label4Doar.text.isEmpty() || !c.Label4Sof.text.isEmpty());
    changeRole(m_answer, look.role);
    m_answerSign->setPixmap(theme().icon(look.icon, theme().size(IconSize::Line), look.colour));
}

} // namespace lumora
