#include "editing/render/FrameScramble.h"

#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {
namespace {

constexpr qint64 leastSize = 100'000;
constexpr qsizetype block = 23'000;

} // namespace

Result<QString> ScrambleFrameFile(const SessionState& state, const Files& files, const QString& path) {
    const Result<qint64> size = files.size(path);
    if (!size)
        return size.failure();
    if (*size < leastSize)
        return QString();
    const QString results = WorkspacePaths::root(state) + QStringLiteral("\\!!moozpanim");
    const QString pieces = WorkspacePaths::root(state) + QStringLiteral("\\!!benaime");
    for (const QString& folder : {results, pieces}) {
        if (const Result<void> made = files.makeFolder(folder); !made)
            return made.failure();
    }
    const Result<QByteArray> bytes = files.read(path);
    if (!bytes)
        return bytes.failure();
    // The pieces stay in memory, so that a failure leaves nothing half joined.
    const QString result = results + QStringLiteral("\\!k.bmp");
    if (const Result<void> written =
            files.writeWhole(result, bytes->mid(block, block) + bytes->left(block) + bytes->mid(2 * block));
        !written)
        return written.failure();
    for (const char* piece : {"kaa", "kbb", "kcc", "kzz"}) {
        const QString left = pieces + u'\\' + QString::fromLatin1(piece) + QStringLiteral(".bmp");
        if (files.fileExists(left))
            static_cast<void>(files.removeFile(left)); // a leftover that stays does no harm
    }
    return result;
}

} // namespace lumora
