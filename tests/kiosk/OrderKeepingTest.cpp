#include "kiosk/OrderKeeping.h"

#include "order/OrderFolder.h"
#include "order/OrderState.h"
#include "support/PageRig.h"

namespace lumora {
namespace {

using Phase = OrderState::Phase;

struct KeptOrders : ::testing::Test, PageRig {
    KeptOrders() {
        state.Careful = true;
        state.kiosk = {true, 90, {}, 10, 15, {}};
    }
    static OrderState arrived(Phase phase = Phase::Reported, bool proven = true) {
        OrderState order;
        order.phase = phase;
        order.proven = proven;
        return order;
    }
    OrderFolder give(const QString& number, const OrderState& order = arrived()) {
        const OrderFolder folder(u"C:\\2000lumora\\!!000"_path / (u"2026_11_21_KUP_1234^"_s + number));
        makeFolder(folder.path());
        for (const QString& name : {u"!105_1234.jpp"_s, u"1 1015GNB0000_016F6E65.jpp"_s, u"a_jpp_001_001.prk"_s})
            write(folder.filePath(name), "x");
        write(folder.logPath(), "log");
        EXPECT_TRUE(WriteOrderState(machine.files, folder, order));
        return folder;
    }
    void look(const QDate& day) {
        machine.clock.time.setDate(day);
        EXPECT_TRUE(OrderKeeping(state, machine.platform).look());
    }
    // On each day of so many.
    void live(int days) {
        for (; days > 0; --days)
            look(today = today.addDays(1));
    }
    QString filesOf(const OrderFolder& order) const {
        return QString::number(machine.files.names(order.path(), u"*"_s).size());
    }

    QDate today{2026, 11, 21};
};

TEST_F(KeptOrders, LoseTheirPrintsAndThenTheirFolderOnceTheyAreProvenToHaveArrived) {
    OrderState unanswered = arrived(Phase::Arrived);
    unanswered.report = OrderState::Report::Begun; // it is never made again
    const OrderFolder orders[] = {give(u"105"_s), give(u"106"_s, unanswered), give(u"107"_s, arrived(Phase::Arrived)),
                                  give(u"108"_s, arrived(Phase::Reported, false)),
                                  give(u"109"_s, arrived(Phase::Sending))};
    look(today);
    for (const auto& [days, left] :
         {std::pair(9, u"4 4 4 4 4"_s), {1, u"2 2 4 4 4"_s}, {4, u"2 2 4 4 4"_s}, {1, u"0 0 4 4 4"_s}}) {
        live(days);
        QStringList each;
        for (const OrderFolder& order : orders)
            each += filesOf(order);
        EXPECT_EQ(each.join(u' '), left);
    }
}

TEST_F(KeptOrders, AreNotAgedByAClockThatIsSetWrong) {
    const QDate day = today;
    const std::pair<const char*, std::function<void()>> cases[] = {
        {"2099 for some days",
         [&] {
             for (int i = 0; i < 13; ++i)
                 look(QDate(2099, 1, 1).addDays(i));
         }},
        {"1970 at each start, and then the day",
         [&] {
             for (int i = 0; i < 12; ++i) {
                 look(QDate(1970, 1, 1));
                 look(day);
             }
         }},
        {"what was counted is damaged",
         [&] {
             write(u"C:\\vedron\\keeping.txt"_path, "\"Lived\",900\r\n\"2026_11_21_KUP_1234^105\",-70000\r\n");
             live(9);
         }},
    };
    for (const auto& [what, happens] : cases) {
        today = day;
        std::filesystem::remove_all(host(u"C:\\vedron"_s));
        const OrderFolder order = give(u"105"_s);
        look(day);
        happens();
        EXPECT_EQ(filesOf(order), u"4") << what;
    }
}

} // namespace
} // namespace lumora
