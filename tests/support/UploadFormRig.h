#pragma once

#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/TestPlatform.h"
#include "transfer/http/UploadForm.h"

#include <map>

namespace lumora {

// A prepared order on the disk and the page that sends it by HTTP, over the line that the test brings.
class UploadFormRig {
public:
    explicit UploadFormRig(Internet& line)
        : test(line)
        , chain(test.pump) {
        state.DiskRoot = u"C:\\"_s;
        state.transfer.OrderFolder = folder();
        state.transfer.SugSheliach = Sender::Http;
        ClientProfile& profile = state.profile;
        profile.ClientCode = u"tarvelmond"_s;
        profile.LabPhone = u"00-0000000"_s;
        profile.HttpHost = u"http://192.0.2.10"_s;
        profile.HttpTikiya = u"hazmanot"_s;
        profile.HttpScriptPath = u"/hazmanot/"_s;
        profile.ReportUrl = u"http://192.0.2.10/aaaqamootreport/padd.asp"_s;
        profile.HttpDoneUrl = u"http://192.0.2.11/aaasssppp/p.asp"_s;
        for (const QString& path : {u"C:\\2000lumora"_s, u"C:\\2000lumora\\!!000"_s, folder()})
            (void)test.files.makeFolder(path);
        write(log(), "the order");
        write(sheet(), QByteArray(900, 's'));
        write(first(), QByteArray("\xFF\xD8\r\n\n\r\0--OLA_GRAIN--\r\n", 23).repeated(300));
        write(second(), QByteArray("\xFF\xD8\n\n second").repeated(500));
        write(third(), {});
        chain.registerPage(PageId::UploadForm,
                           [this] { return std::make_unique<UploadForm>(state, test.platform, chain); });
    }

    static QString name() { return u"2026_11_21_KUP_1234^105"_s; }
    static QString folder() { return u"C:\\2000lumora\\!!000\\"_s + name(); }
    static QString log() { return name() + u".txt"_s; }
    static QString sheet() { return u"!105_1234.jpg"_s; }
    static QString first() { return u"021015GNB0000_03AABB.jpp"_s; }
    static QString second() { return u"111015GNB0001_03AACC.jpp"_s; }
    static QString third() { return u"211015GNB0002_03AADD.jpp"_s; }
    static QString list() { return u"filelisthom.txt"_s; }

    void write(const QString& leaf, const QByteArray& bytes) {
        (void)test.files.writeWhole(folder() + u'\\' + leaf, bytes);
    }
    // The order without the list that was fetched.
    std::map<QString, QByteArray> localFiles() const {
        std::map<QString, QByteArray> bytes;
        for (const QString& leaf : test.files.names(folder(), u"*.*"_s)) {
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
        while (page().counting() && page().controls().Picture1Width < UploadFormControls::Picture1FullWidth)
            page().Timer1_Tick();
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
