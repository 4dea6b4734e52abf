#include "selection/pictures/kyoskNew.h"

#include "editing/editor/BigPics.h"
#include "editing/editor/tFrmNew.h"
#include "editing/render/StoredSmallView.h"
#include "imaging/files/PictureFile.h"
#include "order/EditRecord.h"
#include "session/Workspace.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

class ThePictures : public testing::Test, protected PageRig {
protected:
    ThePictures() {
        state.shemot.ppr = u"10/15"_s;
        state.shemot.maat = u"מבריק"_s;
        state.shemot.Bord = u"NB"_s;
        state.Optint = OrderKind::Print;
        registerPage<kyoskNew>(PageId::kyoskNew);
        registerBare({PageId::hatchala, PageId::Form2, PageId::B3});
        registerPage<tFrmNew>(PageId::tFrmNew);
        chain.registerPage(PageId::BigPics, [] { return std::make_unique<BigPics>(); });
        EXPECT_TRUE(Workspace(state, machine.files).MakeWorkspace());
    }

    tFrmNew& editor() { return chain.load<tFrmNew>(); }

    // count small pictures "01.jpg", ... in a folder; the folder is made.
    void makePictures(const DrivePath& folder, int count, PictureSize size = {40, 30}) {
        makeFolder(folder);
        for (int i = 1; i <= count; ++i) {
            const QString name = u"%1.jpg"_s.arg(i, 2, 10, QLatin1Char('0'));
            ASSERT_TRUE(saveJpeg(Bitmap(size.width, size.height, Qt::red), host(folder / name), 80));
        }
    }

    kyoskNew& open() {
        chain.show(PageId::kyoskNew);
        return *chain.find<kyoskNew>();
    }

    void pick(kyoskNew& page, const QString& picture) {
        machine.dialogs.picks += DrivePath(picture);
        page.Image5_Click();
    }

    // The page with a folder of so many pictures.
    kyoskNew& openWith(int count) {
        makePictures(u"C:\\p"_path, count);
        kyoskNew& page = open();
        pick(page, u"C:\\p\\01.jpg"_s);
        return page;
    }

    static int shownCells(const kyoskNew& page) {
        int shown = 0;
        for (const auto& cell : page.controls().Picture1)
            shown += cell.visible && !cell.bitmap.isNull() ? 1 : 0;
        return shown;
    }
};

const QString first = u"C:\\p\\01.jpg"_s;

TEST_F(ThePictures, areShownTwelveAtATimeAndTheLastOneAgain) {
    kyoskNew& page = openWith(13);
    EXPECT_EQ(page.controls().Picture2.guide.value(1), u"   אם לחצת על תמונה אז בחרת אותה ");
    EXPECT_EQ(page.controls().Label34.text, u"13"_s);
    EXPECT_EQ(page.controls().Label29.text, u"C:\\p"_s);
    for (const int shown : {12, 1, 1}) {
        EXPECT_EQ(page.controls().List2.count(), shown);
        EXPECT_EQ(shownCells(page), shown);
        page.Image16_Click();
    }
    page.Image15_Click();
    EXPECT_EQ(page.controls().List2.item(0), first);
    EXPECT_EQ(page.controls().Picture1[0].bitmap.width(), 115);
    EXPECT_EQ(page.controls().Label5[0].text, first);
}

TEST_F(ThePictures, stayAsTheyAreWhenTheDialogIsCancelled) {
    kyoskNew& page = openWith(13);
    page.Image5_Click();
    EXPECT_EQ(page.controls().List4.count(), 13);
    EXPECT_EQ(page.controls().List4.currentIndex(), 12);
    EXPECT_EQ(page.controls().List2.item(0), first);
    EXPECT_EQ(shownCells(page), 12);
    EXPECT_EQ(machine.dialogs.pickRequests.last(), u"בחר תמונה אחת בלבד |C:\\|Open"_s);
}

