#pragma once

#include <QByteArrayView>

namespace lumora {

// What an ICC profile is by its primaries and curves, whatever its name: sRGB, another one, or no profile at all.
enum class ProfileVerdict { Srgb, Other, Broken };
ProfileVerdict judgeProfile(QByteArrayView profile);

} // namespace lumora
