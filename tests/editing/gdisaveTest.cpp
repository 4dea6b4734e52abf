#include "editing/editor/gdisave.h"

#include "imaging/files/PictureFile.h"
#include "support/JpegQuality.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

class SavingPictures : public ::testing::Test, protected PageRig {
protected:
    SavingPictures() {
        state.transfer.OrderFolder = u"C:\\2000lumora\\!!000\\order"_path;
        state.MisparHazmana = u"105"_s;
        state.shemot.ser = u"1234"_s;
        makeFolder(state.transfer.OrderFolder);
        chain.registerPage(PageId::gdisave, [this] {
            return std::make_unique<gdisave>(state, machine.platform, chain, [this] { return startStatus; });
        });
    }

    gdisave& page() { return chain.load<gdisave>(); }
    // The width and the quality of a picture; 0 where there is none.
    std::pair<int, int> pictureIn(const DrivePath& path) {
        const Result<PictureSize> found = readPictureSize(host(path));
        return found ? std::pair(found->width, jpegQuality(read(path))) : std::pair(0, 0);
    }

    const Bitmap picture{20, 10, Qt::red};
    const Bitmap small{8, 6, Qt::blue};
    int startStatus = 0;
};

TEST_F(SavingPictures, savesEachPictureUnderItsNameOnceTheDrawingStarted) {
    startStatus = 18;
    for (const bool started : {false, true}) {
        page().saveScratch(picture);
        page().saveOrderSheet(picture);
        page().saveProof(small);
        const auto expected = [started](int width, int quality) {
            return started ? std::pair(width, quality) : std::pair(0, 0);
        };
        EXPECT_EQ(pictureIn(u"C:\\2000lumora\\!!000\\^^^.jpg"_path), expected(20, 80));
        EXPECT_EQ(pictureIn(u"C:\\2000lumora\\000.jpg"_path), expected(8, 70));
        EXPECT_EQ(pictureIn(state.transfer.OrderFolder / u"!105_1234.jpp"), expected(20, 90));
        EXPECT_EQ(machine.dialogs.messages,
                  QStringList({u"Gdiplus Not Initialized. GDI+ Error:18"_s, u"GDI+ not inizialized."_s}));
        startStatus = 0;
        chain.unload(PageId::gdisave);
    }
}

TEST_F(SavingPictures, tellsWhyAPictureCouldNotBeSavedAndGoesOn) {
    EXPECT_FALSE(page().SaveJpeg(picture, u"C:\\missing\\a.jpg"_path, 90));
    EXPECT_FALSE(page().SaveJpeg({}, u"C:\\2000lumora\\a.jpg"_path, 90));
    EXPECT_FALSE(machine.files.fileExists(u"C:\\2000lumora\\a.jpg"_path));
    ASSERT_EQ(machine.dialogs.messages.size(), 2);
    EXPECT_TRUE(machine.dialogs.messages[0].startsWith(u"File Not Found. GDI+ Error:10\n"_s));
    EXPECT_TRUE(machine.dialogs.messages[0].contains(u"C:\\missing\\a.jpg"_s));
}

} // namespace
} // namespace lumora
