#pragma once

#include "common/Result.h"

#include <QDateTime>
#include <QString>

#include <cstdint>

// The small things that a page needs of the machine it runs on.
namespace lumora {

class Clock {
public:
    virtual ~Clock() = default;
    virtual QDateTime now() const = 0;
};

// Long loops yield here: pending events are handled and the page is painted, so that a click or a timer may run between
// two steps.
class EventPump {
public:
    virtual ~EventPump() = default;
    virtual void pump() = 0;
    // True while a pump is under way, so that a handler further out is still running.
    virtual bool pumping() const = 0;
};

class Shell {
public:
    virtual ~Shell() = default;
    // Results are not examined: a missing browser or file manager passes in silence.
    virtual void openWebPage(const QString& url) = 0;
    virtual void openFolder(const QString& drivePath) = 0;
    virtual void copyToClipboard(const QString& text) = 0;
};

class Volume {
public:
    virtual ~Volume() = default;
    // A stable signed 32-bit number of the file system that a drive root lies on.
    virtual Result<std::int32_t> serial(const QString& driveRoot) const = 0;
};

} // namespace lumora
