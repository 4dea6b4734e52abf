#include "session/WebPages.h"

#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"

namespace lumora {

using namespace Qt::StringLiterals;

// The browser may be missed only after the page has gone.
void WebPages::open(const QString& url) const {
    m_platform.shell.openWebPage(url, [pages = *this, url] {
        if (pages.m_state.Careful || pages.m_state.closedToCustomers())
            pages.tellNotOpened(url);
    });
}

void WebPages::tellNotOpened(const QString& url) const {
    QString text = url.trimmed().isEmpty()
                       ? m_state.wording(u"לדף זה לא הוגדרה כתובת.", u"No address is set for this page.")
                       : m_state.wording(u"לא ניתן להציג כאן דפי אינטרנט.", u"Web pages can't be shown here.");
    if (!url.trimmed().isEmpty())
        text += u'\n' +
                m_state.wording(u"אפשר לפתוח את הדף במכשיר אחר: %1", u"You can open this page on another device: %1")
                    .arg(url.trimmed());
    const QString phone = m_state.profile.LabPhone.trimmed();
    text += u'\n' + askForHelp(m_state);
    if (!phone.isEmpty())
        text += u' ' + m_state.wording(u"טלפון: %1", u"Telephone: %1").arg(phone);
    m_platform.dialogs.message(text);
}

} // namespace lumora
