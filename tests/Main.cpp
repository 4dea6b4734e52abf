#include <QGuiApplication>

#include <gtest/gtest.h>

// The main() of every suite without one of its own. Fonts, which sheets and captions are drawn with, need an
// application.
int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    const QGuiApplication application(argc, argv);
    return RUN_ALL_TESTS();
}
