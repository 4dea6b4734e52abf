#include "transfer/http/HttpSender.h"

#include "common/AnsiCodePage.h"
#include "common/DrivePath.h"
#include "order/OrderFolder.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "transfer/delivery/OrderFiles.h"
#include "transfer/delivery/StoppableLine.h"
#include "transfer/report/InetForm.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int httpPauseRounds = 1801;
// A larger file is no list.
constexpr qint64 largestList = 4 * 1024 * 1024;
const QString testFolder = u"tttt"_s;

} // namespace

HttpSender::HttpSender(SessionState& state, const Platform& platform, SendingEvents& events)
    : Attempts(events, stop)
    , report(state, platform, stop, Sender::Http, [this](const Result<void>& written) { keep(written); })
    , m_state(state)
    , m_platform(platform)
    , m_script(platform)
    , m_listGuard(state)
    , m_arrival(state, platform, stop) {}

QString HttpSender::folderName() const {
    return OrderFolder::chosen(m_state).name();
}

QString HttpSender::siteAddress(const QString& rest) const {
    return m_state.profile.HttpHost + u'/' + m_state.profile.HttpTikiya + rest;
}

void HttpSender::HttpPause(int times) {
    for (int time = 0; time < times; ++time)
        pauseInRounds(httpPauseRounds, m_events, m_platform.pump, m_stop);
}

QString HttpSender::FetchUrl(const QString& url) const {
    const auto body = m_platform.internet.fetch(url);
    return body ? AnsiCodePage::decode(*body) : QString();
}

void HttpSender::BuildOrderFileList() {
    lists.List4Kvazim.clear();
    lists.List4Kvazim.append(HttpOrderFiles(m_platform.files, m_state.transfer.OrderFolder, ListFileName(0)));
    m_journal.emplace(m_platform.files, OrderFolder(m_state.transfer.OrderFolder));
    if (m_state.transfer.SugMishloah == Sending::Resend)
        m_journal->isSentAgain();
    report.beginOrder(&*m_journal);
    m_notKeptTold = false;
    m_arrival.beginOrder();
    takeLeftBehind();
}

void HttpSender::takeLeftBehind() {
    m_leftBehind = m_journal->state().filesInHand;
    m_leftBehind.removeIf([this](const QString& path) { return !lists.List4Kvazim.contains(path); });
}

void HttpSender::keep(const Result<void>& written) {
    if (written || m_notKeptTold)
        return;
    m_notKeptTold = true;
    m_events.brokenNotKept(written.failure());
}

void HttpSender::leave() {
    stop.left = true;
    m_platform.internet.abort();
}

void HttpSender::tellMissing() {
    m_events.reached(SendingMoment::Missing, lists.List4Hossarim.count());
}

std::optional<SendingPhase> HttpSender::HttpAttempts() {
    m_listNumber = HttpListGuard::first;
    m_listFailure = {};
    const StoppableLine line(m_platform);
    return run(attempts);
}

std::optional<SendingPhase> HttpSender::sendMissing(int) {
    const QStringList files = lists.List4Hossarim.items();
    if (m_journal)
        keep(m_journal->sendingBegins(Sender::Http, false));
    m_left = static_cast<int>(files.size());
    m_allPosted = true;
    for (int i = 0; i < files.size(); ++i) {
        m_events.sending(i, static_cast<int>(files.size()), LeafName(files[i]));
        HttpPause();
        if (m_stop.left)
            return std::nullopt;
        post(files[i]);
        m_platform.pump.pump();
        m_events.progressed(i, lists.List4Hossarim.count());
        if (m_stop.left)
            return std::nullopt;
    }
    return std::nullopt;
}

