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

void DesktopShell::openFolder(const DrivePath& folder) {
    if (const auto host = m_drives.toHost(folder))
        QDesktopServices::openUrl(QUrl::fromLocalFile(toText(*host)));
}

void DesktopShell::copyToClipboard(const QString& text) {
    QGuiApplication::clipboard()->setText(text);
}

} // namespace lumora
