#pragma once

#include <QByteArray>
#include <QObject>
#include <QTimer>

namespace lumora {

// Tells the service manager that the program has begun and that its pages are alive (sd_notify(3)), where it was
// started by one; a program that hangs is ended and begun anew then. The program may be a child of the service's first
// process, as below a compositor, so that WATCHDOG_PID is not looked at.
class ServiceNotice : public QObject {
public:
    ServiceNotice();

private:
    void tell(const QByteArray& state) const;

    QByteArray m_socket;
    QTimer m_alive;
};

} // namespace lumora
