#include "platform/line/PocoInternet.h"
#include "support/LabServers.h"
#include "support/TcpRelay.h"
#include "support/UploadFormRig.h"

#include <gtest/gtest.h>

#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/SocketAddress.h>
#include <Poco/Net/StreamSocket.h>

#include <QFile>

#include <array>
#include <atomic>
#include <filesystem>
#include <thread>

// A prepared order, the page that sends by HTTP, and real web servers that run the lab's scripts.
namespace lumora {
namespace {

// What a server holds of the order, without the lists.
std::map<QString, QByteArray> filesIn(const HostPath& folder) {
    std::map<QString, QByteArray> bytes;
    std::error_code none;
    for (const auto& entry : std::filesystem::directory_iterator(folder, none)) {
        const QString name = toText(entry.path().filename());
        QFile file(toText(entry.path()));
        if (!name.startsWith(u"filelist"_s) && file.open(QIODevice::ReadOnly))
            bytes[name] = file.readAll();
    }
    return bytes;
}

class SendByHttp : public ::testing::Test {
protected:
    void SetUp() override {
        ASSERT_TRUE(lab.running()) << lab.failure().toStdString();
        ClientProfile& profile = rig.state.profile;
        profile.HttpHost = lab.site();
        profile.ReportUrl = lab.site() + u"/aaaqamootreport/padd.asp"_s;
        profile.HttpDoneUrl = lab.site() + u"/aaasssppp/p.asp"_s;
        rig.write(UploadFormRig::second(), everyByte.repeated(900));
    }
    HostPath order(const HostPath& uploads) const { return uploads / UploadFormRig::name().toStdString(); }

