#include "desk/ArrivedOrder.h"

#include "common/HostFile.h"
#include "finished/pieces/Mod4split.h"
#include "order/OrderNames.h"
#include "order/PieceName.h"
#include "platform/files/Drives.h"
#include "platform/files/Files.h"
#include "platform/files/HostPath.h"

#include <QMap>
#include <QMultiMap>

#include <set>

namespace lumora {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;

namespace {

Result<QStringList> filesOf(const fs::path& folder) {
    QStringList names;
    std::error_code error;
    fs::directory_iterator at(folder, error);
    for (const fs::directory_iterator end; !error && at != end; at.increment(error)) {
        std::error_code asked;
        const QString name = toText(at->path().filename());
        if (name.startsWith(u'.'))
            continue;
        if (at->is_regular_file(asked))
            names += name;
        else if (asked && asked != std::errc::no_such_file_or_directory)
            return fileFailure(at->path(), u"can't be read"_s, asked.value());
    }
    if (error)
        return fileFailure(folder, u"can't be listed"_s, error.value());
    names.sort();
    return names;
}

// The pieces of one file.
struct CutFile {
    QString first; // leaf name of a piece
    std::set<int> numbers;
    std::set<QString> totals;
};

QMap<QString, CutFile> cutFilesAmong(const QStringList& names) {
    QMap<QString, CutFile> files;
    for (const QString& name : names) {
        if (const auto joined = IsPiece(name) ? JoinedName(name) : std::nullopt; joined && !names.contains(*joined)) {
            CutFile& file = files[*joined];
            file.first = name;
            file.numbers.insert(PieceSequence(name).toInt());
            file.totals.insert(PieceTotal(name));
        }
    }
    return files;
}

// A file of an exact multiple of the segment declares one piece more than it has. Whether the last one is such a piece,
// the check of the joined file tells.
QString missingOf(const QString& name, const CutFile& file) {
    if (file.totals.size() > 1)
        return u"%1: there are pieces of two cuts"_s.arg(name);
    const int last = std::max(file.totals.begin()->toInt() - 1, *file.numbers.rbegin());
    QStringList missing;
    for (int number = 1; number <= last; ++number) {
        if (!file.numbers.contains(number))
            missing += QString::number(number);
    }
    if (missing.isEmpty())
        return {};
    return u"%1: of its %2 pieces these are missing: %3"_s.arg(name, *file.totals.begin(), missing.join(u", "_s));
}

// A folder with the order's own name in which each file is whole: those of the order by links, the joined ones.
Result<fs::path> joinedFolder(const fs::path& folder, const QStringList& names, const QMap<QString, CutFile>& cut,
                              const fs::path& room) {
    const fs::path whole = room / folder.filename();
    std::error_code error;
    fs::create_directory(whole, error);
    for (const QString& name : names) {
        if (!error && !IsPiece(name))
            fs::create_symlink(folder / toHostPath(name), whole / toHostPath(name), error);
    }
    if (error)
        return fileFailure(whole, u"the pieces of an order can't be joined here"_s, error.value());
    const Drives drives(whole, u'C', {});
    const Files files(drives);
    const Mod4split pieces(files, [](int, int) { return true; });
    for (auto file = cut.cbegin(); file != cut.cend(); ++file) {
        const Joined joined = pieces.JoinPieces(drives.toDrive(folder / toHostPath(file->first)),
                                                drives.toDrive(whole / toHostPath(file.key())));
        if (joined.failure)
            return *joined.failure;
    }
    return whole;
}

} // namespace

Result<ArrivedOrder> ArrivedOrder::judge(const fs::path& given, PrintFileShape shape, const fs::path& room) {
    std::error_code error;
    fs::path folder = fs::canonical(given, error);
    if (error)
        return fileFailure(given, u"can't be read"_s, error.value());
    ArrivedOrder order;
    order.name = toText(folder.filename());
    const Result<QStringList> names = filesOf(folder);
    if (!names)
        return names.failure();
    const QMap<QString, CutFile> cut = cutFilesAmong(*names);
    for (auto file = cut.cbegin(); file != cut.cend(); ++file) {
        if (const QString missing = missingOf(file.key(), *file); !missing.isEmpty())
            order.missing += missing;
    }
    if (!order.missing.isEmpty())
        return order;
    if (!cut.isEmpty()) {
        const Result<fs::path> whole = joinedFolder(folder, *names, cut, room);
        if (!whole)
            return whole.failure();
        folder = *whole;
    }
    const Result<OrderFindings> findings = checkOrderFolder(folder, shape);
    if (!findings) {
        order.missing += findings.failure().message;
        return order;
    }
    order.findings = *findings;
    order.missing = findings->faults;
    const QString sheet = SheetName(OrderNumberOf(order.findings.order), {}, {});
    const Result<QStringList> checked = filesOf(folder);
    if (!checked)
        return checked.failure();
    for (const QString& name : *checked) {
        if (const auto parts = PrintFileName::parse(name))
            order.prints.push_back({name, *parts, folder / toHostPath(name)});
        else if (name.startsWith(sheet))
            order.sheet = folder / toHostPath(name);
    }
    if (order.missing.isEmpty() && static_cast<int>(order.prints.size()) != order.findings.prints)
        return Failure{Failure::Kind::Other, u"%1: %2 prints were checked, %3 are listed"_s.arg(order.name)
                                                 .arg(order.findings.prints)
                                                 .arg(order.prints.size())};
    return order;
}

} // namespace lumora
