#include "views/hatchala/hatchalaView.h"

#include "imaging/files/PictureFile.h"
#include "platform/files/Files.h"
#include "views/hatchala/StartDecoration.h"
#include "views/kit/Overlay.h"

#include <QEvent>
#include <QFocusEvent>
#include <QListWidget>
#include <QMouseEvent>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

void keepPlaceWhenHidden(QWidget& widget) {
    QSizePolicy policy = widget.sizePolicy();
    policy.setRetainSizeWhenHidden(true);
    widget.setSizePolicy(policy);
}

} // namespace

hatchalaView::hatchalaView(hatchala& page, const SessionState& state, const Theme& theme, const Files& files)
    : ViewOf(page, state, theme)
    , m_files(files) {
    frame().steps().setStep(OrderStep::Start);
    frame().setTitleVisible(false);
    makeHeader();
    // Words at the beginning of the reading direction, the picture beside them.
    frame().content()->addLayout(inRow(Space::Far, {{makeWords(), 5}, {makeSide(), 5}}), 1);
    makeStart();
    m_arrow = new ArrowStrip(theme, m_start, this);
    frame().content()->setSpacing(theme.size(Space::Tight));
    frame().content()->setContentsMargins(theme.margin(), theme.px(14), theme.margin(), theme.size(Space::Tight));
    frame().content()->addWidget(m_arrow);
    makeShops();

    for (const char* name : {"Image1", "Image11", "Image5", "Image3"})
        findChild<QWidget*>(QString::fromLatin1(name))->setProperty("sinks", true);
    connect(&page, &hatchala::moved, this, &hatchalaView::renderMotion);
    bind(u"Label8"_s, m_arrow, [&page] { return page.Label8.text; });
    bindHidden(u"Label4Tel2"_s, page.Label4Tel2);
    bindHidden(u"Label4Zel"_s, page.Label4Zel);
    bindHidden(u"Picture8"_s, page.Picture8);
    bindHidden(u"Label5"_s, page.Label5);
    bindList(u"List2"_s, page.List2);
    bindList(u"List4pices"_s, page.List4pices);
    start();
}

void hatchalaView::makeHeader() {
    auto* english = new QPushButton(this);
    setRole(english, "quiet");
    english->setFocusPolicy(Qt::TabFocus);
    setIcon(english, u"globe"_s, Theme::Colour::Ink);
    english->setCheckable(true);
    connect(english, &QPushButton::clicked, this, toPage(&hatchala::Check1_Click));
    bind(u"Check1"_s, english, m_page.Check1);
    QPushButton* leave = button(u"Image3"_s, m_page.Image3, Role::Quiet, &hatchala::Image3_MouseDown, u"exit"_s);
    helpFor(leave, hatchala::Hover::Image3);
    frame().addHeaderActions({english, leave});
}

QLayout* hatchalaView::makeWords() {
    const Card notice = makeCard("success", Pad::Normal);
    m_noticeBox = notice.frame;
    notice.column->addWidget(label(u"Notice"_s, m_page.Notice, "strong"));
    m_headline = label(u"Title"_s, m_page.Title, "display");
    m_how = words("muted");
    QVBoxLayout* column = inColumn(Space::Normal, {m_noticeBox, Item::room(), m_headline, m_how});
    for (const QString& icon : {u"pictures"_s, u"printer"_s, u"send"_s}) {
        m_steps.push_back(words("body"));
        column->addLayout(inRow(Space::Normal, {sign(icon, IconSize::Line), {m_steps.back(), 1}}));
    }
    QPushButton* prices = button(u"Image11"_s, m_page.Image11, Role::Plain, &hatchala::Image11_Click, u"tag"_s);
    QPushButton* site = button(u"Image5"_s, m_page.Image5, Role::Plain, &hatchala::Image5_Click, u"globe"_s);
    helpFor(prices, hatchala::Hover::Image11);
    helpFor(site, hatchala::Hover::Image5);
    m_hints.push_back(makeHint(u"Label3"_s, m_page.Label3, {}));
    add(*column, {Item::room(), inRow(Space::Normal, {prices, site, m_hints.back().box, Item::room()})});
    return column;
}

