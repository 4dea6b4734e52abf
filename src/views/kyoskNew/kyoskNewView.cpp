#include "views/kyoskNew/kyoskNewView.h"

#include "common/DrivePath.h"
#include "views/kit/CardOffer.h"
#include "views/kit/EditableCombo.h"
#include "views/kit/FingerMoves.h"
#include "views/kit/Gauge.h"
#include "views/kit/KeyRows.h"
#include "views/kit/Overlay.h"
#include "views/kyoskNew/LargePicture.h"
#include "views/kyoskNew/PictureCell.h"
#include "views/picture/ResolutionBadge.h"

#include <QApplication>
#include <QKeyEvent>
#include <QLineEdit>
#include <QStackedLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Four in a row, so that the large picture stands beside them; three where it stands above them.
int columnsOf(const Theme& theme) {
    return theme.isTall() ? 3 : 4;
}

// Width and height of a picture stay in one line of text.
QString unbrokenSize(const QString& text) {
    return isolated(text).replace(u" / "_s, u"\u00A0/\u00A0"_s);
}

// A long text stands in two lines, broken at the blank nearest to its middle.
void breakLong(QPushButton& button) {
    QString text = button.text();
    const int room = button.width() - button.fontMetrics().horizontalAdvance(u"MMM"_s);
    if (room <= 0 || text.contains(u'\n') || button.fontMetrics().horizontalAdvance(text) <= room)
        return;
    const qsizetype middle = text.size() / 2;
    for (qsizetype away = 0; away < middle; ++away) {
        for (const qsizetype at : {middle - away, middle + away}) {
            if (text[at] == u' ') {
                text[at] = u'\n';
                button.setText(text);
                return;
            }
        }
    }
}

} // namespace

kyoskNewView::kyoskNewView(kyoskNew& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme) {
    frame().steps().setStep(OrderStep::Pictures);
    frame().setTitleVisible(false);
    frame().content()->setSpacing(theme.size(Space::Small));
    frame().content()->addLayout(makeTopRow());
    auto* body = new QWidget(this);
    m_body = new QStackedLayout(body);
    m_body->addWidget(makeEmpty());
    QWidget* grid = makeGrid();
    m_side = makeSide();
    // The small pictures stand on the left and run from left to right in both languages, as the page's texts say.
    m_body->addWidget(leftToRight(across(theme.isTight() ? Space::Small : Space::Wide,
                                         {{grid, theme.isTall() ? 3 : 2}, {m_side, 1}}, Upright::LastOnTop)));
    frame().content()->addWidget(body, 1);
    makeBars();
    makeQuestions();
    makeCopiesPanel();
    makeClosingPanel();
    makeBranchPanel();
    m_focusRequest = page.focusRequest();
    start();
}

QLayout* kyoskNewView::makeTopRow() {
    QLabel* title = label(c.Title, "large");
    m_folder = oneLine("smallMuted");
    bindName(m_folder, c.Label29);
    QPushButton* chosen = button(c.Command14, Role::Plain, &kyoskNew::Command14_Click, u"check-circle"_s);
    m_previous = button(c.Image15, Role::Plain, &kyoskNew::Image15_Click);
    m_next = button(c.Image16, Role::Plain, &kyoskNew::Image16_Click);
    // The arrows stay where they are from page to page.
    QLabel* range = centred(lineLabel(c.pageRange, "strong"));
    range->setMinimumWidth(theme().px(130));
    keepPlaceWhenHidden(*range);
    QLayout* words = inColumn(Space::None, {title, m_folder});
    if (theme().isTall())
        return inColumn(Space::Small, {words, inRow(Space::Small, {chosen, Item::room(), m_previous, range, m_next})});
    return inRow(Space::Small, {{words, 1}, chosen, m_previous, range, m_next});
}

QWidget* kyoskNewView::makeGrid() {
    QGridLayout* grid = inGrid(Space::Small);
    const int columns = columnsOf(theme());
    for (int i = 0; i < static_cast<int>(cellsOfPage); ++i)
        grid->addWidget(makeCell(i), i / columns, i % columns);
    for (int i = 0; i < columns; ++i)
        grid->setColumnStretch(i, 1);
    auto* box = new SwipeBox(grid, [this](Swipe::Way way) { swipe(way); });
    bindName(box, c.Frame1);
    return box;
}

