#pragma once

#include <QFlags>
#include <QString>

namespace lumora {

// The phase of a sending, for both senders. Only the FTP sender ends in Unclear and PartThere.
enum class SendingPhase {
    Preparing, // the order is read; the HTTP sender asks which files the server has
    NoOrder,   // the order has no files
    NoServer,  // the profile names no server
    Refused,   // the order does not leave: it has no picture, or the customer does not want to send fewer
    Countdown, // the sending begins when the count ends
    Waiting,   // the customer has stopped the count
    Sending,
    Checking,  // the server is asked which files have arrived
    Reporting, // all files have arrived; the lab's site is told
    Success,
    AllThere,    // all files are on the server; a report was sent only where fewer pictures were agreed to
    PartThere,   // the chosen files are on the server, and others of the order are not
    Unclear,     // the server's list gives no clear answer
    NotAll,      // files are missing after the last attempt
    Stopped,     // the customer has stopped the sending
    CallLab,     // nothing that the customer can do helps
    NumberTaken, // the order's name is another order's on the server; it is prepared again, and the page is left
};

// For the station's log.
QString phaseName(SendingPhase phase);

constexpr bool isUnderWay(SendingPhase phase) {
    return phase == SendingPhase::Sending || phase == SendingPhase::Checking || phase == SendingPhase::Reporting;
}
constexpr bool hasArrived(SendingPhase phase) {
    return phase == SendingPhase::Success || phase == SendingPhase::AllThere || phase == SendingPhase::PartThere;
}

// The customer is thanked for the whole order.
constexpr bool isThanked(SendingPhase phase) {
    return phase == SendingPhase::Success || phase == SendingPhase::AllThere;
}
// There is an order to tell of.
constexpr bool hasOrder(SendingPhase phase) {
    return phase != SendingPhase::Preparing && phase != SendingPhase::NoOrder && phase != SendingPhase::NumberTaken;
}

enum class SendingSign { Seconds, Percent, Asking, Good, Held, Unclear, Bad };

enum class SendingButton {
    None = 0,
    SendNow = 1,
    SendAgain = 2,
    Hold = 4, // stops the count
    GoOn = 8, // starts it again
    Stop = 16,
    NewOrder = 32,
    Close = 64,
    Refresh = 128,
    Change = 256, // back to the pictures
};
Q_DECLARE_FLAGS(SendingButtons, SendingButton)
Q_DECLARE_OPERATORS_FOR_FLAGS(SendingButtons)

struct SendingWords {
    const char16_t* hebrew;
    const char16_t* english;
};

// A row of a sending page's table: what page and view show of a phase.
struct PhaseLook {
    SendingPhase phase;
    SendingSign sign;
    SendingButton main; // has the focus; None if there is no choice
    SendingButtons buttons;
    SendingWords title;
    SendingWords advice;     // what the customer can do
    bool tellsWhole = false; // the advice says that the whole order has arrived
};

} // namespace lumora
