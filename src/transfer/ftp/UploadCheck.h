#pragma once

#include "order/OrderCompleteness.h"
#include "platform/Platform.h"
#include "transfer/delivery/SilenceLimit.h"
#include "transfer/ftp/FtpSession.h"
#include "transfer/report/LabReport.h"

namespace lumora {

// The check after each pass: it reconnects, deletes the remains of failed puts from the server and counts the names in
// the order's folder. As built in an order counts as sent when that folder holds as many names as the order has files;
// Careful, FtpArrival proves names and lengths.
class UploadCheck {
public:
    UploadCheck(const SessionState& state, const Platform& platform, SendingEvents& events, SendingStop& stop,
                FtpLists& lists, FtpSession& session)
        : m_state(state)
        , m_platform(platform)
        , m_files(platform.files)
        , m_pump(platform.pump)
        , m_events(events)
        , m_stop(stop)
        , m_lists(lists)
        , m_session(session)
        , m_silence(state) {}

    // A check of an attempt begins and ends. True at the end where the server was silent for too long, which ended it.
    void begin();
    bool endEarly();
    // Each second: ends a check whose line is silent.
    void watch();

    // The steps of the check after attempt 1 to 4; they differ only in pauses and in closing the connection.
    void check(int attempt);

    // Over a connection of its own.
    void ListServerFiles();
    void RecheckBroken();
    void DeleteBrokenFiles();
    void ConfirmBrokenGone();
    void RebuildMissing();

    // Removes from List3 what has arrived, by the proof where there is one.
    void DropAlreadySent();

    // What the last ListServerFiles proves of the files of the sending; none as built in, and where it has not read the
    // order's folder whole.
    std::optional<ArrivalProof> proof;
    // With the proof: how much of the order lies there, also where the sending is only a part of it.
    Arrival proven = Arrival::Part;
    // The prints of the order's log and those among the files of the sending.
    OrderCompleteness completeness() const;
    // How much has arrived where the files of the sending have, each by its name alone.
    Arrival arrivalByNames() const;

    // Files of the order that are not on the server, or there only as the remains of a failed put; by the proof, where
    // there is one.
    QStringList missing() const;

    // Names in List6 without the remains of failed puts.
    std::int16_t NumOnServer = 0;
    bool unreadable = false; // the last listing of the order's folder had a line that could not be read
    bool freshCount = false; // the last ListServerFiles has read the order's folder; else NumOnServer is older

private:
    bool lookUp();
    enum class Over { NewConnection, OpenConnection };
    void listServerFiles(Over connection);
    void prove();
    Arrival orderThere();
    // Full paths of the order's files that are not among those of the sending.
    QStringList restOfOrder() const;
    static Arrival arrivalBy(OrderCompleteness::Verdict verdict);
    bool isThere(const QString& name) const;
    void filterDots();
    void count();
    bool nothingBroken() const { return m_lists.List4Broken.isEmpty() || m_lists.List6.isEmpty(); }
    void freshConnection();

    void endSilent();

    const SessionState& m_state;
    const Platform& m_platform;
    const Files& m_files;
    EventPump& m_pump;
    SendingEvents& m_events;
    SendingStop& m_stop;
    FtpLists& m_lists;
    FtpSession& m_session;
    SilenceLimit m_silence;
    bool m_running = false;
    bool m_silent = false;
    bool m_freshListing = false; // the last RecheckBroken has read List6
};

} // namespace lumora
