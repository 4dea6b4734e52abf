// The sending itself: attempts, the files on their way, and what the server says of them.
#include "common/AnsiCodePage.h"
#include "common/DrivePathText.h"
#include "order/OrderFolder.h"
#include "order/OrderReport.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "transfer/delivery/LineTrouble.h"
#include "transfer/http/UploadForm.h"
#include "transfer/report/InetForm.h"

namespace lumora {

namespace {

constexpr int attempts = 3;
constexpr int pauseRounds = 1801;
// A list is some lines of names; what is larger is none.
constexpr qint64 largestList = 4 * 1024 * 1024;
constexpr char testFolder[] = "tttt";

} // namespace

void UploadForm::HttpAttempts() {
    if (!idle() || List4Hossarim.isEmpty())
        return;
    Timer1.stop();
    Timer2.stop();
    Picture1.visible = Pic4Timer.visible = Picture5.visible = false;
    Command15.enabled = true;
    Image5.visible = false;
    Label1.text.clear();
    m_listFailure = {};
    Label4Reason.visible = false;
    Label4Reason.text.clear();
    // One cell serves as the number of the list file and as the count of what is missing: behind a first attempt that
    // missed more than three files there is no list of that number, and the whole order goes again.
    int cell = 1;
    for (int attempt = 1; attempt <= attempts && !List4Hossarim.isEmpty() && !m_left; ++attempt) {
        if (attempt > 1)
            Label1.text = m_state.wording(QStringLiteral("שולח קבצים שלא עלו כראוי"),
                                          QStringLiteral("Sending files that did not go up properly"));
        HttpSendFiles(cell);
        cell = List4Hossarim.count();
    }
    if (m_left)
        return;
    Command15.enabled = false;
    Label4File.text.clear();
    showMissingCount();
    if (!List4Hossarim.isEmpty()) {
        Label1.text =
            m_state.wording(QStringLiteral("לאחר שלוש נסיונות המחשב לא הצליח להעלות את כל ההזמנה"),
                            QStringLiteral("After three attempts the computer could not upload the whole order"));
        Image5.visible = true;
        enter(Phase::NotAll);
        return;
    }
    finishSuccess();
}

void UploadForm::finishSuccess() {
    enter(Phase::Reporting);
    percent = 100;
    Label7.text = QStringLiteral("100");
    caption = QStringLiteral("100%");
    PicSargel1Width = PicSargel2Width;
    Label1.text.clear();
    Label4Reason.visible = false;
    HttpPause(2);
    if (m_state.transfer.SugMishloah == Sending::NewOrder && !m_left) {
        HttpSendReport();
        HttpPause(2);
        HttpSendDone();
    }
    if (m_left)
        return;
    Label9.visible = Pic4Hamten.visible = false;
    Picture1.visible = false;
    Picture6.visible = true;
    Label16.text = Label15.text;
    enter(Phase::Success);
}

void UploadForm::HttpSendFiles(int listNumber) {
    enter(Phase::Sending);
    Picture6.visible = false;
    Label10.text = m_state.profile.LabPhone;
    PicSargel1Width = 1;
    percent = 0;
    Label7.text = QStringLiteral("0");
    Label9.visible = true;
    const QString url = m_state.profile.HttpHost + m_state.profile.HttpScriptPath + QStringLiteral("getfile2.php");
    const QStringList files = List4Hossarim.items();
    qsizetype left = files.size();
    bool allPosted = true;
    for (int i = 0; i < files.size(); ++i) {
        const QString name = LeafName(files[i]);
        Label4File.text = m_state.wording(QStringLiteral("קובץ %1 מתוך %2: %3"), QStringLiteral("File %1 of %2: %3"))
                              .arg(i + 1)
                              .arg(files.size())
                              .arg(name);
        HttpPause();
        if (m_left)
            return;
        const QString folder = ParentFolder(files[i]);
        TxtWeb.text = m_script.MultipartPost(LeafName(folder), {files[i]}, url, folder, TxtUrl.text, {}, {});
        if (m_script.failed()) {
            allPosted = false;
            tellReason(m_script.failedBeforeSending() ? LineStep::File : LineStep::Put, m_script.lastFailure(), name);
        } else {
            Label12.text = QString::number(--left);
        }
        pump();
        Label4.text = QString::number(i);
        ShowHttpProgress();
        if (m_left)
            return;
    }
    Label4File.text.clear();
    enter(Phase::Verifying);
    if (CheckOrderOnServer(listNumber) != ServerVerdict::Listed)
        takeAllAsMissing();
    // A file that stayed behind says more than the list that lacks it.
    if (allPosted && !List4Hossarim.isEmpty() && !m_left)
        tellReason(listTrouble(), m_listFailure);
    showMissingCount();
    Label9.visible = Pic4Hamten.visible = false;
}

void UploadForm::tellReason(LineStep step, const Failure& failure, const QString& file) {
    Label4Reason.text = LineTroubleText(m_state, step, failure, file);
    Label4Reason.hint = failure.message;
    Label4Reason.visible = true;
}

// Why a check found files missing although each was posted.
LineStep UploadForm::listTrouble() const {
    if (m_listFailure.message.isEmpty())
        return LineStep::Confirm;
    switch (m_listFailure.kind) {
    case Failure::Kind::Disconnected:
    case Failure::Kind::TimedOut:
        return LineStep::List;
    case Failure::Kind::NotFound:
    case Failure::Kind::AccessDenied:
    case Failure::Kind::NoSpace:
    case Failure::Kind::Other:
        return LineStep::KeepList;
    default:
        return LineStep::Confirm;
    }
}

void UploadForm::ShowHttpProgress() {
    const int count = List4Hossarim.count();
    if (count > 0) {
        const double share = Label4.text.toInt() * 100.0 / count;
        Label7.text = QString::number(share).left(3);
        percent = static_cast<int>(share);
        PicSargel1Width = static_cast<int>(PicSargel2Width * share / 100);
    }
    caption = Label7.text + QStringLiteral(" %   ") +
              m_state.wording(QStringLiteral("נא לא לסגור עד גמר המשלוח"),
                              QStringLiteral("Please do not close until the end of the sending"));
    Q_EMIT changed();
}

void UploadForm::HttpPause(int times) {
    Pic4Hamten.visible = true;
    for (int time = 0; time < times; ++time) {
        for (int i = 1; i <= pauseRounds && !m_left; ++i) {
            Pic4HamtenWidth = i / 27;
            pump();
        }
    }
}

ServerVerdict UploadForm::CheckOrderOnServer(int listNumber) {
    ListAfterWeb.clear();
    TxtWeb.text.clear();
    QString& order = m_state.transfer.OrderFolder;
    if (order.endsWith(u'\\'))
        order.chop(1);
    const QString name = folderName();
    Label15.text = name;
    m_state.transfer.ShemTikiya = name;
    if (List4Kvazim.isEmpty() || name == notChosen || LeafName(ParentFolder(List4Kvazim.item(0))) != name)
        return ServerVerdict::OtherFolder;
    HttpFetchFileListN(listNumber);
    if (m_left)
        return ServerVerdict::NotVerified;
    ListInOrder.clear();
    ListInOrder.append(ParseServerList(TxtFromWeb.text));
    const ServerAnswer answer = ReadServerAnswer(TxtWeb.text, name);
    ListAfterWeb.append(answer.entries);
    // What is named counts as arrived even in a list without a total, but such a list is not believed: the whole order
    // goes again.
    if (answer.namesFolder) {
        const QStringList missing = MarkHossarim(List4Kvazim.items(), ListAfterWeb.items(), name);
        List4Hossarim.clear();
        List4Hossarim.append(missing);
        showMissingCount();
    }
    return answer.verdict;
}

void UploadForm::HttpFetchFileListN(int listNumber) {
    clsDownload download(m_platform);
    const Files& files = m_platform.files;
    if (!files.folderExists(WorkspacePaths::root(m_state)))
        (void)files.makeFolder(WorkspacePaths::root(m_state));
    TxtWeb.text.clear();
    HttpPause(2);
    TxtFromWeb.text.clear();
    HttpPause(2);
    const QString name = folderName();
    TxtWeb.text = FetchUrl(siteAddress(QStringLiteral("/listfileb.php?tik=") + name));
    HttpPause(3);
    pump();
    HttpPause();
    if (m_left)
        return;
    // The list of an earlier check would pass for the answer of this one.
    const QString list = OrderFolder::chosen(m_state).filePath(ListFileName(0));
    const Result<void> cleared = files.fileExists(list) ? files.removeFile(list) : Result<void>();
    if (!cleared)
        m_listFailure = cleared.failure();
    const QString uploads = siteAddress(QStringLiteral("/uploads/") + name + u'/');
    download.download(uploads + QStringLiteral("filelist1.txt"),
                      JoinDrivePath(WorkspacePaths::root(m_state), QStringLiteral("filelist1.txt")));
    HttpPause(2);
    const QString remote = ListFileName(listNumber);
    if (cleared && !remote.isEmpty()) {
        download.download(uploads + remote, list);
        m_listFailure = download.lastFailure();
    }
    pump();
    HttpPause(3);
    const auto size = files.size(list);
    if (cleared && size && *size <= largestList) {
        if (const auto text = files.read(list))
            TxtFromWeb.text = TxtWeb.text = AnsiCodePage::decode(*text);
    }
    HttpPause(2);
}

QString UploadForm::FetchUrl(const QString& url) {
    const auto body = m_platform.internet.fetch(url);
    return body ? AnsiCodePage::decode(*body) : QString();
}

// The answers are not looked at: the order is on the server already.
void UploadForm::HttpSendReport() {
    (void)FetchUrl(m_state.profile.ReportUrl + OrderReportQuery(m_state.profile, m_state.transfer, m_state.shemot));
}

void UploadForm::HttpSendDone() {
    (void)FetchUrl(m_state.profile.HttpDoneUrl + DoneQuery(m_state.profile, m_state.transfer));
}

void UploadForm::Command1_Click() {
    if (!idle())
        return;
    const QString& host = m_state.profile.HttpHost;
    const QString bare = host.mid(host.indexOf(QStringLiteral("://")) + (host.contains(QStringLiteral("://")) ? 3 : 0));
    TxtWeb.text = m_script.MultipartPostInet(QString::fromLatin1(testFolder), {QStringLiteral("4445.png")}, bare,
                                             m_state.profile.HttpScriptPath + QStringLiteral("getfile2.php"),
                                             WorkspacePaths::root(m_state), TxtUrl.text);
    Q_EMIT changed();
}

void UploadForm::Command5_Click() {
    if (!idle())
        return;
    TxtWeb.text = m_script.MultipartPost(QString::fromLatin1(testFolder), {},
                                         m_state.profile.HttpHost + m_state.profile.HttpScriptPath +
                                             QStringLiteral("uploads/listfile.php"),
                                         {}, TxtUrl.text, {}, {});
    Q_EMIT changed();
}

void UploadForm::Command6_Click() {
    if (!idle())
        return;
    TxtWeb.text = FetchUrl(m_state.profile.HttpHost + m_state.profile.HttpScriptPath +
                           QStringLiteral("listfile.php?tik=") + QString::fromLatin1(testFolder));
    Q_EMIT changed();
}

void UploadForm::Command7_Click() {
    if (!idle())
        return;
    m_busy = true;
    const int verdict = static_cast<int>(CheckOrderOnServer(0));
    m_busy = false;
    TxtWeb.text = QString::number(verdict);
    Q_EMIT changed();
}

void UploadForm::Command8_Click() {
    if (!idle())
        return;
    m_busy = true;
    HttpFetchFileListN(0);
    m_busy = false;
    ListInOrder.clear();
    ListInOrder.append(ParseServerList(TxtFromWeb.text));
    Q_EMIT changed();
}

} // namespace lumora