TEST_F(ThePictures, ofAPathOutsideTheCodePageAreRefusedInThreeLinesInPlainModesOnly) {
    kyoskNew& page = openWith(2);
    pick(page, u"C:\\?\\01.jpg"_s);
    EXPECT_EQ(machine.dialogs.messages,
              QStringList(u"File Coold not Be Rcognized\nPleas Rename Folder Name \nTo English"_s));
    EXPECT_EQ(page.controls().List4.count(), 2);
    EXPECT_TRUE(page.controls().Picture1[0].visible);
}

TEST_F(ThePictures, leaveACellEmptyForAFileThatCannotBeRead) {
    makePictures(u"C:\\p"_path, 3);
    ASSERT_TRUE(machine.files.writeWhole(u"C:\\p\\02.jpg"_path, "no picture"));
    kyoskNew& page = open();
    pick(page, first);
    EXPECT_EQ(shownCells(page), 2);
    EXPECT_TRUE(page.controls().Picture1[1].bitmap.isNull());

    page.Picture1_Click(0);
    const QString grade = page.controls().Label6.text;
    page.Picture1_Click(1);
    EXPECT_EQ(page.controls().List1.count(), 2);
    EXPECT_EQ(page.controls().Label6.text, grade);
}

TEST_F(ThePictures, areDrawnByTheLatestClickWhenClicksArriveMeanwhile) {
    kyoskNew& page = openWith(30);
    int pumps = 0;
    machine.pump.onPump = [&] {
        if (++pumps == 2)
            page.Image16_Click();
    };
    page.Image16_Click();
    EXPECT_EQ(page.controls().List2.item(0), u"C:\\p\\25.jpg"_s);
    EXPECT_EQ(page.controls().List2.count(), 6);
    EXPECT_EQ(shownCells(page), 6);
    EXPECT_EQ(pumps, 2);
}

TEST_F(ThePictures, areChosenCountedAndCancelledInTheirCells) {
    kyoskNew& page = openWith(3);
    const kyoskNewControls& shown = page.controls();
    page.Picture1_Click(2);
    page.Picture1_Click(0);
    page.Picture1_Click(5);
    page.Command12_Click(2);
    EXPECT_EQ(shown.List1.items(), QStringList({u"2 1015GNBC:\\p\\03.jpg"_s, u"1 1015GNBC:\\p\\01.jpg"_s}));
    EXPECT_EQ(shown.Label4[2].text, u"2"_s);
    EXPECT_EQ(shown.Label7.text, u"3"_s);
    EXPECT_TRUE(shown.Picture4[2].visible);
    EXPECT_FALSE(shown.Picture4[1].visible);
    page.Command13_Click(0);
    page.Command13_Click(0);
    page.Command13_Click(7);
    EXPECT_FALSE(shown.Picture4[0].visible);
    EXPECT_EQ(shown.Label7.text, u"2"_s);
    page.Command14_Click();
    EXPECT_EQ(shown.List2.items(), QStringList(u"C:\\p\\03.jpg"_s));
    EXPECT_EQ(shown.Label4[0].text, u"2"_s);
    page.Image8_Click();
    EXPECT_TRUE(shown.List1.isEmpty());
    EXPECT_EQ(shown.Label7.text, u"0"_s);
}

