#include "imaging/scaling/Resample.h"

#include "imaging/Stopwatch.h"
#include "imaging/drawing/ColourPlanes.h"
#include "imaging/files/JpegWriter.h"
#include "imaging/scaling/PixelRows.h"
#include "imaging/scaling/PlaneScaler.h"
#include "imaging/scaling/ShrunkPlanes.h"

#include <algorithm>
#include <optional>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

QRect wholeOf(PictureSize size) {
    return {0, 0, size.width, size.height};
}

double stepOf(double pitch, int sourceSize, int targetSize, int targetPitch) {
    return static_cast<double>(targetPitch) * sourceSize / targetSize / pitch;
}

// Holds a scaler for each plane; a derived class takes the scaled rows.
class ScalingTaker : public PlaneTaker {
public:
    // part is the part of the target to make; it must be the whole target when chroma is coarser than luma.
    ScalingTaker(PictureSize source, PictureSize target, const QRect& part, int chromaPitch,
                 const ResampleKernels& kernels)
        : m_source(source)
        , m_target(target)
        , m_part(part)
        , m_chromaPitch(chromaPitch)
        , m_kernels(kernels) {}

    void begin(const std::vector<PlaneLayout>& planes) override {
        m_planes = planes;
        m_written.assign(planes.size(), 0);
        m_scalers.reserve(planes.size());
        for (const PlaneLayout& plane : planes) {
            const int pitch = m_scalers.empty() ? 1 : m_chromaPitch;
            const PlaneAxis across{plane.width, (m_part.width() + pitch - 1) / pitch,
                                   stepOf(plane.pitchX, m_source.width, m_target.width, pitch), m_part.left()};
            const PlaneAxis down{plane.height, (m_part.height() + pitch - 1) / pitch,
                                 stepOf(plane.pitchY, m_source.height, m_target.height, pitch), m_part.top()};
            const PlaneScaler* like = m_scalers.empty() ? nullptr : &m_scalers.back();
            m_scalers.emplace_back(across, down, plane.rowsAtOnce, plane.rowBytes, m_kernels, like);
        }
    }
    unsigned char* row(int plane, int y) override { return m_scalers[static_cast<std::size_t>(plane)].inputRow(y); }
    void rowsReady() override {
        for (std::size_t i = 0; i < m_planes.size(); ++i) {
            m_written[i] += m_planes[i].rowsAtOnce;
            m_scalers[i].rowsReady(m_written[i]);
        }
        rowsScaled();
    }

protected:
    // Called when more rows of scalers() may be ready, the last time when all are.
    virtual void rowsScaled() = 0;
    std::vector<PlaneScaler>& scalers() { return m_scalers; }
    QRect part() const { return m_part; }

private:
    PictureSize m_source;
    PictureSize m_target;
    QRect m_part;
    int m_chromaPitch;
    const ResampleKernels& m_kernels;
    std::vector<PlaneLayout> m_planes;
    std::vector<int> m_written;
    std::vector<PlaneScaler> m_scalers;
};

class BitmapTaker : public ScalingTaker {
public:
    BitmapTaker(PictureSize source, PictureSize size, const QRect& part, Bitmap& target, const ResampleKernels& kernels)
        : ScalingTaker(source, size, part, 1, kernels)
        , m_bitmap(target)
        , m_neutral(static_cast<std::size_t>(target.width()), 128) {}

private:
    void rowsScaled() override {
        int end = part().height();
        for (const PlaneScaler& scaler : scalers())
            end = std::min(end, scaler.outputEnd());
        const bool grey = scalers().size() < 3;
        for (; m_next < end; ++m_next) {
            pixelsOf(scalers()[0].outputRow(m_next), grey ? m_neutral.data() : scalers()[1].outputRow(m_next),
                     grey ? m_neutral.data() : scalers()[2].outputRow(m_next), part().width(),
                     reinterpret_cast<QRgb*>(m_bitmap.image().scanLine(m_next)));
        }
        for (PlaneScaler& scaler : scalers())
            scaler.release(m_next);
    }

    Bitmap& m_bitmap;
    std::vector<unsigned char> m_neutral;
    int m_next = 0;
};

