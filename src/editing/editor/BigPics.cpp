#include "editing/editor/BigPics.h"

#include "imaging/scaling/Resample.h"

#include <algorithm>
#include <utility>

namespace lumora {
namespace {

constexpr int surfaceWidth = 400;
constexpr int sampledWidth = 300;

} // namespace

void BigPics::turnGrey() {
    if (!CipCip)
        return;
    CipCip->turnGrey();
    Q_EMIT changed();
}

void BigPics::measureLevels() {
    if (!CipCip)
        return;
    const Bitmap& work = CipCip->workPicture();
    const double aspect = static_cast<double>(work.height()) / work.width();
    const PictureSize surface{surfaceWidth, std::max(1, static_cast<int>(surfaceWidth * aspect))};
    const PictureSize sampled{sampledWidth, static_cast<int>(sampledWidth * aspect)};
    Image_crop = {(surface.width - sampled.width) / 2, (surface.height - sampled.height) / 2, sampled.width,
                  sampled.height};
    Picture2 = resampled(work, surface);

    const SampleColorLevels samples(Picture2, Image_crop);
    for (const auto& [list, items] : {std::pair(&List1, &samples.lists()[0]), std::pair(&List2, &samples.lists()[1]),
                                      std::pair(&List3, &samples.lists()[2])}) {
        list->clear();
        list->append(*items);
    }
    levels.gains = samples.gains();
    levels.floors = samples.floors(static_cast<int>(levels.above));
    Q_EMIT changed();
}

} // namespace lumora
