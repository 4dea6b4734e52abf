#include "views/RedI/RedIView.h"

#include "common/DrivePath.h"
#include "session/SessionState.h"
#include "views/RedI/RedEyeCanvas.h"
#include "views/kit/Overlay.h"

#include <QEvent>
#include <QSignalBlocker>
#include <QSlider>
#include <QStyle>

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
    : HoldingView(page, state, theme) {
    frame().steps().setStep(OrderStep::Pictures);
    frame().setTitleVisible(false);
    QLabel* title = lineLabel(c.LabelTitle, "large");
    m_steps = new RedEyeSteps(theme, this);
    frame().content()->addLayout(inRow(Space::Wide, {title, {m_steps, 1}}));
    m_canvas = new RedEyeCanvas(page, theme, this);
    bind(u"Picture1"_s, m_canvas, [this] { return c.caption; });
    QWidget* side = makeSide();
    frame().content()->addLayout(
        across(Space::Wide, {side, {inColumn(Space::Small, {{m_canvas, 1}, makeOperator(), makeTools()}), 1}},
               Upright::LastOnTop),
        1);
    makeBars();
    makeOverPicture();
    makeMenu();
    makeHelp();
    start();
}

QWidget* RedIView::firstFocus() const {
    return m_canvas;
}

void RedIView::escape() {
    if (c.kofez.visible)
        m_page.kofez_Close();
    else if (c.FrameHelp.visible)
        m_page.CommandHelpClose_Click();
}

QWidget* RedIView::makeSide() {
    m_overview = new RedEyeOverview(m_page, theme(), *m_canvas, this);
    bind(u"Picture3"_s, m_overview, [this] { return c.caption; });
    const Card card = makeCard("card", Pad::Slim, Space::Tight);
    const Card notice = makeCard("notice", Pad::Tight);
    m_notice = notice.frame;
    m_guide = instruction(c.Label40);
    notice.column->addWidget(instruction(c.Label45));
    add(*card.column, {m_guide, instruction(c.Label41), instruction(c.Label44), m_notice, Item::room()});
    QWidget* pad = makePad();
    if (theme().isTall())
        return inBox(inRow(Space::Normal, {{m_overview, 0, Qt::AlignVCenter}, {card.frame, 1}, pad}));
    QWidget* side = inBox(inColumn(Space::Small, {{m_overview, 0, Qt::AlignHCenter}, {card.frame, 1}, pad}));
    // Larger letters break the guide into more lines, and the card can't become higher.
    side->setFixedWidth(theme().px(276 * theme().growth() * theme().growth()));
    return side;
}

QLabel* RedIView::instruction(const Caption& caption) {
    QLabel* made = words("small");
    bindName(made, caption);
    m_instructions.emplace_back(made, &caption);
    return made;
}

QPushButton* RedIView::bindSign(QPushButton* button, const char* icon, const Caption& caption) {
    button->setFocusPolicy(Qt::TabFocus);
    setIcon(button, QString::fromLatin1(icon), Theme::Colour::Ink);
    bindName(button, caption);
    m_signs.emplace_back(button, &caption);
    return button;
}

// The arrows round the middle, the two sizes in the upper corners. The pad is a map of the picture: it is not mirrored
// with the language.
QWidget* RedIView::makePad() {
    const struct {
        const Caption& caption;
        const char* role;
        const char* icon;
        void (RedI::*down)();
        void (RedI::*up)();
        int row, column;
    } keys[] = {
        {c.Image12, "sky", "arrow-up", &RedI::Image12_MouseDown, &RedI::Arrow_MouseUp, 0, 1},
        {c.Image13, "sky", "arrow-down", &RedI::Image13_MouseDown, &RedI::Arrow_MouseUp, 1, 1},
        {c.Image14, "sky", "arrow-left", &RedI::Image14_MouseDown, &RedI::Arrow_MouseUp, 1, 0},
        {c.Image15, "sky", "arrow-right", &RedI::Image15_MouseDown, &RedI::Arrow_MouseUp, 1, 2},
        {c.Image10, "violet", "redeye-smaller", &RedI::Image10_MouseDown, &RedI::Size_MouseUp, 0, 0},
        {c.Image11, "violet", "redeye-larger", &RedI::Image11_MouseDown, &RedI::Size_MouseUp, 0, 2},
    };
    QGridLayout* grid = inGrid(Space::Small);
    for (const auto& key : keys) {
        auto* made = new HoldButton(held(toPage(key.down), toPage(key.up)), this);
        setRole(made, key.role);
        grid->addWidget(bindSign(made, key.icon, key.caption), key.row, key.column);
        grid->setColumnStretch(key.column, 1);
    }
    return leftToRight(grid);
}

