#include "views/tFrmNew/tFrmNewView.h"

#include "common/DrivePath.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "views/kit/Overlay.h"
#include "views/kit/ToolButton.h"
#include "views/picture/ResolutionBadge.h"
#include "views/tFrmNew/EditorPaper.h"
#include "views/tFrmNew/FilmStrip.h"
#include "views/tFrmNew/FrameThumbs.h"

#include <QCheckBox>
#include <QComboBox>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr QSizeF wide{90, 62};      // two in a row of a group
constexpr QSizeF narrow{56, 60};    // three in a row
constexpr double columnWidth = 206; // of a group of tools

} // namespace

tFrmNewView::tFrmNewView(tFrmNew& page, PageChain& chain, const SessionState& state, const Theme& theme)
    : HoldingView(page, state, theme)
    , m_chain(chain) {
    frame().steps().setStep(OrderStep::Pictures);
    frame().setTitleVisible(false);
    frame().content()->setContentsMargins(theme.margins(Pad::Slim));
    frame().content()->setSpacing(theme.size(Space::Small));
    m_nearTools = makeTools();
    m_table = new EditorTable(page, theme, this);
    connect(m_table, &EditorTable::resized, this, &tFrmNewView::placePanels);
    bind(u"PicPic"_s, &m_table->paper(), [this] { return c.Title.text; });
    bindName(m_table->paper().captionBox(), c.Labeltext);
    m_farTools = makeFramesAndMore();
    m_strip = makeStrip();
    m_behindPanel = new QWidget(this);
    m_behindPanel->hide();
    if (theme.isTall())
        add(*frame().content(),
            {{m_table, 1}, inRow(Space::Small, {{m_nearTools, 1}, {m_farTools, 1}}), m_strip, m_behindPanel});
    else
        add(*frame().content(),
            {{inRow(Space::Small, {m_nearTools, {m_table, 1}, m_farTools}), 1}, m_strip, m_behindPanel});
    makeTonePanel();
    makeTurnPanel();
    makeBars();
    makeOperatorPanel();
    makeHints();
    listenToPictures();
    start();
}

// --- makers ---

QFrame* tFrmNewView::group(const Caption& title, std::initializer_list<Item> items) {
    const Card card = makeCard("card", Pad::Tight, Space::Tight);
    card.column->addWidget(lineLabel(title, "smallMuted"));
    add(*card.column, items);
    return card.frame;
}

ToolButton* tFrmNewView::tool(const Caption& caption, const QString& icon, QSizeF size, std::function<void()> clicked) {
    auto* made = new ToolButton(theme(), icon, size, this);
    connect(made, &QPushButton::clicked, this, [clicked = std::move(clicked)] { clicked(); });
    bind(made, caption);
    m_hintLines.emplace_back(nullptr, &caption);
    return made;
}

ToolButton* tFrmNewView::heldTool(const Caption& caption, const QString& icon, QSizeF size, std::function<void()> down,
                                  std::function<void()> up) {
    auto* made = new ToolButton(theme(), icon, size, this, held(std::move(down), std::move(up)));
    bind(made, caption);
    m_hintLines.emplace_back(nullptr, &caption);
    return made;
}

ToolButton* tFrmNewView::zoomOrLight(int index, const QString& icon, QSizeF size) {
    ToolButton* made = heldTool(
        c.Image2[static_cast<std::size_t>(index)], icon, size, [this, index] { m_page.Image2_MouseDown(index); },
        [this, index] { m_page.Image2_MouseUp(index); });
    made->installEventFilter(this);
    return made;
}

ToolButton* tFrmNewView::colour(int index, const QString& icon, QColor ink) {
    ToolButton* made =
        tool(c.Image2[static_cast<std::size_t>(index)], icon, narrow, [this, index] { m_page.Image2_Click(index); });
    made->setInk(ink);
    made->installEventFilter(this);
    return made;
}

QWidget* tFrmNewView::makeTools() {
    QFrame* place = group(c.placeTitle, {makePlace()});
    QFrame* light = group(c.lightTitle, {makeLight()});
    QFrame* turns = group(c.turnTitle, {makeTurns()});
    QWidget* box = inBox(inColumn(Space::Small, {place, light, turns, Item::room()}));
    if (!theme().isTall())
        box->setFixedWidth(theme().px(columnWidth));
    return box;
}

