#include "order/LeftOutPictures.h"

#include "common/FixedText.h"
#include "imaging/files/PictureFile.h"
#include "order/KeptPictures.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/Workspace.h"

namespace lumora {

using namespace Qt::StringLiterals;

QList<LeftOut> LeftOutOf(const QStringList& failed) {
    QList<LeftOut> pictures;
    for (const QString& path : failed)
        pictures += LeftOut{DrivePath(path), HasQuestionMark(path) ? LeftOut::Why::Name : LeftOut::Why::NotTold};
    return pictures;
}

Bitmap SmallLeftOut(const SessionState& state, const Files& files, int index, int cell) {
    const KeptPictures kept(files, state.keptFolder);
    const Result<HostPath> path = files.host(kept.fileOf(state.transfer.leftOut.value(index).picture));
    if (!path)
        return {};
    const std::vector<Result<Bitmap>> small = loadSmallPictures({*path}, cell);
    return small.front() ? *small.front() : Bitmap();
}

// The thumbnails of the order sheet go too, since the next sheet shows all that are there.
void TakeOrderBack(SessionState& state, const Platform& platform) {
    const Files& files = platform.files;
    const DrivePath thumbnails = WorkspacePaths::jobFolder(state);
    for (const QString& name : files.names(thumbnails, u"*.bmp"_s))
        static_cast<void>(files.removeFile(thumbnails / name));
    const OrderFolder order = OrderFolder::chosen(state);
    // Where it can't be removed whole, it must not be sent by itself beside the order that takes its place.
    if (order.isChosen() && ReadOrderState(files, order))
        static_cast<void>(OrderJournal(files, order).givenUp());
    const Result<void> removed =
        order.isChosen() && files.folderExists(order.path()) ? files.removeTree(order.path()) : Result<void>();
    if (!removed)
        platform.dialogs.message(removed.failure().message);
    state.transfer.OrderFolder = {};
    state.transfer.leftOut.clear();
}

} // namespace lumora
