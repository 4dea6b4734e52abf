#include "kiosk/IdleEnd.h"

#include "common/KioskRules.h"
#include "support/PageRig.h"

#include <QCoreApplication>

namespace lumora {
namespace {

using namespace std::chrono_literals;
using Phase = IdleWatch::Phase;
using enum IdleWatch::Silence;

TEST(IdleWatch, AsksBehindASilenceAndEndsWithTheCount) {
    const struct {
        const char* what;
        std::vector<std::pair<std::chrono::seconds, IdleWatch::Silence>> looks; // how long behind the one before
        Phase ends;
    } cases[] = {
        {"the time is not over", {{89s, IsAsked}}, Phase::Alive},
        {"the count is not over", {{90s, IsAsked}, {19s, IsAsked}}, Phase::Asking},
        {"a machine that was held still asks", {{9999s, IsAsked}}, Phase::Asking},
        {"nothing would be lost", {{90s, IsEnough}}, Phase::Over},
        {"the silence runs from the end of a sending", {{9999s, MayNotEnd}, {89s, IsAsked}}, Phase::Alive},
        {"a sending begins while it asks", {{90s, IsAsked}, {20s, MayNotEnd}}, Phase::Alive},
    };
    for (const auto& c : cases) {
        FixedClock clock;
        IdleWatch watch(clock, 90s);
        for (const auto& [later, silence] : c.looks) {
            clock.ran += later;
            watch.look(silence);
        }
        EXPECT_EQ(watch.phase(), c.ends) << c.what;
    }
}

TEST(IdleWatch, TakesAPressForASignAndNotAPageThatChangesBelowThePointer) {
    EXPECT_TRUE(IdleWatch::isSignOfLife(QEvent::TouchBegin) && IdleWatch::isSignOfLife(QEvent::KeyPress));
    EXPECT_FALSE(IdleWatch::isSignOfLife(QEvent::Enter) || IdleWatch::isSignOfLife(QEvent::Show));
}

class WorkingPage : public Page {
public:
    using Page::Page;
    bool isWorking() const override { return works; }
    bool isAtRest() const override { return rests; }
    inline static bool works, rests;
};

class WaitingDialogs : public RecordedDialogs {
public:
    bool isWaiting() const override { return waits; }
    void closeAll() override { waits = false; }
    bool waits = false;
};

struct NobodyIsThere : ::testing::Test, PageRig {
    NobodyIsThere() {
        WorkingPage::works = WorkingPage::rests = false;
        for (const PageId id : {PageId::kyoskNew, PageId::tFrmNew}) {
            chain.registerPage(id, [id] { return std::make_unique<WorkingPage>(id); });
            chain.show(id);
        }
    }
    void wait(std::chrono::seconds time) {
        machine.clock.ran += time;
        idle.Timer_Tick();
        QCoreApplication::processEvents();
    }

    WaitingDialogs dialogs;
    Platform platform = machine.with(dialogs);
    IdleEnd idle{{true, 90, {}, 30, 365, {}}, platform, chain};
};

TEST_F(NobodyIsThere, ButAnOrderThatIsPreparedOrSentIsNeverCut) {
    WorkingPage::works = true; // also below the page in front
    wait(9999s);
    EXPECT_FALSE(idle.asks());
    dialogs.waits = true;
    wait(90s);
    EXPECT_TRUE(idle.asks()) << "a page that waits for an answer does not work";
    wait(20s);
    EXPECT_FALSE(dialogs.waits || chain.hasEnded()) << "and goes on with a no";
}

TEST_F(NobodyIsThere, AndAPageOnWhichNothingIsLeftToDoGoesWithoutAQuestion) {
    registerBare({PageId::hatchala});
    WorkingPage::rests = true;
    wait(90s);
    EXPECT_FALSE(idle.asks());
    EXPECT_EQ(chain.front()->id(), PageId::hatchala);
}

} // namespace
} // namespace lumora
