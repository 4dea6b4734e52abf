#include "order/UnfinishedOrders.h"

#include "common/FixedText.h"
#include "order/BasketLine.h"
#include "order/DoorFolders.h"
#include "order/EditRecord.h"
#include "order/FinishedOrder.h"
#include "order/KeptPictures.h"
#include "order/LeftOutPictures.h"
#include "order/MailAddressGuard.h"
#include "order/OrderChoices.h"
#include "order/OrderCompleteness.h"
#include "order/OrderDetailsReader.h"
#include "order/OrderJournal.h"
#include "order/OrderLog.h"
#include "order/OrderNames.h"
#include "order/OrderSender.h"
#include "order/PictureMark.h"
#include "order/PrintFile.h"
#include "order/PrintFileName.h"
#include "platform/files/EmptyFolder.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

using Phase = OrderState::Phase;
using Way = OrderState::Way;

namespace {

KeptPictures keptBy(const OrderState& order, const Files& files) {
    return {files, DrivePath(order.keptIn)};
}

// A corrected copy is there also where only the order has kept it.
bool pictureIsThere(const OrderFolder& folder, const OrderState& order, qsizetype line, const SessionState& state,
                    const Files& files) {
    const LineForm form = lineFormOf(order.kind);
    const BasketLine item = BasketLine::split(order.items[line], form);
    const DrivePath picture = PictureOf(item, form, state);
    if (picture == item.path)
        return files.fileExists(keptBy(order, files).fileOf(picture)) && !IsOtherPicture(state, files, order, line);
    return files.fileExists(picture) || files.fileExists(KeptWorkFolder(folder, picture.folder()) / picture.leaf());
}

// A name outside the code page is never found: its picture fails in any case.
bool isGone(const OrderFolder& folder, const OrderState& order, qsizetype line, const SessionState& state,
            const Files& files) {
    return !HasQuestionMark(order.items[line]) && !pictureIsThere(folder, order, line, state, files);
}

// The pictures that the log names as failed; no value where it can't be read.
std::optional<QStringList> failedOf(const Files& files, const OrderFolder& folder) {
    const std::optional<OrderLog> log = ReadOrderLog(files, folder);
    return log ? std::optional(log->failed) : std::nullopt;
}

bool canBeSent(const SessionState& session, const OrderState& state) {
    return (state.way == Way::Ftp && SenderSetUp(session.profile, Sender::Ftp)) ||
           (state.way == Way::Http && SenderSetUp(session.profile, Sender::Http));
}

bool canGoOn(const SessionState& session, const Files& files, const UnfinishedOrder& order) {
    const OrderState& state = order.state;
    if (state.phase == Phase::Preparing)
        return !state.items.isEmpty();
    if (state.phase == Phase::Reported || !canBeSent(session, state))
        return false;
    if (state.sentBefore)
        return false;
    if (state.hasArrived())
        return state.onlyReportIsLeft();
    return !PrintsAmong(files.names(order.folder.path(), printPatterns)).isEmpty();
}

bool isNewer(const UnfinishedOrder& order, const UnfinishedOrder& other) {
    const auto place = [](const UnfinishedOrder& of) {
        const std::optional<FinishedOrder> named = FinishedOrderOf(of.folder.name());
        return named ? std::pair(named->date, Val(named->number)) : std::pair(QDate(), 0.0);
    };
    return place(order) > place(other);
}

ClosingEntries closingOf(const SessionState& state) {
    const TypedAddress address = TypedAddress::of(state.shemot.Mail);
    ClosingEntries closing{address.name, address.domain, -1, address.untouched, state.shemot.Hearot};
    if (const QString branch = u" - "_s + state.BranchChoice; closing.Text2.endsWith(branch))
        closing.Text2.chop(branch.size());
    return closing;
}

// As the page of pictures handed the order over. Without its picture a print can't be made again, so that the order
// stays as it is where one is gone.
void giveWayBack(const UnfinishedOrder& order, SessionState& state, const Files& files) {
    state.handOver.takenUp = order.folder.path();
    const bool hasLeft = order.state.phase > OrderState::Phase::Prepared;
    if (hasLeft || order.state.choices.isEmpty() || GonePictures(state, files, order) > 0)
        return;
    HandOver& back = state.handOver;
    back.basket = order.state.items;
    for (const QString& text : back.basket) {
        if (const BasketLine line = BasketLine::split(text, lineFormOf(order.state.kind)); line.hasUsableName())
            back.pictures += line.path.text();
    }
    back.closing = closingOf(state);
    back.details = state.shemot;
    back.details.Mail.clear();
    back.details.Hearot.clear();
    back.doorFolder = doorFolderOf(order.state, files);
}

void takeUpPreparation(const UnfinishedOrder& order, SessionState& state) {
    state.handOver.lines = order.state.items;
    state.handOver.pressStart = printsAsTheyAre(order.state.kind);
    state.transfer.Mefurak = Travel::Whole;
}

void takeUpSending(const UnfinishedOrder& order, SessionState& state, const Files& files) {
    const bool inPieces = TravelsInPieces(order.folder.name());
    state.MisparHazmana = order.state.number;
    state.Optint = order.state.kind;
    state.shemot.ser = order.state.serial;
    state.transfer.OrderFolder = order.folder.path();
    state.transfer.OrderLogBase = order.folder.logBase();
    state.transfer.ShemTikiya = order.folder.name();
    state.transfer.HazmanaP = inPieces ? 1 : 0;
    state.transfer.Mefurak = inPieces ? Travel::Pieces : Travel::Whole;
    state.transfer.SugMishloah = Sending::NewOrder;
    state.transfer.leftOut += LeftOutOf(failedOf(files, order.folder).value_or(QStringList()));
    state.transfer.leftOutAsked = order.state.phase != Phase::Prepared;
    if (order.state.choices.isEmpty())
        ReadReportDetails(files, order.folder.logPath(), state.shemot);
}

} // namespace

