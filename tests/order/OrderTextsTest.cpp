#include "order/BrokenFiles.h"
#include "order/MailAddressGuard.h"
#include "order/OrderDetailsReader.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/OrderReport.h"
#include "session/TextList.h"
#include "support/ExampleOrder.h"
#include "support/Take.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

SessionState orderOfDana() {
    SessionState state = exampleOrder();
    state.profile.ClientCode = u"tarvelmond"_s;
    state.transfer.ShemTikiya = u"2026_11_21_KUP_1234^105"_s;
    return state;
}

const QString reportOfDana =
    u"?k1=tarvelmond&t1=2026_11_21_KUP_1234^105    10_15G_FIT_NB&t2=Notes: gift - &t3=Pratim: 03-1234567    Dana "
    "Levi&t4=Adress: &t5=Mail: dana@example.com&t8=Total_pics: 13"_s;

TEST(TimeOfJob, HasDayCodeAndVolumeInFixedPlaces) {
    EXPECT_EQ(BuildTimeOfJob(QDate(2026, 11, 21), u"KUP"_s, u"1234"_s), u"2026_11_21_KUP_1234^");
    EXPECT_EQ(BuildTimeOfJob(QDate(987, 1, 2), u"P"_s, QString()), u"0987_01_02_P  _^");
    EXPECT_EQ(BuildTimeOfJob(QDate(2026, 1, 2), u"LONG"_s, u"7"_s), u"2026_01_02_LON_7^");
}

TEST(MailAddressGuard, TakesAWholeAddressAsItIsAndNeverThePrompt) {
    const TypedAddress prompt{u"dana"_s, u"Choose or type"_s, true};
    const struct {
        TypedAddress typed;
        QString builtIn, careful;
        bool asks;
        bool complete = false;
    } cases[] = {
        {{u"dana"_s, u"example.com"_s}, u"dana@example.com"_s, u"dana@example.com"_s, false, true},
        {{u" d@lab.example"_s, u"gmail.com"_s}, u" d@lab.example@gmail.com"_s, u"d@lab.example"_s, false, true},
        {{u"dana@"_s, u"@example.com"_s}, u"dana@@@example.com"_s, u"dana@example.com"_s, false, true},
        {{u"dana@"_s, u"@"_s}, u"dana@@@"_s, u"dana"_s, true},
        {prompt, u"dana@Choose or type"_s, u"dana"_s, true},
        {{{}, u"Choose or type"_s, true}, u"@Choose or type"_s, {}, false},
        {{{}, u"gmail.com"_s}, u"@gmail.com"_s, {}, false},
    };
    SessionState state;
    for (const auto& c : cases) {
        EXPECT_EQ(MailAddressGuard::isComplete(c.typed), c.complete) << c.builtIn.toStdString();
        for (const bool careful : {false, true}) {
            state.Careful = careful;
            EXPECT_EQ(MailAddressGuard(state).address(c.typed), careful ? c.careful : c.builtIn);
            EXPECT_EQ(MailAddressGuard(state).lacksDomain(c.typed), careful && c.asks) << c.builtIn.toStdString();
        }
    }
}

TEST(OrderReport, TellsTheOrderInOneQueryButNotThatOfAChain) {
    SessionState state = orderOfDana();
    EXPECT_EQ(OrderReportQuery(state.profile, state.transfer, state.shemot), reportOfDana);
    EXPECT_EQ(DoneQuery(state.profile, state.transfer), u"?t1=tarvelmond&t2=true"_s);
    state.transfer.SugMishloah = Sending::Chain;
    EXPECT_EQ(OrderReportQuery(state.profile, state.transfer, state.shemot), QString());
    EXPECT_EQ(DoneQuery(state.profile, state.transfer), QString());
}

TEST(OrderReport, KeepsEveryCharacterButLineBreaksAndOverlapsTheEndsOfAShortPaperText) {
    SessionState state = orderOfDana();
    state.shemot.Hearot = u"a&b#c%20\r\nGET /"_s + QChar(u'\0') + u'x';
    state.shemot.ppr = u"9/5"_s;
    state.shemot.maat.clear();
    const QString query = OrderReportQuery(state.profile, state.transfer, state.shemot);
    EXPECT_TRUE(query.contains(u"Notes: a&b#c%20  GET / x&t3="_s));
    EXPECT_TRUE(query.contains(u"    9/_/5_FIT_NB&"_s));
}

