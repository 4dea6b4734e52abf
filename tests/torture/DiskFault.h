#pragma once

namespace lumora {

// While this lives, the nth call that changes the disk fails: for want of space if n is odd, else with an input/output
// error. Twice: the one behind it fails too; on a full disk each later one that takes space does. The floors' calls
// come here first, as CMakeLists.txt has it. Nothing waits for the disk.
class DiskFault {
public:
    enum class Kind { Once, Twice, FullDisk };
    explicit DiskFault(int nth, Kind kind = Kind::Once); // 0: none
    ~DiskFault();
    DiskFault(const DiskFault&) = delete;
    DiskFault& operator=(const DiskFault&) = delete;

    bool met() const;
    int syncs() const; // files and folders that were synced meanwhile
};

} // namespace lumora
