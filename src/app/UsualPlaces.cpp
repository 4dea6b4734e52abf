#include "app/UsualPlaces.h"

#include "platform/files/Drives.h"
#include "session/lab/LabFile.h"

#include <QCoreApplication>

namespace lumora {

std::optional<HostPath> usedLabFile(const ProgramOptions& options) {
    if (options.labFile)
        return options.labFile;
    return FindLabFile(labFilePlaces(toHostPath(QCoreApplication::applicationDirPath())));
}

HostPath usedDataFolder(const ProgramOptions& options, const Deployment& deployment) {
    if (options.dataFolder)
        return *options.dataFolder;
    if (!deployment.dataFolder.isEmpty())
        return toHostPath(deployment.dataFolder);
    return Drives::defaultDataFolder();
}

HostPath doorProgram() {
    const HostPath here = toHostPath(QCoreApplication::applicationDirPath());
    std::error_code none;
    const HostPath beside = here / "lumora-door";
    return std::filesystem::exists(beside, none) ? beside : (here / "../../tools/door/lumora-door").lexically_normal();
}

} // namespace lumora
