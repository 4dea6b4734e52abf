#pragma once

#include <QFlags>
#include <QString>

namespace lumora {

// Where a sending stands. One set for both senders; the FTP sender alone ends in Unclear and Stopped.
enum class SendingPhase {
    Preparing, // the order is read; by HTTP the server is asked what it has of it already
    NoOrder,   // there is nothing to send
    NoServer,  // the lab has named no server
    Countdown, // the sending begins by itself when the count ends
    Waiting,   // the customer has stopped the count
    Sending,
    Checking,  // the server is asked what has arrived
    Reporting, // all has arrived, and the lab's site is told
    Success,
    AllThere, // every file of the order is on the server, and nothing was reported
    Unclear,  // the server's list gives no verdict
    NotAll,   // files are missing after the last attempt
    Stopped,  // the customer has stopped the sending
};

constexpr bool isUnderWay(SendingPhase phase) {
    return phase == SendingPhase::Sending || phase == SendingPhase::Checking || phase == SendingPhase::Reporting;
}
constexpr bool hasArrived(SendingPhase phase) {
    return phase == SendingPhase::Success || phase == SendingPhase::AllThere;
}

// What the gauge of a sending page shows.
enum class SendingSign { Seconds, Percent, Asking, Good, Held, Unclear, Bad };

enum class SendingButton {
    None = 0,
    SendNow = 1,
    SendAgain = 2,
    Hold = 4, // stops the count; by FTP it starts it again too
    GoOn = 8,
    Stop = 16,
    NewOrder = 32,
    Close = 64,
    Refresh = 128,
};
Q_DECLARE_FLAGS(SendingButtons, SendingButton)
Q_DECLARE_OPERATORS_FOR_FLAGS(SendingButtons)

struct SendingWords {
    const char16_t* hebrew;
    const char16_t* english;
};

// One row of a sending page's table: all that the page and its view show of a phase.
struct PhaseLook {
    SendingPhase phase;
    SendingSign sign;
    SendingButton main; // has the keyboard; None: nothing is to be chosen
    SendingButtons buttons;
    SendingWords title;
    SendingWords advice; // what the customer can do now
};

} // namespace lumora
