// The renderer in the place of a peer. Instead of "jpeg" or "pixels": "floor" decodes to planes and encodes planes of
// the print's size, no drawing between; "planes" makes what the floor reads.
#include "Floor.h"
#include "Job.h"

#include "editing/render/EditedPicture.h"
#include "imaging/PictureMemory.h"
#include "order/EditRecord.h"
#include "session/SessionState.h"

#include <QGuiApplication>

using namespace Qt::StringLiterals;

using namespace lumora;

namespace {

EditFields recordOf(const Job& job) {
    EditFields edit;
    UnpackEditState(EditRecord::newPicture(), edit);
    edit.RotationCode = 180 + static_cast<int>(Job::degrees);
    edit.ZoomPercent = static_cast<std::int16_t>(job.zoom);
    edit.PanX = 225;
    edit.PanY = 150;
    if (job.pixelsOnly)
        return edit;
    edit.GainR = Job::red;
    edit.GainB = Job::blue;
    edit.FrameFolder = u"bench"_s;
    edit.FrameName = u"f"_s;
    edit.TextOn = 1;
    edit.TextBody = QString::fromLatin1(Job::caption);
    edit.TextFont = u"DejaVu Sans"_s;
    edit.TextFontSize = 24;
    edit.TextX = 32;
    edit.TextY = 230;
    edit.TextRed = edit.TextGreen = 255;
    edit.TextBlue = 0;
    return edit;
}

} // namespace

int main(int argc, char** argv) {
    keepPictureMemory();
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const Job job = Job::of(argc, argv);
    const std::string mode = argv[2];
    const EditFields edit = recordOf(job);
    std::optional<QGuiApplication> application;
    if (mode == "jpeg" || mode == "planes")
        application.emplace(argc, argv);
    for (const auto& file : job.files) {
        EditedPrint print;
        print.file = file;
        print.paper = {10, 15};
        print.framesFolder = job.frames.parent_path();
        const auto planes = job.out / (file.stem().string() + ".planes");
        if (mode == "pixels") {
            const auto paper = renderEditedPrint(print, edit);
            if (!paper || !paper->image().save(QString::fromStdString(job.target(file).string()), "PNG"))
                fail(file);
        } else if (mode == "floor") {
            writeBytes(job.target(file), floorOf(file, {Job::paperWidth, Job::paperHeight}, planes));
        } else {
            const auto bytes = renderEditedPrintToJpeg(print, edit);
            if (!bytes)
                fail(file);
            if (mode == "planes")
                writeFloorPlanes(*bytes, planes);
            else
                writeBytes(job.target(file), *bytes);
        }
    }
    printPeakMemory();
    return 0;
}
