#include "platform/line/FtpListing.h"

#include <cstdint>
#include <cstdlib>

// What a server, or whoever stands in its place, answers to LIST.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const QByteArray listing(reinterpret_cast<const char*>(data), static_cast<qsizetype>(size));
    for (const lumora::FtpEntry& entry : lumora::ParseFtpListing(listing).entries) {
        if (entry.name.isEmpty() || entry.name.contains(u'\n') || entry.name.size() > listing.size() ||
            entry.length.value_or(0) < 0)
            std::abort();
    }
    return 0;
}
