#pragma once

#include "common/Result.h"
#include "imaging/files/PictureFile.h"

#include <QString>

#include <functional>
#include <optional>

namespace lumora {

struct OrderDetails;

// The size of a chosen picture in pixels; no value where it can't be read.
using PictureSizeOf = std::function<std::optional<PictureSize>(const QString& path)>;

// What becomes of the edit record of a chosen picture when the order's paper or border is another one. The places of
// picture and caption are in pixels of the preview's box, whose shape follows the paper: they keep their share of it.
// The frame that the border before stood for gives way to that of the border now.
QString RecordOnPaper(const QString& record, std::optional<PictureSize> picture, const OrderDetails& before,
                      const OrderDetails& now);

// The prints come out in another way than before.
bool ChangesPrints(const OrderDetails& before, const OrderDetails& now);

} // namespace lumora
