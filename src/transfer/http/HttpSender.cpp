#include "transfer/http/HttpSender.h"

#include "common/DrivePath.h"
#include "order/OrderCompleteness.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "transfer/delivery/OrderFiles.h"
#include "transfer/delivery/StoppableLine.h"
#include "transfer/report/InetForm.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int httpPauseRounds = 1801;
// A larger file is no list.
constexpr qint64 largestList = 4 * 1024 * 1024;
// Numbers that the server is asked for until one is free.
constexpr int mostNames = 50;
// Posts of the log in one attempt, until the server gives it out.
constexpr int mostClaims = 2;
const QString testFolder = u"tttt"_s;

bool isTimeOut(const Failure& failure) {
    return failure.kind == Failure::Kind::TimedOut;
}

} // namespace

// While this lives, the customer can stop what runs on the line, and the line is watched.
class HttpSender::OnLine {
public:
    explicit OnLine(HttpSender& sender)
        : m_sender(sender)
        , m_line(sender.m_platform) {
        sender.stop.StopFlag = false;
        sender.m_silent = false;
        sender.m_unkept.reset();
        sender.m_silence.begin();
        sender.m_onLine = true;
    }
    ~OnLine() { m_sender.m_onLine = false; }
    OnLine(const OnLine&) = delete;
    OnLine& operator=(const OnLine&) = delete;

private:
    HttpSender& m_sender;
    StoppableLine m_line;
};

HttpSender::HttpSender(SessionState& state, const Platform& platform, SendingEvents& events)
    : Attempts(events, stop)
    , report(state, platform, stop, Sender::Http, [this](const Result<void>& written) { keep(written); })
    , m_state(state)
    , m_platform(platform)
    , m_script(platform)
    , m_listGuard(state)
    , m_silence(state)
    , m_arrival(state, platform, stop, m_silence)
    , m_folderOwner(state, platform) {}

QString HttpSender::folderName() const {
    return OrderFolder::chosen(m_state).name();
}

QString HttpSender::siteAddress(const QString& rest) const {
    return m_state.profile.HttpHost + u'/' + m_state.profile.HttpTikiya + rest;
}

QString HttpSender::uploadsAddress() const {
    return siteAddress(u"/uploads/"_s + folderName() + u'/');
}

QString HttpSender::listScript(const QString& folder) const {
    return siteAddress(u"/listfileb.php?tik="_s + folder);
}

void HttpSender::HttpPause(int times) {
    for (int time = 0; time < times; ++time)
        pauseInRounds(httpPauseRounds, m_events, m_platform.pump, m_stop);
}

QString HttpSender::FetchUrl(const QString& url) const {
    const auto answer = m_platform.internet.fetch(url);
    return answer ? ServerText(answer->body) : QString();
}

void HttpSender::BuildOrderFileList() {
    lists.List4Kvazim.clear();
    lists.List4Kvazim.append(HttpOrderFiles(m_platform.files, m_state.transfer.OrderFolder, ListFileName(0)));
    m_journal.emplace(m_platform.files, OrderFolder(m_state.transfer.OrderFolder));
    if (m_state.transfer.SugMishloah == Sending::Resend)
        m_journal->markSentAgain();
    report.beginOrder(&*m_journal);
    m_notKeptTold = false;
    m_owner = Owner::NotKnown;
    m_lost = false;
    m_namesAsked = 0;
    QStringList inHand = m_journal->state().filesInHand;
    inHand.removeIf([this](const QString& path) { return !lists.List4Kvazim.contains(path); });
    m_arrival.beginOrder(inHand);
}

void HttpSender::keep(const Result<void>& written) {
    if (written || m_notKeptTold)
        return;
    m_notKeptTold = true;
    m_events.notKept(written.failure());
}

// As built in a step that could not be kept is told, and the sending goes on.
bool HttpSender::isKept(const Result<void>& written) {
    if (written || !m_state.Careful) {
        keep(written);
        return true;
    }
    m_unkept = written.failure();
    stop.StopFlag = true;
    return false;
}

void HttpSender::stopNow() {
    stop.StopFlag = true;
    m_platform.internet.abort();
}

void HttpSender::leave() {
    stop.left = true;
    m_platform.internet.abort();
}

void HttpSender::watch() {
    if (!m_onLine || stopped() || !m_silence.overAfter(m_platform))
        return;
    endSilent();
    m_platform.internet.abort();
}

void HttpSender::endSilent() {
    m_silent = true;
    stop.StopFlag = true;
}

