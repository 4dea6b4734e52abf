#pragma once

#include <QByteArrayView>

namespace lumora {

enum class PictureKind { None, Jpeg, Png, Heif, Avif, WebP, Tiff, Bmp, Gif };

// What a file is by its first bytes; 64 of them are enough, fewer are allowed.
PictureKind pictureKindOf(QByteArrayView head);

} // namespace lumora
