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
            return std::make_unique<gdisave>(state, machine.platform, chain, [this] { return startStatus; });
        });
    }

    gdisave& page() { return chain.load<gdisave>(); }
    bool isPicture(const QString& path, PictureSize size) {
        const Result<PictureSize> found = readPictureSize(host(path));
        return found && *found == size;
    }
    static QString sheet(const char* extension) {
        return u"C:\\2000lumora\\!!000\\order\\!105_1234"_s + QString::fromLatin1(extension);
    }

    const Bitmap picture{20, 10, Qt::red};
    const Bitmap small{8, 6, Qt::blue};
    int startStatus = 0;
};

TEST_F(SavingPictures, eachButtonSavesItsPictureUnderItsName) {
    page().saveScratch(picture);
    page().saveProof(small);
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
        page().saveOrderSheet(picture);
        EXPECT_EQ(isPicture(sheet(".jpp"), {20, 10}), c.jpp);
        EXPECT_EQ(isPicture(sheet(".jpg"), {20, 10}), c.jpg);
        static_cast<void>(machine.files.removeFile(sheet(".jpp")));
        static_cast<void>(machine.files.removeFile(sheet(".jpg")));
    }
}

TEST_F(SavingPictures, doesNothingWhenTheDrawingDidNotStart) {
    startStatus = 18;
    page().saveScratch(picture);
    page().saveOrderSheet(picture);
    page().saveProof(small);
    EXPECT_EQ(machine.dialogs.messages,
              QStringList({u"Gdiplus Not Initialized. GDI+ Error:18"_s, u"GDI+ not inizialized."_s}));
    EXPECT_EQ(machine.dialogs.titles, QStringList({u"GDI Error"_s, u"GDI Error"_s}));
    EXPECT_TRUE(machine.files.names(u"C:\\2000lumora\\!!000"_s, u"*.*"_s).isEmpty());
    EXPECT_TRUE(machine.files.names(u"C:\\2000lumora"_s, u"*.*"_s).isEmpty());
}

TEST_F(SavingPictures, tellsWhyAPictureCouldNotBeSavedAndGoesOn) {
    EXPECT_FALSE(page().SaveJpeg(picture, u"C:\\missing\\a.jpg"_s, 90));
    ASSERT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_TRUE(machine.dialogs.messages[0].startsWith(u"File Not Found. GDI+ Error:10\n"_s));
    EXPECT_TRUE(machine.dialogs.messages[0].contains(u"C:\\missing\\a.jpg"_s));
    EXPECT_FALSE(page().SaveJpeg({}, u"C:\\2000lumora\\a.jpg"_s, 90));
    EXPECT_FALSE(machine.files.fileExists(u"C:\\2000lumora\\a.jpg"_s));
}

TEST_F(SavingPictures, knowsItsStatusTextsAndItsEncoder) {
    for (const auto& [status, text] : {std::pair(1, "Generic Error."), std::pair(17, "Unsupported Gdiplus Version."),
                                       std::pair(20, "Property Not Supported."), std::pair(21, "Unknown GDI+ Error."),
                                       std::pair(-1, "Unknown GDI+ Error.")})
        EXPECT_EQ(gdisave::GdiStatusText(status), QString::fromLatin1(text));
    EXPECT_EQ(page().ShowGdiStatus(0), 0);
    EXPECT_TRUE(machine.dialogs.messages.isEmpty());
    EXPECT_TRUE(gdisave::FindEncoderClsid(u"IMAGE/JPEG"_s));
    EXPECT_FALSE(gdisave::FindEncoderClsid(u"image/webp"_s));
    page().HScroll1_Change(150);
    EXPECT_EQ(page().controls().Label1.text, u"איכות: 100"_s) << "held within its range";
}

} // namespace
} // namespace lumora
