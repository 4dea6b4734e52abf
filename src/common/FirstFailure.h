#pragma once

#include "common/Result.h"

namespace lumora {

// Of several steps, each of which is done whatever became of those before.
class FirstFailure {
public:
    void note(const Result<void>& done) {
        if (m_outcome && !done)
            m_outcome = done;
    }
    const Result<void>& outcome() const { return m_outcome; }

private:
    Result<void> m_outcome;
};

} // namespace lumora