TEST(OrderReport, KnowsThePaperKindsOfBothLanguages) {
    for (const QString& word : {u"מט"_s, u"MAT"_s, u"Matte"_s, u"מבריק"_s, u"Glossy"_s})
        EXPECT_EQ(PaperKindLetter(word), word.endsWith(u'ק') || word.endsWith(u'y') ? u"G"_s : u"M"_s);
    EXPECT_EQ(PaperKindLetter(u"***"_s), QString());
}

TEST(ReadOrderDetails, TakesTheFieldsOfTheLogAndLeavesTheOthers) {
    TestPlatform test;
    const DrivePath path = u"C:\\log.txt"_path;
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
    const DrivePath path = u"C:\\log.txt"_path;
    (void)test.files.writeWhole(path, "\"00\",\"00\"\r\n\"00\",\"00\"\r\n\"TotalPics\",14\r\n\"GodelLBM\",\"30/60\"\r\n"
                                      "\"MailZalam\",\"studio@example.com\"\r\n\"ShemZalam\",\"Studio Or\"\r\n"
                                      "\"Hearot\",\"for the wall\"\r\n");
    OrderDetails details; // a new album has no customer, and the address may have been mended since
    details.Mail = u"as corrected@example.com"_s;
    details.Bord = u"NB"_s;
    ReadOrderDetails(test.files, path, details);
    EXPECT_EQ(details.n1, QString());
    EXPECT_EQ(details.Mail, u"as corrected@example.com"_s);
    EXPECT_EQ(details.TotalPics, 0);
    details.n3 = u"of another order"_s;
    ReadResentDetails(test.files, path, details);
    EXPECT_EQ(details.n1 + details.ppr + details.Mail, u"Studio Or30/60studio@example.com"_s);
    EXPECT_EQ(details.Bord, QString()) << "of another order";
    EXPECT_EQ(details.TotalPics, 14);
    EXPECT_EQ(details.Hearot, QString());
    ReadReportDetails(test.files, path, details);
    EXPECT_EQ(details.n1 + details.n3, u"Studio Or"_s);
    EXPECT_EQ(details.Hearot, u"for the wall"_s);
    EXPECT_EQ(details.TotalPics, 14);
}

TEST(ReadOrderDetails, SaysSoWhenThereIsNoLog) {
    TestPlatform test;
    OrderDetails details;
    details.TotalPics = 4;
    ReadOrderDetails(test.files, u"C:\\none.txt"_path, details);
    for (const QString& text : {details.n1, details.n2, details.ppr, details.Hearot, details.Mail, details.FillFit,
                                details.maat, details.Bord})
        EXPECT_EQ(text, u"NO details"_s);
    EXPECT_EQ(details.TotalPics, 0);
}

TEST(BrokenFiles, ComeBackAsTheyWereWritten) {
    TestPlatform test;
    TextList broken;
    broken.append(u"C:\\תמונות\\a.jpp"_s);
    broken.append(u"C:\\b.jpp"_s);
    ASSERT_TRUE(WriteBrokenFiles(test.files, OrderFolder(u"C:"_path), broken));
    EXPECT_EQ(take(test.files.read(u"C:\\kashloo.txt"_path)), "C:\\\xFA\xEE\xE5\xF0\xE5\xFA\\a.jpp\r\nC:\\b.jpp\r\n");
    EXPECT_EQ(ReadBrokenFiles(test.files, OrderFolder(u"C:\\"_path)), broken.items());
    EXPECT_TRUE(IsBroken(broken, u"b.jpp"_s));
    EXPECT_FALSE(IsBroken(broken, u"B.jpp"_s));
    EXPECT_TRUE(ReadBrokenFiles(test.files, OrderFolder(u"C:\\none"_path)).isEmpty());
    const auto written = WriteBrokenFiles(test.files, OrderFolder(u"C:\\none"_path), broken);
    ASSERT_FALSE(written);
    EXPECT_TRUE(written.failure().message.contains(u"kashloo.txt"_s));
}

} // namespace
} // namespace lumora
