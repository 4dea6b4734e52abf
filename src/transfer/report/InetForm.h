#pragma once

#include "common/Result.h"
#include "session/Page.h"

namespace lumora {

class PageChain;
struct Platform;
struct SessionState;

// InetForm, "the two reports" in the glossary: a page that nobody sees, by which the sending page tells the lab's web
// site that an order has arrived. The answers are stored and read by nobody, and a report that is lost changes nothing:
// the order is on the server already.
class InetForm : public Page {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::InetForm;

    InetForm(SessionState& state, const Platform& platform, PageChain& chain);

    // Events.
    void Command1_Click() { reportOrder(); }
    void Command2_Click() { reportDone(); }
    void Command4_Click() {} // "pricelist"
    void cmdLoad_Click() {}  // "Load"

    // The order report and the done call.
    void reportOrder();
    void reportDone();

    // State.
    const QString& answer() const { return TeshuvatSharat; } // of the last call

    // The body behind a URL, past every cache; empty when there is none. Without a line a box tells so.
    QString FetchUrlSmall(const QString& url);

private:
    const SessionState& m_state;
    const Platform& m_platform;
    QString TeshuvatSharat;
};

// Fetches a URL to a file under a drive path. True unless the path names no place on this machine: the download's own
// result is not examined, and only kept for a page that tells a person of it.
class clsDownload {
public:
    explicit clsDownload(const Platform& platform)
        : m_platform(platform) {}
    bool download(const QString& url, const QString& path);

    // Of the last call; the message is empty when it went well.
    const Failure& lastFailure() const { return m_failure; }

private:
    const Platform& m_platform;
    Failure m_failure;
};

} // namespace lumora
