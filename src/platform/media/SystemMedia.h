#pragma once

#include "platform/media/RemovableMedia.h"

#include <memory>

namespace lumora {

// The first of two sources that this machine has: when the first turns out to be absent, also later on, the second
// begins.
class FirstPresent : public RemovableMedia {
    Q_OBJECT
public:
    FirstPresent(std::unique_ptr<RemovableMedia> first, std::unique_ptr<RemovableMedia> second);

    void begin() override;

private:
    RemovableMedia* m_first;
    RemovableMedia* m_second;
};

// udisks2 where it answers, else the folders of media.
std::unique_ptr<RemovableMedia> systemMedia();

} // namespace lumora
