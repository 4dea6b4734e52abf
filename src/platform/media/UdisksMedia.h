#pragma once

#include "common/Warning.h"
#include "platform/media/RemovableMedia.h"

#include <QDBusConnection>
#include <QDBusObjectPath>
#include <QMap>
#include <QVariantMap>

#include <functional>

namespace lumora {

// Finds media by the service udisks2 and has it mount those that nobody has mounted, for reading only.
class UdisksMedia : public RemovableMedia {
    Q_OBJECT
public:
    using Interfaces = QMap<QString, QVariantMap>; // the properties of each interface of an object
    using Warn = std::function<void(const QString& text)>;

    // address: of the bus; empty for that of the system.
    explicit UdisksMedia(QString address = {}, Warn warn = writeWarning);
    ~UdisksMedia() override;

    void begin() override;

private Q_SLOTS:
    void objectAdded(const QDBusObjectPath& object, const lumora::UdisksMedia::Interfaces& interfaces);
    void objectRemoved(const QDBusObjectPath& object, const QStringList& interfaces);
    void propertiesChanged(const QString& interface, const QVariantMap& changed, const QStringList& invalidated,
                           const QDBusMessage& message);
    void ownerChanged(const QString& service, const QString& before, const QString& now);

private:
    void look();
    bool isCustomers(const QString& block) const;
    void mount(const QString& block);
    QVariant property(const QString& object, const char* interface, const char* name) const;

    QString m_address;
    Warn m_warn;
    QString m_connectionName;
    QDBusConnection m_bus;
    QMap<QString, Interfaces> m_objects;
    QStringList m_asked; // blocks that were mounted or asked to be: once each while they are in
    bool m_begun = false;
};

} // namespace lumora
