#include "selection/OrderResolution.h"

#include "order/BasketLine.h"
#include "order/EditRecord.h"
#include "order/KeptPictures.h"
#include "platform/files/Files.h"
#include "selection/Basket.h"
#include "selection/FinishRule.h"
#include "session/SessionState.h"

namespace lumora {

std::optional<PaperSize> OrderResolution::paper() const {
    return m_state.Optint == OrderKind::Album ? std::nullopt : PaperSize::ofText(m_state.shemot.ppr);
}

PaperFit OrderResolution::fit() const {
    return paperFitOf(m_state.shemot.FillFit);
}

void OrderResolution::look(const QString& path) {
    const std::optional<HostPath> file = KeptPictures(m_files, m_state.keptFolder).hostOf(DrivePath(path));
    const Result<PictureSize> size = file ? readPictureSize(*file) : Result<PictureSize>(Failure{});
    m_sizes[path] = size ? std::optional(*size) : std::nullopt;
}

std::optional<PictureSize> OrderResolution::sizeOf(const QString& path) {
    if (!m_sizes.contains(path))
        look(path);
    return m_sizes.value(path);
}

std::optional<PrintResolution> OrderResolution::of(const QString& path, const QString& record) const {
    const std::optional<PictureSize> size = m_sizes.value(path);
    return size ? of(*size, record) : std::nullopt;
}

std::optional<PrintResolution> OrderResolution::of(PictureSize picture, const QString& record) const {
    const std::optional<PaperSize> on = paper();
    if (!on)
        return std::nullopt;
    if (printsAsTheyAre(m_state.Optint))
        return PrintResolution::ofPlain(picture, *on, fit(),
                                        m_state.DchisaAmoka == 1 ? PrintResolution::Sent::Whole
                                                                 : PrintResolution::Sent::Scaled);
    EditFields edit;
    UnpackEditState(record.isEmpty() ? EditRecord::newPicture() : record, edit);
    return PrintResolution::ofEdited(picture, *on, edit);
}

QStringList OrderResolution::coarse(const Basket& basket) {
    QStringList paths;
    for (const QString& text : basket.lines().items()) {
        const BasketLine line = BasketLine::split(text, basket.form());
        const QString& path = line.path.text();
        const std::optional<PictureSize> size = sizeOf(path);
        const std::optional<PrintResolution> resolution = size ? of(*size, line.editState) : std::nullopt;
        if (resolution && resolution->grade() == PrintResolution::Grade::Coarse)
            paths += path;
    }
    return paths;
}

} // namespace lumora
