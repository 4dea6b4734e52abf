#include "views/tFrmNew/EditorPaper.h"

#include <QMouseEvent>
#include <QPainter>
#include <QWheelEvent>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr QColor tableColour{0x2C, 0x31, 0x36};
constexpr QColor words{0xE9, 0xEA, 0xEB};
constexpr double handleRadius = 18; // of a crop handle, in logical pixels

constexpr CropFrame::Corner corners[] = {CropFrame::Corner::Picture11, CropFrame::Corner::Picture9,
                                         CropFrame::Corner::Picture10, CropFrame::Corner::Picture14};

// The dashed box of the caption. Black and white dashes, so that it shows on any picture.
class CaptionBox : public QWidget {
public:
    explicit CaptionBox(QWidget* parent)
        : QWidget(parent) {
        setCursor(Qt::SizeAllCursor);
        hide();
    }

protected:
    void paintEvent(QPaintEvent*) override {
        QPainter painter(this);
        const QRectF box = QRectF(rect()).adjusted(1, 1, -1, -1);
        painter.fillRect(box, QColor(255, 255, 255, 40));
        painter.setPen(QPen(QColor(0x1D, 0x25, 0x2C), 2));
        painter.drawRect(box);
        QPen dashes(Qt::white, 2);
        dashes.setDashPattern({3, 3});
        painter.setPen(dashes);
        painter.drawRect(box);
    }
};

} // namespace

EditorPaper::EditorPaper(tFrmNew& page, QWidget* parent)
    : QWidget(parent)
    , m_page(page)
    , m_shown(page.controls())
    , m_caption(new CaptionBox(this)) {
    setMouseTracking(true);
    setCursor(Qt::OpenHandCursor);
    setAttribute(Qt::WA_OpaquePaintEvent);
    m_caption->installEventFilter(this);
}

void EditorPaper::render() {
    m_scale = m_shown.PicPicSize.width > 0 ? double(width()) / m_shown.PicPicSize.width : 1;
    const TextLabelBox& box = m_shown.LabeltextBox;
    // The box is large enough for a finger, however small the caption is.
    QRectF area(box.left * m_scale, box.top * m_scale, box.width * m_scale, box.height * m_scale);
    const QPointF middle = area.center();
    area.setSize({std::max(area.width(), 44.0), std::max(area.height(), 44.0)});
    area.moveCenter(middle);
    if (m_caption->geometry() != area.toRect())
        m_caption->setGeometry(area.toRect());
    if (m_caption->isHidden() == m_shown.Labeltext.visible)
        m_caption->setVisible(m_shown.Labeltext.visible);
    // The paper is repainted for another bitmap only.
    if (m_preview.cacheKey() != m_shown.PicPic.image().cacheKey() || m_shown.crop.visible) {
        m_preview = m_shown.PicPic.image();
        update();
    }
}

void EditorPaper::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    if (m_preview.isNull()) {
        painter.fillRect(rect(), Qt::white);
        return;
    }
    const double ratio = devicePixelRatioF();
    const bool asItIs = m_preview.size() == (QSizeF(size()) * ratio).toSize();
    painter.setRenderHint(QPainter::SmoothPixmapTransform, !asItIs);
    painter.drawImage(rect(), m_preview);
    if (!m_shown.crop.visible)
        return;
    painter.setRenderHint(QPainter::Antialiasing);
    QPolygonF sides;
    for (const int at : {0, 1, 3, 2})
        sides << QPointF(m_shown.crop.marker(corners[at])) * m_scale;
    painter.setPen(QPen(Theme::Colour::Sun, 2));
    painter.drawPolygon(sides);
    painter.setBrush(Theme::Colour::Sun);
    for (const CropFrame::Corner corner : corners)
        painter.drawEllipse(m_shown.crop.handle(corner) * m_scale, 8, 8);
}

void EditorPaper::drag(QEvent::Type type, QPointF at) {
    const bool down = type == QEvent::MouseButtonPress;
    const bool up = type == QEvent::MouseButtonRelease;
    switch (m_drag) {
    case Drag::Caption:
        down ? m_page.Labeltext_MouseDown(at) : up ? m_page.Labeltext_MouseUp() : m_page.Labeltext_MouseMove(at);
        break;
    case Drag::CropHandle:
        up ? m_page.CropHandle_MouseUp() : m_page.CropHandle_MouseMove(at);
        break;
    case Drag::Picture:
        down ? m_page.PicPic_MouseDown(at) : up ? m_page.PicPic_MouseUp() : m_page.PicPic_MouseMove(at);
        break;
    case Drag::None:
        if (!down && !up)
            m_page.PicPic_MouseMove(at); // closes the panels
        break;
    }
    if (up)
        m_drag = Drag::None;
}

