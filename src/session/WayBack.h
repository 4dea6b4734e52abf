#pragma once

#include "session/Page.h"

namespace lumora {

class PageChain;
struct SessionState;

// The way from an order that is prepared, or was to be, back to its pictures.
bool leadsToPictures(PageId from, const SessionState& state, const PageChain& chain);
// Gives basket, pictures and what was typed back to the page of pictures. False where that page is not shown.
bool goBackToPictures(PageId from, SessionState& state, PageChain& chain);

} // namespace lumora
