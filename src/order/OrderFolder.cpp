#include "order/OrderFolder.h"

#include "common/DrivePathText.h"
#include "common/FixedText.h"
#include "order/OrderNames.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {
namespace {

const QString printFiles = QStringLiteral("*.jpp");

QString pathOf(const SessionState& state, const QString& number, OrderFolder::Ending ending) {
    const bool marked = ending == OrderFolder::Ending::BySession && state.transfer.HazmanaP > 0;
    const QString name = OrderName(state.shemot.TimeOfJob, number);
    return JoinDrivePath(WorkspacePaths::orders(state), marked ? name + u'P' : name);
}

bool isFree(const Files& files, const OrderFolder& folder) {
    if (!files.folderExists(folder.path()))
        return true;
    if (files.fileExists(folder.logPath()))
        return false;
    for (const QString& name : files.names(folder.path(), printFiles))
        static_cast<void>(files.removeFile(folder.filePath(name)));
    return files.names(folder.path(), printFiles).isEmpty();
}

} // namespace

OrderFolder OrderFolder::chosen(const SessionState& state) {
    return OrderFolder(state.transfer.OrderFolder);
}

OrderFolder OrderFolder::inPreparation(const SessionState& state, Ending ending) {
    return OrderFolder(pathOf(state, state.MisparHazmana, ending));
}

bool OrderFolder::isChosen() const {
    return !m_path.isEmpty() && m_path != notChosen;
}

QString OrderFolder::name() const {
    return LeafName(m_path);
}

QString OrderFolder::filePath(const QString& fileName) const {
    return JoinDrivePath(m_path, fileName);
}

QString freeOrderNumber(const SessionState& state, const Files& files, OrderFolder::Ending ending) {
    QString number = state.MisparHazmana;
    while (!isFree(files, OrderFolder(pathOf(state, number, ending))))
        number = QString::number(Val(number) + 1.0, 'f', 0);
    return number;
}

Result<void> makeOrderFolder(const Files& files, const OrderFolder& folder) {
    const QString orders = ParentFolder(folder.path());
    for (const QString& path : {ParentFolder(orders), orders, folder.path()}) {
        if (files.folderExists(path))
            continue;
        if (Result<void> made = files.makeFolder(path); !made)
            return made;
    }
    return {};
}

} // namespace lumora
