#include "start/hatchala.h"

#include "common/AnsiCodePage.h"
#include "common/DrivePathText.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/files/Drives.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/PageChain.h"
#include "session/Workspace.h"
#include "session/lab/ClientProfile.h"
#include "session/lab/SettingsText.h"

#include <QUrl>

namespace lumora {

namespace {

// A settings text is one line; what a stranger's server sends in its place may be anything.
constexpr qint64 largestSettingsFile = 1 << 16;

} // namespace

hatchala::hatchala(SessionState& state, const Platform& platform, PageChain& chain, const Deployment& deployment)
    : Page(PageId::hatchala)
    , Timer1(4000, [this] { Timer1_Tick(); })
    , Timer2(1000, [this] { Timer2_Tick(); })
    , Timer3(4, [this] { Timer3_Tick(); })
    , Timer4(1000, [this] { Timer4_Tick(); })
    , Timer5(15, [this] { Timer5_Tick(); })
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_deployment(deployment) {
    for (Caption* hidden : {&Picture1, &Picture8, &Command1, &Command2, &Label3, &Label4, &Label6, &Label7, &Picture3})
        hidden->visible = false;
    for (Caption& help : Image12)
        help.visible = false;
}

void hatchala::load() {
    m_state.EnglishTips = 0;
    m_state.SugTzad = m_deployment.SugTzad;
    // Both clicks: the first leaves nothing behind that the second does not set anew.
    Check1_Click(true);
    Check1_Click(false);
    m_state.DiskRoot = m_platform.files.drives().programRoot();
    loadProfile();
    setTexts();
    Label6.text = QStringLiteral("5");
    Notice.text = m_state.handOver.notice;
    Notice.visible = !Notice.text.isEmpty();
    m_state.handOver.notice.clear();
    Timer2.start();
    Timer5.start();
}

void hatchala::setTexts() {
    const SessionState& s = m_state;
    Title.text = s.wording(QStringLiteral("ברוכים הבאים"), QStringLiteral("Welcome"));
    Image1.text = s.wording(QStringLiteral("התחל"), QStringLiteral("Start"));
    Image11.text = s.wording(QStringLiteral("מחירון"), QStringLiteral("Price list"));
    Image5.text = s.wording(QStringLiteral("לאתר שלנו"), QStringLiteral("Our site"));
    Image8.text = QUrl(s.profile.SiteUrl).host();
    Image6.text = s.wording(QStringLiteral("יצירת קשר עם המעבדה"), QStringLiteral("Reach the lab"));
    Image3.text = s.wording(QStringLiteral("יציאה"), QStringLiteral("Exit"));
    Image1.hint = s.wording({}, QStringLiteral("Start Button"));
    Image11.hint = s.wording({}, QStringLiteral("Navigate to Price List Page on the web"));
    Image5.hint = s.wording({}, QStringLiteral("Navigate to our site"));
    Image3.hint = s.wording({}, QStringLiteral("Exit this program"));
    Check1.text = QStringLiteral("English Tips");
    Label3.text = s.wording({}, QStringLiteral("With this button \nyou can navigaet \nTo our site"));
    Label4.text = s.wording({}, QStringLiteral("With this button \nyou can exit \n"));
    Label3.visible = s.english();
    Label4.visible = s.english();
    Picture3.text =
        s.wording(QStringLiteral("מה עושה הכפתור?"),
                  QStringLiteral(" please select \n Wher do you want \n to recieve the \n Printed Pictures "));
    List1Caption.text = s.wording(QStringLiteral("היכן תרצו לקבל את התמונות?"), Picture3.text);
    setHelp();
    Label7.text = s.wording(QStringLiteral("מיד מתחילים"), QStringLiteral("Starting right away"));
    Label8.text = QStringLiteral("V  V  V");
    Command1.text = s.wording(QStringLiteral("משלוח"), QStringLiteral("Sending"));
    Command2.text = s.wording(QStringLiteral("התחל"), QStringLiteral("Start"));
    Command3.text = QStringLiteral("Read");
    Command4.text = QStringLiteral("myzofen");
    Command5.text = QStringLiteral("shoora");
    Command6.text = QStringLiteral("open zofen");

    const int chosen = List1.currentIndex();
    List1.clear();
    if (s.english()) {
        List1.append({QStringLiteral("* Recieve by Postmail "), QStringLiteral("* Get at stor ")});
    } else {
        for (const Shop& shop : m_deployment.profile.Shops)
            List1.append(QStringLiteral("* ") + shop.name);
    }
    List1.setCurrentIndex(chosen);
    showProfile();
    Q_EMIT changed();
}

void hatchala::setHelp() {
    const auto help = [this](Hover over, const QString& hebrew, const QString& english) {
        Image12[static_cast<std::size_t>(over)].text = m_state.wording(hebrew, english);
    };
    help(Hover::Image1, QStringLiteral("מתחילים הזמנה חדשה: פרטים, תמונות ומשלוח למעבדה"),
         QStringLiteral("Begins a new order: your details, your pictures, and off to the lab"));
    help(Hover::Image11, QStringLiteral("מציג את מחירי ההדפסה באתר שלנו"),
         QStringLiteral("Shows the prices of prints on our web site"));
    help(Hover::Image5, QStringLiteral("פותח את אתר האינטרנט שלנו"), QStringLiteral("Opens our web site"));
    help(Hover::Image3, QStringLiteral("סוגר את התוכנה. דבר אינו נשלח"),
         QStringLiteral("Ends the program. Nothing is sent"));
    help(Hover::Image6, QStringLiteral("יש שאלה? נשמח לעזור בטלפון או בדואר אלקטרוני"),
         QStringLiteral("Any question? We are glad to help, by telephone or by e-mail"));
}

void hatchala::Check1_Click(bool checked) {
    MouseMove(Hover::Nothing);
    Check1.checked = checked;
    m_state.EnglishTips = checked ? 1 : 0;
    List1.clear();
    setTexts();
}

// --- the ways on ---

void hatchala::Image1_MouseDown() {
    startWith(QStringLiteral("KUP"));
    Q_EMIT changed();
}

void hatchala::StartAutomatically() {
    startWith(QStringLiteral("PIC"));
}

void hatchala::startWith(const QString& code) {
    if (m_leaving)
        return;
    // No tick may run behind a hand-over.
    Timer4.stop();
    Timer1.stop();
    Timer2.stop();
    m_state.MishloachHabaita = false;
    if (m_state.DeliveryChoiceMode == 1) {
        Command2_Click(); // does nothing as long as no shop is chosen
        return;
    }
    loadProfile();
    m_state.KodMishloach = code;
    m_state.KodMishloachMakor = code;
    m_state.shemot.Mail.clear();
    handOver();
}

// Comes only when the press left the page open: the question of the shop is still to be answered.
void hatchala::Image1_Click() {
    if (m_leaving || m_state.DeliveryChoiceMode != 1)
        return;
    Picture1Width = 5;
    Picture1.visible = true;
    Timer3.start();
    Timer5.stop();
    m_state.KodMishloach = QStringLiteral("KUP");
    Q_EMIT changed();
}

void hatchala::Picture1_Escape() {
    if (m_leaving)
        return;
    Timer3.stop();
    Picture1.visible = false;
    Timer2.start();
    Timer5.start();
    Q_EMIT changed();
}

void hatchala::List1_Click(int row) {
    List1.setCurrentIndex(row);
    Timer3.stop();
    Command2_Click();
    Q_EMIT changed();
}

void hatchala::Command2_Click() {
    const int row = List1.currentIndex();
    if (m_leaving || row < 0 || row >= static_cast<int>(m_state.profile.Shops.size()))
        return;
    loadProfile();
    const QString phone = m_state.profile.Shops[static_cast<std::size_t>(row)].phone;
    // The details page loads with the lab's own number for the first shop and with the shop's for the second.
    if (row == 1)
        m_state.profile.LabPhone = phone;
    m_state.MishloachHabaita = false;
    m_state.KodMishloach = row == 0 ? QStringLiteral("SOK") : QStringLiteral("OSK");
    m_state.KodMishloachMakor = m_state.KodMishloach;
    m_state.shemot.Mail.clear();
    handOver();
    m_state.profile.LabPhone = phone;
}

void hatchala::handOver() {
    for (Ticker* timer : {&Timer1, &Timer2, &Timer3, &Timer4, &Timer5})
        timer->stop();
    m_leaving = true;
    m_state.handOver.pressStart = false;
    m_chain.follow(PageId::hatchala, Outcome::OrderBegun);
}

void hatchala::Command1_Click() {
    m_chain.follow(PageId::hatchala, Outcome::SendingWanted);
}

void hatchala::Image3_MouseDown() {
    m_chain.endProgram();
}

void hatchala::Image11_Click() {
    loadProfile();
    m_platform.shell.openWebPage(m_state.profile.PriceListUrl);
}

void hatchala::Image5_Click() {
    loadProfile();
    m_platform.shell.openWebPage(m_state.profile.SiteUrl);
}

void hatchala::Image8_Click() {
    Image5_Click();
}

void hatchala::MouseMove(Hover over) {
    if (over == m_over)
        return;
    m_over = over;
    for (std::size_t i = 0; i < Image12.size(); ++i)
        Image12[i].visible = over != Hover::Nothing && static_cast<std::size_t>(over) == i;
    // In English the place of these pictures is taken by words.
    if (!m_state.english()) {
        Picture3.visible = over != Hover::Nothing;
        Picture2.visible = over == Hover::Nothing;
        Image2.visible = over == Hover::Nothing;
    }
    Q_EMIT changed();
}

// --- timers ---

void hatchala::Timer1_Tick() {
    Timer1.stop();
    // A picture that does not come is no loss: one that is there already shows all the same.
    const auto target = m_platform.files.drives().toHost(m_state.profile.AdFile1);
    if (target && Workspace(m_state, m_platform.files).MakeRootFolders())
        (void)m_platform.internet.download(m_state.profile.AdUrl1, *target);
    if (m_platform.files.fileExists(m_state.profile.AdFile1)) {
        Picture4 = m_state.profile.AdFile1;
        Timer2.start();
    }
    Q_EMIT changed();
}

void hatchala::Timer2_Tick() {
    if (!m_platform.files.fileExists(m_state.profile.AdFile1)) {
        Timer2.stop();
        return;
    }
    Timer2.setInterval(30);
    // One that the installation placed there needs no fetch.
    if (Picture4.isEmpty()) {
        Picture4 = m_state.profile.AdFile1;
        Q_EMIT changed();
    }
    if (Picture4Width >= pictureWidth)
        m_pictureStep = -1;
    Picture4Width += m_pictureStep;
    if (Picture4Width < 5)
        m_pictureStep = 1;
    Q_EMIT moved();
}

void hatchala::Timer3_Tick() {
    if (Picture1Width < panelWidth)
        Picture1Width += 5;
    else
        Timer3.stop();
    Q_EMIT moved();
}

void hatchala::Timer4_Tick() {
    const int left = Label6.text.toInt();
    if (left >= 1) {
        Label6.text = QString::number(left - 1);
        Label6.visible = true;
        Label7.visible = true;
        Q_EMIT changed();
        return;
    }
    Timer4.stop();
    Timer4.setInterval(0);
    StartAutomatically();
}

void hatchala::Timer5_Tick() {
    if (Label8Top >= arrowBottom)
        Label8Top = arrowTop;
    ++Label8Top;
    Q_EMIT moved();
}

// --- the profile and its service panel ---

void hatchala::loadProfile() {
    LoadDefaultProfile(m_state, m_deployment);
    showProfile();
}

void hatchala::showProfile() {
    Label4Tel.text = m_state.profile.LabPhone;
    Label4Tel2.text = m_state.profile.LabPhone;
    Label4Zel.text = m_state.profile.LabPhone;
    Label1.text = m_state.profile.LabMail;
}

void hatchala::Command5_Click() {
    BuildSettingsText();
}

void hatchala::BuildSettingsText() {
    const QString text = SettingsText(m_state.profile);
    const QString path = settingsFile();
    if (const Result<void> written = m_platform.files.writeWhole(path, AnsiCodePage::encode(text) + "\r\n"); !written)
        m_platform.dialogs.message(written.failure().message);
    List4pices.clear();
    List4pices.append(SplitSettings(text).pieces);
    Label5.text = text;
    Q_EMIT changed();
}

void hatchala::DownloadSettings() {
    const Workspace workspace(m_state, m_platform.files);
    if (!workspace.MakeRootFolders())
        return;
    const QString path = settingsFile();
    (void)m_platform.files.removeFile(path);
    // The caller learns of a failure from the file that is missing then.
    if (const auto target = m_platform.files.drives().toHost(path))
        (void)m_platform.internet.download(
            QStringLiteral("http://%1/00natoonim/%2.txt").arg(m_state.profile.SettingsHost, m_state.profile.ClientCode),
            *target);
}

void hatchala::ReadSettingsFile(const QString& path) {
    List2.clear();
    const bool named = LeafName(path) == m_state.profile.ClientCode + QStringLiteral(".txt");
    const Result<qint64> size = m_platform.files.size(path);
    const Result<QByteArray> bytes = named && size && *size <= largestSettingsFile
                                         ? m_platform.files.read(path)
                                         : Result<QByteArray>(Failure{Failure::Kind::NotFound, {}});
    if (!bytes) {
        m_platform.dialogs.message(QStringLiteral("No Server"));
        return;
    }
    QString text = AnsiCodePage::decode(*bytes);
    text.replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
    if (text.endsWith(u'\n'))
        text.chop(1);
    if (!bytes->isEmpty())
        List2.append(text.split(u'\n'));
}

void hatchala::Command3_Click() {
    DownloadSettings();
    ReadSettingsFile(settingsFile());
    if (List2.isEmpty())
        m_platform.dialogs.message(QStringLiteral("No Server 2"));
    else
        SplitSettingsText(List2.item(0));
    Q_EMIT changed();
}

void hatchala::SplitSettingsText(const QString& text) {
    List4pices.clear();
    List4pices.append(SplitSettings(text).pieces);
    Q_EMIT changed();
}

void hatchala::Command8_Click() {
    SplitSettingsText(Label5.text);
}

// Twice: the stored form is the text under the square of the substitution.
void hatchala::Command4_Click() {
    Label5.text = Scramble(Scramble(Label5.text));
    Q_EMIT changed();
}

void hatchala::Command6_Click() {
    Label5.text = Unscramble(Unscramble(Label5.text));
    Q_EMIT changed();
}

QString hatchala::settingsFile() const {
    return JoinDrivePath(WorkspacePaths::root(m_state), m_state.profile.ClientCode + QStringLiteral(".txt"));
}

} // namespace lumora
