#pragma once

#include "platform/Machine.h"

#include <QProcess>

#include <functional>
#include <memory>
#include <utility>
#include <vector>

class QUrl;

namespace lumora {

class Drives;

// The desktop's own browser, file manager and clipboard.
class DesktopShell : public Shell {
public:
    // What opens in the desktop's place; false where nothing does.
    using Opener = std::function<bool(const QUrl&)>;
    explicit DesktopShell(const Drives& drives, Opener opener = {})
        : m_drives(drives)
        , m_opener(std::move(opener)) {}
    ~DesktopShell() override;

    // Where it says no, neither pages nor folders open.
    std::function<bool()> mayOpen;

    void openWebPage(const QString& url, NotOpened notOpened) override;
    void openFolder(const DrivePath& folder, NotOpened notOpened) override;
    void copyToClipboard(const QString& text) override;
    void clearClipboard() override;

private:
    void open(const QUrl& url, const NotOpened& notOpened);

    const Drives& m_drives;
    Opener m_opener;
    std::vector<std::unique_ptr<QProcess>> m_openers; // one that has ended goes with the next opening
};

} // namespace lumora