// The format that pixels of a picture without alpha have.
Bitmap unfilled(PictureSize size) {
    return Bitmap(QImage(size.width, size.height, QImage::Format_RGB32));
}

class JpegTaker : public ScalingTaker {
public:
    JpegTaker(PictureSize source, PictureSize target, JpegWriter& writer, const ResampleKernels& kernels,
              Stopwatch& watch)
        : ScalingTaker(source, target, wholeOf(target), 2, kernels)
        , m_writer(writer)
        , m_watch(watch)
        , m_neutral(static_cast<std::size_t>(target.width) / 2 + ResampleKernels::slack, 128) {}

    void rowsReady() override {
        m_watch.add(&PictureTimes::decode);
        ScalingTaker::rowsReady();
        m_watch.add(&PictureTimes::draw);
    }

private:
    void rowsScaled() override {
        const int height = part().height();
        while (m_next < height) {
            const int chroma = m_next / 2;
            if (scalers()[0].outputEnd() < std::min(m_next + JpegWriter::lumaRows, height))
                return;
            for (std::size_t i = 1; i < scalers().size(); ++i) {
                if (scalers()[i].outputEnd() < std::min(chroma + JpegWriter::chromaRows, (height + 1) / 2))
                    return;
            }
            JpegWriter::PlaneRows rows{};
            for (int y = 0; y < JpegWriter::lumaRows; ++y)
                rows.luma[static_cast<std::size_t>(y)] = scalers()[0].outputRow(std::min(m_next + y, height - 1));
            for (int y = 0; y < JpegWriter::chromaRows; ++y) {
                const int at = std::min(chroma + y, (height + 1) / 2 - 1);
                rows.cb[static_cast<std::size_t>(y)] =
                    scalers().size() < 3 ? m_neutral.data() : scalers()[1].outputRow(at);
                rows.cr[static_cast<std::size_t>(y)] =
                    scalers().size() < 3 ? m_neutral.data() : scalers()[2].outputRow(at);
            }
            m_watch.add(&PictureTimes::draw);
            m_writer.planeRows(rows);
            m_watch.add(&PictureTimes::encode);
            m_next += JpegWriter::lumaRows;
            scalers()[0].release(m_next);
            for (std::size_t i = 1; i < scalers().size(); ++i)
                scalers()[i].release(m_next / 2);
        }
    }

    JpegWriter& m_writer;
    Stopwatch& m_watch;
    std::vector<unsigned char> m_neutral;
    int m_next = 0;
};

} // namespace

namespace {

// source and target have the same 32-bit format. size is that of the whole scaled picture, whose part is written to at.
void resampleInto(QImage& target, QPoint at, const QImage& source, PictureSize size, const QRect& part,
                  const ResampleKernels& kernels) {
    const PlaneAxis across{source.width(), part.width(), stepOf(1, source.width(), size.width, 1), part.left()};
    const PlaneAxis down{source.height(), part.height(), stepOf(1, source.height(), size.height, 1), part.top()};
    const int channels = source.hasAlphaChannel() ? 4 : 3;
    std::vector<PlaneScaler> scalers;
    scalers.reserve(4);
    for (int i = 0; i < channels; ++i)
        scalers.emplace_back(across, down, 1, source.width(), kernels, i > 0 ? &scalers.front() : nullptr);
    const PlaneScaler::Range columns = scalers[0].inputColumns();
    const PlaneScaler::Range lines = scalers[0].inputRows();
    int next = 0;
    std::vector<std::uint8_t*> rows(scalers.size());
    for (int y = lines.begin; y < lines.end; ++y) {
        for (std::size_t i = 0; i < rows.size(); ++i)
            rows[i] = scalers[i].inputRow(y) + columns.begin;
        splitRow(reinterpret_cast<const std::uint32_t*>(source.constScanLine(y)) + columns.begin,
                 columns.end - columns.begin, rows);
        for (PlaneScaler& scaler : scalers)
            scaler.rowsReady(y + 1);
        for (; next < scalers[0].outputEnd(); ++next) {
            for (std::size_t i = 0; i < rows.size(); ++i)
                rows[i] = scalers[i].outputRow(next);
            // The cubic overshoots at edges, so that a colour may exceed its alpha; joinRow limits it.
            joinRow(rows, part.width(), reinterpret_cast<std::uint32_t*>(target.scanLine(at.y() + next)) + at.x());
        }
        for (PlaneScaler& scaler : scalers)
            scaler.release(next);
    }
}

} // namespace

