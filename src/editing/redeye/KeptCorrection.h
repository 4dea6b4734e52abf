#pragma once

#include "common/DrivePath.h"

namespace lumora {

class Files;
class RedEyePicture;
struct SessionState;

// Keeps the corrections of earlier visits: a visit begins from the corrected copy, restoring brings the customer's file
// back and its accept gives the copy up, and only a changed picture is marked. As built in, each visit begins from the
// customer's file, its accept replaces the copy without a word, and the editor shows the correction when the picture is
// opened the next time.
class KeptCorrection {
public:
    KeptCorrection(const SessionState& state, const Files& files)
        : m_state(state)
        , m_files(files) {}

    // The file that a visit begins with.
    DrivePath begin(const DrivePath& picture) const;

    // What an accept does with the corrected copy.
    enum class Accept { Nothing, Save, GiveUp };
    Accept accept(const RedEyePicture& picture) const;

    // The editor loads the picture by its record after an accept and in full colour.
    bool isSeen() const;

private:
    const SessionState& m_state;
    const Files& m_files;
};

} // namespace lumora
