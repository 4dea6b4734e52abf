#include "session/lab/SettingsText.h"

#include "common/AnsiCodePage.h"

#include <cstdint>
#include <cstdlib>

// A settings text comes from a web host.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const QByteArray bytes(reinterpret_cast<const char*>(data), static_cast<qsizetype>(size));
    const QString text = lumora::AnsiCodePage::decode(bytes);
    const lumora::SettingsPieces split = lumora::SplitSettings(text);
    if (split.pieces.size() > 35)
        std::abort();
    (void)lumora::orderCardEntry(split);
    const QString scrambled = lumora::Scramble(text);
    if (scrambled.size() > text.size() || lumora::Scramble(lumora::Unscramble(scrambled)) != scrambled)
        std::abort();
    return 0;
}
