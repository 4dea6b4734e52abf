#include "editing/redeye/RedEyePicture.h"

#include "editing/redeye/RedOverview.h"

#include <QPainter>

#include <algorithm>
#include <utility>

namespace lumora {
namespace {

void paintOver(Bitmap& picture, QPoint at, const Bitmap& part) {
    QPainter painter(&picture.image());
    painter.setCompositionMode(QPainter::CompositionMode_Source);
    painter.drawImage(at, part.image());
}

// Whether the part of the second picture holds the pixels that stand at a place of the first; both have 32 bits a
// pixel.
bool isSame(const QImage& first, QPoint at, const QImage& second, const QRect& part) {
    for (int y = 0; y < part.height(); ++y) {
        const auto* a = reinterpret_cast<const QRgb*>(first.constScanLine(at.y() + y)) + at.x();
        const auto* b = reinterpret_cast<const QRgb*>(second.constScanLine(part.top() + y)) + part.left();
        if (!std::equal(a, a + part.width(), b, [](QRgb one, QRgb other) { return ((one ^ other) & RGB_MASK) == 0; }))
            return false;
    }
    return true;
}

} // namespace

RedEyePicture::Originals RedEyePicture::differences(const Bitmap& file, const Bitmap& picture) {
    constexpr int side = 64;
    Originals found;
    for (int top = 0; top < picture.height(); top += side) {
        for (int left = 0; left < picture.width(); left += side) {
            const QRect tile = QRect(left, top, side, side) & picture.image().rect();
            if (!isSame(file.image(), tile.topLeft(), picture.image(), tile))
                found.emplace_back(tile.topLeft(), Bitmap(file.image().copy(tile)));
        }
    }
    return found;
}

bool RedEyePicture::differsFromFile() const {
    return std::any_of(m_originals.begin(), m_originals.end(), [this](const auto& original) {
        const QRect part(original.first, original.second.image().size());
        return !isSame(original.second.image(), {0, 0}, Picture1.image(), part);
    });
}

void RedEyePicture::begin(Bitmap picture, Bitmap overview, PictureSize overviewSize, const std::filesystem::path& file,
                          Originals originals) {
    m_originals = std::move(originals);
    for (const auto& [at, original] : m_originals)
        m_corrected += QRect(at, original.image().size());
    m_wasCorrected = !m_originals.empty();
    Picture1 = std::move(picture);
    Picture3 = std::move(overview);
    Picture3Size = overviewSize;
    if (!file.empty())
        m_undo.begin(Picture1, file);
}

void RedEyePicture::clear() {
    end();
    Picture1 = Picture3 = Picture7 = Picture2 = Image1Picture = Bitmap();
    patchPlace = {};
    m_corrected = {};
    m_originals.clear();
    RedChanged = m_changedBefore = m_wasCorrected = false;
    RedFixLevel = 0;
}

Result<void> RedEyePicture::keep(const QRect& part) {
    const QRect inside = part & Picture1.image().rect();
    if (const Result<void> kept = m_undo.keep(Picture1, inside); !kept)
        return kept;
    m_changedBefore = RedChanged;
    for (const QRect& fresh : QRegion(inside) - m_corrected)
        m_originals.emplace_back(fresh.topLeft(), Bitmap(Picture1.image().copy(fresh)));
    m_corrected += inside;
    return {};
}

void RedEyePicture::drawOverview() {
    Picture3Size = RedOverview::size({Picture1.width(), Picture1.height()});
    Picture3 = RedOverview::draw(Picture1, RedOverview::pixels(Picture3Size));
}

void RedEyePicture::findPeak(QPoint centre) {
    peak = RedEye::findPeak(Picture1, centre);
    RedPeakValue = peak.redness;
    RedPeakX = peak.x;
    RedPeakY = peak.y;
    RedPeakBrightness = peak.brightness;
}

bool RedEyePicture::takePatch(const QRect& circle) {
    const bool moved = std::exchange(patchPlace, circle) != circle;
    Image1Picture = Picture7 = Bitmap(Picture1.image().copy(patchPlace));
    return moved;
}

QStringList RedEyePicture::correct(QPoint centre) {
    findPeak(centre);
    QStringList changed = RedEye::correct(Picture1, patchPlace, peak.ratio(), RedFixLevel);
    Picture2 = Picture7 = Bitmap(Picture1.image().copy(patchPlace));
    RedOverview::refresh(Picture3, Picture1, patchPlace);
    return changed;
}

RedEye::PatchStats RedEyePicture::correctByHand(int passes, QPoint meant) {
    RedEye::PatchStats stats;
    for (int pass = 0; pass < passes; ++pass) {
        stats = RedEye::patchStats(Picture7);
        if (stats.peak.redness > 0) {
            RedPeakValue = stats.peak.redness;
            RedPeakX = stats.peak.x;
            RedPeakY = stats.peak.y;
            RedPeakBrightness = stats.peak.brightness;
        }
        // The first pass goes round the point that was meant, the later ones round the strongest pixel.
        if (pass == 0) {
            RedPeakX = meant.x();
            RedPeakY = meant.y();
        }
        RedEye::fixAround(Picture7, {RedPeakX, RedPeakY}, {RedPeakValue, RedPeakX, RedPeakY, RedPeakBrightness});
    }
    putPatchBack();
    return stats;
}

void RedEyePicture::darken(const QStringList& pixels) {
    RedEye::darken(Picture7, Picture7.image().rect(), pixels);
    m_undo.changedOtherwise(patchPlace & Picture1.image().rect());
    putPatchBack();
}

void RedEyePicture::putPatchBack() {
    paintOver(Picture1, patchPlace.topLeft(), Picture7);
    Picture2 = Picture7;
    RedOverview::refresh(Picture3, Picture1, patchPlace);
}

Result<void> RedEyePicture::goBack() {
    const Result<QRegion> restored = m_undo.restore(Picture1);
    if (!restored)
        return restored.failure();
    RedChanged = m_changedBefore;
    afterGoingBack(*restored);
    return {};
}

void RedEyePicture::cancelAll() {
    for (const auto& [at, original] : m_originals)
        paintOver(Picture1, at, original);
    m_undo.changedOtherwise(m_corrected);
    RedChanged = false;
    afterGoingBack(m_corrected);
}

// The correction of the patch in work is gone, so the patch goes too.
void RedEyePicture::afterGoingBack(const QRegion& changedPart) {
    for (const QRect& rect : changedPart)
        RedOverview::refresh(Picture3, Picture1, rect);
    RedFixLevel = 0;
    Picture7 = Picture2 = Bitmap();
    patchPlace = {};
}

} // namespace lumora
