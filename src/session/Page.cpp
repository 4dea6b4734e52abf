#include "session/Page.h"

#include <array>
#include <cstddef>

namespace lumora {

QString pageName(PageId id) {
    static constexpr std::array<const char*, 17> names = {
        "hatchala", "nnn", "Havharot", "kyoskNew", "tFrmNew",    "BigPics",  "RedI",      "mikledet", "gdisave",
        "Form3",    "B3",  "Form2",    "FtpFrm",   "UploadForm", "InetForm", "MoogMeret", "SpltForm"};
    return QString::fromLatin1(names[static_cast<std::size_t>(id)]);
}

const Controls& Page::controls() const {
    static const struct None final : Controls {
    } none;
    return none;
}

} // namespace lumora
