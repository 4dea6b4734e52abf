#include "views/kyoskNew/kyoskNewView.h"

#include "common/DrivePathText.h"
#include "views/kit/Cards.h"
#include "views/kit/EditableCombo.h"
#include "views/kit/Overlay.h"
#include "views/kyoskNew/LargePicture.h"
#include "views/kyoskNew/PictureCell.h"

#include <QApplication>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QScreen>
#include <QStackedLayout>
#include <QVBoxLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Four in a row, so that the large picture stands beside them.
constexpr int columns = 4;

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
    : ViewOf(page, state, theme)
    , m_shown(page.controls()) {
    frame().steps().setStep(OrderStep::Pictures);
    frame().setTitleVisible(false);
    frame().content()->setSpacing(theme.px(8));
    frame().content()->addLayout(makeTopRow());
    auto* body = new QWidget(this);
    m_body = new QStackedLayout(body);
    m_body->addWidget(makeEmpty());
    auto* pictures = new QWidget(body);
    // The small pictures stand on the left and run from left to right in both languages, as the page's texts say.
    pictures->setLayoutDirection(Qt::LeftToRight);
    auto* row = new QHBoxLayout(pictures);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(theme.px(20));
    row->addWidget(makeGrid(), 2);
    m_side = makeSide();
    row->addWidget(m_side, 1);
    m_body->addWidget(pictures);
    frame().content()->addWidget(body, 1);
    makeBars();
    makeLeavePanel();
    makeHelpPanel();
    makeClosingPanel();
    makeBranchPanel();
    makeCompressionPanel();
    m_focusRequest = page.focusRequest();
    start();
}

QLayout* kyoskNewView::makeTopRow() {
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().px(10));
    auto* words = new QVBoxLayout;
    words->setSpacing(0);
    words->addWidget(label(m_shown.Title, "large"));
    m_folder = makeLabel(this, "smallMuted");
    m_folder->setWordWrap(false);
    bindName(m_folder, m_shown.Label29);
    words->addWidget(m_folder);
    row->addLayout(words, 1);
    row->addWidget(button(m_shown.Command14, Role::Plain, &kyoskNew::Command14_Click, u"check-circle"_s));
    m_previous = button(m_shown.Image15, Role::Plain, &kyoskNew::Image15_Click);
    m_next = button(m_shown.Image16, Role::Plain, &kyoskNew::Image16_Click);
    row->addWidget(m_previous);
    row->addWidget(m_next);
    return row;
}

QWidget* kyoskNewView::makeGrid() {
    auto* box = new QWidget(this);
    auto* grid = new QGridLayout(box);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setSpacing(theme().px(10));
    bindName(box, m_shown.Frame1);
    for (int i = 0; i < static_cast<int>(cellsOfPage); ++i) {
        const auto at = static_cast<std::size_t>(i);
        auto* cell = new PictureCell(theme(), box);
        m_cells[at] = cell;
        connect(cell, &QAbstractButton::clicked, this, [this, i] { m_page.Picture1_Click(i); });
        if (i == 0)
            connect(cell, &PictureCell::resized, this,
                    [this] { QTimer::singleShot(0, this, &kyoskNewView::fitCells); });
        connect(cell->plus(), &QPushButton::clicked, this, [this, i] { m_page.Command12_Click(i); });
        connect(cell->minus(), &QPushButton::clicked, this, [this, i] { m_page.Command13_Click(i); });
        connect(cell, &PictureCell::arrow, this, [this, i](int across, int down) {
            const int column = i % columns + across;
            const int next = i + across + down * columns;
            if (column < 0 || column >= columns || next < 0 || next >= static_cast<int>(cellsOfPage))
                return;
            m_cells[static_cast<std::size_t>(next)]->setFocus(Qt::TabFocusReason);
        });
        bindName(cell, m_shown.Picture1[at]);
        bindName(cell->mark(), m_shown.Picture4[at]);
        bindName(cell->copies(), m_shown.Label4[at]);
        bindName(cell->plus(), m_shown.Command12[at]);
        bindName(cell->minus(), m_shown.Command13[at]);
        grid->addWidget(cell, i / columns, i % columns);
    }
    for (int i = 0; i < columns; ++i)
        grid->setColumnStretch(i, 1);
    return box;
}

