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
    : PageView(page, state, theme)
    , m_page(page) {
    frame().steps().setStep(OrderStep::Pictures);
    frame().setTitleVisible(false);
    frame().content()->setSpacing(theme.px(8));
    frame().content()->addLayout(makeTopRow());
    auto* body = new QWidget(this);
    m_body = new QStackedLayout(body);
    m_body->addWidget(makeEmpty());
    auto* pictures = new QWidget(body);
    // The small pictures stand on the left in both languages, and run from left to right: so the page's texts say.
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
    bindTheRest();
    m_focusRequest = page.focusRequest;
    start();
}

QLayout* kyoskNewView::makeTopRow() {
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().px(10));
    auto* words = new QVBoxLayout;
    words->setSpacing(0);
    words->addWidget(label(u"Title"_s, m_page.Title, "large"));
    m_folder = makeLabel(this, "smallMuted");
    m_folder->setWordWrap(false);
    bind(u"Label29"_s, m_folder, [this] { return m_page.Label29.text; });
    words->addWidget(m_folder);
    row->addLayout(words, 1);
    row->addWidget(button(
        u"Command14"_s, m_page.Command14, Role::Plain, [this] { m_page.Command14_Click(); }, u"check-circle"_s));
    m_previous = button(u"Image15"_s, m_page.Image15, Role::Plain, [this] { m_page.Image15_Click(); });
    m_next = button(u"Image16"_s, m_page.Image16, Role::Plain, [this] { m_page.Image16_Click(); });
    row->addWidget(m_previous);
    row->addWidget(m_next);
    return row;
}

QWidget* kyoskNewView::makeGrid() {
    auto* box = new QWidget(this);
    auto* grid = new QGridLayout(box);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setSpacing(theme().px(10));
    bind(u"Frame1"_s, box, [this] { return m_page.Frame1.text; });
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
        const auto numbered = [i](const char* name) { return u"%1(%2)"_s.arg(QLatin1StringView(name)).arg(i); };
        bind(numbered("Picture1"), cell, [this, at] { return m_page.List2.item(static_cast<int>(at)); });
        bind(numbered("Picture4"), cell->mark(), [this, at] { return m_page.Picture4[at].text; });
        bind(numbered("Label4"), cell->copies(), [this, at] { return m_page.Label4[at].text; });
        bind(numbered("Command12"), cell->plus(), [this, at] { return m_page.Command12[at].text; });
        bind(numbered("Command13"), cell->minus(), [this, at] { return m_page.Command13[at].text; });
        bindHidden(numbered("Label5"), m_page.Label5[at]);
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
    m_emptyHead = makeLabel(box, "title");
    m_emptyHead->setAlignment(Qt::AlignCenter);
    column->addWidget(m_emptyHead);
    m_emptyText = makeLabel(box, "body");
    m_emptyText->setAlignment(Qt::AlignCenter);
    bind(u"Label25"_s, m_emptyText, [this] { return m_page.Label25.text; });
    column->addWidget(m_emptyText);
    m_firstFolder = new QPushButton(box);
    setRole(m_firstFolder, "main");
    m_firstFolder->setObjectName(u"firstFolder"_s);
    m_firstFolder->setFocusPolicy(Qt::TabFocus);
    setIcon(m_firstFolder, u"folder-plus"_s, Qt::white);
    connect(m_firstFolder, &QPushButton::clicked, this, [this] { m_page.Image5_Click(); });
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
    bind(u"Picture2"_s, m_large, [this] { return m_page.Picture2.guide.join(u'\n'); });
    connect(m_large, &LargePicture::clicked, &m_page, &kyoskNew::Picture2_Click);
    inside->addWidget(m_large, 1);
    auto* grade = label(u"Label6"_s, m_page.Label6, "strong");
    grade->setAlignment(Qt::AlignCenter);
    inside->addWidget(grade);
    m_turn = button(
        u"Image4"_s, m_page.Image4, Role::Plain, [this] { m_page.Image4_Click(); }, u"rotate"_s);
    inside->addWidget(m_turn, 0, Qt::AlignCenter);
    column->addWidget(card, 1);

    m_offer = new QFrame(box);
    setRole(m_offer, "notice");
    auto* offer = new QVBoxLayout(m_offer);
    offer->setContentsMargins(theme().px(14), theme().px(10), theme().px(14), theme().px(12));
    offer->setSpacing(theme().px(6));
    auto* offerText = label(u"Label35"_s, m_page.Label35, "strong");
    offerText->setAlignment(Qt::AlignCenter);
    offer->addWidget(offerText);
    offer->addWidget(button(u"Command24"_s, m_page.Command24, Role::Plain, [this] { m_page.Command24_Click(); }));
    offer->addWidget(button(u"Command25"_s, m_page.Command25, Role::Plain, [this] { m_page.Command25_Click(); }));
    offer->addWidget(button(u"Command23"_s, m_page.Command23, Role::Quiet, [this] { m_page.Command23_Click(); }));
    for (const char* name : {"Command24", "Command25", "Command23"})
        setRole(m_offer->findChild<QWidget*>(QString::fromLatin1(name)), "tall");
    bind(u"Picture66"_s, m_offer, m_page.Picture66);
    column->addWidget(m_offer);
    column->addWidget(button(
        u"Image33"_s, m_page.Image33, Role::Plain, [this] { m_page.Image33_Click(); }, u"shop"_s));
    return box;
}

