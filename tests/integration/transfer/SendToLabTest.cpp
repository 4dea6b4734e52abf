#include "common/AnsiCodePage.h"
#include "platform/line/PocoInternet.h"
#include "support/FtpFrmRig.h"
#include "support/LabServers.h"
#include "support/TcpRelay.h"

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
        profile.FtpServer = relay.host();
        profile.FtpUser = LabServers::user();
        profile.FtpPassword = LabServers::password();
        profile.ReportUrl = lab.site() + u"/aaaqamootreport/padd.asp"_s;
        profile.DoneUrl = lab.site() + u"/aaasssppp/p.asp"_s;
        // Larger than any other file of the order, so that a cut by length strikes it alone; every value of a byte and
        // line ends of each kind.
        QByteArray large;
        for (int i = 0; i < 300000; ++i)
            large.append(static_cast<char>((i * 7 + i / 251) & 0xFF));
        rig.write(FtpFrmRig::second(), large + "\r\n\r\r\n\n");
    }

    // What the customer's side must keep: the order without the page's own list and the summary's picture.
    std::map<QString, QByteArray> localOrder() const {
        auto files = rig.localFiles();
        files.erase(u"kashloo.txt"_s);
        files.erase(FtpFrmRig::proof());
        return files;
    }

    std::map<QString, QByteArray> arrived() const {
        return FilesIn(lab.ordersFolder() / FtpFrmRig::name().toStdString());
    }
    void expectArrived() {
        EXPECT_EQ(rig.page().phase(), SendingPhase::Success);
        auto files = arrived();
        EXPECT_EQ(files.size(), FtpFrmRig::names().size());
        EXPECT_EQ(files.erase(FtpFrmRig::proof()), 1u);
        EXPECT_TRUE(files == localOrder()) << "the bytes on the server are not those of the folder";
        EXPECT_EQ(lab.requests(3).size(), 3);
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
    TcpRelay relay{lab.ftpPort()};
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

TEST_F(SendToLab, AFileThatIsCutEachTimeIsAllThatTheOrderTakenUpAgainSends) {
    relay.setFaults({.cutDataAfter = 100000});
    const auto before = localOrder();
    rig.send();
    const FtpFrmControls& shown = rig.page().controls();
    EXPECT_EQ(rig.page().phase(), SendingPhase::NotAll);
    EXPECT_TRUE(shown.Picture6.visible && shown.Command10.visible);
    EXPECT_EQ(shown.Label4Missing.text, u"1"_s);
    EXPECT_EQ(puts().size(), 8);
    EXPECT_TRUE(localOrder() == before) << "the local folder changed";
    EXPECT_TRUE(lab.requests().isEmpty());
    EXPECT_FALSE(arrived().contains(FtpFrmRig::second())) << "the remains are deleted";

    // The line is good another day, and the customer takes the order up on the page of finished orders.
    relay.setFaults({});
    rig.chain.unload(PageId::FtpFrm);
    rig.takeUpAgain(FtpFrmRig::names().mid(0, 4));
    rig.send();
    EXPECT_EQ(puts().mid(8), QStringList(FtpFrmRig::second()));
    expectArrived();
}

} // namespace lumora
