#include "station/KeptLog.h"

#include "platform/files/UserFolders.h"

#include <QDateTime>

#include <sys/stat.h>
#include <unistd.h>

#include <cstdio>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 mostBytes = 5'000'000;

// systemd names the stream that it keeps by device and inode (systemd.exec, JOURNAL_STREAM): a redirected standard
// error is another one.
bool isStandardErrorKept() {
    struct stat facts {};
    if (::fstat(STDERR_FILENO, &facts) != 0)
        return false;
    const QByteArray own = QByteArray::number(quint64(facts.st_dev)) + ':' + QByteArray::number(quint64(facts.st_ino));
    return qgetenv("JOURNAL_STREAM") == own;
}

} // namespace

HostPath KeptLog::usualPath() {
    return userFolder("XDG_STATE_HOME", ".local/state") / "lumora" / "lumora.log";
}

KeptLog::KeptLog(const HostPath& path)
    : m_file(path, mostBytes)
    , m_standardError(isStandardErrorKept()) {
    begin();
}

KeptLog::~KeptLog() {
    end();
}

void KeptLog::write(const QString& line) {
    QString whole = line;
    whole.replace(u'\n', u' ').replace(u'\r', u' ');
    if (m_standardError) {
        std::fprintf(stderr, "lumora: %s\n", qPrintable(whole));
        return;
    }
    const QString time = QDateTime::currentDateTime().toString(u"yyyy-MM-dd HH:mm:ss.zzz"_s);
    const Result<void> written = m_file.append((time + u' ' + whole + u'\n').toUtf8());
    if (!written && !m_failed)
        std::fprintf(stderr, "lumora: the log can't be kept: %s\n", qPrintable(written.failure().message));
    m_failed = !written;
}

} // namespace lumora
