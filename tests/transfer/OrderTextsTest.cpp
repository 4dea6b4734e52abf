#include "support/ExampleOrder.h"
#include "transfer/delivery/OrderFacts.h"
#include "transfer/delivery/OrderSummary.h"
#include "transfer/delivery/UploadPace.h"
#include "transfer/delivery/UploadProgress.h"

#include <gtest/gtest.h>

namespace lumora {

using namespace Qt::StringLiterals;

TEST(OrderSummary, ShowsWhoOnlyForANewOrderAndDeliveryOnlyWhenAskedFor) {
    SessionState state = exampleOrder();
    const QDate date(2026, 11, 21);
    EXPECT_EQ(OrderSummaryLines(state, date).join(u'|'),
              u"21/11/2026|Dana Levi|03-1234567|10/15NB מבריק|gift - | סך תמונות 13||||"_s);
    state.transfer.SugMishloah = Sending::Resend;
    state.MishloachHabaita = true;
    const QStringList resend = OrderSummaryLines(state, date);
    EXPECT_FALSE(resend.contains(u"Dana Levi"_s));
    EXPECT_EQ(resend.value(1), u" משלוח חוזר "_s);
    EXPECT_EQ(resend.value(4), u" משלוח עד הבית "_s);
    state.OperatorArea = false; // no button opens the details
    EXPECT_EQ(OrderSummaryLines(state, date).value(2), u" משלוח עד הבית "_s);
}

TEST(OrderFacts, AreInWordsAndLeaveOutWhatIsNotKnown) {
    const struct {
        const char* what;
        void (*arrange)(SessionState&);
        QString facts;
    } cases[] = {
        {"print", [](SessionState&) {},
         u"Dana Levi|03-1234567|13|10/15 cm, Glossy, no border, the whole picture, uncut|gift"_s},
        {"branch", [](SessionState& s) { s.BranchChoice = u"Haifa"_s, s.shemot.Hearot = u" - Haifa"_s; },
         u"Dana Levi|03-1234567|13|10/15 cm, Glossy, no border, the whole picture, uncut|Haifa"_s},
        {"home",
         [](SessionState& s) { s.MishloachHabaita = true, s.shemot.n3 = u"5 Herzl"_s, s.shemot.Bord = u"B7"_s; },
         u"Dana Levi|03-1234567|13|10/15 cm, Glossy, border B7 (black, narrow), the whole picture, uncut|to your home, 5 Herzl|gift"_s},
        {"no log",
         [](SessionState& s) { s.shemot = {}, s.shemot.n1 = u"NO details"_s, s.shemot.ppr = s.shemot.maat = u"***"_s; },
         u""_s},
        {"album",
         [](SessionState& s) {
             s.Optint = OrderKind::Album;
             s.shemot.n1.clear();
             s.album.ShemZalam = u"Studio Or"_s;
             s.album.SoogLBM = u"פוטו גדול"_s;
             s.album.SoogNiar = u"בחר סוג נייר"_s; // none was
             s.shemot.Hearot = QString(25, u'x');
         },
         u"Studio Or|03-1234567|13|Photo large|xxxxxxxxxxxxxxxxxxxxxxxx\u200Bx"_s},
    };
    for (const auto& each : cases) {
        SessionState state = exampleOrder();
        state.EnglishTips = 1;
        each.arrange(state);
        QStringList facts;
        for (const OrderFact& fact : OrderFacts(state))
            facts += fact.text;
        EXPECT_EQ(facts.join(u'|'), each.facts) << each.what;
        EXPECT_EQ(CalledName(state), state.Optint == OrderKind::Album ? u"Studio Or"_s
                                     : each.facts.isEmpty()           ? u""_s
                                                                      : u"Dana"_s);
    }
    EXPECT_EQ(ShortNumber(u"2026_11_21_KUP_1234^105P"_s), u"105"_s);
}

TEST(OrderSummary, IsDrawnDarkOnWhiteFromTheSideOfItsLanguage) {
    const QStringList lines{u"IIIIIIII"_s};
    for (const auto direction : {Qt::LeftToRight, Qt::RightToLeft}) {
        const Bitmap picture = OrderSummaryPicture(lines, direction);
        ASSERT_FALSE(picture.isNull());
        int left = 0;
        int right = 0;
        for (int y = 0; y < picture.height(); ++y) {
            for (int x = 0; x < picture.width(); ++x) {
                if (qGray(picture.image().pixel(x, y)) < 128)
                    ++(x < picture.width() / 2 ? left : right);
            }
        }
        EXPECT_GT(direction == Qt::LeftToRight ? left : right, 20);
        EXPECT_EQ(direction == Qt::LeftToRight ? right : left, 0);
    }
}

TEST(UploadProgress, CountsFromNoneToAllAndCutsDown) {
    EXPECT_EQ(UploadPercent(0, 1), 0);
    EXPECT_EQ(UploadPercent(0, 17), 0);
    EXPECT_EQ(UploadPercent(1, 4), 33);
    EXPECT_EQ(UploadPercent(16, 17), 100);
    EXPECT_EQ(BarWidth(33, 1000), 330);
    EXPECT_EQ(BarWidth(33, 5), 1);
}

TEST(UploadProgress, MinutesFollowThePaceSlowlyAndStayUntilTheyAreWrong) {
    UploadPace pace;
    qint64 put = 0;
    int now = 0;
    const auto go = [&](int seconds, qint64 rate) {
        for (int i = 0; i < seconds; ++i)
            pace.moved(put += rate, std::chrono::seconds(++now));
    };
    go(3, 100'000);
    EXPECT_FALSE(pace.minutes(12'000'000)) << "too early to know";
    go(20, 100'000);
    EXPECT_EQ(pace.minutes(12'000'000), 2);
    EXPECT_EQ(pace.minutes(6'500'000), 2);
    EXPECT_EQ(pace.minutes(5'300'000), 1);
    EXPECT_EQ(pace.minutes(24'000'000), 4);
    go(3, 0);
    EXPECT_EQ(pace.minutes(24'000'000), 5) << "the line has paused for a moment";
}

TEST(UploadProgress, ReadsThePlaceOfAPieceFromItsName) {
    const auto piece = PieceFromName(u"C:\\order\\a_002_008.prk"_s);
    ASSERT_TRUE(piece);
    EXPECT_EQ(piece->sequence, u"002"_s);
    EXPECT_DOUBLE_EQ(piece->share(), 0.25);
    EXPECT_FALSE(piece->last());
    EXPECT_TRUE(PieceFromName(u"a_008_008.prk"_s)->last());
    EXPECT_DOUBLE_EQ(PieceFromName(u"a_001_000.prk"_s)->share(), 1);
    EXPECT_FALSE(PieceFromName(u"a_001_000.jpp"_s));
    EXPECT_EQ(MinutesLeft(50, 7), 8);
}

} // namespace lumora
