#pragma once

#include "common/HostFile.h"
#include "platform/files/HostPath.h"

#include <functional>
#include <memory>

class QSocketNotifier;

namespace lumora {

// A second start of the program asks the run that has the data folder to come to the front. The call goes through a
// local socket that is named after the folder's device and inode and leaves no file on the disk.
class ForwardCalls {
public:
    // The event loop delivers calls for as long as the object lives.
    ForwardCalls(const HostPath& dataFolder, std::function<void()> called);
    ~ForwardCalls();

private:
    Descriptor m_socket;
    std::unique_ptr<QSocketNotifier> m_notifier;
};

// True if a run of this data folder accepts such calls and has been called.
bool CallForward(const HostPath& dataFolder);

} // namespace lumora
