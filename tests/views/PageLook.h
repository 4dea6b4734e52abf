#pragma once

#include "Walk.h"

#include "views/kit/Theme.h"
#include "views/window/MainWindow.h"

#include <QTimer>
#include <QWidget>

#include <gtest/gtest.h>

#include <ostream>
#include <vector>

namespace lumora {

using namespace Qt::StringLiterals;

inline void PrintTo(const Screen& screen, std::ostream* out) {
    *out << screen.size.width() << "x" << screen.size.height() << (screen.english ? " English" : " Hebrew");
}

// Each page in each state, in both languages, on a small, a wide and a tall screen: looked at for what a person could
// stumble over, and photographed where LUMORA_SHOTS asks for it. LUMORA_SCREENS=all brings the smallest ones and the
// largest screen, and each in both languages; one of contrast and one of a desktop with large letters stand among them.
class PageLook : public ::testing::TestWithParam<Screen> {
public:
    static auto screens() {
        std::vector<Screen> all = {{{1024, 768}, false}, {{1024, 768}, true},        {{1920, 1080}, false},
                                   {{1080, 1920}, true}, {{1024, 768}, false, true}, {{1024, 768}, true, false, 20}};
        if (qEnvironmentVariable("LUMORA_SCREENS") == u"all") {
            all.insert(all.end(), {{{1920, 1080}, true},
                                   {{1080, 1920}, false},
                                   {{1024, 768}, true, true},
                                   {{1024, 768}, false, false, 20}});
            for (const QSize& size : {QSize(640, 512), QSize(800, 600), QSize(3840, 2160)})
                all.insert(all.end(), {{size, false}, {size, true}});
        }
        return ::testing::ValuesIn(all);
    }
    static std::string nameOf(const ::testing::TestParamInfo<Screen>& info) {
        const QSize size = info.param.size;
        return std::to_string(size.width()) + "x" + std::to_string(size.height()) +
               (info.param.english ? "English" : "Hebrew") + (info.param.contrast ? "Contrast" : "") +
               (info.param.letters > 0 ? "Large" : "");
    }

protected:
    void SetUp() override { Theme::setLetters(GetParam().letters); }
    void TearDown() override { Theme::setLetters(0); }

    void look(Walk& walk, const QString& name) {
        walk.settle(60);
        walk.shot(u"%1-%2%3%4"_s.arg(name, GetParam().english ? u"en" : u"he",
                                     GetParam().contrast ? u"-contrast"_s : QString(),
                                     GetParam().letters > 0 ? u"-large"_s : QString()));
        for (const QString& fault : walk.faults())
            ADD_FAILURE() << qPrintable(name) << ": " << qPrintable(fault);
    }
    void go(Walk& walk, const QString& route) {
        walk.go(route, [&](const QString& name) { look(walk, name); });
    }
    // The picker waits in an event loop of its own below the press, as a question does: it is looked at from within,
    // and cancelled.
    void lookAtPicker(Walk& walk, const QString& page, const QString& button, const QString& name,
                      const QString& answer = u"pickerCancel"_s) {
        QTimer timer;
        QObject::connect(&timer, &QTimer::timeout, &timer, [&] {
            auto* cancel = walk.program().window().findChild<QWidget*>(answer);
            if (!cancel || !cancel->isVisible())
                return;
            timer.stop();
            look(walk, name);
            EXPECT_EQ(ControlFinder::whyNotPressable(*cancel), QString());
            QMetaObject::invokeMethod(cancel, "click");
        });
        timer.start(400);
        walk.press(page, button);
        EXPECT_FALSE(timer.isActive()) << "no picker came";
    }
};

} // namespace lumora
