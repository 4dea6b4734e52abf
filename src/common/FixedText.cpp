#include "common/FixedText.h"

#include "common/AnsiCodePage.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace lumora {

using namespace Qt::StringLiterals;

QString LeftField(const QString& text, int width) {
    return text.leftJustified(width, u' ', true);
}

QString RightPart(const QString& text, int width) {
    return text.right(width);
}

double Val(const QString& text) {
    QString number;
    bool point = false;
    bool exponent = false;
    for (const QChar c : text) {
        if (c == u' ' || c == u'\t' || c == u'\n')
            continue;
        const QChar before = number.isEmpty() ? QChar() : number.back();
        if (c >= u'0' && c <= u'9') {
            number += c;
        } else if ((c == u'-' || c == u'+') && (number.isEmpty() || before == u'e')) {
            number += c;
        } else if (c == u'.' && !point && !exponent) {
            point = true;
            number += c;
        } else if ((c == u'e' || c == u'E' || c == u'd' || c == u'D') && !exponent && before >= u'0' &&
                   before <= u'9') {
            exponent = true;
            number += u'e';
        } else {
            break;
        }
    }
    // "1e" and "1e-" are the number 1 with something behind it.
    while (!number.isEmpty() && (number.back() == u'-' || number.back() == u'+' || number.back() == u'e'))
        number.chop(1);
    bool ok = false;
    const double value = number.toDouble(&ok);
    if (ok && std::isfinite(value))
        return value;
    return number.startsWith(u'-') && std::isinf(value) ? std::numeric_limits<double>::lowest()
           : std::isinf(value)                          ? std::numeric_limits<double>::max()
                                                        : 0.0;
}

std::int16_t Val16(const QString& text) {
    return HoldIn16Bits(Val(text));
}

std::int16_t HoldIn16Bits(double value) {
    if (std::isnan(value))
        return 0;
    const double rounded = std::nearbyint(value);
    return static_cast<std::int16_t>(std::clamp(rounded, -32768.0, 32767.0));
}

long long RoundHalfEven(double value) {
    return std::llrint(value);
}

QString ZeroPadded(long long number, int width) {
    return QString::number(number).rightJustified(width, u'0').right(width);
}

QString PlainNumber(float number) {
    if (number == 0.0F || !std::isfinite(number))
        return u"0"_s;
    const int magnitude = static_cast<int>(std::floor(std::log10(std::fabs(static_cast<double>(number)))));
    QString text = QString::number(static_cast<double>(number), 'f', std::clamp(6 - magnitude, 0, 60));
    if (text.contains(u'.')) {
        while (text.endsWith(u'0'))
            text.chop(1);
        if (text.endsWith(u'.'))
            text.chop(1);
    }
    return text;
}

bool HasQuestionMark(const QString& text) {
    return text.contains(u'?');
}

QString TextToHex(const QString& text) {
    return QString::fromLatin1(AnsiCodePage::encode(text).toHex().toUpper());
}

QString HexToChars(const QString& hex) {
    QByteArray bytes;
    for (qsizetype i = 0; i < hex.size(); i += 2)
        bytes.append(static_cast<char>(HexToDecimal(hex.mid(i, 2)).toInt()));
    return AnsiCodePage::decode(bytes);
}

QString HexToDecimal(const QString& hex) {
    QString digits = hex.trimmed().toUpper();
    if (digits.startsWith(QLatin1String("&H")))
        digits.remove(0, 2);
    // The library's reader would take a sign and "0X" too.
    const bool hexadecimal = std::all_of(digits.begin(), digits.end(),
                                         [](QChar c) { return (c >= u'0' && c <= u'9') || (c >= u'A' && c <= u'F'); });
    if (!hexadecimal || digits.isEmpty() || digits.size() > 8)
        return u"00"_s;
    const auto number = digits.toULongLong(nullptr, 16);
    if (number <= 0xFFFF && digits.size() <= 4)
        return QString::number(static_cast<std::int16_t>(number));
    return QString::number(static_cast<std::int32_t>(number));
}

} // namespace lumora
