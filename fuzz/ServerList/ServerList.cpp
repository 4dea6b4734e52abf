#include "transfer/http/ServerList.h"
#include "common/AnsiCodePage.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>

using namespace Qt::StringLiterals;

// The list that a web server gives of an order's folder. Whatever it says, what is missing is part of the order, and no
// entry takes more than one file off it.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    using namespace lumora;
    const QString folder = u"2026_11_21_KUP_1234^105"_s;
    const QStringList files = {u"C:\\o\\2026_11_21_KUP_1234^105.txt"_s, u"C:\\o\\!105.jpg"_s,
                               u"C:\\o\\021015GNB0000_03AABB.jpp"_s, u"C:\\o\\1.jpp"_s};
    const QByteArray bytes(reinterpret_cast<const char*>(data), static_cast<qsizetype>(size));
    const ServerAnswer answer = ReadServerAnswer(AnsiCodePage::decode(bytes), folder);
    const QStringList missing = MarkHossarim(files, answer.entries, folder);
    bool holds = missing.size() + answer.entries.size() >= files.size();
    for (const QString& file : missing)
        holds = holds && files.contains(file);
    for (const QString& entry : answer.entries)
        holds = holds && !entry.trimmed().isEmpty() && !entry.contains(u"~~"_s);
    if (answer.verdict == ServerVerdict::Listed)
        holds = holds && answer.namesFolder && answer.entries.size() >= 2;
    if (!holds)
        std::abort();
    return 0;
}