// A page is drawn over as a leaf of a book in the page's language.
void kyoskNewView::swipe(Swipe::Way way) {
    if (way == Swipe::Way::None)
        return;
    QPushButton* turn = (way == Swipe::Way::Left) == (layoutDirection() == Qt::LeftToRight) ? m_next : m_previous;
    if (turn->isVisible())
        turn->click();
}

PictureCell* kyoskNewView::makeCell(int i) {
    const auto at = static_cast<std::size_t>(i);
    auto* cell = new PictureCell(theme(), this);
    m_cells[at] = cell;
    connect(cell, &QAbstractButton::clicked, this, [this, i] { m_page.Picture1_Click(i); });
    connect(cell->plus(), &QPushButton::clicked, this, [this, i] { m_page.Command12_Click(i); });
    connect(cell->minus(), &QPushButton::clicked, this, [this, i] { m_page.Command13_Click(i); });
    if (i == 0)
        connect(cell, &PictureCell::resized, this, [this] { QTimer::singleShot(0, this, &kyoskNewView::fitCells); });
    connect(cell, &PictureCell::arrow, this, [this, i](int across, int down) {
        const int columns = columnsOf(theme());
        const int column = i % columns + across;
        const int next = i + across + down * columns;
        if (column < 0 || column >= columns || next < 0 || next >= static_cast<int>(cellsOfPage))
            return;
        m_cells[static_cast<std::size_t>(next)]->setFocus(Qt::TabFocusReason);
    });
    bindName(cell, c.Picture1[at]);
    bindName(cell->mark(), c.Picture4[at]);
    bindName(cell->copies(), c.Label4[at]);
    cell->setCopiesTyped(m_page.typesCopies());
    connect(cell->copies(), &QPushButton::clicked, this, [this, i] { m_page.Label4_Click(i); });
    bindName(cell->plus(), c.Command12[at]);
    bindName(cell->minus(), c.Command13[at]);
    return cell;
}

QWidget* kyoskNewView::makeEmpty() {
    m_firstFolder = button(c.firstFolder, Role::Main, &kyoskNew::Image5_Click, u"folder-plus"_s);
    const Card card = makeCard("well", Pad::Normal, Space::Wide);
    add(*card.column, {Item::room(),
                       {sign(u"pictures"_s, IconSize::Page), 0, Qt::AlignCenter},
                       centred(label(c.emptyHead, "title")),
                       centred(label(c.Label25)),
                       {m_firstFolder, 0, Qt::AlignCenter},
                       m_cardPlaces[0] = inRow(Space::None),
                       Item::room()});
    return card.frame;
}

