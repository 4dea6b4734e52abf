#include "platform/QueuePrinter.h"

#include "common/Warning.h"

#include <QProcess>
#include <QTimer>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int lastWait = 2000; // milliseconds, at the end of the program

Result<void> queueOutcome(QProcess& child, bool endedByUs) {
    if (endedByUs)
        return Failure{Failure::Kind::TimedOut, u"%1 gave no answer"_s.arg(child.program())};
    if (child.error() == QProcess::FailedToStart)
        return Failure{Failure::Kind::NoProgram,
                       u"%1 can't be started: %2"_s.arg(child.program(), child.errorString())};
    if (child.exitStatus() == QProcess::NormalExit && child.exitCode() == 0)
        return {};
    const QString words = QString::fromLocal8Bit(child.readAllStandardError()).simplified();
    return Failure{Failure::Kind::Refused, words.isEmpty() ? u"%1 has failed"_s.arg(child.program()) : words.left(300)};
}

} // namespace

QueuePrinter::QueuePrinter(QString program, std::chrono::milliseconds limit)
    : m_program(std::move(program))
    , m_limit(limit) {}

QueuePrinter::~QueuePrinter() {
    for (QProcess* child : findChildren<QProcess*>()) {
        child->disconnect(this);
        if (child->waitForFinished(lastWait))
            continue;
        writeWarning(u"%1 has not ended, and a slip is lost"_s.arg(child->program()));
        child->kill();
        child->waitForFinished(lastWait);
    }
}

Result<QStringList> QueuePrinter::queues(std::chrono::milliseconds limit) {
    QProcess child;
    child.start(u"lpstat"_s, {u"-e"_s});
    const bool ended = child.waitForFinished(static_cast<int>(limit.count()));
    const Result<void> outcome = queueOutcome(child, !ended && child.error() == QProcess::Timedout);
    if (!outcome)
        return outcome.failure();
    return QString::fromLocal8Bit(child.readAllStandardOutput()).split(u'\n', Qt::SkipEmptyParts);
}

void QueuePrinter::print(const QString& queue, const QByteArray& pdf, Done done) {
    auto* child = new QProcess(this);
    auto* limit = new QTimer(child);
    limit->setSingleShot(true);
    const auto end = [child, limit, done = std::move(done)] {
        const Result<void> outcome = queueOutcome(*child, !limit->isActive());
        limit->stop();
        child->deleteLater();
        done(outcome);
    };
    connect(child, &QProcess::finished, this, end);
    connect(child, &QProcess::errorOccurred, this, [end](QProcess::ProcessError error) {
        if (error == QProcess::FailedToStart)
            end();
    });
    connect(limit, &QTimer::timeout, child, &QProcess::kill);
    limit->start(m_limit);
    child->setStandardOutputFile(QProcess::nullDevice());
    child->start(m_program, {u"-d"_s, queue, u"-"_s});
    child->write(pdf);
    child->closeWriteChannel();
}

} // namespace lumora
