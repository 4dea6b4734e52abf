#include "common/Background.h"

#include <QCoreApplication>

#include <gtest/gtest.h>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <thread>

namespace lumora {
namespace {

// As main() ends: the application goes, the statics behind it.
void endProgram(std::chrono::milliseconds work) {
    runInBackground([work] {
        std::this_thread::sleep_for(work);
        std::fputs("done", stderr);
    });
    QCoreApplication::instance()->~QCoreApplication();
    std::exit(3);
}

TEST(BackgroundDeathTest, TheEndOfTheProgramWaitsForWorkButNotForever) {
    EXPECT_EXIT(endProgram(std::chrono::milliseconds(100)), testing::ExitedWithCode(3), "done");
    EXPECT_EXIT(endProgram(std::chrono::hours(1)), testing::ExitedWithCode(3), "^$");
}

} // namespace
} // namespace lumora
