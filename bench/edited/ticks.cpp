// edited_ticks FRAMES FILE [SCALE]: what one tick of a held button takes in the editor, with frame and caption, and
// what opening the picture takes beside the scaled decode alone. Times are processor time of this thread.
#include "Floor.h"
#include "Timing.h"
#include "editing/render/EditedPicture.h"
#include "imaging/scaling/Resample.h"
#include "order/EditRecord.h"
#include "session/SessionState.h"

#include <QGuiApplication>

#include <cmath>
#include <cstdio>
#include <functional>

using namespace Qt::StringLiterals;

using namespace lumora;

namespace {

void tell(const char* what, const char* unit, const std::vector<double>& times) {
    const Spread spread = spreadOf(times);
    std::printf("%-36s median %6.2f%s, worst %6.2f%s\n", what, spread.median, unit, spread.highest, unit);
}

} // namespace

int main(int argc, char** argv) {
    if (argc < 3)
        return 2;
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(argc, argv);
    const std::filesystem::path file = argv[2];
    const double scale = argc > 3 ? std::atof(argv[3]) : 1;
    constexpr PaperSize paper{10, 15};

    EditFields edit;
    UnpackEditState(EditRecord::newPicture(), edit);
    edit.FrameFolder = u"bench"_s;
    edit.FrameName = u"f"_s;
    edit.TextOn = 1;
    edit.TextBody = u"שלום Lumora 2024\r\nמזל טוב"_s;
    edit.TextFont = u"DejaVu Sans"_s;
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
        const Times decode = timed([&] {
            DroppedPlanes dropped;
            if (!readerOf(file)->readPlanes(decodeDenominator(size, wanted), dropped))
                fail(file);
        });
        ratios.push_back(timed(open).thread / decode.thread);
    }
    tell("opening and showing / scaled decode", "", ratios);

    const auto ticks = [&](const char* what, const std::function<void()>& step) {
        const EditFields before = edit;
        std::vector<double> times;
        for (int i = 0; i < 85; ++i)
            times.push_back(timed([&] {
                                step();
                                if (preview->render(edit, frame, scale).isNull())
                                    fail("not drawn");
                            }).thread);
        tell(what, " ms", times);
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
