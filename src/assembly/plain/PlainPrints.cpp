#include "assembly/plain/PlainPrints.h"

#include "assembly/OrderSheet.h"
#include "assembly/PaperResize.h"
#include "common/FixedText.h"
#include "imaging/files/JpegCheck.h"
#include "imaging/files/PictureFile.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"

#include <algorithm>
#include <utility>

namespace lumora {

namespace {

// Together with what the program takes besides under 400 MB, also where each picture has 50 megapixels.
constexpr std::int64_t decodingRoom = 180 << 20;
constexpr qsizetype readyRoom = 128 << 20;

} // namespace

PlainPrints::PlainPrints(const SessionState& state, const Files& files, const QStringList& items,
                         const QSet<int>& notMade)
    : m_files(files)
    , m_kept(files, state.keptFolder)
    , m_paper(PaperSize::ofText(state.shemot.ppr))
    , m_deep(state.DchisaAmoka == 1)
    , m_careful(state.Careful)
    , m_ready(static_cast<std::size_t>(items.size()))
    , m_memory(decodingRoom) {
    for (int i = 0; i < items.size(); ++i) {
        m_lines.push_back(BasketLine::split(items[i], LineForm::Short));
        m_wanted.push_back(!notMade.contains(i) && m_lines.back().hasUsableName() && !HasQuestionMark(items[i]));
    }
}

PlainPrints::~PlainPrints() = default;

void PlainPrints::beginSheet(int cells) {
    m_making = std::make_unique<MakingSmall>(std::min(cells, static_cast<int>(m_lines.size())),
                                             [this](int i) { return scalingBoth(i); });
    m_making->begin();
}

Result<Bitmap> PlainPrints::nextSmall(const Waiting& whileWaiting) {
    Made made = m_making->take(whileWaiting);
    std::optional<Result<QByteArray>>& ready = m_ready[static_cast<std::size_t>(m_nextSmall++)];
    if (made.print && *made.print) { // else tried again at its own step: a card may be back by then
        m_readyBytes += (*made.print)->size();
        ready = std::move(made.print);
    }
    return std::move(made.small);
}

void PlainPrints::beginPrints() {
    m_making.reset();
    for (std::size_t i = 0; i < m_lines.size(); ++i) {
        if (m_wanted[i] && !m_ready[i])
            m_left.push_back(static_cast<int>(i));
    }
    m_makingLeft = std::make_unique<Making>(static_cast<int>(m_left.size()), [this](int i) {
        const int line = m_left[static_cast<std::size_t>(i)];
        return m_deep ? copying(line) : scaling(line);
    });
    m_makingLeft->begin();
}

Result<QByteArray> PlainPrints::print(int line, const Waiting& whileWaiting) {
    if (auto& ready = m_ready[static_cast<std::size_t>(line)]; ready)
        return *std::exchange(ready, std::nullopt);
    return m_makingLeft->take(whileWaiting);
}

std::function<PlainPrints::Made()> PlainPrints::scalingBoth(int line) {
    const auto at = static_cast<std::size_t>(line);
    const std::optional<HostPath> source = m_kept.hostOf(m_lines[at].path);
    const bool prints = m_wanted[at] && !m_deep && m_paper && m_readyBytes < readyRoom;
    return [source, paper = m_paper, prints, memory = &m_memory]() -> Made {
        if (!source)
            return {std::nullopt, Failure{Failure::Kind::NotFound, {}}};
        const MemoryShare::Hold hold = memory->hold(decodingMemory(*source, Decode::Rows));
        Bitmap small;
        std::optional<Result<QByteArray>> print;
        if (prints)
            print = resizeToPaper(*source, *paper, &small);
        if (print && *print)
            (*print)->squeeze(); // it is kept
        if (small.isNull())
            return {std::move(print), sheetThumbnail(*source)};
        return {std::move(print), std::move(small)};
    };
}

std::function<Result<QByteArray>()> PlainPrints::scaling(int line) {
    const std::optional<HostPath> source = m_kept.hostOf(m_lines[static_cast<std::size_t>(line)].path);
    return [source, paper = m_paper, memory = &m_memory]() -> Result<QByteArray> {
        if (!source || !paper)
            return Failure{Failure::Kind::NotFound, {}};
        const MemoryShare::Hold hold = memory->hold(decodingMemory(*source, Decode::Rows));
        return resizeToPaper(*source, *paper);
    };
}

std::function<Result<QByteArray>()> PlainPrints::copying(int line) const {
    const DrivePath path = m_kept.fileOf(m_lines[static_cast<std::size_t>(line)].path);
    const Result<HostPath> source = m_files.host(path);
    return [source, path, decoded = m_careful, files = &m_files]() -> Result<QByteArray> {
        if (!source)
            return source.failure();
        const Result<void> whole = decoded ? checkJpegDecodes(*source) : Result<void>();
        return whole ? files->read(path) : whole.failure();
    };
}

} // namespace lumora
