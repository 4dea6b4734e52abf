#include "session/SessionState.h"
#include "support/TestPlatform.h"
#include "transfer/BrokenFiles.h"
#include "transfer/OrderDetailsReader.h"
#include "transfer/OrderReport.h"
#include "transfer/OrderSummary.h"
#include "transfer/UploadProgress.h"

#include "session/TextList.h"

#include <gtest/gtest.h>

namespace lumora {

namespace {

SessionState orderOfDana() {
    SessionState state;
    state.profile.ClientCode = QStringLiteral("tarvelmond");
    state.transfer.ShemTikiya = QStringLiteral("2026_11_21_KUP_1234^105");
    state.shemot.n1 = QStringLiteral("Dana Levi");
    state.shemot.n2 = QStringLiteral("03-1234567");
    state.shemot.Mail = QStringLiteral("dana@example.com");
    state.shemot.Hearot = QStringLiteral("gift - ");
    state.shemot.ppr = QStringLiteral("10/15");
    state.shemot.maat = QStringLiteral("מבריק");
    state.shemot.FillFit = QStringLiteral("FIT");
    state.shemot.Bord = QStringLiteral("NB");
    state.shemot.TotalPics = 13;
    return state;
}

const QString reportOfDana = QStringLiteral(
    "?k1=tarvelmond&t1=2026_11_21_KUP_1234^105    10_15G_FIT_NB&t2=Notes: gift - &t3=Pratim: 03-1234567    Dana "
    "Levi&t4=Adress: &t5=Mail: dana@example.com&t8=Total_pics: 13");

} // namespace

TEST(OrderReport, TellsTheOrderInOneQueryForANewOrderAndForAResend) {
    SessionState state = orderOfDana();
    EXPECT_EQ(OrderReportQuery(state), reportOfDana);
    EXPECT_EQ(DoneQuery(state), QStringLiteral("?t1=tarvelmond&t2=true"));
    state.transfer.SugMishloah = 1;
    EXPECT_EQ(OrderReportQuery(state), reportOfDana);
    state.transfer.SugMishloah = 2;
    EXPECT_EQ(OrderReportQuery(state), QString());
    EXPECT_EQ(DoneQuery(state), QString());
}

TEST(OrderReport, KeepsEveryCharacterButLineBreaks) {
    SessionState state = orderOfDana();
    state.shemot.Hearot = QStringLiteral("a&b#c%20\r\nGET /") + QChar(u'\0') + u'x';
    EXPECT_TRUE(OrderReportQuery(state).contains(QStringLiteral("Notes: a&b#c%20  GET / x&t3=")));
}

TEST(OrderReport, OverlapsTheEndsOfAShortPaperText) {
    SessionState state = orderOfDana();
    state.shemot.ppr = QStringLiteral("9/5");
    state.shemot.maat.clear();
    EXPECT_TRUE(OrderReportQuery(state).contains(QStringLiteral("    9/_/5_FIT_NB&")));
}

TEST(OrderReport, KnowsThePaperKindsOfBothLanguages) {
    for (const QString& word : {QStringLiteral("מט"), QStringLiteral("MAT"), QStringLiteral("Matte")})
        EXPECT_EQ(PaperKindLetter(word), QStringLiteral("M")) << word.toStdString();
    for (const QString& word : {QStringLiteral("מבריק"), QStringLiteral("GLOSSY"), QStringLiteral("Glossy")})
        EXPECT_EQ(PaperKindLetter(word), QStringLiteral("G")) << word.toStdString();
    for (const QString& word : {QString(), QStringLiteral("***"), QStringLiteral("M")})
        EXPECT_EQ(PaperKindLetter(word), QString()) << word.toStdString();
}

TEST(ReadOrderDetails, TakesNineFieldsAndLeavesWhatTheLogLacks) {
    TestPlatform test;
    const QString path = QStringLiteral("C:\\log.txt");
    (void)test.files.writeWhole(path, "\"00\",\"00\"\r\n\"Shemot.n1\",\"a, \"b\" c\"\r\n\"Shemot.TotalPics\",13\r\n"
                                      "\"Shemot.n3\",\"elsewhere\"\r\n\"Shemot.Hearot\",\"\"\r\nrubbish\r\n");
    OrderDetails details;
    details.n2 = QStringLiteral("03");
    details.n3 = QStringLiteral("street");
    details.Hearot = QStringLiteral("old");
    ReadOrderDetails(test.files, path, details);
    EXPECT_EQ(details.n1, QStringLiteral("a, \"b\" c"));
    EXPECT_EQ(details.n2, QStringLiteral("03"));
    EXPECT_EQ(details.n3, QStringLiteral("street"));
    EXPECT_EQ(details.Hearot, QString());
    EXPECT_EQ(details.TotalPics, 13);
}

TEST(ReadOrderDetails, LeavesANewAlbumAsTheSessionKnowsItAndReadsOneThatIsSentAgain) {
    TestPlatform test;
    const QString path = QStringLiteral("C:\\log.txt");
    (void)test.files.writeWhole(path, "\"00\",\"00\"\r\n\"00\",\"00\"\r\n\"TotalPics\",14\r\n\"GodelLBM\",\"30/60\"\r\n"
                                      "\"MailZalam\",\"studio@example.com\"\r\n\"ShemZalam\",\"Studio Or\"\r\n");
    OrderDetails details; // a new album has no customer, and the address may have been mended since
    details.Mail = QStringLiteral("as corrected@example.com");
    details.Bord = QStringLiteral("NB");
    ReadOrderDetails(test.files, path, details);
    EXPECT_EQ(details.n1, QString());
    EXPECT_EQ(details.Mail, QStringLiteral("as corrected@example.com"));
    EXPECT_EQ(details.TotalPics, 0);
    ReadResentDetails(test.files, path, details);
    EXPECT_EQ(details.n1, QStringLiteral("Studio Or"));
    EXPECT_EQ(details.ppr, QStringLiteral("30/60"));
    EXPECT_EQ(details.Mail, QStringLiteral("studio@example.com"));
    EXPECT_EQ(details.Bord, QString()) << "of another order";
    EXPECT_EQ(details.TotalPics, 14);
}

TEST(ReadOrderDetails, SaysSoWhenThereIsNoLog) {
    TestPlatform test;
    OrderDetails details;
    details.TotalPics = 4;
    ReadOrderDetails(test.files, QStringLiteral("C:\\none.txt"), details);
    for (const QString& text : {details.n1, details.n2, details.ppr, details.Hearot, details.Mail, details.FillFit,
                                details.maat, details.Bord})
        EXPECT_EQ(text, QStringLiteral("NO details"));
    EXPECT_EQ(details.TotalPics, 0);
}

TEST(CopiesCount, SumsTheFirstTwoCharactersOfAllButTexts) {
    EXPECT_EQ(
        CopiesCount({QStringLiteral("99order.txt"), QStringLiteral("!105_1234.jpp"), QStringLiteral("021015G.jpp"),
                     QStringLiteral("1 1015G.jpp"), QStringLiteral("000.jpg"), QStringLiteral("ab.jpp")}),
        3);
    EXPECT_EQ(CopiesCount(QStringList(400, QStringLiteral("99.jpp"))), 32767);
}

TEST(OrderSummary, ShowsWhoOnlyForANewOrderAndDeliveryOnlyWhenAskedFor) {
    SessionState state = orderOfDana();
    const QDate date(2026, 11, 21);
    const QStringList plain = OrderSummaryLines(state, date);
    EXPECT_EQ(plain, (QStringList{QStringLiteral("21/11/2026"),
                                  QStringLiteral("Dana Levi"),
                                  QStringLiteral("03-1234567"),
                                  QStringLiteral("10/15NB מבריק"),
                                  QStringLiteral("gift - "),
                                  QStringLiteral(" סך תמונות 13"),
                                  {},
                                  {},
                                  {},
                                  {}}));
    state.transfer.SugMishloah = 1;
    state.MishloachHabaita = true;
    const QStringList resend = OrderSummaryLines(state, date);
    EXPECT_FALSE(resend.contains(QStringLiteral("Dana Levi")));
    EXPECT_EQ(resend.value(1), QStringLiteral(" משלוח חוזר "));
    EXPECT_EQ(resend.value(4), QStringLiteral("  משלוח עד הבית  "));
}

TEST(OrderSummary, IsDrawnDarkOnWhiteFromTheSideOfItsLanguage) {
    const QStringList lines{QStringLiteral("IIIIIIII")};
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
    const auto piece = PieceFromName(QStringLiteral("C:\\order\\a_002_008.prk"));
    ASSERT_TRUE(piece);
    EXPECT_EQ(piece->sequence, QStringLiteral("002"));
    EXPECT_DOUBLE_EQ(piece->share(), 0.25);
    EXPECT_FALSE(piece->last());
    EXPECT_TRUE(PieceFromName(QStringLiteral("a_008_008.prk"))->last());
    EXPECT_DOUBLE_EQ(PieceFromName(QStringLiteral("a_001_000.prk"))->share(), 1);
    EXPECT_FALSE(PieceFromName(QStringLiteral("a_001_000.jpp")));
    EXPECT_EQ(MinutesLeft(50, 7), 8);
}

TEST(BrokenFiles, ComeBackAsTheyWereWritten) {
    TestPlatform test;
    TextList broken;
    broken.append(QStringLiteral("C:\\תמונות\\a.jpp"));
    broken.append(QStringLiteral("C:\\b.jpp"));
    ASSERT_TRUE(WriteBrokenFiles(test.files, QStringLiteral("C:"), broken));
    EXPECT_EQ(ReadBrokenFiles(test.files, QStringLiteral("C:\\")), broken.items());
    EXPECT_TRUE(IsBroken(broken, QStringLiteral("b.jpp")));
    EXPECT_FALSE(IsBroken(broken, QStringLiteral("B.jpp")));
    EXPECT_TRUE(ReadBrokenFiles(test.files, QStringLiteral("C:\\none")).isEmpty());
    const auto written = WriteBrokenFiles(test.files, QStringLiteral("C:\\none"), broken);
    ASSERT_FALSE(written);
    EXPECT_TRUE(written.failure().message.contains(QStringLiteral("kashloo.txt")));
}

} // namespace lumora
