#pragma once

#include "app/Program.h"

namespace lumora {

// What a lab's people ask of the program on the command line. Each writes on standard output and returns the exit
// status: 0, or 1 where there is something to mend.

// A line for each thing that was tried, with what to do. Needs a QGuiApplication.
int checkStation(const ProgramOptions& options, bool writes);
// Writes the ZIP file for whoever helps.
int writeSupportBundle(const ProgramOptions& options, const HostPath& target);
// Every key of lab.ini, with what it allows.
int printLabKeys();

} // namespace lumora
