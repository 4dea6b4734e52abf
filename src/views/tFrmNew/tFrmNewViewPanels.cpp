// The editor's panels: tones, turns, the hints in words, and the operator's tools.
#include "editing/render/EditedPicture.h"
#include "editing/render/LineFrame.h"
#include "views/kit/Cards.h"
#include "views/kit/Overlay.h"
#include "views/kit/ToolButton.h"
#include "views/tFrmNew/EditorPaper.h"
#include "views/tFrmNew/tFrmNewView.h"

#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QMouseEvent>
#include <QPainter>
#include <QPushButton>
#include <QSlider>
#include <QVBoxLayout>

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
    m_tonePanel = new QFrame(this);
    setRole(m_tonePanel, "card");
    auto* row = new QHBoxLayout(m_tonePanel);
    row->setContentsMargins(theme().px(8), theme().px(8), theme().px(8), theme().px(8));
    row->setSpacing(theme().px(5));
    const auto tone = [&](const QString& name, const Caption& caption, std::array<double, 3> gains, bool grey,
                          std::function<void()> clicked) {
        ToolButton* made = tool(name, caption, u"tones"_s, inPanel, std::move(clicked));
        made->setPicture(toneSample(theme(), gains, grey));
        row->addWidget(made);
    };
    tFrmNew& page = m_page;
    tone(u"Image5"_s, m_shows.Image5, {1, 1, 1}, false, [&page] { page.Image5_Click(); });
    tone(u"Image4"_s, m_shows.Image4, {1, 1, 1}, true, [&page] { page.Image4_Click(); });
    tone(u"Image11"_s, m_shows.Image11, {1.3, 1, 0.8}, true, [&page] { page.Image11_Click(); });
    tone(u"Image12"_s, m_shows.Image12, {1, 1, 1.3}, true, [&page] { page.Image12_Click(); });
    tone(u"Image9"_s, m_shows.Image9, {1, 1.3, 1}, true, [&page] { page.Image9_Click(); });
    bind(u"Frame3"_s, m_tonePanel, m_shows.Frame3);
}

void tFrmNewView::makeTurnPanel() {
    m_turnPanel = new QFrame(this);
    setRole(m_turnPanel, "card");
    // Left is left in both languages.
    m_turnPanel->setLayoutDirection(Qt::LeftToRight);
    auto* row = new QHBoxLayout(m_turnPanel);
    row->setContentsMargins(theme().px(8), theme().px(8), theme().px(8), theme().px(8));
    row->setSpacing(theme().px(5));
    tFrmNew& page = m_page;
    row->addWidget(tool(u"Image18"_s, m_shows.Image18, u"quarter-left"_s, inPanel, [&page] { page.Image18_Click(); }));
    row->addWidget(held(
        u"Image17"_s, m_shows.Image17, u"turn-left"_s, inPanel, [&page] { page.Image17_MouseDown(); },
        [&page] { page.Image17_MouseUp(); }));
    m_angle = makeLabel(m_turnPanel, "large");
    m_angle->setAlignment(Qt::AlignCenter);
    m_angle->setWordWrap(false);
    m_angle->setMinimumWidth(theme().px(60));
    bind(u"Label10"_s, m_angle, [this] { return m_shows.Label10.text; });
    row->addWidget(m_angle);
    row->addWidget(held(
        u"Image16"_s, m_shows.Image16, u"turn-right"_s, inPanel, [&page] { page.Image16_MouseDown(); },
        [&page] { page.Image16_MouseUp(); }));
    row->addWidget(tool(u"Image27"_s, m_shows.Image27, u"upright"_s, inPanel, [&page] { page.Image27_Click(); }));
    bind(u"Frame4"_s, m_turnPanel, m_shows.Frame4);
}

