#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"
#include "session/Page.h"
#include "transfer/report/ReportOnce.h"

#include <optional>

namespace lumora {

class PageChain;
struct Platform;
struct SessionState;

// InetForm, "the two reports" in the glossary: a page without a view, by which the sending page tells the lab's web
// site that an order has arrived. Nothing reads the answers. A report that no answer came to is told by Careful; the
// order is on the server in any case.
class InetForm : public Page, public ReportCalls {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::InetForm;

    InetForm(const SessionState& state, const Platform& platform, PageChain& chain);

    // Events.
    void Command1_Click() { report(); }
    void Command2_Click() { reportDone(doneQuery()); }

    void announceReport() override;
    bool reportOrder(const QString& query) override;
    bool reportDone(const QString& query) override;

    // State.
    const QString& answer() const { return TeshuvatSharat; } // of the last call

    // The body at a URL, not from any cache; empty on failure. Without a connection it shows a box.
    QString FetchUrlSmall(const QString& url);

private:
    bool call(const QString& address, const QString& query);
    std::optional<QString> answerOf(const QString& url);
    void report();
    QString doneQuery() const;

    const SessionState& m_state;
    const Platform& m_platform;
    QString TeshuvatSharat;
};

// Downloads a URL to a drive path. True unless the path has no place on this machine: lastFailure() tells whether the
// download itself failed.
class clsDownload {
public:
    explicit clsDownload(const Platform& platform)
        : m_platform(platform) {}
    bool download(const QString& url, const DrivePath& path);

    // Of the last call; the message is empty after success.
    const Failure& lastFailure() const { return m_failure; }

private:
    const Platform& m_platform;
    Failure m_failure;
};

} // namespace lumora
