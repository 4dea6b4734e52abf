#include "order/CustomerTraces.h"

#include "common/FirstFailure.h"
#include "order/DoorFolders.h"
#include "platform/Instances.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Removes what is there.
class Removal {
public:
    explicit Removal(const Files& files)
        : m_files(files) {}

    void file(const DrivePath& path) {
        if (m_files.fileExists(path))
            m_steps.note(m_files.removeFile(path));
    }
    void files(const DrivePath& folder, const QString& patterns) {
        for (const QString& name : m_files.storedNames(folder, patterns))
            m_steps.note(m_files.removeFile(folder / name));
    }
    void tree(const DrivePath& folder) {
        if (m_files.folderExists(folder))
            m_steps.note(m_files.removeTree(folder));
    }
    Result<void> outcome() const { return m_steps.outcome(); }

private:
    const Files& m_files;
    FirstFailure m_steps;
};

} // namespace

Result<void> CustomerTraces::clear() const {
    clearSession();
    m_platform.shell.clearClipboard();
    return m_platform.instances.another() ? Result<void>() : clearFiles();
}

// The line of a kept order is for whoever comes to the start page.
void CustomerTraces::clearSession() const {
    SessionState fresh;
    fresh.DiskRoot = m_state.DiskRoot;
    fresh.waitingOrders = m_state.waitingOrders;
    fresh.slipTrouble = m_state.slipTrouble;
    fresh.handOver.kept = m_state.handOver.kept;
    m_state = std::move(fresh);
}

Result<void> CustomerTraces::clearFiles() const {
    const Files& files = m_platform.files;
    Removal removal(files);
    const DrivePath root = WorkspacePaths::root(m_state);
    for (const DrivePath& path : WorkspacePaths::detailStores(m_state))
        removal.file(path);
    for (const DrivePath& path : {WorkspacePaths::previewCopy(m_state), WorkspacePaths::toneCopy(m_state),
                                  WorkspacePaths::proofPicture(m_state), WorkspacePaths::summaryPicture(m_state)})
        removal.file(path);
    removal.tree(WorkspacePaths::handOverTexts(m_state));
    removal.files(root, u"filelist*.txt"_s); // what the web server has of the order

    const DrivePath passing = WorkspacePaths::zmany(m_state);
    tidyDoorFolders(m_state, files);
    for (const QString& name : files.folders(passing)) {
        if (name != u"door")
            removal.tree(passing / name);
    }
    removal.files(passing, u"*"_s);
    removal.files(WorkspacePaths::orders(m_state), u"*.jpg;*.bmp;*.gbr;*.gbx;*.jpp"_s);
    return removal.outcome();
}

} // namespace lumora
