#include <QGuiApplication>

#include <gtest/gtest.h>

// Captions need the fonts that a QGuiApplication loads.
int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    const QGuiApplication application(argc, argv);
    return RUN_ALL_TESTS();
}
