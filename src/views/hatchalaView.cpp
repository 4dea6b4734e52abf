#include "views/hatchalaView.h"

#include "imaging/PictureFile.h"
#include "platform/Files.h"
#include "views/Cards.h"
#include "views/Overlay.h"

#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QPainter>
#include <QPushButton>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Three prints on a table: what the customer goes home with.
class Prints : public QWidget {
public:
    using QWidget::QWidget;

protected:
    void paintEvent(QPaintEvent*) override {
        QPainter painter(this);
        painter.setRenderHint(QPainter::Antialiasing);
        const double unit = std::min(width() / 1.25, height() / 1.0);
        const auto print = [&](QPointF at, double angle, double w, double h) {
            painter.save();
            painter.translate(rect().center() + at * unit);
            painter.rotate(angle);
            const QRectF paper(-w * unit / 2, -h * unit / 2, w * unit, h * unit);
            for (int i = 4; i > 0; --i) {
                painter.setPen(Qt::NoPen);
                painter.setBrush(QColor(0x1D, 0x25, 0x2C, 9));
                painter.drawRoundedRect(paper.adjusted(-i, -i + 3, i, i + 4), 4, 4);
            }
            painter.fillRect(paper, Qt::white);
            const double edge = unit * 0.022;
            drawSamplePicture(painter, paper.adjusted(edge, edge, -edge, -edge));
            painter.restore();
        };
        print({-0.22, -0.10}, -9, 0.62, 0.43);
        print({0.26, -0.03}, 8, 0.40, 0.58);
        print({-0.03, 0.17}, -2, 0.66, 0.45);
    }
};

} // namespace

hatchalaView::hatchalaView(hatchala& page, const SessionState& state, const Theme& theme, const Files& files)
    : PageView(page, state, theme)
    , m_page(page)
    , m_files(files) {
    frame().steps().setStep(OrderStep::Start);
    frame().setTitleVisible(false);

    // Header: language, exit.
    m_english = new QPushButton(this);
    setRole(m_english, "quiet");
    m_english->setFocusPolicy(Qt::TabFocus);
    setIcon(m_english, u"globe"_s, Theme::Colour::Ink);
    m_english->setCheckable(true);
    connect(m_english, &QPushButton::clicked, this, [this](bool on) { m_page.Check1_Click(on); });
    bind(u"Check1"_s, m_english, page.Check1);
    frame().addHeaderAction(m_english);
    auto* leave = button(
        u"Image3"_s, page.Image3, Role::Quiet, [this] { m_page.Image3_MouseDown(); }, u"exit"_s);
    frame().addHeaderAction(leave);

    // Content: words at the beginning of the reading direction, the picture beside them.
    auto* row = new QHBoxLayout;
    row->setSpacing(theme.px(36));
    auto* words = new QVBoxLayout;
    words->setSpacing(theme.px(14));
    m_noticeBox = new QFrame(this);
    setRole(m_noticeBox, "success");
    auto* noticeRow = new QHBoxLayout(m_noticeBox);
    noticeRow->setContentsMargins(theme.px(18), theme.px(12), theme.px(18), theme.px(12));
    noticeRow->addWidget(label(u"Notice"_s, page.Notice, "strong"));
    words->addWidget(m_noticeBox);
    words->addStretch(1);
    m_headline = label(u"Title"_s, page.Title, "display");
    words->addWidget(m_headline);
    m_how = makeLabel(this, "muted");
    words->addWidget(m_how);
    for (int i = 0; i < 3; ++i) {
        auto* line = new QHBoxLayout;
        line->setSpacing(theme.px(14));
        auto* sign = new QLabel(this);
        static constexpr const char* icons[] = {"pictures", "printer", "send"};
        sign->setPixmap(theme.icon(QString::fromLatin1(icons[i]), theme.px(30), Theme::Colour::Primary));
        line->addWidget(sign);
        m_steps.push_back(makeLabel(this, "body"));
        line->addWidget(m_steps.back(), 1);
        words->addLayout(line);
    }
    words->addStretch(1);
    auto* links = new QHBoxLayout;
    links->setSpacing(theme.gap());
    auto* prices = button(
        u"Image11"_s, page.Image11, Role::Plain, [this] { m_page.Image11_Click(); }, u"tag"_s);
    auto* site = button(
        u"Image5"_s, page.Image5, Role::Plain, [this] { m_page.Image5_Click(); }, u"globe"_s);
    links->addWidget(prices);
    links->addWidget(site);
    links->addStretch(1);
    words->addLayout(links);
    row->addLayout(words, 5);

    auto* side = new QVBoxLayout;
    side->addWidget(new Prints(this), 1);
    m_advert = new PictureBox(theme, this);
    m_advert->setFixedHeight(theme.px(120));
    side->addWidget(m_advert);
    auto* contact = new QHBoxLayout;
    contact->setSpacing(theme.px(24));
    const auto entry = [&](const QString& icon, QLabel* text) {
        auto* box = new QWidget(this);
        auto* line = new QHBoxLayout(box);
        line->setContentsMargins(0, 0, 0, 0);
        auto* sign = new QLabel(box);
        sign->setPixmap(theme.icon(icon, theme.px(24), Theme::Colour::Primary));
        line->addWidget(sign);
        text->setWordWrap(false);
        line->addWidget(text);
        contact->addWidget(box);
        return box;
    };
    contact->addStretch(1);
    m_telephone = entry(u"phone"_s, label(u"Label4Tel"_s, page.Label4Tel, "strong"));
    m_mail = entry(u"mail"_s, label(u"Label1"_s, page.Label1, "body"));
    contact->addStretch(1);
    side->addLayout(contact);
    row->addLayout(side, 5);
    frame().content()->addLayout(row, 1);

    m_start = new QPushButton(this);
    setRole(m_start, "main");
    m_start->setFocusPolicy(Qt::TabFocus);
    connect(m_start, &QPushButton::pressed, this, [this] { m_page.Image1_MouseDown(); });
    connect(m_start, &QPushButton::clicked, this, [this] {
        if (!isDetached())
            m_page.Image1_Click();
    });
    bind(u"Image1"_s, m_start, page.Image1);
    frame().addMainAction(m_start);
    frame().addStatus(label(u"Label7"_s, page.Label7, "muted"));
    frame().addStatus(label(u"Label6"_s, page.Label6, "large"));

    // The question at which shop the prints are fetched.
    m_shops = new Overlay(theme, this);
    m_ask = makeLabel(m_shops, "title");
    m_shops->column()->addWidget(m_ask);
    auto* list = new QListWidget(m_shops);
    list->setMinimumHeight(theme.px(170));
    connect(list, &QListWidget::itemClicked, this,
            [this, list](QListWidgetItem* item) { m_page.List1_Click(list->row(item)); });
    connect(list, &QListWidget::itemActivated, this,
            [this, list](QListWidgetItem* item) { m_page.List1_Click(list->row(item)); });
    bindList(u"List1"_s, page.List1, list);
    m_shops->column()->addWidget(list);
    m_shops->setFirstFocus(list);
    m_shopList = list;
    bind(u"Picture1"_s, new QWidget(m_shops), page.Picture1);

    m_hovers = {{m_start, hatchala::Hover::Image1},
                {prices, hatchala::Hover::Image11},
                {site, hatchala::Hover::Image5},
                {leave, hatchala::Hover::Image3}};
    for (const auto& [widget, over] : m_hovers)
        widget->installEventFilter(this);

    bindHidden(u"Label3"_s, page.Label3);
    bindHidden(u"Label4"_s, page.Label4);
    bindHidden(u"Label4Tel2"_s, page.Label4Tel2);
    bindHidden(u"Label8"_s, page.Label8);
    bindHidden(u"Image8"_s, page.Image8);
    bindHidden(u"Picture8"_s, page.Picture8);
    bindHidden(u"Label5"_s, page.Label5);
    bindList(u"List2"_s, page.List2);
    bindList(u"List4pices"_s, page.List4pices);
    start();
}