QWidget* kyoskNewView::makeEmpty() {
    auto* box = new QFrame(this);
    setRole(box, "well");
    auto* column = new QVBoxLayout(box);
    column->setSpacing(theme().px(16));
    column->addStretch(1);
    auto* sign = new QLabel(box);
    sign->setPixmap(theme().icon(u"pictures"_s, theme().px(96), Theme::Colour::Primary));
    sign->setAlignment(Qt::AlignCenter);
    column->addWidget(sign);
    for (QLabel* words : {label(m_shown.emptyHead, "title"), label(m_shown.Label25)}) {
        words->setAlignment(Qt::AlignCenter);
        column->addWidget(words);
    }
    m_firstFolder = button(m_shown.firstFolder, Role::Main, &kyoskNew::Image5_Click, u"folder-plus"_s);
    column->addWidget(m_firstFolder, 0, Qt::AlignCenter);
    column->addStretch(1);
    return box;
}

QWidget* kyoskNewView::makeSide() {
    auto* box = new QWidget(this);
    auto* column = new QVBoxLayout(box);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(theme().px(10));
    auto* card = new QFrame(box);
    setRole(card, "card");
    auto* inside = new QVBoxLayout(card);
    inside->setContentsMargins(theme().px(14), theme().px(14), theme().px(14), theme().px(10));
    inside->setSpacing(theme().px(6));
    m_large = new LargePicture(theme(), card);
    bindName(m_large, m_shown.Picture2);
    connect(m_large, &LargePicture::clicked, &m_page, &kyoskNew::Picture2_Click);
    inside->addWidget(m_large, 1);
    auto* grade = label(m_shown.Label6, "strong");
    grade->setAlignment(Qt::AlignCenter);
    inside->addWidget(grade);
    inside->addWidget(button(m_shown.Image4, Role::Plain, &kyoskNew::Image4_Click, u"rotate"_s), 0, Qt::AlignCenter);
    column->addWidget(card, 1);

    auto* offerCard = new QFrame(box);
    setRole(offerCard, "notice");
    auto* offer = new QVBoxLayout(offerCard);
    offer->setContentsMargins(theme().px(14), theme().px(10), theme().px(14), theme().px(12));
    offer->setSpacing(theme().px(6));
    auto* offerText = label(m_shown.Label35, "strong");
    offerText->setAlignment(Qt::AlignCenter);
    offer->addWidget(offerText);
    m_offerButtons = {
        button(m_shown.Command24, Role::Plain, &kyoskNew::Command24_Click),
        button(m_shown.Command25, Role::Plain, &kyoskNew::Command25_Click),
        button(m_shown.Command23, Role::Quiet, &kyoskNew::Command23_Click),
    };
    for (QPushButton* answer : m_offerButtons) {
        setRole(answer, "tall");
        offer->addWidget(answer);
    }
    bind(offerCard, m_shown.Picture66);
    column->addWidget(offerCard);
    column->addWidget(button(m_shown.Image33, Role::Plain, &kyoskNew::Image33_Click, u"shop"_s));
    return box;
}

void kyoskNewView::makeBars() {
    frame().addHeaderAction(button(m_shown.Image11, Role::Quiet, &kyoskNew::Image11_Click, u"tag"_s));
    frame().addHeaderAction(button(m_shown.Image6, Role::Quiet, &kyoskNew::Image6_Click, u"info"_s));
    frame().addHeaderAction(button(m_shown.Image10, Role::Quiet, &kyoskNew::Image10_Click, u"exit"_s));
    frame().addSecondaryAction(button(m_shown.Image5, Role::Secondary, &kyoskNew::Image5_Click, u"folder-plus"_s));
    frame().addSecondaryAction(button(m_shown.Image8, Role::Quiet, &kyoskNew::Image8_Click, u"eraser"_s));

    auto* total = new QFrame(this);
    auto* row = new QHBoxLayout(total);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(theme().px(10));
    row->addWidget(lineLabel(m_shown.Label7Prompt));
    row->addWidget(lineLabel(m_shown.Label7, "title"));
    row->addSpacing(theme().px(14));
    row->addWidget(lineLabel(m_shown.Label15, "muted"));
    frame().addStatus(total);

    frame().addMainAction(button(m_shown.Image13, Role::Main, &kyoskNew::Image13_Click));
    frame().addMainAction(button(m_shown.Image7, Role::Main, &kyoskNew::Image7_Click));
}

