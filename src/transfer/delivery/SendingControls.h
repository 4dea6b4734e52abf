#pragma once

#include "session/Caption.h"
#include "session/LeftOutBox.h"
#include "transfer/delivery/OrderFacts.h"

namespace lumora {

// The controls that both sending pages have.
struct SendingControls : Controls {
    QString caption;                                                   // title of the window
    int percent = 0;                                                   // progress of the pass, 0 to 100
    Caption Label4Title{*this, u"Label4Title"};                        // title of the phase
    Caption Label4Do{*this, u"Label4Do"};                              // what the customer can do now
    Caption Label4File{*this, u"Label4File"};                          // "file 3 of 12"; empty while no file is sent
    Caption Label4Reason{*this, u"Label4Reason", Caption::At::Hidden}; // what the last failure means
    Caption Label4Order{*this, u"Label4Order"};                        // heading of the order's card
    Caption Pic4Order{*this, u"Pic4Order"};                            // card of the order
    Caption Pic4Failure{*this, u"Pic4Failure", Caption::At::Hidden};   // card of the failure, at the end
    Caption Command28{*this, u"Command28", Caption::At::Hidden};       // new order
    Caption Image3{*this, u"Image3"};                                  // close

    Caption changeOrder{*this, u"changeOrder", Caption::At::Hidden}; // back to the pictures

    // What is in the order; a fact that is not known is hidden.
    ControlArray<Caption, mostFacts> factName{*this, u"factName", Caption::At::Hidden};
    ControlArray<Caption, mostFacts> fact{*this, u"fact", Caption::At::Hidden};

    // The thank-you, once the order has arrived.
    Caption thanks{*this, u"thanks", Caption::At::Hidden};
    Caption shortNumber{*this, u"shortNumber"};
    Caption nextSteps{*this, u"nextSteps", Caption::At::Hidden}; // what becomes of the order now
    Caption slip{*this, u"slip", Caption::At::Hidden};           // the queue has taken it
    Caption slipCode{*this, u"slipCode", Caption::At::Hidden};   // a picture of it: what the staff scans
    Caption cardMayGo{*this, u"cardMayGo", Caption::At::Hidden}; // a card is in, and nothing reads it any more

    LeftOutControls leftOut{*this};

    // What the operator's area tells of the order.
    Caption Label4Hokhaha{*this, u"Label4Hokhaha", Caption::At::Hidden};   // arrival is proven by names only
    Caption Label4Dooach{*this, u"Label4Dooach", Caption::At::Hidden};     // a report was begun, its end is unknown
    Caption Command4Dooach{*this, u"Command4Dooach", Caption::At::Greyed}; // report again
};

} // namespace lumora