std::optional<SendingPhase> HttpSender::endEarly() {
    if (!stop.StopFlag || stop.left)
        return std::nullopt;
    stop.StopFlag = false;
    m_endedEarly = true;
    if (m_unkept) {
        m_events.failed(LineStep::KeepState, *m_unkept);
        return SendingPhase::NotAll;
    }
    if (!m_silent)
        return SendingPhase::Stopped;
    m_events.failed(LineStep::Silence, {Failure::Kind::TimedOut, u"the line was silent or too slow"_s});
    return SendingPhase::NotAll;
}

void HttpSender::tellMissing() {
    m_events.reached(SendingMoment::Missing, lists.List4Hossarim.count());
}

std::optional<SendingPhase> HttpSender::HttpAttempts() {
    m_listNumber = HttpListGuard::first;
    m_listFailure = {};
    m_endedEarly = false;
    const OnLine line(*this);
    return run(attempts);
}

std::optional<SendingPhase> HttpSender::sendMissing(int attempt) {
    m_allPosted = true;
    // The answer may be hours old: the customer may have held the sending.
    if (m_owner == Owner::NotKnown || !isEntered())
        compare(m_listNumber);
    else if (attempt == 1)
        lookForAnother();
    if (m_lost)
        return endLost();
    // Another attempt could not post either, and would wait as long.
    if (m_owner == Owner::NotKnown && isTimeOut(m_listFailure) && !stop.StopFlag)
        endSilent();
    const bool claims = m_owner == Owner::Unclaimed && !stopped();
    if (claims)
        claimFolder();
    if (m_owner != Owner::Ours || stopped())
        return m_owner == Owner::Foreign ? SendingPhase::NumberTaken : endEarly();
    QStringList files = lists.List4Hossarim.items();
    if (claims)
        files.removeAll(logPath());
    m_silence.begin();
    m_left = static_cast<int>(files.size());
    m_sent = lists.List4Kvazim.count() - m_left;
    for (int i = 0; i < files.size(); ++i) {
        m_events.sending(i, static_cast<int>(files.size()), LeafName(files[i]));
        HttpPause();
        if (stopped())
            break;
        if (i == 0 && m_journal)
            (void)isKept(m_journal->sendingBegins(Sender::Http, m_folderOwner.claims()));
        if (!stopped())
            post(files[i]);
        m_platform.pump.pump();
        m_events.progressed(i, lists.List4Hossarim.count());
        if (m_silence.over() && !stop.StopFlag)
            endSilent();
        if (stopped())
            break;
    }
    return endEarly();
}

bool HttpSender::isEntered() const {
    return !m_folderOwner.claims() || (m_journal && m_journal->ownsFolder(Sender::Http));
}

QString HttpSender::logPath() const {
    return OrderFolder(m_state.transfer.OrderFolder).logPath().text();
}

// An order without its log can't tell its folder from another's.
void HttpSender::claimFolder() {
    const QString log = logPath();
    if (!lists.List4Kvazim.contains(log)) {
        m_owner = Owner::Ours;
        return;
    }
    bool timedOut = false;
    for (int tries = 0; tries < mostClaims && m_owner == Owner::Unclaimed && !stopped(); ++tries) {
        m_events.sending(0, lists.List4Hossarim.count(), LeafName(log));
        HttpPause();
        if (stopped())
            return;
        if (!isKept(m_journal->folderIsAsked(Sender::Http)))
            return;
        m_silence.begin();
        m_left = lists.List4Hossarim.count();
        m_sent = lists.List4Kvazim.count() - m_left;
        m_allPosted = true;
        post(log);
        const bool before = std::exchange(timedOut, m_script.failed() && isTimeOut(m_script.lastFailure()));
        if (before && timedOut && !stopped())
            endSilent();
        if (!stopped())
            compare(m_listNumber);
    }
    // The log is not there: without it nothing else may go.
    if (m_owner == Owner::Unclaimed)
        m_owner = Owner::NotKnown;
}

// Another order may post its log after this one's was found there.
void HttpSender::lookForAnother() {
    m_lost = m_journal && !stopped() && m_journal->ownsFolder(Sender::Http) &&
             m_folderOwner.isReplaced(*m_journal, lists.ListAfterWeb.items(), uploadsAddress());
}

SendingPhase HttpSender::endLost() {
    keep(m_journal->folderIsLost(Sender::Http));
    m_events.failed(LineStep::FolderLost, {Failure::Kind::InUse, folderName()});
    return SendingPhase::CallLab;
}

