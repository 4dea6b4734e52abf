#include "session/lab/Deployment.h"

namespace lumora {

// Addresses of the kinds kept free for examples: a program without a lab's file reaches nobody.
Deployment::Deployment() {
    profile.FtpFolder2 = QStringLiteral("zalamim234");
    profile.ClientCode = QStringLiteral("tarvelmond");
    profile.FtpServer = QStringLiteral("192.0.2.10");
    profile.FtpPassword = QStringLiteral("morvex482");
    profile.FtpUser = QStringLiteral("lumora");
    profile.JppBase = 30;
    profile.JppChunks = 56;
    profile.ProfileNumber = 201100;
    profile.SizeList = {QStringLiteral("09/13"), QStringLiteral("10/15"), QStringLiteral("13/18"),
                        QStringLiteral("15/21"), QStringLiteral("20/30"), QStringLiteral("30/40"),
                        QStringLiteral("30/45"), QStringLiteral("40/60"), QStringLiteral("50/70")};
    profile.QuickSizes = {QStringLiteral("10/15"), QStringLiteral("13/18")};
    profile.ClientLetter = QStringLiteral("AL");
    profile.LabName1 = QStringLiteral("Lumora");
    profile.LabName2 = QStringLiteral("Lumora");
    profile.LabMail = QStringLiteral("info@lumora.example");
    profile.LabPhone = QStringLiteral("00-0000000");
    profile.SiteUrl = QStringLiteral("http://www.lumora.example/");
    profile.ReportUrl = QStringLiteral("http://report.lumora.example/aaaqamootreport/padd.asp");
    profile.DoneUrl = QStringLiteral("http://report.lumora.example/aaasssppp/p.asp");
    profile.HttpDoneUrl = QStringLiteral("http://upload.lumora.example/aaasssppp/p.asp");
    profile.SettingsHost = QStringLiteral("settings.lumora.example");
    profile.ReportOn = 1;
    profile.Shops = {Shop{QStringLiteral("חנות ראשונה"), QStringLiteral("00-0000001")},
                     Shop{QStringLiteral("חנות שנייה"), QStringLiteral("00-0000002")}};
    profile.Branches.back().caption = QStringLiteral("משלוח לבית");
}

} // namespace lumora
