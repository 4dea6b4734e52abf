#pragma once

#include "transfer/ftp/UploadCheck.h"
#include "transfer/ftp/UploadPass.h"

#include <utility>

namespace lumora {

// The rules of the sending page at work on one board.
struct UploadRoom {
    UploadRoom(FtpBoard& board, SessionState& state, const Platform& platform, std::function<void()> changed)
        : desk{board, state, platform, std::move(changed)}
        , session(desk)
        , pass(desk, session)
        , check(desk, session) {}

    FtpDesk desk;
    FtpSession session;
    UploadPass pass;
    UploadCheck check;
};

} // namespace lumora
