#include "order/EditRecord.h"

#include "common/FixedText.h"
#include "session/SessionState.h"

#include <QRegularExpression>

#include <algorithm>

namespace lumora {

namespace EditRecord {

QString newPicture() {
    return LeftField(QStringLiteral("1   1   1   180100999 999 000000000000000000"), width);
}

QString beforeAnyPicture() {
    return LeftField(QStringLiteral("1   1   1   "), width);
}

std::int16_t stored(Column column, std::int16_t number) {
    return Val16(QString::number(number).left(column.width));
}

QString stored(Column column, const QString& text) {
    const QString cut = text.left(column.width);
    qsizetype from = 0;
    qsizetype to = cut.size();
    while (from < to && cut[from] == u' ')
        ++from;
    while (to > from && cut[to - 1] == u' ')
        --to;
    return cut.mid(from, to - from);
}

QString frameOfBorder(const QString& paperBorderCode) {
    if (paperBorderCode == QStringLiteral("WB"))
        return QStringLiteral("001");
    return paperBorderCode == QStringLiteral("BK") ? QStringLiteral("002") : noFrame;
}

} // namespace EditRecord

namespace {

// True when the field has a digit behind at most a sign, blanks and a point.
bool beginsWithNumber(const QString& field) {
    static const QRegularExpression number(QStringLiteral("^[+-]? *\\.?[0-9]"));
    return number.match(field).hasMatch();
}

} // namespace

void UnpackEditState(const QString& record, EditFields& fields) {
    namespace R = EditRecord;
    fields.EditState = LeftField(record, R::width);
    const auto text = [&](R::Column column) { return fields.EditState.mid(column.position - 1, column.width); };
    const auto number = [&](R::Column column) { return Val16(text(column)); };

    // Without the edit when a damaged record has letters in place of a number: 0 would print the picture black or
    // shrunk to nothing.
    const auto unlessLetters = [&](R::Column column, double without) {
        const QString field = text(column).trimmed();
        return field.isEmpty() || beginsWithNumber(field) ? Val(field) : without;
    };
    const auto placed = [&](R::Column column, std::int16_t without) {
        return unlessLetters(column, without) == without ? without : number(column);
    };
    fields.GainR = static_cast<float>(unlessLetters(R::GainR, 1));
    fields.GainG = static_cast<float>(unlessLetters(R::GainG, 1));
    fields.GainB = static_cast<float>(unlessLetters(R::GainB, 1));
    fields.RotationCode = placed(R::RotationCode, 180);
    fields.ZoomPercent = placed(R::ZoomPercent, 100);
    fields.PanX = placed(R::PanX, 999);
    fields.PanY = placed(R::PanY, 999);
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
    fields.TextBody = R::stored(R::TextBody, text(R::TextBody));
}

void PackEditState(EditFields& fields, const QString& paperBorderCode, const QString& frameFolder) {
    namespace R = EditRecord;
    const QString frame = R::frameOfBorder(paperBorderCode);
    if (frame != R::noFrame && fields.FrameName == R::noFrame) {
        fields.FrameName = frame;
        if (fields.FrameFolder.isEmpty())
            fields.FrameFolder = frameFolder;
    }

    const QString before = LeftField(fields.EditState, R::width);
    QString record(R::width, u' ');
    const auto text = [&](R::Column column, const QString& value) {
        record.replace(column.position - 1, column.width, LeftField(value, column.width));
    };
    const auto number = [&](R::Column column, int value) { text(column, QString::number(value)); };
    // No page sets these fields; the values of the record are kept.
    const auto carried = [&](R::Column column) {
        number(column, Val16(before.mid(column.position - 1, column.width)));
    };

    text(R::GainR, PlainNumber(fields.GainR));
    text(R::GainG, PlainNumber(fields.GainG));
    text(R::GainB, PlainNumber(fields.GainB));
    number(R::RotationCode, fields.RotationCode);
    number(R::ZoomPercent, fields.ZoomPercent);
    number(R::PanX, fields.PanX);
    number(R::PanY, fields.PanY);
    number(R::ToneFlag, fields.ToneFlag);
    number(R::SpareFlag, fields.SpareFlag);
    text(R::FrameName, fields.FrameName);
    text(R::LineFrameCode, fields.LineFrameCode);
    text(R::RedMarker, fields.RedMarker);
    text(R::AutoMarker, fields.AutoMarker);
    text(R::FrameFolder, fields.FrameFolder);
    number(R::TextFontSize, fields.TextFontSize);
    number(R::TextAlign, fields.TextAlign);
    carried(R::Spare59);
    carried(R::Spare61);
    number(R::TextOn, fields.TextOn);
    text(R::Tag, QStringLiteral("ddd"));
    number(R::TextBlue, fields.TextBlue);
    number(R::TextGreen, fields.TextGreen);
    number(R::TextRed, fields.TextRed);
    number(R::TextX, fields.TextX);
    number(R::TextY, fields.TextY);
    carried(R::Spare90);
    number(R::TextVertical, fields.TextVertical);
    number(R::TextStyle, fields.TextStyle);
    text(R::TextFont, fields.TextFont);
    text(R::TextBody, fields.TextBody);
    fields.EditState = record;
}

namespace EditStep {

float gain(float from, int hundredths) {
    return static_cast<float>(static_cast<double>(from) + hundredths / 100.0);
}

std::int16_t zoom(std::int16_t from, int step) {
    return static_cast<std::int16_t>(std::clamp(from + step, 40, 210));
}

std::int16_t turn(std::int16_t from, int step) {
    return from + step > 540 ? std::int16_t{180} : HoldIn16Bits(from + step);
}

std::int16_t quarterRight(std::int16_t from) {
    return HoldIn16Bits(from + 90 > 540 ? from - 270 : from + 90);
}

std::int16_t quarterLeft(std::int16_t from) {
    return HoldIn16Bits(from - 90 < 180 ? from + 270 : from - 90);
}

} // namespace EditStep

} // namespace lumora
