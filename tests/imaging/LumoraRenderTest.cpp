#include "JpegOfKind.h"
#include "common/HostFile.h"
#include "imaging/files/PictureFile.h"

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

    QByteArray source() const {
        const Result<QByteArray> bytes = readWholeFile(at("a b.jpg").toStdString(), u"a b.jpg"_s, 1 << 30);
        return bytes ? *bytes : QByteArray();
    }
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

TEST_F(LumoraRenderTest, makesWhatItIsAskedFor) {
    struct Case {
        const char* call; // "a b.jpg" goes behind it, and a record in place of the sign
        const char* made;
        QSize size;
    };
    for (const Case& c :
         {Case{"plain --paper 10/15 --time --out out", "out/a b.jpg", {1800, 1350}},
          Case{"plain --paper=10/15 --png --out out", "out/a b.png", {1800, 1350}},
          Case{"small --size 90 --out out", "out/a b.png", {90, 68}},
          Case{"print --paper 10/15 --record % --time --out out", "out/a b.jpg", {1500, 1000}},
          Case{"preview --paper 10/15 --record % --background 204060 --out out", "out/a b.png", {450, 300}}}) {
        QStringList call = QString::fromLatin1(c.call).split(u' ');
        call.replaceInStrings(u"%"_s, u"1   1   1   27040 225 150 0  0  000"_s);
        EXPECT_EQ(run(call + QStringList{"a b.jpg"}), 0) << qPrintable(m_err);
        EXPECT_EQ(QImage(at(c.made)).size(), c.size) << c.call;
        EXPECT_EQ(m_out.startsWith(u"a b.jpg decode "_s) && m_out.count(u'\n') == 1, call.contains(u"--time"_s));
    }
    const QImage preview(at("out/a b.png"));
    EXPECT_EQ(preview.pixelColor(2, 2), QColor(0x20, 0x40, 0x60));
    EXPECT_NE(preview.pixelColor(225, 150), QColor(0x20, 0x40, 0x60));
}

TEST_F(LumoraRenderTest, aPictureThatFailsIsNamedAndTheOthersAreDone) {
    EXPECT_EQ(run({"plain", "--paper", "10/15", "--out", "out", "broken.jpg", "a b.jpg"}), 1);
    EXPECT_TRUE(m_err.contains(u"broken.jpg"_s)) << qPrintable(m_err);
    EXPECT_TRUE(QFileInfo::exists(at("out/a b.jpg")));
    EXPECT_FALSE(QFileInfo::exists(at("out/broken.jpg")));
}

TEST_F(LumoraRenderTest, eachFaultOfACallHasItsStatusAndItsMessageAndWritesNothing) {
    const QByteArray before = source();
    struct Case {
        const char* call; // "a b.jpg" goes behind it
        int status;
        const char* message;
    };
    const Case cases[] = {
        {"preview --paper 10/15 --out out broken.jpg", 1, "broken.jpg"},
        {"print --paper 10/15 --out out gone.jpg", 1, "gone.jpg"},
        {"print --paper zz/zz --out out", 2, "--paper zz/zz is no paper size"},
        {"print --paper 0/15 --out out", 2, "--paper 0/15 is no paper size"},
        {"print --paper *** --out out", 2, "--paper *** is no paper size"},
        {"print --paper 10/15 --background 12345 --out out", 2, "is no colour"},
        {"preview --paper 10/15 --background 12345G --out out", 2, "is no colour"},
        {"print --paper 10/15 --frames gone --out out", 2, "--frames gone is no folder"},
        {"print --out out", 2, ""},
        {"plain", 2, ""},
        {"large", 2, ""},
        {"small --size 0 --out out", 2, ""},
        {"small --size 9x --out out", 2, ""},
        {"small --sise 90", 2, ""},
        {"small --out gone", 2, ""},
        {"plain --paper 10/15 --out .", 2, ""},
        {"plain --paper 10/15 --out out ./a\tb.jpg", 2, ""},
    };
    for (const Case& fault : cases) {
        QStringList call = QString::fromLatin1(fault.call).split(u' ');
        call.replaceInStrings(u"\t"_s, u" "_s);
        EXPECT_EQ(run(call + QStringList{"a b.jpg"}), fault.status) << fault.call;
        EXPECT_TRUE(m_err.startsWith(u"lumora-render: "_s)) << qPrintable(m_err);
        EXPECT_TRUE(m_err.contains(QString::fromLatin1(fault.message))) << qPrintable(m_err);
        if (fault.status == 2) {
            EXPECT_TRUE(QDir(at("out")).isEmpty()) << fault.call;
        }
        QDir(at("out")).removeRecursively();
        QDir(m_folder.path()).mkdir(u"out"_s);
    }
    for (const QStringList& call : {QStringList{}, QStringList{"small"}, QStringList{"plain", "--paper"}})
        EXPECT_EQ(run(call), 2);
    EXPECT_EQ(source(), before);
    EXPECT_EQ(run({"--help"}), 0);
    EXPECT_TRUE(m_out.contains(u"--paper"_s));
}

} // namespace
} // namespace lumora
