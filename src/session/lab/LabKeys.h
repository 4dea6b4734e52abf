#pragma once

#include "session/lab/Deployment.h"

#include <functional>
#include <vector>

namespace lumora {

// One key of the lab's file.
struct LabKey {
    QString section;
    QString name;
    QString allowed; // the values that the key takes, in the words of a message
    // Returns false for a value that is not allowed; the deployment is unchanged then.
    std::function<bool(Deployment&, const QString&)> set;
    bool ofMachine = false; // a path of this machine, which is never written in the lab's code page
};

// All keys, section by section. packaging/lab.ini.example explains each.
const std::vector<LabKey>& labKeys();

} // namespace lumora
