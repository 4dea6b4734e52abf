#include "common/HostFile.h"
#include "platform/ForwardCall.h"
#include "platform/Instances.h"
#include "platform/NetworkCards.h"
#include "platform/QtEventPump.h"
#include "platform/files/MarkedVolume.h"
#include "platform/files/StatVolume.h"
#include "platform/line/LineAbort.h"
#include "support/TestPlatform.h"

#include <Poco/Net/NetException.h>
#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/StreamSocket.h>

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QTemporaryDir>
#include <QTimer>

#include <gtest/gtest.h>

#include <array>
#include <fstream>
#include <optional>
#include <string>
#include <tuple>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(QtEventPump, TellsAHandlerInsideThatAPumpIsUnderWay) {
    QtEventPump pump;
    int depth = 0;
    QTimer::singleShot(0, [&] {
        depth = pump.pumping() ? 1 : -1;
        pump.pump(); // a handler that pumps in its turn comes back
    });
    QElapsedTimer waiting;
    waiting.start();
    while (depth == 0 && waiting.elapsed() < 60'000)
        pump.pump();
    EXPECT_EQ(depth, 1);
    EXPECT_FALSE(pump.pumping());
}

TEST(StatVolume, GivesAStableNumberAlsoBeforeTheFolderIsMade) {
    QTemporaryDir folder;
    const Drives drives(toHostPath(folder.path()) / "not" / "yet", u'C', {});
    const StatVolume volume(drives);
    const auto before = volume.serial(u"C:\\"_path);
    ASSERT_TRUE(before) << before.failure().message.toStdString();
    std::filesystem::create_directories(drives.dataFolder());
    EXPECT_EQ(*volume.serial(u"C:\\"_path), *before);
    EXPECT_NE(*before, 0);
    EXPECT_FALSE(volume.serial(u"Q:\\"_path));
}

TEST(StatVolume, TakesTheSerialThatAMediumWasFormattedWith) {
    EXPECT_EQ(serialOfUuid(u"1234-ABCD"_s), 0x1234ABCD);
    EXPECT_EQ(serialOfUuid(u"F000-0001"_s), static_cast<std::int32_t>(0xF0000001U));
    EXPECT_NE(serialOfUuid(u"0a1b2c3d-0000-4000-8000-000000000001"_s),
              serialOfUuid(u"0a1b2c3d-0000-4000-8000-000000000002"_s));
}

TEST(MarkedVolume, KeepsTheSerialOfAFolderAndChangesItWithTheMachine) {
    const FixedVolume plain;
    const QTemporaryDir folder;
    const HostPath data = toHostPath(folder.path());
    const QStringList here = {u"52:54:00:00:00:01"_s, u"52:54:00:00:00:02"_s};
    const auto serial = [&](const QStringList& cards) {
        return *MarkedVolume(plain, data, cards, {}).serial(u"C:\\"_path);
    };
    const std::int32_t first = serial(here);
    EXPECT_EQ(serial(here), first) << "at the next start";
    EXPECT_EQ(serial({}), first) << "no card can be told";

    // The image on another machine, and then on a third.
    const std::int32_t second = serial({u"52:54:00:00:00:03"_s});
    EXPECT_NE(second, first);
    EXPECT_NE(serial({u"52:54:00:00:00:04"_s}), second);

    // Another folder on the same volume and machine; a mark that is no mark.
    const QTemporaryDir other;
    const MarkedVolume beside(plain, toHostPath(other.path()), here, {});
    const std::int32_t another = *beside.serial(u"C:\\"_path);
    EXPECT_NE(another, first);
    ASSERT_TRUE(writeWholeFile(toHostPath(other.path()) / ".lumora-mark", "\"Mark\",\"x\"\r\n"));
    EXPECT_NE(*beside.serial(u"C:\\"_path), another);

    int told = 0;
    const MarkedVolume unkept(plain, "/proc/none", here, [&](const Failure&) { ++told; });
    for (int time = 0; time < 2; ++time)
        EXPECT_EQ(*unkept.serial(u"C:\\"_path), plain.number) << "a mark that can't be kept";
    EXPECT_EQ(told, 1);
}

