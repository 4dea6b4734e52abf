#include "selection/OrderSpace.h"

#include "common/PaperSize.h"
#include "order/BasketLine.h"
#include "order/KeptPictures.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

namespace {

constexpr qint64 megabyte = 1000 * 1000;
constexpr qint64 passing = 200 * megabyte; // sheet, log and scratch pictures of an order
constexpr double dotsInCentimetre = 300 / 2.54;
constexpr double bytesOfDot = 0.6; // of a JPEG of much detail at the print's quality

qint64 printOn(const PaperSize& paper) {
    return static_cast<qint64>(paper.shortSide * dotsInCentimetre * paper.longSide * dotsInCentimetre * bytesOfDot);
}

} // namespace

qint64 OrderSpace::neededFor(const QStringList& lines, const SessionState& state, const Files& files) {
    const KeptPictures kept(files, state.keptFolder);
    const LineForm form = lineFormOf(state.Optint);
    qint64 needed = passing;
    for (const QString& text : lines) {
        const BasketLine line = BasketLine::split(text, form);
        const Result<qint64> picture = files.size(kept.fileOf(line.path));
        const std::optional<PaperSize> paper = PaperSize::ofDigits(line.code.mid(PrintCode::copiesWidth, 4));
        needed += std::max(picture ? *picture : 0, printOn(paper.value_or(PaperSize{30, 45})));
    }
    return needed;
}

std::optional<QString> OrderSpace::lacking(const QStringList& lines, const SessionState& state, const Files& files) {
    const Result<qint64> free = files.freeBytes(state.DiskRoot);
    return free ? words(state, neededFor(lines, state, files), *free) : std::nullopt;
}

std::optional<QString> OrderSpace::words(const SessionState& state, qint64 needed, qint64 free) {
    if (free >= needed)
        return std::nullopt;
    return state
        .wording(u"אין די מקום במכשיר להזמנה זו: דרושים כ-%1 מגה-בייט ופנויים %2.\nהבחירה שלכם נשמרת כאן. "
                 u"נא לקרוא לצוות החנות, או לבחור פחות תמונות.",
                 u"There is not enough room on this machine for the order: it needs about %1 MB, and %2 MB are "
                 u"free.\nWhat you chose stays here. Please call the staff, or choose fewer pictures.")
        .arg((needed + megabyte - 1) / megabyte)
        .arg(free / megabyte);
}

} // namespace lumora
