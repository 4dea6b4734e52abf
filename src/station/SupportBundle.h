#pragma once

#include "common/Result.h"
#include "platform/files/HostPath.h"
#include "session/lab/LabFile.h"

#include <QByteArray>

namespace lumora {

// What a lab sends to whoever helps it: one ZIP file with versions.txt, lab.txt, orders.txt and the log, which is
// journal.txt where systemd keeps it. Nothing in it names a customer, and no password is in it.
class SupportBundle {
public:
    // labFile: empty where there is none.
    SupportBundle(HostPath labFile, HostPath dataFolder, HostPath log);

    enum class Log { Held, Missing };
    // Replaces no file that is there. Tells whether a log is in it: a journal is read only for a user who may.
    Result<Log> write(const HostPath& target) const;

    // The values that the lab's file gives, a key a line. Passwords and the staff's code are "(set)" or "(empty)", and
    // so is a user in an address; a line with an unknown key is left out, since it may hold one.
    static QByteArray labText(const QByteArray& labFile);
    // What journalctl has written, by its line, without what may name a customer.
    static QByteArray journalText(const QByteArray& lines);

private:
    QByteArray versions() const;
    QByteArray lab() const;
    static QByteArray journal(); // of the kiosk's service; empty where there is none
    // A line an order: name, phase, files, bytes.
    QByteArray orders() const;

    HostPath m_labFile;
    HostPath m_dataFolder;
    HostPath m_log;
};

} // namespace lumora
