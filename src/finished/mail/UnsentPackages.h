#pragma once

namespace lumora {

class PackageWalk;
struct SessionState;

// The packages that a stopped walk has left, so that the lab does not get the others twice. As built in, a walk begins
// again at its first package.
class UnsentPackages {
public:
    explicit UnsentPackages(const SessionState& state)
        : m_state(state) {}

    // How many there are to go on with; 0 where none was sent before.
    int count(const PackageWalk& walk) const;

private:
    const SessionState& m_state;
};

} // namespace lumora
