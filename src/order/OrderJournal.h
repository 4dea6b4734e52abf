#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"
#include "order/OrderFolder.h"
#include "order/OrderState.h"
#include "session/SessionState.h"

#include <QString>
#include <QStringList>

namespace lumora {

class Files;

// The state of one order as it goes on: each step is kept in the order's folder before the next begins. All writes of
// a state go through it. A call that changes nothing writes nothing. An order without a state, which was made by an
// older version or by hand, gets one at its first step here.
class OrderJournal {
public:
    // Reads the state. An order without one, or with a damaged one, is not known.
    OrderJournal(const Files& files, OrderFolder folder);

    bool known() const { return m_known; }
    const OrderState& state() const { return m_state; }
    const OrderFolder& folder() const { return m_folder; }

    // The folder is claimed, and the preparation begins: keeps the lines of the basket and what the customer chose.
    // replaces: the folder of the order that this one is prepared again from, or empty.
    Result<void> begin(const SessionState& session, OrderState::Way way, const QStringList& lines,
                       const DrivePath& replaces = {});
    // The log is written: the order is whole. Keeps the lengths of its prints.
    Result<void> prepared();
    // The folder on the server is entered for sending; the basket is dropped, and with it what was kept aside for the
    // preparation. ours: this order has made it, or it is known to hold nothing of another order. An order that has
    // arrived stays so.
    Result<void> sendingBegins(Sender by, bool ours);
    // The folder on this sender's server is known as the order's own. One that was made for the other sender is not.
    bool ownsFolder(Sender by) const;
    // This sender's server is about to be asked for the folder; it has refused.
    Result<void> folderIsAsked(Sender by);
    Result<void> folderIsRefused();
    // Asked there, and the answer is not known.
    bool mayHaveMadeFolder(Sender by) const { return m_state.folderAsked == by; }
    // Another order has taken the folder on this sender's server: nothing more of this one may go there.
    Result<void> folderIsLost(Sender by);
    // The customer sends the order again: without a state, it was sent by an older version. Writes nothing by itself.
    void markSentAgain() { m_sentAgain = true; }
    // An older version may have sent the order.
    bool wasSentBefore() const { return m_state.sentBefore || (!m_known && m_sentAgain); }
    // A file's full path, before its put and after the put that was confirmed.
    Result<void> take(const QString& path);
    Result<void> release(const QString& path);
    // How far the sending has come; kept with the next step.
    void countFiles(int sent, int inAll);
    // All files of the order lie on the server, none is in hand any more.
    Result<void> arrived(bool byNameOnly);
    // The same, and each in its length: kept with the next step.
    void markProven();
    // All files of the folder lie there. The log names more, and the customer has agreed to that.
    Result<void> arrivedAsAgreed();
    // Before report and done call, and after them. A begin that could not be kept has not taken place.
    Result<void> reportBegun();
    Result<void> reportDone();
    // The order has arrived and the lab wants no report.
    Result<void> needsNoReport();
    Result<void> wentByMail();
    // A sending by itself has ended without the order's arrival; the staff wants no more of them.
    Result<void> tried(const BothLanguages& why);
    Result<void> givenUp();
    // The customer has stopped the count before the sending, or lets it go on.
    Result<void> held(bool isHeld);
    // Its customer has gone.
    Result<void> lapsed();
    // The order that this one was prepared again from is gone, or is one of its own.
    Result<void> replacesNone();

private:
    QStringList marksOf(const QStringList& lines, const SessionState& session) const;
    void expectTheWorst();
    void makeKnown();
    Result<void> keep(const OrderState& next);

    const Files& m_files;
    OrderFolder m_folder;
    OrderState m_state;
    bool m_known = false;
    bool m_kept = false; // the file holds m_state
    bool m_sentAgain = false;
};

} // namespace lumora
