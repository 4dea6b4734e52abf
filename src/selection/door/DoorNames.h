#pragma once

#include <QString>
#include <QStringList>

#include <functional>

namespace lumora {

// The name of each picture of a folder behind the door, in the order of names: its own with the ending .jpg. The lab
// prints under these names, so that each is in the code page and there once, whatever the case of its letters: a .jpg
// file keeps its name, and another one that would have it gets "a (2).jpg". Accents outside the code page are dropped,
// and so is what no server takes in a name; of a name with nothing left "picture 1" is made.
QStringList doorNames(const QStringList& names);

// The first of these names for a file of this name that is not taken.
QString freeDoorName(const QString& name, const std::function<bool(const QString&)>& isTaken);

} // namespace lumora
