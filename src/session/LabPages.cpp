#include "session/LabPages.h"

#include "common/Warning.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"

#include <QFileInfo>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// English pages show "terms.en.html" where it lies beside "terms.html".
QString inLanguage(const QString& file, bool english) {
    const QFileInfo info(file);
    const QString other = info.path() + u'/' + info.completeBaseName() + u".en."_s + info.suffix();
    return english && QFileInfo::exists(other) ? other : file;
}

} // namespace

void LabPages::openTerms() const {
    if (m_state.texts.terms.isEmpty())
        openSite();
    else
        showText(m_state.texts.terms, m_state.wording(u"תנאי שימוש", u"Terms of use"));
}

void LabPages::openPriceList() const {
    if (m_state.texts.priceList.isEmpty())
        openAddress(m_state.profile.PriceListUrl);
    else
        showText(m_state.texts.priceList, m_state.wording(u"מחירון", u"Price list"));
}

void LabPages::openSite() const {
    openAddress(m_state.profile.SiteUrl);
}

bool LabPages::openHelp() const {
    if (m_state.texts.help.isEmpty())
        return false;
    showText(m_state.texts.help, m_state.wording(u"עזרה", u"Help"));
    return true;
}

void LabPages::showText(const QString& file, const QString& title) const {
    const Result<void> shown = m_platform.dialogs.showText(toHostPath(inLanguage(file, m_state.english())), title);
    if (shown)
        return;
    writeWarning(shown.failure().message);
    m_platform.dialogs.message(
        m_state.wording(u"לא ניתן להציג את הדף הזה במחשב זה.", u"This page can't be shown on this computer.") + u'\n' +
        askForHelp(m_state));
}

// The browser may be missed only after the page has gone.
void LabPages::openAddress(const QString& url) const {
    m_platform.shell.openWebPage(url, [pages = *this, url] {
        if (pages.m_state.Careful || pages.m_state.closedToCustomers())
            pages.tellNotOpened(url);
    });
}

void LabPages::tellNotOpened(const QString& url) const {
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
