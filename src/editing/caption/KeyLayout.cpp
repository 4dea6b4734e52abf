#include "editing/caption/KeyLayout.h"

#include "common/AnsiCodePage.h"

#include <QStringView>

namespace lumora::KeyLayout {
namespace {

constexpr QStringView hebrew = u"עגירפכטאוחק שדזהצמנבסתץלןף םך,";
constexpr QStringView small = u"gdhrpfytujeqaszvmnbcx, ki wol ";
constexpr QStringView capital = u"GDHRPFYTUJEQASZVMNBCX, KI WOL ";
static_assert(hebrew.size() == letterKeys && small.size() == letterKeys && capital.size() == letterKeys);

constexpr QStringView symbols = u".!?-:;'\u05F4()&@#+=%*/\u20AA\u2026";
static_assert(symbols.size() == symbolKeys);

constexpr QChar hebrewDoubleMark = u'\u05F4';

} // namespace

QString caption(int key, Letters letters) {
    if (key < 0 || key >= keys)
        return {};
    if (key >= firstSymbol)
        return symbols[key - firstSymbol];
    if (key >= firstDigit)
        return QString::number(key - firstDigit);
    const QStringView labels = letters == Letters::Hebrew ? hebrew : letters == Letters::Small ? small : capital;
    return labels[key];
}

std::array<int, letterKeys> places() {
    return {11, 26, 10, 3,  7,  6,  8,  24, 27, 4,  12, 13, 1,  5,  0,
            2,  9,  23, 28, 25, 14, 20, 19, 15, 18, 17, 16, 21, 22, 29};
}

std::optional<QString> typed(QChar character) {
    if (character == u'"')
        return hebrewDoubleMark;
    if (!character.isPrint() || character.isSurrogate())
        return std::nullopt;
    QString text(character);
    if (AnsiCodePage::squeeze(text) != text)
        return std::nullopt;
    return text;
}

} // namespace lumora::KeyLayout
