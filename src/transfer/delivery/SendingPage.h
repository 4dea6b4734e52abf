#pragma once

#include "imaging/Bitmap.h"
#include "order/OrderCompleteness.h"
#include "order/OrderState.h"
#include "platform/media/Cards.h"
#include "session/Page.h"
#include "session/Ticker.h"
#include "transfer/delivery/Countdown.h"
#include "transfer/delivery/PreparedAgain.h"
#include "transfer/delivery/PrintPreviews.h"
#include "transfer/delivery/SendingControls.h"
#include "transfer/delivery/SendingEvents.h"
#include "transfer/delivery/SendingPhase.h"

#include <functional>
#include <optional>
#include <span>

namespace lumora {

class LabReport;
class PageChain;
class ReportCalls;
struct Platform;
struct SessionState;

// What the gauge shows: a sign, or a ring filled by share with two texts inside.
struct SendingGauge {
    SendingSign sign;
    double share = 0; // 0 to 1
    QString large;
    QString small;
};

// What the two sending pages have in common: the phase and its look, the countdown, the ways in and out. A page begins
// when it comes to the front, so that the customer sees what it does; construction alone sends nothing.
class SendingPage : public Page {
    Q_OBJECT
public:
    void Form_Activate() { activate(); }           // the page has come to the front
    void Timer4Report_Tick() { watchReport(); }    // each second of a telling
    void Command4Dooach_Click() { reportAgain(); } // in the operator's area
    void Command4Bli_Click() { goOnWithout(); }    // in the box of left out pictures
    void Command4Hazor_Click() { goBack(); }
    void changeOrder_Click() { change(); }

    SendingPhase phase() const { return m_phase; }
    const PhaseLook& look() const;
    SendingGauge gauge() const;
    const Countdown& countdown() const { return m_countdown; }
    const SendingControls& sendingControls() const { return m_shown; }

    // The page has come to an end, or waits for an answer.
    bool hasEnded() const;
    bool isWorking() const override { return !hasEnded(); }
    // Why, as the staff reads it: what the order lacks, or the reason that was told last, or the words of the phase.
    BothLanguages whyItEnded() const;
    // Nothing is left to do but to begin a new order, or to send again. Then the page may be left where nobody is
    // there.
    bool isAtRest() const override;
    void leaveUnattended() { leaveForNewOrder(); }

    // As SmallLeftOut().
    Bitmap smallLeftOut(int index, int cell) const;
    // The first prints of the order. They are read only where somebody looks at the page.
    void showPrints();
    const std::vector<Bitmap>& prints() const { return m_previews.pictures(); }

    // What slipCode shows: black modules of one pixel on white. Null where it is hidden.
    Bitmap slipCode() const;

    // What the operator's area shows of the order. A telling that was begun may have been heard or not.
    bool reportUnknown() const;
    bool provenByNameOnly() const;
    bool mayReportAgain() const;

protected:
    SendingPage(PageId id, SessionState& state, const Platform& platform, PageChain& chain, SendingControls& shown,
                Countdown countdown);

    // The page's table: a row for each phase that the page enters.
    virtual std::span<const PhaseLook> looks() const = 0;
    // The advice of the row with its numbers inserted.
    virtual QString advice(const PhaseLook& row) const;
    // Changes the page's own controls with the phase.
    virtual void showPhase(const PhaseLook& row) = 0;
    // Starts what the page does by itself.
    virtual void begin() = 0;
    // Starts the count, or waits where an answer is awaited.
    virtual void startCount() = 0;
    // The customer is to answer first whether the order goes on without the pictures that were left out.
    bool isAnswerAwaited() const { return m_leftOut.isAwaited(); }
    // The customer leaves the page or the program: nothing more may be sent.
    virtual void leave() = 0;
    virtual void stopTimers() = 0;
    // How the lab is told; no calls where it can't be.
    virtual LabReport& report() = 0;
    virtual const LabReport& report() const = 0;
    virtual ReportCalls* reportCalls() = 0;
    // A call on the line is under way, also one that the phase does not show.
    virtual bool lineInUse() const = 0;

    void enter(SendingPhase phase);
    // Shows the texts of the phase in the language of the session.
    void tellPhase();
    // Shows what the operator may do about the report.
    void showReporting();
    void tellReason(LineStep step, const Failure& failure, const QString& subject);
    void forgetReason();
    // A step of the sending could not be kept in the order's folder.
    void tellNotKept() const;
    // The customer has stopped the count, or lets it go on: what is stopped is not sent by itself.
    void keepHeld(bool held) const;
    // Asked of the files that make up the chosen order; a question's loop may close the page.
    bool mayBeSent(const QStringList& paths);
    // The order's number is another order's on the server: follows the way to the page that prepares the order again
    // under another one. False where that is not possible; the page stays.
    bool prepareAgain(const OrderJournal& order, const PreparedAgain::IsTaken& isTaken);
    const QString& reason() const { return m_reason; } // empty: no failure is to be told
    void tellLab();
    // A file of the order may lie on a server.
    void endWayBack();
    void leaveForNewOrder();
    void leaveProgram();
    // Not by a customer of a kiosk.
    bool mayBeClosed() const;

    QString wording(const char16_t* hebrew, const char16_t* english) const;
    QString wording(const SendingWords& words) const { return wording(words.hebrew, words.english); }

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    Countdown m_countdown;
    std::optional<OrderCompleteness> m_lacking; // of an order that has arrived with fewer prints than its log names

private:
    QString adviceOf(const PhaseLook& row) const;
    BothLanguages inBoth(const std::function<QString(const SessionState&)>& words) const;
    bool goesOnByItself(SendingPhase phase) const;
    bool knowsCustomer() const;
    void showFacts();
    void showThanks();
    void printSlip();
    void slipHandedOver(bool taken);
    void watchCards();
    void showCardMayGo();
    void readPrints();
    void goOnWithout();
    void goBack();
    // Nothing of the order has left the machine.
    bool mayChange() const;
    void change();
    void bringWorkBack() const;
    // What the log of an order that is sent again names as failed.
    void readLeftOut();
    void activateWhenFree();
    void activate();
    void reportAgain();
    void watchReport();
    using Telling = void (LabReport::*)(ReportCalls&);
    void tellWatched(Telling telling, ReportCalls& calls);

    SendingControls& m_shown;
    LeftOutBox m_leftOut;
    Ticker Timer4Report; // 1000 ms: the watch over a telling
    PrintPreviews m_previews;
    bool m_isLookedAt = false;               // somebody looks at the page
    bool m_slipAsked = false;                // it was handed over for printing
    bool m_slipTaken = false;                // the queue has it
    bool m_wayBack = true;                   // nothing of the order was sent
    std::optional<Cards::Watch> m_cardWatch; // of an order that has arrived
    SendingPhase m_phase = SendingPhase::Preparing;
    bool m_activated = false;
    QString m_reason; // what the last failure means
    // The failure that was told last.
    struct Trouble {
        LineStep step;
        Failure failure;
        QString subject;
    };
    std::optional<Trouble> m_trouble;
    std::optional<BothLanguages> m_refusal; // what the order lacks that does not leave
};

} // namespace lumora
