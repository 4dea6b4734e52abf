#include "views/RedI/RedIView.h"

#include "common/DrivePathText.h"
#include "session/SessionState.h"
#include "views/RedI/RedEyeCanvas.h"
#include "views/kit/HoldButton.h"
#include "views/kit/Overlay.h"

#include <QEvent>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QSignalBlocker>
#include <QSlider>
#include <QStyle>
#include <QVBoxLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Without the blanks and empty lines that lead and trail: in a line from right to left they would push its first letter
// over the edge.
QString linesOf(const QString& text) {
    QStringList lines = text.trimmed().split(u'\n');
    for (QString& line : lines)
        line = line.trimmed();
    return lines.join(u'\n');
}

} // namespace

RedIView::RedIView(RedI& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page)
    , m_shows(page.controls()) {
    frame().steps().setStep(OrderStep::Pictures);
    frame().setTitleVisible(false);

    auto* top = new QHBoxLayout;
    top->setSpacing(theme.px(20));
    auto* title = label(u"LabelTitle"_s, m_shows.LabelTitle, "large");
    title->setWordWrap(false);
    top->addWidget(title);
    m_steps = new RedEyeSteps(theme, this);
    top->addWidget(m_steps, 1);
    frame().content()->addLayout(top);

    auto* row = new QHBoxLayout;
    row->setSpacing(theme.px(18));
    m_canvas = new RedEyeCanvas(page, theme, this);
    bind(u"Picture1"_s, m_canvas, [this] { return m_shows.caption; });
    row->addWidget(makeSide());
    auto* work = new QVBoxLayout;
    work->setSpacing(theme.px(10));
    work->addWidget(m_canvas, 1);
    work->addWidget(makeOperator());
    work->addLayout(makeTools());
    row->addLayout(work, 1);
    frame().content()->addLayout(row, 1);

    auto* help = button(
        u"CommandHelp"_s, m_shows.CommandHelp, Role::Quiet, [&page] { page.CommandHelp_Click(); }, u"info"_s);
    frame().addHeaderAction(help);
    frame().addSecondaryAction(button(
        u"Image9"_s, m_shows.Image9, Role::Secondary, [&page] { page.Image9_Click(); }, u"close"_s));
    frame().addSecondaryAction(button(
        u"Image7"_s, m_shows.Image7, Role::Secondary, [&page] { page.Image7_Click(); }, u"redeye-back"_s));
    frame().addSecondaryAction(button(
        u"Image5"_s, m_shows.Image5, Role::Secondary, [&page] { page.Image5_Click(); }, u"eraser"_s));
    m_accept = button(
        u"Image8"_s, m_shows.Image8, Role::Main, [&page] { page.Image8_Click(); }, u"tick-white"_s);
    frame().addMainAction(m_accept);

    m_darkenBeside = button(
        u"Frame6"_s, m_shows.Frame6, Role::Plain, [&page] { page.Frame6_Click(); }, u"redeye-darken"_s);
    m_more = button(
        u"CommandMenu"_s, m_shows.CommandMenu, Role::Plain, [&page] { page.kofez_Open(); }, u"redeye-more"_s);
    m_closer = new QPushButton(this);
    connect(m_closer, &QPushButton::clicked, this, [&page] { page.CommandCloser_Click(); });
    bindSign(u"CommandCloser"_s, m_closer, u"redeye-closer"_s, m_shows.CommandCloser);
    m_further = new QPushButton(this);
    connect(m_further, &QPushButton::clicked, this, [&page] { page.CommandFurther_Click(); });
    bindSign(u"CommandFurther"_s, m_further, u"redeye-further"_s, m_shows.CommandFurther);
    for (QPushButton* over : {m_darkenBeside, m_closer, m_further, m_more})
        over->setParent(m_canvas);
    m_busy = new QFrame(m_canvas);
    setRole(m_busy, "notice");
    auto* wait = new QVBoxLayout(m_busy);
    wait->setContentsMargins(theme.px(26), theme.px(18), theme.px(26), theme.px(18));
    auto* waiting = label(u"Label4Busy"_s, m_shows.Label4Busy, "large");
    waiting->setWordWrap(false);
    wait->addWidget(waiting);
    connect(m_canvas, &RedEyeCanvas::resized, this, &RedIView::placeOverPicture);

    makeMenu();
    makeHelp();
    bindTheRest();
    start();
}

QWidget* RedIView::firstFocus() const {
    return m_canvas;
}

void RedIView::escape() {
    if (m_shows.kofez.visible)
        m_page.kofez_Close();
    else if (m_shows.FrameHelp.visible)
        m_page.CommandHelpClose_Click();
}

