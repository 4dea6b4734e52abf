#include "order/LineEnds.h"

#include "common/HostFile.h"
#include "platform/files/Files.h"

namespace lumora {

void LineEnds::add(QByteArrayView bytes) {
    for (const char byte : bytes) {
        cr += byte == '\r' ? 1 : 0;
        lf += byte == '\n' ? 1 : 0;
        crlf += byte == '\n' && m_afterCr ? 1 : 0;
        m_afterCr = byte == '\r';
    }
}

std::array<qint64, 4> LineEnds::changes() const {
    return {-cr, -crlf, lf, lf - crlf};
}

Result<LineEnds> LineEndsOf(const Files& files, const DrivePath& path) {
    const Result<HostPath> host = files.host(path);
    if (!host)
        return host.failure();
    const Result<Descriptor> source = openSource(*host, path.text());
    if (!source)
        return source.failure();
    LineEnds ends;
    QByteArray part(qsizetype(1) << 16, Qt::Uninitialized);
    for (;;) {
        const Result<std::size_t> count =
            readSome(*source, part.data(), static_cast<std::size_t>(part.size()), path.text());
        if (!count)
            return count.failure();
        if (*count == 0)
            return ends;
        ends.add(QByteArrayView(part.constData(), static_cast<qsizetype>(*count)));
    }
}

} // namespace lumora
