#include "platform/media/CardSummary.h"
#include "platform/media/Cards.h"
#include "platform/media/MediaFolders.h"
#include "platform/media/SystemMedia.h"
#include "platform/media/UdisksMedia.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusMetaType>
#include <QDBusVirtualObject>
#include <QDateTime>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>

#include <gtest/gtest.h>

#include <chrono>
#include <fstream>
#include <semaphore>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;

QString told(const std::vector<Medium>& media) {
    QStringList texts;
    for (const Medium& medium : media)
        texts += u"%1 %2 %3"_s.arg(static_cast<int>(medium.kind)).arg(medium.label, toText(medium.folder));
    return texts.join(u", "_s);
}

// Answers for udisks2 on a bus of its own: what is in, and what a mounting does.
class DiskService : public QDBusVirtualObject {
public:
    using Objects = QMap<QDBusObjectPath, UdisksMedia::Interfaces>;

    DiskService() {
        m_daemon.start(u"dbus-daemon"_s, {u"--session"_s, u"--nofork"_s, u"--nopidfile"_s, u"--print-address=1"_s,
                                          u"--address=unix:dir="_s + m_folder.path()});
        EXPECT_TRUE(m_daemon.waitForStarted() && m_daemon.waitForReadyRead()) << "needs the package dbus-daemon";
        address = QString::fromUtf8(m_daemon.readAllStandardOutput().trimmed());
    }
    ~DiskService() override {
        leave();
        m_daemon.kill();
        m_daemon.waitForFinished();
    }
    void enter() {
        QDBusConnection bus = connection();
        EXPECT_TRUE(bus.registerVirtualObject(root, this, QDBusConnection::SubPath) &&
                    bus.registerService(u"org.freedesktop.UDisks2"_s));
    }
    static void leave() { QDBusConnection::disconnectFromBus(u"disks"_s); }

    // A drive of these properties and its one block, which has a file system where points are given.
    void put(const QString& name, const QVariantMap& drive, const QString& label,
             std::optional<QList<QByteArray>> points) {
        const QDBusObjectPath drivePath(root + u"/drives/"_s + name);
        const QDBusObjectPath block(root + u"/block_devices/"_s + name);
        const QVariantMap facts{{u"Drive"_s, QVariant::fromValue(drivePath)}, {u"IdLabel"_s, label}};
        objects[drivePath] = {{service + u".Drive"_s, drive}};
        objects[block] = {{service + u".Block"_s, facts}};
        if (points)
            objects[block][fileSystem] = {{u"MountPoints"_s, QVariant::fromValue(*points)}};
        for (const QDBusObjectPath& path : {drivePath, block})
            send(root, u"org.freedesktop.DBus.ObjectManager"_s, u"InterfacesAdded"_s,
                 {QVariant::fromValue(path), QVariant::fromValue(objects[path])});
    }
    void takeOut(const QString& name) {
        const QDBusObjectPath block(root + u"/block_devices/"_s + name);
        const QStringList interfaces = objects.take(block).keys();
        send(root, u"org.freedesktop.DBus.ObjectManager"_s, u"InterfacesRemoved"_s,
             {QVariant::fromValue(block), interfaces});
    }

    QString introspect(const QString&) const override { return {}; }
    bool handleMessage(const QDBusMessage& message, const QDBusConnection& bus) override {
        if (message.member() == u"GetManagedObjects")
            return bus.send(message.createReply(QVariant::fromValue(objects)));
        const QString name = message.path().section(u'/', -1);
        const auto options = qdbus_cast<QVariantMap>(message.arguments().value(0));
        mountings += name + u' ' + options.value(u"options"_s).toString();
        if (name == u"refused")
            return bus.send(message.createErrorReply(u"org.freedesktop.UDisks2.Error.NotAuthorized"_s, u"no right"_s));
        setMounted(name, {"/media/" + name.toUtf8() + '\0'});
        return bus.send(message.createReply(u"/media/"_s + name));
    }
    void setMounted(const QString& name, const QList<QByteArray>& points) {
        const QDBusObjectPath block(root + u"/block_devices/"_s + name);
        objects[block][fileSystem] = {{u"MountPoints"_s, QVariant::fromValue(points)}};
        send(block.path(), u"org.freedesktop.DBus.Properties"_s, u"PropertiesChanged"_s,
             {fileSystem, objects[block][fileSystem], QStringList()});
    }

    QString address;
    Objects objects;
    QStringList mountings;

private:
    QDBusConnection connection() const { return QDBusConnection::connectToBus(address, u"disks"_s); }
    void send(const QString& path, const QString& interface, const QString& name, const QVariantList& arguments) const {
        QDBusMessage signal = QDBusMessage::createSignal(path, interface, name);
        signal.setArguments(arguments);
        connection().send(signal);
    }

