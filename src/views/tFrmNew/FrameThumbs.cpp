#include "views/tFrmNew/FrameThumbs.h"

#include "views/kit/Painting.h"

#include <QKeyEvent>
#include <QPainter>
#include <QScrollBar>
#include <QStyledItemDelegate>

#include <algorithm>
#include <map>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int across = 2;

// As the preview draws a frame: black is clear, and a pixel is solid from a little light on.
QImage withClearBlack(const QImage& frame) {
    QImage result = frame.convertToFormat(QImage::Format_ARGB32);
    for (int y = 0; y < result.height(); ++y) {
        auto* row = reinterpret_cast<QRgb*>(result.scanLine(y));
        for (int x = 0; x < result.width(); ++x) {
            const QRgb pixel = row[x];
            const int alpha = std::min(255, 11 * (qRed(pixel) + qGreen(pixel) + qBlue(pixel)));
            row[x] = qRgba(qRed(pixel), qGreen(pixel), qBlue(pixel), std::min(alpha, qAlpha(pixel)));
        }
    }
    return result;
}

class Thumb : public QStyledItemDelegate {
public:
    Thumb(const Theme& theme, std::function<Bitmap(int)> picture, const int& worn, QObject* parent)
        : QStyledItemDelegate(parent)
        , m_theme(theme)
        , m_picture(std::move(picture))
        , m_worn(worn) {}

    QSize sizeHint(const QStyleOptionViewItem&, const QModelIndex&) const override { return cell; }
    QSize cell{60, 44};

    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override {
        painter->save();
        painter->setLayoutDirection(Qt::LeftToRight);
        const bool worn = index.row() == m_worn;
        const bool lively = option.state & (QStyle::State_Selected | QStyle::State_MouseOver);
        const QRectF card = drawCard(*painter, option.rect.adjusted(1, 1, -1, -1),
                                     worn                                    ? Theme::Colour::Primary
                                     : option.state & QStyle::State_HasFocus ? Theme::Colour::Focus
                                     : lively                                ? Theme::Colour::Edge
                                                                             : Theme::Colour::Line,
                                     worn ? Theme::Colour::PrimarySoft : Theme::Colour::Surface,
                                     worn ? m_theme.thick() : std::max(m_theme.px(1), m_theme.edge()), m_theme.px(8));
        const int inset = m_theme.size(Space::Tight);
        const QImage& frame = clear(index.row());
        const QRectF paper =
            fitted(card.adjusted(inset, inset, -inset, -inset), frame.isNull() ? QSizeF(3, 2) : QSizeF(frame.size()));
        drawSamplePicture(*painter, paper);
        if (frame.isNull()) {
            painter->setPen(Theme::Colour::Ink);
            painter->drawText(paper, Qt::AlignCenter, index.data(Qt::UserRole).toString());
        } else {
            painter->drawImage(paper, frame);
        }
        if (worn)
            drawMark(*painter, m_theme, card,
                     {.icon = u"tick"_s, .disc = Theme::Colour::Primary, .radius = 10, .inset = 2, .rim = 2});
        painter->restore();
    }

private:
    // Kept by its source bitmap, so that a category that is chosen again is not drawn again.
    const QImage& clear(int row) const {
        const Bitmap picture = m_picture(row);
        static const QImage none;
        if (picture.isNull())
            return none;
        QImage& kept = m_clear[picture.image().cacheKey()];
        if (kept.isNull())
            kept = withClearBlack(picture.image());
        return kept;
    }

    const Theme& m_theme;
    std::function<Bitmap(int)> m_picture;
    const int& m_worn;
    mutable std::map<qint64, QImage> m_clear;
};

} // namespace

FrameThumbs::FrameThumbs(const Theme& theme, std::function<Bitmap(int)> picture, QWidget* parent)
    : QListWidget(parent)
    , m_theme(theme)
    , m_picture(std::move(picture)) {
    setProperty("ownRing", true);
    setViewMode(QListView::IconMode);
    setMovement(QListView::Static);
    setResizeMode(QListView::Adjust);
    setUniformItemSizes(true);
    setMouseTracking(true);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAsNeeded);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    setTabKeyNavigation(false);
    m_thumb = new Thumb(theme, m_picture, m_worn, this);
    setItemDelegate(m_thumb);
    connect(this, &QListWidget::itemClicked, this, [this](QListWidgetItem* item) { Q_EMIT picked(row(item)); });
}

void FrameThumbs::setWorn(int row) {
    if (m_worn == row)
        return;
    m_worn = row;
    if (QListWidgetItem* worn = item(row))
        scrollToItem(worn);
    viewport()->update();
}

void FrameThumbs::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Space || event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter) {
        if (currentRow() >= 0)
            Q_EMIT picked(currentRow());
        return;
    }
    const int before = currentRow();
    QListWidget::keyPressEvent(event);
    if (currentRow() != before && currentRow() >= 0)
        Q_EMIT picked(currentRow());
}

void FrameThumbs::resizeEvent(QResizeEvent* event) {
    QListWidget::resizeEvent(event);
    layOut();
}

void FrameThumbs::layOut() {
    // Room for the scroll bar is kept also while there is none: it would come and go with the cells' own size.
    const int width = (maximumViewportSize().width() - verticalScrollBar()->sizeHint().width() - 2) / across;
    const QSize cell(width, std::max(m_theme.least(), width * 2 / 3 + m_theme.px(6)));
    if (gridSize() == cell)
        return;
    static_cast<Thumb*>(m_thumb)->cell = cell;
    setGridSize(cell);
}

} // namespace lumora
