#include "session/Workspace.h"

#include "common/AnsiCodePage.h"
#include "common/DrivePath.h"
#include "session/SessionState.h"

#include <optional>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The largest number that a counter is believed: it must fit, with one added, wherever an order number goes.
constexpr long long largestNumber = 999999999;

DrivePath counterFolder(const SessionState& state) {
    return state.DiskRoot / u"vedron";
}

// Blanks in front are passed over and digits are taken up to the first other character: "007x" is 7, a text without
// digits is 0.
long long counterValue(const QString& line) {
    long long value = 0;
    for (const QChar digit : line.trimmed()) {
        if (digit < u'0' || digit > u'9')
            break;
        value = std::min(value * 10 + (digit.unicode() - u'0'), largestNumber);
    }
    return value;
}

// The first line of a stored text; nothing for a text without any byte.
std::optional<QString> firstLine(const QByteArray& bytes) {
    if (bytes.isEmpty())
        return std::nullopt;
    const qsizetype end = bytes.indexOf('\n');
    QByteArray line = end < 0 ? bytes : bytes.left(end);
    if (line.endsWith('\r'))
        line.chop(1);
    return AnsiCodePage::decode(line);
}

} // namespace

namespace WorkspacePaths {

DrivePath root(const SessionState& state) {
    return state.DiskRoot / u"2000lumora";
}

DrivePath zmany(const SessionState& state) {
    return root(state) / u"zmany";
}

DrivePath ktanim(const SessionState& state) {
    return zmany(state) / u"ktanim";
}

DrivePath tempred(const SessionState& state) {
    return zmany(state) / u"tempred";
}

DrivePath corrected(const SessionState& state, const DrivePath& picture) {
    return tempred(state) / MangleFileName(picture);
}

DrivePath jobFolder(const SessionState& state) {
    return zmany(state) / u"job_folder";
}

DrivePath misgarot(const SessionState& state) {
    return root(state) / u"misgarot";
}

DrivePath orders(const SessionState& state) {
    return root(state) / u"!!000";
}

DrivePath scratchPicture(const SessionState& state) {
    return orders(state) / u"^^^.jpg";
}

DrivePath counter(const SessionState& state) {
    return counterFolder(state) / u"mispar.txt";
}

DrivePath toneCopy(const SessionState& state) {
    return root(state) / u"bw.bmp";
}

DrivePath previewCopy(const SessionState& state) {
    return root(state) / u"0.bmp";
}

DrivePath proofPicture(const SessionState& state) {
    return root(state) / u"000.jpg";
}

DrivePath summaryPicture(const SessionState& state) {
    return root(state) / u"001.jpg";
}

DrivePath handOverTexts(const SessionState& state) {
    return root(state) / u"Tik4txt";
}

std::array<DrivePath, 3> detailStores(const SessionState& state) {
    return {root(state) / u"pratim.txt", root(state) / u"pratim2.txt", root(state) / u"pratim3.txt"};
}

} // namespace WorkspacePaths

bool Workspace::MakeRootFolders() const {
    // A failed creation does not matter when the folder exists, as on a drive that has become read-only.
    (void)m_files.makeFolder(WorkspacePaths::root(m_state));
    (void)m_files.makeFolder(WorkspacePaths::zmany(m_state));
    return m_files.folderExists(WorkspacePaths::zmany(m_state));
}

Result<void> Workspace::MakeWorkspace() const {
    for (const DrivePath& folder :
         {WorkspacePaths::root(m_state), WorkspacePaths::zmany(m_state), WorkspacePaths::jobFolder(m_state),
          WorkspacePaths::ktanim(m_state), WorkspacePaths::tempred(m_state), WorkspacePaths::misgarot(m_state)}) {
        if (const Result<void> made = m_files.makeFolder(folder); !made)
            return made;
    }
    return {};
}

Result<void> Workspace::MakeCounterFolder() const {
    return m_files.makeFolder(counterFolder(m_state));
}

Result<void> Workspace::MakeOrderFolder() const {
    return m_files.makeFolder(WorkspacePaths::orders(m_state));
}

Result<void> Workspace::CleanWorkspace(QString& MisparHazmana) const {
    const DrivePath orders = WorkspacePaths::orders(m_state);
    const struct {
        DrivePath folder;
        QStringList endings;
    } scratch[] = {{WorkspacePaths::ktanim(m_state), {"jpg"}},
                   {WorkspacePaths::tempred(m_state), {"jpg"}},
                   {WorkspacePaths::jobFolder(m_state), {"txt", "jpg", "bmp"}},
                   {orders, {"gbr", "jpg", "gbx"}}};
    for (const auto& place : scratch) {
        for (const QString& ending : place.endings)
            deleteMatching(place.folder, ending);
    }

    const Result<void> written = m_files.writeWhole(orders / u"mana.txt", QByteArrayLiteral("1\r\n"));

    const DrivePath counter = WorkspacePaths::counter(m_state);
    if (!m_files.fileExists(counter)) {
        MisparHazmana = u"100"_s;
    } else if (const Result<QByteArray> bytes = m_files.read(counter)) {
        // An empty counter file, like an unreadable one, leaves the number as it was.
        if (const std::optional<QString> line = firstLine(*bytes))
            MisparHazmana = QString::number(counterValue(*line));
    }

    (void)m_files.removeFile(orders / u"111.jpg");
    return written;
}

void Workspace::CleanHistory(const std::function<bool(const DrivePath&)>& keeps) const {
    const DrivePath orders = WorkspacePaths::orders(m_state);
    for (const QString& order : m_files.folders(orders)) {
        const DrivePath folder = orders / order;
        if (keeps && keeps(folder))
            continue;
        const QStringList names = m_files.names(folder, u"*.*"_s);
        // The first file of a folder is its order sheet, which stays as the record of the order.
        for (qsizetype i = 1; i < names.size(); ++i) {
            if (names[i].endsWith(u"jpp"))
                (void)m_files.removeFile(folder / names[i]);
        }
    }
}

Result<void> Workspace::writeCounter() const {
    if (const Result<void> made = MakeCounterFolder(); !made)
        return made;
    const long long next = counterValue(m_state.MisparHazmana) + 1;
    const Result<QByteArray> stored = m_files.read(WorkspacePaths::counter(m_state));
    if (stored && counterValue(firstLine(*stored).value_or(QString())) >= next)
        return {};
    return m_files.writeWhole(WorkspacePaths::counter(m_state), QByteArray::number(next) + "\r\n");
}

// The pattern ignores letter case and the test of the ending does not, so "a.Jpg" stays; so does a file that can't be
// deleted.
void Workspace::deleteMatching(const DrivePath& folder, const QString& ending) const {
    for (const QString& name : m_files.names(folder, u"*."_s + ending)) {
        if (name.endsWith(ending) || name.endsWith(ending.toUpper()))
            (void)m_files.removeFile(folder / name);
    }
}

} // namespace lumora
