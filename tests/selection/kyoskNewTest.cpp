#include "ThePage.h"

#include "editing/caption/mikledet.h"
#include "editing/render/StoredSmallView.h"
#include "order/BasketLine.h"
#include "order/EditRecord.h"

namespace lumora {
namespace {

class ThePictures : public ThePage {
protected:
    tFrmNew& editor() { return chain.load<tFrmNew>(); }

    // count small pictures "01.jpg", ... in a folder; the folder is made.
    void makePictures(const DrivePath& folder, int count, PictureSize size = {40, 30}) {
        makeFolder(folder);
        for (int i = 1; i <= count; ++i) {
            const QString name = u"%1.jpg"_s.arg(i, 2, 10, QLatin1Char('0'));
            ASSERT_TRUE(saveJpeg(Bitmap(size.width, size.height, Qt::red), host(folder / name), 80));
        }
    }

    // The page with a folder of so many pictures.
    kyoskNew& openWith(int count) {
        makePictures(u"C:\\p"_path, count);
        kyoskNew& page = open();
        pick(page, u"C:\\p\\01.jpg"_s);
        return page;
    }

    // Of the record in a line of the basket.
    static QString field(const QString& line, EditRecord::Column column) {
        return BasketLine::split(line, LineForm::Full).editState.mid(column.position - 1, column.width);
    }
    static QString field(const kyoskNew& page, int line, EditRecord::Column column) {
        return field(page.controls().List1.item(line), column);
    }
    static int shownCells(const kyoskNew& page) {
        int shown = 0;
        for (const auto& cell : page.controls().Picture1)
            shown += cell.visible && !cell.bitmap.isNull() ? 1 : 0;
        return shown;
    }
};

const QString first = u"C:\\p\\01.jpg"_s;

TEST_F(ThePictures, areShownTwelveAtATimeAndStayWhenTheDialogIsCancelled) {
    kyoskNew& page = openWith(13);
    const kyoskNewControls& shown = page.controls();
    page.Image5_Click();
    EXPECT_EQ(machine.dialogs.pickRequests.last(), u"בחר תמונה אחת בלבד |C:\\|Open"_s);
    EXPECT_EQ(shown.Label34.text + shown.Label29.text, u"13C:\\p"_s);
    EXPECT_EQ(shownCells(page), 12);
    page.Picture1_Click(2);
    page.Command12_Click(2);
    page.Command14_Click(); // the chosen alone
    EXPECT_EQ(shown.List2.items(), QStringList(u"C:\\p\\03.jpg"_s));
    EXPECT_EQ(shown.Label4[0].text, u"2"_s);
    page.Command23_Click(); // the whole choice is taken back
    EXPECT_TRUE(shown.List1.isEmpty() && shown.List4.isEmpty());
    EXPECT_EQ(shownCells(page), 0);
    pick(page, first);
    EXPECT_EQ(shownCells(page), 12);
    page.Image10_Click();
    EXPECT_TRUE(chain.hasEnded()) << "nothing is lost";
}

TEST_F(ThePictures, ofAPathOutsideTheCodePageAreRefusedInThreeLines) {
    kyoskNew& page = openWith(2);
    int refused = 0;
    for (const auto& [careful, picture, taken] : {std::tuple(false, u"C:\\?\\01.jpg"_s, false),
                                                  {false, u"C:\\p\\caf?.jpg"_s, false},
                                                  {true, u"C:\\?\\01.jpg"_s, false},
                                                  {true, u"C:\\p\\caf?.jpg"_s, true}}) {
        state.Careful = careful;
        pick(page, picture);
        EXPECT_EQ(page.controls().List4.count(), taken ? 4 : 2) << "picked again";
        EXPECT_EQ(machine.dialogs.messages.size(), refused += taken ? 0 : 1);
        EXPECT_TRUE(page.controls().Picture1[0].visible);
    }
    EXPECT_EQ(machine.dialogs.messages.last(), u"File Coold not Be Rcognized\nPleas Rename Folder Name \nTo English"_s);
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
    EXPECT_EQ(page.controls().resolution[0].text, u"5 dpi"_s) << "at the zoom of the record";
    const QStringList lines = page.controls().List1.items();
    EXPECT_EQ(lines.first(), u"2 1015GNB"_s + record + first);
    const QByteArray all = take(machine.files.read(u"C:\\2000lumora\\Tik4txt\\all_list.txt"_path));
    const QByteArray one = take(machine.files.read(u"C:\\2000lumora\\Tik4txt\\00onepic.txt"_path));
    EXPECT_EQ(all, (lines.join(u"\r\n"_s) + u"\r\n"_s).toLatin1());
    EXPECT_EQ(one, (lines.first() + u"\r\n"_s).toLatin1());
    state.edit.PicturePath = u"C:\\p\\02.jpg"_path;
    page.Picture1_Click(0);
    EXPECT_EQ(state.edit.ZoomPercent, 130);
    // A held button of the caption's keyboard changes the line at each step, and writes the files when it is let go.
    registerPage<mikledet>(PageId::mikledet);
    editor().Command8_Click();
    auto& keys = *chain.find<mikledet>();
    const DrivePath file = u"C:\\2000lumora\\Tik4txt\\all_list.txt"_path;
    ASSERT_TRUE(machine.files.removeFile(file));
    keys.Image15_MouseDown(1);
    keys.Timer1_Tick();
    EXPECT_EQ(field(page, 0, EditRecord::TextX), u"102"_s);
    EXPECT_FALSE(machine.files.fileExists(file));
    keys.Image15_MouseUp();
    EXPECT_TRUE(machine.files.fileExists(file));
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
    const auto paper = [&page] { return page.controls().Picture2.paper; };
    EXPECT_NEAR(paper().height(), 8 / 9.0, 1e-9) << "10/15 is longer than the picture";
    EXPECT_EQ(page.controls().resolution[0].text + page.controls().largeResolution.text,
              u"6 dpi6 dpi בגודל 10/15: מפוקסלת"_s);
    for (const int width : {300, 400, 300, 400}) {
        page.Image4_Click();
        EXPECT_NEAR(width == 300 ? paper().width() : paper().height(), 8 / 9.0, 1e-9) << "turned with the picture";
        EXPECT_EQ(page.controls().Picture2.bitmap.image().size(), QSize(width, 700 - width));
    }
    // At exactly 800000 pixels the text of the picture before stays, and no warning is painted.
    pick(page, u"C:\\q\\01.jpg"_s);
    page.Picture1_Click(1);
    EXPECT_EQ(page.controls().Label1.text, u"C:\\q\\01.jpg"_s);
    EXPECT_EQ(page.controls().Label6.text, u"  איכות נמוכה מאוד  30 / 40"_s);
    EXPECT_FALSE(page.controls().Picture2.poor);
}

TEST_F(ThePictures, thatWillPrintCoarseAreToldOfAndShownTwelveAtATimeBeforeTheyAreSent) {
    makePictures(u"C:\\q"_path, 1, {1000, 700});
    kyoskNew& page = openWith(14);
    const kyoskNewControls& shown = page.controls();
    ASSERT_TRUE(saveJpeg(Bitmap(30, 40, Qt::red), host(u"C:\\p\\13.jpg"_path), 80)); // upright
    pick(page, u"C:\\q\\01.jpg"_s);
    page.Command24_Click();
    for (const auto& [cells, path] : {std::pair(12, first), {2, u"C:\\p\\13.jpg"_s}, {12, first}}) {
        page.Image7_Click();
        EXPECT_EQ(shown.coarseNote.text, u"14 תמונות יצאו מפוקסלות בגודל 10/15"_s);
        page.showCoarse_Click();
        EXPECT_FALSE(shown.Frame4.visible);
        EXPECT_EQ(shown.List2.count(), cells);
        EXPECT_EQ(shown.Label2.text, path) << "in hand";
        EXPECT_EQ(shown.Picture2.bitmap.height() > shown.Picture2.bitmap.width(), cells == 2) << "and in large";
    }
    for (const int cells : {12, 2}) {
        for (int cell = 0; cell < cells; ++cell)
            page.Command13_Click(cell);
        page.Image7_Click();
        EXPECT_EQ(shown.coarseNote.visible, cells == 12);
        page.showCoarse_Click();
    }
}

TEST_F(ThePictures, ofAnAlbumHaveAFinishOfTheirOwnUntilTheWholeFolderIsTaken) {
    state.Optint = OrderKind::Album;
    state.shemot.ppr = u"30/60"_s;
    state.shemot.maat = u"M"_s;
    state.album.MailZalam = u"studio@example.com"_s;
    kyoskNew& page = openWith(3);
    EXPECT_TRUE(page.controls().Image13.visible && !page.controls().Image7.visible);
    page.Image13_Click();
    EXPECT_EQ(machine.dialogs.messages, QStringList(u"לא נבחרו תמונות"_s));
    page.Command24_Click();
    EXPECT_FALSE(page.controls().resolution[0].visible) << "the photographer lays out an album";
    EXPECT_TRUE(!page.controls().Image13.visible && page.controls().Image7.visible)
        << "there is always a way to finish";
    state.coupon.HaKoopon = 1;
    state.coupon.MisparKoopon = 9; // of a size that an earlier customer chose
    for (const bool careful : {false, true}) {
        state.Careful = careful;
        page.Image7_Click();
        EXPECT_EQ(page.controls().Frame4.visible, careful);
    }
    for (const bool deep : {false, true}) {
        state.DchisatAlbum = deep;
        page.Image7_Click();
        EXPECT_EQ(state.DchisaAmoka, deep ? 1 : 0);
    }
    page.Txt4Ml2_Change(u"other@example.com"_s);
    page.Command8_Click();
    EXPECT_EQ(chain.front()->id(), PageId::Form2);
    EXPECT_EQ(state.shemot.Mail + state.album.MailZalam, u"other@example.comother@example.com"_s);
    EXPECT_TRUE(state.handOver.pressStart);
    EXPECT_EQ(state.handOver.lines.value(0), u"1 3060MNB"_s + first);
}

TEST_F(ThePictures, thatTheEditorChangedShowTheirStoredViewUntilTheyAreChosenAnew) {
    state.Optint = OrderKind::EditedPrint;
    kyoskNew& page = openWith(3);
    page.Picture1_Click(0);
    EXPECT_EQ(chain.front(), &editor());
    EXPECT_EQ(page.openCell(), 0);
    EXPECT_EQ(field(page, 0, EditRecord::ZoomPercent) + field(page, 0, EditRecord::PanX) +
                  field(page, 0, EditRecord::PanY),
              u"100225 150 "_s);
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
    // A second finger on another picture while the zoom is still held.
    page.Picture1_Click(0);
    editor().Image2_MouseDown(0);
    editor().Timer2_Tick();
    page.Picture1_Click(1);
    EXPECT_EQ(field(page, 0, EditRecord::ZoomPercent), u"102"_s);
    EXPECT_EQ(state.edit.ZoomPercent, 100);

    // Another picture that comes while the release of the zoom lets events through.
    page.Picture1_Click(0);
    editor().Image2_MouseDown(0);
    editor().Timer2_Tick();
    machine.pump.onPump = [&] { page.Picture1_Click(1); };
    editor().Image2_MouseUp(0);
    machine.pump.onPump = nullptr;
    EXPECT_EQ(field(page, 0, EditRecord::ZoomPercent) + field(page, 1, EditRecord::ZoomPercent), u"104100"_s);

    // A caption that was dragged, which does not pack by itself.
    page.Picture1_Click(0);
    state.edit.TextOn = 1;
    state.edit.TextBody = u"abc"_s;
    editor().Command11_Click();
    editor().Labeltext_MouseDown({0, 0});
    editor().Labeltext_MouseMove({130, 260});
    editor().Labeltext_MouseUp();
    EXPECT_EQ(field(page, 0, EditRecord::TextX), u"0  "_s);
    editor().CommandDone_Click();
    EXPECT_EQ(field(page, 0, EditRecord::TextX) + field(page, 0, EditRecord::TextY), u"10 20 "_s);
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
    page.Command4Safa_Click();
    EXPECT_EQ(editor().controls().Image13.text, u"Tones"_s);
    page.Image7_Click();
    EXPECT_FALSE(page.controls().Picture7.visible) << "deep compression is asked for plain orders only";
    page.Command7_Click();
    ASSERT_EQ(chain.front()->id(), PageId::B3);
    const QString line = state.handOver.lines.value(0);
    EXPECT_EQ(field(line, EditRecord::RotationCode) + field(line, EditRecord::ZoomPercent), u"270102"_s);
    EXPECT_TRUE(machine.files.fileExists(StoredSmallView::path(state, DrivePath(first))));
    EXPECT_EQ(chain.find(PageId::tFrmNew), nullptr);
    EXPECT_EQ(chain.find(PageId::BigPics), nullptr);
    // A further order begins without the record of this one.
    chain.show(PageId::kyoskNew);
    EXPECT_EQ(state.edit.RotationCode, 180);
}

TEST_F(ThePictures, stayChosenOnAnotherPaper) {
    for (const OrderKind kind : {OrderKind::Print, OrderKind::EditedPrint, OrderKind::Album}) {
        chain.unload(PageId::kyoskNew);
        chain.unload(PageId::tFrmNew);
        state.Optint = kind;
        state.shemot.ppr = u"10/15"_s;
        registerBare({PageId::nnn});
        const bool edited = kind == OrderKind::EditedPrint;
        kyoskNew& page = openWith(2);
        page.Picture1_Click(0);
        if (edited) {
            editor().Image15_Click();
            editor().CommandDone_Click();
            ASSERT_TRUE(machine.files.fileExists(StoredSmallView::path(state, DrivePath(first))));
        }
        const QString line = page.controls().List1.item(0);
        state.DchisaAmoka = 1;
        page.changeDetails_Click();
        ASSERT_EQ(chain.front()->id(), PageId::nnn);
        state.shemot.ppr = u"20/20"_s;
        state.MediniyutDchisa = 1;
        chain.follow(PageId::nnn, Outcome::PicturesWanted);
        ASSERT_EQ(chain.front(), &page);
        EXPECT_EQ(page.controls().List1.item(0).left(9), u"1 2020GNB"_s);
        EXPECT_EQ(page.controls().Label15.text, u"20/20"_s);
        EXPECT_EQ(state.DchisaAmoka, 0) << "what was answered was about another paper";
        if (!edited)
            continue;
        EXPECT_EQ(field(page, 0, EditRecord::RotationCode), field(line, EditRecord::RotationCode));
        EXPECT_FALSE(machine.files.fileExists(StoredSmallView::path(state, DrivePath(first))))
            << "it has the old shape";
        page.Picture1_Click(0);
        EXPECT_EQ(editor().controls().PicPic.height(), editor().controls().PicPic.width());
    }
}

TEST_F(ThePictures, areHandedOverOnceWithAddressAndNote) {
    kyoskNew& page = openWith(2);
    page.Image7_Click();
    EXPECT_EQ(machine.dialogs.messages, QStringList(u"לא נבחרו תמונות"_s));
    page.Picture1_Click(0);
    page.Picture1_Click(1);
    page.Command12_Click(1);
    page.Image7_Click();
    EXPECT_EQ(page.controls().Label19.text + page.controls().Label20.text, u"10/153"_s);
    page.Text1_Change(u"dana"_s);
    EXPECT_EQ(page.controls().Label33Word.text, u"אפשר להמשיך גם בלעדיו"_s) << "half an address";
    page.Combo1_Change(u"example.com"_s);
    page.Text2_Change(u"gift"_s);
    page.Command4Safa_Click(); // to English, with all that was chosen and typed
    EXPECT_EQ(page.controls().Label33Word.text, u"✓ filled in"_s);
    int handOvers = 0;
    QObject::connect(&chain, &PageChain::shown, [&](Page* shown) { handOvers += shown->id() == PageId::Form2; });
    machine.pump.onPump = [&] { page.Command8_Click(); }; // an impatient second press
    page.Command8_Click();
    EXPECT_EQ(handOvers, 1);
    EXPECT_EQ(chain.find(PageId::kyoskNew), nullptr);
    EXPECT_EQ(state.handOver.lines, QStringList({u"1 1015GNBC:\\p\\01.jpg"_s, u"2 1015GNBC:\\p\\02.jpg"_s}));
    EXPECT_TRUE(state.handOver.pressStart);
    EXPECT_EQ(state.shemot.Mail + u'|' + state.shemot.Hearot, u"dana@example.com|gift - "_s);
}

TEST_F(ThePictures, askInTheClosingPanelForWhatTheLabWants) {
    const struct {
        QString paper;
        int policy;
        bool optionalMail, station, deep, asksForDepth, asksForAddress, mustHaveOne;
    } cases[] = {{u"30/45"_s, 2, false, false, true, false, true, true},
                 {u"50/70"_s, 1, true, false, false, true, true, false},
                 {u"20/30"_s, 1, true, true, false, false, false, false},
                 {u"zz/zz"_s, 2, false, true, false, false, false, false},
                 {u"30/45"_s, 0, false, true, false, false, false, false}};
    for (const auto& c : cases) {
        state.shemot.ppr = c.paper;
        state.MediniyutDchisa = static_cast<std::int16_t>(c.policy);
        state.DoarReshut = c.optionalMail;
        state.TachanaMekomit = c.station;
        kyoskNew& page = openWith(1);
        page.Picture1_Click(0);
        page.Image7_Click();
        const kyoskNewControls& shown = page.controls();
        EXPECT_EQ(shown.Picture7.visible, c.asksForDepth) << c.policy;
        EXPECT_EQ(state.DchisaAmoka, c.deep ? 1 : 0);
        EXPECT_EQ(shown.Text1.visible, c.asksForAddress) << c.policy;
        EXPECT_EQ(shown.Label33.visible, c.mustHaveOne) << c.policy;
        if (c.asksForDepth)
            page.Command21_Click();
        EXPECT_EQ(state.DchisaAmoka, c.deep || c.asksForDepth ? 1 : 0);
        page.Command7_Click(); // without an address
        EXPECT_EQ(chain.front()->id(), PageId::Form2);
        EXPECT_EQ(state.shemot.Mail, u"לא הוקלד"_s);
        EXPECT_EQ(state.shemot.Hearot, u" - "_s);
        chain.unload(PageId::Form2);
    }
}

TEST_F(ThePictures, areNotHandedOverWithHalfAnAddress) {
    for (const bool careful : {false, true}) {
        state.Careful = careful;
        state.Optint = OrderKind::Print;
        kyoskNew& page = openWith(1);
        page.Picture1_Click(0);
        page.Image7_Click();
        page.Combo1_Click(2);
        page.Image7_Click();
        EXPECT_EQ(page.controls().Combo1.text, careful ? u"walla.com"_s : u"בחר או הקלד"_s) << "behind the way back";
        page.Combo1_Change({});
        page.Text1_Change(u"dana"_s);
        page.Command8_Click();
        EXPECT_EQ(page.focusBox() == u"Combo1"_s, careful);
        page.Text1_Change({});
        page.Command8_Click();
        EXPECT_EQ(state.shemot.Mail, careful ? u"לא הוקלד"_s : u"dana@"_s);
        chain.unload(PageId::Form2);
    }
}

TEST_F(ThePictures, ofACouponMustMatchItAndTellTheBranch) {
    state.coupon.HaKoopon = 1;
    state.coupon.MisparKoopon = 2;
    state.profile.Branches[3] = {u"חיפה"_s, u"סניף חיפה"_s, {u"הנביאים 1"_s, {}}, u"04-1"_s};
    kyoskNew& page = openWith(1);
    const kyoskNewControls& shown = page.controls();
    page.Picture1_Click(0);
    page.Image7_Click();
    page.Command12_Click(0);
    page.Command12_Click(0);
    page.Image7_Click();
    EXPECT_EQ(machine.dialogs.messages.size(), 2) << "too few, too many";
    EXPECT_EQ(shown.Label7.text, u"3"_s) << "a refusal leaves the basket whole";
    EXPECT_FALSE(shown.Frame4.visible || shown.Pic4snifim.visible);
    page.Command13_Click(0);
    page.Image7_Click();
    EXPECT_TRUE(shown.Frame4.visible && shown.Pic4snifim.visible);
    // Home delivery has no address, and there is no eleventh branch.
    for (const auto& [branch, told] :
         {std::pair(3, u"סניף חיפה\nהנביאים 1\n04-1"_s), {11, QString()}, {10, shown.Command4Snif[10].text}}) {
        page.Command4Snif_MouseMove(branch);
        EXPECT_EQ(shown.Label41.text, told);
    }
    // The lab reads Hebrew; a delivery to the home needs an address.
    state.EnglishTips = 1;
    state.profile.Branches[10].caption = u"משלוח - לבית"_s;
    page.Image7_Click();
    machine.dialogs.messages.clear();
    page.Command4Snif_Click(10);
    EXPECT_TRUE(machine.dialogs.messages.isEmpty()) << "as built in the order leaves without one";
    state.Careful = true;
    page.Command4Snif_Click(10);
    page.Command8_Click();
    EXPECT_EQ(machine.dialogs.messages.size(), 2);
    EXPECT_EQ(page.focusBox(), u"Text2"_s);
    page.Text2_Change(u"5 Herzl, Haifa"_s);
    state.coupon.MisparKoopon = 0; // of a size without a coupon
    page.Image7_Click();
    EXPECT_TRUE(shown.Frame4.visible);
    page.Command8_Click();
    EXPECT_EQ(state.shemot.Hearot, u"5 Herzl, Haifa - משלוח - לבית"_s);
    state.shemot.Hearot = u"???"_s; // of the log
    state.handOver.back = true;
    kyoskNew& again = open();
    again.Image7_Click();
    again.Command28_Click();
    again.Command8_Click();
    EXPECT_EQ(state.shemot.Hearot, u"5 Herzl, Haifa - משלוח - לבית"_s);
}

} // namespace
} // namespace lumora
