#include "editing/render/StoredSmallView.h"

#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <QBuffer>

namespace lumora::StoredSmallView {

using namespace Qt::StringLiterals;

DrivePath path(const SessionState& state, const DrivePath& picturePath) {
    return WorkspacePaths::ktanim(state) / MangleFileName(picturePath);
}

Result<void> store(const SessionState& state, const Files& files, const DrivePath& picturePath, const Bitmap& preview) {
    const DrivePath folder = WorkspacePaths::ktanim(state);
    if (!files.folderExists(folder)) {
        if (const Result<void> made = files.makeFolder(folder); !made)
            return made;
    }
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    if (!preview.image().save(&buffer, "BMP"))
        return Failure{Failure::Kind::Other, u"The small view of %1 can't be made."_s.arg(picturePath.text())};
    return files.writeWhole(path(state, picturePath), bytes);
}

void discard(const SessionState& state, const Files& files, const DrivePath& picturePath) {
    const DrivePath stored = path(state, picturePath);
    // A small view that can't be removed stays until the next store writes over it.
    if (files.fileExists(stored))
        static_cast<void>(files.removeFile(stored));
}

} // namespace lumora::StoredSmallView
