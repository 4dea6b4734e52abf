#pragma once

#include "order/OrderJournal.h"
#include "session/TextList.h"
#include "transfer/delivery/Attempts.h"
#include "transfer/http/HttpArrival.h"
#include "transfer/http/HttpListGuard.h"
#include "transfer/http/ServerList.h"
#include "transfer/http/UploadScript.h"
#include "transfer/report/LabReport.h"
#include "transfer/report/ReportOnce.h"

#include <optional>
#include <utility>
#include <vector>

namespace lumora {

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
    // The customer leaves: the call of the line that is under way is cut.
    void leave();
    // Fills List4Hossarim with the files that the server lacks; with all files when its list can't be trusted.
    void findMissing(int listNumber);
    // Asks the server. listNumber: the list file to download, 0 to 3; none for any other number.
    ServerVerdict CheckOrderOnServer(int listNumber);
    void HttpFetchFileListN(int listNumber);
    // Fills ListInOrder from the list file.
    void readListInOrder();

    // Up to three attempts. The end of the sending; no value when the customer has left.
    std::optional<SendingPhase> HttpAttempts();

    // The sending has ended so: keeps what has arrived.
    void keepArrival(SendingPhase end);
    // The files of the folder lay on the server before anything was sent. True when the lab has yet to be told of the
    // order.
    bool keepFoundThere();

    void HttpSendReport(const QString& query) const;
    void HttpSendDone(const QString& query) const;
    void HttpPause(int times = 1);

    // The lab's tests of its scripts; the answers are in TxtWeb.
    void postTestPicture();
    void postNothing();
    void fetchTestListing();

    // The answers of report and done call are ignored.
    void reportOrder(const QString& query) override;
    void reportDone(const QString& query) override { HttpSendDone(query); }

    HttpLists lists;
    SendingStop stop;
    LabReport report;

private:
    std::optional<SendingPhase> sendMissing(int attempt) override;
    std::optional<SendingPhase> checkArrival(int attempt) override;
    SendingPhase afterTheLast() override { return SendingPhase::NotAll; }

    bool isWholeOrder() const;
    void takeLeftBehind();
    void keep(const Result<void>& written);
    void post(const QString& path);
    void downloadList(int listNumber);
    void tellMissing();
    LineStep listTrouble() const;
    QString folderName() const;
    QString siteAddress(const QString& rest) const;
    QString FetchUrl(const QString& url) const;

    SessionState& m_state;
    const Platform& m_platform;
    UploadScript m_script;
    std::optional<OrderJournal> m_journal;
    bool m_notKeptTold = false; // a step that could not be kept is told once an order
    // Full paths that an earlier sending had in hand as it ended: half a file may lie on the server under its name.
    QStringList m_leftBehind;
    HttpListGuard m_listGuard;
    HttpArrival m_arrival;
    int m_listNumber = HttpListGuard::first;
    ServerVerdict m_verdict = ServerVerdict::NotVerified; // of the last check
    int m_left = 0;                                       // files of the pass not yet posted
    bool m_allPosted = true;                              // every file of the last pass was posted
    Failure m_listFailure; // failure of the last list file's download; no message after success
};

} // namespace lumora
