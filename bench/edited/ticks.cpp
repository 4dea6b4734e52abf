// edited_ticks FRAMES FILE [SCALE]: what one tick of a held button takes in the editor, with frame and caption, and
// what opening the picture takes beside the scaled decode alone. Times are processor time of this thread.
#include "Floor.h"
#include "editing/EditRecord.h"
#include "editing/EditedPicture.h"
#include "imaging/Resample.h"
#include "session/SessionState.h"

#include <QGuiApplication>

#include <cmath>
#include <cstdio>
#include <ctime>
#include <functional>

using namespace lumora;

namespace {

double milliseconds() {
    timespec now{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) * 1e3 + static_cast<double>(now.tv_nsec) / 1e6;
}

double timed(const std::function<void()>& work) {
    const double begin = milliseconds();
    work();
    return milliseconds() - begin;
}

void tell(const char* what, std::vector<double> times) {
    std::sort(times.begin(), times.end());
    std::printf("%-36s median %6.2f ms, worst %6.2f ms\n", what, times[times.size() / 2], times.back());
}

} // namespace

int main(int argc, char** argv) {
    if (argc < 3)
        return 2;
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(argc, argv);
    const std::filesystem::path file = argv[2];
    const double scale = argc > 3 ? std::atof(argv[3]) : 1;
    constexpr PaperDigits paper{10, 15};

    EditFields edit;
    UnpackEditState(EditRecord::newPicture(), edit);
    edit.FrameFolder = QStringLiteral("bench");
    edit.FrameName = QStringLiteral("f");
    edit.TextOn = 1;
    edit.TextBody = QStringLiteral("שלום Lumora 2024\r\nמזל טוב");
    edit.TextFont = QStringLiteral("DejaVu Sans");
    edit.TextFontSize = 24;
    edit.TextX = 40;
    edit.TextY = 60;
    edit.GainR = 1.06F;
    const auto frame = loadFrame(argv[1], edit, FrameUse::Preview);
    if (!frame)
        fail("no frame kf.bmp in the category bench");

    std::optional<EditedPreview> preview;
    const auto open = [&] {
        auto opened = EditedPreview::open(file, paper, 100, EditedPreview::Tone::Colour, scale);
        if (!opened)
            fail(file);
        preview = std::move(*opened);
        preview->placeAtCentreIfUnset(edit);
        preview->render(edit, std::nullopt, scale);
    };
    const PictureSize size = readerOf(file)->size();
    const PictureSize work = *workPictureSize(size, 100);
    const PictureSize wanted{static_cast<int>(work.width * scale), static_cast<int>(work.height * scale)};
    std::vector<double> ratios;
    for (int i = 0; i < 7; ++i) {
        const double decode = timed([&] {
            DroppedPlanes dropped;
            if (!readerOf(file)->readPlanes(decodeDenominator(size, wanted), dropped))
                fail(file);
        });
        ratios.push_back(timed(open) / decode);
    }
    std::sort(ratios.begin(), ratios.end());
    std::printf("%-36s median %6.2f, worst %6.2f\n", "opening and showing / scaled decode", ratios[3], ratios[6]);

    const auto ticks = [&](const char* what, const std::function<void()>& step) {
        const EditFields before = edit;
        std::vector<double> times;
        for (int i = 0; i < 85; ++i)
            times.push_back(timed([&] {
                step();
                if (preview->render(edit, frame, scale).isNull())
                    fail("not drawn");
            }));
        tell(what, times);
        edit = before;
    };
    ticks("zoom in, upright", [&] { edit.ZoomPercent = EditStep::zoom(edit.ZoomPercent, 2); });
    ticks("zoom out, upright", [&] { edit.ZoomPercent = EditStep::zoom(edit.ZoomPercent, -2); });
    ticks("turn", [&] { edit.RotationCode = EditStep::turn(edit.RotationCode, 1); });
    edit.RotationCode = 193;
    edit.ZoomPercent = 160;
    ticks("move, turned and zoomed", [&] { edit.PanX = static_cast<std::int16_t>(edit.PanX + 2); });
    ticks("brightness, turned and zoomed",
          [&] { edit.GainR = edit.GainG = edit.GainB = EditStep::gain(edit.GainG, 4); });
    ticks("caption size, turned and zoomed", [&] { ++edit.TextFontSize; });
    ticks("caption move, turned and zoomed", [&] { edit.TextX = static_cast<std::int16_t>(edit.TextX + 2); });
    return 0;
}
