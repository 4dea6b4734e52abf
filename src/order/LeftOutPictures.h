#pragma once

#include "imaging/Bitmap.h"
#include "session/SessionState.h"

namespace lumora {

class Files;
struct Platform;

// The pictures that the log names as failed, as left out.
QList<LeftOut> LeftOutOf(const QStringList& failed);

// A small picture of one of leftOut, as smallPictureSize() has it for a cell of that many pixels; null where there is
// none or it can't be read.
Bitmap SmallLeftOut(const SessionState& state, const Files& files, int index, int cell);

// Removes the folder of the chosen order, from whose box the customer went back to the pictures, and what was made for
// its sheet. A failure is told.
void TakeOrderBack(SessionState& state, const Platform& platform);

} // namespace lumora
