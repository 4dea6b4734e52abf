#pragma once

#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/SessionState.h"
#include "transfer/ftp/FtpBoard.h"

#include <functional>

namespace lumora {

// What the rules of sending work with: the board they write, the session, the machine, and the way to have the board
// painted.
struct FtpDesk {
    FtpBoard& board;
    SessionState& state;
    const Platform& platform;
    std::function<void()> changed;
    // The customer has left the page or the program: every loop ends at its next step and nothing more is sent.
    bool left = false;
    // The customer has asked to stop the sending. Read at the head of each file and within it, between two tries to
    // reach the server, and behind a check; reset where a file begins.
    bool StopFlag = false;

    QString wording(const QString& hebrew, const QString& inEnglish) const { return state.wording(hebrew, inEnglish); }

    // True when the files travel as they are and not as pieces; pieces keep the status line and the caption quiet.
    bool wholeFiles() const { return state.transfer.Mefurak == Travel::Whole; }

    void status(const QString& text) {
        board.Label3.text = text;
        changed();
    }
    void captionFollowsStatus() {
        board.caption = board.Label3.text;
        changed();
    }
    void pump() {
        changed();
        platform.pump.pump();
    }
};

} // namespace lumora
