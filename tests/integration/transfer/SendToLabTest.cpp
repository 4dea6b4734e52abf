#include "common/AnsiCodePage.h"
#include "platform/line/PocoInternet.h"
#include "support/FtpFrmRig.h"
#include "support/LabServers.h"
#include "support/TcpRelay.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QRegularExpression>

#include <filesystem>

// A prepared order, the sending page, a real FTP server behind a bad line, and a real web server.
namespace lumora {

namespace {

const QString uploaded = u"הקבצים הועלו בהצלחה"_s;
const QString notAll = u"לא כל הקבצים הועלו"_s;
const QString second = u"נסיון שני לקבצים שלא עלו"_s;
const QString third = u"נסיון שלישי לקבצים שלא עלו"_s;
const QString fourth = u"נסיון רביעי ואחרון להעלות קבצים שלא עלו"_s;

// Larger than any other file of the order, so that a cut by length strikes it alone.
constexpr int largeSize = 300000;
constexpr int cutAt = 100000;

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
        // Every value of a byte and line ends of each kind.
        QByteArray large;
        for (int i = 0; i < largeSize; ++i)
            large.append(static_cast<char>((i * 7 + i / 251) & 0xFF));
        rig.write(FtpFrmRig::second(), large + "\r\n\r\r\n\n");
    }

    // The customer takes the order up again on the page of finished orders.
    void resend() {
        rig.chain.unload(PageId::FtpFrm);
        rig.takeUpAgain(FtpFrmRig::names().mid(0, 4));
        rig.send();
    }

    // What the customer's side must keep: the order without the page's own list and the summary's picture.
    std::map<QString, QByteArray> localOrder() const {
        auto files = rig.localFiles();
        files.erase(u"kashloo.txt"_s);
        files.erase(FtpFrmRig::proof());
        return files;
    }

    HostPath remoteFolder() const { return lab.ordersFolder() / FtpFrmRig::name().toStdString(); }

    std::map<QString, QByteArray> arrived() const {
        std::map<QString, QByteArray> files;
        const QDir folder(toText(remoteFolder()));
        for (const QString& name : folder.entryList(QDir::Files)) {
            QFile file(folder.filePath(name));
            EXPECT_TRUE(file.open(QIODevice::ReadOnly));
            files[name] = file.readAll();
        }
        return files;
    }

    void expectArrived() const {
        auto files = arrived();
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
    TcpRelay relay{lab.ftpPort()};
    PocoInternet line{TimeLimits{Poco::Timespan(3, 0), Poco::Timespan(3, 0)}};
    FtpFrmRig rig{line};
};

QByteArray requestLine(const QString& address) {
    return "GET " + AnsiCodePage::encode(address).replace(' ', "%20") + " HTTP/1.1";
}

TcpRelay::Faults refusedPut(int times) {
    return {.command = "STOR " + FtpFrmRig::first().toLatin1(), .reply = "553 Could not create file.", .times = times};
}

struct LineFault {
    const char* name = "";
    TcpRelay::Faults faults = {};
    QString backAt = {}; // the attempt at which the line is good again; empty: as the faults say
    QString password = LabServers::password();
    bool fromEarlierTry = false; // one file lies in the order's folder on the server already
    // What is told.
    bool success = true;
    QString attempt = {};
    int puts = 0;
    QStringList neverArrives = {};
};

void PrintTo(const LineFault& fault, std::ostream* out) {
    *out << fault.name;
}

// Nobody answers until that attempt.
LineFault backAt(const char* name, const QString& attempt) {
    return {.name = name, .faults = {.refuseConnections = true}, .backAt = attempt, .attempt = attempt, .puts = 5};
}

class FaultsOfTheLine : public SendToLab, public ::testing::WithParamInterface<LineFault> {};

} // namespace

