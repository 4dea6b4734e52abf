#include "platform/files/Files.h"

#include "common/HostFile.h"
#include "support/DrivePathLiteral.h"
#include "support/Take.h"

#include <QTemporaryDir>

#include <sys/stat.h>

#include <gtest/gtest.h>

#include <fstream>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

namespace fs = std::filesystem;

class FilesTest : public ::testing::Test {
    QTemporaryDir m_folder;

protected:
    HostPath data = toHostPath(m_folder.path());
    Drives drives{data, u'C', {}};
    Files files{drives};

    // Names that are no text are beyond the temporary folder's own removal.
    void TearDown() override { fs::remove_all(data); }

    void put(const HostPath& name, const std::string& content = "x") const {
        fs::create_directories((data / name).parent_path());
        std::ofstream(data / name, std::ios::binary) << content;
    }
    // What is left in a folder besides its named files, hidden ones included.
    static int countAll(const HostPath& folder) {
        return static_cast<int>(std::distance(fs::directory_iterator(folder), fs::directory_iterator()));
    }
};

TEST_F(FilesTest, ListsByPatternWithoutCaseAndSortsWithoutCase) {
    for (const char* name :
         {"b.JPG", "A.jpg", "10.Jpg", "!7.jpp", "a.jpp", ".hidden.jpg", "noending", "ת.jpg", "c.jpeg", "_u.jpg"})
        put(name);
    fs::create_directory(data / "folder.jpg");
    fs::create_symlink("nowhere", data / "broken.jpg");
    const std::pair<const char*, const char*> cases[] = {
        {"*.jpg", "10.Jpg|_u.jpg|A.jpg|b.JPG|ת.jpg"},
        {"*.JPP;*.jpeg", "!7.jpp|a.jpp|c.jpeg"},
        {" *.jpp ; *.gbr", "!7.jpp|a.jpp"},
        {"?.jpg", "A.jpg|b.JPG|ת.jpg"},
        {"*.*", "!7.jpp|10.Jpg|_u.jpg|A.jpg|a.jpp|b.JPG|c.jpeg|noending|ת.jpg"},
        {"*", "!7.jpp|10.Jpg|_u.jpg|A.jpg|a.jpp|b.JPG|c.jpeg|noending|ת.jpg"},
        {"a*j*p*", "A.jpg|a.jpp"},
        {"", ""},
    };
    for (const auto& [pattern, expected] : cases)
        EXPECT_EQ(files.names(u"C:\\"_path, QString::fromLatin1(pattern)).join(u'|').toStdString(), expected)
            << pattern;
    EXPECT_EQ(files.folders(u"C:\\"_path), QStringList(u"folder.jpg"_s));
    EXPECT_TRUE(files.names(u"C:\\missing"_path, u"*"_s).isEmpty());
}

TEST_F(FilesTest, ShowsAQuestionMarkForWhatTheCodePageLacksAndTakesItForAbsent) {
    put("漢.jpg");
    put("\xff.jpg");
    EXPECT_EQ(files.names(u"C:\\"_path, u"*.jpg"_s), QStringList({u"?.jpg"_s, u"?.jpg"_s}));
    put("real?.jpg");
    EXPECT_FALSE(files.fileExists(u"C:\\real?.jpg"_path));
    EXPECT_EQ(files.read(u"C:\\real?.jpg"_path).failure().kind, Failure::Kind::NotFound);
    EXPECT_FALSE(files.writeWhole(u"C:\\new?.jpg"_path, "x"));
}

TEST_F(FilesTest, CollectsThroughSubfoldersAndEndsWhereALinkLeadsBack) {
    put("a/1.jpg");
    put("a/b/2.jpg");
    fs::create_directory_symlink(data, data / "a" / "b" / "loop");
    EXPECT_EQ(files.collect(u"C:\\a\\"_path, Files::Depth::WithSubfolders).join(u'|'),
              u"C:\\a\\1.jpg|C:\\a\\b\\2.jpg"_s);
    EXPECT_EQ(files.collect(u"C:\\a"_path, Files::Depth::ThisFolder).join(u'|'), u"C:\\a\\1.jpg"_s);
}

