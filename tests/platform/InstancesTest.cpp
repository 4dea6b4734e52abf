#include "platform/Instances.h"

#include <gtest/gtest.h>

#include <QTemporaryDir>

#include <optional>

namespace lumora {

TEST(InstancesTest, RunsOverOneFolderKnowOfEachOtherAsLongAsBothAreThere) {
    const QTemporaryDir folder;
    const QTemporaryDir elsewhere;
    const Instances first(folder.path().toStdString());
    const Instances stranger(elsewhere.path().toStdString());
    EXPECT_FALSE(first.another());
    std::optional<Instances> second(std::in_place, folder.path().toStdString());
    EXPECT_TRUE(first.another());
    EXPECT_TRUE(second->another());
    EXPECT_FALSE(stranger.another());
    second.reset();
    EXPECT_FALSE(first.another());
    EXPECT_FALSE(Instances("/proc/no such folder").another());
}

} // namespace lumora
