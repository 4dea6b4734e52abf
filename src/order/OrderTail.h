#pragma once

#include <QByteArray>
#include <QString>

#include <optional>

namespace lumora {

struct SessionState;

// What every print file of an order carries behind the picture: whose it is, so that the lab can sort a print that lost
// its folder. Fixed fields in the ANSI code page, each cut to its width: a total of 1234 reads "123".
struct OrderTail {
    QString telephone;   // 10
    QString name;        // 10
    QString totalPics;   // 3
    QString orderNumber; // 3
    QString serial;      // 4
    QString baseName;    // of the long tail only: the last 19 characters, behind a "^"

    static constexpr int shortWidth = 40;
    static constexpr int longWidth = 60;

    static OrderTail of(const SessionState& state);

    // 40 bytes.
    QByteArray shortForm() const;
    // 60 bytes: the short form and the 20-byte name field.
    QByteArray longForm(const QString& baseName) const;
    // What SugTzad asks for: 60 the long form, 40 the short form, any other value no tail at all.
    QByteArray form(int SugTzad, const QString& baseName) const;

    // The fields of a tail of 40 or 60 bytes without the blanks at their ends; no value for another length.
    static std::optional<OrderTail> parse(const QByteArray& bytes);
};

} // namespace lumora
