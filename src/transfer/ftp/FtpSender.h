#pragma once

#include "transfer/ftp/UploadCheck.h"
#include "transfer/ftp/UploadPass.h"
#include "transfer/report/LabReport.h"

namespace lumora {

// Sends one order by FTP. The caller puts the files into List3, then calls beginOrder().
class FtpSender {
public:
    static constexpr int attempts = 4;
    static constexpr int olderRounds = 3;

    FtpSender(SessionState& state, const Platform& platform, SendingEvents& events);

    // Removes all that belongs to an earlier order.
    void clearLists();
    // Takes List3 as the whole order of OrderFolder. Broken are the files of kashloo.txt and those that were in hand
    // when a program ended.
    void beginOrder();
    // OrderFolder's order is new, and an earlier run found that it arrived: only the lab was not told.
    bool onlyReportIsLeft() const;
    std::int16_t countList3() const;
    // Puts the whole order into List3 again; the pass skips what has arrived.
    void refill();

    // The customer stops, or leaves the page: the call of the line that is under way is cut. A file that was being put
    // counts as broken.
    void stopNow();
    void leave();
    // Each second: ends a pass or a check whose line is silent.
    void watch();

    // Up to four attempts, each a pass and a check. The end of the sending; no value when the customer has left.
    std::optional<SendingPhase> RunAttempts();
    // The older bulk path: up to three rounds over List3, each followed by a check.
    std::optional<SendingPhase> runOlderRounds();

    // What the last check says of the order. As built in by the count of names, else by the proof of names and lengths.
    enum class Verdict {
        All,
        Missing,
        NotKnown,      // as built in: the server has more names than the order; else: the folder could not be read
        ServerChanges, // what is there has other line ends
    };
    Verdict verdict() const;
    // What has arrived where the sending ends so.
    Arrival arrival(SendingPhase end) const;
    // The prints of the order and of what is sent.
    OrderCompleteness completeness() const { return check.completeness(); }
    bool provenByNameOnly() const { return !check.proof || check.proof->provenByNameOnly(); }
    // The end when nothing is left to send but the counts differ.
    SendingPhase silentEnd() const;
    // The end when all of the sending has arrived: of a chosen part, the order may not be whole.
    SendingPhase arrivedEnd() const;

    FtpLists lists;
    SendingStop stop;
    FtpSession session;
    UploadPass pass;
    UploadCheck check;
    LabReport report;
    std::int16_t NumToSend = 0; // number of files that make up the order

private:
    void takeBroken();
    void closeOpened();
    // True when the count of the last check allows a verdict of missing files.
    bool lacksFiles() const;
    SendingPhase changedEnd();
    SendingPhase unheardEnd() const;

    class FourAttempts;
    class OlderRounds;

    const TransferState& m_transfer;
    const Platform& m_platform;
    SendingEvents& m_events;
};

} // namespace lumora
