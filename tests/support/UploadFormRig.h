#pragma once

#include "support/SendingRig.h"
#include "transfer/http/UploadForm.h"

namespace lumora {

// A prepared order and the page that sends it by HTTP.
struct UploadFormRig : SendingRig {
    explicit UploadFormRig(Internet& line)
        : SendingRig(line) {
        state.transfer.SugSheliach = Sender::Http;
        state.MisparHazmana = u"105"_s;
        state.Optint = OrderKind::Print;
        ClientProfile& profile = state.profile;
        profile.LabPhone = u"00-0000000"_s;
        profile.HttpHost = u"http://192.0.2.10"_s;
        profile.HttpTikiya = u"hazmanot"_s;
        profile.HttpScriptPath = u"/hazmanot/"_s;
        profile.HttpDoneUrl = u"http://192.0.2.11/aaasssppp/p.asp"_s;
        write(log(), "the order");
        write(sheet(), QByteArray(900, 's'));
        write(third(), QByteArray("\xFF\xD8 third").repeated(50));
        registerPage<UploadForm>(PageId::UploadForm);
    }

    static QString sheet() { return u"!105_1234.jpg"_s; }
    static QString third() { return u"211015GNB0002_03AADD.jpp"_s; }

    UploadForm& start() {
        chain.show(PageId::UploadForm);
        page().setTexts();
        page().Form_Activate();
        return page();
    }
    UploadForm& page() { return static_cast<UploadForm&>(*chain.find(PageId::UploadForm)); }
    // The panel grows, the countdown ends and the order is sent.
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
};

} // namespace lumora
