#include "views/tFrmNew/tFrmNewView.h"

#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "views/kit/Overlay.h"
#include "views/kit/ToolButton.h"
#include "views/tFrmNew/EditorPaper.h"
#include "views/tFrmNew/FilmStrip.h"
#include "views/tFrmNew/FrameThumbs.h"

#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QMouseEvent>
#include <QPushButton>
#include <QVBoxLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr QSizeF wide{90, 62};      // two in a row of a group
constexpr QSizeF narrow{56, 60};    // three in a row
constexpr double columnWidth = 206; // of a group of tools

} // namespace

tFrmNewView::tFrmNewView(tFrmNew& page, PageChain& chain, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page)
    , m_shows(page.controls())
    , m_chain(chain) {
    frame().steps().setStep(OrderStep::Pictures);
    frame().setTitleVisible(false);
    auto* content = frame().content();
    content->setContentsMargins(theme.px(14), theme.px(8), theme.px(14), theme.px(8));
    content->setSpacing(theme.px(8));
    auto* row = new QHBoxLayout;
    row->setSpacing(theme.px(10));
    m_nearTools = makePlaceAndLight();
    row->addWidget(m_nearTools);
    m_table = new EditorTable(page, theme, this);
    bind(u"PicPic"_s, &m_table->paper(), [this] { return m_shows.Title.text; });
    bind(u"Labeltext"_s, m_table->paper().captionBox(), [this] { return m_shows.Labeltext.text; });
    row->addWidget(m_table, 1);
    m_farTools = makeFramesAndMore();
    row->addWidget(m_farTools);
    content->addLayout(row, 1);
    m_strip = makeStrip();
    content->addWidget(m_strip);
    m_behindPanel = new QWidget(this);
    m_behindPanel->hide();
    content->addWidget(m_behindPanel);
    makeTonePanel();
    makeTurnPanel();
    makeBars();
    makeOperatorPanel();
    makeHints();
    bindTheRest();
    listenToPictures();
    start();
}

// --- makers ---

QVBoxLayout* tFrmNewView::toolColumn(QWidget& box) const {
    box.setFixedWidth(theme().px(columnWidth));
    auto* column = new QVBoxLayout(&box);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(theme().px(7));
    return column;
}

QFrame* tFrmNewView::group(QVBoxLayout& column, QLabel*& title) {
    auto* card = new QFrame(this);
    setRole(card, "card");
    auto* inside = new QVBoxLayout(card);
    inside->setContentsMargins(theme().px(8), theme().px(5), theme().px(8), theme().px(8));
    inside->setSpacing(theme().px(4));
    title = makeLabel(card, "smallMuted");
    title->setWordWrap(false);
    inside->addWidget(title);
    column.addWidget(card);
    return card;
}

ToolButton* tFrmNewView::tool(const QString& name, const Caption& caption, const QString& icon, QSizeF size,
                              std::function<void()> clicked) {
    auto* made = new ToolButton(theme(), icon, size, this);
    connect(made, &QPushButton::clicked, this, [clicked = std::move(clicked)] { clicked(); });
    bind(name, made, caption);
    m_hintLines.emplace_back(nullptr, &caption);
    return made;
}

ToolButton* tFrmNewView::held(const QString& name, const Caption& caption, const QString& icon, QSizeF size,
                              std::function<void()> down, std::function<void()> up) {
    auto* made = new ToolButton(theme(), icon, size, this,
                                {std::move(down), [&page = m_page] { page.tickOnceIfNone(); },
                                 [this, up = std::move(up)] {
                                     if (!isDetached())
                                         up();
                                 }});
    bind(name, made, caption);
    m_hintLines.emplace_back(nullptr, &caption);
    return made;
}

ToolButton* tFrmNewView::zoomOrLight(int index, const QString& icon, QSizeF size) {
    auto* made = held(
        u"Image2(%1)"_s.arg(index), m_shows.Image2[static_cast<std::size_t>(index)], icon, size,
        [&page = m_page, index] { page.Image2_MouseDown(index); },
        [&page = m_page, index] { page.Image2_MouseUp(index); });
    made->installEventFilter(this);
    return made;
}

ToolButton* tFrmNewView::colour(int index, const QString& icon, QColor ink) {
    auto* made = tool(u"Image2(%1)"_s.arg(index), m_shows.Image2[static_cast<std::size_t>(index)], icon, narrow,
                      [&page = m_page, index] { page.Image2_Click(index); });
    made->setInk(ink);
    made->installEventFilter(this);
    return made;
}