TEST_F(SendToLab, AnOrderArrivesByteForByteAndTheLabsSiteIsTold) {
    const auto before = localOrder();
    rig.send();
    EXPECT_EQ(rig.page().controls().Label3.text, uploaded);
    EXPECT_EQ(rig.page().controls().Label34.text, QString());
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

TEST_P(FaultsOfTheLine, EndAsTheCustomerIsToldAndAResendSendsOnlyWhatIsMissing) {
    const LineFault& fault = GetParam();
    rig.state.profile.FtpPassword = fault.password;
    relay.setFaults(fault.faults);
    const auto before = localOrder();
    if (fault.fromEarlierTry) {
        // An earlier order of one file, by the same road.
        rig.state.profile.ReportOn = 0;
        rig.takeUpAgain({FtpFrmRig::first()});
        rig.send();
        ASSERT_EQ(rig.page().controls().Label3.text, uploaded);
        rig.chain.unload(PageId::FtpFrm);
        ASSERT_TRUE(std::filesystem::remove(remoteFolder() / "000.jpg"));
        rig.state.profile.ReportOn = 1;
        rig.state.transfer.SugMishloah = Sending::NewOrder;
    }
    const auto earlier = puts().size();

    FtpFrm& page = rig.start();
    if (!fault.backAt.isEmpty()) {
        QObject::connect(&page, &Page::changed, &page, [this, &page, &fault] {
            if (page.controls().Label34.text == fault.backAt)
                relay.setFaults({});
        });
    }
    rig.countDown();
    EXPECT_EQ(page.controls().Label3.text, fault.success ? uploaded : notAll);
    EXPECT_EQ(page.controls().Label34.text, fault.attempt);
    EXPECT_EQ(page.controls().Picture6.visible, !fault.success);
    EXPECT_EQ(page.controls().Command10.visible, !fault.success);
    EXPECT_EQ(puts().size() - earlier, fault.puts);
    EXPECT_TRUE(localOrder() == before) << "the local folder changed";
    EXPECT_EQ(lab.requests(fault.success ? 3 : 0).size(), fault.success ? 3 : 0);
    if (fault.success) {
        expectArrived();
        return;
    }
    EXPECT_EQ(page.controls().Label4Missing.text, QString::number(fault.neverArrives.size()));
    EXPECT_FALSE(page.controls().Label2.text.isEmpty());
    const auto there = arrived();
    for (const QString& name : fault.neverArrives)
        EXPECT_FALSE(there.count(name)) << name.toStdString();

    // The line is good again another day.
    relay.setFaults({});
    rig.state.profile.FtpPassword = LabServers::password();
    const auto failed = puts().size();
    resend();
    EXPECT_EQ(rig.page().controls().Label3.text, uploaded);
    EXPECT_EQ(puts().mid(failed), fault.neverArrives);
    expectArrived();
    EXPECT_EQ(lab.requests(3).size(), 3);
}

INSTANTIATE_TEST_SUITE_P(
    SendToLab, FaultsOfTheLine,
    ::testing::Values(LineFault{.name = "login_refused",
                                .password = u"wrong"_s,
                                .success = false,
                                .attempt = fourth,
                                .neverArrives = FtpFrmRig::names()},
                      LineFault{.name = "folder_exists_from_an_earlier_try", .fromEarlierTry = true, .puts = 4},
                      LineFault{.name = "put_refused_once", .faults = refusedPut(1), .attempt = second, .puts = 5},
                      LineFault{.name = "put_refused_always",
                                .faults = refusedPut(-1),
                                .success = false,
                                .attempt = fourth,
                                .puts = 4,
                                .neverArrives = {FtpFrmRig::first()}},
                      LineFault{.name = "cut_in_the_middle_of_a_file",
                                .faults = {.cutDataAfter = cutAt, .times = 1},
                                .attempt = second,
                                .puts = 6},
                      LineFault{.name = "cut_there_each_time",
                                .faults = {.cutDataAfter = cutAt},
                                .success = false,
                                .attempt = fourth,
                                .puts = 8,
                                .neverArrives = {FtpFrmRig::second()}},
                      backAt("server_back_at_the_second_attempt", second),
                      backAt("server_back_at_the_third_attempt", third),
                      backAt("server_back_at_the_fourth_attempt", fourth)),
    [](const ::testing::TestParamInfo<LineFault>& each) { return each.param.name; });

} // namespace lumora
