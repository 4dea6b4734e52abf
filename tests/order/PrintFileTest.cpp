#include "order/PrintFile.h"

#include "order/OrderTail.h"
#include "order/PrintFileName.h"
#include "order/TailTelephone.h"
#include "support/DrivePathLiteral.h"
#include "support/ExampleOrder.h"
#include "support/Take.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

QByteArray someBytes(int count) {
    QByteArray bytes;
    for (int i = 0; i < count; ++i)
        bytes.append(static_cast<char>(1 + (i * 7919 + i / 251) % 255));
    return bytes;
}

TEST(PrintFile, isWrittenAsTheLabsToolsReadIt) {
    const QByteArray tail = OrderTail::of(exampleOrder()).shortForm();
    const QByteArray file = take(packPrintFile("ABCDEFGHIJKLMN", {4, 30}, tail));
    EXPECT_EQ(file.toHex().toUpper(),
              QByteArray("414243440100454647480200494A4B4C03004D4E00000400000033342020202020202020"
                         "31203120"
                         "30332D31323334353637"
                         "44616E61204C65766920"
                         "313320"
                         "313035"
                         "31323334"
                         "202020202020"));
}

TEST(PrintFile, hasTheSizeThatPieceAndRemainderGive) {
    struct Case {
        int length, chunks, piece, remainder, size;
    };
    for (const Case& c : {Case{100, 8, 12, 4, 166}, Case{10, 4, 2, 2, 68}, Case{0, 56, 0, 0, 162},
                          Case{14, 56, 0, 14, 176}, Case{28, 56, 0, 28, 190}, Case{84, 56, 2, 28, 302},
                          Case{112, 56, 2, 0, 274}, Case{100000, 56, 1786, 40, 100218}}) {
        const QByteArray file = take(packPrintFile(someBytes(c.length), {c.chunks, 30}, QByteArray(40, ' ')));
        EXPECT_EQ(file.size(), c.size) << c.length;
        const PrintFileContent content = take(readPrintFile(file, {c.chunks, 30}));
        EXPECT_EQ(content.piece, c.piece) << c.length;
        EXPECT_EQ(content.remainder, c.remainder) << c.length;
    }
}

TEST(PrintFile, givesBackEveryPictureThatDoesNotEndInZeros) {
    for (const int chunks : {1, 2, 3, 4, 56, 57, 300}) {
        for (const int base : {0, 30, 32767}) {
            for (int length = 0; length < 700; length += 1 + length / 150) {
                for (const int tailWidth : {40, 60, 0}) {
                    const QByteArray picture = someBytes(length);
                    const QByteArray tail = someBytes(tailWidth);
                    const QByteArray file = take(packPrintFile(picture, {chunks, base}, tail));
                    const PrintFileContent content = take(readPrintFile(file, {chunks, base}));
                    ASSERT_EQ(content.picture, picture)
                        << length << " bytes in " << chunks << " pieces, tail " << tailWidth;
                    ASSERT_EQ(content.tail, tail);
                }
            }
        }
    }
}

TEST(PrintFile, refusesWhatDoesNotHoldTogether) {
    const QByteArray whole = *packPrintFile(someBytes(1000), {56, 30}, QByteArray(40, ' '));
    ASSERT_TRUE(readPrintFile(whole, {56, 30}));
    EXPECT_FALSE(readPrintFile(whole, {55, 30})) << "another number of pieces";
    EXPECT_FALSE(readPrintFile(whole, {56, 31})) << "another base";
    EXPECT_FALSE(readPrintFile(whole, {0, 30}));
    EXPECT_FALSE(readPrintFile({}, {56, 30}));
    for (qsizetype cut = 1; cut < whole.size(); cut += 12)
        EXPECT_FALSE(readPrintFile(whole.chopped(cut), {56, 30})) << cut;
    QByteArray number = whole;
    number[18] = 9; // number of the first piece of 18 bytes
    EXPECT_FALSE(readPrintFile(number, {56, 30}));
    QByteArray marker = whole;
    marker.replace(marker.size() - 50, 10, "9999999999");
    EXPECT_FALSE(readPrintFile(marker, {56, 30}));

    for (const int chunks : {0, -1, 32768})
        EXPECT_FALSE(packPrintFile("x", {chunks, 30}, {})) << chunks;
}

TEST(OrderTail, cutsEachFieldToItsWidthInBytesOfTheCodePage) {
    SessionState state = exampleOrder();
    state.shemot.n1 = QString::fromUtf8("דנה לוי-כהן\U0001F600");
    state.shemot.n2 = u"+972-3-1234567"_s;
    state.shemot.TotalPics = 1234;
    state.MisparHazmana = u"1005"_s;
    EXPECT_EQ(OrderTail::of(state).shortForm(), "1 1 +972-3-123\xe3\xf0\xe4 \xec\xe5\xe9-\xeb\xe4"
                                                "1231001234      ");

    state.shemot.n1 = QString::fromUtf8("\U0001F600\U0001F600");
    EXPECT_EQ(OrderTail::of(state).shortForm().mid(14, 10), "??        ") << "outside the code page, one byte each";
}

