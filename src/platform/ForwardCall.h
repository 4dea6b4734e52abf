#pragma once

#include "common/HostFile.h"
#include "platform/files/HostPath.h"

#include <functional>
#include <memory>

class QSocketNotifier;

namespace lumora {

// The call of a second start to the run that has the data folder: come to the front. It goes through a local socket of
// the kernel that is named after the folder's file and leaves nothing on the disk.
class ForwardCalls {
public:
    // Calls come through the event loop for as long as the object lives.
    ForwardCalls(const HostPath& dataFolder, std::function<void()> called);
    ~ForwardCalls();

private:
    Descriptor m_socket;
    std::unique_ptr<QSocketNotifier> m_notifier;
};

// True if a run of this data folder takes such calls and has been called.
bool CallForward(const HostPath& dataFolder);

} // namespace lumora
