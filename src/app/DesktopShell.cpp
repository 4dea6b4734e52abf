#include "app/DesktopShell.h"

#include "platform/files/Drives.h"

#include <QClipboard>
#include <QDesktopServices>
#include <QGuiApplication>
#include <QUrl>

namespace lumora {

void DesktopShell::openWebPage(const QString& url) {
    if (!mayOpen || mayOpen())
        QDesktopServices::openUrl(QUrl(url, QUrl::TolerantMode));
}

void DesktopShell::openFolder(const DrivePath& folder) {
    if (const auto host = m_drives.toHost(folder); host && (!mayOpen || mayOpen()))
        QDesktopServices::openUrl(QUrl::fromLocalFile(toText(*host)));
}

void DesktopShell::copyToClipboard(const QString& text) {
    QGuiApplication::clipboard()->setText(text);
}

void DesktopShell::clearClipboard() {
    QClipboard* clipboard = QGuiApplication::clipboard();
    clipboard->clear();
    if (clipboard->supportsSelection())
        clipboard->clear(QClipboard::Selection);
}

} // namespace lumora
