#include "transfer/http/UploadScript.h"
#include "session/SessionState.h"
#include "support/FakeWebLab.h"
#include "support/TestPlatform.h"
#include "transfer/http/HttpListGuard.h"
#include "transfer/http/ServerList.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

const QByteArray header = "Content-Disposition: form-data; name=\"uploadedFile\"; filename=\"";

TEST(MultipartBodyTest, IsWhatTheScriptIsUsedToByteForByte) {
    EXPECT_EQ(MultipartBody({{u"a.jpg"_s, "xyz"}}),
              "--OLA_GRAIN\r\n" + header + "a.jpg\";\r\nContent-type: file\r\n\r\nxyz\r\n--OLA_GRAIN--");
    // Three files, a Hebrew name, bytes that no text could carry.
    const QByteArray raw("\x00\xFF\xCA\r\n\x80", 6);
    EXPECT_EQ(MultipartBody({{u"דנה.jpg"_s, raw}, {u"b"_s, ""}, {u"c"_s, "3"}}),
              "--OLA_GRAIN\r\n" + header + "\xe3\xf0\xe4.jpg\";\r\nContent-type: file\r\n\r\n" + raw +
                  "\r\nOLA_GRAIN\r\n" + header + "b\";\r\nContent-type: file\r\n\r\n\r\nOLA_GRAIN\r\n" + header +
                  "c\";\r\nContent-type: file\r\n\r\n3\r\n--OLA_GRAIN--");
}

struct UploadScriptTest : ::testing::Test {
    FakeWebLab lab;
    TestPlatform test{lab};
    UploadScript script{test.platform};
    const QString order = u"2026_11_21_KUP_1234^105"_s;
    const QString extra = u"value1=Hello&value2=World!"_s;
    const QString path = u"C:\\a.jpg"_s;

    void SetUp() override { ASSERT_TRUE(test.files.writeWhole(DrivePath(path), "xyz")); }
};

TEST_F(UploadScriptTest, TheTwoFormsDifferInTypeVersionAndAnnouncedLength) {
    EXPECT_EQ(script.MultipartPost(order, {path}, u"http://192.0.2.10/p/getfile2.php"_s, u"C:\\"_path, extra, {}, {}),
              u"stored"_s);
    EXPECT_EQ(script.MultipartPostInet(order, {path}, u"192.0.2.10"_s, u"/p/getfile2.php"_s, u"C:\\"_path, extra),
              u"stored"_s);
    ASSERT_EQ(lab.posts.size(), 2u);
    const QString address =
        u"http://192.0.2.10/p/getfile2.php?folder=2026_11_21_KUP_1234^105&value1=Hello&value2=World!"_s;
    EXPECT_EQ(lab.urls, QStringList({address, address}));
    EXPECT_EQ(lab.posts[0].body, lab.posts[1].body);
    EXPECT_EQ(lab.posts[0].contentType, "multipart/form-data; boundary=OLA_GRAIN");
    EXPECT_EQ(lab.posts[1].contentType, "multipart/form-data, boundary=OLA_GRAIN");
    EXPECT_EQ(lab.posts[0].announcedLength, 0);
    EXPECT_EQ(lab.posts[1].announcedLength, 249);
    ASSERT_TRUE(test.files.writeWhole(u"C:\\b.jpg"_path, "12"));
    const auto announced = [&](const QStringList& files) {
        (void)script.MultipartPostInet(order, files, u"192.0.2.10"_s, u"/p/getfile2.php"_s, u"C:\\"_path, {});
        return lab.posts.back().announcedLength;
    };
    EXPECT_EQ(announced({path, u"C:\\b.jpg"_s}), 467);
    EXPECT_EQ(lab.urls.last(), u"http://192.0.2.10/p/getfile2.php?folder=2026_11_21_KUP_1234^105&"_s)
        << "an empty rest leaves its mark";
    ASSERT_TRUE(test.files.writeWhole(DrivePath(path), {}));
    EXPECT_EQ(announced({path}), 243);
    EXPECT_EQ(lab.posts[0].version, PostRequest::Version::Http11);
    EXPECT_EQ(lab.posts[1].version, PostRequest::Version::Http10);
}

