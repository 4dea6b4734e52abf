#include "platform/media/UdisksMedia.h"

#include <QDBusArgument>
#include <QDBusMessage>
#include <QDBusMetaType>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

const QString serviceName = u"org.freedesktop.UDisks2"_s;
const QString rootObject = u"/org/freedesktop/UDisks2"_s;
constexpr const char* blockInterface = "org.freedesktop.UDisks2.Block";
constexpr const char* driveInterface = "org.freedesktop.UDisks2.Drive";
constexpr const char* fileSystemInterface = "org.freedesktop.UDisks2.Filesystem";
const QString objectManager = u"org.freedesktop.DBus.ObjectManager"_s;
const QString propertiesInterface = u"org.freedesktop.DBus.Properties"_s;
constexpr int mountLimit = 60 * 1000; // milliseconds; a large card is checked first

using ManagedObjects = QMap<QDBusObjectPath, UdisksMedia::Interfaces>;

// Paths are bytes that end with a zero.
QByteArray withoutZero(QByteArray path) {
    while (path.endsWith('\0'))
        path.chop(1);
    return path;
}

QList<QByteArray> mountPoints(const QVariant& value) {
    auto points = qdbus_cast<QList<QByteArray>>(value);
    std::transform(points.begin(), points.end(), points.begin(), withoutZero);
    return points;
}

bool isOfTheSystem(const QByteArray& mountPoint) {
    return mountPoint == "/" || mountPoint.startsWith("/boot") || mountPoint.startsWith("/efi") ||
           mountPoint.startsWith("/home");
}

Medium::Kind kindOf(const QString& media, const QString& bus) {
    if (media.startsWith(u"flash_sd"))
        return Medium::Kind::SdCard;
    if (media.startsWith(u"flash"))
        return Medium::Kind::Card;
    return media == u"thumb" || bus == u"usb" ? Medium::Kind::Stick
           : bus == u"sdio"                   ? Medium::Kind::SdCard
                                              : Medium::Kind::Other;
}

} // namespace

UdisksMedia::UdisksMedia(QString address, Warn warn)
    : m_address(std::move(address))
    , m_warn(std::move(warn))
    , m_connectionName(u"lumora media %1"_s.arg(reinterpret_cast<quintptr>(this)))
    , m_bus(QString()) {
    // The bus finds the type of a slot by the name that stands in its declaration.
    qRegisterMetaType<Interfaces>("lumora::UdisksMedia::Interfaces");
    qDBusRegisterMetaType<Interfaces>();
    qDBusRegisterMetaType<ManagedObjects>();
    qDBusRegisterMetaType<QList<QByteArray>>();
}

UdisksMedia::~UdisksMedia() {
    QDBusConnection::disconnectFromBus(m_connectionName);
}

void UdisksMedia::begin() {
    m_bus = m_address.isEmpty() ? QDBusConnection::connectToBus(QDBusConnection::SystemBus, m_connectionName)
                                : QDBusConnection::connectToBus(m_address, m_connectionName);
    if (!m_bus.isConnected()) {
        Q_EMIT absent();
        return;
    }
    m_bus.connect(serviceName, rootObject, objectManager, u"InterfacesAdded"_s, this,
                  SLOT(objectAdded(QDBusObjectPath, lumora::UdisksMedia::Interfaces)));
    m_bus.connect(serviceName, rootObject, objectManager, u"InterfacesRemoved"_s, this,
                  SLOT(objectRemoved(QDBusObjectPath, QStringList)));
    m_bus.connect(serviceName, {}, propertiesInterface, u"PropertiesChanged"_s, this,
                  SLOT(propertiesChanged(QString, QVariantMap, QStringList, QDBusMessage)));
    m_bus.connect(u"org.freedesktop.DBus"_s, u"/org/freedesktop/DBus"_s, u"org.freedesktop.DBus"_s,
                  u"NameOwnerChanged"_s, {serviceName}, {}, this, SLOT(ownerChanged(QString, QString, QString)));

    // The call also starts the service where it is installed.
    const QDBusMessage all =
        QDBusMessage::createMethodCall(serviceName, rootObject, objectManager, u"GetManagedObjects"_s);
    auto* answer = new QDBusPendingCallWatcher(m_bus.asyncCall(all), this);
    connect(answer, &QDBusPendingCallWatcher::finished, this, [this, answer] {
        answer->deleteLater();
        const QDBusPendingReply<ManagedObjects> reply = *answer;
        if (reply.isError()) {
            Q_EMIT absent();
            return;
        }
        const ManagedObjects objects = reply.value();
        for (auto at = objects.begin(); at != objects.end(); ++at)
            m_objects[at.key().path()] = at.value();
        m_begun = true;
        look();
    });
}

