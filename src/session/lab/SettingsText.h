#pragma once

#include <QString>
#include <QStringList>

#include <array>
#include <optional>
#include <vector>

// The client profile as one line of text, pieces closed by "^": docs/formats.md has the table.
namespace lumora {

struct ClientProfile;

// The settings text of a profile. A text field that is empty is written as the digit 0.
QString SettingsText(const ClientProfile& profile);

// The pieces of a settings text. The table's first piece stands at index 1 and index 0 is empty; every later piece
// keeps the "^" in front of it. The list has all pieces but the first, without that mark. Pieces beyond index 35 are
// dropped.
struct SettingsPieces {
    std::array<QString, 36> table;
    QStringList pieces;
};
SettingsPieces SplitSettings(const QString& text);

// A second kind of settings text has one field of a customer's prepaid card: the field's name is the first piece and
// its value the second. No page keeps the record of these fields yet.
struct OrderCardEntry {
    QString field;
    QString value;
    QString line;      // caption and value, for the six fields that a list shows; else empty
    double number = 0; // the page size as a number, for that field
};
// No value for a text of the first kind.
std::optional<OrderCardEntry> orderCardEntry(const SettingsPieces& settings);

// A one-to-one substitution of 74 characters. A character outside that alphabet is dropped.
QString Scramble(const QString& text);
QString Unscramble(const QString& text);

} // namespace lumora
