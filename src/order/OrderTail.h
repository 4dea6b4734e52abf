#pragma once

#include <QByteArray>
#include <QString>

#include <optional>

namespace lumora {

struct SessionState;

// The end of every print file of an order: fixed fields in the ANSI code page that tell whose print it is. Each is cut
// to its width: a total of 1234 reads "123".
struct OrderTail {
    QString telephone;   // 10
    QString name;        // 10
    QString totalPics;   // 3
    QString orderNumber; // 3
    QString serial;      // 4
    QString baseName;    // only in the long tail: "^" and its last 19 characters

    static constexpr int shortWidth = 40;
    static constexpr int longWidth = 60;

    static OrderTail of(const SessionState& state);

    // The 40 bytes of the short form.
    QByteArray shortForm() const;
    // The 60 bytes of the long form: the short form and the 20 bytes of the base name.
    QByteArray longForm(const QString& baseName) const;
    // The form that SugTzad stands for: 60 the long form, 40 the short form, any other value no tail.
    QByteArray form(int SugTzad, const QString& baseName) const;

    // Reads a tail of 40 or 60 bytes; trailing blanks of a field are removed. No value for any other length.
    static std::optional<OrderTail> parse(const QByteArray& bytes);
};

} // namespace lumora
