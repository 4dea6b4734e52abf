#pragma once

#include <QtGlobal>

#include <chrono>
#include <optional>

namespace lumora {

// How long the rest of a pass will take, by what its last half minute has put: each moment counts the less the longer
// ago it was, so that a pause of the line changes the minutes slowly.
class UploadPace {
public:
    void begin() { *this = {}; }
    // put: bytes of files that the pass has put by now. running: of the Clock.
    void moved(qint64 put, std::chrono::milliseconds running);
    // For so many bytes, upwards to whole ones; no value before the pace is known. A number that was told stays until
    // it is clearly wrong.
    std::optional<int> minutes(qint64 left);

private:
    std::optional<std::chrono::milliseconds> m_begun;
    std::chrono::milliseconds m_last{0};
    qint64 m_put = 0;
    double m_rate = 0; // bytes a millisecond
    std::optional<int> m_told;
};

} // namespace lumora
