#pragma once

#include "common/DrivePath.h"

namespace lumora {

// u"C:\\pics"_path
inline DrivePath operator""_path(const char16_t* text, std::size_t length) {
    return DrivePath(QString::fromUtf16(text, static_cast<qsizetype>(length)));
}

} // namespace lumora