void kyoskNewView::makeBars() {
    frame().addHeaderAction(button(
        u"Image11"_s, m_page.Image11, Role::Quiet, [this] { m_page.Image11_Click(); }, u"tag"_s));
    frame().addHeaderAction(button(
        u"Image6"_s, m_page.Image6, Role::Quiet, [this] { m_page.Image6_Click(); }, u"info"_s));
    frame().addHeaderAction(button(
        u"Image10"_s, m_page.Image10, Role::Quiet, [this] { m_page.Image10_Click(); }, u"exit"_s));
    frame().addSecondaryAction(button(
        u"Image5"_s, m_page.Image5, Role::Secondary, [this] { m_page.Image5_Click(); }, u"folder-plus"_s));
    frame().addSecondaryAction(button(
        u"Image8"_s, m_page.Image8, Role::Quiet, [this] { m_page.Image8_Click(); }, u"eraser"_s));

    m_total = new QFrame(this);
    auto* total = new QHBoxLayout(m_total);
    total->setContentsMargins(0, 0, 0, 0);
    total->setSpacing(theme().px(10));
    m_totalWord = label(u"Label7Prompt"_s, m_page.Label7Prompt, "body");
    m_totalWord->setWordWrap(false);
    total->addWidget(m_totalWord);
    m_totalNumber = label(u"Label7"_s, m_page.Label7, "title");
    m_totalNumber->setWordWrap(false);
    total->addWidget(m_totalNumber);
    total->addSpacing(theme().px(14));
    auto* paper = label(u"Label15"_s, m_page.Label15, "muted");
    paper->setWordWrap(false);
    total->addWidget(paper);
    frame().addStatus(m_total);

    m_finish = button(u"Image7"_s, m_page.Image7, Role::Main, [this] { m_page.Image7_Click(); });
    m_finishAlbum = button(u"Image13"_s, m_page.Image13, Role::Main, [this] { m_page.Image13_Click(); });
    frame().addMainAction(m_finishAlbum);
    frame().addMainAction(m_finish);
}

