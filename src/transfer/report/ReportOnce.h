#pragma once

#include "common/Result.h"
#include "session/SessionState.h"

#include <QString>

#include <optional>

namespace lumora {

class Files;
class OrderJournal;

// The two requests that tell the lab's site of an order, as one of the senders makes them. Their answers are not looked
// at.
class ReportCalls {
public:
    virtual void reportOrder(const QString& query) = 0;
    virtual void reportDone(const QString& query) = 0;

protected:
    ~ReportCalls() = default;
};

// Tells the lab of an order: the order report, then the done call. As built in, each arrival by FTP is told where
// ReportOn is above 0, and a new order's by HTTP. Careful: at most once for an order, by whichever sender it has
// arrived; an order that is sent again is told as its log has it, and signs that cut a query are encoded.
//
// A sending page calls tell() after OrderJournal::arrived() with the journal of its order, and shows a failure of
// kept(): a step of the telling that could not be written to the order's folder.
class ReportOnce {
public:
    ReportOnce(const SessionState& state, const Files& files, OrderJournal& journal)
        : m_state(state)
        , m_files(files)
        , m_journal(journal) {}

    enum class Told {
        Now,
        Before,    // by an earlier arrival
        NotKnown,  // an earlier telling was begun, and its end is not known
        NotWanted, // the lab wants no report of this order, or not all of it has arrived
        NotKept,   // the begin could not be kept, so that no request went out
    };
    Told tell(Sender by, ReportCalls& calls);
    // Whatever was told before, for an operator who knows that the lab has heard nothing.
    Told tellAgain(ReportCalls& calls);

    // For an order that lay whole on the server before anything was sent: true where tell() would tell of it now. As
    // built in, such an order is never told of.
    bool isDueWhereFound(Sender by);

    // Of the last call.
    const Result<void>& kept() const { return m_kept; }

private:
    std::optional<Told> toldOrUnwanted() const;
    bool isWanted(Sender by) const;
    Told request(ReportCalls& calls);
    QString orderQuery() const;
    bool keep(const Result<void>& written);

    const SessionState& m_state;
    const Files& m_files;
    OrderJournal& m_journal;
    Result<void> m_kept;
};

} // namespace lumora
