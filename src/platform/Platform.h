#pragma once

#include "platform/files/HostPath.h"

namespace lumora {

class Cards;
class Clock;
class Dialogs;
class EventPump;
class Files;
class Instances;
class Internet;
class Mail;
class Printer;
class Shell;
class Volume;

// All that a page may use of the machine. main() makes one; tests make one of a temporary folder and fakes.
struct Platform {
    const Files& files;
    Dialogs& dialogs;
    Internet& internet;
    Mail& mail;
    Shell& shell;
    const Clock& clock;
    EventPump& pump;
    const Volume& volume;
    const Instances& instances;
    Cards& cards;
    Printer& printer;
    HostPath doorProgram; // lumora-door, which decodes what is no ordinary JPEG; where it is missing nothing is decoded
};

} // namespace lumora
