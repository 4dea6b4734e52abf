// The editor with the lab's guards off and on.
#include "TheEditor.h"

#include <tuple>

namespace lumora {
namespace {

TEST_F(TheEditor, carefullyPacksATurnAndAPlaceThatComeBackAsTheyWereSeen) {
    for (const auto& [turnZoomPan, button, column, builtIn, guarded] : // after ten ticks
         {std::tuple("-90100225 150 ", turnLeft, EditRecord::RotationCode, "-10", "260"),
          {"-89100225 150 ", turnLeft, EditRecord::RotationCode, "-99", "-99"},
          {"180100665 150 ", right, EditRecord::PanX, "685 ", "674 "},
          {"180100-215150 ", left, EditRecord::PanX, "-235", "-224"},
          {"180210770 150 ", right, EditRecord::PanX, "790 ", "780 "},
          {"180100225 460 ", down, EditRecord::PanY, "480 ", "467 "}}) {
        for (const bool careful : {false, true}) {
            SCOPED_TRACE(careful);
            state.Careful = careful;
            open(lying, EditRecord::newPicture().replace(12, 14, QString::fromLatin1(turnZoomPan)));
            hold(button, 10);
            EXPECT_EQ(field(column), QLatin1String(careful ? guarded : builtIn));
            const QImage seen = paper();
            open(lying, QString(state.edit.EditState));
            EXPECT_TRUE(!careful || paper() == seen) << "what was seen is what opens again";
        }
    }
    tFrmNew& editor = open(lying);
    editor.PicPic_MouseDown({0, 0});
    for (int move = 0; move < 20; ++move)
        editor.PicPic_MouseMove({1300, 130});
    editor.PicPic_MouseUp();
    EXPECT_EQ(storedField(EditRecord::PanX) + storedField(EditRecord::PanY), u"674 350 "_s)
        << "it slides along the edge";
}

TEST_F(TheEditor, carefullyPrintsTheFrameThatIsSeenAndNoOther) {
    makeFrame(u"aa"_s, u"001"_s, Qt::green);
    makeFrame(u"aa"_s, u"002"_s, Qt::blue);
    makeFrame(u"aa"_s, u"003"_s, Qt::yellow);
    ASSERT_TRUE(machine.files.removeFile(WorkspacePaths::misgarot(state) / u"aa\\k003.bmp"));
    for (const bool careful : {false, true}) {
        SCOPED_TRACE(careful);
        state.Careful = careful;
        tFrmNew& editor = open(lying);
        editor.Combo2_Click(2); // has its print file alone
        EXPECT_EQ(corner().green() > 240, careful);
        editor.Combo2_Click(0);
        editor.Misgerett_Click(false);
        EXPECT_GT(corner().red(), 240);
        EXPECT_EQ(storedField(EditRecord::FrameName), careful ? u"999"_s : u"001"_s);
        EXPECT_EQ(machine.dialogs.messages.size(), careful ? 1 : 0);
        editor.Image20_Click();
        EXPECT_EQ(corner().blue() > 240, careful);
        editor.Misgerett_Click(false);
        open(lying, recordWith(EditRecord::FrameName, u"001"_s, recordWith(EditRecord::FrameFolder, u"aa"_s)));
        EXPECT_EQ(shown().Misgerett.checked, careful) << "ticked for another picture";
        EXPECT_EQ(corner().green() > 240, careful);
        editor.Misgerett_Click(true);
    }
}

TEST_F(TheEditor, carefullyRaisesTheZoomOfATurnedPictureToWhatCovers) {
    tFrmNew& editor = page();
    const auto press = [&](QChar key) {
        key == u'q'   ? editor.Image15_Click()
        : key == u'b' ? editor.Image18_Click()
        : key == u'u' ? editor.Image27_Click()
        : key == u'z' ? editor.Image2_Click(5)
        : key == u's' ? hold(turnRight, 45)
        : key == u'c' ? holdImage2(0, 1)
        : key == u'C' ? holdImage2(0, 40)
                      : holdImage2(1, 30);
    };
    // The keys: quarter, back, upright, undo, slanted, closer, much closer, further.
    for (const auto& [what, keys, panX, builtIn, guarded] : {std::tuple("a quarter", "q", 225, "100", "134"),
                                                             {"back", "qb", 225, "100", "100"},
                                                             {"upright", "su", 225, "100", "100"},
                                                             {"slanted", "s", 225, "100", "158"},
                                                             {"its own zoom", "qcb", 225, "102", "136"},
                                                             {"bare on purpose", "qfq", 225, "40 ", "74 "},
                                                             {"bare before", "fq", 225, "40 ", "40 "},
                                                             {"undone, and anew", "qzb", 225, "100", "134"},
                                                             {"no further", "Cs", 90, "180", "210"}}) {
        for (const bool careful : {false, true}) {
            SCOPED_TRACE(what);
            state.Careful = careful;
            open(lying, recordWith(EditRecord::PanX, QString::number(panX), recordWith(EditRecord::PanY, u"150"_s)));
            for (const QChar key : QString::fromLatin1(keys))
                press(key);
            EXPECT_EQ(field(EditRecord::ZoomPercent), QLatin1String(careful ? guarded : builtIn));
            EXPECT_EQ(shown().Label11.text, field(EditRecord::ZoomPercent).trimmed());
        }
    }
}

} // namespace
} // namespace lumora
