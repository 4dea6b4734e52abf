#pragma once

#include "common/Result.h"
#include "session/TextList.h"

#include <QString>
#include <QStringList>

#include <cstdint>
#include <functional>
#include <optional>
#include <vector>

namespace lumora {

class Descriptor;
class Files;

// What became of one file that was to be cut. With a failure or a stop the pieces that are counted stand whole, and the
// rest is missing.
struct Cut {
    bool passedOver = false; // its name does not end as asked for
    bool stopped = false;
    QString folder; // where the pieces lie
    int pieces = 0;
    int declared = 0;
    std::optional<Failure> failure;
};

// What became of one family that was to be joined. With a failure or a stop the output is as it was before.
struct Joined {
    bool stopped = false;
    QString file;
    int pieces = 0;   // that went into the file: up to the first gap in the numbers
    int declared = 0; // by the name that was given
    qint64 bytes = 0;
    std::optional<Failure> failure;
};

// A whole decimal number of 1 to 2147483647 bytes; blanks around it do not count.
std::optional<std::int32_t> SegmentSize(const QString& text);

// Cuts files into numbered pieces of a fixed size, and joins pieces into the file again. Sources are opened for reading
// only; a piece or a joined file is there whole or not at all.
class Mod4split {
public:
    // done pieces of total are through; pumps, and false ends the work there.
    using Step = std::function<bool(int done, int total)>;
    Mod4split(const Files& files, Step step)
        : m_files(files)
        , m_step(std::move(step)) {}

    enum class Target { FolderOfSource, Meforakim };
    // Does nothing to a path that does not end in extension, three characters. A piece that is there already is written
    // over from its beginning and not cut short: what it holds beyond the new bytes stays, as the lab's tools have it.
    Cut SplitFile(const QString& path, const QString& segmentText, Target target, const QString& extension) const;

    // Into the folder moorkavim beside the piece.
    Joined MergeFamily(const QString& piecePath) const;
    // Follows the numbers on the disk from 1 to the first gap, whatever total the names declare.
    Joined JoinPieces(const QString& piecePath, const QString& outputPath) const;

private:
    Result<void> writePiece(const QString& path, const Descriptor& source, qint64 count,
                            const QString& sourcePath) const;
    Result<qint64> appendPieces(const QString& piecePath, const QString& outputPath, Joined& joined) const;

    const Files& m_files;
    Step m_step;
};

// The first listed piece of each family.
void ListSingles(const TextList& from, TextList& into);

// All the paths of pieces that have the key of the current entry of families go to family. 1: as many as that entry
// declares; negative: so many are missing; above 10: 10 and the surplus.
int CollectFamily(const TextList& families, const TextList& pieces, TextList& family);
int FamilyVerdict(int declared, int count);
inline constexpr int familyComplete = 1;
inline constexpr int surplusBase = 10;

// What is known of a family.
struct PieceFamily {
    QString first; // path of its first listed piece
    int declared = 0;
    int count = 0;
    int verdict = 0;          // as CollectFamily's
    bool listedTwice = false; // a path stands more than once in pieces: its folder was read again
};
// One for each entry of singles.
std::vector<PieceFamily> JudgeFamilies(const TextList& singles, const TextList& pieces);

// The total that a piece's name declares; 0 for what is no number.
int DeclaredTotal(const QString& piecePath);

} // namespace lumora