QLayout* RedIView::makeTools() {
    m_darken = button(c.Image6, Role::Secondary, &RedI::Image6_Click, u"redeye-darken"_s);
    m_darken->installEventFilter(this);
    return inRow(Space::Small,
                 {Item::room(), m_darken, button(c.Image16, Role::Secondary, &RedI::Image16_Click, u"redeye-deeper"_s),
                  button(c.Image2, Role::Main, &RedI::Image2_Click, u"redeye-correct"_s)});
}

// What the lab's people work and read; customers never see it.
QWidget* RedIView::makeOperator() {
    m_readout = words("smallMuted");
    m_check = words("small");
    m_check->setAutoFillBackground(true);
    bindName(m_check, c.Label6);
    m_level = new QSlider(Qt::Horizontal, this);
    m_level->setRange(0, RedIControls::HScroll1Max);
    connect(m_level, &QSlider::valueChanged, this, toPage(&RedI::HScroll1_Change));
    bind(u"HScroll1"_s, m_level, [this] { return QString::number(c.HScroll1); });
    m_operator =
        inBox(inColumn(Space::Small, {inRow(Space::Small, {{m_readout, 1}, m_check}),
                                      inRow(Space::Small, {{m_level, 1},
                                                           button(c.Command13, Role::Quiet, &RedI::Command13_Click),
                                                           button(c.Command6, Role::Quiet, &RedI::Command6_Click)})}));
    return m_operator;
}

void RedIView::makeBars() {
    frame().addHeaderAction(button(c.CommandHelp, Role::Quiet, &RedI::CommandHelp_Click, u"info"_s));
    frame().addSecondaryActions({button(c.Image9, Role::Secondary, &RedI::Image9_Click, u"close"_s),
                                 button(c.Image7, Role::Secondary, &RedI::Image7_Click, u"redeye-back"_s),
                                 button(c.Image5, Role::Secondary, &RedI::Image5_Click, u"eraser"_s)});
    frame().addMainAction(button(c.Image8, Role::Main, &RedI::Image8_Click, u"tick-white"_s));
}

void RedIView::makeOverPicture() {
    m_darkenBeside = button(c.Frame6, Role::Plain, &RedI::Frame6_Click, u"redeye-darken"_s);
    m_more = button(c.CommandMenu, Role::Plain, &RedI::kofez_Open, u"redeye-more"_s);
    const auto glass = [&](const Caption& caption, const char* icon, void (RedI::*clicked)()) {
        auto* made = new QPushButton(this);
        connect(made, &QPushButton::clicked, this, toPage(clicked));
        return bindSign(made, icon, caption);
    };
    m_closer = glass(c.CommandCloser, "redeye-closer", &RedI::CommandCloser_Click);
    m_further = glass(c.CommandFurther, "redeye-further", &RedI::CommandFurther_Click);
    const Card busy = makeCard("notice", Pad::Wide);
    m_busy = busy.frame;
    busy.column->addWidget(lineLabel(c.Label4Busy, "large"));
    for (QWidget* over : std::initializer_list<QWidget*>{m_darkenBeside, m_closer, m_further, m_more, m_busy})
        over->setParent(m_canvas);
    connect(m_canvas, &RedEyeCanvas::resized, this, &RedIView::placeOverPicture);
}

