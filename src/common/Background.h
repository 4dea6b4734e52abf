#pragma once

#include <functional>

class QThreadPool;

namespace lumora {

// Work that no object waits for, since a card that is pulled or a name server that keeps silent may hold it for good.
// The end of the application waits for it, a second at most: statics must not go while a thread reads them. What still
// runs then is left to the end of the process, which keeps its status and destroys nothing more.

// Each work has a thread at once.
void runInBackground(std::function<void()> work);

// A new pool of so many threads, never destroyed.
QThreadPool& backgroundPool(int threads);

} // namespace lumora
