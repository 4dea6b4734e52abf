// A correction of a red eye on a picture of 50 megapixels with a circle of 60 pixels: the processor time of the press,
// beside the same rule on a copy of the whole picture with an overview scaled anew, which is how it is done where
// pictures are values.

#include "Timing.h"
#include "common/HostFile.h"
#include "editing/redeye/RedI.h"
#include "samples/SamplePhotographs.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/TestPlatform.h"

#include <QGuiApplication>
#include <QPainter>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <filesystem>
#include <thread>
#include <vector>

using namespace Qt::StringLiterals;

using namespace lumora;

namespace {

constexpr PictureSize fiftyMegapixels{8660, 5773};
constexpr int circle = 60;

QPoint eye(int round) {
    return {500 + round * 137 % (fiftyMegapixels.width - 1000), 400 + round * 211 % (fiftyMegapixels.height - 800)};
}

void print(const char* what, const std::vector<double>& times) {
    const Spread spread = spreadOf(times);
    std::printf("%-58s median %8.2f ms   lowest %8.2f   highest %8.2f\n", what, spread.median, spread.lowest,
                spread.highest);
}

} // namespace

int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QGuiApplication application(argc, argv);
    const int rounds = argc > 1 ? std::max(1, std::atoi(argv[1])) : 21;

    TestPlatform machine;
    SessionState state;
    state.DiskRoot = machine.drives.programRoot();
    PageChain chain(machine.pump);
    chain.registerPage(PageId::RedI, [&] { return std::make_unique<RedI>(state, machine.platform, chain); });
    {
        Bitmap photograph = samplePhotograph(fiftyMegapixels, 1);
        QPainter painter(&photograph.image());
        for (int round = 0; round < rounds; ++round) {
            painter.setBrush(QColor(200, 30, 40));
            painter.drawEllipse(eye(round), circle / 2 - 4, circle / 2 - 4);
        }
        painter.end();
        const auto file = encodeJpeg(photograph, 92);
        if (!file || !writeWholeFile(machine.drives.dataFolder() / "large.jpg", *file))
            return 1;
    }

    auto& page = chain.load<RedI>();
    const Times opening = timed([&] { page.open(DrivePath(u"C:\\large.jpg"_s)); });
    if (page.picture().Picture1.isNull())
        return 1;
    std::printf("opening 50 megapixels: %.0f ms, processor %.0f ms\n", opening.wall, opening.processor);
    // The customer looks for the eye.
    const Times background = timed([] { std::this_thread::sleep_for(std::chrono::seconds(5)); });
    std::printf("the undo copy in the background: processor %.0f ms\n", background.processor);

    std::vector<double> ours;
    std::vector<double> oursWall;
    std::vector<double> undo;
    std::vector<double> copied;
    for (int round = 0; round < rounds; ++round) {
        const QPoint at = eye(round);
        page.Picture1_MouseDown(RedI::Button::Left, at);
        page.Picture1_MouseUp(at);
        while (page.sight().circle().width() != circle)
            page.Combo1_Change(page.sight().circle().width() < circle ? 0 : 2);
        const Times press = timed([&] { page.Image2_Click(); });
        ours.push_back(press.processor);
        oursWall.push_back(press.wall);
        if (page.controls().List1.isEmpty()) {
            std::fprintf(stderr, "nothing was corrected\n");
            return 1;
        }
        undo.push_back(timed([&] { page.Image7_Click(); }).processor);

        QStringList changed;
        QImage overview;
        const Times onCopy = timed([&] {
            Bitmap copy(page.picture().Picture1.image().copy());
            const RedEye::Peak peak = RedEye::findPeak(copy, at);
            changed = RedEye::correct(copy, page.sight().circle(), peak.ratio(), 0);
            overview = copy.image().scaled(page.picture().Picture3.image().size(), Qt::IgnoreAspectRatio,
                                           Qt::SmoothTransformation);
        });
        copied.push_back(onCopy.processor);
        if (changed.isEmpty() || overview.isNull())
            return 1;
    }
    print("a correction, processor time", ours);
    print("the same, elapsed", oursWall);
    print("one step back, processor time", undo);
    print("the rule on a whole copy, overview scaled by Qt", copied);
    return 0;
}
