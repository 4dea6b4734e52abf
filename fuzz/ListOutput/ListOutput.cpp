#include "common/ListOutput.h"

#include <cstdint>
#include <cstdlib>

// The reader of stored texts and order logs, which come back from a disk that anybody may have written to.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const QByteArray bytes(reinterpret_cast<const char*>(data), static_cast<qsizetype>(size));
    const QStringList lines = lumora::ListOutputLines(bytes);
    const auto entries = lumora::ReadListOutput(bytes);
    if (entries.size() > lines.size() || lines.join(QString()).size() > bytes.size())
        std::abort();
    for (const QString& line : lines)
        (void)lumora::WithoutEnds(line);
    return 0;
}
