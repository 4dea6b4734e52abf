#pragma once

#include "transfer/ftp/UploadCheck.h"
#include "transfer/ftp/UploadPass.h"

namespace lumora {

// Sends one order by FTP. Who begins an order puts its files into List3 and says with beginOrder() that they are whole.
class FtpSender {
public:
    static constexpr int attempts = 4;
    static constexpr int olderRounds = 3;

    FtpSender(const ClientProfile& profile, TransferState& transfer, const Platform& platform, SendingEvents& events);

    // Nothing of an earlier order is left in the lists.
    void clearLists();
    // What List3 holds is the whole order.
    void beginOrder();
    std::int16_t countList3() const;
    // List3 is the whole order again; what has arrived is skipped on the way.
    void refill();

    // Up to four attempts, each a pass and a check. What the sending has come to; no value when the customer has left.
    std::optional<SendingPhase> RunAttempts();
    // The older bulk path: up to three rounds over List3, each ended by a look at the server.
    std::optional<SendingPhase> runOlderRounds();

    // The last check counted as many files as the order has.
    bool allCounted() const { return check.NumOnServer == NumToSend; }
    // The end where the counts differ and there is nothing to send again.
    SendingPhase silentEnd() const;

    FtpLists lists;
    SendingStop stop;
    FtpSession session;
    UploadPass pass;
    UploadCheck check;
    std::int16_t NumToSend = 0; // number of files that make up the order

private:
    class FourAttempts;
    class OlderRounds;

    SendingEvents& m_events;
};

} // namespace lumora