void TidyOrders(const SessionState& state, const Files& files) {
    const DrivePath orders = WorkspacePaths::orders(state);
    const QStringList names = files.folders(orders);
    tidyDoorFolders(state, files);
    for (const QString& name : names) {
        if (!FinishedOrderOf(name))
            continue;
        const OrderFolder folder(orders / name);
        if (const DrivePath fromServer = folder.fetchedLogPath(); files.fileExists(fromServer))
            static_cast<void>(files.removeFile(fromServer));
        removeIfEmpty(files, folder.path());
        OrderJournal order(files, folder);
        static_cast<void>(RemoveReplacedOrder(files, order)); // the next start tries again
    }
}

Result<void> RemoveReplacedOrder(const Files& files, OrderJournal& order) {
    const QString name = order.state().replaces;
    if (!order.known() || order.state().phase == Phase::Preparing || name.isEmpty())
        return {};
    const OrderFolder replaced(order.folder().path().folder() / name);
    const Result<OrderState> before = ReadOrderState(files, replaced);
    if (before && before->phase <= Phase::Prepared && name != order.folder().name()) {
        if (const auto failed = failedOf(files, order.folder()); !failed || !failed->isEmpty())
            return {};
        if (Result<void> removed = files.removeTree(replaced.path()); !removed)
            return removed;
    }
    return order.replacesNone();
}

std::optional<OrderFolder> ReplacementOf(const SessionState& state, const Files& files, const OrderFolder& folder) {
    const Result<OrderState> replaced = ReadOrderState(files, folder);
    if (!replaced || replaced->phase > Phase::Prepared)
        return std::nullopt;
    const DrivePath orders = WorkspacePaths::orders(state);
    for (const QString& name : files.folders(orders)) {
        const OrderFolder other(orders / name);
        const Result<OrderState> order = ReadOrderState(files, other);
        if (order && order->replaces == folder.name() && name != folder.name())
            return other;
    }
    return std::nullopt;
}

DrivePath KeptWorkFolder(const OrderFolder& folder, const DrivePath& scratch) {
    return folder.keptWorkPath() / scratch.leaf();
}

DrivePath PictureOf(const BasketLine& line, LineForm form, const SessionState& state) {
    if (form == LineForm::Short)
        return line.path;
    EditFields edit;
    UnpackEditState(line.editState, edit);
    return edit.RedMarker == EditRecord::corrected ? WorkspacePaths::corrected(state, line.path) : line.path;
}

