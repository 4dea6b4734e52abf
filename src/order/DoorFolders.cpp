#include "order/DoorFolders.h"

#include "order/OrderFolder.h"
#include "order/OrderState.h"
#include "session/Workspace.h"

#include <QRegularExpression>
#include <QSet>
#include <QUuid>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

DrivePath doorFolders(const Files& files) {
    return files.drives().programRoot() / u"2000lumora\\zmany\\door";
}

// The folders of orders to which the paths of an order lead. A customer's card may hold a copy of a workspace, so that
// the drive counts too.
QSet<QString> foldersOf(const OrderState& order, const Files& files) {
    static const QRegularExpression name(u"^[0-9a-f]{12}(?=\\\\)"_s);
    const QString before = doorFolders(files).text() + u'\\';
    QSet<QString> folders;
    for (const QString& line : order.items + QStringList(order.keptIn + u'\\')) {
        const qsizetype at = line.indexOf(before);
        const QString found = at < 0 ? QString() : name.match(line.mid(at + before.size())).captured();
        if (!found.isEmpty())
            folders += before + found;
    }
    return folders;
}

} // namespace

DrivePath newDoorFolder(const Files& files) {
    return doorFolders(files) / QUuid::createUuid().toString(QUuid::Id128).left(12);
}

DrivePath doorFolderOf(const OrderState& order, const Files& files) {
    const QSet<QString> folders = foldersOf(order, files);
    // Of several nobody knows which one is the order's own.
    return order.keptIn.isEmpty() && folders.size() == 1 ? DrivePath(*folders.begin()) : DrivePath(order.keptIn);
}

void removeDoorFolders(const Files& files, const OrderState& order) {
    for (const QString& folder : foldersOf(order, files))
        static_cast<void>(files.removeTree(DrivePath(folder))); // the next start tries again
}

void tidyDoorFolders(const SessionState& state, const Files& files) {
    const DrivePath all = doorFolders(files);
    const QStringList names = files.folders(all);
    if (names.isEmpty())
        return;
    QSet<QString> needed;
    const DrivePath orders = WorkspacePaths::orders(state);
    for (const QString& leaf : files.folders(orders)) {
        const Result<OrderState> order = ReadOrderState(files, OrderFolder(orders / leaf));
        const bool leaves = order && order->way != OrderState::Way::Station && order->way != OrderState::Way::Mail;
        if (order &&
            (order->phase == OrderState::Phase::Preparing || (leaves && order->phase < OrderState::Phase::Sending)))
            needed += foldersOf(*order, files);
    }
    for (const QString& name : names) {
        if (const DrivePath folder = all / name; !needed.contains(folder.text()))
            static_cast<void>(files.removeTree(folder));
    }
}

} // namespace lumora
