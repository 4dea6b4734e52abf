#include "transfer/ftp/UploadCheck.h"

#include "common/DrivePath.h"
#include "common/FixedText.h"
#include "order/BrokenFiles.h"
#include "order/OrderCompleteness.h"
#include "order/OrderFolder.h"
#include "order/OrderLog.h"
#include "order/OrderNames.h"
#include "platform/Machine.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "transfer/delivery/OrderFiles.h"

#include <algorithm>
#include <array>
#include <vector>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

enum class Step { Pause, Recheck, Delete, Close, Confirm, List };

const std::vector<Step>& stepsOf(int attempt) {
    using enum Step;
    static const std::vector<Step> first = {Pause,   Recheck, Pause, Delete,  Close,   Recheck, Delete, Close,
                                            Recheck, Delete,  Close, Recheck, Confirm, Close,   List};
    static const std::vector<Step> middle = {Pause, Recheck, Pause, Delete, Close, Recheck, Pause,   Delete,
                                             Close, Recheck, Pause, Delete, Close, Recheck, Confirm, List};
    static const std::vector<Step> last = {Pause,  Recheck, Pause,   Delete,  Close, Recheck,
                                           Delete, Close,   Recheck, Confirm, List};
    return attempt == 1 ? first : attempt == 4 ? last : middle;
}

// Removing an entry skips the next one, so that one walk may leave dots; three walks remove all.
constexpr int filterWalks = 3;

} // namespace

void UploadCheck::begin() {
    m_silence.begin(SilenceLimit::Work::Check);
    m_silent = false;
    m_running = true;
}

bool UploadCheck::endEarly() {
    m_running = false;
    if (!m_silent || m_stop.left)
        return false;
    m_session.closeSession();
    m_stop.StopFlag = false;
    m_events.failed(LineStep::Silence, {Failure::Kind::TimedOut, u"the line was silent during the check"_s});
    return true;
}

void UploadCheck::endSilent() {
    m_silent = true;
    m_stop.StopFlag = true;
}

void UploadCheck::watch() {
    if (!m_running || m_silent || m_stop.StopFlag || !m_silence.overAfter(m_platform))
        return;
    endSilent();
    m_platform.internet.abort();
}

void UploadCheck::check(int attempt) {
    m_freshListing = false;
    // A kept session whose pass had no fault.
    if (m_session.inOrderFolder() && m_lists.List4Broken.isEmpty()) {
        listServerFiles(Over::OpenConnection);
        return;
    }
    for (const Step step : stepsOf(attempt)) {
        if (m_stop.left || m_silent)
            return;
        switch (step) {
        case Step::Pause:
            m_session.PauseBar();
            break;
        case Step::Recheck:
            RecheckBroken();
            break;
        case Step::Delete:
            DeleteBrokenFiles();
            break;
        case Step::Close:
            m_session.FtpCloseConnection();
            break;
        case Step::Confirm:
            ConfirmBrokenGone();
            break;
        case Step::List:
            ListServerFiles();
            break;
        }
    }
}

void UploadCheck::freshConnection() {
    m_session.PauseBar();
    m_session.FtpCloseConnection();
    m_session.PauseBar();
    m_pump.pump();
    m_session.PauseBar(3);
    m_session.walkToLabFolder();
    m_silence.connectsTimedOut(m_session.connectTimedOut);
    if (m_running && m_silence.over() && !m_stop.StopFlag)
        endSilent();
}

bool UploadCheck::lookUp() {
    const QString& name = m_state.transfer.ShemTikiya;
    const QStringList before = m_lists.List6.items();
    // Some servers cut a long listing, and a kept session has none.
    const bool isListed = m_lists.List5.contains(name) || m_session.provesArrival() || m_session.isKept();
    if (m_session.inOrderFolder() ? !m_session.listOrderFolder() : !isListed || !m_session.enterListedFolder(name))
        return false;
    unreadable = !m_session.unreadLine().isEmpty();
    if (!unreadable)
        return true;
    // Such a listing proves neither what arrived nor what is gone.
    m_lists.List6.clear();
    m_lists.List6.append(before);
    m_events.failed(LineStep::List, {Failure::Kind::Damaged, m_session.unreadLine()});
    return false;
}

void UploadCheck::filterDots() {
    for (int walk = 0; walk < filterWalks; ++walk) {
        const int count = m_lists.List6.count();
        for (int i = 0; i < count; ++i) {
            const QString name = m_lists.List6.item(i);
            if (name == u"."_s || name == u".."_s)
                m_lists.List6.removeAt(i);
        }
    }
}

void UploadCheck::count() {
    int names = 0;
    for (const QString& name : m_lists.List6.items()) {
        if (!IsBroken(m_lists.List4Broken, name))
            ++names;
    }
    NumOnServer = HoldIn16Bits(names);
}

void UploadCheck::ListServerFiles() {
    listServerFiles(Over::NewConnection);
}

void UploadCheck::listServerFiles(Over connection) {
    freshCount = false;
    unreadable = false;
    proof.reset();
    proven = Arrival::Part;
    if (connection == Over::NewConnection)
        freshConnection();
    if (m_stop.left)
        return;
    if (!m_session.insideOrderBase()) {
        m_events.reached(SendingMoment::OutsideFolder);
        return;
    }
    freshCount = lookUp();
    if (freshCount) {
        count();
        m_events.reached(SendingMoment::Listed, NumOnServer);
        prove();
    }
    filterDots();
    count();
    m_events.reached(SendingMoment::Counted, NumOnServer);
    m_session.FtpCloseConnection();
}

// The connection still stands in the folder.
void UploadCheck::prove() {
    proof = m_session.prove(m_lists.List4Makor.items());
    if (proof && missing().isEmpty())
        proven = orderThere();
}

