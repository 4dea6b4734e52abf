#include "selection/HandOverFiles.h"

#include "common/AnsiCodePage.h"
#include "common/DrivePathText.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {

QString HandOverFiles::onePicName(int index) {
    return QStringLiteral("%1onepic.txt").arg(index, 2, 10, QLatin1Char('0'));
}

Result<void> HandOverFiles::write(const QStringList& lines, int index) const {
    const QString folder = JoinDrivePath(WorkspacePaths::root(m_state), QStringLiteral("Tik4txt"));
    if (!m_files.folderExists(folder)) {
        if (const Result<void> made = m_files.makeFolder(folder); !made)
            return made;
    }
    QString all;
    for (const QString& line : lines)
        all += line + QStringLiteral("\r\n");
    if (const Result<void> written =
            m_files.writePassing(JoinDrivePath(folder, QStringLiteral("all_list.txt")), AnsiCodePage::encode(all));
        !written)
        return written;
    return m_files.writePassing(JoinDrivePath(folder, onePicName(index)),
                                AnsiCodePage::encode(lines.value(index) + QStringLiteral("\r\n")));
}

} // namespace lumora
