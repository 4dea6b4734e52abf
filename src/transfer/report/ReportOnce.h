#pragma once

#include "common/Result.h"
#include "session/SessionState.h"

#include <QString>

#include <optional>

namespace lumora {

class Files;
class OrderJournal;
struct SendingStop;

// The requests that tell the lab's site of an order, as one of the senders makes them. What an answer says is not
// looked at; false: none came.
class ReportCalls {
public:
    // Before the report.
    virtual void announceReport() {}
    virtual bool reportOrder(const QString& query) = 0;
    virtual bool reportDone(const QString& query) = 0;

protected:
    ~ReportCalls() = default;
};

// Tells the lab of an order: the order report, then the done call. As built in, each arrival by FTP is told where
// ReportOn is above 0, and a new order's by HTTP. Careful: at most once for an order, by whichever sender it has
// arrived; an order that is sent again is told as its log has it, and signs that cut a query are encoded.
// The state of an order that has not arrived, as that of a chosen part, is left as it is.
class ReportOnce {
public:
    ReportOnce(const SessionState& state, const Files& files, OrderJournal& journal, const SendingStop& stop)
        : m_state(state)
        , m_files(files)
        , m_journal(journal)
        , m_stop(stop) {}

    enum class Told {
        Now,
        Before,    // by an earlier arrival
        NotKnown,  // an earlier telling was begun, and its end is not known
        NotWanted, // the lab wants no report of this order, or not all of it has arrived
        NotKept,   // the begin could not be kept, so that no request went out
        Cut,       // stopped or left: once it was begun, its end is not known
    };
    Told tell(Sender by, ReportCalls& calls);
    // Whatever was told before, for an operator who knows that the lab has heard nothing.
    Told tellAgain(ReportCalls& calls);

    // True where tell() would tell of the order now; as built in never.
    bool isDue(Sender by) const;
    // For an order that lay whole on the server before anything was sent; one that an older version may have sent was
    // told of then.
    bool isDueWhereFound(Sender by) const;
    // The order has arrived and ends untold. As built in, and where the lab wants no report of it, nothing is left to
    // tell of it then.
    void endsUntold(Sender by);

    // Of the last call: fails where a step of the telling could not be written to the order's folder.
    const Result<void>& kept() const { return m_kept; }

private:
    std::optional<Told> toldOrUnwanted() const;
    bool isWanted(Sender by) const;
    bool isStopped() const;
    Told request(ReportCalls& calls);
    bool makeCalls(ReportCalls& calls) const;
    OrderDetails details() const;
    bool keep(const Result<void>& written);

    const SessionState& m_state;
    const Files& m_files;
    OrderJournal& m_journal;
    const SendingStop& m_stop;
    Result<void> m_kept;
};

} // namespace lumora
