#include "views/hatchala/hatchalaView.h"

#include "imaging/files/PictureFile.h"
#include "platform/files/Files.h"
#include "views/hatchala/StartDecoration.h"
#include "views/kit/Overlay.h"

#include <QEvent>
#include <QFocusEvent>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QMouseEvent>
#include <QPushButton>
#include <QVBoxLayout>

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
    : PageView(page, state, theme)
    , m_page(page)
    , m_files(files) {
    frame().steps().setStep(OrderStep::Start);
    frame().setTitleVisible(false);
    makeHeader();
    // Words at the beginning of the reading direction, the picture beside them.
    auto* row = new QHBoxLayout;
    row->setSpacing(theme.px(36));
    row->addLayout(makeWords(), 5);
    row->addLayout(makeSide(), 5);
    frame().content()->addLayout(row, 1);
    makeStart();
    m_arrow = new ArrowStrip(theme, m_start, this);
    frame().content()->setSpacing(theme.px(4));
    frame().content()->setContentsMargins(theme.margin(), theme.px(14), theme.margin(), theme.px(4));
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
    connect(english, &QPushButton::clicked, this, [this](bool on) { m_page.Check1_Click(on); });
    bind(u"Check1"_s, english, m_page.Check1);
    frame().addHeaderAction(english);
    auto* leave = button(
        u"Image3"_s, m_page.Image3, Role::Quiet, [this] { m_page.Image3_MouseDown(); }, u"exit"_s);
    frame().addHeaderAction(leave);
    helpFor(leave, hatchala::Hover::Image3);
}

QLayout* hatchalaView::makeWords() {
    auto* words = new QVBoxLayout;
    words->setSpacing(theme().px(14));
    m_noticeBox = new QFrame(this);
    setRole(m_noticeBox, "success");
    auto* noticeRow = new QHBoxLayout(m_noticeBox);
    noticeRow->setContentsMargins(theme().px(18), theme().px(12), theme().px(18), theme().px(12));
    noticeRow->addWidget(label(u"Notice"_s, m_page.Notice, "strong"));
    words->addWidget(m_noticeBox);
    words->addStretch(1);
    m_headline = label(u"Title"_s, m_page.Title, "display");
    words->addWidget(m_headline);
    m_how = makeLabel(this, "muted");
    words->addWidget(m_how);
    for (const QString& icon : {u"pictures"_s, u"printer"_s, u"send"_s}) {
        auto* line = new QHBoxLayout;
        line->setSpacing(theme().px(14));
        auto* sign = new QLabel(this);
        sign->setPixmap(theme().icon(icon, theme().px(30), Theme::Colour::Primary));
        line->addWidget(sign);
        m_steps.push_back(makeLabel(this, "body"));
        line->addWidget(m_steps.back(), 1);
        words->addLayout(line);
    }
    words->addStretch(1);
    auto* links = new QHBoxLayout;
    links->setSpacing(theme().gap());
    auto* prices = button(
        u"Image11"_s, m_page.Image11, Role::Plain, [this] { m_page.Image11_Click(); }, u"tag"_s);
    auto* site = button(
        u"Image5"_s, m_page.Image5, Role::Plain, [this] { m_page.Image5_Click(); }, u"globe"_s);
    helpFor(prices, hatchala::Hover::Image11);
    helpFor(site, hatchala::Hover::Image5);
    links->addWidget(prices);
    links->addWidget(site);
    m_hints.push_back(makeHint(u"Label3"_s, m_page.Label3, {}));
    links->addWidget(m_hints.back().box);
    links->addStretch(1);
    words->addLayout(links);
    return words;
}

QLayout* hatchalaView::makeSide() {
    auto* side = new QVBoxLayout;
    side->setSpacing(theme().px(10));
    // Right below the button that it speaks of.
    m_hints.push_back(makeHint(u"Label4"_s, m_page.Label4, u"exit"_s));
    side->addWidget(m_hints.back().box, 0, Qt::AlignTrailing);
    side->addWidget(makeStage(), 1);
    m_advert = new AdvertisingPicture(theme(), this);
    bind(u"Picture4"_s, m_advert, [this] { return m_page.Picture4; });
    side->addWidget(m_advert, 0, Qt::AlignCenter);
    side->addWidget(makeContact(), 0, Qt::AlignCenter);
    return side;
}

// The prints, and in their place what the control in hand does.
QWidget* hatchalaView::makeStage() {
    auto* stage = new QWidget(this);
    auto* column = new QVBoxLayout(stage);
    column->setContentsMargins(0, 0, 0, 0);
    auto* over = new QWidget(stage);
    auto* place = new QGridLayout(over);
    place->setContentsMargins(0, 0, 0, 0);
    m_prints = new Prints(over);
    place->addWidget(m_prints, 0, 0);
    auto* help = new QWidget(over);
    help->setAttribute(Qt::WA_TransparentForMouseEvents);
    auto* helpColumn = new QVBoxLayout(help);
    helpColumn->setContentsMargins(0, 0, 0, 0);
    helpColumn->setSpacing(theme().px(8));
    auto* head = label(u"Picture3"_s, m_page.Picture3, "muted");
    head->setMinimumHeight(theme().px(32));
    head->setAlignment(Qt::AlignCenter);
    keepPlaceWhenHidden(*head);
    helpColumn->addStretch(2);
    helpColumn->addWidget(head);
    helpColumn->addWidget(makeHelp(hatchala::Hover::Image1, u"play"_s, help));
    helpColumn->addWidget(makeHelp(hatchala::Hover::Image11, u"tag"_s, help));
    helpColumn->addWidget(makeHelp(hatchala::Hover::Image5, u"globe"_s, help));
    helpColumn->addWidget(makeHelp(hatchala::Hover::Image3, u"exit"_s, help));
    helpColumn->addWidget(makeHelp(hatchala::Hover::Image6, u"phone"_s, help));
    helpColumn->addStretch(3);
    place->addWidget(help, 0, 0);
    column->addWidget(over, 1);
    // Their place in the state is the one of the prints at the back and of the one in front.
    bindHidden(u"Picture2"_s, m_page.Picture2);
    bindHidden(u"Image2"_s, m_page.Image2);
    return stage;
}

