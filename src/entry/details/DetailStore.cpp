#include "entry/details/DetailStore.h"

#include "common/AnsiCodePage.h"
#include "common/ListOutput.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// In the order of WorkspacePaths::detailStores().
constexpr std::size_t customerStore = 0;
constexpr std::size_t albumStore = 1;
constexpr std::size_t quickStore = 2;

// A line of up to four characters has at most two between its quotes: no name, no number.
QString albumField(const QStringList& lines, int index) {
    const QString line = lines.value(index);
    return line.size() > 4 ? WithoutEnds(line) : QString();
}

} // namespace

Result<void> DetailStore::SaveDetails(const Customer& customer) const {
    ListOutput store;
    store.number(0).endLine();
    store.text(customer.name).endLine();
    store.text(customer.telephone).endLine();
    store.number(0).endLine();
    store.number(0).endLine();
    return m_files.writeWhole(path(customerStore), store.bytes());
}

Result<std::optional<DetailStore::Customer>> DetailStore::details() const {
    const Result<std::optional<QStringList>> stored = lines(customerStore);
    if (!stored)
        return stored.failure();
    if (!*stored || (*stored)->size() < 2)
        return std::optional<Customer>();
    return std::optional(Customer{WithoutEnds((*stored)->value(1)), WithoutEnds((*stored)->value(2))});
}

Result<void> DetailStore::forgetDetails() const {
    return forget(customerStore);
}

Result<void> DetailStore::SaveAlbumDetails(const Photographer& photographer) const {
    ListOutput store;
    store.number(0).endLine();
    for (const QString& field : {photographer.name, photographer.telephone, photographer.mailName}) {
        if (!field.isEmpty())
            store.text(field).endLine();
    }
    store.number(0).endLine();
    return m_files.writeWhole(path(albumStore), store.bytes());
}

Result<std::optional<DetailStore::Photographer>> DetailStore::albumDetails() const {
    const Result<std::optional<QStringList>> stored = lines(albumStore);
    if (!stored)
        return stored.failure();
    if (!*stored)
        return std::optional<Photographer>();
    return std::optional(Photographer{albumField(**stored, 1), albumField(**stored, 2), albumField(**stored, 3)});
}

Result<void> DetailStore::forgetQuickDetails() const {
    return forget(quickStore);
}

DrivePath DetailStore::path(std::size_t store) const {
    return WorkspacePaths::detailStores(m_state)[store];
}

// Splits at line ends alone, since a name may hold a single quote mark, as Hebrew abbreviations do.
Result<std::optional<QStringList>> DetailStore::lines(std::size_t store) const {
    if (!m_files.fileExists(path(store)))
        return std::optional<QStringList>();
    const Result<QByteArray> bytes = m_files.read(path(store));
    if (!bytes)
        return bytes.failure();
    QString text = AnsiCodePage::decode(*bytes);
    text.replace(u"\r\n"_s, u"\n"_s);
    if (text.endsWith(u'\n'))
        text.chop(1);
    return std::optional(text.split(u'\n'));
}

Result<void> DetailStore::forget(std::size_t store) const {
    if (!m_files.fileExists(path(store)))
        return {};
    return m_files.removeFile(path(store));
}

} // namespace lumora
