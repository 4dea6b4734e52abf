#include "views/hatchala/hatchalaView.h"

#include "views/hatchala/StartDecoration.h"
#include "views/kit/KeyRows.h"
#include "views/kit/Overlay.h"

#include <QEvent>
#include <QFocusEvent>
#include <QListWidget>
#include <QMouseEvent>

namespace lumora {

using namespace Qt::StringLiterals;

hatchalaView::hatchalaView(hatchala& page, const SessionState& state, const Theme& theme, const Files& files)
    : ViewOf(page, state, theme)
    , m_files(files) {
    frame().steps().setStep(OrderStep::Start);
    frame().setTitleVisible(false);
    makeHeader();
    // Words at the beginning of the reading direction, the picture beside them; on an upright page above them.
    frame().content()->addLayout(across(Space::Far, {{makeWords(), 5}, {makeSide(), 5}}, Upright::LastOnTop), 1);
    makeStart();
    m_arrow = new ArrowStrip(theme, m_start, this);
    frame().content()->setSpacing(theme.size(Space::Tight));
    frame().content()->setContentsMargins(theme.margin(), theme.gap(), theme.margin(), theme.size(Space::Tight));
    frame().content()->addWidget(m_arrow);
    makeShops();
    makeOffer();

    for (const char* name : {"Image1", "Image11", "Image5", "Image3"})
        findChild<QWidget*>(QString::fromLatin1(name))->setProperty("sinks", true);
    connect(&page, &hatchala::moved, this, &hatchalaView::renderMotion);
    bind(u"Label8"_s, m_arrow, [this] { return c.Label8.text; });
    start();
}

void hatchalaView::makeHeader() {
    auto* english = new QPushButton(this);
    setRole(english, "quiet");
    english->setFocusPolicy(Qt::TabFocus);
    setIcon(english, u"globe"_s, Theme::Colour::Ink);
    english->setCheckable(true);
    connect(english, &QPushButton::clicked, this, toPage(&hatchala::Check1_Click));
    bind(english, c.Check1);
    QPushButton* hebrew = button(c.Command4Ivrit, Role::Quiet, &hatchala::Command4Ivrit_Click, u"globe"_s);
    hebrew->setProperty("letterOfAnyLanguage", true);
    QPushButton* leave = button(c.Image3, Role::Quiet, &hatchala::Image3_MouseDown, u"exit"_s);
    helpFor(leave, hatchala::Hover::Image3);
    frame().addHeaderActions({english, hebrew, leave});
}

QLayout* hatchalaView::makeWords() {
    const Card notice = makeCard("success", Pad::Normal);
    m_noticeBox = notice.frame;
    notice.column->addWidget(label(c.Notice, "strong"));
    m_headline = label(c.Title, "display");
    QVBoxLayout* column = inColumn(Space::Normal, {m_noticeBox, Item::room(), m_headline,
                                                   label(c.Label4How, theme().isTall() ? "large" : "muted")});
    const QString icons[] = {u"pictures"_s, u"printer"_s, u"send"_s};
    for (std::size_t i = 0; i < c.Label4Step.size(); ++i)
        column->addLayout(inRow(Space::Normal, {sign(icons[i], theme().isTall() ? IconSize::Box : IconSize::Line),
                                                {label(c.Label4Step[i], theme().isTall() ? "large" : "body"), 1}}));
    QPushButton* prices = button(c.Image11, Role::Plain, &hatchala::Image11_Click, u"tag"_s);
    QPushButton* site = button(c.Image5, Role::Plain, &hatchala::Image5_Click, u"globe"_s);
    helpFor(prices, hatchala::Hover::Image11);
    helpFor(site, hatchala::Hover::Image5);
    m_hints.push_back(makeHint(c.Label3, {}));
    add(*column, {Item::room(), inRow(Space::Normal, {prices, site, m_hints.back().box, Item::room()})});
    return column;
}

QLayout* hatchalaView::makeSide() {
    // This hint is right below its button, the exit.
    m_hints.push_back(makeHint(c.Label4, u"exit"_s));
    QWidget* stage = makeStage();
    m_advert = new AdvertisingPicture(theme(), this);
    bind(u"Picture4"_s, m_advert, [this] { return c.Picture4.text(); });
    return inColumn(Space::Small, {{m_hints.back().box, 0, Qt::AlignTrailing},
                                   {stage, 1},
                                   {m_advert, 0, Qt::AlignCenter},
                                   {makeContact(), 0, Qt::AlignCenter}});
}

// The prints, or in their place the help of the control under the pointer.
QWidget* hatchalaView::makeStage() {
    m_prints = new Prints(this);
    QLabel* head = label(c.Picture3, "muted");
    head->setMinimumHeight(theme().size(IconSize::Line));
    head->setAlignment(Qt::AlignCenter);
    keepPlaceWhenHidden(*head);
    using enum hatchala::Hover;
    QWidget* help =
        inBox(inColumn(Space::Small, {Item::room(2), head, makeHelp(Image1, u"play"_s), makeHelp(Image11, u"tag"_s),
                                      makeHelp(Image5, u"globe"_s), makeHelp(Image3, u"exit"_s),
                                      makeHelp(Image6, u"phone"_s), Item::room(3)}));
    help->setAttribute(Qt::WA_TransparentForMouseEvents);
    auto* place = inGrid(Space::None);
    place->addWidget(m_prints, 0, 0);
    place->addWidget(help, 0, 0);
    return inBox(place);
}

QWidget* hatchalaView::makeHelp(hatchala::Hover over, const QString& icon) {
    const Card card = makeCard("card", Pad::Wide);
    m_helps.push_back({over, words("large")});
    card.column->addLayout(inRow(Space::Wide, {sign(icon, IconSize::Box), {m_helps.back().text, 1}}));
    const auto at = static_cast<std::size_t>(over);
    bind(card.frame, c.Image12[at]);
    return card.frame;
}

hatchalaView::Hint hatchalaView::makeHint(const Caption& caption, const QString& icon) {
    QLabel* text = oneLine("smallMuted");
    QHBoxLayout* row = inRow(Space::Small);
    if (!icon.isEmpty())
        row->addWidget(sign(icon, IconSize::Small, Theme::Colour::Muted));
    row->addWidget(text);
    QWidget* box = inBox(row);
    bind(box, caption);
    return {&caption, box, text};
}

QWidget* hatchalaView::makeContact() {
    const auto entry = [&](const QString& icon, QLabel* text) {
        text->setWordWrap(false);
        return inBox(inRow(Space::Small, {sign(icon, IconSize::Button), text}));
    };
    m_telephone = entry(u"phone"_s, label(c.Label4Tel, "strong"));
    m_mail = entry(u"mail"_s, label(c.Label1, "body"));
    QWidget* contact = inBox(inRow(Space::Wide, {m_telephone, m_mail}));
    bind(contact, c.Image6);
    helpFor(contact, hatchala::Hover::Image6);
    return contact;
}

void hatchalaView::makeStart() {
    m_start = plainButton(u"Image1"_s, "main", [this] {
        if (!isDetached())
            m_page.Image1_Click();
    });
    connect(m_start, &QPushButton::pressed, this, toPage(&hatchala::Image1_MouseDown));
    bind(m_start, c.Image1);
    frame().addMainAction(m_start);
    frame().addSecondaryAction(button(c.Image8, Role::Quiet, &hatchala::Image8_Click, u"globe"_s));
    frame().addStatus({label(c.Label4Mamtinot, "smallMuted"), label(c.Label7, "muted"), label(c.Label6, "large")});
    helpFor(m_start, hatchala::Hover::Image1);
}

// The question at which shop the prints are fetched.
void hatchalaView::makeShops() {
    QListWidget* shops = list(c.List1, &hatchala::List1_Click);
    shops->setFixedHeight(theme().size(Extent::Drawing));
    m_shops = new Overlay(theme(), this,
                          {label(c.List1Caption, "title"),
                           shops,
                           {button(c.shopsBack, Role::Secondary, &hatchala::Picture1_Escape), 0, Qt::AlignLeading}});
    m_shops->setFirstFocus(shops);
    m_shops->whenEscaped(toPage(&hatchala::Picture1_Escape));
    m_shopList = shops;
    bind(u"Picture1"_s, m_shops->card(), [this] { return c.Picture1.text; });
}

// On a kiosk the customer of the order is known by them.
QWidget* hatchalaView::makeDigits() {
    KeyRows keys;
    for (std::size_t i = 0; i < keys.digits.size(); ++i)
        keys.digits[i] = toKey(
            button(c.Command4Sifra[i], Role::Plain, &hatchala::Command4Sifra_Click, static_cast<int>(i)), theme());
    m_takeBack = toKey(button(c.Command4Mehak, Role::Plain, &hatchala::Command4Mehak_Click, u"backspace"_s), theme());
    keys.besideZero[1] = m_takeBack;
    QWidget* pad = inMiddle(inDigitRows(*this, theme(), keys), 2);
    follow(pad, c.Label4Sfarot);
    return pad;
}

// The offer to go on with an order that was not finished.
void hatchalaView::makeOffer() {
    m_offer = new Overlay(theme(), this,
                          {label(c.Pic4Hemshech, "title"), label(c.Label4Hemshech, "large"),
                           centred(label(c.Label4Sfarot, "display")), label(c.Label4Od, "muted"), makeDigits()});
    QPushButton* goOn = button(c.Command4Hemshech, Role::Main, &hatchala::Command4Hemshech_Click);
    m_offer->addRow({button(c.Command4Bitul, Role::Quiet, &hatchala::Command4Bitul_Click, u"trash"_s), Item::room(),
                     button(c.Command4Achar, Role::Secondary, &hatchala::Command4Achar_Click), goOn});
    m_offer->setFirstFocus(goOn);
    m_offer->whenEscaped(toPage(&hatchala::Command4Achar_Click));
}

void hatchalaView::helpFor(QWidget* widget, hatchala::Hover over) {
    m_hovers.emplace_back(widget, over);
    widget->installEventFilter(this);
}

bool hatchalaView::eventFilter(QObject* watched, QEvent* event) {
    for (const auto& [widget, over] : m_hovers) {
        if (widget != watched || isDetached())
            continue;
        switch (event->type()) {
        case QEvent::Enter:
            m_page.MouseMove(over);
            break;
        case QEvent::MouseButtonPress: // a finger comes without a hover
            m_page.MouseMove(over);
            if (!qobject_cast<QPushButton*>(widget))
                return true; // or it would count as a press on the bare page
            break;
        case QEvent::Leave:
        case QEvent::FocusOut:
            if (m_page.hover() == over) // the focus of another control takes no help away
                m_page.MouseMove(hatchala::Hover::Nothing);
            break;
        case QEvent::FocusIn: {
            const Qt::FocusReason why = static_cast<QFocusEvent*>(event)->reason();
            if (why == Qt::TabFocusReason || why == Qt::BacktabFocusReason)
                m_page.MouseMove(over);
            break;
        }
        default:
            break;
        }
    }
    return PageView::eventFilter(watched, event);
}

void hatchalaView::mousePressEvent(QMouseEvent* event) {
    m_page.MouseMove(hatchala::Hover::Nothing);
    PageView::mousePressEvent(event);
}

QWidget* hatchalaView::firstFocus() const {
    return m_start;
}

// A step of a motion repaints the moving pieces only.
void hatchalaView::renderMotion() {
    if (isDetached())
        return;
    const StartMotion& motion = m_page.motion();
    // Only every second step is painted; the eye sees no difference.
    const int step = (motion.Label8Top() - StartMotion::arrowTop) / 2 * 2;
    m_arrow->setPhase(static_cast<double>(step) / (StartMotion::arrowBottom - StartMotion::arrowTop));
    m_advert->setOpening(static_cast<double>(motion.Picture4Width()) / StartMotion::pictureWidth);
    m_shops->setReveal(static_cast<double>(motion.Picture1Width()) / StartMotion::panelWidth);
}

void hatchalaView::renderAdvert() {
    if (std::exchange(m_advertFile, c.Picture4) != c.Picture4)
        m_advert->setPicture(loadedPicture(m_files, m_advertFile));
    m_advert->setVisible(m_advert->hasPicture());
}

void hatchalaView::renderHelp() {
    for (const Help& help : m_helps)
        help.text->setText(c.Image12[static_cast<std::size_t>(help.over)].text);
    const bool shown = m_page.hover() != hatchala::Hover::Nothing;
    // In English the page keeps the prints visible, and the help is shown in their place.
    m_prints->show(c.Picture2.visible && !shown, c.Image2.visible && !shown);
    for (const Hint& hint : m_hints)
        hint.text->setText(hint.caption->text.trimmed());
}

bool hatchalaView::leave() {
    m_page.Image3_MouseDown();
    return true;
}

void hatchalaView::render() {
    setDirectedIcon(m_start, Way::Forwards);
    m_start->setLayoutDirection(state().english() ? Qt::RightToLeft : Qt::LeftToRight); // the arrow behind the word
    m_noticeBox->setVisible(c.Notice.visible);
    m_telephone->setVisible(!c.Label4Tel.text.isEmpty());
    m_mail->setVisible(!c.Label1.text.isEmpty());
    m_arrow->setVisible(c.Label8.visible);
    renderAdvert();
    renderHelp();
    const QString spoken = c.List1Caption.text.simplified();
    speak(m_takeBack, c.Command4Mehak.hint);
    speak(m_shops, spoken);
    speak(m_shopList, spoken);
    renderMotion();
    m_shops->setOpen(c.Picture1.visible);
    m_offer->setOpen(c.Pic4Hemshech.visible);
}

} // namespace lumora