TEST_F(ThePictures, ofAnEditedOrderKeepTheirEditsWhenTheyAreChosenAnew) {
    state.Optint = OrderKind::EditedPrint;
    kyoskNew& page = openWith(3);
    page.Picture1_Click(0);
    EXPECT_EQ(page.controls().Picture2.guide.value(1), u"   אם לחצת על תמונה אז היא נפתחת לעריכה ");
    page.Command12_Click(0);
    page.Picture1_Click(1);
    // What the editor stores of the first picture.
    QString record = EditRecord::newPicture();
    record.replace(15, 3, u"130"_s).replace(38, 3, u"RED"_s);
    state.edit.EditState = record;
    state.edit.PicturePath = DrivePath(first);
    page.ZZvvA_Click();
    const QStringList lines = page.controls().List1.items();
    EXPECT_EQ(lines.first(), u"2 1015GNB"_s + record + first);
    const Result<QByteArray> all = machine.files.read(u"C:\\2000lumora\\Tik4txt\\all_list.txt"_path);
    const Result<QByteArray> one = machine.files.read(u"C:\\2000lumora\\Tik4txt\\00onepic.txt"_path);
    ASSERT_TRUE(all && one);
    EXPECT_EQ(*all, (lines.join(u"\r\n"_s) + u"\r\n"_s).toLatin1());
    EXPECT_EQ(*one, (lines.first() + u"\r\n"_s).toLatin1());
    state.edit.PicturePath = u"C:\\p\\02.jpg"_path;
    page.Picture1_Click(0);
    EXPECT_EQ(state.edit.ZoomPercent, 130);
    EXPECT_EQ(state.edit.TempRedName, u"C;]p]01.jpg"_s);
    EXPECT_EQ(page.controls().List1.item(0).left(9), u"2 1015GNB"_s);
}

TEST_F(ThePictures, areGradedLargeAndTurnInFourClicks) {
    makePictures(u"C:\\q"_path, 1, {1000, 800});
    kyoskNew& page = openWith(1);
    page.Picture1_Click(0);
    EXPECT_EQ(page.controls().Label6.text, u"  איכות נמוכה מאוד  30 / 40"_s);
    EXPECT_TRUE(page.controls().Picture2.poor);
    EXPECT_EQ(page.controls().Picture2.bitmap.width(), 400);
    for (const int width : {300, 400, 300, 400}) {
        page.Image4_Click();
        EXPECT_EQ(page.controls().Picture2.bitmap.width(), width);
        EXPECT_EQ(page.controls().Picture2.bitmap.height(), 700 - width);
    }
    // At exactly 800000 pixels the text of the picture before stays, and no warning is painted.
    pick(page, u"C:\\q\\01.jpg"_s);
    page.Picture1_Click(1);
    EXPECT_EQ(page.controls().Label1.text, u"C:\\q\\01.jpg"_s);
    EXPECT_EQ(page.controls().Label6.text, u"  איכות נמוכה מאוד  30 / 40"_s);
    EXPECT_FALSE(page.controls().Picture2.poor);
}

TEST_F(ThePictures, ofAWholeFolderAreSentOnRequestAndTakenBack) {
    state.Optint = OrderKind::Sequence;
    kyoskNew& page = openWith(14);
    ASSERT_TRUE(page.controls().Picture66.visible);
    page.Command26_Click(0);
    EXPECT_EQ(page.controls().Label7.text, u"14"_s);
    EXPECT_EQ(page.controls().List2.item(0), first);
    EXPECT_TRUE(page.controls().Picture4[11].visible);

    page.Command23_Click();
    EXPECT_TRUE(page.controls().List1.isEmpty());
    EXPECT_TRUE(page.controls().List4.isEmpty());
    EXPECT_EQ(page.controls().Label7.text, u"0"_s);
    EXPECT_FALSE(page.controls().Frame1.visible);
    EXPECT_EQ(shownCells(page), 0);
    pick(page, first);
    EXPECT_TRUE(page.controls().Frame1.visible);
    EXPECT_EQ(shownCells(page), 12);
}

