#include "finished/pieces/Mod4split.h"

#include "common/FixedText.h"
#include "common/HostFile.h"
#include "order/PieceName.h"
#include "platform/files/Files.h"

#include <QHash>
#include <QSet>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

const QString meforakim = u"meforakim"_s;
const QString moorkavim = u"moorkavim"_s;

Failure fault(Failure::Kind kind, const QString& path, const QString& reason) {
    return {kind, u"%1: %2"_s.arg(path, reason)};
}

DrivePath beside(const DrivePath& piece, int sequence) {
    return DrivePath(PieceBeside(piece.text(), sequence));
}

} // namespace

std::optional<std::int32_t> SegmentSize(const QString& text) {
    bool isNumber = false;
    const int size = text.trimmed().toInt(&isNumber);
    if (!isNumber || size < 1)
        return std::nullopt;
    return size;
}

Cut Mod4split::SplitFile(const DrivePath& path, const QString& segmentText, Target target,
                         const QString& extension) const {
    Cut cut;
    cut.passedOver = path.text().right(3) != extension;
    if (cut.passedOver)
        return cut;
    const auto refuse = [&cut](Failure failure) {
        cut.failure = std::move(failure);
        return cut;
    };
    const auto segment = SegmentSize(segmentText);
    if (!segment)
        return refuse(fault(Failure::Kind::Unsupported, segmentText, u"no number of bytes from 1 to 2147483647"_s));
    const auto length = m_files.size(path);
    if (!length)
        return refuse(length.failure());
    const qint64 declared = *length / *segment + 1;
    // A piece's name has three digits for a number: more pieces could never be joined.
    if (declared > mostPieces)
        return refuse(
            fault(Failure::Kind::TooLarge, path.text(),
                  u"%1 pieces of %2 bytes; names have room for %3"_s.arg(declared).arg(*segment).arg(mostPieces)));
    cut.declared = static_cast<int>(declared);
    const QString total = PieceNumber(cut.declared);
    const QString stem = PieceStem(path.leaf());
    const QString longest = stem + PieceTail(1, total);
    // A name that the drive shortens would lose the numbers at its end.
    if (ShortenedName(longest) != longest)
        return refuse(fault(Failure::Kind::Unsupported, path.text(), u"the name is too long for pieces"_s));

    const auto host = m_files.host(path);
    if (!host)
        return refuse(host.failure());
    const auto source = openSource(*host, path.text());
    if (!source)
        return refuse(source.failure());
    cut.folder = path.folder();
    if (target == Target::Meforakim) {
        cut.folder = cut.folder / meforakim;
        if (const auto made = m_files.makeFolder(cut.folder); !made)
            return refuse(made.failure());
    }
    for (qint64 offset = 0; offset < *length; offset += *segment) {
        if (!m_step(cut.pieces, cut.declared)) {
            cut.stopped = true;
            return cut;
        }
        const DrivePath piece = cut.folder / (stem + PieceTail(cut.pieces + 1, total));
        const auto written = writePiece(piece, *source, std::min<qint64>(*segment, *length - offset), path);
        if (!written)
            return refuse(written.failure());
        ++cut.pieces;
    }
    return cut;
}

Result<void> Mod4split::writePiece(const DrivePath& path, const Descriptor& source, qint64 count,
                                   const DrivePath& sourcePath) const {
    const auto host = m_files.host(path);
    if (!host)
        return host.failure();
    NewContent content(*host, path.text());
    const auto taken = appendFrom(source, count, content, sourcePath.text());
    if (!taken)
        return taken.failure();
    if (!content.failed() && *taken != count)
        return fault(Failure::Kind::Damaged, sourcePath.text(), u"the file became shorter meanwhile"_s);
    if (m_files.fileExists(path)) {
        const auto old = openSource(*host, path.text());
        if (!old)
            return old.failure();
        if (const auto skipped = skipTo(*old, count, path.text()); !skipped)
            return skipped.failure();
        if (const auto tail = appendFrom(*old, toTheEnd, content, path.text()); !tail)
            return tail.failure();
    }
    return content.commit();
}

