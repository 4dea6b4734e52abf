#pragma once

namespace lumora {

// Asks for the staff's code of a kiosk, on a terminal twice and without showing it, and prints the line for the lab's
// file. From a pipe one line is read. The status with which the process ends.
int promptForStaffCode();

} // namespace lumora