TEST_F(ThePictures, ofAnAlbumHaveAFinishOfTheirOwnUntilTheWholeFolderIsTaken) {
    state.Optint = OrderKind::Album;
    state.shemot.ppr = u"30/60"_s;
    state.shemot.maat = u"M"_s;
    state.album.MailZalam = u"studio@example.com"_s;
    kyoskNew& page = openWith(3);
    ASSERT_TRUE(page.controls().Picture66.visible);
    EXPECT_TRUE(page.controls().Image13.visible);
    EXPECT_FALSE(page.controls().Image7.visible);
    page.Image13_Click();
    EXPECT_EQ(machine.dialogs.messages, QStringList(u"לא נבחרו תמונות"_s));
    EXPECT_EQ(page.controls().Txt4Ml2.text, u"studio@example.com"_s);
    page.Command24_Click();
    EXPECT_FALSE(page.controls().Image13.visible);
    EXPECT_TRUE(page.controls().Image7.visible) << "there is always a way to finish";
    page.Image7_Click();
    page.Txt4Ml2_Change(u"other@example.com"_s);
    page.Command8_Click();
    EXPECT_EQ(chain.front()->id(), PageId::Form2);
    EXPECT_EQ(state.shemot.Mail, u"other@example.com"_s);
    EXPECT_EQ(state.DchisaAmoka, 1);
    EXPECT_TRUE(state.handOver.pressStart);
    EXPECT_EQ(state.handOver.lines.value(0), u"1 3060MNB"_s + first);
}

TEST_F(ThePictures, thatTheEditorChangedShowTheirStoredViewUntilTheyAreChosenAnew) {
    state.Optint = OrderKind::EditedPrint;
    kyoskNew& page = openWith(3);
    page.Picture1_Click(0);
    EXPECT_EQ(chain.front(), &editor());
    EXPECT_EQ(page.openCell(), 0);
    EXPECT_EQ(page.controls().List1.item(0).mid(9 + 12, 14), u"180100225 150 "_s);
    editor().Image4_Click(); // grey
    editor().CommandDone_Click();
    EXPECT_EQ(chain.front(), &page);
    ASSERT_TRUE(machine.files.fileExists(StoredSmallView::path(state, DrivePath(first))));
    const auto redAt = [&](std::size_t cell) {
        return page.controls().Picture1[cell].bitmap.image().pixelColor(50, 30).red();
    };
    EXPECT_LT(redAt(0), 100);
    EXPECT_GT(redAt(1), 200);
    page.Picture1_Click(1);
    EXPECT_EQ(page.openCell(), 1);
    page.Image15_Click();
    EXPECT_LT(redAt(0), 100);
    EXPECT_GT(redAt(1), 200);

    // Taken out of the basket it shows as its file is, and so it stays when it is chosen anew.
    page.Command13_Click(0);
    EXPECT_GT(redAt(0), 200);
    page.Picture1_Click(0);
    EXPECT_FALSE(machine.files.fileExists(StoredSmallView::path(state, DrivePath(first))));
    EXPECT_GT(redAt(0), 200);
    page.Command13_Click(0);
    EXPECT_EQ(page.openCell(), -1);
}

TEST_F(ThePictures, areLeftWithAllThatWasSeenInTheirRecord) {
    state.Optint = OrderKind::EditedPrint;
    kyoskNew& page = openWith(2);
    const auto field = [&page](EditRecord::Column column) {
        return page.controls().List1.item(0).mid(9 + column.position - 1, column.width);
    };
    // A second finger on another picture while the zoom is still held.
    page.Picture1_Click(0);
    editor().Image2_MouseDown(0);
    editor().Timer2_Tick();
    page.Picture1_Click(1);
    EXPECT_EQ(field(EditRecord::ZoomPercent), u"102"_s);
    EXPECT_EQ(state.edit.ZoomPercent, 100);

    // Another picture that comes while the release of the zoom lets events through.
    page.Picture1_Click(0);
    editor().Image2_MouseDown(0);
    editor().Timer2_Tick();
    machine.pump.onPump = [&] {
        machine.pump.onPump = nullptr;
        page.Picture1_Click(1);
    };
    editor().Image2_MouseUp(0);
    EXPECT_EQ(field(EditRecord::ZoomPercent), u"104"_s);
    EXPECT_EQ(page.controls().List1.item(1).mid(9 + 15, 3), u"100"_s);

    // A caption that was dragged, which does not pack by itself.
    page.Picture1_Click(0);
    state.edit.TextOn = 1;
    state.edit.TextBody = u"abc"_s;
    editor().Command11_Click();
    editor().Labeltext_MouseDown({0, 0});
    editor().Labeltext_MouseMove({130, 260});
    editor().Labeltext_MouseUp();
    EXPECT_EQ(field(EditRecord::TextX), u"0  "_s);
    editor().CommandDone_Click();
    EXPECT_EQ(field(EditRecord::TextX), u"10 "_s);
    EXPECT_EQ(field(EditRecord::TextY), u"20 "_s);
}

