#include "order/OrderFolder.h"

#include "common/FixedText.h"
#include "order/OrderNames.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {
namespace {

DrivePath pathOf(const SessionState& state, const QString& number, OrderFolder::Ending ending) {
    const bool marked = ending == OrderFolder::Ending::BySession && state.transfer.HazmanaP > 0;
    const QString name = OrderName(state.shemot.TimeOfJob, number);
    return WorkspacePaths::orders(state) / (marked ? name + u'P' : name);
}

// The numbers of the orders without a log, each also without the "P" of its folder.
QStringList numbersOfUnfinished(const SessionState& state, const Files& files) {
    const DrivePath orders = WorkspacePaths::orders(state);
    QStringList numbers;
    for (const QString& name : files.folders(orders)) {
        if (files.fileExists(OrderFolder(orders / name).logPath()))
            continue;
        const QString number = OrderNumberOf(name);
        numbers += TravelsInPieces(number) ? number.chopped(1) : number;
    }
    return numbers;
}

// The folder of the orders, and the one that it lies in.
Result<void> makeFolders(const Files& files, const DrivePath& orders) {
    Result<void> made = files.makeFolder(orders.folder());
    return made ? files.makeFolder(orders) : made;
}

} // namespace

OrderFolder OrderFolder::chosen(const SessionState& state) {
    return OrderFolder(state.transfer.OrderFolder);
}

OrderFolder OrderFolder::inPreparation(const SessionState& state, Ending ending) {
    return OrderFolder(pathOf(state, state.MisparHazmana, ending));
}

bool OrderFolder::isChosen() const {
    return !m_path.isEmpty() && m_path.text() != notChosen;
}

QString OrderFolder::name() const {
    return m_path.leaf();
}

DrivePath OrderFolder::filePath(const QString& fileName) const {
    return m_path / fileName;
}

Result<OrderFolder> claimOrderFolder(SessionState& state, const Files& files, OrderFolder::Ending ending) {
    if (const Result<void> made = makeFolders(files, WorkspacePaths::orders(state)); !made)
        return made.failure();
    const QStringList taken = numbersOfUnfinished(state, files);
    for (QString number = state.MisparHazmana;; number = QString::number(Val(number) + 1.0, 'f', 0)) {
        if (taken.contains(number))
            continue;
        const OrderFolder folder(pathOf(state, number, ending));
        const Result<bool> made = files.makeNewFolder(folder.path());
        if (!made)
            return made.failure();
        if (!*made)
            continue;
        state.MisparHazmana = number;
        return folder;
    }
}

Result<void> makeOrderFolder(const Files& files, const OrderFolder& folder) {
    Result<void> made = makeFolders(files, folder.path().folder());
    return made ? files.makeFolder(folder.path()) : made;
}

} // namespace lumora