QWidget* kyoskNewView::makeSide() {
    m_card = new CardOffer(theme(), this);
    bind(m_card, c.cardOffer);
    connect(m_card, &QAbstractButton::clicked, &m_page, &kyoskNew::cardOffer_Click);
    m_large = new LargePicture(theme(), this);
    bindName(m_large, c.Picture2);
    connect(m_large, &LargePicture::resized, this, [this] { QTimer::singleShot(0, this, &kyoskNewView::fitCells); });
    connect(m_large, &LargePicture::clicked, &m_page, &kyoskNew::Picture2_Click);
    const Card picture = makeCard("card", Pad::Slim);
    QPushButton* turn = button(c.Image4, Role::Plain, &kyoskNew::Image4_Click, u"rotate"_s);
    m_largeResolution = new ResolutionBadge(theme(), this);
    bind(m_largeResolution, c.largeResolution);
    QLabel* note = centred(label(c.paperNote, "smallMuted"));
    QLabel* size = centred(label(c.Label6, "strong", unbrokenSize));
    if (theme().isTall())
        picture.column->addLayout(
            inRow(Space::Normal,
                  {{m_large, 3},
                   {inColumn(Space::Normal,
                             {Item::room(), size, note, {m_largeResolution, 0, Qt::AlignCenter}, turn, Item::room()}),
                    2}}),
            1);
    else if (theme().isTight())
        add(*picture.column, {{m_large, 1},
                              m_about = inBox(inColumn(Space::None, {note, size})),
                              {m_largeResolution, 0, Qt::AlignCenter},
                              turn});
    else
        add(*picture.column,
            {{m_large, 1}, note, {m_largeResolution, 0, Qt::AlignCenter}, inRow(Space::Small, {{size, 1}, turn})});

    m_offerButtons = {
        button(c.Command24, Role::Plain, &kyoskNew::Command24_Click),
        button(c.Command25, Role::Plain, &kyoskNew::Command25_Click),
        button(c.Command23, Role::Quiet, &kyoskNew::Command23_Click),
    };
    const Card offer = makeCard("notice", Pad::Slim);
    bind(offer.frame, c.Picture66);
    offer.column->addWidget(centred(label(c.Label35, "strong")));
    for (QPushButton* answer : m_offerButtons) {
        setRole(answer, "tall");
        offer.column->addWidget(answer);
    }
    QPushButton* branch = button(c.Image33, Role::Plain, &kyoskNew::Image33_Click, u"shop"_s);
    m_cardPlaces[1] = inRow(Space::None);
    QLabel* copies = centred(label(c.cardCopies, "strong"));
    if (!theme().isTall())
        return inBox(inColumn(Space::Small, {m_cardPlaces[1], copies, {picture.frame, 1}, offer.frame, branch}));
    return inBox(inRow(Space::Normal, {{picture.frame, 2},
                                       {inColumn(Space::Small, {m_cardPlaces[1], copies, offer.frame, branch}), 1}}));
}

void kyoskNewView::makeBars() {
    QPushButton* language = button(c.Command4Safa, Role::Quiet, &kyoskNew::Command4Safa_Click, u"globe"_s);
    language->setProperty("letterOfAnyLanguage", true);
    frame().addHeaderActions({language, button(c.Image11, Role::Quiet, &kyoskNew::Image11_Click),
                              button(c.Image6, Role::Quiet, &kyoskNew::Image6_Click),
                              button(c.Image10, Role::Quiet, &kyoskNew::Image10_Click)});
    frame().addSecondaryActions({button(c.Image5, Role::Secondary, &kyoskNew::Image5_Click, u"folder-plus"_s),
                                 button(c.Image8, Role::Quiet, &kyoskNew::Image8_Click, u"eraser"_s)});
    QPushButton* change = button(c.changeDetails, Role::Quiet, &kyoskNew::changeDetails_Click);
    frame().addStatus({lineLabel(c.Label7Prompt), lineLabel(c.Label7, "title"), Space::Tight,
                       inRow(Space::None, {lineLabel(c.Label15, "muted"), change})});
    frame().addMainActions({button(c.Image13, Role::Main, &kyoskNew::Image13_Click),
                            button(c.Image7, Role::Main, &kyoskNew::Image7_Click)});
}

void kyoskNewView::makeQuestions() {
    m_leave = new Overlay(theme(), this, {label(c.Label11, "large")});
    m_leave->addButtons(button(c.Command15, Role::Danger, &kyoskNew::Command15_Click, u"exit"_s),
                        button(c.Command4, Role::Main, &kyoskNew::Command4_Click));
    m_leave->whenEscaped(toPage(&kyoskNew::Command4_Click));

    m_help = new Overlay(theme(), this, {label(c.Label9)});
    m_help->addButton(button(c.helpClose, Role::Main, &kyoskNew::Image6_Click));
    m_help->whenEscaped(toPage(&kyoskNew::Image6_Click));

    m_doorGauge = new Gauge(theme(), this);
    m_door = new Overlay(theme(), this, {centred(label(c.doorNote, "large")), {m_doorGauge, 0, Qt::AlignCenter}});
    m_door->addButton(button(c.doorBack, Role::Secondary, &kyoskNew::doorBack_Click), Qt::AlignCenter);
    m_door->whenEscaped(toPage(&kyoskNew::doorBack_Click));

    m_compression = new Overlay(theme(), this, {label(c.Label37, "large")});
    m_compression->addButtons(button(c.Command20, Role::Secondary, &kyoskNew::Command20_Click),
                              button(c.Command21, Role::Main, &kyoskNew::Command21_Click));
}

