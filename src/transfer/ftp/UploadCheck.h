#pragma once

#include "transfer/ftp/FtpSession.h"

namespace lumora {

// After each pass the check reconnects from scratch, deletes the remains of failed puts from the server and counts the
// names in the order's folder. An order counts as sent when its folder on the server holds as many names as the order
// has files; neither sizes nor dates are compared.
class UploadCheck {
public:
    UploadCheck(const TransferState& transfer, EventPump& pump, SendingEvents& events, SendingStop& stop,
                FtpLists& lists, FtpSession& session)
        : m_transfer(transfer)
        , m_pump(pump)
        , m_events(events)
        , m_stop(stop)
        , m_lists(lists)
        , m_session(session) {}

    // The steps that follow the pass of an attempt, 1 to 4. They differ in their pauses and closings alone.
    void check(int attempt);

    void ListServerFiles();
    void RecheckBroken();
    void DeleteBrokenFiles();
    void ConfirmBrokenGone();
    void RebuildMissing();

    // Takes out of List3 what List6 has already.
    void DropAlreadySent();

    // Files of the order that are not on the server, or only as the remains of a failed put.
    QStringList missing() const;

    // Names in List6 less those whose put failed: they are on the server, but not as sent files.
    std::int16_t NumOnServer = 0;
    bool freshCount = false; // the last ListServerFiles saw the order's folder; else its count is that of older lists

private:
    bool lookUp();
    void filterDots();
    void count();
    bool nothingBroken() const { return m_lists.List4Broken.isEmpty() || m_lists.List6.isEmpty(); }
    void freshConnection();

    const TransferState& m_transfer;
    EventPump& m_pump;
    SendingEvents& m_events;
    SendingStop& m_stop;
    FtpLists& m_lists;
    FtpSession& m_session;
    bool m_freshListing = false; // List6 was read by the last RecheckBroken
};

} // namespace lumora
