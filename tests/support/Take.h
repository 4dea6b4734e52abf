#pragma once

#include "common/Result.h"

#include <stdexcept>
#include <utility>

namespace lumora {

// What a call has given. A failure ends the test, which fails with its message.
template <class T>
T take(Result<T> result) {
    if (!result)
        throw std::runtime_error(result.failure().message.toStdString());
    return std::move(*result);
}

inline void take(const Result<void>& result) {
    if (!result)
        throw std::runtime_error(result.failure().message.toStdString());
}

} // namespace lumora
