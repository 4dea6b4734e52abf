#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"
#include "platform/files/Files.h"

#include <QString>

#include <array>
#include <functional>

namespace lumora {

struct SessionState;

// Paths of the workspace under the drive root.
namespace WorkspacePaths {
DrivePath root(const SessionState& state);                                // 2000lumora
DrivePath zmany(const SessionState& state);                               // passing files
DrivePath ktanim(const SessionState& state);                              // small views that the editor stored
DrivePath tempred(const SessionState& state);                             // working files of the red-eye page
DrivePath corrected(const SessionState& state, const DrivePath& picture); // in tempred: a picture's red-eye copy
DrivePath jobFolder(const SessionState& state);      // texts and thumbnails of the order in preparation
DrivePath misgarot(const SessionState& state);       // frames
DrivePath orders(const SessionState& state);         // !!000: staging, one sub-folder an order
DrivePath scratchPicture(const SessionState& state); // ^^^.jpg, the picture of the current step
DrivePath counter(const SessionState& state);        // vedron\mispar.txt
DrivePath toneCopy(const SessionState& state);       // bw.bmp: the grey picture that the latest toned print came from
DrivePath previewCopy(const SessionState& state);    // 0.bmp: the editor's picture
DrivePath proofPicture(const SessionState& state);   // 000.jpg
DrivePath summaryPicture(const SessionState& state); // 001.jpg
DrivePath handOverTexts(const SessionState& state);  // Tik4txt: the lines of the basket
// pratim.txt, pratim2.txt and pratim3.txt: details of a customer, of an album's photographer, of a quick order.
std::array<DrivePath, 3> detailStores(const SessionState& state);
} // namespace WorkspacePaths

// The folder tree on the program's own drive and its clean-up before each order.
class Workspace {
public:
    Workspace(const SessionState& state, const Files& files)
        : m_state(state)
        , m_files(files) {}

    // 2000lumora and 2000lumora\zmany. True if the second then exists; a failed creation is not reported.
    bool MakeRootFolders() const;
    // The whole tree but for the two below, each only if missing, in the order that a fresh drive shows. The failure
    // names the folder.
    Result<void> MakeWorkspace() const;
    Result<void> MakeCounterFolder() const;
    Result<void> MakeOrderFolder() const;

    // Empties the scratch folders, writes mana.txt afresh and reads the order number into MisparHazmana. Files that may
    // not or cannot be deleted are passed over.
    Result<void> CleanWorkspace(QString& MisparHazmana) const;

    // Removes the print files of the orders already made, but for the file at index 0 of each folder and for the orders
    // whose folder keeps() tells.
    void CleanHistory(const std::function<bool(const DrivePath&)>& keeps = {}) const;

    // Writes the next order's number into the counter file. A larger number in the file stays, since an order that was
    // taken up later must not give the numbers after it a second time.
    Result<void> writeCounter() const;

private:
    void deleteMatching(const DrivePath& folder, const QString& ending) const;

    const SessionState& m_state;
    const Files& m_files;
};

} // namespace lumora
