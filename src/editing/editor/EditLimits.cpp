#include "editing/editor/EditLimits.h"

#include "common/FixedText.h"
#include "editing/render/EditedPicture.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {
namespace {

bool carried(QPointF place) {
    const auto within = [](double pixels) { return HoldIn16Bits(pixels) >= -999 && HoldIn16Bits(pixels) < unsetPan; };
    return within(place.x()) && within(place.y());
}

// The last allowed place on the straight way between the two, or `from` where that is not allowed itself. The allowed
// places are convex.
template <class MayBe>
QPointF lastOnTheWay(QPointF from, QPointF to, const MayBe& mayBe) {
    if (mayBe(to))
        return to;
    double good = 0;
    double bad = 1;
    for (int halving = 0; halving < 16; ++halving) {
        const double middle = (good + bad) / 2;
        (mayBe(from + (to - from) * middle) ? good : bad) = middle;
    }
    return from + (to - from) * good;
}

} // namespace

void EditLimits::hold(EditFields& edit) const {
    if (!m_state.Careful)
        return;
    constexpr std::int16_t least = -99; // of three columns
    constexpr std::int16_t most = 999;
    while (edit.RotationCode < least)
        edit.RotationCode = HoldIn16Bits(edit.RotationCode + 360);
    edit.TextX = std::clamp(edit.TextX, least, most);
    edit.TextY = std::clamp(edit.TextY, least, most);
    edit.TextFontSize = std::clamp<std::int16_t>(edit.TextFontSize, 8, 98);
}

QPointF EditLimits::pan(const EditedPreview& picture, const EditFields& edit, QPointF from, QPointF to) const {
    if (!m_state.Careful)
        return to;
    const auto mayBe = [&](QPointF place) {
        EditFields there = edit;
        there.PanX = HoldIn16Bits(place.x());
        there.PanY = HoldIn16Bits(place.y());
        return carried(place) && picture.touchesPaper(there);
    };
    if (!mayBe(from)) // zoomed or turned off the paper
        return lastOnTheWay({picture.box().width / 2.0, picture.box().height / 2.0}, to, mayBe);
    const QPointF across = lastOnTheWay(from, {to.x(), from.y()}, mayBe);
    return lastOnTheWay(across, {across.x(), to.y()}, mayBe);
}

} // namespace lumora
