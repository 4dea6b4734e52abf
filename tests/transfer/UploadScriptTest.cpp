#include "transfer/UploadScript.h"
#include "support/FakeWebLab.h"
#include "support/TestPlatform.h"
#include "transfer/ServerList.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

const QByteArray header = "Content-Disposition: form-data; name=\"uploadedFile\"; filename=\"";

TEST(MultipartBodyTest, IsWhatTheScriptIsUsedToByteForByte) {
    EXPECT_EQ(MultipartBody({{QStringLiteral("a.jpg"), "xyz"}}),
              "--OLA_GRAIN\r\n" + header + "a.jpg\";\r\nContent-type: file\r\n\r\nxyz\r\n--OLA_GRAIN--");
    EXPECT_EQ(MultipartBody({{QStringLiteral("a.jpg"), "xyz"}, {QStringLiteral("b.jpg"), "12"}}),
              "--OLA_GRAIN\r\n" + header + "a.jpg\";\r\nContent-type: file\r\n\r\nxyz\r\nOLA_GRAIN\r\n" + header +
                  "b.jpg\";\r\nContent-type: file\r\n\r\n12\r\n--OLA_GRAIN--");
    EXPECT_EQ(MultipartBody({{QStringLiteral("a.jpg"), "xyz"}}).size(), 125);
    EXPECT_EQ(MultipartBody({{QStringLiteral("a.jpg"), ""}}).size(), 122);
    EXPECT_EQ(MultipartBody({{QStringLiteral("a.jpg"), "xyz"}, {QStringLiteral("b.jpg"), "12"}}).size(), 234);
    // Three files, a Hebrew name, bytes that no text could carry.
    const QByteArray raw("\x00\xFF\xCA\r\n\x80", 6);
    EXPECT_EQ(MultipartBody({{QStringLiteral("דנה.jpg"), raw}, {QStringLiteral("b"), ""}, {QStringLiteral("c"), "3"}}),
              "--OLA_GRAIN\r\n" + header + "\xe3\xf0\xe4.jpg\";\r\nContent-type: file\r\n\r\n" + raw +
                  "\r\nOLA_GRAIN\r\n" + header + "b\";\r\nContent-type: file\r\n\r\n\r\nOLA_GRAIN\r\n" + header +
                  "c\";\r\nContent-type: file\r\n\r\n3\r\n--OLA_GRAIN--");
}

struct UploadScriptTest : ::testing::Test {
    FakeWebLab lab;
    TestPlatform test{lab};
    UploadScript script{test.platform};
    const QString order = QStringLiteral("2026_11_21_KUP_1234^105");
    const QString extra = QStringLiteral("value1=Hello&value2=World!");
    const QString path = QStringLiteral("C:\\a.jpg");

    void SetUp() override { ASSERT_TRUE(test.files.writeWhole(path, "xyz")); }
};

TEST_F(UploadScriptTest, TheTwoFormsDifferInTypeVersionAndAnnouncedLength) {
    EXPECT_EQ(script.MultipartPost(order, {path}, QStringLiteral("http://192.0.2.10/p/getfile2.php"),
                                   QStringLiteral("C:\\"), extra, {}, {}),
              QStringLiteral("stored"));
    EXPECT_EQ(script.MultipartPostInet(order, {path}, QStringLiteral("192.0.2.10"), QStringLiteral("/p/getfile2.php"),
                                       QStringLiteral("C:\\"), extra),
              QStringLiteral("stored"));
    ASSERT_EQ(lab.posts.size(), 2u);
    const QString address =
        QStringLiteral("http://192.0.2.10/p/getfile2.php?folder=2026_11_21_KUP_1234^105&value1=Hello&value2=World!");
    EXPECT_EQ(lab.urls, QStringList({address, address}));
    EXPECT_EQ(lab.posts[0].body, lab.posts[1].body);
    EXPECT_EQ(lab.posts[0].contentType, "multipart/form-data; boundary=OLA_GRAIN");
    EXPECT_EQ(lab.posts[1].contentType, "multipart/form-data, boundary=OLA_GRAIN");
    EXPECT_EQ(lab.posts[0].announcedLength, 0);
    EXPECT_EQ(lab.posts[1].announcedLength, 249);
    ASSERT_TRUE(test.files.writeWhole(QStringLiteral("C:\\b.jpg"), "12"));
    const auto announced = [&](const QStringList& files) {
        (void)script.MultipartPostInet(order, files, QStringLiteral("192.0.2.10"), QStringLiteral("/p/getfile2.php"),
                                       QStringLiteral("C:\\"), {});
        return lab.posts.back().announcedLength;
    };
    EXPECT_EQ(announced({path, QStringLiteral("C:\\b.jpg")}), 467);
    EXPECT_EQ(lab.urls.last(), QStringLiteral("http://192.0.2.10/p/getfile2.php?folder=2026_11_21_KUP_1234^105&"))
        << "an empty rest leaves its mark";
    ASSERT_TRUE(test.files.writeWhole(path, {}));
    EXPECT_EQ(announced({path}), 243);
    EXPECT_EQ(lab.posts[0].version, PostRequest::Version::Http11);
    EXPECT_EQ(lab.posts[1].version, PostRequest::Version::Http10);
}

