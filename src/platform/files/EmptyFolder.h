#pragma once

namespace lumora {

class DrivePath;
class Files;

// Removes a folder that holds nothing, hidden files included. Any other folder stays.
void removeIfEmpty(const Files& files, const DrivePath& folder);

} // namespace lumora
