#include "platform/files/UserFolders.h"

#include <pwd.h>
#include <unistd.h>

#include <cstdlib>

namespace lumora {

HostPath userFolder(const char* variable, const char* belowHome) {
    const auto valueOf = [](const char* name) {
        const char* value = std::getenv(name);
        return value ? HostPath(value) : HostPath();
    };
    HostPath named = valueOf(variable);
    if (named.is_absolute())
        return named;
    HostPath home = valueOf("HOME");
    const passwd* user = ::getpwuid(::getuid());
    if (home.empty() && user && user->pw_dir)
        home = user->pw_dir;
    return home / belowHome;
}

} // namespace lumora
