#include "order/OrderCompleteness.h"

#include "order/OrderFolder.h"
#include "order/OrderLog.h"
#include "order/OrderState.h"
#include "order/PieceName.h"
#include "order/PrintFileName.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"

#include <QMap>
#include <QSet>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

int printsNamedBy(const OrderLog& log) {
    int usable = 0;
    for (qsizetype i = 0; i < log.items.size(); ++i)
        usable += log.line(i).hasUsableName() ? 1 : 0;
    return std::max(0, usable - static_cast<int>(log.failed.size()));
}

bool isWhole(const QSet<int>& sequence, int declared) {
    int n = 0;
    while (sequence.contains(n + 1))
        ++n;
    return n > 0 && n == sequence.size() && n >= declared - 1;
}

} // namespace

QStringList PrintsAmong(const QStringList& names) {
    QSet<QString> prints;
    QMap<std::pair<QString, QString>, QSet<int>> families; // by joined name and declared total
    for (const QString& name : names) {
        if (PrintFileName::parse(name)) {
            prints += name;
            continue;
        }
        const std::optional<QString> joined = IsPiece(name) ? JoinedName(name) : std::nullopt;
        if (joined && PrintFileName::parse(*joined))
            families[{*joined, PieceTotal(name)}] += PieceSequence(name).toInt();
    }
    for (auto family = families.cbegin(); family != families.cend(); ++family) {
        if (isWhole(family.value(), family.key().second.toInt()))
            prints += family.key().first;
    }
    QStringList sorted(prints.begin(), prints.end());
    sorted.sort();
    return sorted;
}

OrderCompleteness::Verdict OrderCompleteness::verdict() const {
    if (sent() == 0)
        return Verdict::None;
    if (!named)
        return Verdict::Unknown;
    return sent() < *named ? Verdict::Fewer : Verdict::Whole;
}

OrderCompleteness OrderCompleteness::of(const OrderLog* log, const QStringList& present, const QStringList& marked,
                                        const QStringList& damagedFiles) {
    const auto whole = [&](QStringList names) {
        names.removeIf([&](const QString& name) { return damagedFiles.contains(name); });
        return static_cast<int>(PrintsAmong(names).size());
    };
    OrderCompleteness counts;
    const int all = static_cast<int>(PrintsAmong(present).size());
    counts.present = whole(present);
    counts.marked = whole(marked);
    counts.damaged = all - counts.present;
    counts.damagedFiles = damagedFiles;
    if (log)
        counts.named = printsNamedBy(*log);
    else if (counts.damaged > 0)
        counts.named = all;
    return counts;
}

OrderCompleteness OrderCompleteness::read(const SessionState& state, const Files& files, const OrderFolder& folder,
                                          const QStringList& marked) {
    const QStringList present = files.names(folder.path(), printPatterns);
    const std::optional<OrderLog> log = ReadOrderLog(files, folder);
    return of(log ? &*log : nullptr, present, marked, DamagedPrints(state, files, folder));
}

QStringList DamagedPrints(const SessionState& state, const Files& files, const OrderFolder& folder) {
    if (!state.Careful)
        return {};
    const Result<OrderState> kept = ReadOrderState(files, folder);
    QStringList names = files.names(folder.path(), printPatterns);
    names.removeIf([&](const QString& name) {
        const Result<qint64> length = files.size(folder.filePath(name));
        return length && *length > 0 && (!kept || kept->lengths.value(name, *length) == *length);
    });
    return names;
}

} // namespace lumora
