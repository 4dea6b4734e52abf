#pragma once

#include <QString>

namespace lumora {

class DrivePath;
class Files;

// Tells a picture from another one that stands at its path later: cards of two cameras hold the same names. Its size in
// bytes and the SHA-1 of its first 16 KiB, where a camera writes the time of the shot; empty where it can't be read.
QString PictureMark(const Files& files, const DrivePath& picture);

} // namespace lumora
