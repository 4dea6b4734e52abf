#include "order/BrokenFiles.h"
#include "order/OrderDetailsReader.h"
#include "order/OrderReport.h"
#include "support/ExampleOrder.h"
#include "support/TestPlatform.h"
#include "transfer/delivery/OrderSummary.h"
#include "transfer/delivery/UploadProgress.h"

#include "session/TextList.h"

#include <gtest/gtest.h>

namespace lumora {

namespace {

SessionState orderOfDana() {
    SessionState state = exampleOrder();
    state.profile.ClientCode = u"tarvelmond"_s;
    state.transfer.ShemTikiya = u"2026_11_21_KUP_1234^105"_s;
    return state;
}

const QString reportOfDana =
    u"?k1=tarvelmond&t1=2026_11_21_KUP_1234^105    10_15G_FIT_NB&t2=Notes: gift - &t3=Pratim: 03-1234567    Dana "
    "Levi&t4=Adress: &t5=Mail: dana@example.com&t8=Total_pics: 13"_s;

} // namespace

TEST(OrderReport, TellsTheOrderInOneQueryForANewOrderAndForAResend) {
    SessionState state = orderOfDana();
    EXPECT_EQ(OrderReportQuery(state), reportOfDana);
    EXPECT_EQ(DoneQuery(state), u"?t1=tarvelmond&t2=true"_s);
    state.transfer.SugMishloah = Sending::Resend;
    EXPECT_EQ(OrderReportQuery(state), reportOfDana);
    state.transfer.SugMishloah = Sending::Chain;
    EXPECT_EQ(OrderReportQuery(state), QString());
    EXPECT_EQ(DoneQuery(state), QString());
}

TEST(OrderReport, KeepsEveryCharacterButLineBreaksAndOverlapsTheEndsOfAShortPaperText) {
    SessionState state = orderOfDana();
    state.shemot.Hearot = u"a&b#c%20\r\nGET /"_s + QChar(u'\0') + u'x';
    state.shemot.ppr = u"9/5"_s;
    state.shemot.maat.clear();
    const QString query = OrderReportQuery(state);
    EXPECT_TRUE(query.contains(u"Notes: a&b#c%20  GET / x&t3="_s));
    EXPECT_TRUE(query.contains(u"    9/_/5_FIT_NB&"_s));
}

TEST(OrderReport, KnowsThePaperKindsOfBothLanguages) {
    for (const QString& word : {u"מט"_s, u"MAT"_s, u"Matte"_s})
        EXPECT_EQ(PaperKindLetter(word), u"M"_s) << word.toStdString();
    for (const QString& word : {u"מבריק"_s, u"GLOSSY"_s, u"Glossy"_s})
        EXPECT_EQ(PaperKindLetter(word), u"G"_s) << word.toStdString();
    for (const QString& word : {QString(), u"***"_s, u"M"_s})
        EXPECT_EQ(PaperKindLetter(word), QString()) << word.toStdString();
}

TEST(ReadOrderDetails, TakesNineFieldsAndLeavesWhatTheLogLacks) {
    TestPlatform test;
    const QString path = u"C:\\log.txt"_s;
    (void)test.files.writeWhole(path, "\"00\",\"00\"\r\n\"Shemot.n1\",\"a, \"b\" c\"\r\n\"Shemot.TotalPics\",13\r\n"
                                      "\"Shemot.n3\",\"elsewhere\"\r\n\"Shemot.Hearot\",\"\"\r\nrubbish\r\n");
    OrderDetails details;
    details.n2 = u"03"_s;
    details.n3 = u"street"_s;
    details.Hearot = u"old"_s;
    ReadOrderDetails(test.files, path, details);
    EXPECT_EQ(details.n1, u"a, \"b\" c"_s);
    EXPECT_EQ(details.n2, u"03"_s);
    EXPECT_EQ(details.n3, u"street"_s);
    EXPECT_EQ(details.Hearot, QString());
    EXPECT_EQ(details.TotalPics, 13);
}

TEST(ReadOrderDetails, LeavesANewAlbumAsTheSessionKnowsItAndReadsOneThatIsSentAgain) {
    TestPlatform test;
    const QString path = u"C:\\log.txt"_s;
    (void)test.files.writeWhole(path, "\"00\",\"00\"\r\n\"00\",\"00\"\r\n\"TotalPics\",14\r\n\"GodelLBM\",\"30/60\"\r\n"
                                      "\"MailZalam\",\"studio@example.com\"\r\n\"ShemZalam\",\"Studio Or\"\r\n");
    OrderDetails details; // a new album has no customer, and the address may have been mended since
    details.Mail = u"as corrected@example.com"_s;
    details.Bord = u"NB"_s;
    ReadOrderDetails(test.files, path, details);
    EXPECT_EQ(details.n1, QString());
    EXPECT_EQ(details.Mail, u"as corrected@example.com"_s);
    EXPECT_EQ(details.TotalPics, 0);
    ReadResentDetails(test.files, path, details);
    EXPECT_EQ(details.n1, u"Studio Or"_s);
    EXPECT_EQ(details.ppr, u"30/60"_s);
    EXPECT_EQ(details.Mail, u"studio@example.com"_s);
    EXPECT_EQ(details.Bord, QString()) << "of another order";
    EXPECT_EQ(details.TotalPics, 14);
}

TEST(ReadOrderDetails, SaysSoWhenThereIsNoLog) {
    TestPlatform test;
    OrderDetails details;
    details.TotalPics = 4;
    ReadOrderDetails(test.files, u"C:\\none.txt"_s, details);
    for (const QString& text : {details.n1, details.n2, details.ppr, details.Hearot, details.Mail, details.FillFit,
                                details.maat, details.Bord})
        EXPECT_EQ(text, u"NO details"_s);
    EXPECT_EQ(details.TotalPics, 0);
}

TEST(CopiesCount, SumsTheFirstTwoCharactersOfAllButTexts) {
    EXPECT_EQ(CopiesCount({u"99order.txt"_s, u"!105_1234.jpp"_s, u"021015G.jpp"_s, u"1 1015G.jpp"_s, u"000.jpg"_s,
                           u"ab.jpp"_s}),
              3);
    EXPECT_EQ(CopiesCount(QStringList(400, u"99.jpp"_s)), 32767);
}

TEST(OrderSummary, ShowsWhoOnlyForANewOrderAndDeliveryOnlyWhenAskedFor) {
    SessionState state = orderOfDana();
    const QDate date(2026, 11, 21);
    EXPECT_EQ(OrderSummaryLines(state, date).join(u'|'),
              u"21/11/2026|Dana Levi|03-1234567|10/15NB מבריק|gift - | סך תמונות 13||||"_s);
    state.transfer.SugMishloah = Sending::Resend;
    state.MishloachHabaita = true;
    const QStringList resend = OrderSummaryLines(state, date);
    EXPECT_FALSE(resend.contains(u"Dana Levi"_s));
    EXPECT_EQ(resend.value(1), u" משלוח חוזר "_s);
    EXPECT_EQ(resend.value(4), u"  משלוח עד הבית  "_s);
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

TEST(BrokenFiles, ComeBackAsTheyWereWritten) {
    TestPlatform test;
    TextList broken;
    broken.append(u"C:\\תמונות\\a.jpp"_s);
    broken.append(u"C:\\b.jpp"_s);
    ASSERT_TRUE(WriteBrokenFiles(test.files, u"C:"_s, broken));
    EXPECT_EQ(ReadBrokenFiles(test.files, u"C:\\"_s), broken.items());
    EXPECT_TRUE(IsBroken(broken, u"b.jpp"_s));
    EXPECT_FALSE(IsBroken(broken, u"B.jpp"_s));
    EXPECT_TRUE(ReadBrokenFiles(test.files, u"C:\\none"_s).isEmpty());
    const auto written = WriteBrokenFiles(test.files, u"C:\\none"_s, broken);
    ASSERT_FALSE(written);
    EXPECT_TRUE(written.failure().message.contains(u"kashloo.txt"_s));
}

} // namespace lumora
