#include "TheEditor.h"

#include "editing/render/EditedPicture.h"

#include <functional>
#include <tuple>

namespace lumora {
namespace {

TEST_F(TheEditor, givesANewPictureThePlaceOfThePapersCentreAndStoresIt) {
    open(lying);
    EXPECT_EQ(state.edit.EditState, LeftField(u"1   1   1   180100225 150 0  0  000000000000          "
                                              "8 0 0 0 0 ddd       0  0  0  0  0  0  0 0 "_s,
                                              200));
    EXPECT_EQ(shown().PicPicSize, (PictureSize{450, 300}));
    EXPECT_EQ(paper().width(), 450);
    EXPECT_GT(middle().red(), 240);
    EXPECT_TRUE(shown().Picture3.visible);
    EXPECT_FALSE(shown().Image19.visible);
    EXPECT_EQ(take(readPictureSize(host(u"C:\\2000lumora\\0.bmp"_s))), (PictureSize{500, 375}));

    // 780 is a position, 781 is none.
    for (const auto& [pan, expected] : {std::pair(780, 780), std::pair(781, 225)}) {
        open(lying, recordWith(EditRecord::PanX, QString::number(pan), recordWith(EditRecord::PanY, u"20"_s)));
        EXPECT_EQ(state.edit.PanX, expected);
        EXPECT_EQ(state.edit.PanY, expected == 780 ? 20 : 150);
    }
}

TEST_F(TheEditor, packsAndStoresEachControlInItsOwnWay) {
    tFrmNew& editor = open(lying);
    editor.Image2_MouseDown(0);
    editor.Timer2_Tick();
    editor.Timer2_Tick();
    EXPECT_EQ(state.edit.ZoomPercent, 104);
    EXPECT_EQ(shown().Label11.text, u"104"_s);
    EXPECT_EQ(shown().resolution.text, u"65 dpi בגודל 10/15: מפוקסלת"_s);
    EXPECT_EQ(field(EditRecord::ZoomPercent), u"100"_s);
    EXPECT_TRUE(stored.isEmpty());
    editor.Image2_MouseUp(0);
    ASSERT_EQ(stored.size(), 1);
    EXPECT_EQ(field(EditRecord::ZoomPercent), u"104"_s);

    editor.Image2_MouseDown(4);
    editor.Timer3_Tick();
    EXPECT_EQ(field(EditRecord::GainR), u"1.04"_s);
    EXPECT_EQ(stored.size(), 1);
    editor.Image2_MouseUp(4);
    EXPECT_EQ(stored.size(), 2);

    editor.Image135_MouseDown();
    editor.Timer7_Tick();
    EXPECT_EQ(stored.size(), 3);
    editor.Image135_MouseUp();
    EXPECT_EQ(stored.size(), 3);
    editor.Image11_Click(); // a tone stores before and behind the drawing
    EXPECT_EQ(stored.size(), 5);
    editor.Misgerett_Click(false);
    EXPECT_EQ(stored.size(), 5);

    state.edit.TextOn = 1;
    state.edit.TextBody = u"abc"_s;
    state.edit.TextX = state.edit.TextY = 100;
    editor.Command11_Click();
    ASSERT_EQ(stored.size(), 6);
    editor.Labeltext_MouseDown({110, 110});
    editor.Labeltext_MouseMove({149, 97});
    EXPECT_EQ(state.edit.TextX, 100);
    editor.Labeltext_MouseUp();
    EXPECT_EQ(state.edit.TextX, 103);
    EXPECT_EQ(state.edit.TextY, 99);
    ASSERT_EQ(stored.size(), 7);
    EXPECT_EQ(stored[6], stored[5]); // the place waits for the next pack
    editor.Command5_Click();
    EXPECT_EQ(field(EditRecord::TextX), u"103"_s);
}

TEST_F(TheEditor, takesTheStepsOfItsButtonsIntoTheRecord) {
    tFrmNew& editor = open(lying);
    struct Case {
        std::function<void()> press;
        EditRecord::Column column;
        const char* value;
    };
    for (const Case& c : {Case{[&] { hold(right, 10); }, EditRecord::PanX, "245 "},
                          Case{[&] { hold(left, 3); }, EditRecord::PanX, "239 "},
                          Case{[&] { hold(up, 5); }, EditRecord::PanY, "140 "},
                          Case{[&] { hold(down, 2); }, EditRecord::PanY, "144 "},
                          Case{[&] { hold(turnRight, 2); }, EditRecord::RotationCode, "182"},
                          Case{[&] { hold(turnLeft, 2); }, EditRecord::RotationCode, "180"},
                          Case{[&] { editor.Image15_Click(); }, EditRecord::RotationCode, "270"},
                          Case{[&] { editor.Image18_Click(); }, EditRecord::RotationCode, "180"},
                          Case{[&] { hold(turnLeft, 3); }, EditRecord::RotationCode, "177"},
                          Case{[&] { editor.Image27_Click(); }, EditRecord::RotationCode, "180"},
                          Case{[&] { holdImage2(4, 6); }, EditRecord::GainG, "1.24"},
                          Case{[&] { holdImage2(3, 1); }, EditRecord::GainG, "1.2 "},
                          Case{[&] { editor.Image2_Click(6); }, EditRecord::GainR, "1.26"},
                          Case{[&] { editor.keepRecord(); }, EditRecord::GainB, "1.14"},
                          Case{[&] { editor.Image2_Click(8); }, EditRecord::GainR, "1.2 "},
                          Case{[&] { editor.Image2_Click(10); }, EditRecord::GainB, "1.26"},
                          Case{[&] { editor.keepRecord(); }, EditRecord::GainR, "1.14"},
                          Case{[&] { editor.Image12_Click(); }, EditRecord::GainB, "1.3 "},
                          Case{[&] { editor.Image11_Click(); }, EditRecord::GainB, "0.8 "},
                          Case{[&] { editor.Image5_Click(); }, EditRecord::GainB, "1   "},
                          Case{[&] { holdImage2(1, 5); }, EditRecord::ZoomPercent, "90 "},
                          Case{[&] { holdImage2(0, 80); }, EditRecord::ZoomPercent, "210"},
                          Case{[&] { editor.VScrollZ_Change(500); }, EditRecord::ZoomPercent, "210"}}) {
        c.press();
        EXPECT_EQ(field(c.column), QString::fromLatin1(c.value));
    }
    EXPECT_EQ(shown().VScrollZ, tFrmNewControls::VScrollZMax);
}

TEST_F(TheEditor, dragsByAThirteenthOfTheWayAtEachMoveAndKeepsFractions) {
    tFrmNew& editor = open(lying);
    editor.Image13_MouseMove();
    editor.PicPic_MouseDown({100, 100});
    for (int i = 0; i < 3; ++i)
        editor.PicPic_MouseMove({107, 100 - 13.0 / 6});
    EXPECT_FALSE(shown().Frame3.visible);
    EXPECT_EQ(state.edit.PanX, 225); // the record waits for the release
    editor.PicPic_MouseUp();
    editor.PicPic_MouseMove({300, 300});
    EXPECT_EQ(storedField(EditRecord::PanX) + storedField(EditRecord::PanY),
              u"227 150 "_s); // 226.6, and 149.5 to the even one
    ASSERT_EQ(stored.size(), 1);

    editor.Command8_Click();
    ASSERT_EQ(chain.front()->id(), PageId::mikledet);
    editor.PicPic_MouseDown({0, 0});
    editor.PicPic_MouseMove({200, 200});
    editor.PicPic_MouseUp();
    EXPECT_EQ(state.edit.PanX, 227);
}

TEST_F(TheEditor, letsGoOfAHeldButtonWhenThePointerIsLostOrAnotherPictureComes) {
    tFrmNew& editor = open(lying);
    const std::pair<std::function<void()>, const char*> ends[] = {{[&] { editor.stopHolds(); }, "102"},
                                                                  {[&] { chain.show(PageId::kyoskNew); }, "104"}};
    for (const auto& [end, zoom] : ends) {
        editor.Image2_MouseDown(0);
        editor.Timer2_Tick();
        end();
        EXPECT_EQ(shown().sunkImage2, -1);
        editor.Timer2_Tick(); // one that was under way
        EXPECT_EQ(field(EditRecord::ZoomPercent), QLatin1String(zoom));
    }
    holdImage2(0, 0);
    EXPECT_EQ(field(EditRecord::ZoomPercent), u"106"_s) << "a tap is one step";
    editor.VScrollZ_Change(150);
    editor.Image2_MouseDown(0);
    editor.stopHolds();
    EXPECT_EQ(field(EditRecord::ZoomPercent), u"106"_s) << "lost before the first step";
    editor.Image2_MouseDown(0);
    editor.Timer2_Tick();
    UnpackEditState(EditRecord::newPicture(), state.edit);
    state.edit.PicturePath = standing;
    stored.clear();
    editor.Command17_Click();
    editor.Image2_MouseUp(0);
    ASSERT_EQ(stored.size(), 1);
    EXPECT_TRUE(stored.last().contains(u"180100150 225 "_s));
}

TEST_F(TheEditor, greysThePictureOnceWhateverTonesFollow) {
    tFrmNew& editor = open(lying);
    const auto near = [](QColor a, QColor b) {
        return std::abs(a.red() - b.red()) < 4 && std::abs(a.green() - b.green()) < 4 &&
               std::abs(a.blue() - b.blue()) < 4;
    };
    for (const auto& [press, colour] :
         {std::pair(&tFrmNew::Image11_Click, QColor(99, 76, 60)), std::pair(&tFrmNew::Image4_Click, QColor(76, 76, 76)),
          std::pair(&tFrmNew::Image12_Click, QColor(76, 76, 99)),
          std::pair(&tFrmNew::Image9_Click, QColor(76, 99, 76))}) {
        (editor.*press)();
        EXPECT_TRUE(near(middle(), colour)) << qPrintable(colour.name());
    }
    const QString sepia = recordWith(EditRecord::ToneFlag, u"1"_s, recordWith(EditRecord::GainR, u"1.3"_s));
    open(lying, sepia);
    EXPECT_TRUE(near(middle(), QColor(99, 76, 76)));
    editor.Image4_Click();
    EXPECT_TRUE(near(middle(), QColor(76, 76, 76)));
    editor.Image5_Click();
    EXPECT_GT(middle().red(), 240);
    EXPECT_EQ(field(EditRecord::ToneFlag), u"0  "_s);
}

TEST_F(TheEditor, undoesAllButFrameCaptionAndRedEyes) {
    const DrivePath copy = WorkspacePaths::corrected(state, lying);
    ASSERT_TRUE(Bitmap(400, 300, Qt::blue).image().save(toText(host(copy)), "BMP"));
    const QString before =
        recordWith(EditRecord::RedMarker, u"RED"_s,
                   recordWith(EditRecord::FrameName, u"017"_s, recordWith(EditRecord::TextBody, u"Dana"_s)));
    tFrmNew& editor = open(lying, before);
    EXPECT_GT(middle().blue(), 240);
    editor.Image4_Click();
    editor.Image15_Click();
    holdImage2(0, 10);
    editor.Command10_Click(); // 13/18, from the next load on
    EXPECT_EQ(shown().PicPicSize, (PictureSize{450, 300}));
    editor.Image2_Click(5);
    EXPECT_EQ(shown().PicPicSize, (PictureSize{450, 325}));
    EXPECT_EQ(stored.last().left(44), u"1   1   1   180100225 162 0  0  017000RED000"_s);
    EXPECT_EQ(field(EditRecord::TextBody).trimmed(), u"Dana"_s);
    EXPECT_GT(middle().blue(), 240);

    // Back to colour shows the customer's own file or carefully the corrected one, and the record keeps its marker.
    for (const bool careful : {false, true}) {
        state.Careful = careful;
        editor.Image5_Click();
        EXPECT_GT(careful ? middle().blue() : middle().red(), 240);
        EXPECT_EQ(field(EditRecord::RedMarker), u"RED"_s);
    }
    state.Careful = false;

    // A corrected copy that is gone leaves the picture without it.
    ASSERT_TRUE(machine.files.removeFile(copy));
    open(lying, before);
    EXPECT_GT(middle().red(), 240);
    EXPECT_EQ(field(EditRecord::RedMarker), u"000"_s);
    EXPECT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_TRUE(machine.dialogs.messages.value(0).contains(copy.text()));
}

TEST_F(TheEditor, leavesAPictureThatCannotBeOpenedUnedited) {
    ASSERT_TRUE(machine.files.writeWhole(u"C:\\p\\bad.jpg"_path, "no picture"));
    ASSERT_TRUE(machine.files.makeFolder(u"C:\\2000lumora\\0.bmp"_path)); // where the work picture would be written
    open(lying);
    open(standing);
    EXPECT_EQ(machine.dialogs.messages.size(), 1) << "told once";
    tFrmNew& editor = open(u"C:\\p\\bad.jpg"_path);
    EXPECT_EQ(machine.dialogs.messages.size(), 2);
    EXPECT_FALSE(editor.pictureOpen());
    EXPECT_TRUE(paper().isNull());
    for (int index = 0; index < 11; ++index) {
        editor.Image2_Click(index);
        holdImage2(index, 1);
    }
    for (const auto press :
         {&tFrmNew::Image15_Click, &tFrmNew::Image18_Click, &tFrmNew::Image4_Click, &tFrmNew::Image5_Click,
          &tFrmNew::Image20_Click, &tFrmNew::Image22_Click, &tFrmNew::Image28_Click, &tFrmNew::Command4_Click,
          &tFrmNew::Command5_Click, &tFrmNew::Command6_Click, &tFrmNew::Command8_Click, &tFrmNew::Command9_Click,
          &tFrmNew::Command11_Click, &tFrmNew::Command14_Click, &tFrmNew::CommandImprove_Click})
        (editor.*press)();
    hold(right, 1);
    editor.Misgerett_Click(true);
    editor.VScrollZ_Change(50);
    EXPECT_EQ(state.edit.EditState, EditRecord::newPicture());
    EXPECT_TRUE(stored.isEmpty());
    EXPECT_TRUE(editor.takeSmallView().isNull());
}

TEST_F(TheEditor, takesThePaperFromTheOrderAndPassesOverWhatIsNoSize) {
    for (const auto& [paper, height] : {std::pair(u"30/40"_s, 337), std::pair(u"zz/zz"_s, 300)}) {
        chain.unload(PageId::tFrmNew);
        state.shemot.ppr = paper;
        EXPECT_EQ(open(lying).controls().PicPicSize, (PictureSize{450, height}));
    }
}

TEST_F(TheEditor, beginsACaptionAndHandsItToTheKeyboard) {
    tFrmNew& editor = open(lying);
    editor.Command8_Click();
    EXPECT_EQ(chain.front()->id(), PageId::mikledet);
    EXPECT_TRUE(shown().Labeltext.visible);
    EXPECT_EQ(state.edit.TextFontSize, 24);
    EXPECT_TRUE(chain.find<mikledet>()->controls().Check4.checked);
    state.edit.TextBody = u"Dana"_s;
    editor.Command11_Click();
    EXPECT_EQ(storedField(EditRecord::TextFontSize) + storedField(EditRecord::TextAlign), u"240 "_s);
    EXPECT_EQ(storedField(EditRecord::TextBlue) + storedField(EditRecord::TextGreen) +
                  storedField(EditRecord::TextRed) + storedField(EditRecord::TextX) + storedField(EditRecord::TextY),
              u"30 255255100100"_s);
    EXPECT_EQ(storedField(EditRecord::TextBody).trimmed(), u"Dana"_s);
    editor.CommandDone_Click();
    EXPECT_EQ(chain.front()->id(), PageId::kyoskNew);
    EXPECT_EQ(chain.find(PageId::mikledet), nullptr);
}

TEST_F(TheEditor, showsCropMarkersThatStayAParallelogramAndCutNothing) {
    using Corner = CropFrame::Corner;
    tFrmNew& editor = open(lying);
    const QImage before = paper();
    editor.Command14_Click();
    editor.CropHandle_MouseDown(Corner::Picture10, {450, 0});
    editor.CropHandle_MouseMove({450 - 130, 26});
    editor.CropHandle_MouseUp();
    EXPECT_EQ(shown().crop.marker(Corner::Picture10), QPoint(440, 2));
    EXPECT_EQ(shown().crop.marker(Corner::Picture14), QPoint(440, 302));
    editor.Command13_Click();
    for (int i = 0; i < 100; ++i)
        editor.Command15_Click();
    EXPECT_LT(shown().crop.marker(Corner::Picture11).y(), shown().crop.marker(Corner::Picture14).y());
    EXPECT_EQ(paper(), before);
    EXPECT_TRUE(stored.isEmpty());
}

TEST_F(TheEditor, keepsTheSmallViewInLogicalPixelsHoweverSharpTheScreen) {
    page().setPreviewScale(2);
    tFrmNew& editor = open(lying);
    EXPECT_EQ(paper().width(), 900);
    editor.Image15_Click();
    Result<EditedPreview> expected = EditedPreview::open(host(lying), {10, 15}, 100, EditedPreview::Tone::Colour);
    ASSERT_TRUE(expected);
    EXPECT_EQ(editor.takeSmallView().image(), expected->render(state.edit, std::nullopt).image());
    EXPECT_TRUE(editor.takeSmallView().isNull());
    editor.setPreviewScale(1);
    EXPECT_EQ(paper().width(), 450);
}

TEST_F(TheEditor, measuresLevelsOnRequestAndAtEachOpeningFromThenOn) {
    open(lying);
    page().Command6_Click();
    EXPECT_EQ(storedField(EditRecord::AutoMarker), u"111"_s);
    const QString measured = state.edit.EditState;
    auto& surfaces = chain.load<BigPics>();
    EXPECT_EQ(surfaces.controls().List1.count(), 61 * 46);
    EXPECT_EQ(surfaces.controls().Image_crop, QRect(50, 37, 300, 225)) << "the middle";
    open(standing, measured);
    EXPECT_EQ(surfaces.controls().List1.count(), 61 * 81) << "measured anew";
}

TEST_F(TheEditor, improvesByTheMeasuredGainsWithinTheirLimitsAndOnce) {
    const DrivePath picture = u"C:\\p\\even.jpg"_path;
    for (const auto& [colour, gains, improved] : // 255 by the value and 0.2, cut after two digits
         {std::tuple(QColor(204, 170, 128), u"1.241.491.6 "_s, QColor(253, 253, 205)),
          {QColor(255, 250, 40), u"1   1.011.6 "_s, QColor(255, 253, 64)}}) {
        ASSERT_TRUE(Bitmap(400, 300, colour).image().save(toText(host(picture)), "PNG"));
        tFrmNew& editor = open(picture);
        machine.dialogs.messages.clear();
        editor.CommandImprove_Click();
        EXPECT_EQ(stored.value(0).left(12) + field(EditRecord::AutoMarker), gains + u"000"_s);
        for (const int shift : {0, 8, 16})
            EXPECT_NEAR(middle().rgb() >> shift & 255, improved.rgb() >> shift & 255, 2);
        const QImage seen = paper();
        editor.CommandImprove_Click();
        EXPECT_EQ(machine.dialogs.messages.size(), 1) << "nothing more to improve";
        open(picture, QString(state.edit.EditState));
        EXPECT_EQ(paper(), seen) << "what was seen is what opens again";
        editor.Image2_Click(5);
        EXPECT_EQ(stored.last().left(12), u"1   1   1   "_s);
        editor.Image11_Click();
        editor.CommandImprove_Click();
        EXPECT_EQ(stored.last().left(12), u"1.3 1   0.8 "_s) << "the tint of a tone stays";
        EXPECT_EQ(machine.dialogs.messages.size(), 2);
    }
}

TEST_F(TheEditor, leavesForAnotherFolderOnlyWhenAPictureWasPicked) {
    tFrmNew& editor = open(lying);
    QList<DrivePath> picked;
    QObject::connect(&editor, &tFrmNew::picked, [&](const DrivePath& path) { picked += path; });
    editor.Image2_Click(6);
    const QString before = state.edit.EditState;
    editor.Command2_Click();
    EXPECT_EQ(chain.front(), &editor);
    EXPECT_EQ(state.edit.GainR, 1.06F);
    machine.dialogs.picks += standing;
    editor.Command2_Click();
    EXPECT_EQ(picked, QList<DrivePath>({standing}));
    EXPECT_EQ(chain.front()->id(), PageId::kyoskNew);
    EXPECT_EQ(state.edit.EditState, before);
    EXPECT_EQ(state.edit.GainR, 1) << "not for the next picture";
    EXPECT_TRUE(machine.dialogs.pickRequests[0].endsWith(u"בחר תמונה אחת וכל התמונות תוצגנה"_s));
}

} // namespace
} // namespace lumora
