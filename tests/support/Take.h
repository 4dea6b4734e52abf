#pragma once

#include "common/Result.h"

#include <gtest/gtest.h>

namespace lumora {

// What a call has given; after a failure the test fails and an empty value stands for it.
template <class T>
T take(const Result<T>& result) {
    EXPECT_TRUE(result) << (result ? QString() : result.failure().message).toStdString();
    return result ? *result : T();
}

} // namespace lumora
