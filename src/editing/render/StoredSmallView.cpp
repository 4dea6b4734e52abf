#include "editing/render/StoredSmallView.h"

#include "common/DrivePathText.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <QBuffer>

namespace lumora::StoredSmallView {

QString path(const SessionState& state, const QString& picturePath) {
    return JoinDrivePath(WorkspacePaths::ktanim(state), MangleFileName(picturePath));
}

Result<void> store(const SessionState& state, const Files& files, const QString& picturePath, const Bitmap& preview) {
    const QString folder = WorkspacePaths::ktanim(state);
    if (!files.folderExists(folder)) {
        if (const Result<void> made = files.makeFolder(folder); !made)
            return made;
    }
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    if (!preview.image().save(&buffer, "BMP"))
        return Failure{Failure::Kind::Other, QStringLiteral("The small view of %1 can't be made.").arg(picturePath)};
    return files.writeWhole(path(state, picturePath), bytes);
}

void discard(const SessionState& state, const Files& files, const QString& picturePath) {
    const QString stored = path(state, picturePath);
    // A small view that can't be removed stays until the next store writes over it.
    if (files.fileExists(stored))
        static_cast<void>(files.removeFile(stored));
}

} // namespace lumora::StoredSmallView
