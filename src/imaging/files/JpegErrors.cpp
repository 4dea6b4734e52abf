#include "imaging/files/JpegErrors.h"

#include <array>

#include <jerror.h>

namespace lumora {

namespace {

[[noreturn]] void giveUp(j_common_ptr info) {
    auto* errors = reinterpret_cast<JpegErrors*>(info->err);
    std::array<char, JMSG_LENGTH_MAX> text{};
    info->err->format_message(info, text.data());
    errors->code = info->err->msg_code;
    errors->text = QString::fromLatin1(text.data());
    errors->outOfMemory = errors->code == JERR_OUT_OF_MEMORY;
    std::longjmp(errors->back, 1);
}

// Bytes before a marker, an unknown colour note or version: cameras write such files, and the picture is complete. With
// any other warning libjpeg would invent part of the picture.
bool isHarmless(int warning) {
    return warning == JWRN_EXTRANEOUS_DATA || warning == JWRN_ADOBE_XFORM || warning == JWRN_JFIF_MAJOR ||
           warning == JWRN_BOGUS_ICC;
}

void onMessage(j_common_ptr info, int level) {
    const bool passes = reinterpret_cast<JpegErrors*>(info->err)->warningsPass || isHarmless(info->err->msg_code);
    if (level < 0 && !passes)
        giveUp(info);
}

void sayNothing(j_common_ptr) {}

} // namespace

jpeg_error_mgr* JpegErrors::install() {
    static_assert(offsetof(JpegErrors, manager) == 0);
    jpeg_std_error(&manager);
    manager.error_exit = giveUp;
    manager.emit_message = onMessage;
    manager.output_message = sayNothing;
    return &manager;
}

} // namespace lumora
