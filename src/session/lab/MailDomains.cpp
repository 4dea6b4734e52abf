#include "session/lab/MailDomains.h"

namespace lumora {

QStringList mailDomains() {
    return {QStringLiteral("gmail.com"),        QStringLiteral("walla.co.il"),  QStringLiteral("walla.com"),
            QStringLiteral("hotmail.com"),      QStringLiteral("outlook.com"),  QStringLiteral("yahoo.com"),
            QStringLiteral("icloud.com"),       QStringLiteral("zahav.net.il"), QStringLiteral("bezeqint.net"),
            QStringLiteral("netvision.net.il"), QStringLiteral("012.net.il")};
}

QString mailDomainPrompt(bool english) {
    return english ? QStringLiteral("Choose or type") : QStringLiteral("בחר או הקלד");
}

} // namespace lumora
