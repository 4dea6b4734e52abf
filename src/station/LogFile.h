#pragma once

#include "common/HostFile.h"
#include "platform/files/HostPath.h"

#include <QByteArray>

#include <array>

namespace lumora {

// A file that is appended to and never grows beyond a bound: at half of it the file becomes FILE.1, in the place of the
// one before, and begins anew. Only its owner may read it.
class LogFile {
public:
    // most: bytes of both files together.
    LogFile(HostPath path, qint64 most);

    // Both files that a log at this path may have, the older one first.
    static std::array<HostPath, 2> filesAt(const HostPath& path);

    // A line that can't be written is lost; the next one tries again.
    Result<void> append(const QByteArray& line);

private:
    Result<void> open();
    void turnOver();

    HostPath m_path;
    qint64 m_most;
    Descriptor m_file;
    qint64 m_size = 0; // bytes of the open file
};

} // namespace lumora