void HttpSender::post(const QString& path) {
    const DrivePath folder = DrivePath(path).folder();
    const QString url = m_state.profile.HttpHost + m_state.profile.HttpScriptPath + u"getfile2.php"_s;
    if (m_journal && !isKept(m_journal->take(path)))
        return;
    m_arrival.postBegins(path);
    lists.TxtWeb = m_script.MultipartPost(folder.leaf(), {path}, url, folder, lists.TxtUrl, {}, {});
    const bool cut = m_script.failed() && !m_script.failedBeforeSending();
    // A file that was refused stays in hand; whether it has arrived is for the list and HEAD to tell.
    const bool unconfirmed = cut || m_script.refused();
    if (unconfirmed)
        m_arrival.postUnconfirmed(path);
    else if (!m_script.failed())
        m_arrival.postConfirmed(path);
    Result<void> released;
    if (m_journal && !unconfirmed && !m_arrival.isLeftBehind(path))
        released = m_journal->release(path);
    if (!m_state.Careful) // with the guards the next take tells it
        keep(released);
    m_silence.connectsTimedOut(cut && isTimeOut(m_script.lastFailure()));
    m_events.reached(SendingMoment::Answered);
    if (!m_script.failed()) {
        m_events.reached(SendingMoment::Posted, --m_left);
        m_sent += unconfirmed ? 0 : 1;
        if (m_journal)
            m_journal->countFiles(m_sent, lists.List4Kvazim.count());
        return;
    }
    m_allPosted = false;
    if (!stopped())
        m_events.failed(cut ? LineStep::Put : LineStep::File, m_script.lastFailure(), LeafName(path));
}