Joined Mod4split::MergeFamily(const DrivePath& piecePath) const {
    Joined joined;
    if (piecePath.isEmpty())
        return joined;
    const auto refuse = [&joined](Failure failure) {
        joined.failure = std::move(failure);
        return joined;
    };
    const auto name = JoinedName(piecePath.leaf());
    if (!name)
        return refuse(fault(Failure::Kind::Unsupported, piecePath.text(),
                            u"no piece: the name is shorter than a name and \"_001_001.prk\""_s));
    const DrivePath folder = piecePath.folder() / moorkavim;
    // A family whose pieces were removed meanwhile must not leave an empty folder.
    if (m_files.fileExists(beside(piecePath, 1))) {
        if (const auto made = m_files.makeFolder(folder); !made)
            return refuse(made.failure());
    }
    return JoinPieces(piecePath, folder / *name);
}

Joined Mod4split::JoinPieces(const DrivePath& piecePath, const DrivePath& outputPath) const {
    Joined joined;
    joined.declared = DeclaredTotal(piecePath.text());
    const auto bytes = appendPieces(piecePath, outputPath, joined);
    if (!bytes) {
        joined.failure = bytes.failure();
        return joined;
    }
    joined.bytes = *bytes;
    if (!joined.stopped)
        joined.file = outputPath;
    return joined;
}

Result<qint64> Mod4split::appendPieces(const DrivePath& piecePath, const DrivePath& outputPath, Joined& joined) const {
    int count = 0;
    while (count < mostPieces && m_files.fileExists(beside(piecePath, count + 1)))
        ++count;
    if (count == 0)
        return fault(Failure::Kind::NotFound, beside(piecePath, 1).text(), u"the first piece is not there"_s);
    const auto target = m_files.host(outputPath);
    if (!target)
        return target.failure();
    NewContent content(*target, outputPath.text());
    qint64 bytes = 0;
    for (int number = 1; number <= count && !content.failed(); ++number) {
        joined.stopped = !m_step(number - 1, count);
        if (joined.stopped)
            return 0;
        const DrivePath path = beside(piecePath, number);
        const auto host = m_files.host(path);
        if (!host)
            return host.failure();
        const auto piece = openSource(*host, path.text());
        if (!piece)
            return piece.failure();
        const auto appended = appendFrom(*piece, toTheEnd, content, path.text());
        if (!appended)
            return appended.failure();
        bytes += *appended;
    }
    if (const auto written = content.commit(); !written)
        return written.failure();
    joined.pieces = count;
    return bytes;
}

void ListSingles(const TextList& from, TextList& into) {
    into.clear();
    QSet<QString> keys;
    for (const QString& path : from.items()) {
        const QString key = FamilyKey(path);
        if (!IsPiece(path) || keys.contains(key))
            continue;
        keys.insert(key);
        into.append(path);
    }
}

int CollectFamily(const TextList& families, const TextList& pieces, TextList& family) {
    family.clear();
    const QString single = families.currentItem();
    const QString key = FamilyKey(single);
    for (const QString& path : pieces.items()) {
        if (FamilyKey(path) == key)
            family.append(path);
    }
    return FamilyVerdict(DeclaredTotal(single), family.count());
}

std::vector<PieceFamily> JudgeFamilies(const TextList& singles, const TextList& pieces) {
    QHash<QString, int> counts;
    QSet<QString> paths;
    QSet<QString> twice;
    for (const QString& path : pieces.items()) {
        const QString key = FamilyKey(path);
        ++counts[key];
        if (paths.contains(path))
            twice.insert(key);
        paths.insert(path);
    }
    std::vector<PieceFamily> families;
    for (const QString& first : singles.items()) {
        const QString key = FamilyKey(first);
        const int declared = DeclaredTotal(first);
        const int count = counts.value(key);
        families.push_back({first, declared, count, FamilyVerdict(declared, count), twice.contains(key)});
    }
    return families;
}

int FamilyVerdict(int declared, int count) {
    if (declared == count)
        return familyComplete;
    return count < declared ? count - declared : count - declared + surplusBase;
}

int DeclaredTotal(const QString& piecePath) {
    return static_cast<int>(Val(PieceTotal(piecePath)));
}

} // namespace lumora
