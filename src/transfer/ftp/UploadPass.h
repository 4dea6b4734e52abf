#pragma once

#include "transfer/ftp/FtpSession.h"

#include <QDateTime>

namespace lumora {

// One walk over List3: each file on a session of its own, names that are on the server already skipped.
class UploadPass {
public:
    UploadPass(const Platform& platform, SendingEvents& events, SendingStop& stop, FtpLists& lists, FtpSession& session)
        : m_platform(platform)
        , m_events(events)
        , m_stop(stop)
        , m_lists(lists)
        , m_session(session) {}

    void run();
    // The file at an index of List3.
    void UploadOneFile(int index);
    // A stop has been followed: the session is closed and the stop told.
    void endStopped();

    std::int16_t UserStopped = 0;
    int CurrentIndex = -1;     // index in List3
    int BrokenBefore = 0;      // size of List4Broken before a send
    QDateTime LastPartTime;    // when the last piece had gone
    bool FaultPressed = false; // read by nobody

private:
    void tellPiece(int index);
    void send(const QString& path);
    void put(const QString& path, const QString& name);
    void closeWithPauses();

    const Platform& m_platform;
    SendingEvents& m_events;
    SendingStop& m_stop;
    FtpLists& m_lists;
    FtpSession& m_session;
};

} // namespace lumora
