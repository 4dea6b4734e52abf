#include "order/OrderLog.h"

#include <cstdint>
#include <cstdlib>

// The log of a finished order, which comes back from a disk that anybody may have written to. What was read from a log
// without stray quotes is written to a log that reads the same.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    using namespace lumora;
    const QByteArray bytes(reinterpret_cast<const char*>(data), static_cast<qsizetype>(size));
    OrderLog log;
    log.read(bytes);
    for (qsizetype i = 0; i < log.items.size(); ++i)
        static_cast<void>(log.line(i).hasUsableName());
    const QByteArray written = log.write();
    OrderLog again;
    again.read(written);
    if (again.layout != log.layout)
        std::abort();
    if (written.count('"') % 2 == 0 && again.write() != written)
        std::abort();
    return 0;
}
