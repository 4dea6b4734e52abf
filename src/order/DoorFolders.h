#pragma once

#include "common/Result.h"
#include "platform/files/Files.h"

namespace lumora {

struct OrderState;
struct SessionState;

// The folders of zmany\door: what was made of an order's pictures that are no ordinary JPEG files, and the copies of
// what it has chosen from cards (KeptPictures). The lines of its basket or its state lead there, so that a folder stays
// as long as its order may still be prepared.

// The folder of an order that begins; it is made with the first of its pictures. No two orders ever get one name, since
// an order that was sent long ago still has the lines that led to its own.
DrivePath newDoorFolder(const Files& files);

// The folder of this order; empty for one that has none.
DrivePath doorFolderOf(const OrderState& order, const Files& files);

// The way back of an order is closed.
void removeDoorFolders(const Files& files, const OrderState& order);

// Removes the folders to which no order leads that can still be prepared. Only for a data folder in which no other
// program runs.
void tidyDoorFolders(const SessionState& state, const Files& files);

} // namespace lumora