QStringList UploadCheck::restOfOrder() const {
    const OrderFolder order(m_state.transfer.OrderFolder);
    const QStringList entries = m_files.names(order.path(), ftpOrderPattern);
    QStringList rest = FtpOrderFiles(m_files, order, entries, TravelsInPieces(order.name()));
    rest.removeIf([&](const QString& path) { return m_lists.List4Makor.contains(path); });
    return rest;
}

Arrival UploadCheck::orderThere() {
    const OrderFolder order = OrderFolder::chosen(m_state);
    const QStringList rest = restOfOrder();
    // The server may hold only a part of a file that an earlier sending has not confirmed.
    const QStringList unconfirmed = m_session.journal()->state().filesInHand + ReadBrokenFiles(m_files, order);
    if (std::any_of(rest.begin(), rest.end(), [&](const QString& path) { return unconfirmed.contains(path); }))
        return Arrival::Part;
    const std::optional<ArrivalProof> ofRest = m_session.prove(rest);
    if (!ofRest || !ofRest->proven())
        return Arrival::Part;
    const std::optional<OrderLog> log = ReadOrderLog(m_files, order);
    const QStringList there = m_lists.List6.items();
    return arrivalBy(
        OrderCompleteness::of(log ? &*log : nullptr, there, there, DamagedPrints(m_state, m_files, order)).verdict());
}

Arrival UploadCheck::arrivalByNames() const {
    if (!restOfOrder().isEmpty())
        return Arrival::Part;
    return arrivalBy(completeness().verdict());
}

OrderCompleteness UploadCheck::completeness() const {
    return OrderCompleteness::read(m_state, m_files, OrderFolder::chosen(m_state),
                                   LeafNames(m_lists.List4Makor.items()));
}

Arrival UploadCheck::arrivalBy(OrderCompleteness::Verdict verdict) {
    switch (verdict) {
    case OrderCompleteness::Verdict::Whole:
    case OrderCompleteness::Verdict::Unknown:
        return Arrival::Whole;
    case OrderCompleteness::Verdict::Fewer:
        return Arrival::Agreed;
    case OrderCompleteness::Verdict::None:
        break;
    }
    return Arrival::Part;
}

void UploadCheck::RecheckBroken() {
    m_freshListing = false;
    if (nothingBroken())
        return;
    freshConnection();
    if (m_stop.left)
        return;
    if (!m_session.insideOrderBase()) {
        m_events.reached(SendingMoment::OutsideFolder);
        return;
    }
    m_freshListing = lookUp();
    m_events.reached(SendingMoment::CheckingBroken);
    filterDots();
    count();
    m_events.reached(SendingMoment::Counted, NumOnServer);
}

void UploadCheck::DeleteBrokenFiles() {
    // In another folder a file of the same name belongs to another order.
    if (nothingBroken() || !m_session.inOrderFolder())
        return;
    m_session.CurrentRemoteDir();
    for (int walk = 0; walk < 2; ++walk) {
        for (int i = 0; i < m_lists.List4Broken.count() && !m_stop.left; ++i) {
            m_lists.List4Broken.setCurrentIndex(i);
            m_session.remove(LeafName(m_lists.List4Broken.item(i)).trimmed());
            m_session.PauseBar();
            m_pump.pump();
            m_pump.pump();
        }
        if (walk == 0)
            m_session.PauseBar(2);
    }
}

void UploadCheck::ConfirmBrokenGone() {
    // Only a listing made after the failed put shows its remains.
    if (nothingBroken() || !m_freshListing)
        return;
    m_session.PauseBar();
    TextList& broken = m_lists.List4Broken;
    m_lists.List4BrokenB.clear();
    m_lists.List4BrokenB.append(LeafNames(broken.items()));
    for (int i = 0; i < m_lists.List4BrokenB.count() && !broken.isEmpty(); ++i) {
        const QString name = m_lists.List4BrokenB.item(i);
        int last = -1;
        for (int k = 0; k < broken.count(); ++k) {
            if (LeafName(broken.item(k)) == name)
                last = k;
        }
        if (!m_lists.List6.contains(name))
            broken.removeAt(last);
    }
    if (broken.count() < m_lists.List4BrokenB.count())
        m_session.keepBrokenFiles();
}

QStringList UploadCheck::missing() const {
    QStringList paths;
    for (const QString& path : m_lists.List4Makor.items()) {
        if (!isThere(LeafName(path)))
            paths.append(path);
    }
    return paths;
}

bool UploadCheck::isThere(const QString& name) const {
    const bool broken = IsBroken(m_lists.List4Broken, name);
    if (!proof)
        return m_lists.List6.contains(name) && !broken;
    if (proof->byLength.contains(name))
        return true;
    return !broken && !proof->missing.contains(name) && !proof->broken.contains(name);
}

void UploadCheck::RebuildMissing() {
    if (!proof && NumOnServer >= m_lists.List4Makor.count())
        return;
    const QStringList paths = missing();
    m_lists.List3.clear();
    m_lists.List3.append(paths);
    if (!proof || proof->broken.isEmpty())
        return;
    for (const QString& path : paths) {
        if (proof->broken.contains(LeafName(path)) && !m_lists.List4Broken.contains(path))
            m_lists.List4Broken.append(path);
    }
    m_session.keepBrokenFiles();
}

void UploadCheck::DropAlreadySent() {
    for (int i = m_lists.List3.lastIndex(); i >= 0; --i) {
        if (isThere(LeafName(m_lists.List3.item(i))) && (proof || !m_session.provesArrival()))
            m_lists.List3.removeAt(i);
    }
}

} // namespace lumora