UnfinishedOrder UnfinishedOrderOf(const SessionState& state, const Files& files, const OrderFolder& folder,
                                  const OrderState& order) {
    UnfinishedOrder counted{folder, order};
    if (order.phase != Phase::Preparing)
        return counted;
    const LineForm form = lineFormOf(order.kind);
    bool fits = false; // told by the first print that is there
    for (int i = 0; i < order.items.size(); ++i) {
        const BasketLine line = BasketLine::split(order.items[i], form);
        if (!line.hasUsableName())
            continue;
        ++counted.pictures;
        const DrivePath print = folder.filePath(PrintNameOf(line, i, order.kind));
        const bool isThere = files.fileExists(print);
        if (isThere && counted.prepared == 0)
            fits = PrintFits(state, files, print);
        if (isThere && fits)
            ++counted.prepared;
        else if (isGone(folder, order, i, state, files))
            ++counted.gone;
    }
    return counted;
}

int GonePictures(const SessionState& state, const Files& files, const UnfinishedOrder& order) {
    const LineForm form = lineFormOf(order.state.kind);
    int gone = 0;
    for (qsizetype i = 0; i < order.state.items.size(); ++i) {
        if (BasketLine::split(order.state.items[i], form).hasUsableName() &&
            isGone(order.folder, order.state, i, state, files))
            ++gone;
    }
    return gone;
}

bool IsOtherPicture(const SessionState& state, const Files& files, const OrderState& order, qsizetype line) {
    const QString mark = order.marks.value(line);
    const LineForm form = lineFormOf(order.kind);
    const BasketLine item = BasketLine::split(order.items[line], form);
    if (mark.isEmpty() || PictureOf(item, form, state) != item.path)
        return false;
    const QString now = PictureMark(files, keptBy(order, files).fileOf(item.path));
    return !now.isEmpty() && now != mark;
}

bool PrintFits(const SessionState& state, const Files& files, const DrivePath& print) {
    const Result<QByteArray> bytes = files.read(print);
    return bytes && readPrintFile(*bytes, PrintFileShape::of(state.profile)).ok();
}

QList<UnfinishedOrder> UnfinishedOrders(const SessionState& state, const Files& files) {
    const DrivePath orders = WorkspacePaths::orders(state);
    QList<UnfinishedOrder> unfinished;
    QStringList replaced;
    for (const QString& name : files.folders(orders)) {
        const OrderFolder folder(orders / name);
        const OrderJournal journal(files, folder);
        if (!journal.known())
            continue;
        const OrderState& order = journal.state();
        replaced += order.replaces;
        if (UnfinishedOrder counted = UnfinishedOrderOf(state, files, folder, order); canGoOn(state, files, counted))
            unfinished += std::move(counted);
    }
    unfinished.removeIf([&](const UnfinishedOrder& order) { return replaced.contains(order.folder.name()); });
    std::stable_sort(unfinished.begin(), unfinished.end(), isNewer);
    return unfinished;
}

Outcome TakeUpOrder(const UnfinishedOrder& order, SessionState& state, const Files& files) {
    TakeChoices(order.state.choices, state);
    state.keptFolder = DrivePath(order.state.keptIn);
    state.handOver = {};
    giveWayBack(order, state, files);
    if (order.state.phase == Phase::Preparing) {
        takeUpPreparation(order, state);
        return printsAsTheyAre(order.state.kind) ? Outcome::PlainTakenUp : Outcome::EditedTakenUp;
    }
    takeUpSending(order, state, files);
    return order.state.way == Way::Http ? Outcome::SendingTakenUpByHttp : Outcome::SendingTakenUpByFtp;
}

bool GoOnWithOrder(const UnfinishedOrder& order, SessionState& state, const Files& files, PageChain& chain,
                   PageId from) {
    const SessionState before = state;
    const Outcome way = TakeUpOrder(order, state, files);
    if (chain.canFollow(from, way) && chain.follow(from, way))
        return true;
    state = before;
    return false;
}

Result<void> ThrowAwayOrder(const Files& files, const OrderFolder& folder) {
    const Result<OrderState> order = ReadOrderState(files, folder);
    Result<void> removed = files.removeTree(folder.path());
    if (removed && order && order->phase < Phase::Sending)
        removeDoorFolders(files, *order);
    return removed;
}

} // namespace lumora