QWidget* RedIView::makeSide() {
    auto* side = new QWidget(this);
    side->setFixedWidth(theme().px(276));
    auto* column = new QVBoxLayout(side);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(theme().px(10));

    m_overview = new RedEyeOverview(m_page, theme(), *m_canvas, side);
    bind(u"Picture3"_s, m_overview, [this] { return m_shows.caption; });
    column->addWidget(m_overview, 0, Qt::AlignHCenter);

    auto* card = new QFrame(side);
    setRole(card, "card");
    auto* wordsColumn = new QVBoxLayout(card);
    wordsColumn->setContentsMargins(theme().px(14), theme().px(8), theme().px(14), theme().px(8));
    wordsColumn->setSpacing(theme().px(4));
    m_guide = words(u"Label40"_s, m_shows.Label40);
    wordsColumn->addWidget(m_guide);
    wordsColumn->addWidget(words(u"Label41"_s, m_shows.Label41));
    wordsColumn->addWidget(words(u"Label44"_s, m_shows.Label44));
    m_notice = new QFrame(card);
    setRole(m_notice, "notice");
    auto* noticeColumn = new QVBoxLayout(m_notice);
    noticeColumn->setContentsMargins(theme().px(12), theme().px(6), theme().px(12), theme().px(6));
    noticeColumn->addWidget(words(u"Label45"_s, m_shows.Label45));
    wordsColumn->addWidget(m_notice);
    wordsColumn->addStretch(1);
    column->addWidget(card, 1);
    column->addLayout(makePad());
    return side;
}

QLabel* RedIView::words(const QString& name, const Caption& caption) {
    auto* made = makeLabel(this, "small");
    bind(name, made, [&caption] { return caption.text; });
    m_words.emplace_back(made, &caption);
    return made;
}

HoldButton* RedIView::hold(const QString& name, const Caption& caption, const char* role, const QString& icon,
                           std::function<void()> down, std::function<void()> up) {
    RedI& page = m_page;
    auto* made = new HoldButton({std::move(down), [&page] { page.tickOnceIfNone(); }, std::move(up)}, this);
    setRole(made, role);
    bindSign(name, made, icon, caption);
    return made;
}

void RedIView::bindSign(const QString& name, QPushButton* button, const QString& icon, const Caption& caption) {
    button->setFocusPolicy(Qt::TabFocus);
    setIcon(button, icon, Theme::Colour::Ink);
    bind(name, button, [&caption] { return caption.text; });
    m_signs.emplace_back(button, &caption);
}

// The arrows round the middle, the two sizes in the upper corners. The pad is a map of the picture: it is not mirrored
// with the language.
QLayout* RedIView::makePad() {
    RedI& page = m_page;
    const auto arrowUp = [&page] { page.Arrow_MouseUp(); };
    const auto sized = [&page] { page.Size_MouseUp(); };
    auto* up = hold(
        u"Image12"_s, m_shows.Image12, "sky", u"arrow-up"_s, [&page] { page.Image12_MouseDown(); }, arrowUp);
    auto* down = hold(
        u"Image13"_s, m_shows.Image13, "sky", u"arrow-down"_s, [&page] { page.Image13_MouseDown(); }, arrowUp);
    auto* left = hold(
        u"Image14"_s, m_shows.Image14, "sky", u"arrow-left"_s, [&page] { page.Image14_MouseDown(); }, arrowUp);
    auto* right = hold(
        u"Image15"_s, m_shows.Image15, "sky", u"arrow-right"_s, [&page] { page.Image15_MouseDown(); }, arrowUp);
    auto* smaller = hold(
        u"Image10"_s, m_shows.Image10, "violet", u"redeye-smaller"_s, [&page] { page.Image10_MouseDown(); }, sized);
    auto* larger = hold(
        u"Image11"_s, m_shows.Image11, "violet", u"redeye-larger"_s, [&page] { page.Image11_MouseDown(); }, sized);
    auto* pad = new QWidget(this);
    pad->setLayoutDirection(Qt::LeftToRight);
    auto* grid = new QGridLayout(pad);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setSpacing(theme().px(6));
    grid->addWidget(smaller, 0, 0);
    grid->addWidget(up, 0, 1);
    grid->addWidget(larger, 0, 2);
    grid->addWidget(left, 1, 0);
    grid->addWidget(down, 1, 1);
    grid->addWidget(right, 1, 2);
    for (int i = 0; i < 3; ++i)
        grid->setColumnStretch(i, 1);
    auto* row = new QHBoxLayout;
    row->addWidget(pad);
    return row;
}

QLayout* RedIView::makeTools() {
    RedI& page = m_page;
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().px(10));
    row->addStretch(1);
    m_darken = button(
        u"Image6"_s, m_shows.Image6, Role::Secondary, [&page] { page.Image6_Click(); }, u"redeye-darken"_s);
    m_darken->installEventFilter(this);
    row->addWidget(m_darken);
    row->addWidget(button(
        u"Image16"_s, m_shows.Image16, Role::Secondary, [&page] { page.Image16_Click(); }, u"redeye-deeper"_s));
    m_correct = button(
        u"Image2"_s, m_shows.Image2, Role::Main, [&page] { page.Image2_Click(); }, u"redeye-correct"_s);
    row->addWidget(m_correct);
    return row;
}

