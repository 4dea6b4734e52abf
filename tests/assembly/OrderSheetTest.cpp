#include "assembly/OrderSheet.h"

#include "support/ExampleOrder.h"
#include "support/TestPlatform.h"

#include <QFontMetrics>
#include <QPainter>

#include <gtest/gtest.h>

namespace lumora {
namespace {

QStringList textsOf(const QList<SheetLine>& lines) {
    QStringList texts;
    std::transform(lines.begin(), lines.end(), std::back_inserter(texts),
                   [](const SheetLine& line) { return line.text; });
    return texts;
}

QStringList linesOf(SessionState& state) {
    return textsOf(plainSheetLines(state, FixedClock().now()));
}

SessionState deliveredOrder() {
    SessionState state = exampleOrder();
    state.shemot.n3 = u"Herzl 1"_s;
    state.shemot.maat = u"Matte"_s;
    return state;
}

TEST(OrderSheet, tellsTheOrderInSixLines) {
    SessionState state = deliveredOrder();
    EXPECT_EQ(linesOf(state), QStringList({
                                  u"No.....105_1234    21/11/2026 14:05:09      ver: 4.00"_s,
                                  u"  Name....Dana Levi        Tel.....03-1234567      "_s,
                                  u"    Herzl 1      "_s,
                                  u"  Paper size....10/15       paper  KindMatte    FIT"_s,
                                  u"  Total pictures...13   Border=  NB   Mail  dana@example.com"_s,
                                  u"gift - "_s,
                              }));
    state.shemot.ppr = u"zz/zz"_s;
    state.shemot.Soog1 = u"one"_s;
    state.shemot.Soog2 = u"two"_s;
    EXPECT_EQ(linesOf(state)[3], u"zz/zz   paper  Kindtwo one"_s);
    EXPECT_EQ(orderSheetBackground(SheetKind::Plain, state), QColor(255, 192, 255));
    state.KodMishloach = u"HOM"_s;
    EXPECT_FALSE(linesOf(state)[0].contains(u"קבלת"_s));
    state.KodMishloach = u"LOB"_s;
    EXPECT_TRUE(linesOf(state)[0].contains(u"קבלת תמונות"_s));
}

TEST(OrderSheet, tellsAnEditedOrderInItsOwnSixLines) {
    SessionState state = deliveredOrder();
    state.KodMishloach = u"HOM"_s;
    const QStringList wanted = {
        u"No.....105_1234    21/11/2026 14:05:09     קבלת תמונות בדואר  ver: 4.00"_s,
        u"  Name....Dana Levi        Tel.....03-1234567      "_s,
        u"    Herzl 1      "_s,
        u"  Paper size....10/15       paper Kind  Matte"_s,
        u"  Total pictures...13   Border=  NB     Mail  dana@example.com"_s,
        u"  gift - "_s,
    };
    EXPECT_EQ(textsOf(editedSheetLines(state, FixedClock().now())), wanted);
    state.shemot.ppr = u"zz/zz"_s;
    EXPECT_EQ(orderSheetBackground(SheetKind::Edited, state), QColor(Qt::white));
}

TEST(OrderSheet, tellsAnAlbumInSeventeenLines) {
    SessionState state = deliveredOrder();
    AlbumDetails& album = state.album;
    album.ShemZalam = u"Studio Or"_s;
    album.TelZalam = u"03-7654321"_s;
    album.ShemErooa = u"Wedding"_s;
    album.MailZalam = u"studio@example.com"_s;
    album.GodelLBM = u"30/60"_s;
    album.SoogLBM = u"פוטו גדול"_s;
    album.SoogNiar = u"משי"_s;
    album.SoogKricha = u"חום"_s;
    album.Tosafot2 = {u"0"_s, u"1"_s, u"2"_s, u"3"_s, u"4"_s, u"5"_s, u"6"_s, u"7"_s, u"8"_s};
    album.KamutHorim = u"2"_s;
    album.SoogHorim = u"30/60"_s;
    const QString rule(89, u'-');
    // The event and the address share a line.
    EXPECT_EQ(textsOf(albumSheetLines(state, FixedClock().now())),
              (QStringList{
                  u"No.....105_1234    21/11/2026 14:05:09      ver: 4.00"_s,
                  u"  ShemZalam....Studio Or        TelZalam.....03-7654321      "_s,
                  u"  ShemErooa....Wedding    Herzl 1      "_s,
                  u"  MailZalam....studio@example.com"_s,
                  u"  Total pictures...13"_s,
                  rule,
                  u"  GodelLBM....30/60       SoogLBM....פוטו גדול     SoogNiar....משי"_s,
                  u"  SoogKricha....חום"_s,
                  rule,
                  u" 0       1       2       3  "_s,
                  u" 4       5       6       7       8     "_s,
                  rule,
                  u" 2  אלבום הורים  "_s,
                  u"   סוג  אלבום  הורים  30/60   "_s,
                  rule,
                  u"  Hearot....gift - "_s,
                  rule,
              }));
    EXPECT_EQ(orderSheetBackground(SheetKind::Album, state), QColor(220, 220, 150));
    state.shemot.ppr = u"zz/zz"_s;
    EXPECT_EQ(orderSheetBackground(SheetKind::Album, state), QColor(255, 192, 255));
}

TEST(OrderSheet, keepsWhatOnlyItTellsWhole) {
    SessionState state = deliveredOrder();
    state.shemot.Hearot = state.shemot.n3 = state.album.TelZalam = state.album.ShemZalam =
        u"אבגדה "_s.repeated(20) + u"0123456789"_s.repeated(20);
    // The log would have question marks.
    const QList<SheetLine> lines = albumSheetLines(state, QDateTime()) + QList<SheetLine>{{u"Привет "_s.repeated(99)}};
    QString told;
    for (const PlacedText& piece : placeSheetLines(lines, 500).texts)
        told += piece.text;
    EXPECT_EQ(told, textsOf(lines).join(QString()));
}

TEST(OrderSheet, shortensALineOnlyBelowEightPixels) {
    QFont least;
    least.setPixelSize(8);
    QString fits(20, u'm');
    while (QFontMetrics(least).horizontalAdvance(fits + u'm') <= 480)
        fits += u'm';
    const auto placed = placeSheetLines({{fits}, {fits + u'm'}}, 500).texts;
    EXPECT_EQ(placed.at(0).text, fits);
    EXPECT_TRUE(placed.at(1).text.endsWith(u"m..."_s));
}

class ContactSheet : public ::testing::Test {
protected:
    // The left half red, the right half blue.
    SheetCell picture(const char* name, int width, int height) {
        Bitmap bitmap(width, height, Qt::blue);
        QPainter(&bitmap.image()).fillRect(0, 0, width / 2, height, Qt::red);
        const auto path = std::filesystem::path(folder.path().toStdString()) / name;
        EXPECT_TRUE(saveJpeg(bitmap, path, 100));
        return {path, QString::fromLatin1(name)};
    }
    static bool isRed(QColor colour) { return colour.red() > 200 && colour.blue() < 60; }
    static bool isBlue(QColor colour) { return colour.blue() > 200 && colour.red() < 60; }

