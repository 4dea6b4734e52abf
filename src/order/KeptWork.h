#pragma once

#include "common/Result.h"
#include "order/OrderFolder.h"

#include <QStringList>

namespace lumora {

class Files;
struct SessionState;

// The scratch files that an edited order is made from, kept in a hidden folder of the order: corrected copies and
// thumbnails. The clean-up before another order empties the scratch folders.
class KeptWork {
public:
    KeptWork(const SessionState& state, const Files& files, OrderFolder folder);

    // The corrected copies that the lines of the basket name.
    Result<void> keepCorrected(const QStringList& lines) const;
    Result<void> keepThumbnail(const DrivePath& thumbnail) const;
    // The scratch folders hold what is kept, and nothing of another order.
    void bringBack() const;

private:
    Result<void> keep(const DrivePath& file) const;

    const SessionState& m_state;
    const Files& m_files;
    const OrderFolder m_folder;
};

} // namespace lumora