QWidget* tFrmNewView::makePlaceAndLight() {
    auto* box = new QWidget(this);
    QVBoxLayout* column = toolColumn(*box);
    tFrmNew& page = m_page;

    // Left is left in both languages.
    QFrame* place = group(*column, m_placeTitle);
    auto* pad = new QWidget(place);
    pad->setLayoutDirection(Qt::LeftToRight);
    auto* cross = new QGridLayout(pad);
    cross->setContentsMargins(0, 0, 0, 0);
    cross->setSpacing(theme().px(5));
    m_zoomIn = zoomOrLight(0, u"zoom-in"_s, narrow);
    cross->addWidget(zoomOrLight(1, u"zoom-out"_s, narrow), 0, 0);
    cross->addWidget(m_zoomIn, 0, 2);
    const auto move = [&](const QString& name, const Caption& caption, const QString& icon, Click down, Click up,
                          int row, int at) {
        cross->addWidget(
            held(
                name, caption, icon, narrow, [&page, down] { (page.*down)(); }, [&page, up] { (page.*up)(); }),
            row, at);
    };
    move(u"Image125"_s, m_shows.Image125, u"arrow-up"_s, &tFrmNew::Image125_MouseDown, &tFrmNew::Image125_MouseUp, 0,
         1);
    move(u"Image115"_s, m_shows.Image115, u"arrow-left"_s, &tFrmNew::Image115_MouseDown, &tFrmNew::Image115_MouseUp, 1,
         0);
    m_zoom = makeLabel(pad, "large");
    m_zoom->setAlignment(Qt::AlignCenter);
    m_zoom->setWordWrap(false);
    bind(u"Label11"_s, m_zoom, [this] { return m_shows.Label11.text; });
    cross->addWidget(m_zoom, 1, 1);
    move(u"Image135"_s, m_shows.Image135, u"arrow-right"_s, &tFrmNew::Image135_MouseDown, &tFrmNew::Image135_MouseUp, 1,
         2);
    move(u"Image145"_s, m_shows.Image145, u"arrow-down"_s, &tFrmNew::Image145_MouseDown, &tFrmNew::Image145_MouseUp, 2,
         1);
    for (int i = 0; i < 3; ++i)
        cross->setColumnStretch(i, 1);
    place->layout()->addWidget(pad);

    QFrame* turns = group(*column, m_turnTitle);
    auto* turnRow = new QHBoxLayout;
    turnRow->setSpacing(theme().px(5));
    m_turn = tool(u"Image15"_s, m_shows.Image15, u"quarter-right"_s, wide, [&page] {
        page.Image15_Click();
        page.Image15_MouseMove();
    });
    m_turn->installEventFilter(this);
    turnRow->addWidget(m_turn);
    // For a finger, which does not hover: the panel without a turn.
    m_fineTurn = new ToolButton(theme(), u"turn-fine"_s, wide, turns);
    m_fineTurn->setObjectName(u"Frame4Opener"_s);
    connect(m_fineTurn, &QPushButton::clicked, this,
            [this] { m_shows.Frame4.visible ? m_page.Image2_MouseMove() : m_page.Image15_MouseMove(); });
    turnRow->addWidget(m_fineTurn);
    static_cast<QVBoxLayout*>(turns->layout())->addLayout(turnRow);

    QFrame* light = group(*column, m_lightTitle);
    auto* lightGrid = new QGridLayout;
    lightGrid->setSpacing(theme().px(5));
    lightGrid->addWidget(zoomOrLight(3, u"darker"_s, wide), 0, 0, 1, 3);
    lightGrid->addWidget(zoomOrLight(4, u"lighter"_s, wide), 0, 3, 1, 3);
    lightGrid->addWidget(colour(6, u"drop"_s, QColor(0xC8, 0x3A, 0x32)), 1, 0, 1, 2);
    lightGrid->addWidget(colour(10, u"drop"_s, QColor(0x2F, 0x5F, 0xA8)), 1, 2, 1, 2);
    lightGrid->addWidget(colour(8, u"drop-off"_s, Theme::Colour::Ink), 1, 4, 1, 2);
    for (int i = 0; i < 6; ++i)
        lightGrid->setColumnStretch(i, 1);
    static_cast<QVBoxLayout*>(light->layout())->addLayout(lightGrid);
    column->addStretch(1);
    return box;
}

