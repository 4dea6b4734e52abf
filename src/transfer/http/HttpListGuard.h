#pragma once

#include "transfer/http/ServerList.h"

namespace lumora {

struct SessionState;

// How the lists of the lab's web server are asked for and believed. As built in, part of a name stands for the whole
// one, and the count of missing files is the number of the next list, which there is up to 3. Careful: whole names
// alone prove, and where there is no list of that number, or the last one could not be read, the first one's is asked
// for again: once before anything is posted again, and in the next attempt.
class HttpListGuard {
public:
    explicit HttpListGuard(const SessionState& state)
        : m_state(state) {}

    static constexpr int first = 1; // number of the first attempt's list

    ListMatch match() const;
    // After the posts of an attempt, whose list has this verdict.
    bool asksAgain(ServerVerdict verdict) const;
    // After an attempt that has left so many files missing by the list of this verdict.
    int nextList(int missing, ServerVerdict verdict) const;

private:
    const SessionState& m_state;
};

} // namespace lumora
