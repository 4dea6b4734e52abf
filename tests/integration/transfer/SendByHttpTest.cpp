#include "platform/line/PocoInternet.h"
#include "support/LabServers.h"
#include "support/UploadFormRig.h"

#include <gtest/gtest.h>

#include <filesystem>

// A prepared order, the page that sends by HTTP, and real web servers that run the lab's scripts.
namespace lumora {
namespace {

class SendByHttp : public ::testing::Test {
protected:
    void SetUp() override {
        ASSERT_TRUE(lab.running()) << lab.failure().toStdString();
        ClientProfile& profile = rig.state.profile;
        profile.HttpHost = lab.site();
        profile.ReportUrl = lab.site() + u"/aaaqamootreport/padd.asp"_s;
        profile.HttpDoneUrl = lab.site() + u"/aaasssppp/p.asp"_s;
        rig.write(UploadFormRig::second(), everyByte.repeated(7000));
    }
    // The server holds the order and, beside its lists, nothing else.
    void expectArrived(const HostPath& uploads) {
        EXPECT_TRUE(hasArrived(rig.page().phase()))
            << rig.page().controls().Label4Reason.hint.toStdString() << rig.page().controls().TxtWeb.text.toStdString();
        auto files = FilesIn(uploads / UploadFormRig::name().toStdString());
        std::erase_if(files, [](const auto& file) { return file.first.startsWith(u"filelist"_s); });
        EXPECT_TRUE(files == rig.localFiles()) << "the bytes on the server are not those of the folder";
    }

    QByteArray everyByte = [] {
        QByteArray bytes;
        for (int i = 0; i < 256; ++i)
            bytes.append(static_cast<char>(i));
        return bytes;
    }();
    LabServers lab;
    PocoInternet internet;
    UploadFormRig rig{internet};
};

TEST_F(SendByHttp, TheOrderArrivesByteForByteWithOneReportAndOneDoneCall) {
    rig.send();
    expectArrived(lab.uploads());
    const QByteArrayList reports = lab.reports();
    ASSERT_EQ(reports.size(), 2);
    EXPECT_TRUE(reports[0].startsWith("REPORT k1=tarvelmond | t1=2026_11_21_KUP_1234^105 "));
    EXPECT_EQ(reports[1], "DONE t1=tarvelmond | t2=true");
}

TEST_F(SendByHttp, ASecondKindOfServerTakesTheSameRequest) {
    SecondWebServer second;
    ASSERT_TRUE(second.running()) << second.failure().toStdString();
    rig.state.profile.HttpHost = second.site();
    rig.send();
    expectArrived(second.uploads());
}

TEST_F(SendByHttp, AListThatCanNotBeKeptIsToldAsATroubleOfThisComputer) {
    // Where the list should be stored lies a folder.
    const DrivePath inTheWay = UploadFormRig::folder() / UploadFormRig::list();
    ASSERT_TRUE(rig.test.files.makeFolder(inTheWay));
    UploadForm& page = rig.send();
    EXPECT_EQ(page.look().sign, SendingSign::Bad);
    EXPECT_EQ(page.controls().Label4Reason.text, LineTroubleText(rig.state, LineStep::KeepList, {}));
    ASSERT_TRUE(std::filesystem::remove(*rig.test.drives.toHost(inTheWay)));
    page.Image5_Click();
    EXPECT_TRUE(hasArrived(page.phase()));
}

TEST_F(SendByHttp, TheTestFormAnnouncesMoreThanItsBodyAndIsTaken) {
    UploadScript script(rig.test.platform);
    const QString host = lab.site().mid(7);
    const QString answer = script.MultipartPostInet(u"tttt"_s, {UploadFormRig::second()}, host,
                                                    u"/hazmanot/getfile2.php"_s, UploadFormRig::folder(), u"v=1"_s);
    EXPECT_EQ(answer, u"stored\r\n"_s);
    EXPECT_EQ(FilesIn(lab.uploads() / "tttt"),
              (std::map<QString, QByteArray>{{UploadFormRig::second(), everyByte.repeated(7000)}}));
    EXPECT_TRUE(lab.requests(1).value(0).endsWith("HTTP/1.0"));
}

} // namespace
} // namespace lumora
