// The routines around frames and channels that no page calls.
#include "editing/render/ChannelMinimums.h"
#include "editing/render/FrameScramble.h"
#include "editing/render/LineFrame.h"
#include "imaging/Bitmap.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

class FrameRoutines : public ::testing::Test, protected PageRig {
protected:
    FrameRoutines() { makeFolder(u"C:\\2000lumora"_path); }

    const DrivePath frame = u"C:\\frame.bmp"_path;
    const DrivePath results = u"C:\\2000lumora\\!!moozpanim"_path;
    const DrivePath pieces = u"C:\\2000lumora\\!!benaime"_path;
    const DrivePath packed = results / u"!k.bmp";
};

const ChannelMinimums minimums{{1, 2.5F, 0.001F}, {-4, 0, 255}, {0.4F, 100000, 33.25F}};

TEST_F(FrameRoutines, ChannelMinimumsAreWrittenGreenBlueRedAndReadInAnyOrderAndPart) {
    ASSERT_TRUE(minimums.writeTo(machine.files, frame).ok());
    EXPECT_EQ(read(frame),
              QByteArray("\"00\",\"00\"\r\n"
                         "\"TKN.A_G_MIN(1)\",-4\r\n\"TKN.A_G_MIN(2)\",0\r\n\"TKN.A_G_MIN(3)\",255\r\n"
                         "\"TKN.A_B_MIN(1)\",0.4\r\n\"TKN.A_B_MIN(2)\",100000\r\n\"TKN.A_B_MIN(3)\",33.25\r\n"
                         "\"TKN.A_R_MIN(1)\",1\r\n\"TKN.A_R_MIN(2)\",2.5\r\n\"TKN.A_R_MIN(3)\",0.001\r\n"));
    QList<QByteArray> lines = read(frame).trimmed().split('\n');
    std::reverse(lines.begin(), lines.end());
    write(frame, lines.join('\n'));
    ChannelMinimums found;
    ASSERT_TRUE(found.readFrom(machine.files, frame).ok());
    EXPECT_EQ(found, minimums);
    ASSERT_TRUE(found.readFrom(machine.files, u"C:\\none.txt"_path).ok());
    EXPECT_EQ(found, minimums) << "what a file does not say stays";
}

TEST_F(FrameRoutines, ScramblingExchangesTheFirstTwoBlocksAndUndoesItself) {
    write(frame, QByteArray(99'999, 'a'));
    EXPECT_EQ(*ScrambleFrameFile(state, machine.files, frame), DrivePath()) << "too small";
    EXPECT_FALSE(machine.files.folderExists(results));
    QByteArray bytes;
    for (int i = 0; i < 100'000; ++i)
        bytes.append(static_cast<char>(i * 7 + i / 251));
    write(frame, bytes);
    makeFolder(pieces);
    write(pieces / u"kzz.bmp", "left by an interrupted run");
    EXPECT_EQ(*ScrambleFrameFile(state, machine.files, frame), packed);
    EXPECT_EQ(read(packed), bytes.mid(23000, 23000) + bytes.first(23000) + bytes.mid(46000));
    EXPECT_EQ(machine.files.names(pieces, u"*.*"_s), QStringList());
    ASSERT_TRUE(ScrambleFrameFile(state, machine.files, packed).ok());
    EXPECT_EQ(read(packed) + read(frame), bytes + bytes);
    EXPECT_FALSE(ScrambleFrameFile(state, machine.files, u"C:\\none.bmp"_path).ok());
}

QImage lineFrame(const QString& code) {
    Bitmap box(450, 300, Qt::black);
    PaintLineFrame(box, code);
    return box.image();
}

TEST(PaintLineFrame, PutsTheInkOfEachStyleWhereItsTableSays) {
    struct Case {
        const char* code;
        int x, y, alpha;
    };
    for (const Case& c :
         {// Thin rectangles, one a pixel, from 255 down by 2 or 3 a step.
          Case{"W03", 0, 150, 255}, Case{"W03", 100, 150, 55}, Case{"W03", 140, 150, 0}, Case{"W13", 10, 150, 225},
          Case{"W17", 22, 150, 205 - 66}, Case{"W17", 23, 150, 0},
          // The ellipse grows out of the box: its inside stays clear.
          Case{"W04", 225, 30, 0}, Case{"W14", 225, 150, 0},
          // An edge whose pen lies half outside, a second line of 12 in it, the innermost line of a glow.
          Case{"W21", 9, 150, 211}, Case{"W21", 11, 150, 0}, Case{"W29", 29, 150, 211}, Case{"W31", 15, 150, 200},
          Case{"W31", 17, 150, 0}, Case{"W41", 20, 150, 183}, Case{"W41", 22, 150, 0}})
        EXPECT_NEAR(lineFrame(QString::fromLatin1(c.code)).pixelColor(c.x, c.y).red(), 250 * c.alpha / 255, 2)
            << c.code << " at " << c.x << ", " << c.y;
    EXPECT_EQ(lineFrame(u"S03"_s).pixelColor(0, 150), QColor(240, 120, 0));
    EXPECT_EQ(lineFrame(u"X03"_s).pixelColor(0, 150), QColor(Qt::black)) << "a letter without a colour";
}

} // namespace
} // namespace lumora