void UdisksMedia::objectAdded(const QDBusObjectPath& object, const Interfaces& interfaces) {
    m_objects[object.path()].insert(interfaces);
    look();
}

void UdisksMedia::objectRemoved(const QDBusObjectPath& object, const QStringList& interfaces) {
    Interfaces& left = m_objects[object.path()];
    for (const QString& interface : interfaces)
        left.remove(interface);
    if (left.isEmpty())
        m_objects.remove(object.path());
    // A card that comes back into its slot is mounted again.
    if (interfaces.contains(QLatin1StringView(fileSystemInterface)))
        m_asked.removeAll(object.path());
    look();
}

void UdisksMedia::propertiesChanged(const QString& interface, const QVariantMap& changed, const QStringList&,
                                    const QDBusMessage& message) {
    const auto object = m_objects.find(message.path());
    if (object == m_objects.end())
        return;
    (*object)[interface].insert(changed);
    look();
}

void UdisksMedia::ownerChanged(const QString&, const QString&, const QString& now) {
    if (!now.isEmpty() || !m_begun)
        return;
    m_begun = false;
    m_objects.clear();
    Q_EMIT absent();
}

QVariant UdisksMedia::property(const QString& object, const char* interface, const char* name) const {
    return m_objects.value(object).value(QLatin1StringView(interface)).value(QLatin1StringView(name));
}

bool UdisksMedia::isCustomers(const QString& block) const {
    const QString drive = property(block, blockInterface, "Drive").value<QDBusObjectPath>().path();
    const QString bus = property(drive, driveInterface, "ConnectionBus").toString();
    if (!property(drive, driveInterface, "Removable").toBool() && bus != u"usb" && bus != u"sdio")
        return false;
    if (property(block, blockInterface, "HintIgnore").toBool() ||
        property(block, blockInterface, "HintSystem").toBool())
        return false;
    // A kiosk may run from a stick or a card of its own.
    for (auto at = m_objects.begin(); at != m_objects.end(); ++at) {
        const QList<QByteArray> points = mountPoints(property(at.key(), fileSystemInterface, "MountPoints"));
        if (property(at.key(), blockInterface, "Drive").value<QDBusObjectPath>().path() == drive &&
            std::any_of(points.begin(), points.end(), isOfTheSystem))
            return false;
    }
    return true;
}

void UdisksMedia::look() {
    if (!m_begun)
        return;
    std::vector<Medium> media;
    for (auto at = m_objects.begin(); at != m_objects.end(); ++at) {
        const QString& block = at.key();
        if (!at->contains(QLatin1StringView(fileSystemInterface)) || !isCustomers(block))
            continue;
        const QList<QByteArray> points = mountPoints(property(block, fileSystemInterface, "MountPoints"));
        if (points.isEmpty()) {
            mount(block);
            continue;
        }
        // Whoever unmounts it later wants to take it out.
        if (!m_asked.contains(block))
            m_asked += block;
        const QString drive = property(block, blockInterface, "Drive").value<QDBusObjectPath>().path();
        media.push_back({block + u' ' + property(block, blockInterface, "IdUUID").toString(),
                         kindOf(property(drive, driveInterface, "Media").toString(),
                                property(drive, driveInterface, "ConnectionBus").toString()),
                         property(block, blockInterface, "IdLabel").toString(), points.first().toStdString()});
    }
    Q_EMIT found(media);
}

void UdisksMedia::mount(const QString& block) {
    if (m_asked.contains(block))
        return;
    m_asked += block;
    QDBusMessage call =
        QDBusMessage::createMethodCall(serviceName, block, QLatin1StringView(fileSystemInterface), u"Mount"_s);
    // No question of the desktop comes up before the customer.
    call << QVariantMap{{u"options"_s, u"ro"_s}, {u"auth.no_user_interaction"_s, true}};
    auto* answer = new QDBusPendingCallWatcher(m_bus.asyncCall(call, mountLimit), this);
    connect(answer, &QDBusPendingCallWatcher::finished, this, [this, answer, block] {
        answer->deleteLater();
        const QDBusPendingReply<QString> reply = *answer;
        if (reply.isError() && reply.error().name() != u"org.freedesktop.UDisks2.Error.AlreadyMounted")
            m_warn(u"%1 can't be mounted: %2"_s.arg(block, reply.error().message()));
    });
}

} // namespace lumora