QWidget* hatchalaView::makeHelp(hatchala::Hover over, const QString& icon, QWidget* parent) {
    auto* card = new QFrame(parent);
    setRole(card, "card");
    auto* row = new QHBoxLayout(card);
    row->setContentsMargins(theme().px(22), theme().px(20), theme().px(22), theme().px(20));
    row->setSpacing(theme().px(18));
    auto* sign = new QLabel(card);
    sign->setPixmap(theme().icon(icon, theme().px(52), Theme::Colour::Primary));
    row->addWidget(sign);
    auto* text = makeLabel(card, "large");
    row->addWidget(text, 1);
    m_helps.push_back({over, text});
    const Caption& caption = m_page.Image12[static_cast<std::size_t>(over)];
    bind(u"Image12(%1)"_s.arg(static_cast<int>(over)), card, caption);
    return card;
}

hatchalaView::Hint hatchalaView::makeHint(const QString& name, const Caption& caption, const QString& icon) {
    auto* box = new QWidget(this);
    auto* row = new QHBoxLayout(box);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(theme().px(8));
    if (!icon.isEmpty()) {
        auto* sign = new QLabel(box);
        sign->setPixmap(theme().icon(icon, theme().px(20), Theme::Colour::Muted));
        row->addWidget(sign);
    }
    auto* text = makeLabel(box, "smallMuted");
    text->setWordWrap(false);
    row->addWidget(text);
    bind(name, box, caption);
    return {&caption, box, text};
}

QWidget* hatchalaView::makeContact() {
    auto* contact = new QWidget(this);
    auto* row = new QHBoxLayout(contact);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(theme().px(18));
    const auto entry = [&](const QString& icon, QLabel* text) {
        auto* box = new QWidget(contact);
        auto* line = new QHBoxLayout(box);
        line->setContentsMargins(0, 0, 0, 0);
        auto* sign = new QLabel(box);
        sign->setPixmap(theme().icon(icon, theme().px(24), Theme::Colour::Primary));
        line->addWidget(sign);
        text->setWordWrap(false);
        line->addWidget(text);
        row->addWidget(box);
        return box;
    };
    m_telephone = entry(u"phone"_s, label(u"Label4Tel"_s, m_page.Label4Tel, "strong"));
    m_mail = entry(u"mail"_s, label(u"Label1"_s, m_page.Label1, "body"));
    bind(u"Image6"_s, contact, m_page.Image6);
    helpFor(contact, hatchala::Hover::Image6);
    return contact;
}

void hatchalaView::makeStart() {
    m_start = new QPushButton(this);
    setRole(m_start, "main");
    m_start->setFocusPolicy(Qt::TabFocus);
    connect(m_start, &QPushButton::pressed, this, [this] { m_page.Image1_MouseDown(); });
    connect(m_start, &QPushButton::clicked, this, [this] {
        if (!isDetached())
            m_page.Image1_Click();
    });
    bind(u"Image1"_s, m_start, m_page.Image1);
    frame().addMainAction(m_start);
    frame().addSecondaryAction(button(
        u"Image8"_s, m_page.Image8, Role::Quiet, [this] { m_page.Image8_Click(); }, u"globe"_s));
    frame().addStatus(label(u"Label7"_s, m_page.Label7, "muted"));
    frame().addStatus(label(u"Label6"_s, m_page.Label6, "large"));
    helpFor(m_start, hatchala::Hover::Image1);
}

// The question at which shop the prints are fetched.
void hatchalaView::makeShops() {
    m_shops = new Overlay(theme(), this);
    m_ask = makeLabel(m_shops, "title");
    m_shops->column()->addWidget(m_ask);
    auto* list = new QListWidget(m_shops);
    list->setFixedHeight(theme().px(130));
    connect(list, &QListWidget::itemClicked, this,
            [this, list](QListWidgetItem* item) { m_page.List1_Click(list->row(item)); });
    connect(list, &QListWidget::itemActivated, this,
            [this, list](QListWidgetItem* item) { m_page.List1_Click(list->row(item)); });
    bindList(u"List1"_s, m_page.List1, list);
    m_shops->column()->addWidget(list);
    m_shopsBack = new QPushButton(m_shops);
    setRole(m_shopsBack, "secondary");
    m_shopsBack->setObjectName(u"shopsBack"_s);
    m_shopsBack->setFocusPolicy(Qt::TabFocus);
    connect(m_shopsBack, &QPushButton::clicked, this, [this] { m_page.Picture1_Escape(); });
    m_shops->column()->addWidget(m_shopsBack, 0, Qt::AlignLeading);
    m_shops->setFirstFocus(list);
    connect(m_shops, &Overlay::escaped, this, [this] { m_page.Picture1_Escape(); });
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