TEST(OrderTail, carriesTenDigitsOfALongTelephoneAndAsksForMore) {
    const struct {
        QString typed, builtIn, careful;
        bool asks;
    } cases[] = {{u"03-1234567"_s, u"03-1234567"_s, u"03-1234567"_s, false},
                 {u"052-7654321"_s, u"052-765432"_s, u"0527654321"_s, false},
                 {u"+972-52-765 4321 "_s, u"+972-52-76"_s, u"0527654321"_s, false},
                 {u"+1 212 555 01 23 4"_s, u"+1 212 555"_s, u"+121255501"_s, true}};
    SessionState state = exampleOrder();
    for (const auto& c : cases) {
        state.shemot.n2 = state.album.TelZalam = c.typed;
        for (const bool careful : {false, true}) {
            state.Careful = careful;
            EXPECT_EQ(OrderTail::of(state).shortForm().mid(4, 10), (careful ? c.careful : c.builtIn).toLatin1());
            RecordedDialogs dialogs;
            EXPECT_EQ(TailTelephone(state).mayGoOnWith(c.typed, dialogs), !(careful && c.asks))
                << c.typed.toStdString();
            EXPECT_EQ(dialogs.questions.size(), careful && c.asks ? 1 : 0);
        }
    }
    state.album.ShemZalam = u"Studio Or"_s;
    state.Optint = OrderKind::Album;
    EXPECT_EQ(OrderTail::of(state).name, u"Dana Levi"_s);
    state.albumTail = AlbumTail::Photographer;
    EXPECT_EQ(OrderTail::of(state).name, u"Studio Or"_s);
    state.Optint = OrderKind::Print;
    EXPECT_EQ(OrderTail::of(state).name, u"Dana Levi"_s);
}

TEST(OrderTail, takesTheFormThatTheSessionAsksFor) {
    const OrderTail tail = OrderTail::of(exampleOrder());
    const QString name = u"a very long name of 30 letters"_s;
    EXPECT_EQ(tail.form(40, name), tail.shortForm());
    EXPECT_EQ(tail.form(60, name), tail.shortForm() + "^ name of 30 letters");
    EXPECT_EQ(tail.form(60, u"exactly nineteen ch"_s), tail.shortForm() + "^exactly nineteen ch");
    EXPECT_EQ(tail.form(60, u"twentycharactersname"_s), tail.shortForm() + "^wentycharactersname");
    EXPECT_EQ(tail.form(0, name), QByteArray());
    EXPECT_EQ(tail.form(60, u"תמונה"_s).mid(40), "^\xfa\xee\xe5\xf0\xe4              ");
    EXPECT_EQ(OrderTail::parse(tail.form(60, u"תמונה"_s))->baseName, u"תמונה"_s);
}

TEST(PrintFileName, carriesCodePlaceKindAndNameInHexadecimal) {
    const QString base = PrintBaseName(u"C:\\pics\\תמונה 01.jpg"_path);
    const PrintFileName name{u"121015MWB"_s, 7, 3, base};
    EXPECT_EQ(name.text(), u"121015MWB0007_03FAEEE5F0E4203031.jpp"_s);
    const std::optional<PrintFileName> read = PrintFileName::parse(name.text());
    ASSERT_TRUE(read);
    EXPECT_EQ(read->code, name.code);
    EXPECT_EQ(read->index, 7);
    EXPECT_EQ(read->optint, 3);
    EXPECT_EQ(read->baseName, base);
    EXPECT_EQ(read->copies(), 12);

    EXPECT_EQ((PrintFileName{u"1 1015GNB"_s, 12345, 10, u"a"_s}.text()), u"1 1015GNB2345_1061.jpp"_s);
    EXPECT_EQ((PrintFileName{u"1 1015GNB"_s, 0, 1, u"#ABCDEFGHIJKLMNOPQRST"_s}.text()),
              u"1 1015GNB0000_014142434445464748494A4B4C4D4E4F5051525354.jpp"_s);
    EXPECT_EQ(PrintBaseName(u"C:\\p\\0123456789012345678901234.jpg"_path), u"56789012345678901234"_s);
    for (const char* other :
         {"!105_1234.jpp", "121015MWB007_0361.jpp", "121015MWB0007_036.jpp", "121015MWB0007_03.jpp", ""})
        EXPECT_FALSE(PrintFileName::parse(QString::fromLatin1(other))) << other;
}

} // namespace
} // namespace lumora