TEST_F(UploadScriptTest, AFileThatIsMissingOrWouldBreakItsHeaderIsNeverSent) {
    for (const char* name : {"C:\\missing.jpg", "C:\\a\"b.jpg", "C:\\a\r\nX: y.jpg"}) {
        const QString file = QString::fromLatin1(name);
        EXPECT_EQ(
            script.MultipartPost(order, {path, file}, QStringLiteral("http://h/"), QStringLiteral("C:\\"), {}, {}, {}),
            QString());
        EXPECT_TRUE(script.failed()) << name;
        EXPECT_TRUE(
            script
                .MultipartPostInet(order, {file}, QStringLiteral("h"), QStringLiteral("/"), QStringLiteral("C:\\"), {})
                .startsWith(QStringLiteral("Error: ")));
    }
    EXPECT_TRUE(lab.posts.empty());
    lab.deadPosts = 2;
    EXPECT_EQ(script.MultipartPost(order, {path}, QStringLiteral("http://h/"), QStringLiteral("C:\\"), {}, {}, {}),
              QString());
    EXPECT_EQ(
        script.MultipartPostInet(order, {path}, QStringLiteral("h"), QStringLiteral("/"), QStringLiteral("C:\\"), {}),
        QStringLiteral("Error: nobody answers"));
}

TEST(ServerListTest, ATextOf35CharactersIsNoListing) {
    const QString text = QStringLiteral("2026_11_21_KUP_1234^105~~a~~total:1"); // 35
    ASSERT_EQ(text.size(), 35);
    EXPECT_EQ(ParseServerList(QStringLiteral("  ") + text + u'\n'), QStringList());
    EXPECT_EQ(
        ParseServerList(QStringLiteral("2026_11_21_KUP_1234^105~~ab~~ ~~~~total:1")),
        QStringList({QStringLiteral("2026_11_21_KUP_1234^105"), QStringLiteral("ab"), QStringLiteral("total:1")}));
}

TEST(ServerListTest, AnEntryStrikesOneNameThatContainsIt) {
    const QString folder = QStringLiteral("2026_11_21_KUP_1234^105");
    const QString log = QStringLiteral("C:\\o\\2026_11_21_KUP_1234^105.txt");
    const QString small = QStringLiteral("C:\\o\\1.jpp");
    const QString large = QStringLiteral("C:\\o\\11.JPP");
    const struct {
        QStringList entries;
        QStringList left;
    } cases[] = {
        {{folder, QStringLiteral("total:3")}, {log, large, small}},
        {{folder, log.mid(5), QStringLiteral("total:1")}, {large, small}},
        {{QStringLiteral(" 11.jpp ")}, {log, small}},
        {{QStringLiteral("1.jpp")}, {log, small}}, // taken as arrived: its name contains the listed one
        {{QStringLiteral("1.jpp"), QStringLiteral("1.JPP")}, {log}},
        {{QStringLiteral("..\\..\\x"), QStringLiteral("C:\\o\\1.jpp")}, {log, large, small}},
    };
    for (const auto& c : cases)
        EXPECT_EQ(MarkHossarim({log, large, small}, c.entries, folder), c.left) << c.entries.join(u'|').toStdString();
}

TEST(ServerListTest, AListMustNameTheFolderAndATotalAndNoWhereSayNot) {
    const QString folder = QStringLiteral("2026_11_21_KUP_1234^105");
    const QString files = QStringLiteral("~~021015GNB0000_03AABB.jpp~~");
    const struct {
        QString answer;
        ServerVerdict verdict;
    } cases[] = {
        {folder + files + QStringLiteral("total:1"), ServerVerdict::Listed},
        {folder + files + QStringLiteral("TOTAL: 99"), ServerVerdict::Listed},
        {folder + files, ServerVerdict::NotVerified},
        {QStringLiteral("other") + files + QStringLiteral("total:1"), ServerVerdict::NotVerified},
        {folder + files + QStringLiteral("total:1~~NoT found"), ServerVerdict::NotVerified},
        {QString(), ServerVerdict::NotVerified},
    };
    for (const auto& c : cases)
        EXPECT_EQ(ReadServerAnswer(c.answer, folder).verdict, c.verdict) << c.answer.toStdString();
    EXPECT_EQ(ListFileName(0), QStringLiteral("filelisthom.txt"));
    EXPECT_EQ(ListFileName(3), QStringLiteral("filelisthom3.txt"));
    EXPECT_EQ(ListFileName(4), QString());
}

} // namespace
} // namespace lumora
