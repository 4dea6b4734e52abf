#include "editing/render/ChannelMinimums.h"

#include "common/FixedText.h"
#include "common/ListOutput.h"
#include "platform/files/Files.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The channels in the order of the file.
template <typename Minimums>
auto channels(Minimums& minimums) {
    return std::array{std::pair{u'G', &minimums.A_G_MIN}, std::pair{u'B', &minimums.A_B_MIN},
                      std::pair{u'R', &minimums.A_R_MIN}};
}

QString keyOf(char16_t channel, std::size_t index) {
    return u"TKN.A_%1_MIN(%2)"_s.arg(QChar(channel)).arg(index + 1);
}

} // namespace

Result<void> ChannelMinimums::readFrom(const Files& files, const DrivePath& path) {
    if (!files.fileExists(path))
        return {};
    const Result<QByteArray> bytes = files.read(path);
    if (!bytes)
        return bytes.failure();
    for (const ListOutputEntry& entry : ReadListOutput(*bytes)) {
        for (const auto& [channel, values] : channels(*this)) {
            for (std::size_t i = 0; i < values->size(); ++i) {
                if (entry.key == keyOf(channel, i))
                    (*values)[i] = static_cast<float>(Val(entry.value));
            }
        }
    }
    return {};
}

Result<void> ChannelMinimums::writeTo(const Files& files, const DrivePath& path) const {
    ListOutput out;
    out.pair(u"00"_s, u"00"_s);
    for (const auto& [channel, values] : channels(*this)) {
        for (std::size_t i = 0; i < values->size(); ++i)
            out.text(keyOf(channel, i)).single((*values)[i]).endLine();
    }
    return files.writeWhole(path, out.bytes());
}

} // namespace lumora