// Left is left in both languages.
QWidget* tFrmNewView::makePlace() {
    QGridLayout* cross = inGrid(Space::Tight);
    const auto move = [&](const Caption& caption, const QString& icon, Click down, Click up, int row, int column) {
        cross->addWidget(heldTool(caption, icon, narrow, toPage(down), toPage(up)), row, column);
    };
    m_zoomIn = zoomOrLight(0, u"zoom-in"_s, narrow);
    cross->addWidget(zoomOrLight(1, u"zoom-out"_s, narrow), 0, 0);
    cross->addWidget(m_zoomIn, 0, 2);
    move(c.Image125, u"arrow-up"_s, &tFrmNew::Image125_MouseDown, &tFrmNew::Image125_MouseUp, 0, 1);
    move(c.Image115, u"arrow-left"_s, &tFrmNew::Image115_MouseDown, &tFrmNew::Image115_MouseUp, 1, 0);
    m_zoom = oneLine("large");
    m_zoom->setAlignment(Qt::AlignCenter);
    bindName(m_zoom, c.Label11);
    cross->addWidget(m_zoom, 1, 1);
    move(c.Image135, u"arrow-right"_s, &tFrmNew::Image135_MouseDown, &tFrmNew::Image135_MouseUp, 1, 2);
    move(c.Image145, u"arrow-down"_s, &tFrmNew::Image145_MouseDown, &tFrmNew::Image145_MouseUp, 2, 1);
    for (int i = 0; i < 3; ++i)
        cross->setColumnStretch(i, 1);
    return leftToRight(cross);
}

QLayout* tFrmNewView::makeTurns() {
    m_turn = tool(c.Image15, u"quarter-right"_s, wide, [this] {
        m_page.Image15_Click();
        m_page.Image15_MouseMove();
    });
    m_turn->installEventFilter(this);
    // A finger does not hover, so this button opens the panel without a turn.
    m_fineTurn = new ToolButton(theme(), u"turn-fine"_s, wide, this);
    bind(m_fineTurn, c.Frame4Opener);
    connect(m_fineTurn, &QPushButton::clicked, this,
            [this] { c.Frame4.visible ? m_page.Image2_MouseMove() : m_page.Image15_MouseMove(); });
    return inRow(Space::Tight, {m_turn, m_fineTurn});
}

QLayout* tFrmNewView::makeLight() {
    QGridLayout* grid = inGrid(Space::Tight);
    ToolButton* improve = tool(c.CommandImprove, u"improve"_s, narrow, &tFrmNew::CommandImprove_Click);
    improve->setInk(Theme::Colour::Primary);
    grid->addWidget(improve, 0, 0);
    grid->addWidget(zoomOrLight(3, u"darker"_s, narrow), 0, 1);
    grid->addWidget(zoomOrLight(4, u"lighter"_s, narrow), 0, 2);
    grid->addWidget(colour(6, u"drop"_s, QColor(0xC8, 0x3A, 0x32)), 1, 0);
    grid->addWidget(colour(10, u"drop"_s, QColor(0x2F, 0x5F, 0xA8)), 1, 1);
    grid->addWidget(colour(8, u"drop-off"_s, Theme::Colour::Ink), 1, 2);
    for (int i = 0; i < 3; ++i)
        grid->setColumnStretch(i, 1);
    return grid;
}

