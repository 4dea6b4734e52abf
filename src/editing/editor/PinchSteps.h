#pragma once

namespace lumora {

// How many steps of the editor's buttons make what two fingers do, so that the record holds what its buttons could have
// made.
class PinchSteps {
public:
    static constexpr int zoomStep = 2;    // per cent
    static constexpr int leastTurn = -99; // the record has three columns for it
    static constexpr int ofNotch = 3;     // steps of zoom for one of a wheel

    struct Steps {
        int zoom = 0; // closer
        int turn = 0; // clockwise
        bool any() const { return zoom != 0 || turn != 0; }
    };

    // The zoom where the fingers come down.
    explicit PinchSteps(int zoomPercent)
        : m_from(zoomPercent)
        , m_reached(zoomPercent) {}

    // What is still to be done: the fingers are that many times as far apart as they were, and have turned by so much.
    Steps follow(double times, double degrees);

private:
    int m_from;
    int m_reached;
    int m_turned = 0;
};

} // namespace lumora
