// The editor's panels: tones, turns, the hints in words, and the operator's tools.
#include "editing/render/EditedPicture.h"
#include "editing/render/LineFrame.h"
#include "views/kit/CardButtons.h"
#include "views/kit/Overlay.h"
#include "views/kit/PressElsewhere.h"
#include "views/kit/ToolButton.h"
#include "views/tFrmNew/EditorPaper.h"
#include "views/tFrmNew/tFrmNewView.h"

#include <QComboBox>
#include <QMouseEvent>
#include <QPainter>
#include <QSlider>

#include <algorithm>
#include <array>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr QSizeF inPanel{80, 70};

// A sample photograph in a tone: grey by equal weights and tinted by the gains, as the preview does it. Without gains
// it keeps its colours.
QImage toneSample(const Theme& theme, std::array<double, 3> gains, bool grey) {
    QImage sample(theme.px(60), theme.px(40), QImage::Format_RGB32);
    sample.fill(Qt::white);
    QPainter painter(&sample);
    painter.setRenderHint(QPainter::Antialiasing);
    drawSamplePicture(painter, sample.rect());
    painter.end();
    if (!grey)
        return sample;
    for (int y = 0; y < sample.height(); ++y) {
        auto* row = reinterpret_cast<QRgb*>(sample.scanLine(y));
        for (int x = 0; x < sample.width(); ++x) {
            const double level = greyWeight * (qRed(row[x]) + qGreen(row[x]) + qBlue(row[x]));
            const auto tinted = [&](double gain) { return std::min(255, static_cast<int>(level * gain)); };
            row[x] = qRgb(tinted(gains[0]), tinted(gains[1]), tinted(gains[2]));
        }
    }
    return sample;
}

// The palette of line frames, cell by cell, with the marker and the letter under it.
class Palette : public QWidget {
public:
    Palette(tFrmNew& page, QWidget* parent)
        : QWidget(parent)
        , m_page(page) {
        setFixedSize(LineFramePalette::columns * LineFramePalette::cell,
                     LineFramePalette::rows * LineFramePalette::cell);
        setMouseTracking(true);
    }

protected:
    void mouseMoveEvent(QMouseEvent* event) override { m_page.pic4Msgrt_MouseMove(event->position()); }
    void mousePressEvent(QMouseEvent* event) override {
        m_page.pic4Msgrt_MouseMove(event->position());
        m_page.PicInMsgrt_Click();
    }
    void paintEvent(QPaintEvent*) override {
        QPainter painter(this);
        painter.setPen(Theme::Colour::Line);
        for (int i = 0; i < LineFramePalette::columns * LineFramePalette::rows; ++i) {
            painter.setBrush(*lineFrameColour(LineFramePalette::letterOf(i)));
            painter.drawRect(i / LineFramePalette::rows * LineFramePalette::cell,
                             i % LineFramePalette::rows * LineFramePalette::cell, LineFramePalette::cell - 1,
                             LineFramePalette::cell - 1);
        }
        const QColor colour = *lineFrameColour(m_page.controls().palette.letter());
        painter.setPen(QPen(Theme::Colour::Primary, 2));
        painter.setBrush(colour);
        painter.drawRect(m_page.controls().palette.marker().adjusted(1, 1, -1, -1));
        painter.setPen(colour.lightness() < 128 ? Qt::white : Qt::black);
        painter.drawText(m_page.controls().palette.marker(), Qt::AlignCenter, m_page.controls().palette.letter());
    }

private:
    tFrmNew& m_page;
};

} // namespace

void tFrmNewView::makeTonePanel() {
    const auto tone = [&](const Caption& caption, std::array<double, 3> gains, bool grey, Click clicked) {
        ToolButton* made = tool(caption, u"tones"_s, inPanel, clicked);
        made->setPicture(toneSample(theme(), gains, grey));
        return made;
    };
    const Card panel = makeCard("card", Pad::Tight);
    QGridLayout* grid = inGrid(Space::Tight);
    grid->addWidget(tone(c.Image5, {1, 1, 1}, false, &tFrmNew::Image5_Click), 0, 0, 1, 2);
    grid->addWidget(tone(c.Image4, {1, 1, 1}, true, &tFrmNew::Image4_Click), 1, 0);
    grid->addWidget(tone(c.Image11, {1.3, 1, 0.8}, true, &tFrmNew::Image11_Click), 1, 1);
    grid->addWidget(tone(c.Image12, {1, 1, 1.3}, true, &tFrmNew::Image12_Click), 2, 0);
    grid->addWidget(tone(c.Image9, {1, 1.3, 1}, true, &tFrmNew::Image9_Click), 2, 1);
    add(*panel.column, {grid, Item::room()});
    m_tonePanel = panel.frame;
    bind(m_tonePanel, c.Frame3);
    new PressElsewhere(*m_tonePanel, *m_tones, [this] {
        if (!isDetached() && c.Frame3.visible)
            m_page.Image2_MouseMove();
    });
}

