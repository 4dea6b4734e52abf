#include "platform/media/SystemMedia.h"

#include "platform/media/MediaFolders.h"
#include "platform/media/UdisksMedia.h"

namespace lumora {

FirstPresent::FirstPresent(std::unique_ptr<RemovableMedia> first, std::unique_ptr<RemovableMedia> second)
    : m_first(first.release())
    , m_second(second.release()) {
    m_first->setParent(this);
    m_second->setParent(this);
    connect(m_first, &RemovableMedia::found, this, &RemovableMedia::found);
    connect(m_second, &RemovableMedia::found, this, &RemovableMedia::found);
    connect(m_second, &RemovableMedia::absent, this, &RemovableMedia::absent);
    connect(
        m_first, &RemovableMedia::absent, this, [this] { m_second->begin(); }, Qt::SingleShotConnection);
}

void FirstPresent::begin() {
    m_first->begin();
}

std::unique_ptr<RemovableMedia> systemMedia() {
    return std::make_unique<FirstPresent>(std::make_unique<UdisksMedia>(), std::make_unique<MediaFolders>());
}

} // namespace lumora
