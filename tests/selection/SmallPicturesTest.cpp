#include "selection/SmallPictures.h"

#include "support/PageRig.h"

#include <gtest/gtest.h>

#include <thread>

namespace lumora {
namespace {

TEST(SmallPictures, AreReadAheadAndKeptUntilTheirFileChanges) {
    const PageRig rig;
    const HostPath path = rig.host(u"C:\\a.jpg"_s);
    const auto write = [&path](Qt::GlobalColor colour) {
        ASSERT_TRUE(saveJpeg(Bitmap(40, 30, colour), path, 80));
        static int written = 0; // a clock of files is coarse
        std::filesystem::last_write_time(path, std::filesystem::file_time_type::clock::now() +
                                                   std::chrono::seconds(++written));
    };
    SmallPictures pictures;
    const auto blueOf = [&] {
        return pictures.load({path, path.parent_path() / "none.jpg"}, 16).front()->image().pixelColor(8, 6).blue();
    };
    write(Qt::blue);
    pictures.readAhead({path.parent_path() / "none.jpg", path}, 16);
    for (int i = 0; i < 1000 && !pictures.keeps(path, 16); ++i)
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    EXPECT_TRUE(pictures.keeps(path, 16) && !pictures.keeps(path, 17));
    EXPECT_GT(blueOf(), 200);
    write(Qt::red);
    EXPECT_LT(blueOf(), 60);
    EXPECT_FALSE(pictures.load({path.parent_path() / "none.jpg"}, 16).front().ok());
}

} // namespace
} // namespace lumora