std::optional<SendingPhase> HttpSender::checkArrival(int) {
    const bool ours = m_owner == Owner::Ours;
    if (ours) {
        m_silence.begin();
        compare(m_listNumber);
        if (m_listGuard.asksAgain(m_verdict) && !stopped())
            compare(HttpListGuard::first);
        m_listNumber = m_listGuard.nextList(lists.List4Hossarim.count(), m_verdict);
    }
    if (m_lost)
        return endLost();
    const bool all = ours && lists.List4Hossarim.isEmpty();
    const std::optional<SendingPhase> early = all ? std::nullopt : endEarly();
    // A failed post explains more than the list that lacks the file.
    if (m_allPosted && !all && !early && !stopped())
        m_events.failed(listTrouble(), m_listFailure);
    m_events.reached(SendingMoment::CheckEnds);
    if (!all)
        return early;
    stop.StopFlag = false;
    return lacking() ? SendingPhase::AllThere : SendingPhase::Success;
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

std::optional<SendingPhase> HttpSender::findMissing() {
    m_listFailure = {};
    m_endedEarly = false;
    const OnLine line(*this);
    compare(0);
    return m_lost ? endLost() : endEarly();
}

void HttpSender::compare(int listNumber) {
    m_verdict = CheckOrderOnServer(listNumber);
    const HttpArrival::Listed there{lists.ListAfterWeb.items(), uploadsAddress()};
    m_owner = m_journal && !stopped()
                  ? m_folderOwner.of(*m_journal, ReadServerAnswer(m_folderAnswer, folderName()), there.uploads)
                  : Owner::NotKnown;
    m_lost = false;
    if (m_verdict == ServerVerdict::Listed && m_owner == Owner::Ours)
        lookForAnother();
    const QStringList order = lists.List4Kvazim.items();
    QStringList missing = lists.List4Hossarim.items();
    if (m_verdict == ServerVerdict::Listed && m_owner == Owner::Ours) {
        QStringList named = order;
        named.removeIf([&](const QString& path) { return missing.contains(path); });
        missing += m_arrival.remains(named, there);
        if (missing.isEmpty())
            missing = m_arrival.unproven(order, there);
    } else {
        missing = order;
    }
    lists.List4Hossarim.clear();
    lists.List4Hossarim.append(missing);
    tellMissing();
}

ServerVerdict HttpSender::CheckOrderOnServer(int listNumber) {
    lists.ListAfterWeb.clear();
    lists.TxtWeb.clear();
    m_folderAnswer.clear();
    DrivePath& order = m_state.transfer.OrderFolder;
    if (order.text().endsWith(u'\\'))
        order = order.folder();
    const QString name = folderName();
    m_state.transfer.ShemTikiya = name;
    m_events.reached(SendingMoment::Answered);
    if (lists.List4Kvazim.isEmpty() || !OrderFolder(order).isChosen() ||
        DrivePath(lists.List4Kvazim.item(0)).folder().leaf() != name)
        return ServerVerdict::OtherFolder;
    m_folderAnswer = HttpFetchFileListN(listNumber);
    if (stopped())
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

QString HttpSender::HttpFetchFileListN(int listNumber) {
    const Files& files = m_platform.files;
    if (!files.folderExists(WorkspacePaths::root(m_state)))
        (void)files.makeFolder(WorkspacePaths::root(m_state));
    lists.TxtWeb.clear();
    HttpPause(2);
    lists.TxtFromWeb.clear();
    HttpPause(2);
    const Result<WebAnswer> answer = m_platform.internet.fetch(listScript(folderName()));
    const QString script = answer ? ServerText(answer->body) : QString();
    lists.TxtWeb = script;
    m_events.reached(SendingMoment::Answered);
    HttpPause(3);
    m_platform.pump.pump();
    HttpPause();
    const std::optional<QString> list = stopped() ? std::nullopt : downloadList(listNumber);
    if (list)
        lists.TxtFromWeb = lists.TxtWeb = *list;
    m_events.reached(SendingMoment::Answered);
    HttpPause(2);
    // Without the script's answer the list file is of an earlier time.
    if (!answer || !answer->good())
        return {};
    // A list file lies in the folder: only the script can tell that there is no folder.
    return list && !TellsUnknownFolder(*list) ? *list : script;
}

// The list file's text; no value where there is none.
std::optional<QString> HttpSender::downloadList(int listNumber) {
    const Files& files = m_platform.files;
    clsDownload download(m_platform);
    // A list from an earlier check must not be read as the answer to this one.
    const DrivePath list = OrderFolder::chosen(m_state).filePath(ListFileName(0));
    const Result<void> cleared = files.fileExists(list) ? files.removeFile(list) : Result<void>();
    if (!cleared)
        m_listFailure = cleared.failure();
    const QString uploads = uploadsAddress();
    m_silence.begin();
    download.download(uploads + SecondListName(), WorkspacePaths::root(m_state) / SecondListName());
    HttpPause(2);
    const QString remote = ListFileName(listNumber);
    if (cleared && !remote.isEmpty() && !stopped()) {
        m_silence.begin();
        download.download(uploads + remote, list);
        m_listFailure = download.lastFailure();
    }
    m_platform.pump.pump();
    HttpPause(3);
    const auto size = files.size(list);
    if (!cleared || !size || *size > largestList)
        return std::nullopt;
    const auto text = files.read(list);
    return text ? std::optional(ServerText(*text)) : std::nullopt;
}

std::optional<OrderCompleteness> HttpSender::lacking() const {
    return m_arrival.lacking(OrderFolder(m_state.transfer.OrderFolder), LeafNames(lists.List4Kvazim.items()));
}

std::optional<bool> HttpSender::hasFolder(const QString& name) {
    if (stopped() || ++m_namesAsked > mostNames)
        return std::nullopt;
    const OnLine line(*this);
    const Result<WebAnswer> answer = m_platform.internet.fetch(listScript(name));
    m_platform.pump.pump();
    return answer && answer->good() && !stopped() ? std::optional(!TellsUnknownFolder(ServerText(answer->body)))
                                                  : std::nullopt;
}

bool HttpSender::onlyReportIsLeft() const {
    return m_state.transfer.SugMishloah == Sending::NewOrder && m_journal && m_journal->state().onlyReportIsLeft();
}

Arrival HttpSender::arrival() const {
    return lacking() ? Arrival::Agreed : Arrival::Whole;
}

void HttpSender::keepArrival(SendingPhase end) {
    report.keepArrival(arrival(), end, m_arrival.byNameOnly());
}

bool HttpSender::keepFoundThere() {
    const Arrival found = arrival();
    report.keepArrival(found, SendingPhase::Success, m_arrival.byNameOnly());
    const bool due = found == Arrival::Whole && report.isDueWhereFound();
    if (!due)
        report.endUntold();
    return due;
}

bool HttpSender::reportOrder(const QString& query) {
    const bool heard = HttpSendReport(query);
    HttpPause(2);
    return heard;
}

bool HttpSender::HttpSendReport(const QString& query) const {
    const QString& address = m_state.profile.ReportUrl;
    return m_platform.internet.fetch(address + query) || address.isEmpty();
}

bool HttpSender::HttpSendDone(const QString& query) const {
    const QString& address = m_state.profile.HttpDoneUrl;
    return m_platform.internet.fetch(address + query) || address.isEmpty();
}

void HttpSender::postTestPicture() {
    lists.TxtWeb = m_script.MultipartPostInet(testFolder, {u"4445.png"_s}, m_state.profile.HttpHost,
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