void RedIView::makeMenu() {
    m_menu = new Overlay(theme(), this);
    m_menu->column()->addWidget(echo(c.CommandMenu, "title"));
    const struct {
        const Caption& caption;
        void (RedI::*press)();
        const char* icon;
        Role role = Role::Plain;
    } items[] = {
        {c.Bsisi, &RedI::Bsisi_Click, "redeye-correct"},      {c.amok2, &RedI::amok2_Click, "redeye-correct"},
        {c.amok3, &RedI::amok3_Click, "redeye-correct"},      {c.amok4, &RedI::amok4_Click, "redeye-correct"},
        {c.amok5, &RedI::amok5_Click, "redeye-correct"},      {c.amok, &RedI::amok_Click, "redeye-deeper"},
        {c.Memokad, &RedI::Memokad_Click, "redeye-correct"},  {c.Command3, &RedI::Command3_Click, "redeye-smaller"},
        {c.Rstor, &RedI::Rstor_Click, "eraser", Role::Danger}};
    QGridLayout* grid = inGrid(Space::Normal);
    const auto place = [grid](QWidget* made) { grid->addWidget(made, grid->count() / 2, grid->count() % 2); };
    for (const auto& item : items)
        place(button(item.caption, item.role, item.press, QString::fromLatin1(item.icon)));
    QPushButton* back = button(c.CommandMenuClose, Role::Secondary, &RedI::kofez_Close);
    place(back);
    m_menu->column()->addLayout(grid);
    m_menu->setFirstFocus(back);
    m_menu->whenEscaped(toPage(&RedI::kofez_Close));
}

void RedIView::makeHelp() {
    m_help = new Overlay(theme(), this);
    m_helpText = words("muted");
    add(*m_help->column(), {label(c.FrameHelp, "title"), label(c.Label38), m_helpText});
    m_help->addButton(button(c.CommandHelpClose, Role::Main, &RedI::CommandHelpClose_Click));
    m_help->whenEscaped(toPage(&RedI::CommandHelpClose_Click));
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
    const int edge = theme().size(Space::Normal);
    for (QWidget* over : std::initializer_list<QWidget*>{m_darkenBeside, m_closer, m_further, m_more, m_busy})
        over->adjustSize();
    m_more->move(m_canvas->width() - m_more->width() - edge, edge);
    m_closer->move(edge, edge);
    m_further->move(edge + m_closer->width() + theme().size(Space::Small), edge);
    const QPoint wanted = m_canvas->onWidget(c.Frame6Place).toPoint();
    const QRect room = m_canvas->rect().adjusted(edge, edge, -edge, -edge);
    const int top = room.top() + m_closer->height() + edge;
    m_darkenBeside->move(
        std::clamp(wanted.x(), room.left(), std::max(room.left(), room.right() - m_darkenBeside->width())),
        std::clamp(wanted.y(), top, std::max(top, room.bottom() - m_darkenBeside->height())));
    m_busy->move((m_canvas->width() - m_busy->width()) / 2, (m_canvas->height() - m_busy->height()) / 2);
}

void RedIView::renderInstructions() {
    for (const auto& [label, caption] : m_instructions) {
        label->setText(isolated(linesOf(caption->text)));
        label->setVisible(caption->visible);
    }
    m_notice->setVisible(c.Label45.visible);
    // The longest of the instructions alone needs the small letters.
    const char* type = c.Label41.visible ? "small" : "body";
    if (m_guide->property("type") != QLatin1String(type)) {
        m_guide->setProperty("type", type);
        m_guide->style()->polish(m_guide);
    }
    m_helpText->setText(isolated(m_page.helpText()));
}

void RedIView::render() {
    m_steps->show(c.words.steps, m_page.stepNumber());
    m_overview->fit();
    m_canvas->update();
    speak(m_canvas, c.words.picture.arg(LeafName(c.caption)));
    speak(m_overview, c.words.overview);
    for (const auto& [sign, caption] : m_signs) {
        sign->setEnabled(caption->enabled);
        sign->setToolTip(caption->hint.isEmpty() ? caption->text : caption->hint);
        sign->setAccessibleName(caption->text);
    }
    renderInstructions();
    m_busy->setVisible(c.Label4Busy.visible);
    m_operator->setVisible(state().DegelEdit);
    m_readout->setText(isolated(m_page.readings()));
    QPalette check = palette();
    if (c.Label6Order != RedIControls::Order::Unknown)
        check.setColor(QPalette::Window, c.Label6Order == RedIControls::Order::InOrder ? Theme::Colour::GoodSoft
                                                                                       : Theme::Colour::SunSoft);
    m_check->setPalette(check);
    const QSignalBlocker quiet(m_level);
    m_level->setValue(c.HScroll1);
    speak(m_level, c.Label37.text);
    m_menu->setOpen(c.kofez.visible);
    m_help->setOpen(c.FrameHelp.visible);
    placeOverPicture();
}

} // namespace lumora
