#include "common/AnsiCodePage.h"
#include "platform/line/PocoInternet.h"
#include "support/FtpFrmRig.h"
#include "support/LabServers.h"

#include <gtest/gtest.h>

#include <QRegularExpression>

// A prepared order, the sending page, a real FTP server behind a bad line, and a real web server.
namespace lumora {

namespace {

class SendToLab : public ::testing::Test {
protected:
    void SetUp() override {
        ASSERT_TRUE(lab.running()) << lab.failure().toStdString();
        ClientProfile& profile = rig.state.profile;
        profile.FtpServer = u"127.0.0.1:%1"_s.arg(lab.ftpPort());
        profile.FtpUser = LabServers::user();
        profile.FtpPassword = LabServers::password();
        profile.ReportUrl = lab.site() + u"/aaaqamootreport/padd.asp"_s;
        profile.DoneUrl = lab.site() + u"/aaasssppp/p.asp"_s;
        // Every value of a byte and line ends of each kind.
        QByteArray large;
        for (int i = 0; i < 300000; ++i)
            large.append(static_cast<char>((i * 7 + i / 251) & 0xFF));
        rig.write(FtpFrmRig::second(), large + "\r\n\r\r\n\n");
    }

    // What the customer's side must keep: the order without the summary's picture.
    std::map<QString, QByteArray> localOrder() const {
        auto files = rig.localFiles();
        files.erase(FtpFrmRig::proof());
        return files;
    }

    void expectArrived() {
        EXPECT_EQ(rig.page().phase(), SendingPhase::Success);
        auto files = FilesIn(lab.ordersFolder() / FtpFrmRig::name().toStdString());
        EXPECT_EQ(files.size(), FtpFrmRig::names().size());
        EXPECT_EQ(files.erase(FtpFrmRig::proof()), 1u);
        EXPECT_TRUE(files == localOrder()) << "the bytes on the server are not those of the folder";
    }

    // The names of the puts that reached the server, by its own log.
    QStringList puts() const {
        static const QRegularExpression put(u"FTP command: .*\"STOR (.*)\""_s);
        QStringList names;
        auto matches = put.globalMatch(QString::fromLatin1(lab.ftpLog()));
        while (matches.hasNext())
            names += matches.next().captured(1);
        return names;
    }

    LabServers lab;
    PocoInternet line;
    FtpFrmRig rig{line};
};

QByteArray requestLine(const QString& address) {
    return "GET " + AnsiCodePage::encode(address).replace(' ', "%20") + " HTTP/1.1";
}

} // namespace

TEST_F(SendToLab, AnOrderArrivesByteForByteAndTheLabsSiteIsTold) {
    const auto before = localOrder();
    rig.send();
    EXPECT_EQ(puts(), FtpFrmRig::names());
    expectArrived();
    EXPECT_TRUE(localOrder() == before);
    EXPECT_EQ(lab.requests(3),
              (QByteArrayList{requestLine(u"/aaaqamootreport/padd.aspc.txt"_s),
                              requestLine(u"/aaaqamootreport/padd.asp?k1=tarvelmond&t1=2026_11_21_KUP_1234^105    "
                                          "10_15G_FIT_NB&t2=Notes: gift, \"big\" - &t3=Pratim: 03-1234567    דנה "
                                          "לוי&t4=Adress: &t5=Mail: dana@example.com&t8=Total_pics: 13"_s),
                              requestLine(u"/aaasssppp/p.asp?t1=tarvelmond&t2=true"_s)}));
}

} // namespace lumora
