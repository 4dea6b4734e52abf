#include "transfer/ftp/FtpSender.h"

#include "common/FixedText.h"
#include "order/BrokenFiles.h"
#include "platform/Platform.h"
#include "transfer/delivery/StoppableLine.h"

namespace lumora {

class FtpSender::FourAttempts final : public Attempts {
public:
    FourAttempts(FtpSender& sender, SendingEvents& events)
        : Attempts(events, sender.stop)
        , m_sender(sender) {}

private:
    std::optional<SendingPhase> sendMissing(int attempt) override {
        m_sender.pass.run(attempt);
        return m_sender.pass.UserStopped == 0 ? m_sender.pass.end() : SendingPhase::Stopped;
    }

    std::optional<SendingPhase> checkArrival(int attempt) override {
        m_sender.session.PauseBar();
        if (attempt == 1) {
            if (m_sender.lists.List3.count() < m_sender.lists.List4Makor.count())
                m_sender.refill();
            if (m_sender.lists.List3.isEmpty()) {
                m_events.reached(SendingMoment::NothingToSend);
                return SendingPhase::NoOrder;
            }
        }
        m_sender.check.begin();
        compare(attempt);
        if (m_sender.check.endEarly())
            return m_sender.unheardEnd();
        const Verdict verdict = m_sender.verdict();
        // After a stop the count is valid only if this check has read the server's folder itself.
        if (m_stop.StopFlag && !(verdict == Verdict::All && m_sender.check.freshCount)) {
            if (!m_stop.left)
                m_sender.pass.endStopped();
            return SendingPhase::Stopped;
        }
        if (verdict == Verdict::All)
            return m_sender.arrivedEnd();
        if (verdict == Verdict::ServerChanges)
            return m_sender.changedEnd();
        if (verdict == Verdict::NotKnown)
            return std::nullopt;
        if (m_sender.lists.List3.isEmpty())
            return m_sender.silentEnd();
        m_events.reached(SendingMoment::Incomplete, static_cast<int>(m_sender.check.missing().size()));
        return std::nullopt;
    }

    // Leaves the missing files in List3, unless the count or a folder that was not read says nothing of them.
    void compare(int attempt) {
        m_sender.check.check(attempt);
        if (!m_sender.lacksFiles() || m_stop.left || m_stop.StopFlag)
            return;
        // The check may have failed and counted an older listing.
        m_sender.check.ListServerFiles();
        if (m_sender.lacksFiles())
            m_sender.check.RebuildMissing();
    }

    SendingPhase afterTheLast() override {
        return m_sender.verdict() == Verdict::NotKnown ? m_sender.silentEnd() : SendingPhase::NotAll;
    }

    FtpSender& m_sender;
};

class FtpSender::OlderRounds final : public Attempts {
public:
    OlderRounds(FtpSender& sender, SendingEvents& events)
        : Attempts(events, sender.stop)
        , m_sender(sender) {}

private:
    static constexpr int mostConnectFails = 5;

    std::optional<SendingPhase> sendMissing(int) override {
        m_stop.StopFlag = false;
        m_sender.pass.beginFiles();
        for (int i = 0; i < m_sender.lists.List3.count() && m_sender.session.ConnectFails <= mostConnectFails; ++i) {
            if (m_stop.StopFlag || m_stop.left)
                break;
            m_sender.pass.UploadOneFile(i);
        }
        if (m_sender.pass.endEarly())
            return m_sender.pass.end();
        return stopped() ? std::optional(SendingPhase::Stopped) : std::nullopt;
    }

    std::optional<SendingPhase> checkArrival(int round) override {
        m_sender.check.begin();
        m_sender.check.ListServerFiles();
        if (m_sender.check.endEarly())
            return m_sender.unheardEnd();
        const Verdict verdict = m_sender.verdict();
        if (verdict == Verdict::All && (m_sender.check.freshCount || !m_stop.StopFlag))
            return m_sender.arrivedEnd();
        if (stopped())
            return SendingPhase::Stopped;
        if (verdict == Verdict::ServerChanges)
            return m_sender.changedEnd();
        if (m_sender.lacksFiles()) {
            m_sender.session.RoundNo = HoldIn16Bits(round);
            m_events.reached(SendingMoment::RoundFailed, round);
            m_anyFailed = true;
        }
        return std::nullopt;
    }

    SendingPhase afterTheLast() override { return m_anyFailed ? SendingPhase::NotAll : m_sender.silentEnd(); }

    bool stopped() {
        if (m_stop.StopFlag && !m_stop.left)
            m_sender.pass.endStopped();
        return m_sender.pass.UserStopped == 1;
    }