    QTemporaryDir folder;
};

TEST_F(ContactSheet, laysEveryPictureInLandscapeATurnedOneClockwise) {
    OrderSheet sheet(SheetKind::Plain, {500, 480}, Qt::white);
    const SheetCell gone{std::filesystem::path("/nowhere.jpg"), u"12_gone"_s};
    sheet.drawContactSheet({gone, picture("land", 400, 300), picture("port", 300, 400), picture("square", 200, 200)},
                           [](int) { return true; });
    const QImage& image = sheet.bitmap().image();
    EXPECT_EQ(image.copy(5, 161, 80, 80), OrderSheet(SheetKind::Plain, {80, 80}, Qt::white).bitmap().image());
    // The first row lies at 81 + 80, cells every 82 pixels from 5; the left side of what is turned comes to the top.
    for (const auto& [red, blue] : {std::pair(QPoint(87 + 10, 161 + 30), QPoint(87 + 70, 161 + 30)),
                                    {QPoint(169 + 40, 161 + 10), QPoint(169 + 40, 161 + 50)},
                                    {QPoint(251 + 40, 161 + 10), QPoint(251 + 40, 161 + 70)}}) {
        EXPECT_TRUE(isRed(image.pixelColor(red))) << red.x();
        EXPECT_TRUE(isBlue(image.pixelColor(blue))) << blue.x();
    }
    EXPECT_EQ(image.pixelColor(87 + 10, 160), QColor(Qt::white));
    EXPECT_EQ(image.pixelColor(86, 161 + 30), QColor(Qt::white));
}

TEST(OrderSheet, growsWithTheNumberOfItsThumbnails) {
    const struct {
        int upTo; // one more takes the next size
        PictureSize edited, plain;
    } steps[] = {{10, {450, 580}, {500, 480}},    {50, {450, 880}, {500, 880}},    {70, {660, 880}, {660, 880}},
                 {100, {750, 1000}, {750, 1000}}, {200, {900, 1000}, {900, 1000}}, {999, {1100, 1300}, {1100, 1300}}};
    int from = 0;
    for (const auto& step : steps) {
        for (const int count : {from, step.upTo}) {
            EXPECT_EQ(orderSheetSize(SheetKind::Edited, count), step.edited) << count;
            EXPECT_EQ(orderSheetSize(SheetKind::Plain, count), step.plain) << count;
        }
        from = step.upTo + 1;
    }
}

TEST_F(ContactSheet, endsWithItsLastCellAndWhereItIsToldTo) {
    EXPECT_EQ(OrderSheet(SheetKind::Edited, {450, 580}, Qt::white).capacity(), 24) << "six rows of four";
    OrderSheet sheet(SheetKind::Plain, orderSheetSize(SheetKind::Plain, 10), Qt::white);
    const std::vector<SheetCell> cells(100, picture("land", 40, 30));
    for (const int end : {sheet.capacity() - 1, 3}) {
        int last = -1;
        sheet.drawContactSheet(cells, [&](int i) {
            last = i;
            return end != 3 || i < end;
        });
        EXPECT_EQ(last, end);
    }
}

TEST_F(ContactSheet, showsEachLineWholeAboveThePictures) {
    for (const auto& [kind, words] :
         {std::pair(SheetKind::Plain, 15), {SheetKind::Plain, 400}, {SheetKind::Album, 15}, {SheetKind::Album, 400}}) {
        SessionState state = deliveredOrder();
        state.shemot.Hearot = u"הערה "_s.repeated(words);
        OrderSheet sheet(kind, {500, 480}, Qt::white);
        sheet.drawLines(kind == SheetKind::Album ? albumSheetLines(state, QDateTime())
                                                 : plainSheetLines(state, QDateTime()));
        const QImage text = sheet.bitmap().image();
        const QImage empty = Bitmap(500, text.height(), Qt::white).image();
        const int added = text.height() - 480;
        const int firstRow = added + (kind == SheetKind::Album ? 362 : 161);
        EXPECT_NE(text.copy(0, 10, 500, 20), empty.copy(0, 10, 500, 20));
        EXPECT_EQ(text.copy(499, 0, 1, text.height()), empty.copy(499, 0, 1, text.height())) << "cut at the side";
        EXPECT_EQ(text.copy(0, firstRow, 500, 300), empty.copy(0, firstRow, 500, 300)) << "below the first picture";
        EXPECT_EQ(added > 0, kind == SheetKind::Album && words == 400) << "only an album's log lacks the note";
        sheet.drawContactSheet({picture("land", 400, 300)}, [](int) { return true; });
        EXPECT_TRUE(isRed(sheet.bitmap().image().pixelColor(15, firstRow + 30)));
    }
}

} // namespace
} // namespace lumora
