#include "editing/EditRecord.h"

#include "common/FixedText.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

namespace EditRecord {

QString newPicture() {
    return LeftField(QStringLiteral("1   1   1   180100999 999 000000000000000000"), width);
}

QString beforeAnyPicture() {
    return LeftField(QStringLiteral("1   1   1   "), width);
}

} // namespace EditRecord

void UnpackEditState(const QString& record, EditFields& fields) {
    namespace R = EditRecord;
    fields.EditState = LeftField(record, R::width);
    const auto text = [&](R::Column column) { return fields.EditState.mid(column.position - 1, column.width); };
    const auto number = [&](R::Column column) { return Val16(text(column)); };

    fields.GainR = static_cast<float>(Val(text(R::GainR)));
    fields.GainG = static_cast<float>(Val(text(R::GainG)));
    fields.GainB = static_cast<float>(Val(text(R::GainB)));
    fields.RotationCode = number(R::RotationCode);
    fields.ZoomPercent = number(R::ZoomPercent);
    fields.PanX = number(R::PanX);
    fields.PanY = number(R::PanY);
    fields.ToneFlag = number(R::ToneFlag);
    fields.SpareFlag = number(R::SpareFlag);
    fields.FrameName = text(R::FrameName);
    fields.LineFrameCode = text(R::LineFrameCode);
    fields.RedMarker = text(R::RedMarker);
    fields.AutoMarker = text(R::AutoMarker);
    fields.FrameFolder = text(R::FrameFolder).trimmed();
    fields.TextFontSize = std::max<std::int16_t>(8, number(R::TextFontSize));
    fields.TextAlign = number(R::TextAlign);
    fields.TextOn = number(R::TextOn);
    fields.Tag = text(R::Tag).trimmed();
    fields.TextBlue = number(R::TextBlue);
    fields.TextGreen = number(R::TextGreen);
    fields.TextRed = number(R::TextRed);
    fields.TextX = number(R::TextX);
    fields.TextY = number(R::TextY);
    fields.TextVertical = number(R::TextVertical);
    fields.TextStyle = number(R::TextStyle);
    fields.TextFont = text(R::TextFont).trimmed();
    fields.TextBody = text(R::TextBody).trimmed();
}

} // namespace lumora
