#include "platform/files/EmptyFolder.h"

#include "platform/files/Files.h"

#include <unistd.h>

namespace lumora {

void removeIfEmpty(const Files& files, const DrivePath& folder) {
    if (const Result<HostPath> host = files.host(folder))
        static_cast<void>(::rmdir(host->c_str()));
}

} // namespace lumora
