#pragma once

#include <QtGlobal>

#include <chrono>
#include <deque>
#include <optional>

namespace lumora {

struct Platform;
struct SessionState;

// Tells when a sending waits for a server in vain: two files in a row, or reconnects of a check, whose connects all ran
// into the time limit; a pass that moves under 1,000 bytes a second for five minutes, or a check that moves under 1,000
// bytes in all that time. As built in, a sending waits without limit.
class SilenceLimit {
public:
    explicit SilenceLimit(const SessionState& state)
        : m_state(state) {}

    enum class Work { Pass, Check };
    void begin(Work work = Work::Pass);
    // After each file of a pass and each reconnect of a check. all: every try to connect ran into the time limit.
    void connectsTimedOut(bool all);
    // Told about once a second while the pass runs. bytes: a count that only grows, with what a skipped file has.
    // running: of the Clock. A longer gap counts for a minute, since the program may have been held.
    void moved(qint64 bytes, std::chrono::milliseconds running);
    bool over() const;
    // moved() with what the line has moved by now, and skipped; then over().
    bool overAfter(const Platform& platform, qint64 skipped = 0);

private:
    struct Sample {
        std::chrono::milliseconds at{0};
        qint64 bytes = 0;
    };

    const SessionState& m_state;
    qint64 m_least = 0;                              // bytes of five minutes
    std::optional<std::chrono::milliseconds> m_told; // the last time that was told
    std::chrono::milliseconds m_passed{0};           // since the begin, as far as it counts
    std::deque<Sample> m_samples;                    // of the last five minutes, and one older
    int m_silentFiles = 0;                           // in a row
    bool m_tooSlow = false;
};

} // namespace lumora