TEST(NetworkCards, AreTheBuiltInOnesByTheirAddress) {
    const QTemporaryDir folder;
    const HostPath root = toHostPath(folder.path());
    namespace fs = std::filesystem;
    const auto put = [&](const std::string& name, const std::string& address, const char* bus) {
        fs::create_directories(root / "net" / name);
        std::ofstream(root / "net" / name / "address") << address << '\n';
        if (!bus)
            return;
        fs::create_directories(root / "bus" / bus);
        fs::create_directories(root / "net" / name / "device");
        fs::create_directory_symlink(root / "bus" / bus, root / "net" / name / "device" / "subsystem");
    };
    EXPECT_EQ(NetworkCards(root / "none"), QStringList());
    put("lumoraLo", "00:00:00:00:00:00", nullptr);
    put("lumoraBridge", "52:54:00:00:00:09", nullptr);
    put("lumoraPlug", "52:54:00:00:00:05", "usb");
    EXPECT_EQ(NetworkCards(root / "net"), QStringList(u"52:54:00:00:00:05"_s));
    put("lumoraCard2", "52:54:00:00:00:0B", "pci");
    put("lumoraCard1", "52:54:00:00:00:0a", "virtio");
    put("lumoraNone", "00:00:00:00:00:00", "pci");
    EXPECT_EQ(NetworkCards(root / "net"), QStringList({u"52:54:00:00:00:0a"_s, u"52:54:00:00:00:0b"_s}));
}

TEST(ForwardCalls, ReachTheRunOfTheSameFolderAsLongAsItLives) {
    const QTemporaryDir folder;
    const QTemporaryDir elsewhere;
    int called = 0;
    {
        const ForwardCalls calls(toHostPath(folder.path()), [&] { ++called; });
        EXPECT_FALSE(CallForward(toHostPath(elsewhere.path())));
        EXPECT_TRUE(CallForward(toHostPath(folder.path()) / "."));
        QElapsedTimer waiting;
        waiting.start();
        while (called == 0 && waiting.elapsed() < 60'000)
            QCoreApplication::processEvents();
        EXPECT_EQ(called, 1);
    }
    EXPECT_FALSE(CallForward(toHostPath(folder.path())));
}

TEST(InstancesTest, RunsOverOneFolderKnowOfEachOtherAndOneThatWantsItAloneGetsItOrIsRefused) {
    using Lock = Instances::Lock;
    for (const auto& [first, second, refused] : {std::tuple{Lock::Exclusive, Lock::Exclusive, true},
                                                 {Lock::Exclusive, Lock::Shared, true},
                                                 {Lock::Shared, Lock::Exclusive, true},
                                                 {Lock::Shared, Lock::Shared, false}}) {
        const QTemporaryDir folder;
        const QTemporaryDir elsewhere;
        std::optional<Instances> one(std::in_place, folder.path().toStdString(), first);
        EXPECT_FALSE(one->refused() || one->fault());
        EXPECT_FALSE(one->another());
        {
            const Instances two(folder.path().toStdString(), second);
            EXPECT_EQ(two.refused(), refused);
            EXPECT_EQ(one->another() && two.another(), !refused);
            const Instances stranger(elsewhere.path().toStdString(), second);
            EXPECT_FALSE(stranger.refused() || stranger.another()) << "another data folder";
        }
        EXPECT_FALSE(one->another()) << "the second has ended";
        one.reset();
        EXPECT_FALSE(Instances(folder.path().toStdString(), second).refused()) << "the first has ended";
    }
    const Instances none("/proc/no such folder", Lock::Exclusive);
    EXPECT_FALSE(none.refused() || none.another());
    EXPECT_TRUE(none.fault()->message.contains(u"No such file"_s));
}

// A server that reads the end of the data takes what came for the whole file.
TEST(LineAbort, TheServerSeesAResetAndNoEndOfData) {
    LineAbort line;
    Poco::Net::ServerSocket listening(Poco::Net::SocketAddress("127.0.0.1", 0));
    Poco::Net::StreamSocket client(listening.address());
    Poco::Net::StreamSocket server = listening.acceptConnection();
    server.setReceiveTimeout(Poco::Timespan(30, 0));
    const LineAbort::Watch watch(line, client);
    const std::string part(4000, 'x');
    client.sendBytes(part.data(), static_cast<int>(part.size()));

    line.abort();

    std::array<char, 8192> bytes{};
    EXPECT_THROW(
        {
            while (server.receiveBytes(bytes.data(), int(bytes.size())) > 0) {
            }
        },
        Poco::Net::ConnectionResetException);
    EXPECT_ANY_THROW(client.sendBytes(part.data(), static_cast<int>(part.size())));
}

} // namespace
} // namespace lumora
