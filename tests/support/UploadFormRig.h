#pragma once

#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/TestPlatform.h"
#include "transfer/UploadForm.h"

#include <map>

namespace lumora {

// A prepared order on the disk and the page that sends it by HTTP, over the line that the test brings.
class UploadFormRig {
public:
    explicit UploadFormRig(Internet& line)
        : test(line)
        , chain(test.pump) {
        state.DiskRoot = QStringLiteral("C:\\");
        state.transfer.OrderFolder = folder();
        state.transfer.SugSheliach = 1;
        ClientProfile& profile = state.profile;
        profile.ClientCode = QStringLiteral("tarvelmond");
        profile.LabPhone = QStringLiteral("00-0000000");
        profile.HttpHost = QStringLiteral("http://192.0.2.10");
        profile.HttpTikiya = QStringLiteral("hazmanot");
        profile.HttpScriptPath = QStringLiteral("/hazmanot/");
        profile.ReportUrl = QStringLiteral("http://192.0.2.10/aaaqamootreport/padd.asp");
        profile.HttpDoneUrl = QStringLiteral("http://192.0.2.11/aaasssppp/p.asp");
        for (const QString& path :
             {QStringLiteral("C:\\2000lumora"), QStringLiteral("C:\\2000lumora\\!!000"), folder()})
            (void)test.files.makeFolder(path);
        write(log(), "the order");
        write(sheet(), QByteArray(900, 's'));
        write(first(), QByteArray("\xFF\xD8\r\n\n\r\0--OLA_GRAIN--\r\n", 23).repeated(300));
        write(second(), QByteArray("\xFF\xD8\n\n second").repeated(500));
        write(third(), {});
        chain.registerPage(PageId::UploadForm,
                           [this] { return std::make_unique<UploadForm>(state, test.platform, chain); });
    }

    static QString name() { return QStringLiteral("2026_11_21_KUP_1234^105"); }
    static QString folder() { return QStringLiteral("C:\\2000lumora\\!!000\\") + name(); }
    static QString log() { return name() + QStringLiteral(".txt"); }
    static QString sheet() { return QStringLiteral("!105_1234.jpg"); }
    static QString first() { return QStringLiteral("021015GNB0000_03AABB.jpp"); }
    static QString second() { return QStringLiteral("111015GNB0001_03AACC.jpp"); }
    static QString third() { return QStringLiteral("211015GNB0002_03AADD.jpp"); }
    static QString list() { return QStringLiteral("filelisthom.txt"); }

    void write(const QString& leaf, const QByteArray& bytes) {
        (void)test.files.writeWhole(folder() + u'\\' + leaf, bytes);
    }
    // The order without the list that was fetched.
    std::map<QString, QByteArray> localFiles() const {
        std::map<QString, QByteArray> bytes;
        for (const QString& leaf : test.files.names(folder(), QStringLiteral("*.*"))) {
            if (leaf != list())
                bytes[leaf] = *test.files.read(folder() + u'\\' + leaf);
        }
        return bytes;
    }

    UploadForm& start() {
        chain.show(PageId::UploadForm);
        page().setTexts();
        page().Form_Activate();
        return page();
    }
    UploadForm& page() { return static_cast<UploadForm&>(*chain.find(PageId::UploadForm)); }
    // The panel grows, the count runs out and the order is sent.
    void countDown() {
        while (page().Timer1.running())
            page().Timer1_Tick();
        for (int tick = 0; tick < 6; ++tick)
            page().Timer2_Tick();
    }
    UploadForm& send() {
        start();
        countDown();
        return page();
    }

    TestPlatform test;
    SessionState state;
    PageChain chain;
};

} // namespace lumora
