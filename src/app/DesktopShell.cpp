#include "app/DesktopShell.h"

#include "platform/files/Drives.h"

#include <QClipboard>
#include <QDeadlineTimer>
#include <QDesktopServices>
#include <QGuiApplication>
#include <QStandardPaths>
#include <QUrl>

#include <chrono>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr std::chrono::seconds opening{10};

} // namespace

// An opener may be the browser itself, which stays open behind the program's end: its process is left alone.
DesktopShell::~DesktopShell() {
    for (std::unique_ptr<QProcess>& opener : m_openers) {
        opener->disconnect();
        if (opener->state() != QProcess::NotRunning)
            static_cast<void>(opener.release());
    }
}

void DesktopShell::openWebPage(const QString& url, NotOpened notOpened) {
    open(QUrl(url, QUrl::TolerantMode), notOpened);
}

void DesktopShell::openFolder(const DrivePath& folder, NotOpened notOpened) {
    if (const auto host = m_drives.toHost(folder))
        open(QUrl::fromLocalFile(toText(*host)), notOpened);
    else
        notOpened();
}

// Qt starts the desktop's opener and does not hear how it ends, which tells that no program was found.
void DesktopShell::open(const QUrl& url, const NotOpened& notOpened) {
    if (mayOpen && !mayOpen())
        return notOpened();
    std::erase_if(m_openers, [](const auto& opener) { return opener->state() == QProcess::NotRunning; });
    const QString program = m_opener ? QString() : QStandardPaths::findExecutable(u"xdg-open"_s);
    if (program.isEmpty() || !url.isValid()) {
        if (!url.isValid() || !(m_opener ? m_opener(url) : QDesktopServices::openUrl(url)))
            notOpened();
        return;
    }
    const auto& opener = m_openers.emplace_back(std::make_unique<QProcess>());
    opener->setStandardInputFile(QProcess::nullDevice());
    opener->setStandardOutputFile(QProcess::nullDevice());
    opener->setProcessChannelMode(QProcess::ForwardedErrorChannel);
    // What ends later was open.
    QObject::connect(opener.get(), &QProcess::finished,
                     [notOpened, soon = QDeadlineTimer(opening)](int code, QProcess::ExitStatus) {
                         if (code != 0 && !soon.hasExpired())
                             notOpened();
                     });
    QObject::connect(opener.get(), &QProcess::errorOccurred, [notOpened](QProcess::ProcessError error) {
        if (error == QProcess::FailedToStart)
            notOpened();
    });
    opener->start(program, {url.toString(QUrl::FullyEncoded)});
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