// The pointer that comes to the button has opened the panel already; the next press closes it.
void tFrmNewView::pressTones() {
    const bool closes = c.Frame3.visible && m_tonesPressed;
    m_tonesPressed = !closes;
    closes ? m_page.Image2_MouseMove() : m_page.Image13_MouseMove();
}

void tFrmNewView::makeTurnPanel() {
    const auto turn = [&](const Caption& caption, const QString& icon, Click down, Click up) {
        return heldTool(caption, icon, inPanel, toPage(down), toPage(up));
    };
    const Card panel = makeCard("card", Pad::Tight);
    auto* quarter = tool(c.Image18, u"quarter-left"_s, inPanel, &tFrmNew::Image18_Click);
    auto* left = turn(c.Image17, u"turn-left"_s, &tFrmNew::Image17_MouseDown, &tFrmNew::Image17_MouseUp);
    m_angle = oneLine("large");
    m_angle->setAlignment(Qt::AlignCenter);
    m_angle->setMinimumWidth(theme().px(60));
    bindName(m_angle, c.Label10);
    auto* right = turn(c.Image16, u"turn-right"_s, &tFrmNew::Image16_MouseDown, &tFrmNew::Image16_MouseUp);
    auto* upright = tool(c.Image27, u"upright"_s, inPanel, &tFrmNew::Image27_Click);
    m_turns = inRow(Space::Tight, {quarter, left, m_angle, right, upright});
    panel.column->addLayout(m_turns);
    m_turnPanel = panel.frame;
    m_turnPanel->setLayoutDirection(Qt::LeftToRight); // left is left in both languages
    bind(m_turnPanel, c.Frame4);
}

// The operator's panel: controls that double another one or show the customer nothing.
void tFrmNewView::makeOperatorPanel() {
    const Card panel = makeCard("notice", Pad::Tight);
    m_operatorPanel = panel.frame;
    m_operatorPanel->hide();
    m_operator = plainButton(u"Frame5Opener"_s, "quiet", [this] {
        m_operatorPanel->setVisible(m_operatorPanel->isHidden());
        placePanels();
    });
    setIcon(m_operator, u"gear"_s, Theme::Colour::Ink);
    frame().addHeaderAction(m_operator);

    const auto plain = [&](const Caption& caption, Click clicked) { return button(caption, Role::Plain, clicked); };
    const auto small = [&](const Caption& caption, const QString& icon, Click clicked) {
        auto* made = new ToolButton(theme(), icon, inPanel, this);
        connect(made, &QPushButton::clicked, this, toPage(clicked));
        bind(made, caption);
        return made;
    };
    QLayout* sizes = inRow(
        Space::Small, {plain(c.Command24, &tFrmNew::Command24_Click), plain(c.Command12, &tFrmNew::Command12_Click),
                       plain(c.Command10, &tFrmNew::Command10_Click), plain(c.Command23, &tFrmNew::Command23_Click)});
    m_palette = new Palette(m_page, m_operatorPanel);
    bind(u"pic4Msgrt"_s, m_palette, [this] { return c.Label4.text; });
    m_lineStyles = comboBox(c.Combo5List, c.Combo5, toPage(&tFrmNew::Combo5_Click));
    auto* bar = new QSlider(Qt::Horizontal, m_operatorPanel);
    bar->setRange(tFrmNewControls::VScrollZMin, tFrmNewControls::VScrollZMax);
    bar->setMinimumHeight(theme().target());
    bar->setValue(c.VScrollZ);
    connect(bar, &QSlider::valueChanged, this, toPage(&tFrmNew::VScrollZ_Change));
    bind(u"VScrollZ"_s, bar, [this] { return QString::number(c.VScrollZ); });
    QLayout* upper = inRow(Space::Tight, {small(c.Command2, u"folder"_s, &tFrmNew::Command2_Click),
                                          small(c.Command4, u"look"_s, &tFrmNew::Command4_Click),
                                          small(c.Command6, u"lighter"_s, &tFrmNew::Command6_Click),
                                          small(c.Command18, u"arrow-up"_s, &tFrmNew::Command18_Click),
                                          small(c.Command9, u"arrow-down"_s, &tFrmNew::Command9_Click)});
    QLayout* lower = inRow(Space::Tight, {small(c.Command14, u"frame"_s, &tFrmNew::Command14_Click),
                                          small(c.Command13, u"frame"_s, &tFrmNew::Command13_Click),
                                          small(c.Command16, u"plus"_s, &tFrmNew::Command16_Click),
                                          small(c.Command15, u"minus"_s, &tFrmNew::Command15_Click),
                                          {m_lineStyles, 1}});
    QLabel* record = label(c.Label13, "small");
    record->setLayoutDirection(Qt::LeftToRight);
    add(*panel.column,
        {sizes, inRow(Space::Small, {{m_palette, 0, Qt::AlignCenter}, {inColumn(Space::Tight, {upper, lower}), 1}}),
         bar, record});
}

