#include "selection/HandOverFiles.h"

#include "common/AnsiCodePage.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {

using namespace Qt::StringLiterals;

Result<void> writeHandOverFiles(const SessionState& state, const Files& files, const QStringList& lines, int index) {
    const DrivePath folder = WorkspacePaths::handOverTexts(state);
    Result<void> done = files.folderExists(folder) ? Result<void>() : files.makeFolder(folder);
    const auto write = [&](const QString& name, const QStringList& of) {
        if (done)
            done = files.writePassing(folder / name, AnsiCodePage::encode(of.join(u"\r\n"_s) + u"\r\n"_s));
    };
    write(u"all_list.txt"_s, lines);
    write(u"%1onepic.txt"_s.arg(index, 2, 10, QChar(u'0')), {lines.value(index)});
    return done;
}

} // namespace lumora
