#include "order/EditRecord.h"

#include "common/FixedText.h"
#include "session/SessionState.h"

#include <QRegularExpression>

#include <algorithm>
#include <optional>

namespace lumora {

using namespace Qt::StringLiterals;

namespace EditRecord {

QString newPicture() {
    return LeftField(u"1   1   1   180100999 999 000000000000000000"_s, width);
}

QString beforeAnyPicture() {
    return LeftField(u"1   1   1   "_s, width);
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
    if (paperBorderCode == u"WB"_s)
        return u"001"_s;
    return paperBorderCode == u"BK"_s ? u"002"_s : noFrame;
}

} // namespace EditRecord

namespace {

namespace R = EditRecord;

struct GainField {
    R::Column column;
    float EditFields::*field;
};
constexpr GainField gainFields[] = {
    {R::GainR, &EditFields::GainR}, {R::GainG, &EditFields::GainG}, {R::GainB, &EditFields::GainB}};

struct NumberField {
    R::Column column;
    std::int16_t EditFields::*field;
    std::optional<std::int16_t> damaged =
        {}; // the value of a column that has letters for a number; else they read as 0
};
constexpr NumberField numberFields[] = {{R::RotationCode, &EditFields::RotationCode, 180},
                                        {R::ZoomPercent, &EditFields::ZoomPercent, 100},
                                        {R::PanX, &EditFields::PanX, 999},
                                        {R::PanY, &EditFields::PanY, 999},
                                        {R::ToneFlag, &EditFields::ToneFlag},
                                        {R::SpareFlag, &EditFields::SpareFlag},
                                        {R::TextFontSize, &EditFields::TextFontSize},
                                        {R::TextAlign, &EditFields::TextAlign},
                                        {R::TextOn, &EditFields::TextOn},
                                        {R::TextBlue, &EditFields::TextBlue},
                                        {R::TextGreen, &EditFields::TextGreen},
                                        {R::TextRed, &EditFields::TextRed},
                                        {R::TextX, &EditFields::TextX},
                                        {R::TextY, &EditFields::TextY},
                                        {R::TextVertical, &EditFields::TextVertical},
                                        {R::TextStyle, &EditFields::TextStyle}};

struct TextField {
    R::Column column;
    QString EditFields::*field;
    bool trimmed = false; // when it is read
};
constexpr TextField textFields[] = {
    {R::FrameName, &EditFields::FrameName},           {R::LineFrameCode, &EditFields::LineFrameCode},
    {R::RedMarker, &EditFields::RedMarker},           {R::AutoMarker, &EditFields::AutoMarker},
    {R::FrameFolder, &EditFields::FrameFolder, true}, {R::TextFont, &EditFields::TextFont, true}};

// No page sets these columns; the values of the record are kept.
constexpr R::Column carriedColumns[] = {R::Spare59, R::Spare61, R::Spare90};

// True when the field has a digit behind at most a sign, blanks and a point.
bool beginsWithNumber(const QString& field) {
    static const QRegularExpression number(u"^[+-]? *\\.?[0-9]"_s);
    return number.match(field).hasMatch();
}

QString columnOf(const QString& record, R::Column column) {
    return record.mid(column.position - 1, column.width);
}

} // namespace

void UnpackEditState(const QString& record, EditFields& fields) {
    fields.EditState = LeftField(record, R::width);
    const auto text = [&](R::Column column) { return columnOf(fields.EditState, column); };
    // If a field has letters where a number belongs, the picture prints without that edit: a 0 would print it black or
    // shrunk to nothing.
    const auto isDamaged = [&](R::Column column) {
        const QString field = text(column).trimmed();
        return !field.isEmpty() && !beginsWithNumber(field);
    };
    for (const auto& [column, field] : gainFields)
        fields.*field = isDamaged(column) ? 1.0F : static_cast<float>(Val(text(column).trimmed()));
    for (const auto& [column, field, damaged] : numberFields)
        fields.*field = damaged && isDamaged(column) ? *damaged : Val16(text(column));
    for (const auto& [column, field, trimmed] : textFields)
        fields.*field = trimmed ? text(column).trimmed() : text(column);
    fields.TextFontSize = std::max<std::int16_t>(8, fields.TextFontSize);
    fields.Tag = text(R::Tag).trimmed();
    fields.TextBody = R::stored(R::TextBody, text(R::TextBody));
}

void PackEditState(EditFields& fields, const QString& paperBorderCode, const QString& frameFolder) {
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
    for (const auto& [column, field] : gainFields)
        text(column, PlainNumber(fields.*field));
    for (const auto& [column, field, damaged] : numberFields)
        text(column, QString::number(fields.*field));
    for (const auto& [column, field, trimmed] : textFields)
        text(column, fields.*field);
    for (const R::Column column : carriedColumns)
        text(column, QString::number(Val16(columnOf(before, column))));
    text(R::Tag, u"ddd"_s);
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
