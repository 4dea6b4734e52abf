#pragma once

#include "platform/Machine.h"

#include <QObject>

namespace lumora {

// Hands papers to the print queues of the system by its program lp, which is a child of its own: nothing waits for it,
// and it is ended where it does not come to an end by itself.
class QueuePrinter : public QObject, public Printer {
    Q_OBJECT
public:
    explicit QueuePrinter(QString program = QStringLiteral("lp"),
                          std::chrono::milliseconds limit = std::chrono::seconds(20));
    // Without a word to those that wait for an answer.
    ~QueuePrinter() override;

    // The queues that the system knows, by its program lpstat; waits for it.
    static Result<QStringList> queues(std::chrono::milliseconds limit = std::chrono::seconds(20));

    void print(const QString& queue, const QByteArray& pdf, Done done) override;

private:
    const QString m_program;
    const std::chrono::milliseconds m_limit;
};

} // namespace lumora