    FtpSender& m_sender;
    bool m_anyFailed = false;
};

FtpSender::FtpSender(SessionState& state, const Platform& platform, SendingEvents& events)
    : session(state, platform, events, stop, lists)
    , pass(state, platform, events, stop, lists, session)
    , check(state, platform, events, stop, lists, session)
    , report(state, platform, stop, Sender::Ftp, [this](const Result<void>& written) { session.keep(written); })
    , m_transfer(state.transfer)
    , m_platform(platform)
    , m_events(events) {}

void FtpSender::stopNow() {
    stop.StopFlag = true;
    m_platform.internet.abort();
}

void FtpSender::leave() {
    stop.left = true;
    m_platform.internet.abort();
}

void FtpSender::watch() {
    pass.watch();
    check.watch();
}

void FtpSender::clearLists() {
    for (TextList* list : {&lists.List3, &lists.List4Makor, &lists.List4Broken, &lists.List6, &lists.List7})
        list->clear();
    NumToSend = 0;
    check.NumOnServer = 0;
    report.beginOrder(nullptr);
}

void FtpSender::beginOrder() {
    NumToSend = countList3();
    session.beginOrder();
    report.beginOrder(session.journal());
    lists.List4Makor.clear();
    lists.List4Makor.append(lists.List3.items());
    takeBroken();
}

void FtpSender::takeBroken() {
    const OrderJournal& journal = *session.journal();
    const QStringList reported = ReadBrokenFiles(m_platform.files, journal.folder());
    QStringList inHand = journal.state().filesInHand;
    // This sending rewrites the list of broken files, so files of an earlier one are kept in hand.
    for (const QString& path : reported) {
        if (!lists.List3.contains(path))
            session.keep(session.journal()->take(path));
    }
    for (const QString& path : reported + inHand) {
        if (lists.List3.contains(path) && !lists.List4Broken.contains(path))
            lists.List4Broken.append(path);
    }
    inHand.removeIf([&](const QString& path) { return reported.contains(path); });
    pass.beginOrder(inHand);
}

bool FtpSender::onlyReportIsLeft() const {
    return m_transfer.SugMishloah == Sending::NewOrder &&
           OrderJournal(m_platform.files, OrderFolder(m_transfer.OrderFolder)).state().onlyReportIsLeft();
}

std::int16_t FtpSender::countList3() const {
    return HoldIn16Bits(lists.List3.count());
}

void FtpSender::refill() {
    lists.List3.clear();
    lists.List3.append(lists.List4Makor.items());
}

std::optional<SendingPhase> FtpSender::RunAttempts() {
    pass.UserStopped = 0;
    closeOpened();
    const StoppableLine line(m_platform);
    return FourAttempts(*this, m_events).run(attempts);
}

std::optional<SendingPhase> FtpSender::runOlderRounds() {
    session.beginPass();
    pass.UserStopped = 0;
    closeOpened();
    const StoppableLine line(m_platform);
    return OlderRounds(*this, m_events).run(olderRounds, SendingMoment::RoundBegins);
}

FtpSender::Verdict FtpSender::verdict() const {
    if (!session.provesArrival()) {
        if (check.NumOnServer > NumToSend)
            return Verdict::NotKnown;
        return check.NumOnServer == NumToSend && !check.unreadable ? Verdict::All : Verdict::Missing;
    }
    if (!check.proof)
        return Verdict::NotKnown;
    if (check.missing().isEmpty())
        return Verdict::All;
    return session.lineEndsExplain(*check.proof, lists.List4Makor.items()) ? Verdict::ServerChanges : Verdict::Missing;
}

bool FtpSender::lacksFiles() const {
    return session.provesArrival() ? verdict() == Verdict::Missing || verdict() == Verdict::NotKnown
                                   : check.NumOnServer < NumToSend;
}

Arrival FtpSender::arrival(SendingPhase end) const {
    if (!hasArrived(end))
        return Arrival::Part;
    if (session.provesArrival())
        return check.proven;
    return check.arrivalByNames();
}

SendingPhase FtpSender::arrivedEnd() const {
    if (check.proven == Arrival::Whole || !session.provesArrival())
        return SendingPhase::Success;
    return check.proven == Arrival::Agreed ? SendingPhase::AllThere : SendingPhase::PartThere;
}

SendingPhase FtpSender::changedEnd() {
    pass.tellChanged();
    return SendingPhase::CallLab;
}

// A connection that was opened by hand stands in another folder than the one where the walk begins.
void FtpSender::closeOpened() {
    if (session.hConnection)
        session.closeSession();
}

SendingPhase FtpSender::silentEnd() const {
    if (!session.provesArrival())
        return check.missing().isEmpty() && check.NumOnServer >= NumToSend ? SendingPhase::AllThere
                                                                           : SendingPhase::Unclear;
    if (verdict() == Verdict::All)
        return arrivedEnd();
    return unheardEnd();
}

SendingPhase FtpSender::unheardEnd() const {
    return pass.triedAll() ? SendingPhase::Unclear : SendingPhase::NotAll;
}

} // namespace lumora
