#include "editing/render/FrameScramble.h"

#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {
namespace {

constexpr qint64 leastSize = 100'000;
constexpr qsizetype block = 23'000;

} // namespace

Result<DrivePath> ScrambleFrameFile(const SessionState& state, const Files& files, const DrivePath& path) {
    const Result<qint64> size = files.size(path);
    if (!size)
        return size.failure();
    if (*size < leastSize)
        return DrivePath();
    const DrivePath results = WorkspacePaths::root(state) / u"!!moozpanim";
    const DrivePath pieces = WorkspacePaths::root(state) / u"!!benaime";
    for (const DrivePath& folder : {results, pieces}) {
        if (const Result<void> made = files.makeFolder(folder); !made)
            return made.failure();
    }
    const Result<QByteArray> bytes = files.read(path);
    if (!bytes)
        return bytes.failure();
    // The pieces stay in memory, so that a failure leaves nothing half joined.
    const DrivePath result = results / u"!k.bmp";
    if (const Result<void> written =
            files.writeWhole(result, bytes->mid(block, block) + bytes->left(block) + bytes->mid(2 * block));
        !written)
        return written.failure();
    for (const char16_t* piece : {u"kaa.bmp", u"kbb.bmp", u"kcc.bmp", u"kzz.bmp"}) {
        const DrivePath left = pieces / piece;
        if (files.fileExists(left))
            static_cast<void>(files.removeFile(left)); // a leftover that stays does no harm
    }
    return result;
}

} // namespace lumora
