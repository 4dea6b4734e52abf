#include "platform/Instances.h"

#include <gtest/gtest.h>

#include <QTemporaryDir>

#include <optional>
#include <tuple>

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
}

TEST(InstancesTest, ARunThatWantsItsFolderAloneGetsItOrIsRefused) {
    using Lock = Instances::Lock;
    for (const auto& [first, second, refused] : {std::tuple{Lock::Exclusive, Lock::Exclusive, true},
                                                 {Lock::Exclusive, Lock::Shared, true},
                                                 {Lock::Shared, Lock::Exclusive, true},
                                                 {Lock::Shared, Lock::Shared, false}}) {
        const QTemporaryDir folder;
        const QTemporaryDir elsewhere;
        std::optional<Instances> one(std::in_place, folder.path().toStdString(), first);
        EXPECT_FALSE(one->refused() || one->fault());
        EXPECT_EQ(Instances(folder.path().toStdString(), second).refused(), refused);
        EXPECT_FALSE(Instances(elsewhere.path().toStdString(), second).refused()) << "another data folder";
        one.reset();
        EXPECT_FALSE(Instances(folder.path().toStdString(), second).refused()) << "the first has ended";
    }
    const Instances none("/proc/no such folder", Lock::Exclusive);
    EXPECT_FALSE(none.refused() || none.another());
    EXPECT_TRUE(none.fault()->message.contains(QStringLiteral("No such file")));
}

} // namespace lumora