QLayout* hatchalaView::makeSide() {
    // Right below the button that it speaks of.
    m_hints.push_back(makeHint(u"Label4"_s, m_page.Label4, u"exit"_s));
    QWidget* stage = makeStage();
    m_advert = new AdvertisingPicture(theme(), this);
    bind(u"Picture4"_s, m_advert, [this] { return m_page.Picture4; });
    return inColumn(Space::Small, {{m_hints.back().box, 0, Qt::AlignTrailing},
                                   {stage, 1},
                                   {m_advert, 0, Qt::AlignCenter},
                                   {makeContact(), 0, Qt::AlignCenter}});
}

// The prints, and in their place what the control in hand does.
QWidget* hatchalaView::makeStage() {
    m_prints = new Prints(this);
    QLabel* head = label(u"Picture3"_s, m_page.Picture3, "muted");
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
    // Their place in the state is the one of the prints at the back and of the one in front.
    bindHidden(u"Picture2"_s, m_page.Picture2);
    bindHidden(u"Image2"_s, m_page.Image2);
    return inBox(place);
}

QWidget* hatchalaView::makeHelp(hatchala::Hover over, const QString& icon) {
    const Card card = makeCard("card", Pad::Wide);
    m_helps.push_back({over, words("large")});
    card.column->addLayout(inRow(Space::Wide, {sign(icon, IconSize::Box), {m_helps.back().text, 1}}));
    const auto at = static_cast<std::size_t>(over);
    bind(numbered("Image12", at), card.frame, m_page.Image12[at]);
    return card.frame;
}

hatchalaView::Hint hatchalaView::makeHint(const QString& name, const Caption& caption, const QString& icon) {
    QLabel* text = oneLine("smallMuted");
    QHBoxLayout* row = inRow(Space::Small);
    if (!icon.isEmpty())
        row->addWidget(sign(icon, IconSize::Small, Theme::Colour::Muted));
    row->addWidget(text);
    QWidget* box = inBox(row);
    bind(name, box, caption);
    return {&caption, box, text};
}

QWidget* hatchalaView::makeContact() {
    const auto entry = [&](const QString& icon, QLabel* text) {
        text->setWordWrap(false);
        return inBox(inRow(Space::Small, {sign(icon, IconSize::Button), text}));
    };
    m_telephone = entry(u"phone"_s, label(u"Label4Tel"_s, m_page.Label4Tel, "strong"));
    m_mail = entry(u"mail"_s, label(u"Label1"_s, m_page.Label1, "body"));
    QWidget* contact = inBox(inRow(Space::Wide, {m_telephone, m_mail}));
    bind(u"Image6"_s, contact, m_page.Image6);
    helpFor(contact, hatchala::Hover::Image6);
    return contact;
}

void hatchalaView::makeStart() {
    m_start = plainButton(u"Image1"_s, "main", [this] {
        if (!isDetached())
            m_page.Image1_Click();
    });
    connect(m_start, &QPushButton::pressed, this, toPage(&hatchala::Image1_MouseDown));
    bind(u"Image1"_s, m_start, m_page.Image1);
    frame().addMainAction(m_start);
    frame().addSecondaryAction(button(u"Image8"_s, m_page.Image8, Role::Quiet, &hatchala::Image8_Click, u"globe"_s));
    frame().addStatus({label(u"Label7"_s, m_page.Label7, "muted"), label(u"Label6"_s, m_page.Label6, "large")});
    helpFor(m_start, hatchala::Hover::Image1);
}

