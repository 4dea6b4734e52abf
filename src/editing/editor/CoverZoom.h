#pragma once

#include <cstdint>
#include <optional>

namespace lumora {

class EditedPreview;
struct EditFields;
struct SessionState;

// Turns the picture, and raises the zoom of one that covered the paper to what covers it turned, 210 per cent at most.
// The customer's own zoom returns with the next turn that needs less. As built in, the zoom stays, and the stretched
// picture shows at the bare ends.
class CoverZoom {
public:
    explicit CoverZoom(const SessionState& state)
        : m_state(state) {}

    void turn(EditFields& edit, std::int16_t rotationCode, const EditedPreview& picture);
    // The zoom of the record is the customer's own: another picture, or another zoom.
    void forget() { m_own.reset(); }

private:
    bool isRaisedToTheLast(const EditFields& edit) const;

    const SessionState& m_state;
    std::optional<std::int16_t> m_own; // the customer's zoom while a raised one stands in the record
};

} // namespace lumora
