#pragma once

namespace lumora {

// For main(): keeps the memory of a picture for the next one. Given back to the system after each, as the library would
// do, it comes back page by page, which takes as long as a sixth of an edited print.
void keepPictureMemory();

} // namespace lumora
