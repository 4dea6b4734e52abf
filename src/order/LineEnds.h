#pragma once

#include "common/Result.h"

#include <QByteArrayView>

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

    // Whether the length on the server is that of a file of this length here whose line ends were converted. Any other
    // length is that of a file that was cut.
    bool explain(qint64 here, qint64 there) const;

private:
    bool m_afterCr = false;
};

// Counts those of a file, read in parts.
Result<LineEnds> LineEndsOf(const Files& files, const DrivePath& path);

} // namespace lumora
