#pragma once

#include "assembly/MemoryShare.h"
#include "assembly/WorkAhead.h"
#include "common/HostFile.h"
#include "common/Result.h"
#include "editing/render/PicturePlacement.h"
#include "order/BasketLine.h"

#include <QByteArray>
#include <QSet>
#include <QStringList>

#include <memory>
#include <optional>
#include <vector>

namespace lumora {

class Files;
struct SessionState;

// What the renderer makes of one line of an edited order.
struct EditedPrintResult {
    Result<QByteArray> jpeg;
    // printPreview() of the JPEG.
    Bitmap preview = {};
    // With a tone: the whole picture in grey, of which the print was made. It becomes bw.bmp when its step commits it;
    // no print is made from that file, so that no picture is ever printed from another one's copy.
    std::unique_ptr<NewContent> toneCopy = {};
};

// What page and sheet show of a print, 300 pixels wide: of the JPEG file, as the lab will see it. Null for a file that
// can't be read.
Bitmap printPreview(const QByteArray& jpeg);

// The prints of an edited order, rendered ahead of the steps that pack them, one for each line with a usable name whose
// print is not there, as many at once as memory allows. Only values go into that work. A line that is marked "RED" is
// rendered from the corrected copy, and a missing copy is a failure, since the customer did not see the uncorrected
// picture.
class EditedPrints {
public:
    // items as List1 holds them; there: indices of those that have a print. Without a paper every print is a failure.
    EditedPrints(const SessionState& state, const Files& files, const QStringList& items, const QSet<int>& there,
                 std::optional<PaperSize> paper);

    // The next print in the order of the list; calls whileWaiting again and again until it is there.
    template <class Waiting>
    EditedPrintResult next(Waiting whileWaiting) {
        return m_ahead->take(whileWaiting);
    }

private:
    using Ahead = WorkAhead<EditedPrintResult>;

    Ahead::Work rendering(const BasketLine& item);

    const SessionState& m_state;
    const Files& m_files;
    const std::optional<PaperSize> m_paper;
    std::vector<BasketLine> m_items;
    MemoryShare m_memory;
    std::unique_ptr<Ahead> m_ahead; // declared last, since its function and its threads read the members above
};

} // namespace lumora
