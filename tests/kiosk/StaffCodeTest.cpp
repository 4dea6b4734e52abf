#include "kiosk/StaffCode.h"

#include "session/lab/LabFile.h"
#include "support/PageRig.h"

namespace lumora {
namespace {

using namespace std::chrono_literals;
using Answer = StaffCode::Answer;

struct TheStaffsDoor : ::testing::Test, PageRig {
    TheStaffsDoor() { state.kiosk.code = StaffCodeLine(u"2468"_s, "0123456789abcdef", 10000); }
    StaffCode restarted() const { return {state, machine.files, machine.clock}; }
};

// The vector of RFC 7914, section 11, less its last 32 bytes.
TEST(StaffCodeLine, IsThePublishedFunction) {
    EXPECT_EQ(StaffCodeLine(u"passwd"_s, "salt", 1),
              u"1:73616c74:55ac046e56e3089fec1691c22544b605f94185216dde0465e68b9d57c20dacbc");
}

TEST(StaffCodeLine, IsTakenByTheLabsFileAndNeverTheSameTwice) {
    const QString line = NewStaffCodeLine(u"2468"_s);
    EXPECT_NE(line, NewStaffCodeLine(u"2468"_s));
    EXPECT_TRUE(ParseLabFile("[Kiosk]\nCode = " + line.toLatin1(), u"lab.ini"_s).errors.isEmpty());
    EXPECT_TRUE(IsStaffCode(u"0123"_s) && !IsStaffCode(u"123"_s) && !IsStaffCode(u"12a4"_s));
}

TEST_F(TheStaffsDoor, CostsAMinuteForEachWrongCodeFromTheFifthOn) {
    StaffCode code = restarted();
    for (int wrong = 1; wrong <= 5; ++wrong)
        EXPECT_EQ(code.give(u"1111"_s), Answer::Wrong);
    EXPECT_EQ(code.secondsToWait(), 60);
    EXPECT_EQ(code.give(u"2468"_s), Answer::TooSoon);
    machine.clock.ran += 60s;
    EXPECT_EQ(code.give(u"2468 "_s), Answer::Wrong);
    machine.clock.ran += 59s;
    EXPECT_EQ(code.give(u"2468"_s), Answer::TooSoon);

    StaffCode again = restarted();
    EXPECT_EQ(again.give(u"2468"_s), Answer::TooSoon) << "pulling the plug saves nothing";
    machine.clock.ran += 60s;
    EXPECT_EQ(again.give(u"2468"_s), Answer::Right);
    EXPECT_EQ(restarted().give(u"1111"_s), Answer::Wrong) << "the next one begins anew";
    EXPECT_EQ(restarted().secondsToWait(), 0);
    write(u"C:\\vedron\\kiosk.txt"_path, "no number");
    EXPECT_EQ(restarted().secondsToWait(), 60) << "what can't be understood lets nobody try faster";
}

} // namespace
} // namespace lumora
