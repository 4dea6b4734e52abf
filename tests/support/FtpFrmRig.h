#pragma once

#include "common/ListOutput.h"
#include "editing/gdisave.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "support/TestPlatform.h"
#include "transfer/FtpFrm.h"
#include "transfer/InetForm.h"

#include <map>

namespace lumora {

// A prepared order on the disk and the sending page in front of it, over the line that the test brings.
class FtpFrmRig {
public:
    static constexpr int files = 5; // log, sheet, two pictures, the small picture of the summary

    explicit FtpFrmRig(Internet& line)
        : test(line)
        , chain(test.pump) {
        state.DiskRoot = QStringLiteral("C:\\");
        state.MisparHazmana = QStringLiteral("105");
        state.KodMishloach = QStringLiteral("KUP");
        state.Optint = 1;
        state.transfer.OrderFolder = folder();
        ClientProfile& profile = state.profile;
        profile.FtpServer = QStringLiteral("192.0.2.10");
        profile.FtpUser = QStringLiteral("lumora");
        profile.FtpPassword = QStringLiteral("morvex482");
        profile.FtpFolder2 = QStringLiteral("zalamim234");
        profile.ClientCode = QStringLiteral("tarvelmond");
        profile.ReportUrl = QStringLiteral("http://192.0.2.10/aaaqamootreport/padd.asp");
        profile.DoneUrl = QStringLiteral("http://192.0.2.10/aaasssppp/p.asp");
        profile.ReportOn = 1;
        for (const char* name : {"C:\\2000lumora", "C:\\2000lumora\\!!000"})
            (void)test.files.makeFolder(QString::fromLatin1(name));
        (void)test.files.makeFolder(folder());
        writeLog();
        write(sheet(), QByteArray(900, 's'));
        write(first(), QByteArray("\xFF\xD8\r\n\n\r\0 first", 14).repeated(300));
        write(second(), QByteArray("\xFF\xD8\n\n second").repeated(500));
        addPages();
    }

    static QString name() { return QStringLiteral("2026_11_21_KUP_1234^105"); }
    static QString folder() { return QStringLiteral("C:\\2000lumora\\!!000\\") + name(); }
    static QString log() { return name() + QStringLiteral(".txt"); }
    static QString sheet() { return QStringLiteral("!105_1234.jpp"); }
    static QString first() { return QStringLiteral("021015GNB0000_03AABB.jpp"); }
    static QString second() { return QStringLiteral("111015GNB0001_03AACC.jpp"); }
    static QString proof() { return QStringLiteral("000.jpg"); }
    // The order in which they travel.
    static QStringList names() { return {log(), sheet(), first(), second(), proof()}; }
    static QString remoteFolder() { return QStringLiteral("zalamim234/") + name(); }
    static QString local(const QString& leaf) { return folder() + u'\\' + leaf; }

    void write(const QString& leaf, const QByteArray& bytes) { (void)test.files.writeWhole(local(leaf), bytes); }

    void writeLog() {
        ListOutput out;
        out.pair(QStringLiteral("00"), QStringLiteral("00"));
        out.pair(QStringLiteral("Shemot.n1"), QStringLiteral("דנה לוי"));
        out.pair(QStringLiteral("Shemot.n2"), QStringLiteral("03-1234567"));
        out.text(QStringLiteral("Shemot.TotalPics")).number(13).endLine();
        out.pair(QStringLiteral("Shemot.Mail"), QStringLiteral("dana@example.com"));
        out.pair(QStringLiteral("Shemot.Hearot"), QStringLiteral("gift, \"big\" - "));
        out.pair(QStringLiteral("Shemot.ppr"), QStringLiteral("10/15"));
        out.pair(QStringLiteral("Shemot.Bord"), QStringLiteral("NB"));
        out.pair(QStringLiteral("Shemot.maat"), QStringLiteral("מבריק"));
        out.pair(QStringLiteral("Shemot.FillFit"), QStringLiteral("FIT"));
        write(log(), out.bytes());
    }

    // What the local folder and the summary's picture hold, by leaf name.
    std::map<QString, QByteArray> localFiles() const {
        std::map<QString, QByteArray> bytes;
        for (const QString& leaf : test.files.names(folder(), QStringLiteral("*.*")))
            bytes[leaf] = *test.files.read(local(leaf));
        const QString proofPath = QStringLiteral("C:\\2000lumora\\000.jpg");
        if (test.files.fileExists(proofPath))
            bytes[proof()] = *test.files.read(proofPath);
        return bytes;
    }

    // The page comes to the front and acts.
    FtpFrm& start() {
        chain.show(PageId::FtpFrm);
        page().Form_Activate();
        return page();
    }
    FtpFrm& page() { return static_cast<FtpFrm&>(*chain.find(PageId::FtpFrm)); }
    // The countdown runs out and the order is sent.
    void countDown() {
        for (int tick = 0; tick < 15; ++tick)
            page().Timer1_Tick();
    }
    void send() {
        start();
        countDown();
    }

    TestPlatform test;
    SessionState state;
    PageChain chain;

private:
    class Bare : public Page {
    public:
        explicit Bare(PageId id)
            : Page(id) {}
    };

    void addPages() {
        chain.registerPage(PageId::hatchala, [] { return std::make_unique<Bare>(PageId::hatchala); });
        chain.registerPage(PageId::MoogMeret, [] { return std::make_unique<Bare>(PageId::MoogMeret); });
        chain.registerPage(PageId::FtpFrm, [this] { return std::make_unique<FtpFrm>(state, test.platform, chain); });
        chain.registerPage(PageId::InetForm,
                           [this] { return std::make_unique<InetForm>(state, test.platform, chain); });
        chain.registerPage(PageId::gdisave, [this] { return std::make_unique<gdisave>(state, test.platform, chain); });
    }
};

} // namespace lumora