void EditorPaper::mousePressEvent(QMouseEvent* event) {
    if (event->button() != Qt::LeftButton)
        return;
    const QPointF at = onPaper(event->position());
    m_drag = Drag::Picture;
    for (const CropFrame::Corner corner : corners) {
        if (m_shown.crop.visible && QLineF(at, m_shown.crop.handle(corner)).length() < handleRadius) {
            m_drag = Drag::CropHandle;
            m_page.CropHandle_MouseDown(corner, at);
            return;
        }
    }
    setCursor(Qt::ClosedHandCursor);
    drag(QEvent::MouseButtonPress, at);
}

void EditorPaper::mouseMoveEvent(QMouseEvent* event) {
    drag(QEvent::MouseMove, onPaper(event->position()));
}

void EditorPaper::mouseReleaseEvent(QMouseEvent* event) {
    if (event->button() != Qt::LeftButton)
        return;
    setCursor(Qt::OpenHandCursor);
    drag(QEvent::MouseButtonRelease, onPaper(event->position()));
}

// A hidden widget gets no release, so the drag ends here.
void EditorPaper::hideEvent(QHideEvent* event) {
    if (m_drag != Drag::None)
        drag(QEvent::MouseButtonRelease, {});
    QWidget::hideEvent(event);
}

bool EditorPaper::eventFilter(QObject* watched, QEvent* event) {
    if (watched != m_caption)
        return QWidget::eventFilter(watched, event);
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseMove:
    case QEvent::MouseButtonRelease: {
        const auto& mouse = static_cast<QMouseEvent&>(*event);
        if (event->type() != QEvent::MouseMove && mouse.button() != Qt::LeftButton)
            return true;
        if (event->type() == QEvent::MouseButtonPress)
            m_drag = Drag::Caption;
        if (m_drag == Drag::Caption)
            drag(event->type(), onPaper(m_caption->mapToParent(mouse.position())));
        return true;
    }
    case QEvent::Hide:
        if (m_drag == Drag::Caption)
            drag(QEvent::MouseButtonRelease, {});
        break;
    default:
        break;
    }
    return QWidget::eventFilter(watched, event);
}

EditorTable::EditorTable(tFrmNew& page, const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_page(page)
    , m_theme(theme)
    , m_paper(new EditorPaper(page, this)) {
    setMinimumSize(theme.px(200), theme.px(150));
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
}

void EditorTable::render(const QString& said) {
    m_paper->setVisible(m_page.pictureOpen());
    if (m_words != said) {
        m_words = said;
        update();
    }
}

PaperPlace EditorTable::place(int height, const std::optional<PanelForms>& panel) {
    const PictureSize paper = m_page.controls().PicPicSize;
    const int edge = m_theme.px(10);
    const QSize room(width(), height);
    if (!m_page.pictureOpen() || paper.width < 1 || paper.height < 1 || room.width() < 4 * edge || height < 4 * edge)
        return {};
    const QSizeF shape(paper.width, paper.height);
    PaperPlace place;
    if (panel)
        place = placedBesidePanel(room, shape, edge, *panel);
    if (place.paper.isEmpty())
        place.paper = placedPaper(room, shape, edge);
    if (m_paper->geometry() != place.paper) {
        m_paper->setGeometry(place.paper);
        update();
    }
    m_page.setPreviewScale(double(place.paper.width()) / paper.width * devicePixelRatioF());
    m_paper->render();
    return place;
}

void EditorTable::resizeEvent(QResizeEvent*) {
    Q_EMIT resized();
}

// The drag of the first finger closes the panel.
void EditorTable::touched() {
    m_turns = isVisible() && m_page.controls().Frame4.visible;
}

void EditorTable::pinched(const Pinch& pinch) {
    if (!isVisible())
        return; // its page may have gone
    if (!m_steps) {
        m_steps.emplace(m_page.previewZoom());
        if (m_turns)
            m_page.Image15_MouseMove();
    }
    const PinchSteps::Steps steps = m_steps->follow(pinch.times(), m_turns ? pinch.degrees() : 0);
    if (steps.any())
        m_page.PicPic_Pinch(steps);
}

void EditorTable::wheelEvent(QWheelEvent* event) {
    m_wheel += event->angleDelta().y();
    if (const int notches = m_wheel / QWheelEvent::DefaultDeltasPerStep; notches != 0) {
        m_wheel -= notches * QWheelEvent::DefaultDeltasPerStep;
        m_page.PicPic_Pinch({notches * PinchSteps::ofNotch, 0});
    }
}

void EditorTable::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(tableColour);
    painter.drawRoundedRect(rect(), m_theme.corner(), m_theme.corner());
    if (m_paper->isVisible()) {
        const QRectF paper = m_paper->geometry();
        for (int i = 4; i >= 1; --i) { // a soft shadow
            painter.setBrush(QColor(0, 0, 0, 28));
            painter.drawRoundedRect(paper.adjusted(-i, -i + 2, i, i + 2), i, i);
        }
    } else {
        painter.setPen(words);
        painter.setFont(m_theme.font(Theme::Type::Large));
        painter.setLayoutDirection(layoutDirection());
        painter.drawText(rect().adjusted(20, 20, -20, -20), Qt::AlignCenter | Qt::TextWordWrap, m_words);
    }
}

} // namespace lumora
