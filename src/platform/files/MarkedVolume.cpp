#include "platform/files/MarkedVolume.h"

#include "common/HostFile.h"
#include "common/ListOutput.h"

#include <QRandomGenerator>

#include <optional>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 largestMarkFile = 1 << 16; // bytes

struct FolderMark {
    std::uint32_t number = 0;
    QStringList cards;
};

std::optional<FolderMark> readMark(const HostPath& file) {
    const Result<QByteArray> bytes = readWholeFile(file, toText(file), largestMarkFile);
    if (!bytes)
        return std::nullopt;
    FolderMark mark;
    bool numberTold = false;
    for (const auto& [key, value] : ReadListOutput(*bytes)) {
        if (key == u"Mark")
            mark.number = value.toUInt(&numberTold);
        else if (key == u"Card")
            mark.cards += value;
    }
    return numberTold ? std::optional(mark) : std::nullopt;
}

Result<void> keepMark(const HostPath& file, const FolderMark& mark) {
    ListOutput output;
    output.text(u"Mark"_s).number(mark.number).endLine();
    for (const QString& card : mark.cards)
        output.pair(u"Card"_s, card);
    return writeWholeFile(file, output.bytes());
}

} // namespace

Result<std::int32_t> MarkedVolume::serial(const DrivePath& driveRoot) const {
    Result<std::int32_t> plain = m_volume.serial(driveRoot);
    if (!plain)
        return plain;
    std::optional<FolderMark> mark = readMark(m_file);
    // Without a network card one machine can't be told from another.
    const bool ours = mark && (m_cards.isEmpty() || mark->cards == m_cards);
    if (!ours) {
        mark = FolderMark{QRandomGenerator::system()->generate(), m_cards};
        if (const Result<void> kept = keepMark(m_file, *mark); !kept) {
            if (!std::exchange(m_told, true))
                m_notKept(kept.failure());
            return plain;
        }
    }
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(*plain) ^ mark->number);
}

} // namespace lumora
