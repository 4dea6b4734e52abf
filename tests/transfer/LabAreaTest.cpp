#include "order/OrderJournal.h"
#include "support/FtpFrmRig.h"

#include <gtest/gtest.h>

namespace lumora {

namespace {

// The sending page with its lab's own area, brought to a phase.
struct Area : FtpFrmLine {
    FtpFrm& page() { return rig.page(); }

    void counts() { rig.start(); }
    void sends() { rig.send(); }
    void hasNoServer() { rig.state.profile.FtpPassword.clear(), counts(); }
    void hasNoOrder() { rig.state.transfer.OrderFolder = u"***"_path, counts(); }
    void waitsWithAPart() {
        rig.takeUpAgain({FtpFrmRig::log(), FtpFrmRig::first()});
        rig.start().Command23_Click();
    }
    void leavesRemains() {
        lab.putFaults = {{FtpFrmRig::first(), FakeLab::always, 60}};
        lab.refusesDelete = true;
        sends();
        lab.putFaults.clear();
    }
    void hasANameTwice() { rig.takeUpAgain(QStringList(2, FtpFrmRig::first())), sends(); }
    void isStopped() {
        lab.onPut = [&](const QString&) { page().Command15_Click(); };
        sends();
        lab.onPut = {};
    }
    void meetsAnotherOrder() {
        rig.state.Careful = true;
        remote()[u"stranger.jpp"_s] = "x";
        sends();
    }
    void meetsAStranger() { remote()[u"stranger.jpp"_s] = "x", sends(); }
};

using Press = void (FtpFrm::*)();
constexpr Press listing[] = {&FtpFrm::Command13_Click, &FtpFrm::Command1_Click, &FtpFrm::Command2_Click,
                             &FtpFrm::Command4_Click};

} // namespace

// What each of the four buttons makes of each phase in which a sending can rest: the phase after it, how many files
// List3 holds then, the puts and the boxes.
TEST(LabArea, TheFourListButtonsAreSafeInEachPhase) {
    using enum SendingPhase;
    struct After {
        SendingPhase phase;
        int list3;
        int puts;
        int boxes;
    };
    constexpr After told{NoServer, 0, 0, 2};
    constexpr After still{NoOrder, 0, 0, 0};
    constexpr After there{AllThere, 5, 0, 0};
    constexpr After lists{Countdown, 5, 0, 0};
    constexpr After part{Countdown, 3, 0, 0};
    constexpr After sent{Success, 5, 0, 0};
    const struct {
        const char* what;
        void (Area::*arrange)();
        SendingPhase phase;
        std::array<After, 4> after;
    } rows[] = {
        {"no server", &Area::hasNoServer, NoServer, {{told, told, told, told}}},
        {"no order", &Area::hasNoOrder, NoOrder, {{still, still, {NoOrder, 0, 0, 1}, {NoOrder, 0, 0, 1}}}},
        {"the count runs", &Area::counts, Countdown, {{lists, lists, {Countdown, 5, 0, 1}, {Success, 5, 5, 0}}}},
        {"a part waits", &Area::waitsWithAPart, Waiting, {{lists, part, {Success, 3, 3, 0}, {Success, 3, 3, 0}}}},
        {"remains were left", &Area::leavesRemains, NotAll, {{lists, lists, {NotAll, 1, 0, 1}, {Success, 1, 1, 0}}}},
        {"a name comes twice", &Area::hasANameTwice, Unclear, {{lists, part, {NotAll, 3, 0, 0}, {Unclear, 0, 0, 1}}}},
        {"stopped", &Area::isStopped, Stopped, {{lists, lists, {Stopped, 5, 0, 1}, {Success, 5, 5, 0}}}},
        {"another order", &Area::meetsAnotherOrder, CallLab, {{lists, lists, {CallLab, 5, 0, 1}, {CallLab, 5, 0, 0}}}},
        {"a stranger", &Area::meetsAStranger, AllThere, {{{AllThere, 5, 0, 1}, {AllThere, 5, 0, 1}, there, there}}},
        {"sent", &Area::sends, Success, {{{Success, 5, 0, 1}, {Success, 5, 0, 1}, sent, sent}}},
    };
    for (const auto& row : rows) {
        for (std::size_t at = 0; at < row.after.size(); ++at) {
            SCOPED_TRACE(std::string(row.what) + ", button " + std::to_string(at));
            Area area;
            (area.*row.arrange)();
            FtpFrm& page = area.page();
            EXPECT_EQ(page.phase(), row.phase);
            const auto puts = area.lab.puts.size();
            const auto boxes = area.rig.test.dialogs.messages.size();
            const QStringList broken = page.lists().List4Broken.items();
            (page.*listing[at])();
            const After& after = row.after[at];
            EXPECT_EQ(page.phase(), after.phase);
            EXPECT_EQ(page.lists().List3.count(), after.list3);
            EXPECT_EQ(area.lab.puts.size() - puts, after.puts);
            EXPECT_EQ(area.rig.test.dialogs.messages.size() - boxes, after.boxes);
            EXPECT_EQ(page.counting(), after.phase == Countdown);
            if (after.phase == Countdown) {
                EXPECT_EQ(page.lists().List3.items(), page.lists().List4Makor.items());
                EXPECT_TRUE(page.lists().List3.items().last().endsWith(FtpFrmRig::proof()));
                for (const QString& path : broken)
                    EXPECT_TRUE(page.lists().List4Broken.contains(path));
            }
            const SendingButtons ways = page.look().buttons;
            EXPECT_TRUE(ways.testFlag(SendingButton::NewOrder) || ways.testFlag(SendingButton::SendNow));
            const FtpFrmControls& shown = page.controls();
            EXPECT_FALSE(shown.Command17.enabled || shown.Command19.enabled || shown.Command25.enabled);
            EXPECT_TRUE(shown.Label4Rezef.visible);
        }
    }
}

TEST(LabArea, NothingStartsBeforeTheOrderIsListedOrDuringASending) {
    for (const SendingPhase phase :
         {SendingPhase::Preparing, SendingPhase::Sending, SendingPhase::Checking, SendingPhase::Reporting}) {
        SCOPED_TRACE(static_cast<int>(phase));
        Area area;
        bool pressed = false;
        area.rig.test.pump.onPump = [&] {
            auto* page = static_cast<FtpFrm*>(area.rig.chain.find(PageId::FtpFrm));
            if (pressed || !page || page->phase() != phase)
                return;
            pressed = true;
            EXPECT_FALSE(page->controls().Image5.visible && page->controls().Image5.enabled);
            for (const Press press : listing)
                (page->*press)();
            for (const Press press :
                 {&FtpFrm::Command12_Click, &FtpFrm::Command10_Click, &FtpFrm::Image5_Click, &FtpFrm::Command19_Click,
                  &FtpFrm::Command23_Click, &FtpFrm::cmdInternetOpen_Click, &FtpFrm::cmdClosehOpen_Click,
                  &FtpFrm::Command7_Click})
                (page->*press)();
            const FtpFrmControls& shown = page->controls();
            EXPECT_FALSE(shown.chkPassive.enabled || shown.optBin.enabled || shown.optAscii.enabled);
            page->chkPassive_Click(false);
            page->optAscii_Click();
            EXPECT_TRUE(shown.chkPassive.checked && shown.optBin.checked);
            if (phase != SendingPhase::Preparing)
                page->Command28_Click();
        };
        area.rig.send();
        EXPECT_TRUE(pressed);
        EXPECT_EQ(area.lab.puts, FtpFrmRig::names());
        EXPECT_EQ(area.page().phase(), SendingPhase::Success);
        EXPECT_TRUE(area.rig.test.dialogs.messages.isEmpty());
    }
}

TEST(LabArea, AConnectionByHandHoldsTheCountAndEndsBeforeASending) {
    Area area;
    OrderJournal order(area.rig.test.files, OrderFolder(FtpFrmRig::folder()));
    ASSERT_TRUE(order.reportBegun());
    const auto inHand = [&] { return take(ReadOrderState(area.rig.test.files, order.folder())).filesInHand.size(); };
    FtpFrm& page = area.rig.start();
    page.Command3_Click();
    EXPECT_EQ(area.rig.test.dialogs.messages.last(), u"Not in session"_s);
    page.cmdInternetOpen_Click();
    EXPECT_EQ(page.phase(), SendingPhase::Waiting);
    EXPECT_FALSE(page.counting());
    page.File1_Click(page.lists().File1.find(FtpFrmRig::first()));
    area.lab.onPut = [&](const QString&) {
        page.Image5_Click(); // the connection is in use
        page.cmdClosehOpen_Click();
        page.Command4Dooach_Click();
        EXPECT_EQ(page.phase(), SendingPhase::Waiting);
        EXPECT_EQ(inHand(), 1);
    };
    page.Command3_Click();
    EXPECT_TRUE(area.lab.urls.isEmpty() && page.mayReportAgain());
    EXPECT_EQ(inHand(), 0);
    area.lab.onPut = {};
    page.List2_Click(page.lists().List2.find(FtpFrmRig::first()));
    area.rig.write(FtpFrmRig::first(), "lost");
    page.Command5_Click();
    EXPECT_GT(area.rig.localFiles().at(FtpFrmRig::first()).size(), 100);
    page.Command6_Click();
    EXPECT_FALSE(area.lab.folders[QString()].contains(FtpFrmRig::first()));
    area.lab.puts.clear();
    page.Image5_Click();
    EXPECT_EQ(page.phase(), SendingPhase::Success);
    EXPECT_EQ(area.lab.puts, FtpFrmRig::names());
    EXPECT_EQ(area.remote().size(), FtpFrmRig::names().size()) << "in the order's folder, not where the hand left it";
}

} // namespace lumora