TEST_F(FilesTest, MakesFoldersForTheirOwnerOnly) {
    ASSERT_TRUE(files.makeFolder(u"C:\\2000lumora"_path));
    ASSERT_TRUE(files.makeFolder(u"C:\\2000lumora"_path)); // again
    struct stat status {};
    ASSERT_EQ(::stat((data / "2000lumora").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 0777, 0700U);
    EXPECT_EQ(files.makeFolder(u"C:\\no\\parent"_path).failure().kind, Failure::Kind::NotFound);
    put("afile");
    EXPECT_FALSE(files.makeFolder(u"C:\\afile"_path));
    EXPECT_TRUE(*files.makeNewFolder(u"C:\\claimed"_path));
    EXPECT_FALSE(*files.makeNewFolder(u"C:\\claimed"_path));
    EXPECT_FALSE(files.makeNewFolder(u"C:\\no\\parent"_path).ok());
}

TEST_F(FilesTest, RemovesAWholeTreeButNoFolderOfTheDriveItself) {
    put("work/order/.kept/one.jpg");
    put("work/order/.order");
    put("work/other/a.jpg");
    fs::create_directory_symlink(data / "work" / "other", data / "work" / "order" / "link");
    for (const DrivePath& path : {u"C:\\"_path, u"C:\\work"_path, u"C:\\work\\"_path, u"C:\\work\\.."_path})
        EXPECT_FALSE(files.removeTree(path)) << path.text().toStdString();
    ASSERT_TRUE(files.removeTree(u"C:\\work\\order"_path));
    ASSERT_TRUE(files.removeTree(u"C:\\work\\order"_path)); // again
    EXPECT_FALSE(fs::exists(data / "work" / "order"));
    EXPECT_TRUE(fs::exists(data / "work" / "other" / "a.jpg"));
}

TEST_F(FilesTest, KeepsACopyThatStaysWhenTheSourceIsReplacedOrRemoved) {
    put("a.jpg", "first");
    ASSERT_TRUE(files.keepCopy(u"C:\\a.jpg"_path, u"C:\\kept.jpg"_path));
    ASSERT_TRUE(files.writeWhole(u"C:\\a.jpg"_path, "second"));
    EXPECT_EQ(take(files.read(u"C:\\kept.jpg"_path)), "first");
    ASSERT_TRUE(files.keepCopy(u"C:\\a.jpg"_path, u"C:\\kept.jpg"_path)) << "over an older one";
    ASSERT_TRUE(files.removeFile(u"C:\\a.jpg"_path));
    EXPECT_EQ(take(files.read(u"C:\\kept.jpg"_path)), "second");
    EXPECT_FALSE(files.keepCopy(u"C:\\a.jpg"_path, u"C:\\kept.jpg"_path));
}

TEST_F(FilesTest, StoresAnyBytesUnderALongHebrewNameAndFindsThemAgain) {
    const DrivePath path = u"C:\\"_path / (QString(200, QChar(0x05D0)) + u".jpg"_s);
    const QByteArray bytes = QByteArray("\r\n\0\xff mixed\n", 11).repeated(200000); // more than a copy takes at once
    ASSERT_TRUE(files.writeWhole(path, "old") && files.writeWhole(path, bytes));
    ASSERT_TRUE(files.copyFile(path, u"C:\\copy.txt"_path));
    EXPECT_EQ(take(files.read(path)) + take(files.read(u"C:\\copy.txt"_path)), bytes + bytes);
    EXPECT_EQ(take(files.size(path)), bytes.size());
    const QStringList listed = files.names(u"C:\\"_path, u"*.jpg"_s);
    ASSERT_EQ(listed.size(), 1);
    EXPECT_TRUE(files.removeFile(u"C:\\"_path / listed[0]));
    EXPECT_FALSE(files.fileExists(path));
    EXPECT_EQ(countAll(data), 1);
}

TEST_F(FilesTest, NeverListsWhatIsHiddenAndTakesWhatAKillLeftAtTheNextStart) {
    const char* leftBehind[] = {"order/.lumora-4711-0.tmp", "order/deep/.lumora-4711-12.tmp", ".lumora-1-1.tmp"};
    const char* kept[] = {".lumora-runs", "order/.order", "order/lumora-1-1.tmp", "order/a.jpp", "order/.lumora-notes"};
    for (const char* name : leftBehind)
        put(name);
    for (const char* name : kept)
        put(name);
    fs::create_directory(data / "order" / ".kept");
    put("order/.kept/one.bmp");
    EXPECT_EQ(files.names(u"C:\\order"_path, u"*.*"_s), QStringList({u"a.jpp"_s, u"lumora-1-1.tmp"_s}));
    EXPECT_EQ(files.folders(u"C:\\order"_path), QStringList(u"deep"_s));
    EXPECT_EQ(files.collect(u"C:\\order"_path, Files::Depth::WithSubfolders),
              QStringList({u"C:\\order\\a.jpp"_s, u"C:\\order\\lumora-1-1.tmp"_s}));

    const auto now = fs::file_time_type::clock::now();
    EXPECT_EQ(removeLeftovers(data, now - std::chrono::hours(1)), 0) << "a program may be writing it";
    EXPECT_EQ(removeLeftovers(data, now + std::chrono::hours(1)), 3);
    for (const char* name : leftBehind)
        EXPECT_FALSE(fs::exists(data / name)) << name;
    for (const char* name : kept)
        EXPECT_TRUE(fs::exists(data / name)) << name;
}

TEST_F(FilesTest, FailsWithPathAndReason) {
    const auto missing = files.read(u"C:\\no.txt"_path);
    EXPECT_EQ(missing.failure().kind, Failure::Kind::NotFound);
    EXPECT_TRUE(missing.failure().message.contains(u"C:\\no.txt"_s)) << missing.failure().message.toStdString();
    fs::create_directory(data / "folder");
    EXPECT_FALSE(files.read(u"C:\\folder"_path));
    EXPECT_FALSE(files.writeWhole(u"C:\\folder"_path, "x"));
    EXPECT_FALSE(files.removeFile(u"C:\\folder"_path));
    EXPECT_FALSE(files.copyFile(u"C:\\no.txt"_path, u"C:\\to.txt"_path));
    EXPECT_FALSE(files.fileExists(u"C:\\to.txt"_path));
    ASSERT_EQ(::mkfifo((data / "pipe").c_str(), 0600), 0);
    EXPECT_FALSE(files.read(u"C:\\pipe"_path)); // and does not wait for a writer
    EXPECT_EQ(countAll(data), 2);
}

TEST_F(FilesTest, SnapshotsOfAListStayUntilRefreshed) {
    put("a.jpg");
    FileList list(files, u"*.jpg"_s);
    EXPECT_EQ(list.count(), 0);
    list.setFolder(u"C:\\"_path);
    put("b.jpg");
    EXPECT_EQ(list.count(), 1);
    list.refresh();
    EXPECT_EQ(list.name(1) + list.name(-1), u"b.jpg"_s);
    list.setPattern(u"*.txt"_s);
    EXPECT_EQ(list.count(), 0);
}

} // namespace
} // namespace lumora