QWidget* tFrmNewView::makeFramesAndMore() {
    const Card more = makeCard("card", Pad::Tight);
    m_tones = tool(c.Image13, u"tones"_s, narrow, [this] { pressTones(); });
    m_tones->installEventFilter(this);
    more.column->addLayout(inRow(Space::Tight, {m_tones, tool(c.Command8, u"text"_s, narrow, &tFrmNew::Command8_Click),
                                                colour(7, u"eye"_s, QColor(0xB2, 0x32, 0x2A))}));
    m_moreTools = more.frame;

    m_categories = comboBox(c.Combo4List, c.Combo4, toPage(&tFrmNew::Combo4_Click));
    m_categories->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_frames = new FrameThumbs(
        theme(), [this](int row) { return m_page.framePicture(row); }, this);
    bindList(m_frames, c.Combo2List);
    connect(m_frames, &FrameThumbs::picked, this, toPage(&tFrmNew::Combo2_Click));
    QLayout* steps = makeFrameSteps();
    QLayout* use = inRow(Space::Tight, {tool(c.Image22, u"frame"_s, wide, &tFrmNew::Image22_Click),
                                        tool(c.Image28, u"frame-off"_s, wide, &tFrmNew::Image28_Click)});
    m_frameTools =
        group(c.framesTitle,
              {m_categories, {m_frames, 1}, steps, use, checkBox(c.Misgerett, toPage(&tFrmNew::Misgerett_Click))});
    QSizePolicy keepsItsPlace = m_frameTools->sizePolicy();
    keepsItsPlace.setRetainSizeWhenHidden(true);
    m_frameTools->setSizePolicy(keepsItsPlace);
    QWidget* box = inBox(inColumn(Space::Small, {m_moreTools, {m_frameTools, 1}}));
    if (!theme().isTall())
        box->setFixedWidth(theme().px(columnWidth));
    return box;
}

QLayout* tFrmNewView::makeFrameSteps() {
    const auto step = [&](const Caption& caption, Click clicked) {
        QPushButton* made = button(caption, Role::Plain, clicked);
        setRole(made, "round");
        made->setFixedSize(theme().key(), theme().key());
        m_hintLines.emplace_back(nullptr, &caption);
        return made;
    };
    m_previous = step(c.Image21, &tFrmNew::Image21_Click);
    m_position = oneLine("strong");
    bindName(m_position, c.Label6);
    // "3 / 8" reads from left to right.
    QWidget* numbers =
        leftToRight(inRow(Space::None, {Item::room(), m_position, lineLabel(c.Label5, "strong"), Item::room()}));
    m_next = step(c.Image20, &tFrmNew::Image20_Click);
    return inRow(Space::Tight, {m_previous, {numbers, 1}, m_next});
}

// The small pictures run from left to right in both languages, as on the page of pictures.
QWidget* tFrmNewView::makeStrip() {
    QHBoxLayout* row = inRow(Space::Small);
    for (int i = 0; i < static_cast<int>(cellsOfPage); ++i) {
        auto* cell = new StripCell(theme(), this);
        m_cells[static_cast<std::size_t>(i)] = cell;
        connect(cell, &QAbstractButton::clicked, this, [this, i] {
            if (m_pictures)
                m_pictures->Picture1_Click(i);
        });
        bind(u"Strip(%1)"_s.arg(i), cell,
             [this, i] { return m_pictures ? m_pictures->controls().List2.item(i) : QString(); });
        row->addWidget(cell, 1);
    }
    return leftToRight(row);
}

void tFrmNewView::makeBars() {
    m_undo = button(c.Image2[5], Role::Secondary, &tFrmNew::Image2_Click, 5, u"undo"_s);
    m_undo->installEventFilter(this);
    m_undo->setMouseTracking(true);
    m_hintLines.emplace_back(nullptr, &c.Image2[5]);
    frame().addSecondaryAction(m_undo);
    m_help = button(c.Image29, Role::Quiet, &tFrmNew::Image29_Click, u"info"_s);
    frame().addHeaderAction(m_help);
    m_name = oneLine("muted");
    bindName(m_name, c.Title);
    m_resolution = new ResolutionBadge(theme(), this);
    bind(m_resolution, c.resolution);
    frame().addStatus({m_name, Space::Normal, m_resolution});
    m_done = button(c.CommandDone, Role::Main, &tFrmNew::CommandDone_Click);
    frame().addMainAction(m_done);
}

// --- what the page says ---

void tFrmNewView::listenToPictures() {
    auto* pictures = m_chain.find<kyoskNew>();
    if (pictures == m_pictures)
        return;
    m_pictures = pictures;
    if (pictures)
        connect(pictures, &Page::changed, this, [this] {
            if (!isDetached())
                renderStrip();
        });
}

