#include "session/lab/MailDomains.h"

namespace lumora {

using namespace Qt::StringLiterals;

QStringList mailDomains() {
    return {u"gmail.com"_s,    u"walla.co.il"_s,      u"walla.com"_s,  u"hotmail.com"_s,
            u"outlook.com"_s,  u"yahoo.com"_s,        u"icloud.com"_s, u"zahav.net.il"_s,
            u"bezeqint.net"_s, u"netvision.net.il"_s, u"012.net.il"_s};
}

QString mailDomainPrompt(bool english) {
    return english ? u"Choose or type"_s : u"בחר או הקלד"_s;
}

} // namespace lumora
