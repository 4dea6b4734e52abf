#pragma once

#include "platform/files/HostPath.h"

#include <QDate>

#include <atomic>

namespace lumora {

// What a medium holds.
struct CardSummary {
    bool readable = false;
    int pictures = 0;
    bool more = false; // the count was broken off: the medium holds more than that
    QDate newest;      // day of the newest picture
    HostPath
        newestFolder; // the folder to open: the newest of a camera (DCIM/NNNXXXXX), else that of the newest picture
    HostPath newestPicture; // in it
};

// Follows no links, leaves out what is hidden, and ends early after many files, many levels, or when stop is set.
// Pictures count by their names (isPictureFile, with everyFormat) and by the time of their files.
CardSummary summaryOfCard(const HostPath& root, const std::atomic_bool& stop, bool everyFormat = false);

} // namespace lumora