void kyoskNewView::makeLeavePanel() {
    m_leave = new Overlay(theme(), this);
    m_leave->column()->addWidget(label(u"Label11"_s, m_page.Label11, "large"));
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().gap());
    row->addWidget(button(
        u"Command15"_s, m_page.Command15, Role::Danger, [this] { m_page.Command15_Click(); }, u"exit"_s));
    row->addStretch(1);
    auto* stay = button(u"Command4"_s, m_page.Command4, Role::Main, [this] { m_page.Command4_Click(); });
    row->addWidget(stay);
    m_leave->column()->addLayout(row);
    m_leave->setFirstFocus(stay);
    connect(m_leave, &Overlay::escaped, this, [this] { m_page.Command4_Click(); });
}

void kyoskNewView::makeHelpPanel() {
    m_help = new Overlay(theme(), this);
    m_help->setCardWidth(700);
    m_help->column()->addWidget(label(u"Label9"_s, m_page.Label9));
    m_helpClose = new QPushButton(m_help);
    setRole(m_helpClose, "main");
    m_helpClose->setObjectName(u"helpClose"_s);
    m_helpClose->setFocusPolicy(Qt::TabFocus);
    connect(m_helpClose, &QPushButton::clicked, this, [this] { m_page.Image6_Click(); });
    m_help->column()->addWidget(m_helpClose, 0, Qt::AlignTrailing);
    m_help->setFirstFocus(m_helpClose);
    connect(m_help, &Overlay::escaped, this, [this] { m_page.Image6_Click(); });
}

void kyoskNewView::makeClosingPanel() {
    m_closing = new Overlay(theme(), this);
    m_closing->setCardWidth(920);
    auto* column = m_closing->column();
    column->setSpacing(theme().px(8));
    auto* top = new QHBoxLayout;
    top->setSpacing(theme().px(12));
    m_closingHead = makeLabel(m_closing, "title");
    top->addWidget(m_closingHead, 1);
    top->addWidget(button(
        u"Image17"_s, m_page.Image17, Role::Quiet, [this] { m_page.Image17_Click(); }, u"tag"_s));
    column->addLayout(top);

    auto* facts = new QFrame(m_closing);
    setRole(facts, "well");
    auto* factRow = new QHBoxLayout(facts);
    factRow->setContentsMargins(theme().px(18), theme().px(8), theme().px(18), theme().px(8));
    const auto fact = [&](const QString& promptName, const Caption& prompt, const QString& name, const Caption& value) {
        auto* promptLabel = label(promptName, prompt, "muted");
        auto* valueLabel = label(name, value, "title");
        promptLabel->setWordWrap(false);
        valueLabel->setWordWrap(false);
        factRow->addWidget(promptLabel);
        factRow->addWidget(valueLabel);
        factRow->addStretch(1);
    };
    fact(u"Label20Prompt"_s, m_page.Label20Prompt, u"Label20"_s, m_page.Label20);
    fact(u"Label19Prompt"_s, m_page.Label19Prompt, u"Label19"_s, m_page.Label19);
    column->addWidget(facts);
    auto* coupon = new QHBoxLayout;
    coupon->setSpacing(theme().px(8));
    for (QLabel* part : {label(u"Label4kpn3Prompt"_s, m_page.Label4kpn3Prompt, "muted"),
                         label(u"Label4kpn3"_s, m_page.Label4kpn3, "strong")}) {
        part->setWordWrap(false);
        coupon->addWidget(part);
    }
    coupon->addStretch(1);
    column->addLayout(coupon);

    auto* mailLine = new QHBoxLayout;
    mailLine->addWidget(label(u"Label17"_s, m_page.Label17, "strong"));
    auto* required = label(u"Label33"_s, m_page.Label33, "danger");
    required->setWordWrap(false);
    mailLine->addWidget(required);
    mailLine->addStretch(1);
    column->addLayout(mailLine);
    // An address runs from left to right in both languages.
    auto* address = new QWidget(m_closing);
    address->setLayoutDirection(Qt::LeftToRight);
    auto* addressRow = new QHBoxLayout(address);
    addressRow->setContentsMargins(0, 0, 0, 0);
    addressRow->setSpacing(theme().px(8));
    m_mail = field(u"Text1"_s, m_page.Text1, [this](const QString& text) { m_page.Text1_Change(text); });
    m_mail->setInputMethodHints(Qt::ImhEmailCharactersOnly);
    addressRow->addWidget(m_mail, 3);
    m_at = makeLabel(address, "large");
    m_at->setText(u"@"_s);
    addressRow->addWidget(m_at);
    m_domain = new EditableCombo(
        address, [this](int row) { m_page.Combo1_Click(row); },
        [this](const QString& text) { m_page.Combo1_Change(text); });
    bind(u"Combo1"_s, m_domain, m_page.Combo1);
    addressRow->addWidget(m_domain, 2);
    m_albumMail = field(u"Txt4Ml2"_s, m_page.Txt4Ml2, [this](const QString& text) { m_page.Txt4Ml2_Change(text); });
    addressRow->addWidget(m_albumMail, 5);
    column->addWidget(address);

    column->addSpacing(theme().px(6));
    column->addWidget(label(u"Text2Prompt"_s, m_page.Text2Prompt, "strong"));
    m_note = field(u"Text2"_s, m_page.Text2, [this](const QString& text) { m_page.Text2_Change(text); });
    column->addWidget(m_note);
    column->addWidget(label(u"LblKoopon"_s, m_page.LblKoopon, "smallMuted"));
    column->addSpacing(theme().px(6));

    auto* row = new QHBoxLayout;
    row->setSpacing(theme().gap());
    m_backToPictures = button(u"Command10"_s, m_page.Command10, Role::Secondary, [this] { m_page.Command10_Click(); });
    row->addWidget(m_backToPictures);
    row->addStretch(1);
    m_withoutAddress = button(u"Command7"_s, m_page.Command7, Role::Secondary, [this] { m_page.Command7_Click(); });
    row->addWidget(m_withoutAddress);
    m_withAddress = button(u"Command8"_s, m_page.Command8, Role::Main, [this] { m_page.Command8_Click(); });
    row->addWidget(m_withAddress);
    column->addLayout(row);
    m_closing->setFirstFocus(m_mail);
    connect(m_closing, &Overlay::escaped, this, [this] { m_page.Command10_Click(); });
}