// What doubles another control or shows the customer nothing is for the operator.
void tFrmNewView::makeOperatorPanel() {
    tFrmNew& page = m_page;
    bindHidden(u"Frame5"_s, m_shows.Frame5);
    m_operatorPanel = new QFrame(this);
    setRole(m_operatorPanel, "notice");
    m_operatorPanel->hide();
    m_operator = new QPushButton(this);
    setRole(m_operator, "quiet");
    m_operator->setObjectName(u"Frame5Opener"_s);
    m_operator->setFocusPolicy(Qt::TabFocus);
    setIcon(m_operator, u"gear"_s, Theme::Colour::Ink);
    speak(m_operator, m_shows.words.operatorPanel);
    connect(m_operator, &QPushButton::clicked, this, [this] {
        m_operatorPanel->setVisible(m_operatorPanel->isHidden());
        placePanels();
    });
    frame().addHeaderAction(m_operator);

    auto* column = new QVBoxLayout(m_operatorPanel);
    column->setSpacing(theme().px(6));
    const auto addRow = [&] {
        auto* row = new QHBoxLayout;
        row->setSpacing(theme().px(6));
        column->addLayout(row);
        return row;
    };
    QHBoxLayout& sizes = *addRow();
    addPlain(sizes, u"Command24"_s, m_shows.Command24, &tFrmNew::Command24_Click);
    addPlain(sizes, u"Command12"_s, m_shows.Command12, &tFrmNew::Command12_Click);
    addPlain(sizes, u"Command10"_s, m_shows.Command10, &tFrmNew::Command10_Click);
    addPlain(sizes, u"Command23"_s, m_shows.Command23, &tFrmNew::Command23_Click);
    addPlain(sizes, u"Command4"_s, m_shows.Command4, &tFrmNew::Command4_Click);
    addPlain(sizes, u"Command2"_s, m_shows.Command2, &tFrmNew::Command2_Click);
    addPlain(sizes, u"Command6"_s, m_shows.Command6, &tFrmNew::Command6_Click);
    QHBoxLayout& lines = *addRow();
    m_palette = new Palette(page, m_operatorPanel);
    bind(u"pic4Msgrt"_s, m_palette, [this] { return m_shows.Label4.text; });
    bindHidden(u"Label4"_s, m_shows.Label4);
    lines.addWidget(m_palette);
    auto* styles = comboBox(u"Combo5"_s, m_shows.Combo5List, m_shows.Combo5, [](int) {});
    speak(styles, m_shows.words.lineStyles);
    lines.addWidget(styles);
    addPlain(lines, u"Command18"_s, m_shows.Command18, &tFrmNew::Command18_Click);
    addPlain(lines, u"Command9"_s, m_shows.Command9, &tFrmNew::Command9_Click);
    QHBoxLayout& crop = *addRow();
    addPlain(crop, u"Command14"_s, m_shows.Command14, &tFrmNew::Command14_Click);
    addPlain(crop, u"Command13"_s, m_shows.Command13, &tFrmNew::Command13_Click);
    addPlain(crop, u"Command16"_s, m_shows.Command16, &tFrmNew::Command16_Click);
    addPlain(crop, u"Command15"_s, m_shows.Command15, &tFrmNew::Command15_Click);
    auto* bar = new QSlider(Qt::Horizontal, m_operatorPanel);
    bar->setRange(tFrmNewControls::VScrollZMin, tFrmNewControls::VScrollZMax);
    bar->setMinimumHeight(theme().target());
    bar->setValue(m_shows.VScrollZ);
    connect(bar, &QSlider::valueChanged, this, [&page](int value) { page.VScrollZ_Change(value); });
    bind(u"VScrollZ"_s, bar, [this] { return QString::number(m_shows.VScrollZ); });
    crop.addWidget(bar, 1);
    auto* record = label(u"Label13"_s, m_shows.Label13, "small");
    record->setLayoutDirection(Qt::LeftToRight);
    column->addWidget(record);
}

void tFrmNewView::addPlain(QHBoxLayout& row, const QString& name, const Caption& caption, Click click) {
    row.addWidget(button(name, caption, Role::Plain, [&page = m_page, click] { (page.*click)(); }));
}

// --- the hints in words, for who can't hover ---

void tFrmNewView::makeHints() {
    m_hints = new Overlay(theme(), this);
    m_hints->setWidth(Overlay::Width::Full);
    m_hints->column()->setContentsMargins(theme().px(24), theme().px(20), theme().px(24), theme().px(18));
    m_hints->column()->setSpacing(theme().px(10));
    auto* grid = new QGridLayout;
    grid->setHorizontalSpacing(theme().px(26));
    grid->setVerticalSpacing(theme().px(5));
    const auto rows = static_cast<int>((m_hintLines.size() + 1) / 2);
    int at = 0;
    for (auto& [line, caption] : m_hintLines) {
        line = makeLabel(m_hints->card(), "small");
        grid->addWidget(line, at % rows, at / rows);
        ++at;
    }
    grid->setColumnStretch(0, 1);
    grid->setColumnStretch(1, 1);
    m_hints->column()->addLayout(grid);
    m_hintsClose = new QPushButton(m_hints->card());
    setRole(m_hintsClose, "main");
    m_hintsClose->setObjectName(u"hintsClose"_s);
    m_hintsClose->setFocusPolicy(Qt::TabFocus);
    connect(m_hintsClose, &QPushButton::clicked, this, [&page = m_page] { page.Image29_Click(); });
    m_hints->column()->addWidget(m_hintsClose, 0, Qt::AlignTrailing);
    m_hints->setFirstFocus(m_hintsClose);
    connect(m_hints, &Overlay::escaped, this, [&page = m_page] { page.Image29_Click(); });
}

void tFrmNewView::renderHints() {
    for (const auto& [line, caption] : m_hintLines)
        line->setText(isolated(tFrmNew::hintLine(*caption)));
    m_hintsClose->setText(m_shows.words.closeHints);
    m_hintsClose->setAccessibleName(m_hintsClose->text());
    m_hints->setOpen(m_shows.hintsAsLabels);
}

// --- where they stand ---

// Beside the button that opens them, over the table; the operator's over the small pictures.
void tFrmNewView::placePanels() {
    if (!m_operatorPanel)
        return;
    const QRect table(m_table->mapTo(this, QPoint()), m_table->size());
    const auto beside = [&](QFrame& panel, const QWidget& opener) {
        const QSize size = panel.sizeHint();
        const int level = opener.mapTo(this, QPoint(0, opener.height() / 2)).y();
        const bool fromLeft = opener.mapTo(this, QPoint()).x() < table.center().x();
        const int x = fromLeft ? table.left() : table.right() + 1 - size.width();
        const int y = std::clamp(level - size.height() / 2, table.top(), table.bottom() - size.height());
        panel.setGeometry(x, y, size.width(), size.height());
        panel.raise();
    };
    beside(*m_tonePanel, *m_tones);
    beside(*m_turnPanel, *m_turn);
    const QSize size = m_operatorPanel->sizeHint();
    const int bottom = m_strip->mapTo(this, QPoint(0, m_strip->height())).y();
    m_operatorPanel->setGeometry((width() - size.width()) / 2, bottom - size.height(), size.width(), size.height());
    m_operatorPanel->raise();
    m_palette->update();
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
