#pragma once

#include "common/HostFile.h"
#include "platform/files/HostPath.h"

namespace lumora {

// The runs of the program over one data folder. Each marks itself there for as long as its object lives, so that a page
// on which two runs would get in one another's way can ask. The mark is a shared lock on a hidden file: it goes with
// the process, however that ends.
class Instances {
public:
    explicit Instances(const HostPath& dataFolder);

    // True while another run is marked. False, too, where the folder takes no mark: nothing is known then.
    bool another() const;

private:
    Descriptor m_file;
};

} // namespace lumora
