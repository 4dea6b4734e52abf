#include "order/OrderFolder.h"

#include "common/FixedText.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {
namespace {

const QString printFiles = QStringLiteral("*.jpp");

bool isFree(const Files& files, const OrderFolder& folder) {
    if (!files.folderExists(folder.path()))
        return true;
    if (files.fileExists(folder.logPath()))
        return false;
    for (const QString& name : files.names(folder.path(), printFiles))
        static_cast<void>(files.removeFile(folder.printFilePath(name)));
    return files.names(folder.path(), printFiles).isEmpty();
}

} // namespace

OrderFolder::OrderFolder(const SessionState& state, Ending ending)
    : m_name(state.shemot.TimeOfJob + state.MisparHazmana)
    , m_sheet(u'!' + state.MisparHazmana + u'_' + state.shemot.ser) {
    if (ending == Ending::BySession && state.transfer.HazmanaP > 0)
        m_name += u'P';
    m_path = WorkspacePaths::orders(state) + u'\\' + m_name;
}

void claimOrderNumber(SessionState& state, const Files& files, OrderFolder::Ending ending) {
    while (!isFree(files, OrderFolder(state, ending)))
        state.MisparHazmana = QString::number(Val(state.MisparHazmana) + 1.0, 'f', 0);
}

Result<void> makeOrderFolder(const SessionState& state, const Files& files, const OrderFolder& folder) {
    for (const QString& path : {WorkspacePaths::root(state), WorkspacePaths::orders(state), folder.path()}) {
        if (files.folderExists(path))
            continue;
        if (Result<void> made = files.makeFolder(path); !made)
            return made;
    }
    return {};
}

} // namespace lumora
