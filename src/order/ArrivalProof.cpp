#include "order/ArrivalProof.h"

#include <QHash>
#include <QSet>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

using Lengths = QHash<QString, std::optional<qint64>>;

// Every order of the workspace sends its own content under this name.
const QString sharedName = u"000.jpg"_s;

void add(Lengths& lengths, const QString& name, std::optional<qint64> length) {
    std::optional<qint64>& kept = lengths[name];
    if (length && (!kept || *length > *kept))
        kept = length;
}

QString endingOf(const QString& name) {
    return name.mid(name.lastIndexOf(u'.') + 1).toLower();
}

} // namespace

ArrivalProof ArrivalProof::of(const QList<LocalFile>& here, const QList<RemoteFile>& there, Names names) {
    Lengths exact;
    Lengths folded;
    for (const RemoteFile& file : there) {
        add(exact, file.name, file.length);
        if (names == Names::WithoutCase)
            add(folded, file.name.toCaseFolded(), file.length);
    }
    ArrivalProof proof;
    QSet<QString> measured; // endings of which a length was told
    for (const RemoteFile& file : there) {
        if (file.length)
            measured += endingOf(file.name);
    }
    QSet<QString> looked;
    for (const auto& [name, length] : here) {
        if (looked.contains(name))
            continue;
        looked += name;
        auto found = exact.constFind(name);
        bool isThere = found != exact.constEnd();
        if (!isThere && names == Names::WithoutCase) {
            found = folded.constFind(name.toCaseFolded());
            isThere = found != folded.constEnd();
        }
        if (!isThere)
            proof.missing += name;
        else if (name == sharedName)
            proof.commonName += name;
        else if (!found->has_value())
            (measured.contains(endingOf(name)) ? proof.missing : proof.byName) += name;
        else if (**found == length)
            proof.byLength += name;
        else
            proof.broken += name;
    }
    return proof;
}

} // namespace lumora
