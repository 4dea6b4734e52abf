#pragma once

#include <QString>

namespace lumora {

struct EditFields;
struct SessionState;

// Keeps a caption as it was seen: a line break is taken back whole, a removed caption that is opened again has its
// font, size, colour and place, and a place that it was dragged to is in the record at once. As built in, half of the
// break stays in the record, the caption begins anew, and the place waits for the next change.
class CaptionGuard {
public:
    explicit CaptionGuard(const SessionState& state)
        : m_state(state) {}

    // How many characters of a text that is not empty the backspace takes.
    int lastSign(const QString& text) const;
    // Puts a caption on a picture that shows none.
    void begin(EditFields& edit) const;
    bool keepsDraggedPlace() const;

private:
    const SessionState& m_state;
};

} // namespace lumora
