#pragma once

#include "platform/Machine.h"
#include "platform/files/HostPath.h"

#include <QStringList>

#include <functional>
#include <utility>

namespace lumora {

// The serial of a volume mixed with a random mark of the data folder, so that two data folders on one volume, and two
// machines with one image, make different folders on the lab's server. The hidden file .lumora-mark keeps the mark
// together with the hardware addresses of this machine's network cards. If the addresses differ, a new mark is made,
// since an image copies the file but not the cards. If the mark can't be kept, the serial is that of the volume.
class MarkedVolume : public Volume {
public:
    // notKept: hears once why the mark could not be kept.
    using NotKept = std::function<void(const Failure& why)>;
    MarkedVolume(const Volume& volume, HostPath dataFolder, QStringList networkCards, NotKept notKept)
        : m_volume(volume)
        , m_file(std::move(dataFolder) / ".lumora-mark")
        , m_cards(std::move(networkCards))
        , m_notKept(std::move(notKept)) {}

    Result<std::int32_t> serial(const DrivePath& driveRoot) const override;

private:
    const Volume& m_volume;
    HostPath m_file;
    QStringList m_cards;
    NotKept m_notKept;
    mutable bool m_told = false;
};

} // namespace lumora
