#pragma once

#include <QDateTime>

#include <deque>

namespace lumora {

struct SessionState;

// Tells when a sending waits for a server that will not take it: two files in a row whose connects all ran into the
// time limit, or a pass that moves under 1,000 bytes a second for five minutes. As built in, a sending waits for ever.
class SilenceLimit {
public:
    explicit SilenceLimit(const SessionState& state)
        : m_state(state) {}

    // A pass begins.
    void begin();
    // A file of the pass is done with: did all its connects run into the time limit?
    void connectsTimedOut(bool all);
    // Told about once a second while the pass runs. bytes: a count that only grows, with what a skipped file has.
    void moved(qint64 bytes, const QDateTime& now);
    bool over() const;

private:
    struct Sample {
        QDateTime time;
        qint64 bytes = 0;
    };

    const SessionState& m_state;
    std::deque<Sample> m_samples; // of the last five minutes, and one older
    int m_silentFiles = 0;        // in a row
    bool m_tooSlow = false;
};

} // namespace lumora
