#pragma once

#include "assembly/Preparation.h"
#include "assembly/edited/EditedPrints.h"
#include "order/KeptWork.h"

namespace lumora {

// Prepares an edited order: each picture is rendered with all that its record says, and the order sheet is drawn from
// the rendered prints.
class EditedPreparation : public Preparation {
public:
    EditedPreparation(SessionState& state, const Platform& platform, PreparationEvents& events);

    // The folder of the sheet's pictures. Without it the sheet has none, and the order goes on.
    void makeJobFolder() const;
    // False, and told, when the order is not complete, or when a click ended the program.
    bool prepare(const QStringList& lines, std::optional<PaperSize> paper);

private:
    void preparePicture(int index, PrintPacker& packer, EditedPrints& prints);
    Result<QByteArray> renderPicture(const BasketLine& line, EditedPrints& prints, Bitmap& preview);
    Result<void> keepToneCopy(const BasketLine& line, NewContent& copy);
    KeptWork kept() const;
    DrivePath thumbnailPath(const BasketLine& line) const;
    void remakeThumbnail(int index, const BasketLine& line);
    void saveThumbnail(const BasketLine& line, const Bitmap& preview);
    std::optional<Bitmap> drawSheet();

    const DrivePath m_jobFolder;
};

} // namespace lumora
