// Runs the renderers without an order, for support and measurements.

#include "assembly/PaperResize.h"
#include "common/HostFile.h"
#include "common/NoScreen.h"
#include "editing/render/EditedPicture.h"
#include "editing/render/PlainPrint.h"
#include "imaging/PictureMemory.h"
#include "imaging/files/PictureFile.h"
#include "order/EditRecord.h"
#include "session/SessionState.h"

#include <QBuffer>
#include <QColor>
#include <QGuiApplication>

#include <chrono>
#include <cstdio>
#include <filesystem>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

using namespace Qt::StringLiterals;

using namespace lumora;
namespace fs = std::filesystem;

namespace {

enum ExitCode { allWell = 0, pictureFailed = 1, notUnderstood = 2 };

constexpr std::string_view help =
    R"(Usage: lumora-render MODE [options] FILE...

Modes:
  plain    the picture scaled to the paper as an order without edits prints it (needs --paper)
  small    the small picture of a cell, as PNG
  preview  what the editor shows of an edited picture, as PNG (needs --paper)
  print    the print of an edited picture (needs --paper)

Options:
  --paper 10/15    the paper, short side and long side in centimetres
  --record TEXT    the edit record for preview and print; blanks follow (default: a picture that was not edited);
                   with red eyes corrected, FILE is the corrected copy
  --frames FOLDER  the folder that holds the categories of frames (default: no frames)
  --background RRGGBB  what an uncovered part of the paper shows (default: the whole picture, stretched)
  --size 115       pixels of the cell for the mode small (default 115)
  --png            the pixels before JPEG, as PNG
  --out FOLDER     where results go (default: the current folder); they keep the base name
  --time           prints a line a file: milliseconds of decode, draw and encode
  --help, --version

Exit status: 0 all pictures done, 1 a picture failed (the others are done all the same), 2 the call can't be understood.
)";

struct Request {
    enum class Mode { Plain, Small, Preview, Print } mode = Mode::Plain;
    std::optional<PaperSize> paper;
    EditFields edit;
    fs::path frames;
    std::optional<QColor> background;
    int cell = 115;
    bool png = false;
    bool time = false;
    fs::path out = ".";
    std::vector<fs::path> files;

    bool isEdited() const { return mode == Mode::Preview || mode == Mode::Print; }
    bool writesPng() const { return png || mode == Mode::Small || mode == Mode::Preview; }
};

void complain(std::string_view text) {
    std::fprintf(stderr, "lumora-render: %.*s\n", static_cast<int>(text.size()), text.data());
}

void complain(const QString& text) {
    complain(std::string_view(text.toUtf8().constData()));
}

