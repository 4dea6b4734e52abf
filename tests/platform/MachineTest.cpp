#include "platform/QtEventPump.h"
#include "platform/files/StatVolume.h"

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QTemporaryDir>
#include <QTimer>

#include <gtest/gtest.h>

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
    while (depth == 0 && waiting.elapsed() < 5000)
        pump.pump();
    EXPECT_EQ(depth, 1);
    EXPECT_FALSE(pump.pumping());
}

TEST(StatVolume, GivesAStableNumberAlsoBeforeTheFolderIsMade) {
    QTemporaryDir folder;
    const Drives drives(toHostPath(folder.path()) / "not" / "yet", u'C', {});
    const StatVolume volume(drives);
    const auto before = volume.serial(u"C:\\"_s);
    ASSERT_TRUE(before) << before.failure().message.toStdString();
    std::filesystem::create_directories(drives.dataFolder());
    EXPECT_EQ(*volume.serial(u"C:\\"_s), *before);
    EXPECT_NE(*before, 0);
    EXPECT_FALSE(volume.serial(u"Q:\\"_s));
}

TEST(StatVolume, TakesTheSerialThatAMediumWasFormattedWith) {
    EXPECT_EQ(serialOfUuid(u"1234-ABCD"_s), 0x1234ABCD);
    EXPECT_EQ(serialOfUuid(u"F000-0001"_s), static_cast<std::int32_t>(0xF0000001U));
    EXPECT_NE(serialOfUuid(u"0a1b2c3d-0000-4000-8000-000000000001"_s),
              serialOfUuid(u"0a1b2c3d-0000-4000-8000-000000000002"_s));
}

} // namespace
} // namespace lumora