void kyoskNewView::addAnswers(Overlay& panel, QPushButton* other, QPushButton* first) {
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().gap());
    row->addWidget(other);
    row->addStretch(1);
    row->addWidget(first);
    panel.column()->addLayout(row);
    panel.setFirstFocus(first);
}

void kyoskNewView::makeLeavePanel() {
    m_leave = new Overlay(theme(), this);
    m_leave->column()->addWidget(label(m_shown.Label11, "large"));
    auto* leave = button(m_shown.Command15, Role::Danger, &kyoskNew::Command15_Click, u"exit"_s);
    addAnswers(*m_leave, leave, button(m_shown.Command4, Role::Main, &kyoskNew::Command4_Click));
    connect(m_leave, &Overlay::escaped, &m_page, &kyoskNew::Command4_Click);
}

void kyoskNewView::makeHelpPanel() {
    m_help = new Overlay(theme(), this);
    m_help->setCardWidth(700);
    m_help->column()->addWidget(label(m_shown.Label9));
    auto* close = button(m_shown.helpClose, Role::Main, &kyoskNew::Image6_Click);
    m_help->column()->addWidget(close, 0, Qt::AlignTrailing);
    m_help->setFirstFocus(close);
    connect(m_help, &Overlay::escaped, &m_page, &kyoskNew::Image6_Click);
}

void kyoskNewView::makeClosingPanel() {
    m_closing = new Overlay(theme(), this);
    m_closing->setCardWidth(920);
    auto* column = m_closing->column();
    column->setSpacing(theme().px(8));
    auto* top = new QHBoxLayout;
    top->setSpacing(theme().px(12));
    top->addWidget(label(m_shown.closingHead, "title"), 1);
    top->addWidget(button(m_shown.Image17, Role::Quiet, &kyoskNew::Image17_Click, u"tag"_s));
    column->addLayout(top);

    auto* facts = new QFrame(m_closing);
    setRole(facts, "well");
    auto* factRow = new QHBoxLayout(facts);
    factRow->setContentsMargins(theme().px(18), theme().px(8), theme().px(18), theme().px(8));
    const auto fact = [&](const Caption& prompt, const Caption& value) {
        factRow->addWidget(lineLabel(prompt, "muted"));
        factRow->addWidget(lineLabel(value, "title"));
        factRow->addStretch(1);
    };
    fact(m_shown.Label20Prompt, m_shown.Label20);
    fact(m_shown.Label19Prompt, m_shown.Label19);
    column->addWidget(facts);
    auto* coupon = new QHBoxLayout;
    coupon->setSpacing(theme().px(8));
    coupon->addWidget(lineLabel(m_shown.Label4kpn3Prompt, "muted"));
    coupon->addWidget(lineLabel(m_shown.Label4kpn3, "strong"));
    coupon->addStretch(1);
    column->addLayout(coupon);

    auto* mailLine = new QHBoxLayout;
    mailLine->addWidget(label(m_shown.Label17, "strong"));
    mailLine->addWidget(lineLabel(m_shown.Label33, "danger"));
    mailLine->addStretch(1);
    column->addLayout(mailLine);
    // An address runs from left to right in both languages.
    auto* address = new QWidget(m_closing);
    address->setLayoutDirection(Qt::LeftToRight);
    auto* addressRow = new QHBoxLayout(address);
    addressRow->setContentsMargins(0, 0, 0, 0);
    addressRow->setSpacing(theme().px(8));
    m_mail = field(m_shown.Text1, [this](const QString& text) { m_page.Text1_Change(text); });
    m_mail->setInputMethodHints(Qt::ImhEmailCharactersOnly);
    addressRow->addWidget(m_mail, 3);
    m_at = makeLabel(address, "large");
    m_at->setText(u"@"_s);
    addressRow->addWidget(m_at);
    m_domain = new EditableCombo(
        address, [this](int row) { m_page.Combo1_Click(row); },
        [this](const QString& text) { m_page.Combo1_Change(text); });
    bind(m_domain, m_shown.Combo1);
    addressRow->addWidget(m_domain, 2);
    m_albumMail = field(m_shown.Txt4Ml2, [this](const QString& text) { m_page.Txt4Ml2_Change(text); });
    addressRow->addWidget(m_albumMail, 5);
    column->addWidget(address);

    column->addSpacing(theme().px(6));
    column->addWidget(label(m_shown.Text2Prompt, "strong"));
    m_note = field(m_shown.Text2, [this](const QString& text) { m_page.Text2_Change(text); });
    column->addWidget(m_note);
    column->addWidget(label(m_shown.LblKoopon, "smallMuted"));
    column->addSpacing(theme().px(6));

    auto* row = new QHBoxLayout;
    row->setSpacing(theme().gap());
    m_backToPictures = button(m_shown.Command10, Role::Secondary, &kyoskNew::Command10_Click);
    row->addWidget(m_backToPictures);
    row->addStretch(1);
    m_withoutAddress = button(m_shown.Command7, Role::Secondary, &kyoskNew::Command7_Click);
    row->addWidget(m_withoutAddress);
    row->addWidget(button(m_shown.Command8, Role::Main, &kyoskNew::Command8_Click));
    column->addLayout(row);
    m_closing->setFirstFocus(m_mail);
    connect(m_closing, &Overlay::escaped, &m_page, &kyoskNew::Command10_Click);
}

