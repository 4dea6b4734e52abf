#include "order/DoorFolders.h"

#include "order/OrderFolder.h"
#include "order/OrderState.h"
#include "session/Workspace.h"

#include <QSet>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

DrivePath doorFolders(const Files& files) {
    return files.drives().programRoot() / u"2000lumora\\zmany\\door";
}

// The folders within this one to which the lines' paths lead. A customer's card may hold a copy of a workspace, so that
// the drive counts too.
QSet<QString> foldersOf(const QStringList& lines, const DrivePath& all) {
    const QString before = all.text() + u'\\';
    QSet<QString> folders;
    for (const QString& line : lines) {
        const qsizetype at = line.indexOf(before);
        const qsizetype end = at < 0 ? -1 : line.indexOf(u'\\', at + before.size());
        if (end >= 0)
            folders += line.mid(at, end - at);
    }
    return folders;
}

} // namespace

Result<DrivePath> makeDoorFolder(const SessionState& state, const Files& files) {
    const DrivePath all = doorFolders(files);
    for (const DrivePath& above : {WorkspacePaths::root(state), WorkspacePaths::zmany(state), all}) {
        if (const Result<void> made = files.makeFolder(above); !made)
            return made.failure();
    }
    for (int number = 1;; ++number) {
        const DrivePath folder = all / QString::number(number);
        const Result<bool> made = files.makeNewFolder(folder);
        if (!made)
            return made.failure();
        if (*made)
            return folder;
    }
}

void removeDoorFolders(const Files& files, const QStringList& lines) {
    for (const QString& folder : foldersOf(lines, doorFolders(files)))
        static_cast<void>(files.removeTree(DrivePath(folder))); // the next start tries again
}

void tidyDoorFolders(const SessionState& state, const Files& files) {
    const DrivePath all = doorFolders(files);
    const QStringList numbers = files.folders(all);
    if (numbers.isEmpty())
        return;
    QSet<QString> needed;
    const DrivePath orders = WorkspacePaths::orders(state);
    for (const QString& name : files.folders(orders)) {
        const Result<OrderState> order = ReadOrderState(files, OrderFolder(orders / name));
        const bool leaves = order && order->way != OrderState::Way::Station && order->way != OrderState::Way::Mail;
        if (order &&
            (order->phase == OrderState::Phase::Preparing || (leaves && order->phase < OrderState::Phase::Sending)))
            needed += foldersOf(order->items, all);
    }
    for (const QString& number : numbers) {
        if (const DrivePath folder = all / number; !needed.contains(folder.text()))
            static_cast<void>(files.removeTree(folder));
    }
}

} // namespace lumora
