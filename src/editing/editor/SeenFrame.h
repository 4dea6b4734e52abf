#pragma once

#include "editing/render/EditedPicture.h"

namespace lumora {

struct SessionState;

// Keeps the box Misgerett and the record together, so that the frame that is seen is the one that prints. As built in,
// the box hides a frame that prints all the same, and a frame that has only its print file is not seen.
class SeenFrame {
public:
    explicit SeenFrame(const SessionState& state)
        : m_state(state) {}

    // Whether the box is ticked once a frame was taken or a picture opened.
    bool ticked(bool before) const;
    // The box was unticked: takes the frame out of the record. True if there was one.
    bool takeOut(EditFields& edit) const;
    FrameUse use() const;

private:
    const SessionState& m_state;
};

} // namespace lumora
