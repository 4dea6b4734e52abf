#pragma once

#include "session/lab/Deployment.h"

#include <functional>
#include <vector>

namespace lumora {

// One key of the lab's file.
struct LabKey {
    QString section;
    QString name;
    QString allowed; // the values that the key takes, as a message says it
    // False for a value that is not allowed; the deployment stays as it was then.
    std::function<bool(Deployment&, const QString&)> set;
};

// All keys, section by section. packaging/lab.ini.example explains each.
const std::vector<LabKey>& labKeys();

} // namespace lumora