TEST_F(ThePictures, thatCannotBeOpenedForEditingStayInTheBasketAsTheyAre) {
    state.Optint = OrderKind::EditedPrint;
    kyoskNew& page = openWith(2);
    ASSERT_TRUE(machine.files.writeWhole(DrivePath(first), "no picture"));
    page.Picture1_Click(0);
    EXPECT_EQ(chain.front(), &page);
    EXPECT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_EQ(page.controls().List1.item(0), u"1 1015GNB"_s + EditRecord::newPicture() + first);
    page.Picture1_Click(1);
    EXPECT_EQ(chain.front(), &editor());
    EXPECT_FALSE(machine.files.fileExists(StoredSmallView::path(state, DrivePath(first))));
}

TEST_F(ThePictures, takeTheEditorWithThemWhenTheyGo) {
    state.Optint = OrderKind::EditedPrint;
    state.shemot.ppr = u"30/45"_s;
    state.MediniyutDchisa = 1;
    kyoskNew& page = openWith(1);
    page.Picture1_Click(0);
    editor().Image15_Click();
    editor().Image2_MouseDown(0);
    editor().Timer2_Tick(); // still held, and the editor not left
    page.Image7_Click();
    EXPECT_FALSE(page.controls().Picture7.visible) << "deep compression is asked for plain orders only";
    page.Command7_Click();
    ASSERT_EQ(chain.front()->id(), PageId::B3);
    EXPECT_EQ(state.handOver.lines.value(0).mid(9 + 12, 6), u"270102"_s);
    EXPECT_TRUE(machine.files.fileExists(StoredSmallView::path(state, DrivePath(first))));
    EXPECT_EQ(chain.find(PageId::tFrmNew), nullptr);
    EXPECT_EQ(chain.find(PageId::BigPics), nullptr);
    // A further order begins without the record of this one.
    chain.show(PageId::kyoskNew);
    EXPECT_EQ(state.edit.RotationCode, 180);
}

TEST_F(ThePictures, areHandedOverOnceWithAddressAndNote) {
    kyoskNew& page = openWith(2);
    page.Picture1_Click(0);
    page.Picture1_Click(1);
    page.Command12_Click(1);
    page.Image7_Click();
    EXPECT_TRUE(page.controls().Frame4.visible);
    EXPECT_FALSE(page.controls().Pic4snifim.visible);
    EXPECT_EQ(page.controls().Combo1.text, u"בחר או הקלד"_s);
    EXPECT_EQ(page.controls().Label19.text, u"10/15"_s);
    EXPECT_EQ(page.controls().Label20.text, u"3"_s);
    page.Text1_Change(u"dana"_s);
    page.Combo1_Change(u"example.com"_s);
    page.Text2_Change(u"gift"_s);
    int handOvers = 0;
    QObject::connect(&chain, &PageChain::shown, [&](Page* shown) { handOvers += shown->id() == PageId::Form2; });
    machine.pump.onPump = [&] { page.Command8_Click(); }; // an impatient second press
    page.Command8_Click();
    EXPECT_EQ(handOvers, 1);
    EXPECT_EQ(chain.front()->id(), PageId::Form2);
    EXPECT_EQ(chain.find(PageId::kyoskNew), nullptr);
    EXPECT_EQ(state.handOver.lines, QStringList({u"1 1015GNBC:\\p\\01.jpg"_s, u"2 1015GNBC:\\p\\02.jpg"_s}));
    EXPECT_TRUE(state.handOver.pressStart);
    EXPECT_EQ(state.shemot.Mail, u"dana@example.com"_s);
    EXPECT_EQ(state.shemot.Hearot, u"gift - "_s);
}