Bitmap resampled(const Bitmap& picture, PictureSize size, const ResampleKernels& kernels) {
    return resampledPart(picture, size, wholeOf(size), kernels);
}

Bitmap resampledPart(const Bitmap& picture, PictureSize size, const QRect& part, const ResampleKernels& kernels) {
    if (picture.isNull() || size.width < 1 || size.height < 1 || part.isEmpty())
        return {};
    const bool transparent = picture.image().hasAlphaChannel();
    const QImage source =
        picture.image().convertToFormat(transparent ? QImage::Format_ARGB32_Premultiplied : QImage::Format_RGB32);
    QImage target(part.size(), source.format());
    if (source.isNull() || target.isNull())
        return {};
    resampleInto(target, {0, 0}, source, size, part, kernels);
    return Bitmap(std::move(target));
}

void drawStretched(Bitmap& paper, const Bitmap& picture, const QRect& part) {
    const QRect area = part & QRect(0, 0, paper.width(), paper.height());
    if (paper.isNull() || picture.isNull() || area.isEmpty())
        return;
    const QImage source = picture.image().convertToFormat(QImage::Format_RGB32);
    if (!source.isNull())
        resampleInto(paper.image(), area.topLeft(), source, {paper.width(), paper.height()}, area, bestKernels());
}

int decodeDenominator(PictureSize source, PictureSize wanted) {
    int denominator = 8;
    while (denominator > 1 &&
           (source.width / denominator < wanted.width * 2LL || source.height / denominator < wanted.height * 2LL))
        denominator /= 2;
    return denominator;
}

Result<Bitmap> readResampled(JpegReader& reader, PictureSize size, const ResampleKernels& kernels) {
    return readResampledPart(reader, size, wholeOf(size), kernels);
}

Result<Bitmap> readResampledPart(JpegReader& reader, PictureSize size, const QRect& part,
                                 const ResampleKernels& kernels) {
    const int denominator = decodeDenominator(reader.size(), size);
    if (!reader.hasPlanes()) {
        auto whole = reader.readBitmap(denominator);
        return whole ? Result<Bitmap>(resampledPart(*whole, size, part, kernels)) : whole;
    }
    Bitmap target = unfilled({part.width(), part.height()});
    if (target.isNull())
        return Failure{Failure::Kind::TooLarge, u"memory is short"_s};
    BitmapTaker taker(reader.size(), size, part, target, kernels);
    if (auto read = reader.readPlanes(denominator, taker); !read)
        return read.failure();
    return target;
}

Result<QByteArray> readResampledToJpeg(JpegReader& reader, PictureSize size, int quality,
                                       const ResampleKernels& kernels, PictureTimes* times, SmallCopy* small) {
    Stopwatch watch(times);
    JpegWriter writer(size, quality, JpegWriter::Input::Planes);
    JpegTaker taker(reader.size(), size, writer, kernels, watch);
    const int denominator = decodeDenominator(reader.size(), size);
    Result<void> read;
    Bitmap pixels = small != nullptr && reader.hasPlanes() ? unfilled(small->size) : Bitmap();
    if (small == nullptr || pixels.isNull()) {
        read = reader.readPlanes(denominator, taker);
    } else {
        BitmapTaker smallTaker(reader.size(), small->size, wholeOf(small->size), pixels, kernels);
        ShrunkPlanes both(taker, smallTaker, decodeDenominator(reader.size(), small->size));
        read = reader.readPlanes(denominator, both);
        if (read && both.reachesSmall())
            small->pixels = std::move(pixels);
    }
    watch.add(&PictureTimes::decode);
    if (!read)
        return read.failure();
    auto bytes = writer.finish();
    watch.add(&PictureTimes::encode);
    return bytes;
}

} // namespace lumora
