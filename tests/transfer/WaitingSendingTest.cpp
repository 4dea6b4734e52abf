#include "transfer/waiting/WaitingSending.h"

#include "order/OrderJournal.h"
#include "session/lab/Deployment.h"
#include "support/FtpFrmRig.h"

#include <QCoreApplication>
#include <QEvent>

#include <gtest/gtest.h>

namespace lumora {
namespace {

// A start page at which nobody is, and two orders that wait.
class AKioskLeftAlone : public ::testing::Test, protected FtpFrmLine {
protected:
    AKioskLeftAlone() {
        rig.state.Waiting = deployment.Waiting = true;
        deployment.profile = rig.state.profile;
        for (const QString& folder : {first.name(), second.name()}) {
            const OrderFolder order(rig.folder().folder() / folder);
            rig.makeFolder(order.path());
            rig.PageRig::write(order.filePath(rig.first()), "print");
            OrderState state;
            state.phase = OrderState::Phase::Sending;
            state.number = folder.last(3);
            state.kind = OrderKind::Print;
            EXPECT_TRUE(WriteOrderState(rig.machine.files, order, state));
        }
        rig.chain.show(PageId::hatchala);
        wait(std::chrono::minutes(1));
    }

    OrderState stateOf(const OrderFolder& order) const { return take(ReadOrderState(rig.machine.files, order)); }
    void wait(std::chrono::milliseconds time) { rig.machine.clock.ran += time; }
    // The number of the order that the next second begins, whose sending comes to its end; empty where none begins.
    QString send() {
        waiting.Timer_Tick();
        auto* page = static_cast<FtpFrm*>(waiting.page());
        if (!page)
            return {};
        page->Form_Activate();
        const QString number = page->controls().Label46.text.last(3);
        for (int tick = 0; tick < 15; ++tick)
            page->Timer1_Tick();
        waiting.Timer_Tick();
        return number;
    }
    // The numbers of all that are sent now.
    QString sendAll() {
        QString numbers;
        for (QString number = send(); !number.isEmpty(); number = send())
            numbers += number;
        return numbers;
    }
    qsizetype reports() const { return lab.urls.filter(u"padd.asp?"_s).size(); }

    const OrderFolder first{rig.folder()};
    const OrderFolder second{rig.folder().folder() / u"2026_11_21_KUP_1234^106"};
    Deployment deployment;
    WaitingSending waiting{rig.state, rig.machine.platform, rig.chain, deployment};
};

TEST_F(AKioskLeftAlone, SendsWhatWaitsOldestFirstAndReportsEachOnce) {
    lab.deadConnects = FakeLab::always;
    EXPECT_EQ(sendAll(), u"105106") << "then both pause";
    const OrderState failed = stateOf(first);
    EXPECT_TRUE(failed.tries == 1 && !failed.why.english.isEmpty() && failed.why.english != failed.why.hebrew);
    lab.deadConnects = 0;
    wait(std::chrono::minutes(2));
    EXPECT_EQ(sendAll(), u"105106");
    wait(std::chrono::hours(2));
    EXPECT_EQ(sendAll(), QString());
    EXPECT_EQ(reports(), 2);
    EXPECT_EQ(rig.state.waitingOrders, 0);
    EXPECT_TRUE(rig.machine.dialogs.messages.isEmpty() && rig.machine.dialogs.questions.isEmpty());
}

TEST_F(AKioskLeftAlone, StopsForWhoeverComesAndGoesOnWhenTheyHaveGone) {
    const auto happens = [](QEvent::Type type) {
        return [type] {
            QObject window;
            QEvent event(type);
            QCoreApplication::sendEvent(&window, &event);
        };
    };
    const std::function<void()> comings[] = {happens(QEvent::MouseButtonPress), happens(QEvent::TouchBegin),
                                             happens(QEvent::KeyPress), [&] { rig.chain.show(PageId::MoogMeret); }};
    for (const auto& comes : comings) {
        lab.onPut = [&](const QString&) { comes(); };
        const int before = lab.aborts;
        EXPECT_EQ(send(), u"105");
        EXPECT_GT(lab.aborts, before);
        EXPECT_EQ(sendAll(), QString()) << "somebody is there";
        rig.chain.unload(PageId::MoogMeret);
        wait(WaitingSending::aloneAfter);
    }
    lab.onPut = {};
    EXPECT_EQ(stateOf(first).tries, 0) << "a sending that was stopped is no try";
    EXPECT_EQ(send(), u"105");
    EXPECT_EQ(reports(), 1);
}

TEST_F(AKioskLeftAlone, LeavesASendingPageThatHasNothingMoreToDo) {
    lab.deadConnects = FakeLab::always;
    rig.send();
    const QString advice = rig.page().controls().Label4Do.text;
    EXPECT_TRUE(advice.contains(u"אין צורך להמתין") && advice.contains(rig.state.profile.LabPhone));
    wait(WaitingSending::leftAfter - std::chrono::seconds(1));
    waiting.Timer_Tick();
    EXPECT_EQ(rig.chain.front()->id(), PageId::FtpFrm);
    wait(std::chrono::seconds(1));
    waiting.Timer_Tick();
    EXPECT_EQ(rig.chain.front()->id(), PageId::hatchala);
}

} // namespace
} // namespace lumora
