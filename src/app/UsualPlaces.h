#pragma once

#include "app/Program.h"
#include "session/lab/Deployment.h"

namespace lumora {

// The lab's file that a run reads; none where none is there.
std::optional<HostPath> usedLabFile(const ProgramOptions& options);
// The folder behind the program's own drive letter.
HostPath usedDataFolder(const ProgramOptions& options, const Deployment& deployment);
// Beside this program, or where a build has it.
HostPath doorProgram();

} // namespace lumora
