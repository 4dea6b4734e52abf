#include "platform/files/Drives.h"
#include "common/AnsiCodePage.h"
#include "support/DrivePathLiteral.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <fstream>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

namespace fs = std::filesystem;

class DrivesTest : public ::testing::Test {
    QTemporaryDir m_folder;

protected:
    HostPath base = toHostPath(m_folder.path());
    HostPath data = base / "drive_c";
    HostPath media = base / "media";

    void SetUp() override {
        fs::create_directories(data);
        fs::create_directories(media);
    }
    Drives make(QChar letter = u'C') const { return Drives(data, letter, {media}); }
    void insertCard(const char* name) const {
        fs::create_directories(media / name);
        std::ofstream(media / name / "a.jpg") << "x";
    }
};

TEST_F(DrivesTest, MapsTheLettersBothWays) {
    insertCard("CARD");
    const Drives drives = make();
    const std::pair<const char*, HostPath> cases[] = {
        {"C:\\2000lumora\\!!000", data / "2000lumora" / "!!000"},
        {"C:\\", data},
        {"D:\\a.jpg", media / "CARD" / "a.jpg"},
        {"Z:\\etc", "/etc"},
        {"Z:\\", "/"},
    };
    for (const auto& [drivePath, hostPath] : cases) {
        const auto host = drives.toHost(DrivePath(QString::fromLatin1(drivePath)));
        ASSERT_TRUE(host) << drivePath;
        EXPECT_EQ(host->lexically_normal(), hostPath) << drivePath;
        EXPECT_EQ(drives.toDrive(hostPath).text().toStdString(), drivePath);
    }
    EXPECT_EQ(drives.toHost(u"c:\\a//b\\.\\x\\..\\c"_path), data / "a" / "b" / "c");
    EXPECT_EQ(drives.toDrive(data / "sub" / ".." / "x/"), u"C:\\x"_path);
}

TEST_F(DrivesTest, RefusesWhatIsNoPathOfADrive) {
    const Drives drives = make();
    for (const char* path : {"", "C", "***", "\\a", "E:\\a", "1:\\a", "C:\\..\\secret", "C:\\a\\..\\..\\secret"})
        EXPECT_FALSE(drives.toHost(DrivePath(QString::fromLatin1(path)))) << path;
    EXPECT_FALSE(drives.toHost(DrivePath(u"C:\\a"_s + QChar(0) + u'b')));
}

TEST_F(DrivesTest, GivesTheLetterOfACardToNoOther) {
    insertCard("ONE");
    insertCard("TWO");
    fs::create_directories(media / "cdrom"); // a place without a medium
    Drives drives = make(u'E');
    EXPECT_EQ(drives.programRoot(), u"E:\\"_path);
    EXPECT_EQ(drives.toDrive(media / "ONE"), u"D:\\"_path);
    EXPECT_EQ(drives.toDrive(media / "TWO"), u"F:\\"_path); // E: is the program's own

    fs::remove_all(media / "ONE");
    drives.refreshMedia();
    EXPECT_EQ(drives.drives().size(), 3U);
    EXPECT_EQ(drives.toDrive(media / "TWO"), u"F:\\"_path);

    insertCard("THREE");
    drives.refreshMedia();
    EXPECT_EQ(drives.toDrive(media / "THREE"), u"G:\\"_path);
    EXPECT_EQ(drives.drives().size(), 4U);
    insertCard("ONE");
    drives.refreshMedia();
    EXPECT_EQ(drives.toDrive(media / "ONE"), u"D:\\"_path);
}

TEST_F(DrivesTest, OffersTheDrivesThatTheLabPutsFirstBeforeTheOthers) {
    insertCard("ONE");
    insertCard("TWO");
    const Drives drives(data, u'C', {media}, u"ZXE"_s);
    QString letters;
    for (const Drives::Drive& drive : drives.drives())
        letters += drive.letter;
    EXPECT_EQ(letters, u"ZECD");
    EXPECT_EQ(drives.toDrive(media / "TWO" / "a.jpg"), u"E:\\a.jpg"_path);
}

TEST_F(DrivesTest, CountsAMediumThatShowsTwiceOnce) {
    insertCard("CARD");
    const HostPath second = base / "run";
    fs::create_directories(second);
    fs::create_directory_symlink(media / "CARD", second / "CARD");
    const Drives drives(data, u'C', {media, second});
    EXPECT_EQ(drives.drives().size(), 3U);
}

TEST_F(DrivesTest, CarriesNamesThatAreNoTextAndGivesTheirBytesBack) {
    const Drives drives = make();
    for (const std::string& name :
         {std::string("a\xff\xfe.jpg"), std::string("\xe1\xe2.jpg"), std::string("back\\slash"),
          std::string("\xef\xbb\xbf"
                      "bom"),
          std::string("\xed\xb2\x80"), std::string("\xf0\x9f\x98\x80"), std::string("\xf0\x9f\x98"),
          std::string("אב.jpg")}) {
        const DrivePath path = drives.toDrive(data / name);
        EXPECT_EQ(drives.toHost(path)->native(), (data / name).native()) << name;
        EXPECT_EQ(path.text().count(u'\\'), 1) << name;
    }
    EXPECT_EQ(AnsiCodePage::squeeze(drives.toDrive(data / "a\xff.jpg").text()), u"C:\\a?.jpg"_s);
}

TEST(ShortenedName, KeepsTheEndingAndTellsLongNamesApart) {
    const QString letters(200, QChar(0x05D0)); // 400 bytes
    const QString one = ShortenedName(letters + u"1.jpg"_s);
    const QString two = ShortenedName(letters + u"2.jpg"_s);
    EXPECT_LE(toHostPath(one).native().size(), 255U);
    EXPECT_GE(toHostPath(one).native().size(), 250U);
    EXPECT_TRUE(one.endsWith(u".jpg"_s));
    EXPECT_NE(one, two);
    EXPECT_EQ(ShortenedName(one), one);
    EXPECT_EQ(ShortenedName(u"קצר.jpg"_s), u"קצר.jpg"_s);
    EXPECT_EQ(ShortenedName(QString(255, u'a')).size(), 255);
    EXPECT_EQ(toHostPath(ShortenedName(QString(130, QChar(0xD83D)) + QString(256, u'.'))).native().size(), 255U);
}

} // namespace
} // namespace lumora