QWidget* tFrmNewView::makeFramesAndMore() {
    auto* box = new QWidget(this);
    QVBoxLayout* column = toolColumn(*box);
    tFrmNew& page = m_page;

    auto* more = new QFrame(this);
    setRole(more, "card");
    auto* moreRow = new QHBoxLayout(more);
    moreRow->setContentsMargins(theme().px(8), theme().px(8), theme().px(8), theme().px(8));
    moreRow->setSpacing(theme().px(5));
    m_tones = tool(u"Image13"_s, m_shows.Image13, u"tones"_s, narrow, [&page] { page.Image13_MouseMove(); });
    m_tones->installEventFilter(this);
    moreRow->addWidget(m_tones);
    moreRow->addWidget(tool(u"Command8"_s, m_shows.Command8, u"text"_s, narrow, [&page] { page.Command8_Click(); }));
    moreRow->addWidget(colour(7, u"eye"_s, QColor(0xB2, 0x32, 0x2A)));
    column->addWidget(more);

    QFrame* frames = group(*column, m_framesTitle);
    auto* inside = static_cast<QVBoxLayout*>(frames->layout());
    auto* category =
        comboBox(u"Combo4"_s, m_shows.Combo4List, m_shows.Combo4, [&page](int index) { page.Combo4_Click(index); });
    category->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    inside->addWidget(category);
    m_frames = new FrameThumbs(
        theme(), [&page](int row) { return page.framePicture(row); }, frames);
    bindList(u"Combo2"_s, m_shows.Combo2List, m_frames);
    connect(m_frames, &FrameThumbs::picked, this, [&page](int row) { page.Combo2_Click(row); });
    inside->addWidget(m_frames, 1);
    auto* steps = new QHBoxLayout;
    steps->setSpacing(theme().px(4));
    const auto step = [&](const QString& name, const Caption& caption, std::function<void()> clicked) {
        auto* made = button(name, caption, Role::Plain, std::move(clicked));
        setRole(made, "round");
        made->setFixedSize(theme().key(), theme().key());
        m_hintLines.emplace_back(nullptr, &caption);
        return made;
    };
    steps->addWidget(step(u"Image21"_s, m_shows.Image21, [&page] { page.Image21_Click(); }));
    // "3 / 8" reads from left to right.
    auto* position = new QWidget(frames);
    position->setLayoutDirection(Qt::LeftToRight);
    auto* numbers = new QHBoxLayout(position);
    numbers->setContentsMargins(0, 0, 0, 0);
    numbers->setSpacing(0);
    numbers->addStretch(1);
    m_position = makeLabel(position, "strong");
    m_position->setWordWrap(false);
    bind(u"Label6"_s, m_position, [this] { return m_shows.Label6.text; });
    numbers->addWidget(m_position);
    auto* count = label(u"Label5"_s, m_shows.Label5, "strong");
    count->setWordWrap(false);
    numbers->addWidget(count);
    numbers->addStretch(1);
    steps->addWidget(position, 1);
    steps->addWidget(step(u"Image20"_s, m_shows.Image20, [&page] { page.Image20_Click(); }));
    inside->addLayout(steps);
    auto* use = new QHBoxLayout;
    use->setSpacing(theme().px(5));
    use->addWidget(tool(u"Image22"_s, m_shows.Image22, u"frame"_s, wide, [&page] { page.Image22_Click(); }));
    use->addWidget(tool(u"Image28"_s, m_shows.Image28, u"frame-off"_s, wide, [&page] { page.Image28_Click(); }));
    inside->addLayout(use);
    inside->addWidget(
        checkBox(u"Misgerett"_s, m_shows.Misgerett, [&page](bool checked) { page.Misgerett_Click(checked); }));
    column->setStretch(1, 1);
    return box;
}

QWidget* tFrmNewView::makeStrip() {
    auto* box = new QWidget(this);
    // As on the page of pictures: from left to right in both languages.
    box->setLayoutDirection(Qt::LeftToRight);
    auto* row = new QHBoxLayout(box);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(theme().px(6));
    for (int i = 0; i < static_cast<int>(cellsOfPage); ++i) {
        auto* cell = new StripCell(theme(), box);
        m_cells[static_cast<std::size_t>(i)] = cell;
        connect(cell, &QAbstractButton::clicked, this, [this, i] {
            if (m_pictures)
                m_pictures->Picture1_Click(i);
        });
        bind(u"Strip(%1)"_s.arg(i), cell,
             [this, i] { return m_pictures ? m_pictures->controls().List2.item(i) : QString(); });
        row->addWidget(cell, 1);
    }
    return box;
}