void kyoskNewView::makeBranchPanel() {
    m_branches = new Overlay(theme(), this);
    m_branches->setCardWidth(820);
    m_branches->column()->addWidget(label(m_shown.Pic4snifim, "title"));
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().px(20));
    auto* grid = new QGridLayout;
    grid->setSpacing(theme().px(8));
    for (std::size_t i = 0; i < m_branchButtons.size(); ++i) {
        const int branch = static_cast<int>(i);
        auto* made = button(m_shown.Command4Snif[i], Role::Plain, &kyoskNew::Command4Snif_Click, branch,
                            branch == 10 ? u"truck"_s : u"shop"_s);
        m_branchButtons[i] = made;
        grid->addWidget(made, branch / 2, branch % 2);
    }
    row->addLayout(grid, 3);
    auto* card = new QFrame(m_branches);
    setRole(card, "notice");
    auto* cardColumn = new QVBoxLayout(card);
    cardColumn->addWidget(label(m_shown.Label41));
    cardColumn->addStretch(1);
    bind(card, m_shown.Pic4Snif);
    row->addWidget(card, 2);
    m_branches->column()->addLayout(row);
    m_branches->column()->addWidget(button(m_shown.Command28, Role::Secondary, &kyoskNew::Command28_Click), 0,
                                    Qt::AlignLeading);
    connect(m_branches, &Overlay::escaped, &m_page, &kyoskNew::Command28_Click);
    // The card beside the buttons follows the mouse and the keyboard alike.
    connect(qApp, &QApplication::focusChanged, this, [this](QWidget*, QWidget* now) {
        for (std::size_t i = 0; i < m_branchButtons.size(); ++i) {
            if (!isDetached() && now && now == m_branchButtons[i])
                m_page.Command4Snif_MouseMove(static_cast<int>(i));
        }
    });
    for (QPushButton* made : m_branchButtons)
        made->installEventFilter(this);
}

bool kyoskNewView::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::Enter || event->type() == QEvent::MouseButtonPress) { // a finger only presses
        for (std::size_t i = 0; i < m_branchButtons.size(); ++i) {
            if (watched == m_branchButtons[i] && !isDetached())
                m_page.Command4Snif_MouseMove(static_cast<int>(i));
        }
    }
    return PageView::eventFilter(watched, event);
}

