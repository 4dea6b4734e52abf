#pragma once

#include <QString>
#include <QSysInfo>

#include <csetjmp>
#include <cstdio>

#include <jpeglib.h>

namespace lumora {

// How libjpeg names the bytes of a Bitmap.
constexpr J_COLOR_SPACE bitmapColours = Q_BYTE_ORDER == Q_LITTLE_ENDIAN ? JCS_EXT_BGRX : JCS_EXT_XRGB;

// libjpeg reports an error by a call that may not return. The jump goes back to guarded(), whose argument therefore may
// call libjpeg but must own nothing that has a destructor.
struct JpegErrors {
    jpeg_error_mgr manager{};
    std::jmp_buf back{};
    int code = 0; // libjpeg's message number, or 0
    QString text;
    bool outOfMemory = false;

    // The manager to be set as cinfo.err before the object is created.
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
