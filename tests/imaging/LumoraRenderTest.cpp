#include "JpegOfKind.h"
#include "common/HostFile.h"
#include "imaging/PictureFile.h"

#include <QDir>
#include <QFileInfo>
#include <QImage>
#include <QProcess>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

class LumoraRenderTest : public testing::Test {
protected:
    void SetUp() override {
        ASSERT_TRUE(QDir(m_folder.path()).mkdir(u"out"_s));
        ASSERT_TRUE(
            writeWholeFile(at("a b.jpg").toStdString(), jpegOfKind(testPicture(2000, 1500), {.across = 2, .down = 2})));
        ASSERT_TRUE(writeWholeFile(at("broken.jpg").toStdString(), "broken"));
    }
    QString at(const char* name) const { return m_folder.path() + u'/' + QString::fromUtf8(name); }

    int run(const QStringList& arguments) {
        QProcess program;
        program.setWorkingDirectory(m_folder.path());
        program.start(QStringLiteral(LUMORA_RENDER), arguments);
        EXPECT_TRUE(program.waitForFinished(60000));
        m_out = QString::fromUtf8(program.readAllStandardOutput());
        m_err = QString::fromUtf8(program.readAllStandardError());
        return program.exitStatus() == QProcess::NormalExit ? program.exitCode() : -1;
    }

    QTemporaryDir m_folder;
    QString m_out;
    QString m_err;
};

TEST_F(LumoraRenderTest, plainScalesToThePaperAndTellsTheTimes) {
    EXPECT_EQ(run({"plain", "--paper", "10/15", "--time", "--out", "out", "a b.jpg"}), 0) << qPrintable(m_err);
    EXPECT_EQ(QImage(at("out/a b.jpg")).size(), QSize(1800, 1350));
    EXPECT_TRUE(m_out.startsWith(u"a b.jpg decode "_s)) << qPrintable(m_out);
    EXPECT_EQ(m_out.count(u'\n'), 1);
    EXPECT_EQ(run({"plain", "--paper=10/15", "--png", "--out", "out", "a b.jpg"}), 0);
    EXPECT_EQ(QImage(at("out/a b.png")).size(), QSize(1800, 1350));
}

TEST_F(LumoraRenderTest, smallFillsTheCell) {
    EXPECT_EQ(run({"small", "--size", "90", "--out", "out", "a b.jpg"}), 0) << qPrintable(m_err);
    EXPECT_EQ(QImage(at("out/a b.png")).size(), QSize(90, 68));
}

TEST_F(LumoraRenderTest, previewAndPrintTakeTheRecord) {
    const QString record = u"1   1   1   27040 225 150 0  0  000"_s;
    EXPECT_EQ(
        run({"preview", "--paper", "10/15", "--record", record, "--background", "204060", "--out", "out", "a b.jpg"}),
        0)
        << qPrintable(m_err);
    const QImage preview(at("out/a b.png"));
    EXPECT_EQ(preview.size(), QSize(450, 300));
    EXPECT_EQ(preview.pixelColor(2, 2), QColor(0x20, 0x40, 0x60));
    EXPECT_NE(preview.pixelColor(225, 150), QColor(0x20, 0x40, 0x60));
    EXPECT_EQ(run({"print", "--paper", "10/15", "--record", record, "--time", "--out", "out", "a b.jpg"}), 0);
    EXPECT_EQ(QImage(at("out/a b.jpg")).size(), QSize(1500, 1000));
    EXPECT_TRUE(m_out.startsWith(u"a b.jpg decode "_s)) << qPrintable(m_out);
}

TEST_F(LumoraRenderTest, aPictureThatFailsIsNamedAndTheOthersAreDone) {
    EXPECT_EQ(run({"plain", "--paper", "10/15", "--out", "out", "broken.jpg", "a b.jpg"}), 1);
    EXPECT_TRUE(m_err.contains(u"broken.jpg"_s)) << qPrintable(m_err);
    EXPECT_TRUE(QFileInfo::exists(at("out/a b.jpg")));
    EXPECT_FALSE(QFileInfo::exists(at("out/broken.jpg")));
}

