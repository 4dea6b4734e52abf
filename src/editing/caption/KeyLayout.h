#pragma once

#include <QString>

#include <array>
#include <optional>

// The keys of the on-screen keyboard: 30 letter keys that three buttons relabel, the ten digits, and the further
// symbols of a panel. Every caption is a character that the lab's code page carries, as the caption goes into the order
// log; the double quote is on no key, since a quoted text of the log can't hold it.
namespace lumora::KeyLayout {

enum class Letters { Hebrew, Small, Capital };

inline constexpr int letterKeys = 30;
inline constexpr int firstDigit = 30;
inline constexpr int firstSymbol = 40;
inline constexpr int symbolKeys = 20;
inline constexpr int keys = firstSymbol + symbolKeys;

// What the key adds to the caption. Keys without a letter in a layout add a blank.
QString caption(int key, Letters letters);

// The letter keys as they lie on a real keyboard, row by row from the left.
inline constexpr int columns = 10;
std::array<int, letterKeys> places();

// What a character of a real keyboard adds: itself, or the Hebrew double mark in place of the double quote. No value
// for what the lab's code page lacks and for what can't be seen.
std::optional<QString> typed(QChar character);

} // namespace lumora::KeyLayout