void kyoskNewView::makeBranchPanel() {
    m_branches = new Overlay(theme(), this);
    m_branches->setCardWidth(820);
    m_branchHead = label(u"Pic4snifim"_s, m_page.Pic4snifim, "title");
    m_branches->column()->addWidget(m_branchHead);
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().px(20));
    auto* grid = new QGridLayout;
    grid->setSpacing(theme().px(8));
    for (std::size_t i = 0; i < m_branchButtons.size(); ++i) {
        const int branch = static_cast<int>(i);
        auto* made = button(
            u"Command4Snif(%1)"_s.arg(i), m_page.Command4Snif[i], Role::Plain,
            [this, branch] { m_page.Command4Snif_Click(branch); }, branch == 10 ? u"truck"_s : u"shop"_s);
        m_branchButtons[i] = made;
        grid->addWidget(made, branch / 2, branch % 2);
    }
    row->addLayout(grid, 3);
    auto* card = new QFrame(m_branches);
    setRole(card, "notice");
    auto* cardColumn = new QVBoxLayout(card);
    cardColumn->addWidget(label(u"Label41"_s, m_page.Label41));
    cardColumn->addStretch(1);
    bind(u"Pic4Snif"_s, card, m_page.Pic4Snif);
    row->addWidget(card, 2);
    m_branches->column()->addLayout(row);
    m_branches->column()->addWidget(
        button(u"Command28"_s, m_page.Command28, Role::Secondary, [this] { m_page.Command28_Click(); }), 0,
        Qt::AlignLeading);
    connect(m_branches, &Overlay::escaped, this, [this] { m_page.Command28_Click(); });
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
    m_compression->column()->addWidget(label(u"Label37"_s, m_page.Label37, "large"));
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().gap());
    row->addWidget(button(u"Command20"_s, m_page.Command20, Role::Secondary, [this] { m_page.Command20_Click(); }));
    row->addStretch(1);
    auto* yes = button(u"Command21"_s, m_page.Command21, Role::Main, [this] { m_page.Command21_Click(); });
    row->addWidget(yes);
    m_compression->column()->addLayout(row);
    m_compression->setFirstFocus(yes);
}

