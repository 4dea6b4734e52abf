#pragma once

#include <QPointF>

namespace lumora {

class EditedPreview;
struct EditFields;
struct SessionState;

// Holds what the customer moves and turns within what the columns of the record carry. As built in, a longer value
// loses its right end: -112 degrees print as -11, and the picture or the caption jumps when it is opened again.
class EditLimits {
public:
    explicit EditLimits(const SessionState& state)
        : m_state(state) {}

    // A turn under -99 becomes the same turn in positive degrees; a caption stays within -99 to 999 pixels and 8 to 98
    // points.
    void hold(EditFields& edit) const;

    // Where the picture's centre comes to on the way between two places: it stays where a pixel of the picture touches
    // the paper, and within -999 to 780 pixels, since 781 means "not set".
    QPointF pan(const EditedPreview& picture, const EditFields& edit, QPointF from, QPointF to) const;

private:
    const SessionState& m_state;
};

} // namespace lumora