// --- the hints in words, for customers who can't hover ---

void tFrmNewView::makeHints() {
    m_hints = new Overlay(theme(), this);
    m_hints->setWidth(Overlay::Width::Full);
    QGridLayout* grid = inGrid(Space::Tight);
    grid->setHorizontalSpacing(theme().size(Space::Far));
    const auto rows = static_cast<int>((m_hintLines.size() + 1) / 2);
    for (auto& [line, caption] : m_hintLines) {
        const int at = grid->count();
        line = makeLabel(m_hints->card(), "small");
        grid->addWidget(line, at % rows, at / rows);
        grid->setColumnStretch(at / rows, 1);
    }
    m_hints->column()->addLayout(grid);
    m_hints->addButton(button(c.hintsClose, Role::Main, &tFrmNew::Image29_Click));
    m_hints->whenEscaped(toPage(&tFrmNew::Image29_Click));
}

void tFrmNewView::renderHints() {
    for (const auto& [line, caption] : m_hintLines)
        line->setText(isolated(tFrmNew::hintLine(*caption)));
    m_hints->setOpen(c.hintsAsLabels);
}

// --- where they stand ---

// The room of the panel is kept also while it is closed, so that the paper does not move under the pointer. The
// keyboard takes the tools away, and the panel with them.
std::optional<PanelForms> tFrmNewView::turnForms() const {
    if (m_nearTools->isHidden())
        return std::nullopt;
    PanelForms forms;
    for (int i = 0; i < m_turns->count(); ++i) {
        // A layout takes no size from the widgets of a panel that has never been shown.
        const QWidget& part = *m_turns->itemAt(i)->widget();
        const QSize hint = part.sizeHint().expandedTo(part.minimumSize());
        forms.row = {forms.row.width() + hint.width(), std::max(forms.row.height(), hint.height())};
        forms.column = {std::max(forms.column.width(), hint.width()), forms.column.height() + hint.height()};
    }
    const QMargins margins = m_turnPanel->layout()->contentsMargins() + m_turnPanel->contentsMargins();
    const QSize around(margins.left() + margins.right(), margins.top() + margins.bottom());
    const int gaps = m_turns->spacing() * (m_turns->count() - 1);
    forms.row += around + QSize(gaps, 0);
    forms.column += around + QSize(0, gaps);
    const QPoint opener = m_turn->mapTo(this, m_turn->rect().center()) - m_table->mapTo(this, QPoint());
    forms.level = opener.y();
    forms.atLeft = opener.x() < 0;
    return forms;
}

// The operator's tools lie over the small pictures, on an upright page over the table's own end, the turns beside the
// paper, the tones over the frames below their button: never over the picture.
void tFrmNewView::placePanels() {
    if (!m_operatorPanel || isDetached())
        return;
    const QPoint corner = m_table->mapTo(this, QPoint());
    const QWidget& last = theme().isTall() ? static_cast<QWidget&>(*m_table) : *m_strip;
    const int bottom = last.mapTo(this, QPoint(0, last.height())).y();
    const QSize wanted = m_operatorPanel->sizeHint();
    const QSize size(std::max(wanted.width(), m_table->width()), wanted.height());
    m_operatorPanel->setGeometry(corner.x() + (m_table->width() - size.width()) / 2, bottom - size.height(),
                                 size.width(), size.height());
    m_operatorPanel->raise();
    m_palette->update();
    const int free = m_operatorPanel->isHidden() ? m_table->height() : m_operatorPanel->y() - corner.y();
    const PaperPlace turns = m_table->place(free, turnForms());
    m_turns->setDirection(turns.column ? QBoxLayout::TopToBottom : QBoxLayout::LeftToRight);
    m_turnPanel->setGeometry(turns.panel.translated(corner));
    m_turnPanel->raise();
    // The place of the frames as a whole.
    const QRect tools(m_farTools->mapTo(this, QPoint()), m_farTools->size());
    const int top = m_moreTools->height() + theme().size(Space::Small);
    m_tonePanel->setGeometry(tools.adjusted(0, top, 0, 0));
    m_tonePanel->raise();
    if (m_hints->isOpen())
        m_hints->raise();
}

bool tFrmNewView::eventFilter(QObject* watched, QEvent* event) {
    if ((event->type() == QEvent::Enter || event->type() == QEvent::MouseMove) && !isDetached()) {
        if (watched == m_tones)
            m_page.Image13_MouseMove();
        else if (watched == m_turn)
            m_page.Image15_MouseMove();
        else
            m_page.Image2_MouseMove();
    }
    return PageView::eventFilter(watched, event);
}

} // namespace lumora
