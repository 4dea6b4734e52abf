#pragma once

#include "platform/files/Drives.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"
#include "session/lab/LabFile.h"

#include <functional>

namespace lumora {

// One line of a check.
struct CheckLine {
    enum class State {
        Good,
        Look, // orders go on; somebody should look
        Fault // orders are lost, late or wrong
    };
    State state;
    QString subject;
    QString text;   // what was found
    QString advice; // what to do; empty where nothing is to be done
};

// Tries what a station needs before a customer does: the lab's file, the disk, the fonts, the clock and the lab's
// server. Each step blocks and tells its lines as it ends.
class StationCheck {
public:
    using Tell = std::function<void(const CheckLine&)>;
    enum class Server { IsRead, IsWritten }; // IsWritten: a probe file is put there and deleted

    // line: of the transfer type that the lab's file has.
    StationCheck(const LabFileReading& lab, const HostPath& dataFolder, const HostPath& doorProgram, Internet& line,
                 Tell tell);

    // labFile: empty where there is none. True without a fault.
    bool run(const HostPath& labFile, Server server);

private:
    void tell(CheckLine::State state, const QString& subject, const QString& text, const QString& advice = {});
    void checkLabFile(const HostPath& labFile);
    void checkDisk();
    void checkFrames();
    void checkFonts();
    void checkTexts();
    void checkDoor();
    void checkPrinter();
    void checkClock();
    void checkHosts();
    void checkPlainText();
    void tellHttp(Server server);
    void checkServer(Server server);
    void checkProbe(FtpConnection& connection);

    const LabFileReading& m_lab;
    HostPath m_dataFolder;
    HostPath m_doorProgram;
    Drives m_drives;
    Files m_files;
    SessionState m_state;
    Internet& m_line;
    Tell m_tell;
    bool m_good = true;
};

} // namespace lumora