// The question at which shop the prints are fetched.
void hatchalaView::makeShops() {
    m_shops = new Overlay(theme(), this);
    m_ask = words("title");
    auto* list = new QListWidget(m_shops);
    list->setFixedHeight(theme().px(130));
    const auto taken = [this, list](QListWidgetItem* item) { m_page.List1_Click(list->row(item)); };
    connect(list, &QListWidget::itemClicked, this, taken);
    connect(list, &QListWidget::itemActivated, this, taken);
    bindList(u"List1"_s, m_page.List1, list);
    m_shopsBack = plainButton(u"shopsBack"_s, "secondary", toPage(&hatchala::Picture1_Escape));
    add(*m_shops->column(), {m_ask, list, {m_shopsBack, 0, Qt::AlignLeading}});
    m_shops->setFirstFocus(list);
    m_shops->whenEscaped(toPage(&hatchala::Picture1_Escape));
    m_shopList = list;
    bind(u"Picture1"_s, m_shops->card(), [this] { return m_page.Picture1.text; });
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

// A step of a motion: whatever moves paints itself, and nothing else does anything.
void hatchalaView::renderMotion() {
    if (isDetached())
        return;
    // Every second step is as much as an eye follows.
    const int step = (m_page.Label8Top - hatchala::arrowTop) / 2 * 2;
    m_arrow->setPhase(static_cast<double>(step) / (hatchala::arrowBottom - hatchala::arrowTop));
    m_advert->setOpening(static_cast<double>(m_page.Picture4Width) / hatchala::pictureWidth);
    m_shops->setReveal(static_cast<double>(m_page.Picture1Width) / hatchala::panelWidth);
}

void hatchalaView::renderAdvert() {
    if (m_advertFile != m_page.Picture4) {
        m_advertFile = m_page.Picture4;
        QImage picture;
        if (const auto path = m_files.drives().toHost(m_advertFile)) {
            if (const auto loaded = loadPicture(*path))
                picture = loaded->image();
        }
        m_advert->setPicture(picture);
    }
    m_advert->setVisible(m_advert->hasPicture());
}

void hatchalaView::renderHelp() {
    bool shown = false;
    for (const Help& help : m_helps) {
        const Caption& caption = m_page.Image12[static_cast<std::size_t>(help.over)];
        help.text->setText(caption.text);
        shown = shown || caption.visible;
    }
    // In English the page leaves the prints where they are; the help needs their place all the same.
    m_prints->show(m_page.Picture2.visible && !shown, m_page.Image2.visible && !shown);
    for (const Hint& hint : m_hints)
        hint.text->setText(hint.caption->text.trimmed());
}

void hatchalaView::render() {
    setDirectedIcon(m_start, Way::Forwards);
    m_start->setLayoutDirection(state().english() ? Qt::RightToLeft : Qt::LeftToRight); // the arrow behind the word
    m_how->setText(wording(u"הדפסת תמונות בשלושה צעדים פשוטים:"_s, u"Printing pictures takes three simple steps:"_s));
    m_steps[0]->setText(wording(u"בוחרים תמונות מהמחשב, מכרטיס הזיכרון או מהמצלמה"_s,
                                u"Choose pictures from the computer, a memory card or a camera"_s));
    m_steps[1]->setText(wording(u"בוחרים גודל, סוג נייר וכמות"_s, u"Choose the size, the paper and how many"_s));
    m_steps[2]->setText(wording(u"התוכנה שולחת את ההזמנה למעבדה"_s, u"The program sends the order to the lab"_s));
    m_noticeBox->setVisible(m_page.Notice.visible && !m_page.Notice.text.isEmpty());
    m_telephone->setVisible(!m_page.Label4Tel.text.isEmpty());
    m_mail->setVisible(!m_page.Label1.text.isEmpty());
    m_arrow->setVisible(m_page.Label8.visible);
    renderAdvert();
    renderHelp();
    QStringList question = m_page.List1Caption.text.split(u'\n');
    for (QString& line : question)
        line = line.trimmed();
    m_ask->setText(question.join(u'\n'));
    const QString spoken = m_page.List1Caption.text.simplified();
    speak(m_shops, spoken);
    speak(m_shopList, spoken);
    m_shopsBack->setText(wording(u"חזרה"_s, u"Back"_s));
    m_shopsBack->setAccessibleName(m_shopsBack->text());
    renderMotion();
    m_shops->setOpen(m_page.Picture1.visible);
}

} // namespace lumora
