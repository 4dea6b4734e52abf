#pragma once

#include "session/Caption.h"

namespace lumora {

// What both sending pages show.
struct SendingControls : Controls {
    QString caption;                            // title of the window
    int percent = 0;                            // of the pass, 0 to 100
    Caption Label4Title{*this, u"Label4Title"}; // headline of the phase
    Caption Label4Do{*this, u"Label4Do"};       // what the customer can do now
    Caption Label4File{*this, u"Label4File"};   // which file of how many; empty while nothing travels
    Caption Label4Reason{*this, u"Label4Reason", Caption::At::Hidden}; // what the last failure of the line means
    Caption Label4Order{*this, u"Label4Order"};                        // head of the order's card
    Caption Pic4Failure{*this, u"Pic4Failure", Caption::At::Hidden};   // the card that tells of a failure in the end
    Caption Command28{*this, u"Command28", Caption::At::Hidden};       // a new order; there in each end state
    Caption Image3{*this, u"Image3"};                                  // close
};

} // namespace lumora
