#pragma once

#include "common/Result.h"
#include "order/BasketLine.h"
#include "order/OrderFolder.h"
#include "order/OrderState.h"
#include "session/PageFlow.h"

#include <QList>

#include <optional>

namespace lumora {

class Files;
class OrderJournal;
class PageChain;
struct SessionState;

// Removes what a killed program has left among the orders: orders that were prepared again under another number,
// claimed folders that hold nothing, and logs that were fetched from a server. Only for a data folder in which no other
// program runs: a folder that another program has just claimed is empty too.
void TidyOrders(const SessionState& state, const Files& files);

// An order whose preparation or sending did not come to its end.
struct UnfinishedOrder {
    OrderFolder folder;
    OrderState state;
    int pictures = 0; // lines of the basket with a usable name
    int prepared = 0; // of these, the ones whose print is there
    int gone = 0;     // of the others, the ones whose picture is no longer there

    // Without any picture there is no order to go on with.
    bool lacksAllPictures() const { return gone > 0 && gone == pictures; }
};

// The order as its folder and its state tell it; pictures are counted while it is being prepared.
UnfinishedOrder UnfinishedOrderOf(const SessionState& state, const Files& files, const OrderFolder& folder,
                                  const OrderState& order);

// The orders that can go on, newest first by the day in the name and then by the number: those that are being prepared,
// and those for a server that have not arrived there or of which the lab has not been told. Not among them: an order
// that another one replaces, one without any print to send, and one whose server the lab has not set up. Only for a
// data folder in which no other program runs.
QList<UnfinishedOrder> UnfinishedOrders(const SessionState& state, const Files& files);

// Sets the session for going on with the order, and tells the way to the page that does it.
Outcome TakeUpOrder(const UnfinishedOrder& order, SessionState& state, const Files& files);
// Takes the order up and goes to its page. False where that page is not registered; the session is unchanged then.
bool GoOnWithOrder(const UnfinishedOrder& order, SessionState& state, const Files& files, PageChain& chain,
                   PageId from);

// The order that was prepared again from this one under another number; none where this one has been sent.
std::optional<OrderFolder> ReplacementOf(const SessionState& state, const Files& files, const OrderFolder& folder);
// Removes the order that this one was prepared again from. A replaced order that was sent stays, and so does one whose
// successor has a failed picture, since it may hold the only print.
Result<void> RemoveReplacedOrder(const Files& files, OrderJournal& order);

// "2 of 5 pictures are no longer where they were.", and the question before an order is thrown away.
QString GoneText(const SessionState& state, const UnfinishedOrder& order);
QString ThrowAwayQuestion(const SessionState& state, const QString& number);
// Removes the order's folder with all that it holds.
Result<void> ThrowAwayOrder(const Files& files, const OrderFolder& folder);

// How many pictures of the order's basket are no longer where they were, or have another one in their place, whether
// their prints are there or not.
int GonePictures(const SessionState& state, const Files& files, const UnfinishedOrder& order);

// Another picture stands where the line's picture stood when the preparation began. Of a corrected copy always false.
bool IsOtherPicture(const SessionState& state, const Files& files, const OrderState& order, qsizetype line);

// True for a print file that reads in the shape that the lab asks for now: all prints of an order have one.
bool PrintFits(const SessionState& state, const Files& files, const DrivePath& print);

// Where the order keeps what a clean-up would take out of a scratch folder.
DrivePath KeptWorkFolder(const OrderFolder& folder, const DrivePath& scratch);

// The picture from which the print of a basket line is made: for a line whose red eyes were corrected the corrected
// copy.
DrivePath PictureOf(const BasketLine& line, LineForm form, const SessionState& state);

} // namespace lumora
