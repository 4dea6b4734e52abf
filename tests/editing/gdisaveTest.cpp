#include "editing/editor/gdisave.h"

#include "imaging/files/PictureFile.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

class SavingPictures : public ::testing::Test, protected PageRig {
protected:
    SavingPictures() {
        state.transfer.OrderFolder = u"C:\\2000lumora\\!!000\\order"_s;
        state.MisparHazmana = u"105"_s;
        state.shemot.ser = u"1234"_s;
        makeFolder(state.transfer.OrderFolder);
        chain.registerPage(PageId::gdisave, [this] {
            auto page = std::make_unique<gdisave>(state, machine.platform, chain, [this] { return startStatus; });
            page->PicPic = Bitmap(20, 10, Qt::red);
            page->LitlPic = Bitmap(8, 6, Qt::blue);
            return page;
        });
    }

    gdisave& page() { return dynamic_cast<gdisave&>(chain.load(PageId::gdisave)); }
    bool isPicture(const QString& path, PictureSize size) {
        const Result<PictureSize> found = readPictureSize(host(path));
        return found && *found == size;
    }
    static QString sheet(const char* extension) {
        return u"C:\\2000lumora\\!!000\\order\\!105_1234"_s + QString::fromLatin1(extension);
    }

    int startStatus = 0;
};

TEST_F(SavingPictures, eachButtonSavesItsPictureUnderItsName) {
    page().Command5_Click();
    page().Command7_Click();
    EXPECT_TRUE(isPicture(u"C:\\2000lumora\\!!000\\^^^.jpg"_s, {20, 10}));
    EXPECT_TRUE(isPicture(u"C:\\2000lumora\\000.jpg"_s, {8, 6}));
    EXPECT_TRUE(machine.dialogs.messages.isEmpty());
}

TEST_F(SavingPictures, theSheetsNameFollowsTheSenderAndTheStation) {
    struct Case {
        std::int16_t sender;
        bool station, jpp, jpg;
    };
    for (const Case& c : {Case{0, false, true, false}, Case{0, true, true, true}, Case{1, false, false, true},
                          Case{1, true, false, true}}) {
        state.transfer.SugSheliach = static_cast<Sender>(c.sender);
        state.TachanaMekomit = c.station;
        page().Command6_Click();
        EXPECT_EQ(isPicture(sheet(".jpp"), {20, 10}), c.jpp);
        EXPECT_EQ(isPicture(sheet(".jpg"), {20, 10}), c.jpg);
        static_cast<void>(machine.files.removeFile(sheet(".jpp")));
        static_cast<void>(machine.files.removeFile(sheet(".jpg")));
    }
}

TEST_F(SavingPictures, doesNothingWhenTheDrawingDidNotStart) {
    startStatus = 18;
    page().Command5_Click();
    page().Command6_Click();
    page().Command7_Click();
    EXPECT_EQ(machine.dialogs.messages,
              QStringList({u"Gdiplus Not Initialized. GDI+ Error:18"_s, u"GDI+ not inizialized."_s}));
    EXPECT_EQ(machine.dialogs.titles, QStringList({u"GDI Error"_s, u"GDI Error"_s}));
    EXPECT_TRUE(machine.files.names(u"C:\\2000lumora\\!!000"_s, u"*.*"_s).isEmpty());
    EXPECT_TRUE(machine.files.names(u"C:\\2000lumora"_s, u"*.*"_s).isEmpty());
}

TEST_F(SavingPictures, tellsWhyAPictureCouldNotBeSavedAndGoesOn) {
    EXPECT_FALSE(page().SaveJpeg(page().PicPic, u"C:\\missing\\a.jpg"_s, 90));
    ASSERT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_TRUE(machine.dialogs.messages[0].startsWith(u"File Not Found. GDI+ Error:10\n"_s));
    EXPECT_TRUE(machine.dialogs.messages[0].contains(u"C:\\missing\\a.jpg"_s));
    EXPECT_FALSE(page().SaveJpeg({}, u"C:\\2000lumora\\a.jpg"_s, 90));
    EXPECT_FALSE(machine.files.fileExists(u"C:\\2000lumora\\a.jpg"_s));
}

TEST_F(SavingPictures, holdsTheQualityWithinItsRange) {
    page().HScroll1_Change(150);
    EXPECT_EQ(page().HScroll1, 100);
    EXPECT_EQ(page().Label1.text, u"איכות: 100"_s);
    page().HScroll1_Change(-5);
    EXPECT_EQ(page().HScroll1, 0);
}

TEST_F(SavingPictures, knowsTheStatusTextsAndTheEncoder) {
    EXPECT_EQ(gdisave::GdiStatusText(1), u"Generic Error."_s);
    EXPECT_EQ(gdisave::GdiStatusText(17), u"Unsupported Gdiplus Version."_s);
    EXPECT_EQ(gdisave::GdiStatusText(20), u"Property Not Supported."_s);
    for (const int unknown : {21, -1, 1000})
        EXPECT_EQ(gdisave::GdiStatusText(unknown), u"Unknown GDI+ Error."_s);
    EXPECT_EQ(page().ShowGdiStatus(0), 0);
    EXPECT_TRUE(machine.dialogs.messages.isEmpty());
    EXPECT_TRUE(gdisave::FindEncoderClsid(u"IMAGE/JPEG"_s));
    EXPECT_FALSE(gdisave::FindEncoderClsid(u"image/webp"_s));
}

} // namespace
} // namespace lumora