TEST_F(ThePictures, goOnWithoutAnAddressOrBackToTheChoice) {
    kyoskNew& page = openWith(1);
    page.Image7_Click();
    EXPECT_EQ(machine.dialogs.messages, QStringList(u"לא נבחרו תמונות"_s));
    EXPECT_FALSE(page.controls().Frame4.visible);
    page.Picture1_Click(0);
    page.Image7_Click();
    page.Command10_Click();
    EXPECT_FALSE(page.controls().Frame4.visible);
    EXPECT_EQ(page.controls().List1.count(), 1);
    page.Image7_Click();
    page.Command7_Click();
    EXPECT_EQ(state.shemot.Mail, u"לא הוקלד"_s);
    EXPECT_EQ(state.shemot.Hearot, u" - "_s);
    EXPECT_EQ(chain.front()->id(), PageId::Form2);
}

TEST_F(ThePictures, ofACouponMustMatchItAndTellTheBranch) {
    state.coupon.HaKoopon = 1;
    state.coupon.MisparKoopon = 2;
    state.profile.Branches[3] = {u"חיפה"_s, u"סניף חיפה"_s, {u"הנביאים 1"_s, {}}, u"04-1"_s};
    kyoskNew& page = openWith(1);
    page.Picture1_Click(0);
    page.Image7_Click();
    EXPECT_FALSE(page.controls().Pic4snifim.visible);
    page.Command12_Click(0);
    page.Command12_Click(0);
    page.Image7_Click();
    EXPECT_FALSE(page.controls().Frame4.visible);
    EXPECT_EQ(machine.dialogs.messages,
              QStringList({u"עליך לבחור תמונות לא פחות מהכמות שרכשת בקופון\nלא תתקבלנה הזמנות שאינן במלואן"_s,
                           u"חרגת מכמות התמונות שרכשת בקופון\nעליך לבטל בחירה של חלק מהתמונות"_s}));
    EXPECT_EQ(page.controls().Label7.text, u"3"_s) << "a refusal leaves the basket whole";
    page.Command13_Click(0);
    page.Image7_Click();
    EXPECT_TRUE(page.controls().Frame4.visible);
    EXPECT_TRUE(page.controls().Pic4snifim.visible);
    page.Command4Snif_MouseMove(3);
    EXPECT_EQ(page.controls().Label41.text, u"סניף חיפה\nהנביאים 1\n04-1"_s);
    page.Command4Snif_MouseMove(11);
    EXPECT_EQ(page.controls().Label41.text, QString());
    page.Command4Snif_MouseMove(10);
    EXPECT_EQ(page.controls().Label41.text, page.controls().Command4Snif[10].text) << "home delivery has no address";
    page.Command4Snif_Click(3);
    EXPECT_FALSE(page.controls().Pic4snifim.visible);
    page.Image7_Click();
    page.Command28_Click();
    page.Command8_Click();
    EXPECT_EQ(state.shemot.Hearot, u" - חיפה"_s);
}

TEST_F(ThePictures, areNotLeftWithoutAQuestionOnceSomeAreChosen) {
    kyoskNew& page = openWith(1);
    page.Picture1_Click(0);
    page.Image10_Click();
    EXPECT_TRUE(page.controls().Frame3.visible);
    EXPECT_FALSE(chain.hasEnded());
    page.Command4_Click();
    EXPECT_FALSE(page.controls().Frame3.visible);
    page.Command13_Click(0);
    page.Image10_Click();
    EXPECT_TRUE(chain.hasEnded());
}

} // namespace
} // namespace lumora
