#include "selection/ChangedPaper.h"

#include "common/PaperSize.h"
#include "editing/render/PicturePlacement.h"
#include "order/EditRecord.h"
#include "order/PrintCode.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

namespace {

// The editor shows an order of several sizes so.
constexpr PaperSize paperOfMixed{10, 15};
// A caption's place beyond these loses its end in the record's column.
constexpr int leastPlace = -99;
constexpr int mostPlace = 999;
constexpr int leastPan = -999;

PictureSize boxOf(const OrderDetails& order, PictureSize picture) {
    return previewBox(PaperSize::ofText(order.ppr).value_or(paperOfMixed), orientationOf(picture));
}

std::int16_t carried(int place, int before, int now, int least, int most) {
    return static_cast<std::int16_t>(std::clamp(qRound(static_cast<double>(place) * now / before), least, most));
}

} // namespace

QString RecordOnPaper(const QString& record, std::optional<PictureSize> picture, const OrderDetails& before,
                      const OrderDetails& now) {
    EditFields edit;
    UnpackEditState(record, edit);
    bool changed = false;
    const PictureSize old = picture ? boxOf(before, *picture) : PictureSize();
    const PictureSize box = picture ? boxOf(now, *picture) : PictureSize();
    if (old != box) {
        const EditFields was = edit;
        if (!isPanUnset(edit)) {
            edit.PanX = carried(edit.PanX, old.width, box.width, leastPan, unsetPan - 1);
            edit.PanY = carried(edit.PanY, old.height, box.height, leastPan, unsetPan - 1);
        }
        edit.TextX = carried(edit.TextX, old.width, box.width, leastPlace, mostPlace);
        edit.TextY = carried(edit.TextY, old.height, box.height, leastPlace, mostPlace);
        changed = edit.PanX != was.PanX || edit.PanY != was.PanY || edit.TextX != was.TextX || edit.TextY != was.TextY;
    }
    if (before.Bord != now.Bord && edit.FrameName != EditRecord::noFrame &&
        edit.FrameName == EditRecord::frameOfBorder(before.Bord)) {
        edit.FrameName = EditRecord::noFrame;
        changed = true;
    }
    if (!changed)
        return record;
    PackEditState(edit, now.Bord, edit.FrameFolder);
    return edit.EditState;
}

bool ChangesPrints(const OrderDetails& before, const OrderDetails& now) {
    return before.Bord != now.Bord || before.ppr != now.ppr || before.FillFit != now.FillFit ||
           paperLetter(before.maat, PaperWords::All, u' ') != paperLetter(now.maat, PaperWords::All, u' ') ||
           sizeField(before) != sizeField(now);
}

} // namespace lumora
