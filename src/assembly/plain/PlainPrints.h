#pragma once

#include "assembly/MemoryShare.h"
#include "assembly/WorkAhead.h"
#include "common/PaperSize.h"
#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "order/BasketLine.h"
#include "order/KeptPictures.h"

#include <QByteArray>
#include <QSet>
#include <QStringList>

#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace lumora {

struct SessionState;

// The prints of a plain order, scaled on other threads ahead of the step that packs them; with deep compression the
// file itself, which as built in nobody looks into. The sheet comes before the prints and shows the same pictures, so
// that the decode that gives a small picture gives the print too, which is kept until its step as far as there is room.
// That work takes a source path and gives bytes; it shares no state with the page.
class PlainPrints {
public:
    using Waiting = std::function<void()>;

    // items as List1 holds them; notMade: indices of the lines that get no print.
    PlainPrints(const SessionState& state, const Files& files, const QStringList& items, const QSet<int>& notMade);
    ~PlainPrints();

    // The pictures of the sheet's first cells, one a line; each call gives the next one.
    void beginSheet(int cells);
    Result<Bitmap> nextSmall(const Waiting& whileWaiting);

    // Goes over to the prints, whose sheet is drawn or not needed.
    void beginPrints();
    // The print of a line; to be called in the order of the lines, for each that has a usable name and is not among
    // notMade.
    Result<QByteArray> print(int line, const Waiting& whileWaiting);

private:
    struct Made {
        std::optional<Result<QByteArray>> print;
        Result<Bitmap> small;
    };
    using MakingSmall = WorkAhead<Made>;
    using Making = WorkAhead<Result<QByteArray>>;

    std::function<Made()> scalingBoth(int line);
    std::function<Result<QByteArray>()> scaling(int line);
    std::function<Result<QByteArray>()> copying(int line) const;

    const Files& m_files;
    const KeptPictures m_kept;
    const std::optional<PaperSize> m_paper;
    const bool m_deep;
    const bool m_careful;
    std::vector<BasketLine> m_lines;
    std::vector<char> m_wanted;                             // per line: a print is made of it
    std::vector<std::optional<Result<QByteArray>>> m_ready; // per line: made for the sheet
    qsizetype m_readyBytes = 0;
    int m_nextSmall = 0;
    std::vector<int> m_left; // the lines whose prints are made behind the sheet
    MemoryShare m_memory;
    std::unique_ptr<MakingSmall> m_making; // declared last, since their threads read the memory above
    std::unique_ptr<Making> m_makingLeft;
};

} // namespace lumora