// What the lab's people work and read; customers never see it.
QWidget* RedIView::makeOperator() {
    RedI& page = m_page;
    m_operator = new QWidget(this);
    auto* column = new QVBoxLayout(m_operator);
    column->setContentsMargins(0, 0, 0, 0);
    auto* readings = new QHBoxLayout;
    auto* row = new QHBoxLayout;
    column->addLayout(readings);
    column->addLayout(row);
    m_readout = makeLabel(m_operator, "smallMuted");
    readings->addWidget(m_readout, 1);
    m_check = makeLabel(m_operator, "small");
    m_check->setAutoFillBackground(true);
    bind(u"Label6"_s, m_check, [this] { return m_shows.Label6.text; });
    readings->addWidget(m_check);
    m_level = new QSlider(Qt::Horizontal, m_operator);
    m_level->setRange(0, RedIControls::HScroll1Max);
    connect(m_level, &QSlider::valueChanged, this, [&page](int value) { page.HScroll1_Change(value); });
    bind(u"HScroll1"_s, m_level, [this] { return QString::number(m_shows.HScroll1); });
    row->addWidget(m_level, 1);
    row->addWidget(button(u"Command13"_s, m_shows.Command13, Role::Quiet, [&page] { page.Command13_Click(); }));
    row->addWidget(button(u"Command6"_s, m_shows.Command6, Role::Quiet, [&page] { page.Command6_Click(); }));
    return m_operator;
}

void RedIView::makeMenu() {
    RedI& page = m_page;
    m_menu = new Overlay(theme(), this);
    m_menu->column()->addWidget(label(u"CommandMenuTitle"_s, m_shows.CommandMenu, "title"));
    auto* grid = new QGridLayout;
    grid->setSpacing(theme().px(10));
    const struct {
        const char* name;
        const Caption& caption;
        void (RedI::*press)();
        const char* icon;
        Role role = Role::Plain;
    } items[] = {{"Bsisi", m_shows.Bsisi, &RedI::Bsisi_Click, "redeye-correct"},
                 {"amok2", m_shows.amok2, &RedI::amok2_Click, "redeye-correct"},
                 {"amok3", m_shows.amok3, &RedI::amok3_Click, "redeye-correct"},
                 {"amok4", m_shows.amok4, &RedI::amok4_Click, "redeye-correct"},
                 {"amok5", m_shows.amok5, &RedI::amok5_Click, "redeye-correct"},
                 {"amok", m_shows.amok, &RedI::amok_Click, "redeye-deeper"},
                 {"Memokad", m_shows.Memokad, &RedI::Memokad_Click, "redeye-correct"},
                 {"Command3", m_shows.Command3, &RedI::Command3_Click, "redeye-smaller"},
                 {"Rstor", m_shows.Rstor, &RedI::Rstor_Click, "eraser", Role::Danger}};
    int place = 0;
    for (const auto& item : items) {
        const auto press = [&page, handler = item.press] { (page.*handler)(); };
        grid->addWidget(
            button(QString::fromLatin1(item.name), item.caption, item.role, press, QString::fromLatin1(item.icon)),
            place / 2, place % 2);
        ++place;
    }
    auto* back =
        button(u"CommandMenuClose"_s, m_shows.CommandMenuClose, Role::Secondary, [&page] { page.kofez_Close(); });
    grid->addWidget(back, place / 2, place % 2);
    m_menu->column()->addLayout(grid);
    m_menu->setFirstFocus(back);
    connect(m_menu, &Overlay::escaped, this, [&page] { page.kofez_Close(); });
}

void RedIView::makeHelp() {
    RedI& page = m_page;
    m_help = new Overlay(theme(), this);
    m_help->column()->addWidget(label(u"FrameHelp"_s, m_shows.FrameHelp, "title"));
    m_help->column()->addWidget(label(u"Label38"_s, m_shows.Label38));
    m_helpText = makeLabel(m_help, "muted");
    m_help->column()->addWidget(m_helpText);
    auto* close =
        button(u"CommandHelpClose"_s, m_shows.CommandHelpClose, Role::Main, [&page] { page.CommandHelpClose_Click(); });
    m_help->column()->addWidget(close, 0, Qt::AlignTrailing);
    m_help->setFirstFocus(close);
    connect(m_help, &Overlay::escaped, this, [&page] { page.CommandHelpClose_Click(); });
}

