#pragma once

#include "common/DrivePath.h"
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

// The result of cutting one file. After a failure or a stop the counted pieces are whole and the rest is missing.
struct Cut {
    bool passedOver = false; // its name does not have the extension asked for
    bool stopped = false;
    DrivePath folder; // folder of the pieces
    int pieces = 0;
    int declared = 0;
    std::optional<Failure> failure;
};

// The result of joining one family. After a failure or a stop the output file is as it was before.
struct Joined {
    bool stopped = false;
    DrivePath file;
    int pieces = 0;   // pieces joined: up to the first gap in the numbers
    int declared = 0; // total declared by the given piece's name
    qint64 bytes = 0;
    std::optional<Failure> failure;
};

// The size of a piece: a whole decimal number of 1 to 2147483647 bytes; blanks around it are ignored. No value
// otherwise.
std::optional<std::int32_t> SegmentSize(const QString& text);

// Cuts files into numbered pieces of a fixed size, and joins pieces into the file again. Sources are opened for reading
// only; a piece or a joined file is written whole or not at all.
class Mod4split {
public:
    // Called after each piece, done of total; may pump. Returning false stops the work.
    using Step = std::function<bool(int done, int total)>;
    Mod4split(const Files& files, Step step)
        : m_files(files)
        , m_step(std::move(step)) {}

    enum class Target { FolderOfSource, Meforakim };
    // Does nothing when path does not end in extension (three characters). An existing piece is overwritten from its
    // beginning and not cut short: the bytes behind the new ones stay, as the lab's tools expect.
    Cut SplitFile(const DrivePath& path, const QString& segmentText, Target target, const QString& extension) const;

    // Writes into the folder moorkavim beside the piece.
    Joined MergeFamily(const DrivePath& piecePath) const;
    // Joins the pieces on the disk from number 1 to the first gap; the total in their names is ignored.
    Joined JoinPieces(const DrivePath& piecePath, const DrivePath& outputPath) const;

private:
    Result<void> writePiece(const DrivePath& path, const Descriptor& source, qint64 count,
                            const DrivePath& sourcePath) const;
    Result<qint64> appendPieces(const DrivePath& piecePath, const DrivePath& outputPath, Joined& joined) const;

    const Files& m_files;
    Step m_step;
};

// Appends the first listed piece of each family to into.
void ListSingles(const TextList& from, TextList& into);

// Fills family with all paths in pieces that belong to the family of the current entry. 1: as many as that entry
// declares; negative: that many are missing; above 10: 10 plus the surplus.
int CollectFamily(const TextList& families, const TextList& pieces, TextList& family);
int FamilyVerdict(int declared, int count);
inline constexpr int familyComplete = 1;
inline constexpr int surplusBase = 10;

// What the lists tell about a family.
struct PieceFamily {
    QString first; // path of the first listed piece
    int declared = 0;
    int count = 0;
    int verdict = 0;          // as of CollectFamily
    bool listedTwice = false; // a path stands twice in pieces, since its folder was read again
};
// One for each entry of singles.
std::vector<PieceFamily> JudgeFamilies(const TextList& singles, const TextList& pieces);

// The total that the piece's name declares; 0 when it is no number.
int DeclaredTotal(const QString& piecePath);

} // namespace lumora