void kyoskNewView::makeCopiesPanel() {
    KeyRows keys;
    for (const int digit : {1, 2, 3, 4, 5, 6, 7, 8, 9, 0}) {
        const auto at = static_cast<std::size_t>(digit);
        keys.digits[at] = toKey(button(c.copiesDigit[at], Role::Plain, &kyoskNew::copiesDigit_Click, digit), theme());
    }
    m_copiesBack = toKey(button(c.copiesBack, Role::Plain, &kyoskNew::copiesBack_Click, u"backspace"_s), theme());
    keys.besideZero[0] = m_copiesBack;
    m_copiesPicture = new PictureBox(theme(), this);
    m_copiesPicture->setMinimumSize(theme().size(Extent::WideField), theme().size(Extent::Drawing));
    m_copies = new Overlay(theme(), this,
                           {label(c.copiesHead, "title"),
                            inRow(Space::Far, {{inColumn(Space::Small, {{m_copiesPicture, 1},
                                                                        centred(label(c.copiesTyped, "number")),
                                                                        centred(label(c.copiesNote, "muted"))}),
                                                1},
                                               {inDigitRows(*this, theme(), keys), 1}})});
    m_copies->addButtons(button(c.copiesCancel, Role::Secondary, &kyoskNew::copiesCancel_Click),
                         button(c.copiesDone, Role::Main, &kyoskNew::copiesDone_Click));
    m_copies->whenEscaped(toPage(&kyoskNew::copiesCancel_Click));
}

void kyoskNewView::makeClosingPanel() {
    // The tab order is the order in which the controls are made.
    QPushButton* prices = button(c.Image17, Role::Quiet, &kyoskNew::Image17_Click, u"tag"_s);
    m_mail = field(c.Text1, toPage(&kyoskNew::Text1_Change));
    m_domain = new EditableCombo(this, toPage(&kyoskNew::Combo1_Click), toPage(&kyoskNew::Combo1_Change));
    bind(m_domain, c.Combo1);
    setDomainBox(*m_mail, *m_domain);
    m_at = words("large", u"@"_s);
    m_addressWord = lineLabel(c.Label33Word, "muted");
    m_albumMail = field(c.Txt4Ml2, toPage(&kyoskNew::Txt4Ml2_Change));
    m_albumMail->setInputMethodHints(Qt::ImhEmailCharactersOnly);
    m_note = field(c.Text2, toPage(&kyoskNew::Text2_Change));
    m_backToPictures = button(c.Command10, Role::Secondary, &kyoskNew::Command10_Click);
    m_withoutAddress = button(c.Command7, Role::Secondary, &kyoskNew::Command7_Click);
    const Card facts = makeCard("well", Pad::Slim);
    facts.column->addLayout(
        inRow(Space::Small, {lineLabel(c.Label20Prompt, "muted"), lineLabel(c.Label20, "title"), Item::room(),
                             lineLabel(c.Label19Prompt, "muted"), lineLabel(c.Label19, "title"), Item::room()}));
    const Card coarse = makeCard("notice", Pad::Slim);
    coarse.column->addLayout(
        inRow(Space::Normal, {sign(u"warning"_s, IconSize::Line, Theme::Colour::Danger),
                              {label(c.coarseNote, "strong"), 1},
                              button(c.showCoarse, Role::Plain, &kyoskNew::showCoarse_Click, u"pictures"_s)}));
    follow(coarse.frame, c.coarseNote);
    m_closing = new Overlay(
        theme(), this,
        {inRow(Space::Normal, {{label(c.closingHead, "title"), 1}, prices}), facts.frame, coarse.frame,
         inRow(Space::Small, {lineLabel(c.Label4kpn3Prompt, "muted"), lineLabel(c.Label4kpn3, "strong"), Item::room()}),
         inRow(Space::Small, {label(c.Label17, "strong"), lineLabel(c.Label33, "muted"), m_addressWord, Item::room()}),
         // An address runs from left to right in both languages.
         leftToRight(inRow(Space::Small, {{m_mail, 3}, m_at, {m_domain, 2}, {m_albumMail, 5}})), Space::Tight,
         label(c.Text2Prompt, "strong"), m_note, label(c.LblKoopon, "smallMuted"), Space::Tight,
         inRow(Space::Normal, {m_backToPictures, Item::room(), m_withoutAddress,
                               button(c.Command8, Role::Main, &kyoskNew::Command8_Click)})});
    m_closing->setWidth(Overlay::Width::Full);
    m_closing->column()->setSpacing(theme().size(Space::Small));
    m_closing->setFirstFocus(m_mail);
    m_closing->whenEscaped(toPage(&kyoskNew::Command10_Click));
}

