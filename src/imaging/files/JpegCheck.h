#pragma once

#include "common/Result.h"

#include <filesystem>

namespace lumora {

// Decodes a JPEG file once. A file of another format, an error of the decoder and a file that is cut short are
// failures; the decoder's warnings are none.
Result<void> checkJpegDecodes(const std::filesystem::path& path);

} // namespace lumora
