#include "assembly/edited/EditedPrints.h"

#include "common/FixedText.h"
#include "editing/render/EditedPicture.h"
#include "imaging/files/BmpFile.h"
#include "order/EditRecord.h"
#include "order/KeptPictures.h"
#include "order/UnfinishedOrders.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <new>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

namespace fs = std::filesystem;

// Together with what the program takes besides under 400 MB, also where each picture has 50 megapixels.
constexpr std::int64_t renderingRoom = 300 << 20;
constexpr int previewWidth = 300;

EditedPrintResult render(EditedPrint print, const EditFields& edit, const fs::path& toneCopy) try {
    std::unique_ptr<NewContent> copy;
    if (edit.ToneFlag == 1) {
        Result<Bitmap> grey = loadGrey(print.file);
        if (!grey)
            return {grey.failure()};
        print.grey = std::move(*grey);
        copy = std::make_unique<NewContent>(toneCopy, toText(toneCopy));
        appendBmp(print.grey, *copy, [] { return false; });
        if (copy->failed())
            return {Failure{Failure::Kind::Other, toText(toneCopy)}, {}, std::move(copy)};
    }
    Result<QByteArray> jpeg = renderEditedPrintToJpeg(print, edit);
    Bitmap preview = jpeg ? printPreview(*jpeg) : Bitmap();
    return {std::move(jpeg), std::move(preview), std::move(copy)};
} catch (const std::bad_alloc&) {
    return {Failure{Failure::Kind::TooLarge, u"%1: memory is short"_s.arg(toText(print.file))}};
}

} // namespace

Bitmap printPreview(const QByteArray& jpeg) {
    const Result<Bitmap> preview = scaledFromJpeg(jpeg, previewWidth);
    return preview ? *preview : Bitmap();
}

EditedPrints::EditedPrints(const SessionState& state, const Files& files, const QStringList& items,
                           const QSet<int>& there, std::optional<PaperSize> paper)
    : m_state(state)
    , m_files(files)
    , m_paper(paper)
    , m_memory(renderingRoom) {
    for (int i = 0; i < items.size(); ++i) {
        BasketLine item = BasketLine::split(items[i], LineForm::Full);
        if (!there.contains(i) && item.hasUsableName())
            m_items.push_back(std::move(item));
    }
    m_ahead = std::make_unique<Ahead>(static_cast<int>(m_items.size()),
                                      [this](int i) { return rendering(m_items[static_cast<std::size_t>(i)]); });
    m_ahead->begin();
}

EditedPrints::Ahead::Work EditedPrints::rendering(const BasketLine& item) {
    EditFields edit;
    UnpackEditState(item.editState, edit);
    const Drives& drives = m_files.drives();
    const DrivePath source = PictureOf(item, LineForm::Full, m_state);
    const std::optional<HostPath> file =
        HasQuestionMark(source.text()) ? std::nullopt : KeptPictures(m_files, m_state.keptFolder).hostOf(source);
    const std::optional<HostPath> copy = drives.toHost(WorkspacePaths::toneCopy(m_state));
    if (!m_paper || !file || !copy)
        return [source]() -> EditedPrintResult { return {Failure{Failure::Kind::NotFound, source.text()}}; };
    EditedPrint print;
    print.file = *file;
    print.paper = *m_paper;
    print.framesFolder = drives.toHost(WorkspacePaths::misgarot(m_state)).value_or(HostPath());
    return [print, edit, copy = *copy, memory = &m_memory] {
        const MemoryShare::Hold hold = memory->hold(renderingMemory(print, edit));
        return render(print, edit, copy);
    };
}

} // namespace lumora