    const QString service = u"org.freedesktop.UDisks2"_s;
    const QString fileSystem = service + u".Filesystem"_s;
    const QString root = u"/org/freedesktop/UDisks2"_s;
    QTemporaryDir m_folder;
    QProcess m_daemon;
};

TEST(UdisksMedia, AreTheCustomersAloneAndMountedForReading) {
    DiskService disks;
    QStringList warnings;
    UdisksMedia media(disks.address, [&](const QString& text) { warnings += text; });
    disks.enter();
    const QVariantMap usb{{u"ConnectionBus"_s, u"usb"_s}};
    disks.put(u"card"_s, {{u"Removable"_s, true}, {u"Media"_s, u"flash_sd"_s}}, u"EOS"_s, QList<QByteArray>());
    disks.put(u"stick"_s, usb, u"HOME"_s, QList<QByteArray>{QByteArray("/media/dana/HOME\0", 17)});
    disks.put(u"disk"_s, {{u"Removable"_s, false}, {u"ConnectionBus"_s, QString()}}, {}, QList<QByteArray>());
    disks.put(u"kiosk"_s, usb, {}, QList<QByteArray>{QByteArray("/boot/efi\0", 10)});
    disks.put(u"whole"_s, usb, {}, std::nullopt);
    disks.put(u"refused"_s, usb, {}, QList<QByteArray>());
    QString now = u"nothing"_s;
    bool absent = false;
    QObject::connect(&media, &RemovableMedia::found, &media, [&](const auto& found) { now = told(found); });
    QObject::connect(&media, &RemovableMedia::absent, &media, [&] { absent = true; });
    media.begin();
    EXPECT_TRUE(QTest::qWaitFor(
        [&] { return now == u"1 EOS /media/card, 3 HOME /media/dana/HOME" && !warnings.isEmpty(); }, 20000))
        << qPrintable(now);
    EXPECT_EQ(disks.mountings, QStringList({u"card ro"_s, u"refused ro"_s}));
    EXPECT_EQ(warnings, QStringList(u"/org/freedesktop/UDisks2/block_devices/refused can't be mounted: no right"_s));

    disks.put(u"later"_s, {{u"ConnectionBus"_s, u"sdio"_s}}, u"NIKON"_s, QList<QByteArray>());
    disks.takeOut(u"card"_s);
    EXPECT_TRUE(QTest::qWaitFor([&] { return now == u"1 NIKON /media/later, 3 HOME /media/dana/HOME"; }, 20000))
        << qPrintable(now);
    disks.setMounted(u"stick"_s, {});
    disks.put(u"card"_s, {{u"Removable"_s, true}}, u"OTHER"_s, QList<QByteArray>());
    EXPECT_TRUE(QTest::qWaitFor([&] { return now == u"0 OTHER /media/card, 1 NIKON /media/later"; }, 20000))
        << "put in again: " << qPrintable(now);
    EXPECT_EQ(disks.mountings.join(u' '), u"card ro refused ro later ro card ro") << "the stick is to be taken out";
    EXPECT_FALSE(absent);
    DiskService::leave();
    EXPECT_TRUE(QTest::qWaitFor([&] { return absent; }, 20000)) << "the service has ended";
}

TEST(MediaFolders, StandInWhereNoServiceAnswersAndTellWhatComesAndGoes) {
    const DiskService bus; // without the service
    const QTemporaryDir folder;
    const HostPath root = toHostPath(folder.path());
    fs::create_directories(root / "dana" / "not mounted");
    fs::create_directory_symlink(root / "dana", root / "link.card");
    HostPath mounted;
    const auto isCard = [&](const HostPath& path) { return path.extension() == ".card" || path == mounted; };
    FirstPresent media(std::make_unique<FirstPresent>(std::make_unique<UdisksMedia>(u"unix:path=/nowhere"_s),
                                                      std::make_unique<UdisksMedia>(bus.address)),
                       std::make_unique<MediaFolders>(std::vector{root, root / "absent"}, isCard));
    QStringList now;
    QObject::connect(&media, &RemovableMedia::found, &media,
                     [&](const auto& found) { now += told(found).remove(folder.path()); });
    media.begin();
    EXPECT_TRUE(QTest::qWaitFor([&] { return !now.isEmpty(); }, 20000));
    for (const HostPath& path : {root / "dana" / "a.card", root / "b.card"}) {
        const qsizetype before = now.size();
        fs::create_directory(path);
        EXPECT_TRUE(QTest::qWaitFor([&] { return now.size() > before; }, 20000));
        fs::remove(path);
        EXPECT_TRUE(QTest::qWaitFor([&] { return now.size() > before + 1; }, 20000));
    }
    mounted = root / "dana" / "not mounted";
    EXPECT_TRUE(QTest::qWaitFor([&] { return now.size() > 5; }, 20000)) << "the folder stood there before";
    EXPECT_EQ(now.join(u'|'), u"|0 a.card /dana/a.card||0 b.card /b.card||0 not mounted /dana/not mounted"_s);
    EXPECT_TRUE(MediaFolders::isMountPoint("/proc"));
    EXPECT_FALSE(MediaFolders::isMountPoint(root) || MediaFolders::isMountPoint("/nowhere"));
}

