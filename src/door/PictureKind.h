#pragma once

#include <QByteArrayView>

namespace lumora {

enum class PictureKind { None, Jpeg, Png, Heif, Avif, WebP, Tiff, Bmp, Gif };

// What a file is by its first bytes: 18 of them, and of an ISO media file its whole list of brands. Fewer are allowed.
PictureKind pictureKindOf(QByteArrayView head);

} // namespace lumora