void kyoskNewView::makeBranchPanel() {
    QGridLayout* grid = inGrid(Space::Small);
    for (std::size_t i = 0; i < m_branchButtons.size(); ++i) {
        const int branch = static_cast<int>(i);
        m_branchButtons[i] = button(c.Command4Snif[i], Role::Plain, &kyoskNew::Command4Snif_Click, branch,
                                    branch == 10 ? u"truck"_s : u"shop"_s);
        m_branchButtons[i]->installEventFilter(this);
        grid->addWidget(m_branchButtons[i], branch / 2, branch % 2);
    }
    const Card card = makeCard("notice", Pad::Slim);
    bind(card.frame, c.Pic4Snif);
    add(*card.column, {label(c.Label41), Item::room()});
    m_branches = new Overlay(theme(), this,
                             {label(c.Pic4snifim, "title"),
                              inRow(Space::Wide, {{grid, 3}, {card.frame, 2}}),
                              {button(c.Command28, Role::Secondary, &kyoskNew::Command28_Click), 0, Qt::AlignLeading}});
    m_branches->setWidth(Overlay::Width::Full);
    m_branches->whenEscaped(toPage(&kyoskNew::Command28_Click));
    // The card beside the buttons follows the mouse and the keyboard alike.
    connect(qApp, &QApplication::focusChanged, this, [this](QWidget*, QWidget* now) { pointAtBranch(now); });
}

void kyoskNewView::pointAtBranch(const QObject* widget) {
    const auto at = std::find(m_branchButtons.begin(), m_branchButtons.end(), widget);
    if (at != m_branchButtons.end() && !isDetached())
        m_page.Command4Snif_MouseMove(static_cast<int>(at - m_branchButtons.begin()));
}

bool kyoskNewView::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::Enter || event->type() == QEvent::MouseButtonPress) // a finger only presses
        pointAtBranch(watched);
    return PageView::eventFilter(watched, event);
}

QWidget* kyoskNewView::firstFocus() const {
    return m_page.showsCells() ? static_cast<QWidget*>(m_cells[0]) : m_firstFolder;
}

void kyoskNewView::escape() {
    m_page.Image10_Click();
}

void kyoskNewView::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_PageDown && m_next->isEnabled() && m_next->isVisible())
        m_next->click();
    else if (event->key() == Qt::Key_PageUp && m_previous->isEnabled() && m_previous->isVisible())
        m_previous->click();
    else
        PageView::keyPressEvent(event);
}

void kyoskNewView::fitCells() {
    if (isDetached() || !isVisible())
        return;
    // A cell that was never shown has no true size yet.
    if (m_cells[0]->isVisible())
        m_page.setCellPixels(std::max(40, m_cells[0]->pictureSide()), m_large->longerSide());
}

void kyoskNewView::renderCells() {
    for (std::size_t i = 0; i < cellsOfPage; ++i) {
        const CellPicture& cell = c.Picture1[i];
        PictureCell::Look look;
        look.filled = !cell.text.isEmpty();
        look.picture = cell.visible ? cell.bitmap.image() : QImage();
        look.chosen = c.Picture4[i].visible;
        look.inEditor = m_page.openCell() == static_cast<int>(i);
        look.copies = c.Label4[i].text;
        look.name = cell.name;
        look.waiting = cell.waiting;
        look.unreadable = cell.unreadable;
        look.resolution = c.resolution[i];
        m_cells[i]->show(look);
        speak(m_cells[i], cell.spoken);
        speak(m_cells[i]->plus(), c.Command12[i].spoken);
        speak(m_cells[i]->minus(), c.Command13[i].spoken);
    }
}

