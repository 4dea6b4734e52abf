#include "order/EditRecord.h"

#include "editing/render/EditedPicture.h"
#include "session/SessionState.h"

#include <QDir>
#include <QGuiApplication>
#include <QImage>
#include <QTemporaryDir>

#include <cstdint>
#include <cstdlib>

using namespace lumora;

namespace {

struct Pictures {
    QGuiApplication application;
    QTemporaryDir folder;
    std::filesystem::path file = folder.path().toStdString() + "/picture.png";
    std::filesystem::path frames = folder.path().toStdString() + "/frames";

    Pictures(int& argc, char** argv)
        : application(argc, argv) {
        QDir().mkpath(QString::fromStdString((frames / "aa").string()));
        QImage picture(24, 16, QImage::Format_RGB32);
        picture.fill(qRgb(200, 100, 50));
        QImage frame(45, 30, QImage::Format_RGB32);
        frame.fill(Qt::black);
        frame.setPixel(3, 3, 0xFF0A0000);
        const auto save = [](const QImage& image, const std::filesystem::path& path) {
            if (!image.save(QString::fromStdString(path.string())))
                std::abort();
        };
        save(picture, file);
        save(frame, frames / "aa" / "001.bmp");
        save(frame, frames / "aa" / "k001.bmp");
    }
};

} // namespace

// Records come out of files on the disk and out of old orders. Whatever the 200 characters: the record packs to 200
// characters again and soon to the same ones, and preview and print come out in their own size.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static int argc = 1;
    static char name[] = "fuzz";
    static char* argv[] = {name, nullptr};
    qputenv("QT_QPA_PLATFORM", "offscreen");
    static const Pictures pictures(argc, argv);

    const QString record = QString::fromUtf8(reinterpret_cast<const char*>(data), static_cast<qsizetype>(size));
    EditFields edit;
    UnpackEditState(record, edit);
    EditFields again = edit;
    QString packed[3];
    for (QString& text : packed) {
        PackEditState(again, QString(), QString());
        text = again.EditState;
        if (text.size() != EditRecord::width)
            std::abort();
        UnpackEditState(text, again);
    }
    if (packed[1] != packed[2])
        std::abort();

    constexpr PaperSize paper{1, 2};
    auto preview = EditedPreview::open(pictures.file, paper, edit.ZoomPercent,
                                       edit.ToneFlag == 1 ? EditedPreview::Tone::Grey : EditedPreview::Tone::Colour);
    if (!preview)
        std::abort();
    EditFields placed = edit;
    preview->placeAtCentreIfUnset(placed);
    const Bitmap shown = preview->render(placed, loadFrame(pictures.frames, placed, FrameUse::Preview));
    EditedPrint print;
    print.file = pictures.file;
    print.paper = paper;
    print.framesFolder = pictures.frames;
    const auto printed = renderEditedPrint(print, edit);
    if (shown.width() != 450 || shown.height() != 225 || !printed || printed->width() != 200 ||
        printed->height() != 100)
        std::abort();
    return 0;
}
