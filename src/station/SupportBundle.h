#pragma once

#include "common/Result.h"
#include "platform/files/HostPath.h"
#include "session/lab/LabFile.h"

#include <QByteArray>

namespace lumora {

// What a lab sends to whoever helps it: one ZIP file with versions.txt, lab.txt, orders.txt and the log. Nothing in it
// names a customer, and no password is in it.
class SupportBundle {
public:
    // labFile: empty where there is none.
    SupportBundle(HostPath labFile, HostPath dataFolder, HostPath log);

    // Replaces no file that is there.
    Result<void> write(const HostPath& target) const;

    // The values that the lab's file gives, a key a line. Passwords and the staff's code are "(set)" or "(empty)"; a
    // line with an unknown key is left out, since it may hold one.
    static QByteArray labText(const QByteArray& labFile);

private:
    QByteArray versions() const;
    QByteArray lab() const;
    // A line an order: name, phase, files, bytes.
    QByteArray orders() const;

    HostPath m_labFile;
    HostPath m_dataFolder;
    HostPath m_log;
};

} // namespace lumora