void tFrmNewView::makeBars() {
    tFrmNew& page = m_page;
    m_undo = button(
        u"Image2(5)"_s, m_shows.Image2[5], Role::Secondary, [&page] { page.Image2_Click(5); }, u"undo"_s);
    m_undo->installEventFilter(this);
    m_undo->setMouseTracking(true);
    frame().addSecondaryAction(m_undo);
    m_hintLines.emplace_back(nullptr, &m_shows.Image2[5]);
    frame().addHeaderAction(button(
        u"Image29"_s, m_shows.Image29, Role::Quiet, [&page] { page.Image29_Click(); }, u"info"_s));
    m_name = makeLabel(this, "muted");
    m_name->setWordWrap(false);
    bind(u"Title"_s, m_name, [this] { return m_shows.Title.text; });
    frame().addStatus(m_name);
    m_done = button(u"CommandDone"_s, m_shows.CommandDone, Role::Main, [&page] { page.CommandDone_Click(); });
    frame().addMainAction(m_done);
}

void tFrmNewView::bindTheRest() {
    bindHidden(u"Image19"_s, m_shows.Image19);
    bindHidden(u"Picture3"_s, m_shows.Picture3);
}

// --- what the page says ---

void tFrmNewView::listenToPictures() {
    auto* pictures = static_cast<kyoskNew*>(m_chain.find(PageId::kyoskNew));
    if (pictures == m_pictures)
        return;
    m_pictures = pictures;
    if (pictures)
        connect(pictures, &Page::changed, this, [this] {
            if (!isDetached())
                renderStrip();
        });
}

void tFrmNewView::renderTitles() {
    m_placeTitle->setText(m_shows.words.place);
    m_turnTitle->setText(m_shows.words.turn);
    m_lightTitle->setText(m_shows.words.light);
    m_framesTitle->setText(m_shows.words.frames);
    m_fineTurn->setText(m_shows.words.fineTurn);
    m_fineTurn->setAccessibleName(m_fineTurn->text());
    m_zoom->setText(isolated(m_shows.Label11.text + u'%'));
    speak(findChild<QWidget*>(u"Combo4"_s), m_shows.words.categories);
    speak(m_frames, m_shows.words.framesOfCategory);
    for (const char* name : {"Image20", "Image21"}) {
        auto* step = findChild<QPushButton*>(QString::fromLatin1(name));
        step->setText({});
        const bool next = name == std::string_view("Image20");
        setDirectedIcon(step, next ? Way::Forwards : Way::Back);
        speak(step, next ? m_shows.Image20.text : m_shows.Image21.text);
    }
    m_angle->setText(isolated(u"%1°"_s.arg(m_page.turnDegrees())));
}

void tFrmNewView::renderStrip() {
    for (std::size_t i = 0; i < m_cells.size(); ++i) {
        StripCell::Look look;
        QString name;
        if (m_pictures) {
            const CellPicture& cell = m_pictures->controls().Picture1[i];
            name = cell.text;
            look.filled = !name.isEmpty();
            look.picture = cell.visible ? cell.bitmap.image() : QImage();
            look.ordered = m_pictures->controls().Picture4[i].visible;
            look.open = m_pictures->openCell() == static_cast<int>(i);
        }
        m_cells[i]->show(look);
        name = name.section(u'\\', -1);
        speak(m_cells[i], !look.filled ? m_shows.words.emptyCell
                          : look.open  ? m_shows.words.openCell.arg(name)
                                       : m_shows.words.otherCell.arg(name));
    }
}

void tFrmNewView::renderFrames() {
    m_position->setText(m_shows.Label6.text.isEmpty() ? u"–  / "_s : m_shows.Label6.text);
    m_frames->setWorn(m_page.frameOnPicture());
}

void tFrmNewView::render() {
    listenToPictures();
    renderTitles();
    renderStrip();
    renderFrames();
    renderHints();
    const bool uncovered = m_covered == 0;
    m_nearTools->setVisible(uncovered && m_shows.Picture3.visible);
    m_farTools->setVisible(uncovered && m_shows.Picture3.visible);
    m_strip->setVisible(uncovered);
    m_undo->setVisible(m_shows.Picture3.visible);
    m_name->setText(fromLeft(m_name->fontMetrics().elidedText(m_shows.Title.text, Qt::ElideMiddle, theme().px(260))));
    m_operator->setVisible(state().DegelEdit);
    m_table->render(m_shows.Image19.visible ? m_shows.Image19.text : QString());
    placePanels();
}

void tFrmNewView::setCoveredHeight(int pixels) {
    // What lies above the bottom bar; the bar itself is covered as well.
    const int bar = height() - frame().content()->parentWidget()->geometry().bottom() - 1;
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
    return m_shows.Picture3.visible ? static_cast<QWidget*>(m_zoomIn) : m_done;
}

void tFrmNewView::escape() {
    if (m_shows.Frame3.visible || m_shows.Frame4.visible) {
        QPushButton* opener = m_shows.Frame3.visible ? m_tones : m_fineTurn;
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
