#include "start/hatchala.h"

#include "platform/files/Files.h"
#include "session/LabPages.h"
#include "session/PageChain.h"
#include "session/lab/ClientProfile.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

hatchala::hatchala(SessionState& state, const Platform& platform, PageChain& chain, const Deployment& deployment)
    : Page(PageId::hatchala)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_deployment(deployment)
    , m_timers{{4000, [this] { fetchPicture(); }},
               {1000, [this] { movePicture(); }},
               {4, [this] { unfoldPanel(); }},
               {1000, [this] { countDown(); }},
               {15, [this] { moveArrow(); }}} {}

void hatchala::load() {
    m_state.DiskRoot = m_platform.files.drives().programRoot();
    if (m_deployment.kiosk.on)
        endCustomer();
    m_state.EnglishTips = 0;
    m_state.SugTzad = m_deployment.SugTzad;
    loadProfile();
    offerUnfinished();
    m_kept = std::exchange(m_state.handOver.kept, {});
    setTexts();
    Label6.text = QString::number(m_secondsLeft);
    m_timers.Timer2.start();
    m_timers.Timer5.start();
}

void hatchala::setEnglish(bool english) {
    showHelp(Hover::Nothing);
    Check1.checked = english;
    m_state.EnglishTips = english ? 1 : 0;
    List1.clear();
    setTexts();
}

bool hatchala::isUntouched() const {
    return !m_state.english() && !m_state.staff && !Pic4Hemshech.visible && !Picture1.visible && !Notice.visible;
}

// --- leaving the page ---

void hatchala::startWith(const QString& code) {
    if (m_leaving || Pic4Hemshech.visible)
        return;
    // No tick may run after the order has begun.
    m_timers.Timer4.stop();
    m_timers.Timer1.stop();
    m_timers.Timer2.stop();
    m_state.MishloachHabaita = false;
    if (m_state.DeliveryChoiceMode == 1) {
        startWithShop(); // does nothing as long as no shop is chosen
    } else {
        loadProfile();
        m_state.KodMishloach = code;
        handOver();
    }
    Q_EMIT changed();
}

void hatchala::startWithShop() {
    const int row = List1.currentIndex();
    if (m_leaving || row < 0 || row >= static_cast<int>(m_state.profile.Shops.size()))
        return;
    loadProfile();
    const QString phone = m_state.profile.Shops[static_cast<std::size_t>(row)].phone;
    // The details page loads with the lab's own telephone for the first shop and with the shop's for the second.
    if (row == 1)
        m_state.profile.LabPhone = phone;
    m_state.MishloachHabaita = false;
    m_state.KodMishloach = row == 0 ? u"SOK"_s : u"OSK"_s;
    handOver();
    m_state.profile.LabPhone = phone;
}

void hatchala::handOver() {
    stopTimers();
    m_leaving = true;
    m_state.KodMishloachMakor = m_state.KodMishloach;
    m_state.shemot.Mail.clear();
    m_state.handOver.pressStart = false;
    m_chain.follow(PageId::hatchala, Outcome::OrderBegun);
}

void hatchala::stopTimers() {
    for (Ticker* timer : {&m_timers.Timer1, &m_timers.Timer2, &m_timers.Timer3, &m_timers.Timer4, &m_timers.Timer5})
        timer->stop();
}

void hatchala::askForTheShop() {
    if (m_leaving || Pic4Hemshech.visible || m_state.DeliveryChoiceMode != 1)
        return;
    m_motion.foldPanel();
    Picture1.visible = true;
    m_timers.Timer3.start();
    m_timers.Timer5.stop();
    m_state.KodMishloach = u"KUP"_s;
    Q_EMIT changed();
}

void hatchala::putOffTheQuestion() {
    if (m_leaving)
        return;
    m_timers.Timer3.stop();
    Picture1.visible = false;
    m_timers.Timer2.start();
    m_timers.Timer5.start();
    Q_EMIT changed();
}

void hatchala::chooseShop(int row) {
    List1.setCurrentIndex(row);
    m_timers.Timer3.stop();
    startWithShop();
    Q_EMIT changed();
}

void hatchala::openPriceList() {
    loadProfile();
    LabPages(m_state, m_platform).openPriceList();
}

void hatchala::openSite() {
    loadProfile();
    LabPages(m_state, m_platform).openSite();
}

void hatchala::leaveProgram() {
    m_chain.endProgram();
}

void hatchala::loadProfile() {
    LoadDefaultProfile(m_state, m_deployment);
    showProfile();
}

void hatchala::showProfile() {
    for (Caption* phone : {&Label4Tel, &Label4Tel2, &Label4Zel})
        phone->text = m_state.profile.LabPhone;
    Label1.text = m_state.profile.LabMail;
}

// --- motion and help ---

void hatchala::showHelp(Hover over) {
    if (over == m_over)
        return;
    m_over = over;
    const bool helps = over != Hover::Nothing;
    for (std::size_t i = 1; i < Image12.size(); ++i)
        Image12[i].visible = static_cast<std::size_t>(over) == i;
    // In English, words stand in place of these pictures.
    if (!m_state.english()) {
        Picture3.visible = helps;
        Picture2.visible = Image2.visible = !helps;
    }
    Q_EMIT changed();
}

void hatchala::movePicture() {
    if (!m_platform.files.fileExists(m_state.profile.AdFile1)) {
        m_timers.Timer2.stop();
        return;
    }
    m_timers.Timer2.setInterval(30);
    // A picture that the installation placed there is not fetched.
    if (Picture4.isEmpty()) {
        Picture4 = m_state.profile.AdFile1;
        Q_EMIT changed();
    }
    m_motion.movePicture();
    Q_EMIT moved();
}

void hatchala::unfoldPanel() {
    if (!m_motion.unfoldPanel())
        m_timers.Timer3.stop();
    Q_EMIT moved();
}

void hatchala::moveArrow() {
    m_motion.moveArrow();
    Q_EMIT moved();
}

} // namespace lumora
