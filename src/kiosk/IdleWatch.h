#pragma once

#include <QEvent>

#include <chrono>

namespace lumora {

class Clock;

// Whether anybody is still there: what counts as a sign of life, when the person is asked, when the page is given up.
// By the running clock, asked each second.
class IdleWatch {
public:
    // Between the question and its end.
    static constexpr std::chrono::seconds answerTime{20};

    enum class Phase { Alive, Asking, Over };
    // What the page in front makes of a silence.
    enum class Silence {
        MayNotEnd, // it works by itself
        NeedsNone, // nothing on it comes of a person
        IsAsked,   // something would be lost
        IsEnough,  // nothing would be lost
    };

    IdleWatch(const Clock& clock, std::chrono::seconds idle)
        : m_clock(clock)
        , m_idle(idle)
        , m_since(now()) {}

    static bool isSignOfLife(QEvent::Type event);

    // A person did something; a question is answered by it.
    void sign();
    Phase look(Silence silence);
    Phase phase() const { return m_phase; }
    int secondsLeft() const; // of the question

private:
    std::chrono::milliseconds now() const;

    const Clock& m_clock;
    std::chrono::seconds m_idle;
    Phase m_phase = Phase::Alive;
    std::chrono::milliseconds m_since{0}; // the last sign of life, or the question
};

} // namespace lumora