void tFrmNewView::renderStrip() {
    for (std::size_t i = 0; i < m_cells.size(); ++i) {
        StripCell::Look look;
        QString name;
        if (m_pictures) {
            const CellPicture& cell = m_pictures->controls().Picture1[i];
            name = LeafName(cell.text);
            look.filled = !cell.text.isEmpty();
            look.picture = cell.visible ? cell.bitmap.image() : QImage();
            look.ordered = m_pictures->controls().Picture4[i].visible;
            look.open = m_pictures->openCell() == static_cast<int>(i);
        }
        m_cells[i]->show(look);
        speak(m_cells[i], !look.filled ? c.words.emptyCell
                          : look.open  ? c.words.openCell.arg(name)
                                       : c.words.otherCell.arg(name));
    }
}

void tFrmNewView::render() {
    listenToPictures();
    m_zoom->setText(isolated(c.Label11.text + u'%'));
    m_angle->setText(isolated(u"%1°"_s.arg(m_page.turnDegrees())));
    m_position->setText(c.Label6.text.isEmpty() ? u"–  / "_s : c.Label6.text);
    m_frames->setWorn(m_page.frameOnPicture());
    speak(m_categories, c.words.categories);
    speak(m_frames, c.words.framesOfCategory);
    speak(m_lineStyles, c.words.lineStyles);
    speak(m_operator, c.words.operatorPanel);
    for (const auto& [step, caption, way] :
         {std::tuple(m_next, &c.Image20, Way::Forwards), std::tuple(m_previous, &c.Image21, Way::Back)}) {
        step->setText({});
        setDirectedIcon(step, way);
        speak(step, caption->text);
    }
    renderStrip();
    renderHints();
    const bool uncovered = m_covered == 0;
    m_nearTools->setVisible(uncovered && c.Picture3.visible);
    m_farTools->setVisible(uncovered && c.Picture3.visible);
    m_frameTools->setVisible(!c.Frame3.visible); // the tones lie in their place
    m_strip->setVisible(uncovered);
    m_help->setVisible(uncovered); // a panel would cover the button that closes the hints
    m_undo->setVisible(c.Picture3.visible);
    m_name->setText(fromLeft(m_name->fontMetrics().elidedText(c.Title.text, Qt::ElideMiddle, theme().px(260))));
    m_operator->setVisible(uncovered && state().DegelEdit);
    if (!uncovered)
        m_operatorPanel->hide();
    m_resolution->display(c.resolution);
    m_tonesPressed = m_tonesPressed && c.Frame3.visible;
    m_table->render(c.Image19.visible ? c.Image19.text : QString());
    placePanels();
}

void tFrmNewView::setCoveredHeight(int pixels) {
    // What lies above the bottom bar; the bar itself is covered as well.
    const QWidget* body = frame().content()->parentWidget();
    const int bar = height() - body->mapTo(this, QPoint(0, body->height())).y();
    const int room = pixels == 0 ? 0 : std::max(1, pixels - bar);
    if (m_covered == room)
        return;
    m_covered = room;
    m_behindPanel->setFixedHeight(std::max(1, room));
    m_behindPanel->setVisible(room > 0);
    if (!isDetached())
        render();
}

QWidget* tFrmNewView::firstFocus() const {
    return c.Picture3.visible ? static_cast<QWidget*>(m_zoomIn) : m_done;
}

void tFrmNewView::escape() {
    if (c.Frame3.visible || c.Frame4.visible) {
        QPushButton* opener = c.Frame3.visible ? m_tones : m_fineTurn;
        m_page.Image2_MouseMove();
        opener->setFocus(Qt::OtherFocusReason);
    } else {
        m_page.CommandDone_Click();
    }
}

void tFrmNewView::hideEvent(QHideEvent* event) {
    if (!isDetached())
        m_page.stopHolds();
    PageView::hideEvent(event);
}

void tFrmNewView::resizeEvent(QResizeEvent* event) {
    PageView::resizeEvent(event);
    placePanels();
}

} // namespace lumora