void RedIView::bindTheRest() {
    bindHidden(u"kofez"_s, m_shows.kofez);
    bindHidden(u"RedTargetRectangle"_s, m_shows.RedTargetRectangle);
    bindHidden(u"Image1"_s, m_shows.Image1);
    const std::pair<const char*, const Caption*> operators[] = {
        {"Label1", &m_shows.Label1},   {"Label2", &m_shows.Label2},   {"Label3", &m_shows.Label3},
        {"Label12", &m_shows.Label12}, {"Label13", &m_shows.Label13}, {"Label16", &m_shows.Label16},
        {"Label17", &m_shows.Label17}, {"Label24", &m_shows.Label24}, {"Label25", &m_shows.Label25},
        {"Label27", &m_shows.Label27}, {"Label28", &m_shows.Label28}, {"Label30", &m_shows.Label30},
        {"Label31", &m_shows.Label31}, {"Label37", &m_shows.Label37}, {"Label42", &m_shows.Label42},
        {"Label43", &m_shows.Label43}, {"Rlbl", &m_shows.Rlbl},       {"Glbl", &m_shows.Glbl},
        {"Blbl", &m_shows.Blbl}};
    for (const auto& [name, caption] : operators)
        bindHidden(QString::fromLatin1(name), *caption);
    bindList(u"List1"_s, m_shows.List1);
    bindList(u"List2"_s, m_shows.List2);
    bindList(u"Combo1"_s, m_shows.Combo1);
}

bool RedIView::eventFilter(QObject* watched, QEvent* event) {
    if (watched == m_darken && event->type() == QEvent::Enter && m_darken->isEnabled() && !isDetached())
        m_page.Image6_MouseMove();
    return PageView::eventFilter(watched, event);
}

// What lies over the picture: the two glasses in an upper corner, the darkening button beside the patch, what the
// customer waits for in the middle.
void RedIView::placeOverPicture() {
    if (isDetached() || !m_busy)
        return;
    const int edge = theme().px(10);
    m_more->adjustSize();
    m_more->move(m_canvas->width() - m_more->width() - edge, edge);
    int x = edge;
    for (QPushButton* glass : {m_closer, m_further}) {
        glass->adjustSize();
        glass->move(x, edge);
        x += glass->width() + theme().px(6);
    }
    m_darkenBeside->adjustSize();
    const QPointF wanted = m_canvas->onWidget(m_shows.Frame6Place);
    const QRect room = m_canvas->rect().adjusted(edge, edge, -edge, -edge);
    m_darkenBeside->move(
        std::clamp(static_cast<int>(wanted.x()), room.left(),
                   std::max(room.left(), room.right() - m_darkenBeside->width())),
        std::clamp(static_cast<int>(wanted.y()), room.top() + m_closer->height() + edge,
                   std::max(room.top() + m_closer->height() + edge, room.bottom() - m_darkenBeside->height())));
    m_busy->adjustSize();
    m_busy->move((m_canvas->width() - m_busy->width()) / 2, (m_canvas->height() - m_busy->height()) / 2);
}

void RedIView::render() {
    m_steps->show(m_shows.words.steps, m_page.stepNumber());
    m_overview->fit();
    m_canvas->update();
    speak(m_canvas, m_shows.words.picture.arg(LeafName(m_shows.caption)));
    speak(m_overview, m_shows.words.overview);
    for (const auto& [sign, caption] : m_signs) {
        sign->setEnabled(caption->enabled);
        sign->setToolTip(caption->hint.isEmpty() ? caption->text : caption->hint);
        sign->setAccessibleName(caption->text);
    }
    for (const auto& [label, caption] : m_words) {
        label->setText(isolated(linesOf(caption->text)));
        label->setVisible(caption->visible);
    }
    // The longest of the instructions alone needs the small letters.
    const char* type = m_shows.Label41.visible ? "small" : "body";
    if (m_guide->property("type") != QLatin1String(type)) {
        m_guide->setProperty("type", type);
        m_guide->style()->polish(m_guide);
    }
    m_busy->setVisible(m_shows.Label4Busy.visible);
    m_notice->setVisible(m_shows.Label45.visible);
    m_operator->setVisible(state().DegelEdit);
    m_readout->setText(isolated(m_page.readings()));
    QPalette check = palette();
    if (m_shows.Label6Order != RedIControls::Order::Unknown)
        check.setColor(QPalette::Window, m_shows.Label6Order == RedIControls::Order::InOrder ? Theme::Colour::GoodSoft
                                                                                             : Theme::Colour::SunSoft);
    m_check->setPalette(check);
    const QSignalBlocker quiet(m_level);
    m_level->setValue(m_shows.HScroll1);
    speak(m_level, m_shows.Label37.text);
    m_helpText->setText(isolated(m_page.helpText()));
    m_menu->setOpen(m_shows.kofez.visible);
    m_help->setOpen(m_shows.FrameHelp.visible);
    placeOverPicture();
}

} // namespace lumora
