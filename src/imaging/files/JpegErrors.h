#pragma once

#include <QString>
#include <QSysInfo>

#include <csetjmp>
#include <cstdio>

#include <jpeglib.h>

namespace lumora {

// libjpeg's name for the byte order of a Bitmap's pixels.
constexpr J_COLOR_SPACE bitmapColours = Q_BYTE_ORDER == Q_LITTLE_ENDIAN ? JCS_EXT_BGRX : JCS_EXT_XRGB;

// Turns libjpeg's errors, which must not return, into a jump back to guarded(). The argument of guarded() may call
// libjpeg but must own nothing with a destructor, since the jump skips destructors.
struct JpegErrors {
    jpeg_error_mgr manager{};
    std::jmp_buf back{};
    int code = 0; // libjpeg's message number, or 0
    QString text;
    bool outOfMemory = false;
    bool warningsPass = false; // also those with which libjpeg invents part of the picture

    // Gives the manager for cinfo.err; called before the libjpeg object is created.
    jpeg_error_mgr* install();

    template <class Calls>
    bool guarded(const Calls& calls) {
        if (setjmp(back) != 0)
            return false;
        calls();
        return true;
    }
};

} // namespace lumora
