#pragma once

#include "order/OrderJournal.h"
#include "session/TextList.h"
#include "transfer/delivery/Attempts.h"
#include "transfer/delivery/SilenceLimit.h"
#include "transfer/http/HttpArrival.h"
#include "transfer/http/HttpFolderOwner.h"
#include "transfer/http/HttpListGuard.h"
#include "transfer/http/ServerList.h"
#include "transfer/http/UploadScript.h"
#include "transfer/report/LabReport.h"
#include "transfer/report/ReportOnce.h"

#include <optional>
#include <utility>
#include <vector>

namespace lumora {

struct OrderCompleteness;
struct SessionState;

// The working lists and texts of the HTTP sender, under the names that the lab's people use.
struct HttpLists {
    TextList List4Kvazim;                                          // all files of the order folder, full paths
    TextList List4Hossarim;                                        // missing files, full paths
    TextList ListAfterWeb;                                         // entries of the last listing
    TextList ListInOrder;                                          // entries of the list file
    QString TxtWeb;                                                // the last answer, or the list file's text
    QString TxtFromWeb;                                            // the list file's text
    QString TxtUrl = QStringLiteral("value1=Hello&value2=World!"); // the rest of the upload's query

    std::vector<std::pair<const char16_t*, const TextList*>> named() const {
        return {{u"List4Kvazim", &List4Kvazim},
                {u"List4Hossarim", &List4Hossarim},
                {u"ListAfterWeb", &ListAfterWeb},
                {u"ListInOrder", &ListInOrder}};
    }
};

// Sends one order by HTTP, file by file, and asks scripts on the lab's web server which files have arrived. Only the
// server's list tells success, never the answer to an upload.
class HttpSender final : private Attempts, public ReportCalls {
public:
    static constexpr int attempts = 3;

    HttpSender(SessionState& state, const Platform& platform, SendingEvents& events);

    // Begins an order: fills List4Kvazim with the files of its folder; empty when no folder is set.
    void BuildOrderFileList();
    // The customer stops, or leaves the page: the call of the line that is under way is cut. A file that was being
    // posted counts as left behind.
    void stopNow();
    void leave();
    // Called each second: cuts a line that is silent or too slow.
    void watch();
    // Fills List4Hossarim with the files that the server lacks; with all files when its list can't be trusted. The end
    // if the customer has stopped it, or the line was silent.
    std::optional<SendingPhase> findMissing();
    // Asks the server. listNumber: the list file to download, 0 to 3; none for any other number.
    ServerVerdict CheckOrderOnServer(int listNumber);
    // The answer that may tell whose the order's folder is; empty where the script answered badly.
    QString HttpFetchFileListN(int listNumber);
    // Fills ListInOrder from the list file.
    void readListInOrder();

    // Up to three attempts. The end of the sending; no value when the customer has left. Nothing is posted into the
    // folder of another order, nor while it is not known whose it is.
    std::optional<SendingPhase> HttpAttempts();
    // The last sending ended before its attempts were over; what has arrived meanwhile was not asked.
    bool endedEarly() const { return m_endedEarly; }
    // The order's prints, where some that its log names are not among its files.
    std::optional<OrderCompleteness> lacking() const;
    // Whether the server has a folder of this name; no value where it does not tell, was asked for too many names or
    // the customer has stopped it.
    std::optional<bool> hasFolder(const QString& name);
    const OrderJournal* journal() const { return m_journal ? &*m_journal : nullptr; }

    // The order is new, and an earlier run found that it arrived: only the lab was not told.
    bool onlyReportIsLeft() const;
    // The sending has ended so: keeps what has arrived.
    void keepArrival(SendingPhase end);
    // The files of the folder lay on the server before anything was sent. True when the lab has yet to be told of the
    // order.
    bool keepFoundThere();

    // False where no answer came. A lab without such an address wants no such call.
    bool HttpSendReport(const QString& query) const;
    bool HttpSendDone(const QString& query) const;
    void HttpPause(int times = 1);

    // The lab's tests of its scripts; the answers are in TxtWeb.
    void postTestPicture();
    void postNothing();
    void fetchTestListing();

    bool reportOrder(const QString& query) override;
    bool reportDone(const QString& query) override { return HttpSendDone(query); }

    HttpLists lists;
    SendingStop stop;
    LabReport report;

private:
    std::optional<SendingPhase> sendMissing(int attempt) override;
    std::optional<SendingPhase> checkArrival(int attempt) override;
    SendingPhase afterTheLast() override { return SendingPhase::NotAll; }

    class OnLine;
    using Owner = HttpFolderOwner::Owner;

    void compare(int listNumber);
    bool isEntered() const; // the folder needs no further question whose it is
    void claimFolder();
    Arrival arrival() const; // where all files of the folder have arrived
    void lookForAnother();
    SendingPhase endLost();
    bool stopped() const { return m_stop.left || m_stop.StopFlag; }
    void endSilent();
    std::optional<SendingPhase> endEarly();
    void keep(const Result<void>& written);
    // A step that has to be kept before the server hears of it. False: the sending ends.
    bool isKept(const Result<void>& written);
    void post(const QString& path);
    std::optional<QString> downloadList(int listNumber);
    void tellMissing();
    LineStep listTrouble() const;
    QString folderName() const;
    QString logPath() const;
    QString siteAddress(const QString& rest) const;
    QString uploadsAddress() const; // of the order's folder
    QString listScript(const QString& folder) const;
    QString FetchUrl(const QString& url) const;

    SessionState& m_state;
    const Platform& m_platform;
    UploadScript m_script;
    std::optional<OrderJournal> m_journal;
    bool m_notKeptTold = false; // a step that could not be kept is told once an order
    HttpListGuard m_listGuard;
    SilenceLimit m_silence;
    HttpArrival m_arrival;
    HttpFolderOwner m_folderOwner;
    Owner m_owner = Owner::NotKnown; // by the last check
    bool m_lost = false;             // another order has taken the folder since
    bool m_onLine = false;           // a sending or a check runs
    bool m_silent = false;           // the line was cut because nothing moved on it
    std::optional<Failure> m_unkept; // why a step could not be kept that the sending has ended for
    bool m_endedEarly = false;
    int m_namesAsked = 0; // of folders, for a free number
    int m_listNumber = HttpListGuard::first;
    ServerVerdict m_verdict = ServerVerdict::NotVerified; // of the last check
    int m_left = 0;                                       // files of the pass not yet posted
    int m_sent = 0;                                       // files of the order answered well or found there
    bool m_allPosted = true;                              // every file of the last pass was posted
    QString m_folderAnswer;                               // of the last check, by HttpFetchFileListN
    Failure m_listFailure; // failure of the last list file's download; no message after success
};

} // namespace lumora
