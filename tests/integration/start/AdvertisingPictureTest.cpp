#include "platform/PocoInternet.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/hatchala.h"
#include "support/LabServers.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

TEST(AdvertisingPictureTest, ComesFromTheLabsWebServerWhereItsFolderIsThere) {
    LabServers lab;
    ASSERT_TRUE(lab.running()) << lab.failure().toStdString();
    PocoInternet internet;
    TestPlatform machine{internet};
    SessionState state;
    Deployment deployment;
    deployment.profile.SiteUrl = lab.site() + u'/';
    PageChain chain{machine.pump};
    hatchala page(state, machine.platform, chain, deployment);
    page.load();

    page.Timer1.start();
    page.Timer1_Tick();
    EXPECT_TRUE(page.Picture4.isEmpty()) << "nothing but an installation makes the folder";
    EXPECT_FALSE(page.Timer1.running());
    page.Timer2_Tick();
    EXPECT_FALSE(page.Timer2.running());

    std::filesystem::create_directories(machine.drives.dataFolder() / "lumora" / "zmany");
    page.Timer1_Tick();
    EXPECT_EQ(page.Picture4, state.profile.AdFile1);
    EXPECT_TRUE(page.Timer2.running());
    EXPECT_EQ(machine.files.read(state.profile.AdFile1)->left(2), QByteArray("\xFF\xD8"));
    EXPECT_EQ(lab.requests(1).value(0), QByteArray("GET //ad01.jpg HTTP/1.1"));
}

} // namespace
} // namespace lumora
