#include "app/DesktopShell.h"

#include "platform/files/Drives.h"

#include <QClipboard>
#include <QDesktopServices>
#include <QGuiApplication>
#include <QUrl>

namespace lumora {

void DesktopShell::openWebPage(const QString& url) {
    QDesktopServices::openUrl(QUrl(url, QUrl::TolerantMode));
}

void DesktopShell::openFolder(const QString& drivePath) {
    if (const auto folder = m_drives.toHost(drivePath))
        QDesktopServices::openUrl(QUrl::fromLocalFile(toText(*folder)));
}

void DesktopShell::copyToClipboard(const QString& text) {
    QGuiApplication::clipboard()->setText(text);
}

} // namespace lumora
