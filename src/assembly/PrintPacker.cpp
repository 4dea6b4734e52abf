#include "assembly/PrintPacker.h"

#include "order/PrintFileName.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

PrintPacker::PrintPacker(const SessionState& state, const Files& files, OrderFolder folder, int tailForm)
    : m_state(state)
    , m_files(files)
    , m_folder(std::move(folder))
    , m_tail(OrderTail::of(state))
    , m_shape(PrintFileShape::of(state.profile))
    , m_scratch(WorkspacePaths::scratchPicture(state))
    , m_tailForm(tailForm) {}

void PrintPacker::beginStep() {
    m_folderThere = makeOrderFolder(m_files, m_folder);
}

PrintPacker::Outcome PrintPacker::pack(const Line& line, const std::function<Result<QByteArray>()>& picture) {
    if (const Result<void> gone = m_files.fileExists(m_scratch) ? m_files.removeFile(m_scratch) : Result<void>();
        !gone) {
        static_cast<void>(picture()); // a print that was made ahead must not come in the next step
        return {false, gone.failure(), {}};
    }
    const Result<QByteArray> made = picture();
    if (!made)
        return {};
    if (const Result<void> written = m_files.writePassing(m_scratch, *made); !written)
        return {false, written.failure(), {}};

    const QString base = PrintBaseName(line.path);
    m_manifestLine = QString::number(made->size()) + u">>"_s + line.code + QString::number(m_runningNumber) + u'_' +
                     base + u".jpg\r\n"_s;
    if (!m_folderThere)
        return {false, m_folderThere.failure(), {}};
    const Result<QByteArray> packed = packPrintFile(*made, m_shape, m_tail.form(m_tailForm, base));
    const DrivePath print =
        m_folder.filePath(PrintFileName{line.code, line.index, static_cast<int>(m_state.Optint), base}.text());
    const Result<void> written = packed ? m_files.writeWhole(print, *packed) : Result<void>(packed.failure());
    if (written)
        return {true, {}, {}};
    // What the log names as failed must not be sent.
    const Result<void> removed = m_files.fileExists(print) ? m_files.removeFile(print) : Result<void>();
    return {false, written.failure(), removed ? std::optional<Failure>() : removed.failure()};
}

void PrintPacker::removeScratch() const {
    if (m_files.fileExists(m_scratch))
        static_cast<void>(m_files.removeFile(m_scratch));
}

} // namespace lumora