void HttpSender::post(const QString& path) {
    const DrivePath folder = DrivePath(path).folder();
    const QString url = m_state.profile.HttpHost + m_state.profile.HttpScriptPath + u"getfile2.php"_s;
    if (m_journal)
        keep(m_journal->take(path));
    m_arrival.forget(path);
    lists.TxtWeb = m_script.MultipartPost(folder.leaf(), {path}, url, folder, lists.TxtUrl, {}, {});
    if (m_journal && (!m_script.failed() || (m_script.failedBeforeSending() && !m_leftBehind.contains(path))))
        keep(m_journal->release(path));
    m_events.reached(SendingMoment::Answered);
    if (m_script.failed()) {
        m_allPosted = false;
        if (m_stop.left) // the customer has cut it
            return;
        m_events.failed(m_script.failedBeforeSending() ? LineStep::File : LineStep::Put, m_script.lastFailure(),
                        LeafName(path));
    } else {
        m_leftBehind.removeAll(path);
        m_events.reached(SendingMoment::Posted, --m_left);
    }
}

std::optional<SendingPhase> HttpSender::checkArrival(int) {
    findMissing(m_listNumber);
    m_listNumber = m_listGuard.nextList(lists.List4Hossarim.count(), m_verdict);
    // A failed post explains more than the list that lacks the file.
    if (m_allPosted && !lists.List4Hossarim.isEmpty() && !m_stop.left)
        m_events.failed(listTrouble(), m_listFailure);
    m_events.reached(SendingMoment::CheckEnds);
    if (lists.List4Hossarim.isEmpty())
        return isWholeOrder() ? SendingPhase::Success : SendingPhase::AllThere;
    return std::nullopt;
}