void kyoskNewView::renderClosing() {
    speak(m_mail, c.Label17.text.simplified());
    speak(m_domain, c.Combo1.spoken);
    speak(m_albumMail, c.Label17.text.simplified());
    speak(m_note, c.Text2Prompt.text.simplified());
    using enum EditableCombo::Says;
    m_domain->display(c.Combo1Items, c.Combo1Index, c.Combo1.text, m_page.promptStands() ? Prompt : Choice);
    const AddressBox box = m_page.addressBox();
    m_at->setVisible(box == AddressBox::Mail);
    changeLook(m_addressWord, "type", m_page.addressTyped() ? u"good"_s : u"muted"_s);
    changeRole(m_withoutAddress, box == AddressBox::None ? "main" : "secondary");
    m_closing->setFirstFocus(box == AddressBox::Mail ? m_mail : box == AddressBox::AlbumMail ? m_albumMail : m_note);
    m_closing->setOpen(c.Frame4.visible);
}

void kyoskNewView::takeFocus() {
    if (m_focusRequest == m_page.focusRequest())
        return;
    m_focusRequest = m_page.focusRequest();
    if (auto* widget = findChild<QWidget*>(m_page.focusBox()))
        giveFocus(*widget);
}

void kyoskNewView::renderFolder() {
    const QString name = m_page.folderName();
    QString line;
    if (!name.isEmpty())
        line = fromLeft(m_folder->fontMetrics().elidedText(name, Qt::ElideMiddle, theme().size(Extent::WideField))) +
               u"  ·  "_s + c.pictureCount.text;
    m_folder->setText(line);
}

// One control, at the place that the body in view has for it.
void kyoskNewView::renderCard() {
    QBoxLayout* place = m_cardPlaces[m_page.showsCells() ? 1 : 0];
    if (place->isEmpty()) {
        place->addWidget(m_card, 0, m_page.showsCells() ? Qt::Alignment() : Qt::AlignCenter);
        m_card->setSize(m_page.showsCells() ? CardOffer::Size::Slim : CardOffer::Size::Large);
    }
    m_card->setNote(c.cardNote.text);
    speak(m_card, c.cardNote.text.isEmpty() ? c.cardOffer.text : c.cardOffer.text + u", "_s + c.cardNote.text);
}

bool kyoskNewView::leave() {
    m_page.Image10_Click();
    return true;
}

void kyoskNewView::render() {
    m_side->setLayoutDirection(layoutDirection());
    const int body = m_page.showsCells() ? 1 : 0;
    if (m_body->currentIndex() != body) {
        m_body->setCurrentIndex(body);
        QTimer::singleShot(0, this, &kyoskNewView::fitCells);
    }
    renderFolder();
    renderCard();
    renderCells();
    m_large->show(c.Picture2);
    if (m_about)
        m_about->setVisible(!c.Picture66.visible); // the offer leaves the picture no room for its words
    m_largeResolution->display(c.largeResolution);
    setDirectedIcon(m_previous, Way::Back);
    setDirectedIcon(m_next, Way::Forwards);
    m_next->setLayoutDirection(state().english() ? Qt::RightToLeft : Qt::LeftToRight);
    setDirectedIcon(m_backToPictures, Way::Back);
    for (QPushButton* answer : m_offerButtons)
        breakLong(*answer);
    m_copiesPicture->setPicture(c.copiesPicture.image());
    speak(m_copiesBack, c.copiesBack.hint);
    m_copies->setOpen(c.copiesPanel.visible);
    m_leave->setOpen(c.Frame3.visible);
    m_help->setOpen(c.Frame2.visible);
    if (c.Frame4.visible && !m_closing->isOpen())
        m_branches->setOpen(false); // comes in front again, with the keyboard
    renderClosing();
    // The panel opens on the first branch there is.
    for (std::size_t i = m_branchButtons.size(); i-- > 0;) {
        if (c.Command4Snif[i].visible)
            m_branches->setFirstFocus(m_branchButtons[i]);
    }
    m_branches->setOpen(c.Pic4snifim.visible);
    m_compression->setOpen(c.Picture7.visible);
    m_doorGauge->show(c.doorShare, c.doorCount.text, QString());
    m_door->setOpen(c.doorPanel.visible);
    takeFocus();
}

} // namespace lumora
