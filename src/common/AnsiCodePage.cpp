#include "common/AnsiCodePage.h"

#include <algorithm>
#include <array>
#include <utility>

namespace lumora::AnsiCodePage {
namespace {

constexpr char16_t none = 0xFFFD;

// Bytes 80 to FF of Windows-1255, after the mapping table that the Unicode Consortium publishes
// (VENDORS/MICSFT/WINDOWS/CP1255.TXT). Unassigned 81, 8A and their like in 80..9F go to the C1 control of the same
// number, as the best-fit table of the platform has it; those above A0 have no character at all.
constexpr std::array<char16_t, 128> upperHalf = {
    0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, 0x02C6, 0x2030, 0x008A, 0x2039, 0x008C,
    0x008D, 0x008E, 0x008F, 0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014, 0x02DC, 0x2122,
    0x009A, 0x203A, 0x009C, 0x009D, 0x009E, 0x009F, 0x00A0, 0x00A1, 0x00A2, 0x00A3, 0x20AA, 0x00A5, 0x00A6,
    0x00A7, 0x00A8, 0x00A9, 0x00D7, 0x00AB, 0x00AC, 0x00AD, 0x00AE, 0x00AF, 0x00B0, 0x00B1, 0x00B2, 0x00B3,
    0x00B4, 0x00B5, 0x00B6, 0x00B7, 0x00B8, 0x00B9, 0x00F7, 0x00BB, 0x00BC, 0x00BD, 0x00BE, 0x00BF, 0x05B0,
    0x05B1, 0x05B2, 0x05B3, 0x05B4, 0x05B5, 0x05B6, 0x05B7, 0x05B8, 0x05B9, none,   0x05BB, 0x05BC, 0x05BD,
    0x05BE, 0x05BF, 0x05C0, 0x05C1, 0x05C2, 0x05C3, 0x05F0, 0x05F1, 0x05F2, 0x05F3, 0x05F4, none,   none,
    none,   none,   none,   none,   none,   0x05D0, 0x05D1, 0x05D2, 0x05D3, 0x05D4, 0x05D5, 0x05D6, 0x05D7,
    0x05D8, 0x05D9, 0x05DA, 0x05DB, 0x05DC, 0x05DD, 0x05DE, 0x05DF, 0x05E0, 0x05E1, 0x05E2, 0x05E3, 0x05E4,
    0x05E5, 0x05E6, 0x05E7, 0x05E8, 0x05E9, 0x05EA, none,   none,   0x200E, 0x200F, none};

struct Pair {
    char16_t unit;
    unsigned char byte;
};

constexpr auto byUnit = [] {
    std::array<Pair, 128> pairs{};
    for (std::size_t i = 0; i < pairs.size(); ++i)
        pairs[i] = {upperHalf[i], static_cast<unsigned char>(0x80 + i)};
    std::sort(pairs.begin(), pairs.end(), [](const Pair& a, const Pair& b) { return a.unit < b.unit; });
    return pairs;
}();

char byteOf(char16_t unit) {
    if (unit < 0x80)
        return static_cast<char>(unit);
    if (unit == none)
        return '?';
    const auto at = std::lower_bound(byUnit.begin(), byUnit.end(), unit,
                                     [](const Pair& pair, char16_t wanted) { return pair.unit < wanted; });
    return at != byUnit.end() && at->unit == unit ? static_cast<char>(at->byte) : '?';
}

} // namespace

QByteArray encode(const QString& text) {
    QByteArray bytes;
    bytes.reserve(text.size());
    for (qsizetype i = 0; i < text.size(); ++i) {
        const QChar character = text[i];
        if (character.isHighSurrogate() && i + 1 < text.size() && text[i + 1].isLowSurrogate()) {
            bytes.append('?');
            ++i;
        } else {
            bytes.append(byteOf(character.unicode()));
        }
    }
    return bytes;
}

QString decode(const QByteArray& bytes) {
    QString text;
    text.reserve(bytes.size());
    for (const char c : bytes) {
        const auto byte = static_cast<unsigned char>(c);
        text.append(QChar(byte < 0x80 ? char16_t(byte) : upperHalf[byte - 0x80]));
    }
    return text;
}

bool holds(const QString& text) {
    return !squeeze(text).contains(u'?');
}

QString squeeze(const QString& text) {
    return decode(encode(text));
}

} // namespace lumora::AnsiCodePage
