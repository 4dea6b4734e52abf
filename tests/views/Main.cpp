#include "views/window/Application.h"

#include <gtest/gtest.h>

int main(int argc, char** argv) {
    ::testing::InitGoogleTest(&argc, argv);
    // No test looks at what a person's desktop has set.
    qputenv("QT_QPA_PLATFORM", "offscreen");
    lumora::Application application(argc, argv);
    return RUN_ALL_TESTS();
}
