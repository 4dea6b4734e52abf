#include "editing/redeye/RedUndoCopy.h"

#include <QPainter>

#include <utility>
#include <vector>

namespace lumora {

RedUndoCopy::~RedUndoCopy() {
    end();
}

void RedUndoCopy::begin(const Bitmap& picture, const std::filesystem::path& file) {
    end();
    m_file = file;
    m_waiting.emplace(m_file, QString::fromLocal8Bit(m_file.c_str()));
    m_written = false;
    // Only the thread uses the picture until finishWriting() has joined the thread.
    m_writer = std::jthread([this, copy = Bitmap(picture)](const std::stop_token& stop) mutable {
        appendBmp(copy, *m_waiting, [&stop] { return stop.stop_requested(); });
        copy = Bitmap();
        m_written = true;
    });
}

Result<void> RedUndoCopy::commitWaiting() {
    Result<void> written = m_waiting->commit(NewContent::Durability::Passing);
    m_waiting.reset();
    return written;
}

Result<void> RedUndoCopy::finishWriting(const Bitmap& picture) {
    if (m_rows)
        return {};
    if (m_writer.joinable())
        m_writer.join();
    Result<void> written = m_waiting ? commitWaiting() : Failure{};
    if (!written) {
        // The background writing failed; a second try may find room and a folder.
        m_waiting.emplace(m_file, QString::fromLocal8Bit(m_file.c_str()));
        appendBmp(picture, *m_waiting, [] { return false; });
        m_differs = {};
        written = commitWaiting();
    }
    if (!written)
        return written;
    auto rows = BmpRows::open(m_file, picture.image().size());
    if (!rows)
        return rows.failure();
    m_rows = std::move(*rows);
    return {};
}

Result<void> RedUndoCopy::keep(const Bitmap& picture, const QRect& part) {
    if (auto written = finishWriting(picture); !written)
        return written;
    m_kept = false;
    for (const QRect& rect : m_differs) {
        if (auto written = m_rows->write(picture, rect); !written)
            return written;
    }
    m_differs = part & picture.image().rect();
    m_kept = true;
    return {};
}

void RedUndoCopy::changedOtherwise(const QRegion& region) {
    m_differs += region;
}

Result<QRegion> RedUndoCopy::restore(Bitmap& picture) {
    if (!m_kept)
        return QRegion();
    std::vector<std::pair<QPoint, Bitmap>> parts;
    for (const QRect& rect : m_differs) {
        auto part = m_rows->read(rect);
        if (!part)
            return part.failure();
        parts.emplace_back(rect.topLeft(), std::move(*part));
    }
    QPainter painter(&picture.image());
    painter.setCompositionMode(QPainter::CompositionMode_Source);
    for (const auto& [at, part] : parts)
        painter.drawImage(at, part.image());
    return std::exchange(m_differs, {});
}

void RedUndoCopy::end() {
    if (m_writer.joinable()) {
        m_writer.request_stop();
        m_writer.join();
    }
    m_waiting.reset();
    m_rows.reset();
    m_differs = {};
    m_kept = false;
}

} // namespace lumora