    QByteArray everyByte = [] {
        QByteArray bytes;
        for (int i = 0; i < 256; ++i)
            bytes.append(static_cast<char>(i));
        return bytes;
    }();
    LabServers lab;
    PocoInternet internet{TimeLimits{Poco::Timespan(2, 0), Poco::Timespan(5, 0)}};
    UploadFormRig rig{internet};
};

TEST_F(SendByHttp, TheOrderArrivesByteForByteWithOneReportAndOneDoneCall) {
    UploadForm& page = rig.send();
    EXPECT_TRUE(hasArrived(page.phase()))
        << page.controls().Label4Reason.hint.toStdString() << page.controls().TxtWeb.text.toStdString();
    EXPECT_EQ(filesIn(order(lab.uploads())), rig.localFiles());
    const QByteArrayList reports = lab.reports();
    ASSERT_EQ(reports.size(), 2);
    EXPECT_TRUE(reports[0].startsWith("REPORT k1=tarvelmond | t1=2026_11_21_KUP_1234^105 "));
    EXPECT_EQ(reports[1], "DONE t1=tarvelmond | t2=true");
}

TEST_F(SendByHttp, ASecondKindOfServerTakesTheSameRequest) {
    SecondWebServer second;
    ASSERT_TRUE(second.running()) << second.failure().toStdString();
    rig.state.profile.HttpHost = second.site();
    UploadForm& page = rig.send();
    EXPECT_TRUE(hasArrived(page.phase()))
        << page.controls().Label4Reason.hint.toStdString() << page.controls().TxtWeb.text.toStdString();
    EXPECT_EQ(filesIn(order(second.uploads())), rig.localFiles());
}

TEST_F(SendByHttp, WhatWasCutInItsMiddleGoesAgain) {
    TcpRelay relay(lab.httpPort(), TcpRelay::Kind::Plain);
    rig.state.profile.HttpHost = u"http://"_s + relay.host();
    rig.start();
    relay.setFaults({.cutDataAfter = 20, .times = 2});
    rig.countDown();
    EXPECT_TRUE(hasArrived(rig.page().phase())) << rig.page().controls().Label4Reason.hint.toStdString();
    EXPECT_EQ(filesIn(order(lab.uploads())), rig.localFiles());
}

TEST_F(SendByHttp, AServerThatAnswers500EndsInTheThreeAttemptsAndSendAgainStartsAnew) {
    // Where the order's folder should be lies a file: the script can't store anything.
    QFile inTheWay(toText(order(lab.uploads())));
    ASSERT_TRUE(inTheWay.open(QIODevice::WriteOnly));
    UploadForm& page = rig.send();
    EXPECT_EQ(page.look().sign, SendingSign::Bad);
    EXPECT_TRUE(page.controls().Image5.visible);
    EXPECT_EQ(page.controls().Label12.text, u"5"_s);
    EXPECT_EQ(page.controls().Label10.text, u"00-0000000"_s);
    EXPECT_TRUE(lab.reports().isEmpty());
    EXPECT_EQ(lab.requests().join(" ").count("POST "), 15);
    ASSERT_TRUE(inTheWay.remove());
    page.Image5_Click();
    EXPECT_TRUE(hasArrived(page.phase()));
    EXPECT_EQ(filesIn(order(lab.uploads())), rig.localFiles());
    EXPECT_EQ(lab.reports().size(), 2);
}

TEST_F(SendByHttp, AServerThatClosesInTheMiddleOfAFileIsAFailureThatIsTold) {
    // Takes a little of each request and resets the line.
    Poco::Net::ServerSocket server(Poco::Net::SocketAddress("127.0.0.1", 0));
    std::atomic<bool> stop = false;
    std::thread closing([&] {
        while (!stop) {
            if (!server.poll(Poco::Timespan(0, 20'000), Poco::Net::Socket::SELECT_READ))
                continue;
            Poco::Net::StreamSocket line = server.acceptConnection();
            std::array<char, 600> some;
            line.receiveBytes(some.data(), static_cast<int>(some.size()));
            line.setLinger(true, 0);
            line.close();
        }
    });
    rig.state.profile.HttpHost = u"http://127.0.0.1:%1"_s.arg(server.address().port());
    UploadForm& page = rig.send();
    stop = true;
    closing.join();
    EXPECT_EQ(page.look().sign, SendingSign::Bad);
    EXPECT_TRUE(page.controls().Label4Reason.visible);
    EXPECT_EQ(page.lists().List4Hossarim.count(), 5);
    rig.state.profile.HttpHost = lab.site();
    page.Image5_Click();
    EXPECT_TRUE(hasArrived(page.phase())) << page.controls().Label4Reason.hint.toStdString();
    EXPECT_EQ(filesIn(order(lab.uploads())), rig.localFiles());
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

TEST_F(SendByHttp, AHebrewNameArrivesInTheCodePageAndNoNameLeadsElsewhere) {
    UploadScript script(rig.test.platform);
    const QString url = lab.site() + u"/hazmanot/getfile2.php"_s;
    rig.write(u"דנה.jpg"_s, "xyz");
    const auto send = [&](const QString& folder, const QString& name) {
        return script.MultipartPost(folder, {name}, url, UploadFormRig::folder(), {}, {}, {});
    };
    EXPECT_EQ(send(u"tttt"_s, u"דנה.jpg"_s), u"stored\r\n"_s);
    EXPECT_TRUE(std::filesystem::exists(lab.uploads() / "tttt" / "\xe3\xf0\xe4.jpg"));
    for (const char* folder : {"..", "../www", "", ".hidden", "a\\b"})
        EXPECT_NE(send(QString::fromLatin1(folder), UploadFormRig::first()), u"stored\r\n"_s) << folder;
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(lab.uploads()), {}), 1);
}

TEST_F(SendByHttp, TheTestFormAnnouncesMoreThanItsBodyAndIsTaken) {
    UploadScript script(rig.test.platform);
    const QString host = lab.site().mid(7);
    const QString answer = script.MultipartPostInet(u"tttt"_s, {UploadFormRig::second()}, host,
                                                    u"/hazmanot/getfile2.php"_s, UploadFormRig::folder(), u"v=1"_s);
    EXPECT_EQ(answer, u"stored\r\n"_s);
    EXPECT_EQ(filesIn(lab.uploads() / "tttt"),
              (std::map<QString, QByteArray>{{UploadFormRig::second(), everyByte.repeated(900)}}));
    EXPECT_TRUE(lab.requests(1).value(0).endsWith("HTTP/1.0"));
}

// The address sanitizer's allocator holds on to what was freed, so that there the peak tells nothing.
#ifndef LUMORA_SANITIZED

// Peak memory of this process, in bytes.
qint64 peakMemory() {
    QFile status(u"/proc/self/status"_s);
    if (!status.open(QIODevice::ReadOnly))
        return -1;
    for (const QByteArray& line : status.readAll().split('\n')) {
        if (line.startsWith("VmHWM:"))
            return line.mid(6).trimmed().split(' ').value(0).toLongLong() * 1024;
    }
    return -1;
}

TEST_F(SendByHttp, AFileOf20MiBTakesLessThanThreeTimesItsSize) {
    constexpr qint64 size = 20 * 1024 * 1024;
    std::filesystem::resize_file(*rig.test.drives.toHost(UploadFormRig::folder() / UploadFormRig::first()), size);
    UploadScript script(rig.test.platform);
    QFile reset(u"/proc/self/clear_refs"_s);
    ASSERT_TRUE(reset.open(QIODevice::WriteOnly));
    reset.write("5"); // the peak begins anew
    reset.close();
    const qint64 before = peakMemory();
    EXPECT_EQ(script.MultipartPost(u"tttt"_s, {UploadFormRig::first()}, lab.site() + u"/hazmanot/getfile2.php"_s,
                                   UploadFormRig::folder(), {}, {}, {}),
              u"stored\r\n"_s);
    const qint64 taken = peakMemory() - before;
    RecordProperty("bytes_taken", std::to_string(taken));
    EXPECT_LT(taken, 3 * size);
    EXPECT_GT(taken, size) << "the measure is blind";
    EXPECT_EQ(std::filesystem::file_size(lab.uploads() / "tttt" / UploadFormRig::first().toStdString()),
              static_cast<std::uintmax_t>(size));
}

#endif

} // namespace
} // namespace lumora