// Each record prints the picture without the edit that its fault spoils: like another record, or like none.
TEST_F(LumoraRenderTest, aRecordWithAFaultGivesThePictureWithoutThatEdit) {
    const auto record = [](const char* rotation, const char* panX, const char* frame, const char* folder) {
        const auto field = [](const char* text, int width) { return QString::fromLatin1(text).leftJustified(width); };
        return u"1   1   1   "_s + field(rotation, 3) + field("100", 3) + field(panX, 4) + field("150", 4) +
               field("0", 3) + field("0", 3) + field(frame, 3) + u"000      "_s + field(folder, 10);
    };
    ASSERT_TRUE(QDir(m_folder.path()).mkpath(u"frames/aa"_s));
    QImage black(15, 10, QImage::Format_RGB32);
    black.fill(qRgb(30, 30, 30));
    for (const char* name : {"frames/aa/001.bmp", "frames/aa/k001.bmp", "001.bmp", "k001.bmp"})
        ASSERT_TRUE(black.save(at(name)));
    ASSERT_TRUE(writeWholeFile(at("frames/aa/002.bmp").toStdString(), "no bitmap"));
    ASSERT_TRUE(writeWholeFile(at("frames/aa/k002.bmp").toStdString(), "no bitmap"));

    const auto shown = [&](const char* mode, const QString& text) {
        EXPECT_EQ(run({QString::fromLatin1(mode), "--paper", "10/15", "--png", "--record", text, "--frames", "frames",
                       "--out", "out", "a b.jpg"}),
                  0)
            << qPrintable(text) << ": " << qPrintable(m_err);
        return QImage(at("out/a b.png"));
    };
    const QString bare = record("180", "225", "000", "");
    struct Case {
        const char* what;
        QString faulty;
        QString like;
        const char* mode = "print";
    };
    const Case cases[] = {
        {"letters behind a number", record("19x", "2x", "000", ""), record("19", "2", "000", "")},
        {"letters for a number", record("x80", "225", "000", ""), bare},
        {"999 in one axis", record("180", "999", "000", ""), bare, "preview"},
        {"no such frame", record("180", "225", "777", "aa"), bare},
        {"a frame that is no bitmap", record("180", "225", "002", "aa"), bare},
        {"a folder with ..", record("180", "225", "001", "aa/.."), bare},
        {"a folder above", record("180", "225", "001", ".."), bare},
        {"a folder with a backslash", record("180", "225", "001", "aa\\..\\.."), bare},
        {"an absolute folder", record("180", "225", "001", "/tmp"), bare},
        {"a frame with ..", record("180", "225", "../", "aa"), bare},
    };
    for (const Case& fault : cases)
        EXPECT_EQ(shown(fault.mode, fault.faulty), shown(fault.mode, fault.like)) << fault.what;
    EXPECT_NE(shown("print", record("180", "225", "001", "aa")), shown("print", bare)) << "the frame itself shows";
}

TEST_F(LumoraRenderTest, eachFaultOfACallHasItsStatusAndItsMessage) {
    struct Case {
        QStringList call;
        int status;
        const char* message;
    };
    const QString record = u"1   1   1   180100225 150 0  0  000"_s;
    const Case cases[] = {
        {{"print", "--paper", "10/15", "--record", record, "--out", "out", "gone.jpg"}, 1, "gone.jpg"},
        {{"preview", "--paper", "10/15", "--record", record, "--out", "out", "broken.jpg"}, 1, "broken.jpg"},
        {{"print", "--paper", "zz/zz", "--out", "out", "a b.jpg"}, 2, "--paper zz/zz is no paper size"},
        {{"print", "--paper", "0/15", "--out", "out", "a b.jpg"}, 2, "--paper 0/15 is no paper size"},
        {{"print", "--paper", "***", "--out", "out", "a b.jpg"}, 2, "--paper *** is no paper size"},
        {{"print", "--paper", "10/15", "--background", "12345", "--out", "out", "a b.jpg"}, 2, "is no colour"},
        {{"print", "--paper", "10/15", "--background", "12345G", "--out", "out", "a b.jpg"}, 2, "is no colour"},
        {{"print", "--paper", "10/15", "--frames", "gone", "--out", "out", "a b.jpg"}, 2, "--frames gone is no folder"},
    };
    for (const Case& fault : cases) {
        EXPECT_EQ(run(fault.call), fault.status) << qPrintable(fault.call.join(u' '));
        EXPECT_TRUE(m_err.startsWith(u"lumora-render: "_s)) << qPrintable(m_err);
        EXPECT_TRUE(m_err.contains(QString::fromLatin1(fault.message))) << qPrintable(m_err);
    }
    EXPECT_TRUE(QDir(at("out")).isEmpty());
}

TEST_F(LumoraRenderTest, aCallThatCanNotBeUnderstoodDoesNothing) {
    const QByteArray before = *encodeJpeg(*loadPicture(at("a b.jpg").toStdString()), 90);
    for (const QStringList& call :
         {QStringList{}, QStringList{"plain", "a b.jpg"}, QStringList{"plain", "--paper", "zz/zz", "a b.jpg"},
          QStringList{"plain", "--paper"}, QStringList{"small", "--size", "0", "--out", "out", "a b.jpg"},
          QStringList{"small", "--size", "9x", "--out", "out", "a b.jpg"}, QStringList{"large", "a b.jpg"},
          QStringList{"small"}, QStringList{"print", "--out", "out", "a b.jpg"},
          QStringList{"preview", "--paper", "10/15", "--background", "red", "--out", "out", "a b.jpg"},
          QStringList{"print", "--paper", "10/15", "--frames", "no such folder", "--out", "out", "a b.jpg"},
          QStringList{"small", "--sise", "90", "a b.jpg"}, QStringList{"small", "--out", "no such folder", "a b.jpg"},
          QStringList{"plain", "--paper", "10/15", "--out", ".", "a b.jpg"},
          QStringList{"plain", "--paper", "10/15", "--out", "out", "a b.jpg", "./a b.jpg"}}) {
        EXPECT_EQ(run(call), 2) << qPrintable(call.join(u' '));
        EXPECT_TRUE(m_err.startsWith(u"lumora-render: "_s)) << qPrintable(m_err);
    }
    EXPECT_EQ(*encodeJpeg(*loadPicture(at("a b.jpg").toStdString()), 90), before);
    EXPECT_TRUE(QDir(at("out")).isEmpty());
    EXPECT_EQ(run({"--help"}), 0);
    EXPECT_TRUE(m_out.contains(u"--paper"_s));
}

} // namespace
} // namespace lumora
