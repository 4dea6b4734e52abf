#pragma once

#include "transfer/ftp/FtpSession.h"

#include <QDateTime>

namespace lumora {

// One walk over List3: each file on a session of its own, names that are on the server already skipped.
class UploadPass {
public:
    UploadPass(FtpDesk& desk, FtpSession& session)
        : m_desk(desk)
        , m_board(desk.board)
        , m_session(session) {}

    void run();
    void UploadOneFile(const QString& path);
    // The two boxes of a stop, and the page back at full size.
    void tellStopped();

    std::int16_t UserStopped = 0;
    int CurrentIndex = -1;     // index in List3
    int BrokenBefore = 0;      // size of List4Broken before a send
    QDateTime LastPartTime;    // when the last piece had gone
    bool FaultPressed = false; // read by nobody

private:
    void showProgress(int index);
    void showPiece(int index, const QString& name);
    void showFile(const QString& name);
    void send(const QString& path);
    void closeWithPauses();
    FtpSession::Captions captions() const;

    FtpDesk& m_desk;
    FtpBoard& m_board;
    FtpSession& m_session;
};

} // namespace lumora