void kyoskNewView::makeCompressionPanel() {
    m_compression = new Overlay(theme(), this);
    m_compression->column()->addWidget(label(m_shown.Label37, "large"));
    auto* no = button(m_shown.Command20, Role::Secondary, &kyoskNew::Command20_Click);
    addAnswers(*m_compression, no, button(m_shown.Command21, Role::Main, &kyoskNew::Command21_Click));
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
    m_page.setScreenHeight(screen()->size().height());
    // A cell that was never shown has no true size yet.
    if (m_cells[0]->isVisible())
        m_page.setCellPixels(std::max(40, m_cells[0]->pictureSide()));
}

void kyoskNewView::renderCells() {
    for (std::size_t i = 0; i < cellsOfPage; ++i) {
        const CellPicture& cell = m_shown.Picture1[i];
        PictureCell::Look look;
        look.filled = !cell.text.isEmpty();
        look.picture = cell.visible ? cell.bitmap.image() : QImage();
        look.chosen = m_shown.Picture4[i].visible;
        look.inEditor = m_page.openCell() == static_cast<int>(i);
        look.copies = m_shown.Label4[i].text;
        look.name = LeafName(cell.text);
        m_cells[i]->show(look);
        speak(m_cells[i], cell.spoken);
        speak(m_cells[i]->plus(), m_shown.Command12[i].spoken);
        speak(m_cells[i]->minus(), m_shown.Command13[i].spoken);
    }
}

void kyoskNewView::renderClosing() {
    speak(m_mail, m_shown.Label17.text.simplified());
    speak(m_domain, m_shown.Combo1.spoken);
    speak(m_albumMail, m_shown.Label17.text.simplified());
    speak(m_note, m_shown.Text2Prompt.text.simplified());
    m_domain->display(m_shown.Combo1Items, m_shown.Combo1Index, m_shown.Combo1.text);
    const AddressBox box = m_page.addressBox();
    m_at->setVisible(box == AddressBox::Mail);
    changeRole(m_withoutAddress, box == AddressBox::None ? "main" : "secondary");
    m_closing->setFirstFocus(box == AddressBox::Mail ? m_mail : box == AddressBox::AlbumMail ? m_albumMail : m_note);
    m_closing->setOpen(m_shown.Frame4.visible);
}

void kyoskNewView::takeFocus() {
    if (m_focusRequest == m_page.focusRequest())
        return;
    m_focusRequest = m_page.focusRequest();
    if (auto* widget = findChild<QWidget*>(m_page.focusBox()))
        giveFocus(*widget);
}

void kyoskNewView::renderFolder() {
    const QString folder = m_shown.Label29.text.trimmed();
    QString line;
    if (!folder.isEmpty())
        line = fromLeft(m_folder->fontMetrics().elidedText(folder, Qt::ElideMiddle, theme().px(200))) + u"  ·  "_s +
               m_shown.pictureCount.text;
    m_folder->setText(line);
}

void kyoskNewView::render() {
    m_side->setLayoutDirection(layoutDirection());
    const int body = m_page.showsCells() ? 1 : 0;
    if (m_body->currentIndex() != body) {
        m_body->setCurrentIndex(body);
        QTimer::singleShot(0, this, &kyoskNewView::fitCells);
    }
    renderFolder();
    renderCells();
    m_large->show(m_shown.Picture2);
    setDirectedIcon(m_previous, Way::Back);
    setDirectedIcon(m_next, Way::Forwards);
    m_next->setLayoutDirection(state().english() ? Qt::RightToLeft : Qt::LeftToRight);
    setDirectedIcon(m_backToPictures, Way::Back);
    for (QPushButton* answer : m_offerButtons)
        breakLong(*answer);
    m_leave->setOpen(m_shown.Frame3.visible);
    m_help->setOpen(m_shown.Frame2.visible);
    renderClosing();
    // The panel opens on the first branch there is.
    for (std::size_t i = m_branchButtons.size(); i-- > 0;) {
        if (m_shown.Command4Snif[i].visible)
            m_branches->setFirstFocus(m_branchButtons[i]);
    }
    m_branches->setOpen(m_shown.Pic4snifim.visible);
    m_compression->setOpen(m_shown.Picture7.visible);
    takeFocus();
}

} // namespace lumora