void kyoskNewView::bindTheRest() {
    const std::pair<const char*, const Caption*> captions[] = {{"Label1", &m_page.Label1},
                                                               {"Label2", &m_page.Label2},
                                                               {"Label18", &m_page.Label18},
                                                               {"Label24", &m_page.Label24},
                                                               {"Label34", &m_page.Label34},
                                                               {"Label34Prompt", &m_page.Label34Prompt},
                                                               {"Label36", &m_page.Label36},
                                                               {"Frame2", &m_page.Frame2},
                                                               {"Frame3", &m_page.Frame3},
                                                               {"Frame4", &m_page.Frame4},
                                                               {"Picture7", &m_page.Picture7},
                                                               {"PicB4Sioom", &m_page.PicB4Sioom},
                                                               {"Pic4Brose", &m_page.Pic4Brose},
                                                               {"Command11", &m_page.Command11},
                                                               {"Image19", &m_page.Image19},
                                                               {"Image20", &m_page.Image20},
                                                               {"Image23", &m_page.Image23},
                                                               {"Command26(0)", &m_page.Command26[0]},
                                                               {"Command26(1)", &m_page.Command26[1]}};
    for (const auto& [name, caption] : captions)
        bindHidden(QString::fromLatin1(name), *caption);
    bindList(u"List1"_s, m_page.List1.lines());
    bindList(u"List2"_s, m_page.List2);
    bindList(u"List4"_s, m_page.List4.paths());
}

QWidget* kyoskNewView::firstFocus() const {
    return m_page.List4.isEmpty() ? static_cast<QWidget*>(m_firstFolder) : m_cells[0];
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
        const QString path = m_page.List2.item(static_cast<int>(i));
        PictureCell::Look look;
        look.filled = !path.isEmpty();
        look.picture = m_page.Picture1[i].visible ? m_page.Picture1[i].bitmap.image() : QImage();
        look.chosen = look.filled && m_page.Picture4[i].visible;
        look.inEditor = m_page.Command13[i].colour == kyoskNew::KeyColour::Orange;
        look.copies = m_page.Label4[i].text;
        look.name = LeafName(path);
        m_cells[i]->show(look);
        speak(
            m_cells[i],
            !look.filled ? wording(u"תא ריק"_s, u"Empty place"_s)
            : look.chosen
                ? wording(u"%1, נבחרה, עותקים: %2"_s, u"%1, chosen, copies: %2"_s).arg(look.name, look.copies.trimmed())
            : m_page.plain() ? wording(u"%1, לחץ לבחירה"_s, u"%1, press to choose"_s).arg(look.name)
                             : wording(u"%1, לחץ לעריכה"_s, u"%1, press to edit"_s).arg(look.name));
        speak(m_cells[i]->plus(), wording(u"עותק נוסף של %1"_s, u"One more copy of %1"_s).arg(look.name));
        speak(m_cells[i]->minus(), wording(u"עותק אחד פחות של %1"_s, u"One copy less of %1"_s).arg(look.name));
    }
}

