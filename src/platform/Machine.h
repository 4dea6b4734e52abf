#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"

#include <QByteArray>
#include <QDateTime>
#include <QString>

#include <chrono>
#include <cstdint>
#include <functional>

// Small interfaces of the machine that pages use.
namespace lumora {

class Clock {
public:
    virtual ~Clock() = default;
    virtual QDateTime now() const = 0;
    // Since an unknown moment. It only runs forward, whatever now() is set to, and stands while the machine sleeps.
    virtual std::chrono::milliseconds running() const = 0;
};

// Long loops call pump(): it handles pending events and paints the page, so a click or a timer may run inside.
class EventPump {
public:
    virtual ~EventPump() = default;
    virtual void pump() = 0;
    // True while a pump runs, that is, while a handler further out has not returned.
    virtual bool pumping() const = 0;
};

class Shell {
public:
    virtual ~Shell() = default;
    // notOpened is called, perhaps later, where no browser or file manager shows it.
    using NotOpened = std::function<void()>;
    virtual void openWebPage(const QString& url, NotOpened notOpened) = 0;
    virtual void openFolder(const DrivePath& folder, NotOpened notOpened) = 0;
    virtual void copyToClipboard(const QString& text) = 0;
    // Also what was marked and never copied.
    virtual void clearClipboard() = 0;
};

class Printer {
public:
    virtual ~Printer() = default;
    // Hands the pages to a print queue of the machine. Returns at once; done is called later, and tells whether the
    // queue has taken them.
    using Done = std::function<void(const Result<void>&)>;
    virtual void print(const QString& queue, const QByteArray& pdf, Done done) = 0;
};

class Volume {
public:
    virtual ~Volume() = default;
    // A stable signed 32-bit number of the file system on which a drive's root folder lies.
    virtual Result<std::int32_t> serial(const DrivePath& driveRoot) const = 0;
};

} // namespace lumora