TEST_F(UploadScriptTest, AFileThatIsMissingOrWouldBreakItsHeaderIsNeverSent) {
    for (const char* name : {"C:\\missing.jpg", "C:\\a\"b.jpg", "C:\\a\r\nX: y.jpg"}) {
        const QString file = QString::fromLatin1(name);
        EXPECT_EQ(script.MultipartPost(order, {path, file}, u"http://h/"_s, u"C:\\"_path, {}, {}, {}), QString());
        EXPECT_TRUE(script.failed()) << name;
        EXPECT_TRUE(script.MultipartPostInet(order, {file}, u"h"_s, u"/"_s, u"C:\\"_path, {}).startsWith(u"Error: "_s));
    }
    EXPECT_TRUE(lab.posts.empty());
    lab.deadPosts = 2;
    EXPECT_EQ(script.MultipartPost(order, {path}, u"http://h/"_s, u"C:\\"_path, {}, {}, {}), QString());
    EXPECT_EQ(script.MultipartPostInet(order, {path}, u"h"_s, u"/"_s, u"C:\\"_path, {}), u"Error: nobody answers"_s);
}

TEST(ServerListTest, ATextOf35CharactersIsNoListing) {
    const QString text = u"2026_11_21_KUP_1234^105~~a~~total:1"_s; // 35
    ASSERT_EQ(text.size(), 35);
    EXPECT_EQ(ParseServerList(u"  "_s + text + u'\n'), QStringList());
    EXPECT_EQ(ParseServerList(u"2026_11_21_KUP_1234^105~~ab~~ ~~~~total:1"_s),
              QStringList({u"2026_11_21_KUP_1234^105"_s, u"ab"_s, u"total:1"_s}));
    const QString marked = ServerText("\xEF\xBB\xBF" + (text + u"\r\n"_s).toLatin1());
    EXPECT_EQ(ReadServerAnswer(marked, u"2026_11_21_KUP_1234^105"_s).files, QStringList(u"a"_s));
}

TEST(ServerListTest, AnEntryStrikesOneNameThatContainsItOrCarefullyIsIt) {
    const QString folder = u"2026_11_21_KUP_1234^105"_s;
    const QString log = u"C:\\o\\2026_11_21_KUP_1234^105.txt"_s;
    const QString small = u"C:\\o\\1.jpp"_s;
    const QString large = u"C:\\o\\11.JPP"_s;
    const struct {
        QStringList entries;
        QStringList left;
        QStringList leftByWholeNames;
    } cases[] = {
        {{folder, u"total:3"_s}, {log, large, small}, {log, large, small}},
        {{folder, log.mid(5), u"total:1"_s}, {large, small}, {large, small}},
        {{u" 11.jpp "_s}, {log, small}, {log, small}},
        {{u"1.jpp"_s}, {log, small}, {log, large}}, // taken as arrived: its name contains the listed one
        {{u"1.jpp"_s, u"1.JPP"_s}, {log}, {log, large}},
        {{u"."_s, u"jpp"_s, u"txt"_s}, {small}, {log, large, small}},
        {{u"..\\..\\x"_s, u"C:\\o\\1.jpp"_s}, {log, large, small}, {log, large, small}},
    };
    SessionState state;
    for (const bool careful : {false, true}) {
        state.Careful = careful;
        for (const auto& c : cases)
            EXPECT_EQ(MarkHossarim({log, large, small}, c.entries, folder, HttpListGuard(state).match()),
                      careful ? c.leftByWholeNames : c.left)
                << c.entries.join(u'|').toStdString();
    }
}

TEST(NameInAddress, KeepsTheSignsThatWouldEndAnAddress) {
    EXPECT_EQ(NameInAddress(u"a#b?c%d.jpp"_s), u"a%23b%3Fc%25d.jpp"_s);
}

TEST(ServerListTest, AListMustNameTheFolderAndATotalAndNoWhereSayNot) {
    const QString folder = u"2026_11_21_KUP_1234^105"_s;
    const QString files = u"~~021015GNB0000_03AABB.jpp~~"_s;
    const struct {
        QString answer;
        ServerVerdict verdict;
    } cases[] = {
        {folder + files + u"total:1"_s, ServerVerdict::Listed},
        {folder + files + u"TOTAL: 99"_s, ServerVerdict::Listed},
        {folder + files, ServerVerdict::NotVerified},
        {u"other"_s + files + u"total:1"_s, ServerVerdict::NotVerified},
        {folder + files + u"total:1~~NoT found"_s, ServerVerdict::NotVerified},
        {QString(), ServerVerdict::NotVerified},
    };
    for (const auto& c : cases)
        EXPECT_EQ(ReadServerAnswer(c.answer, folder).verdict, c.verdict) << c.answer.toStdString();
}

} // namespace
} // namespace lumora
