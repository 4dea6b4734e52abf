#include "order/KeptWork.h"

#include "order/UnfinishedOrders.h"
#include "platform/files/Files.h"
#include "session/Workspace.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

KeptWork::KeptWork(const SessionState& state, const Files& files, OrderFolder folder)
    : m_state(state)
    , m_files(files)
    , m_folder(std::move(folder)) {}

Result<void> KeptWork::keepCorrected(const QStringList& lines) const {
    for (const QString& text : lines) {
        const BasketLine line = BasketLine::split(text, LineForm::Full);
        const DrivePath copy = PictureOf(line, LineForm::Full, m_state);
        if (copy == line.path || !m_files.fileExists(copy))
            continue;
        if (Result<void> kept = keep(copy); !kept)
            return kept;
    }
    return {};
}

Result<void> KeptWork::keepThumbnail(const DrivePath& thumbnail) const {
    return keep(thumbnail);
}

Result<void> KeptWork::keep(const DrivePath& file) const {
    const DrivePath folder = KeptWorkFolder(m_folder, file.folder());
    for (const DrivePath& path : {folder.folder(), folder}) {
        if (Result<void> made = m_files.makeFolder(path); !made)
            return made;
    }
    return m_files.keepCopy(file, folder / file.leaf());
}

void KeptWork::bringBack() const {
    const Workspace workspace(m_state, m_files);
    QString number; // of the next order, which this one does not take
    if (workspace.MakeWorkspace())
        static_cast<void>(workspace.CleanWorkspace(number));
    for (const DrivePath& scratch : {WorkspacePaths::tempred(m_state), WorkspacePaths::jobFolder(m_state)}) {
        const DrivePath kept = KeptWorkFolder(m_folder, scratch);
        // A picture that is missing here fails, and is named.
        for (const QString& name : m_files.names(kept, u"*"_s))
            static_cast<void>(m_files.keepCopy(kept / name, scratch / name));
    }
}

} // namespace lumora
