#include "order/OrderLog.h"

#include "common/AnsiCodePage.h"
#include "order/EditRecord.h"
#include "support/ExampleOrder.h"

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

// The lines as the lab expects them, each behind a bar.
TEST(AnOrderLog, isWrittenInEachLayoutAsTheLabExpects) {
    const QString moment = uR"("Time",#2026-11-21 14:05:09#|"Hazmana","2026_11_21_KUP_1234^105"|)"_s;
    const QString details =
        uR"("Shemot.ser","1234"|"Shemot.n1","Dana Levi"|"Shemot.n2","03-1234567"|"Shemot.n3",""|"Shemot.n4",""|)"
        uR"("Shemot.TotalPics",13|"Shemot.Mail","dana@example.com"|"Shemot.TimeOfJob","2026_11_21_KUP_1234^"|)"
        uR"("Shemot.Hearot","gift - "|"Shemot.ppr","10/15"|"Shemot.T1",#1899-12-30#|"Shemot.Bord","NB"|)"
        uR"("Shemot.maat","מבריק"|"Shemot.FillFit","FIT"|)"_s;
    const QString server = uR"("KeSherLaSharat","0"|"HitKasherDerech",""|"TaooyotBaHaShvaa",0|)"
                           uR"("------------","---------"|)"_s;
    const QString stars = uR"("***","*********************************************"|)"_s;
    const QString end = uR"(" "|"-----------End","Of Failed List-------------"|" "|)"
                        uR"("-----------","------------------------------"|" "|)"_s;
    const QString record = u"1   1   1   180100999 999 "_s + QString(18, u'0') + QString(156, u' ');
    const auto pictures = [](const QString& edits) {
        return uR"("Shoora","121015GNB%1C:\pics\IMG_0012.jpg"|"Shoora","1 1015GNB%1C:\pics\IMG_0013.jpg"|)"_s.arg(
            edits);
    };
    const std::pair<OrderLog, QString> cases[] = {
        {printOrder(Layout::Plain), uR"("00","00"|)"_s + server + uR"("Shemot.Girsa","4.00"|)"_s + moment +
                                        uR"("Optint",1|)"_s + details + uR"("More Comp = ",0|)"_s + stars +
                                        uR"("-----------Total Failed","1-----------"|" "|)"
                                        uR"("fail_","C:\pics\IMG_0013.jpg"|)"_s +
                                        end + pictures({})},
        {printOrder(Layout::Edited),
         uR"("KeSherLaSharat = ","0"|"HitKasherDerech = ",""|"TaooyotBaHaShvaa = ",0|"00","00"|)"
         uR"("Shemot.Girsa","4.00"|)"_s +
             moment + uR"("Option","5"|)"_s + details + stars +
             uR"("***","****    Failed    ***************************"|"Failed  ","C:\pics\IMG_0013.jpg"|)"_s + stars +
             pictures(record)},
        {albumOrder(),
         uR"("00","00"|"00","00"|)"_s + server + uR"("Girsa","4.00"|)"_s + moment +
             uR"("Optint",10|"ser","1234"|"TotalPics",3|"GodelLBM","30/60"|"Hearot",""|"MailZalam","studio@example.com"|)"
             uR"("ShemErooa","Wedding"|"ShemZalam","סטודיו אור"|"SoogKricha","חום"|"SoogLBM","פוטו גדול"|)"
             uR"("SoogNiar","בחר סוג נייר"|"Tosafot1_1","קנבס"|"Tosafot1_2",""|"Tosafot1_3",""|"Tosafot1_4",""|)"
             uR"("Tosafot2_1","עוד=0"|"Tosafot2_2","הטבעת שם בכריכה=0"|"Tosafot2_3","פינות עגולות=1"|)"
             uR"("Tosafot2_4","מזוודה=0"|"Tosafot2_5","סובלימציה=0"|"Tosafot2_6","פתיחה אנגלית=0"|)"
             uR"("Tosafot2_7",""|"Tosafot2_8",""|"More Comp = ",1|)"_s +
             stars + uR"("-----------Total Failed","0-----------"|" "|)"_s + end +
             uR"("Shoora","2 3060MNBC:\pics\one.jpg"|"Shoora","1 3060MNBC:\pics\two.jpg"|)"_s}};
    for (const auto& [log, lines] : cases)
        EXPECT_EQ(AnsiCodePage::decode(log.write()).replace(u"\r\n"_s, u"|"_s).toStdString(), lines.toStdString());
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
