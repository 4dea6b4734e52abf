#pragma once

#include "app/DesktopShell.h"
#include "common/Result.h"
#include "platform/files/HostPath.h"
#include "platform/media/Cards.h"

#include <QSize>

#include <memory>
#include <optional>

namespace lumora {

class Clock;
class Internet;
class KeptLog;
class MainWindow;
class PageChain;
class ScreenDialogs;
struct Platform;
struct SessionState;

struct ProgramOptions {
    std::optional<HostPath> labFile;    // the deployment file; without one the usual places are searched
    std::optional<HostPath> dataFolder; // the folder behind the program's own drive letter
    QSize windowSize;                   // an empty one leaves the size to the screen
    bool fullScreen = false;
    bool operatorArea = false;    // opens the hidden area of the sending page, whatever the deployment says
    DesktopShell::Opener opener;  // replaces the desktop's browser and file manager
    Internet* internet = nullptr; // replaces the machine's own line
    const Clock* clock = nullptr; // replaces the machine's own
    Cards::Source media;          // replaces the machine's own media, where the lab has them watched
};

// One run of the program: the session, the machine, the chain of pages and the window. Needs an Application (in
// views/). The scenario player runs the program through this class too.
class Program {
public:
    explicit Program(ProgramOptions options);
    ~Program();
    Program(const Program&) = delete;
    Program& operator=(const Program&) = delete;

    // Reads the deployment file, opens the window and brings the start page to the front. After a failure no window is
    // open. A failure of the file names file, line, key and what is allowed; InUse: another run has the data folder.
    // The end of the page chain quits the application.
    Result<void> start();

    // True after InUse when the other run was asked to come to the front and its display allows it.
    bool otherCameForward() const { return m_otherCameForward; }

    // Valid once start() has succeeded.
    SessionState& state();
    PageChain& chain();
    MainWindow& window();
    ScreenDialogs& dialogs();
    const Platform& platform() const;

private:
    struct Parts;
    ProgramOptions m_options;
    std::unique_ptr<KeptLog> m_log;
    std::unique_ptr<Parts> m_parts;
    bool m_otherCameForward = false;
};

} // namespace lumora
