#pragma once

#include "platform/Machine.h"

#include <functional>

namespace lumora {

class Drives;

// The desktop's own browser, file manager and clipboard.
class DesktopShell : public Shell {
public:
    explicit DesktopShell(const Drives& drives)
        : m_drives(drives) {}

    // Where it says no, neither pages nor folders open.
    std::function<bool()> mayOpen;

    void openWebPage(const QString& url) override;
    void openFolder(const DrivePath& folder) override;
    void copyToClipboard(const QString& text) override;
    void clearClipboard() override;

private:
    const Drives& m_drives;
};

} // namespace lumora