void kyoskNewView::renderClosing() {
    m_closingHead->setText(wording(u"כמעט סיימנו"_s, u"Almost done"_s));
    speak(m_mail, m_page.Label17.text.simplified());
    speak(m_domain, wording(u"ספק הדואר, אחרי השטרודל"_s, u"Mail provider, behind the at sign"_s));
    speak(m_albumMail, m_page.Label17.text.simplified());
    speak(m_note, m_page.Text2Prompt.text.simplified());
    m_domain->display(m_page.Combo1Items, m_page.Combo1Index, m_page.Combo1.text);
    m_at->setVisible(m_page.Text1.visible);
    const bool local = !m_page.Command8.visible && m_page.Command7.visible;
    changeRole(m_withoutAddress, local ? "main" : "secondary");
    m_closing->setFirstFocus(m_page.Text1.visible ? m_mail : m_page.Txt4Ml2.visible ? m_albumMail : m_note);
    m_closing->setOpen(m_page.Frame4.visible);
}

void kyoskNewView::takeFocus() {
    if (m_focusRequest == m_page.focusRequest)
        return;
    m_focusRequest = m_page.focusRequest;
    if (auto* widget = findChild<QWidget*>(m_page.focusBox))
        giveFocus(*widget);
}

void kyoskNewView::render() {
    m_side->setLayoutDirection(layoutDirection());
    const int body = m_page.List4.isEmpty() && m_page.List1.isEmpty() ? 0 : 1;
    if (m_body->currentIndex() != body) {
        m_body->setCurrentIndex(body);
        QTimer::singleShot(0, this, &kyoskNewView::fitCells);
    }
    m_emptyHead->setText(wording(u"מאיפה ניקח את התמונות?"_s, u"Where are your pictures?"_s));
    m_emptyText->setText(isolated(m_page.Label25.text));
    m_firstFolder->setText(wording(u"פתח תיקיית תמונות"_s, u"Open a folder of pictures"_s));
    m_firstFolder->setAccessibleName(m_firstFolder->text());
    const QString folder = m_page.Label29.text.trimmed();
    QString line;
    if (!folder.isEmpty())
        line = fromLeft(m_folder->fontMetrics().elidedText(folder, Qt::ElideMiddle, theme().px(200)));
    if (!m_page.Label34.text.trimmed().isEmpty() && !folder.isEmpty())
        line += u"  ·  "_s + wording(u"%1 תמונות"_s, u"%1 pictures"_s).arg(m_page.Label34.text.trimmed());
    m_folder->setText(line);
    renderCells();
    m_large->show(m_page.Picture2,
                  wording(u"מעט פיקסלים: ההדפסה עלולה לצאת מטושטשת"_s, u"Few pixels: the print may come out blurred"_s),
                  wording(u"הצגת התמונה בגדול"_s, u"Look at the picture in large"_s));
    m_turn->setVisible(m_page.Image4.visible && !m_page.Picture2.bitmap.isNull());
    setDirectedIcon(m_previous, Way::Back);
    setDirectedIcon(m_next, Way::Forwards);
    m_next->setLayoutDirection(state().english() ? Qt::RightToLeft : Qt::LeftToRight);
    setDirectedIcon(m_backToPictures, Way::Back);
    // One main action at a time.
    m_finishAlbum->setVisible(m_page.Image13.visible && !m_page.Image7.visible);
    for (const char* name : {"Command24", "Command25", "Command23"})
        breakLong(*findChild<QPushButton*>(QString::fromLatin1(name)));
    m_helpClose->setText(wording(u"סגור"_s, u"Close"_s));
    m_helpClose->setAccessibleName(m_helpClose->text());
    m_leave->setOpen(m_page.Frame3.visible);
    m_help->setOpen(m_page.Frame2.visible);
    renderClosing();
    // A lab with fewer shops leaves captions empty; the panel opens on the first branch there is.
    for (auto at = m_branchButtons.rbegin(); at != m_branchButtons.rend(); ++at) {
        if ((*at)->text().isEmpty())
            (*at)->hide();
        else
            m_branches->setFirstFocus(*at);
    }
    m_branches->setOpen(m_page.Pic4snifim.visible);
    m_compression->setOpen(m_page.Picture7.visible);
    takeFocus();
}

} // namespace lumora