TEST(Cards, WaitForNoServiceThatHangs) {
    struct Hanging : RemovableMedia {
        void begin() override {
            begun->release();
            goesOn->acquire();
        }
        std::shared_ptr<std::binary_semaphore> begun, goesOn;
    };
    const auto begun = std::make_shared<std::binary_semaphore>(0);
    const auto goesOn = std::make_shared<std::binary_semaphore>(0);
    Cards cards([&] {
        auto media = std::make_unique<Hanging>();
        media->begun = begun;
        media->goesOn = goesOn;
        return media;
    });
    {
        const Cards::Watch watch(cards);
        begun->acquire();
    }
    goesOn->release();
}

// The pictures are an hour apart, the first the oldest.
TEST(CardSummary, OpensAtTheNewestFolderOfACamera) {
    const struct {
        QStringList files;
        int pictures;
        QString newest;
    } cases[] = {
        {{u"DCIM/101CANON/IMG_1.JPG"_s, u"DCIM/100CANON/IMG_2.JPG"_s, u"a.jpg"_s}, 3, u"DCIM/101CANON/IMG_1.JPG"_s},
        {{u"dcim/100APPLE/1.jpg"_s, u"dcim/101CANON/1.jpg"_s, u"dcim/102APPLE/1.jpg"_s}, 3, u"dcim/102APPLE/1.jpg"_s},
        {{u"DCIM/105CANON/1.jpg"_s, u"DCIM/100NIKON/1.jpg"_s, u"DCIM/106CANON/no.txt"_s}, 2, u"DCIM/100NIKON/1.jpg"_s},
        {{u"trip/b.jpg"_s, u"trip/a.jpg"_s, u"home/c.jpg"_s, u"trip/d.jpeg"_s}, 3, u"home/c.jpg"_s},
        {{u"DCIM/1.jpg"_s, u"DCIM/Camera/2.Jpg"_s, u".Trash/3.jpg"_s, u"DCIM/._2.jpg"_s}, 2, u"DCIM/Camera/2.Jpg"_s},
        {{u"1/2/3/4/5/6/7/8/a.jpg"_s, u"1/2/3/4/5/6/7/8/9/b.jpg"_s}, 1, u"1/2/3/4/5/6/7/8/a.jpg"_s},
        {{u"notes.txt"_s}, 0, {}},
    };
    const QDateTime day(QDate(2026, 11, 20), QTime(8, 0));
    for (const auto& expected : cases) {
        const QTemporaryDir folder;
        const HostPath root = toHostPath(folder.path());
        qint64 hours = 0;
        for (const QString& file : expected.files) {
            const HostPath path = root / toHostPath(file);
            fs::create_directories(path.parent_path());
            std::ofstream(path) << "x";
            const auto ago = std::chrono::seconds(day.secsTo(QDateTime::currentDateTime()) - 3600 * hours++);
            fs::last_write_time(path, fs::file_time_type::clock::now() - ago);
        }
        fs::create_directory_symlink(root, root / "loop");
        std::atomic_bool stop = false;
        const CardSummary card = summaryOfCard(root, stop);
        const HostPath newest = expected.newest.isEmpty() ? HostPath() : root / toHostPath(expected.newest);
        EXPECT_TRUE(card.readable && !card.more);
        EXPECT_EQ(card.pictures, expected.pictures) << newest;
        EXPECT_EQ(card.newestPicture, newest);
        EXPECT_EQ(card.newestFolder, newest.empty() ? root : newest.parent_path());
        EXPECT_EQ(card.newest, expected.pictures > 0 ? day.date() : QDate()) << newest;
        stop = true;
        EXPECT_TRUE(summaryOfCard(root, stop).more) << "broken off";
        EXPECT_FALSE(summaryOfCard(root / "gone", stop).readable);
    }
}

} // namespace
} // namespace lumora
