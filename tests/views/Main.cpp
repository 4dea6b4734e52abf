#include "views/window/Application.h"

#include <QTimer>

#include <gtest/gtest.h>

namespace {

// Where the test before has ended its program, each inner event loop would end at once, until one of the application's
// own has run.
class FreshLoop : public ::testing::EmptyTestEventListener {
    void OnTestStart(const ::testing::TestInfo&) override {
        QTimer::singleShot(0, [] { QCoreApplication::exit(); });
        QCoreApplication::exec();
    }
};

} // namespace

int main(int argc, char** argv) {
    ::testing::InitGoogleTest(&argc, argv);
    // No test looks at what a person's desktop has set.
    qputenv("QT_QPA_PLATFORM", "offscreen");
    lumora::Application application(argc, argv);
    ::testing::UnitTest::GetInstance()->listeners().Append(new FreshLoop);
    return RUN_ALL_TESTS();
}
