#pragma once

#include "common/Result.h"

#include <QByteArrayView>

#include <array>

namespace lumora {

class DrivePath;
class Files;

// The line ends among the bytes of a file, by which a server is known that converts what it takes for text: it drops
// each CR, or the CR of each CR LF, or puts a CR before each LF.
struct LineEnds {
    qint64 cr = 0;   // all CR bytes
    qint64 lf = 0;   // all LF bytes
    qint64 crlf = 0; // pairs

    void add(QByteArrayView bytes); // the next bytes of the file

    // By how many bytes the file becomes longer in each way of converting it: every CR dropped, the CR of each pair
    // dropped, a CR put before each LF, and before each LF that has none. A file of any other length was cut.
    std::array<qint64, 4> changes() const;

private:
    bool m_afterCr = false;
};

// Counts those of a file, read in parts.
Result<LineEnds> LineEndsOf(const Files& files, const DrivePath& path);

} // namespace lumora
