#pragma once

#include "common/ListOutput.h"
#include "editing/editor/gdisave.h"
#include "support/FakeLab.h"
#include "support/SendingRig.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/report/InetForm.h"

namespace lumora {

// A prepared order and the page that sends it by FTP.
struct FtpFrmRig : SendingRig {
    explicit FtpFrmRig(Internet& line)
        : SendingRig(line) {
        state.MisparHazmana = u"105"_s;
        state.KodMishloach = u"KUP"_s;
        state.Optint = OrderKind::Print;
        ClientProfile& profile = state.profile;
        profile.FtpServer = u"192.0.2.10"_s;
        profile.FtpUser = u"lumora"_s;
        profile.FtpPassword = u"morvex482"_s;
        profile.FtpFolder2 = u"zalamim234"_s;
        profile.DoneUrl = u"http://192.0.2.10/aaasssppp/p.asp"_s;
        profile.ReportOn = 1;
        writeLog();
        write(sheet(), QByteArray(900, 's'));
        registerBare({PageId::hatchala, PageId::MoogMeret});
        registerPage<FtpFrm>(PageId::FtpFrm);
        registerPage<InetForm>(PageId::InetForm);
        registerPage<gdisave>(PageId::gdisave);
    }

    static QString sheet() { return u"!105_1234.jpp"_s; }
    static QString proof() { return u"000.jpg"_s; } // small picture of the summary
    // The files of the order as they are sent.
    static QStringList names() { return {log(), sheet(), first(), second(), proof()}; }
    static QString remoteFolder() { return u"zalamim234/"_s + name(); }

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

    // The local folder and the small picture of the summary, by leaf name.
    std::map<QString, QByteArray> localFiles() const {
        auto bytes = SendingRig::localFiles();
        if (const auto picture = test.files.read(u"C:\\2000lumora\\000.jpg"_path))
            bytes[proof()] = *picture;
        return bytes;
    }

    // These files are to be sent again, as the page of finished orders asks for it.
    void takeUpAgain(const QStringList& leaves) {
        state.transfer.SugMishloah = Sending::Resend;
        for (const QString& leaf : leaves)
            state.handOver.lines += local(leaf).text();
    }
    // The page comes to the front and acts.
    FtpFrm& start() {
        chain.show(PageId::FtpFrm);
        page().Form_Activate();
        return page();
    }
    FtpFrm& page() { return static_cast<FtpFrm&>(*chain.find(PageId::FtpFrm)); }
    // The countdown ends and the order is sent.
    void countDown() {
        for (int tick = 0; tick < 15; ++tick)
            page().Timer1_Tick();
    }
    void send() {
        start();
        countDown();
    }
};

// The same over a lab in memory that has the folder of the orders.
struct FtpFrmLine {
    FtpFrmLine() { lab.folders[u"zalamim234"_s]; }
    FakeLab::Folder& remote() { return lab.folders[FtpFrmRig::remoteFolder()]; }

    FakeLab lab;
    FtpFrmRig rig{lab};
};

} // namespace lumora
