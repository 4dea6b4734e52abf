#pragma once

#include "common/DrivePath.h"
#include "editing/render/PrintResolution.h"

#include <QHash>
#include <QStringList>

#include <optional>

namespace lumora {

class Basket;
class Files;
struct SessionState;

// The resolution at which the pictures of an order print. An album has none, since its pages are laid out by hand, and
// neither has a paper without a size.
class OrderResolution {
public:
    OrderResolution(const SessionState& state, const Files& files)
        : m_state(state)
        , m_files(files) {}

    // The paper of the order's prints; none where there is no resolution.
    std::optional<PaperSize> paper() const;
    PaperFit fit() const;

    // Reads the header of the file, which may be another one under the same path than before.
    void look(const QString& path);
    // Of the file as it was looked at last.
    std::optional<PictureSize> sizeOf(const QString& path);
    // Of a picture that was looked at and can be read. record: its edit record, empty in a plain order.
    std::optional<PrintResolution> of(const QString& path, const QString& record) const;
    std::optional<PrintResolution> of(PictureSize picture, const QString& record) const;

    // The paths of the basket that print coarse, in its order. Looks at what was not looked at before.
    QStringList coarse(const Basket& basket);

private:
    const SessionState& m_state;
    const Files& m_files;
    QHash<QString, std::optional<PictureSize>> m_sizes; // by path; no value for what can't be read
};

} // namespace lumora