// No value if the arguments are wrong; the reason is printed.
std::optional<Request> understood(const std::vector<std::string>& arguments) {
    Request request;
    std::string modeName;
    UnpackEditState(EditRecord::newPicture(), request.edit);
    const auto refuse = [](const std::string& reason) {
        complain(reason + "; --help tells more");
        return std::nullopt;
    };
    bool optionsEnded = false;
    for (std::size_t i = 0; i < arguments.size(); ++i) {
        const std::string& argument = arguments[i];
        if (optionsEnded || !argument.starts_with("--")) {
            if (modeName.empty())
                modeName = argument;
            else
                request.files.emplace_back(argument);
            continue;
        }
        const std::size_t equals = argument.find('=');
        const std::string name = argument.substr(0, equals);
        std::optional<std::string> value;
        if (equals != std::string::npos)
            value = argument.substr(equals + 1);
        const bool takesValue = name == "--paper" || name == "--size" || name == "--out" || name == "--record" ||
                                name == "--frames" || name == "--background";
        if (takesValue && !value && i + 1 < arguments.size())
            value = arguments[++i];
        if (takesValue != value.has_value() && (takesValue || value))
            return refuse(takesValue ? name + " needs a value" : name + " takes no value");

        if (argument == "--") {
            optionsEnded = true;
        } else if (name == "--png") {
            request.png = true;
        } else if (name == "--time") {
            request.time = true;
        } else if (name == "--out") {
            request.out = *value;
        } else if (name == "--record") {
            UnpackEditState(QString::fromUtf8(value->c_str()), request.edit);
        } else if (name == "--frames") {
            std::error_code ignored;
            if (!fs::is_directory(*value, ignored))
                return refuse("--frames " + *value + " is no folder");
            request.frames = *value;
        } else if (name == "--background") {
            const QColor colour(u'#' + QString::fromUtf8(value->c_str()));
            if (value->size() != 6 || !colour.isValid())
                return refuse("--background " + *value + " is no colour; six hexadecimal digits are wanted, as FF8000");
            request.background = colour;
        } else if (name == "--paper") {
            request.paper = PaperSize::ofText(QString::fromUtf8(value->c_str()));
            if (!request.paper)
                return refuse("--paper " + *value + " is no paper size; two sides in centimetres are wanted, as 10/15");
        } else if (name == "--size") {
            bool isNumber = false;
            request.cell = QByteArray::fromStdString(*value).toInt(&isNumber);
            if (!isNumber || request.cell < 1 || request.cell > 10000)
                return refuse("--size " + *value + " is no size; 1 to 10000 pixels are wanted");
        } else {
            return refuse("unknown option " + name);
        }
    }
    using Mode = Request::Mode;
    const std::map<std::string, Mode> modes{
        {"plain", Mode::Plain}, {"small", Mode::Small}, {"preview", Mode::Preview}, {"print", Mode::Print}};
    const auto mode = modes.find(modeName);
    if (mode == modes.end())
        return refuse((modeName.empty() ? "no mode is given" : "unknown mode " + modeName) +
                      "; plain, small, preview or print");
    request.mode = mode->second;
    if (request.mode != Mode::Small && !request.paper)
        return refuse("the mode " + modeName + " needs --paper");
    if (request.files.empty())
        return refuse("no file is given");
    return request;
}

// A result never overwrites a customer's picture or another result.
bool targetsAreFree(const Request& request, const std::vector<fs::path>& targets) {
    std::map<fs::path, fs::path> sourceOf;
    for (std::size_t i = 0; i < targets.size(); ++i) {
        const auto [other, isNew] = sourceOf.emplace(targets[i], request.files[i]);
        if (!isNew) {
            complain(targets[i].string() + " would be the result of both " + other->second.string() + " and " +
                     request.files[i].string());
            return false;
        }
        for (const fs::path& source : request.files) {
            std::error_code ignored;
            if (fs::equivalent(targets[i], source, ignored)) {
                complain("the result would overwrite the picture " + source.string() +
                         "; give another folder with --out");
                return false;
            }
        }
    }
    return true;
}

double millisecondsSince(std::chrono::steady_clock::time_point start) {
    return std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count();
}

Result<QByteArray> pngOf(const Bitmap& picture, const fs::path& source) {
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    if (!onWhite(picture).image().save(&buffer, "PNG"))
        return Failure{Failure::Kind::Other, QString::fromStdString(source.string()) + u": can't be made a PNG"_s};
    return bytes;
}

Result<QByteArray> previewPng(const Request& request, const fs::path& source, PictureTimes& times) {
    EditFields edit = request.edit;
    auto start = std::chrono::steady_clock::now();
    auto preview = EditedPreview::open(source, *request.paper, edit.ZoomPercent,
                                       edit.ToneFlag == 1 ? EditedPreview::Tone::Grey : EditedPreview::Tone::Colour);
    times.decode = millisecondsSince(start);
    if (!preview)
        return preview.failure();
    if (request.background)
        preview->setBackground(*request.background);
    preview->placeAtCentreIfUnset(edit);
    start = std::chrono::steady_clock::now();
    const Bitmap shown = preview->render(edit, loadFrame(request.frames, edit, FrameUse::Preview));
    times.draw = millisecondsSince(start);
    start = std::chrono::steady_clock::now();
    auto bytes = pngOf(shown, source);
    times.encode = millisecondsSince(start);
    return bytes;
}

