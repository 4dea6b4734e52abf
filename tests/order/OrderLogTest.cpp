#include "order/OrderLog.h"

#include "order/EditRecord.h"
#include "support/ExampleOrder.h"

#include <QCryptographicHash>

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;
using Layout = OrderLog::Layout;

const QDateTime afternoon(QDate(2026, 11, 21), QTime(14, 5, 9));

OrderLog printOrder(Layout layout) {
    SessionState state = exampleOrder();
    state.Optint = layout == Layout::Edited ? OrderKind::EditedPrint : OrderKind::Print;
    const QString record = layout == Layout::Edited ? EditRecord::newPicture() : QString();
    return OrderLog::of(
        state, layout,
        {u"121015GNB"_s + record + u"C:\\pics\\IMG_0012.jpg"_s, u"1 1015GNB"_s + record + u"C:\\pics\\IMG_0013.jpg"_s},
        {u"C:\\pics\\IMG_0013.jpg"_s}, afternoon);
}

OrderLog albumOrder() {
    SessionState state = exampleOrder();
    state.Optint = OrderKind::Album;
    state.DchisaAmoka = 1;
    state.shemot.TotalPics = 3;
    AlbumDetails& album = state.album;
    album.ShemZalam = u"סטודיו אור"_s;
    album.ShemErooa = u"Wedding"_s;
    album.MailZalam = u"studio@example.com"_s;
    album.SoogLBM = u"פוטו גדול"_s;
    album.SoogKricha = u"חום"_s;
    album.SoogNiar = u"בחר סוג נייר"_s;
    album.Tosafot1[0] = u"קנבס"_s;
    album.Tosafot2 = {u"עוד=0"_s,    u"הטבעת שם בכריכה=0"_s, u"פינות עגולות=1"_s,
                      u"מזוודה=0"_s, u"סובלימציה=0"_s,       u"פתיחה אנגלית=0"_s};
    album.GodelLBM = u"30/60"_s;
    return OrderLog::of(state, Layout::Album, {u"2 3060MNBC:\\pics\\one.jpg"_s, u"1 3060MNBC:\\pics\\two.jpg"_s}, {},
                        afternoon);
}

TEST(AnOrderLog, isWrittenInEachLayoutAsTheLabExpectsToTheByte) {
    struct Case {
        OrderLog log;
        int lines, size;
        const char* hash;
    };
    for (const auto& [log, lines, size, hash] : {Case{printOrder(Layout::Plain), 35, 900, "445c4828f7ea94f5"},
                                                 Case{printOrder(Layout::Edited), 28, 1220, "a9e4f5e707d207c7"},
                                                 Case{albumOrder(), 43, 1009, "a3802b20f664c2dc"}}) {
        const QByteArray bytes = log.write();
        EXPECT_EQ(bytes.count('\n'), lines);
        EXPECT_EQ(bytes.size(), size);
        EXPECT_EQ(QCryptographicHash::hash(bytes, QCryptographicHash::Sha256).toHex().left(16), hash)
            << bytes.constData();
    }
}

TEST(AnOrderLog, isReadBackWithAllThatWasWritten) {
    for (OrderLog log : {printOrder(Layout::Plain), printOrder(Layout::Edited), albumOrder()}) {
        log.shemot.Hearot = u"a \"gift\",\r\n\"Shoora\",1"_s;
        log.shemot.T1 = QDateTime(QDate(2026, 12, 1), QTime(0, 0));
        log.HitKasherDerech = u"modem"_s;
        log.KeSherLaSharat = 7;
        log.failed += u"C:\\pics\\תמונה.jpg"_s;
        OrderLog back;
        back.read(log.write());
        EXPECT_EQ(back.layout, log.layout);
        EXPECT_EQ(back.Optint, log.Optint);
        EXPECT_EQ(back.Hazmana, u"2026_11_21_KUP_1234^105"_s);
        EXPECT_EQ(back.Time, afternoon);
        EXPECT_EQ(back.failed, log.failed);
        EXPECT_EQ(back.countOfFailed.has_value(), log.layout != Layout::Edited);
        EXPECT_EQ(back.line(0).path, log.line(0).path);
        EXPECT_EQ(back.write().toStdString(), log.write().toStdString());
    }
}

} // namespace
} // namespace lumora
