#include "order/PrintFile.h"

#include "order/OrderTail.h"
#include "order/PrintFileName.h"

#include <cstdint>
#include <cstdlib>

// The first byte is the number of pieces, the second the base; the rest is the file.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    using namespace lumora;
    if (size < 2)
        return 0;
    const PrintFileShape shape{data[0], data[1]};
    const QByteArray bytes(reinterpret_cast<const char*>(data) + 2, static_cast<qsizetype>(size - 2));
    if (const Result<PrintFileContent> content = readPrintFile(bytes, shape)) {
        // What was read takes no more than the file, and packs again to a file that reads the same.
        if (content->picture.size() + content->tail.size() > bytes.size())
            std::abort();
        const Result<QByteArray> again = packPrintFile(content->picture, shape, content->tail);
        if (!again || !readPrintFile(*again, shape))
            std::abort();
    }
    static_cast<void>(OrderTail::parse(bytes));
    static_cast<void>(PrintFileName::parse(QString::fromLatin1(bytes)));
    return 0;
}
