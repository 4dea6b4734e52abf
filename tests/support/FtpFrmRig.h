#pragma once

#include "common/ListOutput.h"
#include "editing/editor/gdisave.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "support/TestPlatform.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/report/InetForm.h"

#include <map>

namespace lumora {

// A prepared order on the disk and the sending page in front of it, over the line that the test brings.
class FtpFrmRig {
public:
    static constexpr int files = 5; // log, sheet, two pictures, the small picture of the summary

    explicit FtpFrmRig(Internet& line)
        : test(line)
        , chain(test.pump) {
        state.DiskRoot = u"C:\\"_s;
        state.MisparHazmana = u"105"_s;
        state.KodMishloach = u"KUP"_s;
        state.Optint = OrderKind::Print;
        state.transfer.OrderFolder = folder();
        ClientProfile& profile = state.profile;
        profile.FtpServer = u"192.0.2.10"_s;
        profile.FtpUser = u"lumora"_s;
        profile.FtpPassword = u"morvex482"_s;
        profile.FtpFolder2 = u"zalamim234"_s;
        profile.ClientCode = u"tarvelmond"_s;
        profile.ReportUrl = u"http://192.0.2.10/aaaqamootreport/padd.asp"_s;
        profile.DoneUrl = u"http://192.0.2.10/aaasssppp/p.asp"_s;
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

    static QString name() { return u"2026_11_21_KUP_1234^105"_s; }
    static QString folder() { return u"C:\\2000lumora\\!!000\\"_s + name(); }
    static QString log() { return name() + u".txt"_s; }
    static QString sheet() { return u"!105_1234.jpp"_s; }
    static QString first() { return u"021015GNB0000_03AABB.jpp"_s; }
    static QString second() { return u"111015GNB0001_03AACC.jpp"_s; }
    static QString proof() { return u"000.jpg"_s; }
    // The order in which they travel.
    static QStringList names() { return {log(), sheet(), first(), second(), proof()}; }
    static QString remoteFolder() { return u"zalamim234/"_s + name(); }
    static QString local(const QString& leaf) { return folder() + u'\\' + leaf; }

    void write(const QString& leaf, const QByteArray& bytes) { (void)test.files.writeWhole(local(leaf), bytes); }

    void writeLog() {
        ListOutput out;
        out.pair(u"00"_s, u"00"_s);
        out.pair(u"Shemot.n1"_s, u"דנה לוי"_s);
        out.pair(u"Shemot.n2"_s, u"03-1234567"_s);
        out.text(u"Shemot.TotalPics"_s).number(13).endLine();
        out.pair(u"Shemot.Mail"_s, u"dana@example.com"_s);
        out.pair(u"Shemot.Hearot"_s, u"gift, \"big\" - "_s);
        out.pair(u"Shemot.ppr"_s, u"10/15"_s);
        out.pair(u"Shemot.Bord"_s, u"NB"_s);
        out.pair(u"Shemot.maat"_s, u"מבריק"_s);
        out.pair(u"Shemot.FillFit"_s, u"FIT"_s);
        write(log(), out.bytes());
    }

    // What the local folder and the summary's picture hold, by leaf name.
    std::map<QString, QByteArray> localFiles() const {
        std::map<QString, QByteArray> bytes;
        for (const QString& leaf : test.files.names(folder(), u"*.*"_s))
            bytes[leaf] = *test.files.read(local(leaf));
        const QString proofPath = u"C:\\2000lumora\\000.jpg"_s;
        if (test.files.fileExists(proofPath))
            bytes[proof()] = *test.files.read(proofPath);
        return bytes;
    }

    // These files are to be sent again, as the page of finished orders asks for it.
    void takeUpAgain(const QStringList& leaves) {
        state.transfer.SugMishloah = Sending::Resend;
        for (const QString& leaf : leaves)
            state.handOver.lines += local(leaf);
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