bool hatchalaView::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::Enter || event->type() == QEvent::Leave) {
        for (const auto& [widget, over] : m_hovers) {
            if (widget == watched && !isDetached())
                m_page.MouseMove(event->type() == QEvent::Enter ? over : hatchala::Hover::Nothing);
        }
    }
    return PageView::eventFilter(watched, event);
}

QWidget* hatchalaView::firstFocus() const {
    return m_start;
}

void hatchalaView::render() {
    setDirectedIcon(m_start, true);
    m_start->setLayoutDirection(state().english() ? Qt::RightToLeft : Qt::LeftToRight); // the arrow behind the word
    m_how->setText(wording(u"הדפסת תמונות בשלושה צעדים פשוטים:"_s, u"Printing pictures takes three simple steps:"_s));
    m_steps[0]->setText(wording(u"בוחרים תמונות מהמחשב, מכרטיס הזיכרון או מהמצלמה"_s,
                                u"Choose pictures from the computer, a memory card or a camera"_s));
    m_steps[1]->setText(wording(u"בוחרים גודל, סוג נייר וכמות"_s, u"Choose the size, the paper and how many"_s));
    m_steps[2]->setText(wording(u"התוכנה שולחת את ההזמנה למעבדה"_s, u"The program sends the order to the lab"_s));
    m_noticeBox->setVisible(m_page.Notice.visible && !m_page.Notice.text.isEmpty());
    m_telephone->setVisible(!m_page.Label4Tel.text.isEmpty());
    m_mail->setVisible(!m_page.Label1.text.isEmpty());
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
    const QString question = m_page.List1Caption.text.trimmed();
    m_ask->setText(!question.isEmpty()
                       ? question
                       : wording(u"היכן תרצה לקבל את התמונות?"_s, u"Where do you want to receive the pictures?"_s));
    speak(m_shops, m_ask->text());
    speak(m_shopList, m_ask->text());
    m_shops->setOpen(m_page.Picture1.visible);
}

} // namespace lumora
