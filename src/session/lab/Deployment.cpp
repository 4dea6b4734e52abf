#include "session/lab/Deployment.h"

namespace lumora {

using namespace Qt::StringLiterals;

// The addresses are reserved for examples, so that a program without a lab's file reaches no server.
Deployment::Deployment() {
    profile.FtpFolder2 = u"zalamim234"_s;
    profile.ClientCode = u"tarvelmond"_s;
    profile.FtpServer = u"192.0.2.10"_s;
    profile.FtpPassword = u"morvex482"_s;
    profile.FtpUser = u"lumora"_s;
    profile.JppBase = 30;
    profile.JppChunks = 56;
    profile.ProfileNumber = 201100;
    profile.SizeList = {u"09/13"_s, u"10/15"_s, u"13/18"_s, u"15/21"_s, u"20/30"_s,
                        u"30/40"_s, u"30/45"_s, u"40/60"_s, u"50/70"_s};
    profile.QuickSizes = {u"10/15"_s, u"13/18"_s};
    profile.ClientLetter = u"AL"_s;
    profile.LabName1 = u"Lumora"_s;
    profile.LabName2 = u"Lumora"_s;
    profile.LabMail = u"info@lumora.example"_s;
    profile.LabPhone = u"00-0000000"_s;
    profile.SiteUrl = u"http://www.lumora.example/"_s;
    profile.ReportUrl = u"http://report.lumora.example/aaaqamootreport/padd.asp"_s;
    profile.DoneUrl = u"http://report.lumora.example/aaasssppp/p.asp"_s;
    profile.HttpDoneUrl = u"http://upload.lumora.example/aaasssppp/p.asp"_s;
    profile.SettingsHost = u"settings.lumora.example"_s;
    profile.ReportOn = 1;
    profile.Shops = {Shop{u"חנות ראשונה"_s, u"00-0000001"_s}, Shop{u"חנות שנייה"_s, u"00-0000002"_s}};
    profile.Branches.back().caption = u"משלוח לבית"_s;
}

} // namespace lumora
