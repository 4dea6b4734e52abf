#pragma once

#include "session/TextList.h"
#include "transfer/delivery/Attempts.h"
#include "transfer/http/ServerList.h"
#include "transfer/http/UploadScript.h"

#include <utility>
#include <vector>

namespace lumora {

struct SessionState;

// The working lists and texts of the HTTP sender, under the names that the lab's people know.
struct HttpLists {
    TextList List4Kvazim;                                          // every file of the order folder, full paths
    TextList List4Hossarim;                                        // the files still missing, full paths
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

// Sends one order by HTTP, file by file, and asks scripts on the lab's web server which files arrived. The answer to an
// upload is never taken for success, only the server's list is.
class HttpSender final : private Attempts {
public:
    static constexpr int attempts = 3;

    HttpSender(SessionState& state, const Platform& platform, SendingEvents& events);

    // List4Kvazim: the files of the order's folder; none when no folder is named.
    void BuildOrderFileList();
    // What the server has of the order, into List4Hossarim; all is missing where its list can't be believed.
    void findMissing(int listNumber);
    // The server's own word. listNumber: which of its list files is fetched, 0 to 3; any other fetches none.
    ServerVerdict CheckOrderOnServer(int listNumber);
    void HttpFetchFileListN(int listNumber);
    // ListInOrder as the list file says.
    void readListInOrder();

    // Up to three attempts at what is missing. What the sending has come to; no value when the customer has left.
    std::optional<SendingPhase> HttpAttempts();

    // The answers are not looked at: the order is on the server already.
    void HttpSendReport() const;
    void HttpSendDone() const;
    void HttpPause(int times = 1);

    // The lab's own tests of its scripts; the answers go to TxtWeb.
    void postTestPicture();
    void postNothing();
    void fetchTestListing();

    HttpLists lists;
    SendingStop stop;

private:
    bool sendMissing(int attempt) override;
    std::optional<SendingPhase> checkArrival(int attempt) override;
    SendingPhase afterTheLast() override { return SendingPhase::NotAll; }

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
    int m_listNumber = 1;
    int m_left = 0;          // files of the pass that have not been posted
    bool m_allPosted = true; // of the last pass
    Failure m_listFailure;   // of the last list file that was asked for; no message when it was fetched
};

} // namespace lumora