// The step that failed when a check finds files missing although all were posted.
LineStep HttpSender::listTrouble() const {
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

void HttpSender::findMissing(int listNumber) {
    m_verdict = CheckOrderOnServer(listNumber);
    if (m_verdict != ServerVerdict::Listed) {
        lists.List4Hossarim.clear();
        lists.List4Hossarim.append(lists.List4Kvazim.items());
    }
    for (const QString& path : std::as_const(m_leftBehind)) {
        if (!lists.List4Hossarim.contains(path))
            lists.List4Hossarim.append(path);
    }
    if (lists.List4Hossarim.isEmpty() && !m_stop.left)
        lists.List4Hossarim.append(m_arrival.unproven(lists.List4Kvazim.items(), lists.ListAfterWeb.items(),
                                                      siteAddress(u"/uploads/"_s + folderName() + u'/')));
    tellMissing();
}

ServerVerdict HttpSender::CheckOrderOnServer(int listNumber) {
    lists.ListAfterWeb.clear();
    lists.TxtWeb.clear();
    DrivePath& order = m_state.transfer.OrderFolder;
    if (order.text().endsWith(u'\\'))
        order = order.folder();
    const QString name = folderName();
    m_state.transfer.ShemTikiya = name;
    m_events.reached(SendingMoment::Answered);
    if (lists.List4Kvazim.isEmpty() || !OrderFolder(order).isChosen() ||
        DrivePath(lists.List4Kvazim.item(0)).folder().leaf() != name)
        return ServerVerdict::OtherFolder;
    HttpFetchFileListN(listNumber);
    if (m_stop.left)
        return ServerVerdict::NotVerified;
    readListInOrder();
    const ServerAnswer answer = ReadServerAnswer(lists.TxtWeb, name);
    lists.ListAfterWeb.append(answer.entries);
    // Files named in a list without a total count as arrived, but that list is not trusted: the whole order is sent
    // again.
    if (answer.namesFolder) {
        const QStringList missing =
            MarkHossarim(lists.List4Kvazim.items(), lists.ListAfterWeb.items(), name, m_listGuard.match());
        lists.List4Hossarim.clear();
        lists.List4Hossarim.append(missing);
        tellMissing();
    }
    return answer.verdict;
}

void HttpSender::readListInOrder() {
    lists.ListInOrder.clear();
    lists.ListInOrder.append(ParseServerList(lists.TxtFromWeb));
}

void HttpSender::HttpFetchFileListN(int listNumber) {
    const Files& files = m_platform.files;
    if (!files.folderExists(WorkspacePaths::root(m_state)))
        (void)files.makeFolder(WorkspacePaths::root(m_state));
    lists.TxtWeb.clear();
    HttpPause(2);
    lists.TxtFromWeb.clear();
    HttpPause(2);
    lists.TxtWeb = FetchUrl(siteAddress(u"/listfileb.php?tik="_s + folderName()));
    m_events.reached(SendingMoment::Answered);
    HttpPause(3);
    m_platform.pump.pump();
    HttpPause();
    if (!m_stop.left)
        downloadList(listNumber);
    m_events.reached(SendingMoment::Answered);
    HttpPause(2);
}

void HttpSender::downloadList(int listNumber) {
    const Files& files = m_platform.files;
    clsDownload download(m_platform);
    // A list from an earlier check must not be read as the answer to this one.
    const DrivePath list = OrderFolder::chosen(m_state).filePath(ListFileName(0));
    const Result<void> cleared = files.fileExists(list) ? files.removeFile(list) : Result<void>();
    if (!cleared)
        m_listFailure = cleared.failure();
    const QString uploads = siteAddress(u"/uploads/"_s + folderName() + u'/');
    download.download(uploads + u"filelist1.txt"_s, WorkspacePaths::root(m_state) / u"filelist1.txt");
    HttpPause(2);
    const QString remote = ListFileName(listNumber);
    if (cleared && !remote.isEmpty()) {
        download.download(uploads + remote, list);
        m_listFailure = download.lastFailure();
    }
    m_platform.pump.pump();
    HttpPause(3);
    const auto size = files.size(list);
    if (cleared && size && *size <= largestList) {
        if (const auto text = files.read(list))
            lists.TxtFromWeb = lists.TxtWeb = AnsiCodePage::decode(*text);
    }
}

bool HttpSender::isWholeOrder() const {
    QStringList names;
    for (const QString& path : lists.List4Kvazim.items())
        names += LeafName(path);
    return m_arrival.isWholeOrder(OrderFolder(m_state.transfer.OrderFolder), names);
}

void HttpSender::keepArrival(SendingPhase end) {
    report.keepArrival(isWholeOrder() ? Arrival::Whole : Arrival::Agreed, end, m_arrival.byNameOnly());
}

bool HttpSender::keepFoundThere() {
    keepArrival(SendingPhase::Success);
    const bool due = isWholeOrder() && report.isDueWhereFound();
    if (!due)
        keepArrival(SendingPhase::AllThere);
    return due;
}

void HttpSender::reportOrder(const QString& query) {
    HttpSendReport(query);
    HttpPause(2);
}

void HttpSender::HttpSendReport(const QString& query) const {
    (void)FetchUrl(m_state.profile.ReportUrl + query);
}

void HttpSender::HttpSendDone(const QString& query) const {
    (void)FetchUrl(m_state.profile.HttpDoneUrl + query);
}

void HttpSender::postTestPicture() {
    const QString& host = m_state.profile.HttpHost;
    const QString scheme = u"://"_s;
    const QString bare = host.contains(scheme) ? host.mid(host.indexOf(scheme) + scheme.size()) : host;
    lists.TxtWeb = m_script.MultipartPostInet(testFolder, {u"4445.png"_s}, bare,
                                              m_state.profile.HttpScriptPath + u"getfile2.php"_s,
                                              WorkspacePaths::root(m_state), lists.TxtUrl);
}

void HttpSender::postNothing() {
    lists.TxtWeb = m_script.MultipartPost(
        testFolder, {}, m_state.profile.HttpHost + m_state.profile.HttpScriptPath + u"uploads/listfile.php"_s, {},
        lists.TxtUrl, {}, {});
}

void HttpSender::fetchTestListing() {
    lists.TxtWeb =
        FetchUrl(m_state.profile.HttpHost + m_state.profile.HttpScriptPath + u"listfile.php?tik="_s + testFolder);
}

} // namespace lumora
