#include <QGuiApplication>

#include <gtest/gtest.h>

// The order's summary is drawn as a picture, and fonts need an application.
int main(int argc, char** argv) {
    ::testing::InitGoogleTest(&argc, argv);
    QGuiApplication application(argc, argv);
    return RUN_ALL_TESTS();
}