Result<QByteArray> editedPrint(const Request& request, const fs::path& source, PictureTimes& times) {
    EditedPrint print;
    print.file = source;
    print.paper = *request.paper;
    print.framesFolder = request.frames;
    print.background = request.background;
    if (!request.png)
        return renderEditedPrintToJpeg(print, request.edit, &times);
    const auto paper = renderEditedPrint(print, request.edit, &times);
    if (!paper)
        return paper.failure();
    const auto start = std::chrono::steady_clock::now();
    auto bytes = pngOf(*paper, source);
    times.encode = millisecondsSince(start);
    return bytes;
}

Result<QByteArray> scaled(const Request& request, const fs::path& source, PictureTimes& times) {
    const auto size = readPictureSize(source);
    if (!size)
        return size.failure();
    const bool small = request.mode == Request::Mode::Small;
    const PictureSize wanted = small ? smallPictureSize(*size, request.cell) : paperPictureSize(*size, *request.paper);
    if (!small && !request.png)
        return scalePictureToJpeg(source, wanted, printQuality, &times);
    auto start = std::chrono::steady_clock::now();
    const auto picture = loadPictureScaled(source, wanted);
    times.draw = millisecondsSince(start);
    if (!picture)
        return picture.failure();
    start = std::chrono::steady_clock::now();
    auto bytes = pngOf(*picture, source);
    times.encode = millisecondsSince(start);
    return bytes;
}

Result<void> render(const Request& request, const fs::path& source, const fs::path& target, PictureTimes& times) {
    const auto bytes = request.mode == Request::Mode::Preview ? previewPng(request, source, times)
                       : request.mode == Request::Mode::Print ? editedPrint(request, source, times)
                                                              : scaled(request, source, times);
    return bytes ? writeWholeFile(target, *bytes) : bytes.failure();
}

} // namespace

int main(int argc, char** argv) {
    keepPictureMemory();
    const std::vector<std::string> arguments(argv + 1, argv + argc);
    for (const std::string& argument : arguments) {
        if (argument == "--help" || argument == "--version") {
            std::fputs(argument == "--help" ? help.data() : "lumora-render " LUMORA_VERSION "\n", stdout);
            return allWell;
        }
    }
    const auto request = understood(arguments);
    if (!request)
        return notUnderstood;
    std::error_code ignored;
    if (!fs::is_directory(request->out, ignored)) {
        complain(request->out.string() + " is no folder");
        return notUnderstood;
    }
    // The application object, which loads fonts, starts slowly and is made only if text is drawn.
    std::optional<QGuiApplication> application;
    if (request->isEdited() && request->edit.TextOn == 1) {
        goWithoutScreen();
        application.emplace(argc, argv);
    }
    std::vector<fs::path> targets;
    for (const fs::path& file : request->files)
        targets.push_back(request->out / (file.stem().string() + (request->writesPng() ? ".png" : ".jpg")));
    if (!targetsAreFree(*request, targets))
        return notUnderstood;

    int code = allWell;
    for (std::size_t i = 0; i < targets.size(); ++i) {
        PictureTimes times;
        if (const auto done = render(*request, request->files[i], targets[i], times); !done) {
            complain(done.failure().message);
            code = pictureFailed;
        } else if (request->time) {
            // A scaled load decodes and draws in one pass; the two times can't be told apart.
            if (request->writesPng() && !request->isEdited())
                std::printf("%s decode and draw %.1f encode %.1f\n", request->files[i].c_str(), times.draw,
                            times.encode);
            else
                std::printf("%s decode %.1f draw %.1f encode %.1f\n", request->files[i].c_str(), times.decode,
                            times.draw, times.encode);
        }
    }
    return code;
}
