// lumora-door SOURCE TARGET.jpg: the program that the door starts as a process without rights for each picture, and,
// called by hand, the door for one file.
//
//   lumora-door photo.heic photo.jpg

#include "door/DoorChild.h"
#include "door/DoorDecoder.h"

#include <cstdio>
#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

using namespace lumora;
namespace fs = std::filesystem;

namespace {

enum ExitCode { allWell = 0, pictureFailed = 1, notUnderstood = 2 };

constexpr std::string_view help =
    R"(Usage: lumora-door SOURCE TARGET.jpg

Makes an upright JPEG file in sRGB of a picture: JPEG, PNG, HEIC, AVIF, WebP, TIFF, BMP or GIF (its first frame), whatever its
ending says. A JPEG that has only another ending is copied, one that only lies on its side is turned without a loss where its
sides allow that; all others are decoded by a process that can open no file and no line.

  --help, --version

Exit status: 0 all is well, 1 a picture can't be read or the target can't be written, 2 the call can't be understood.
)";

void complain(const QString& text) {
    std::fprintf(stderr, "lumora-door: %s\n", text.toLocal8Bit().constData());
}

} // namespace

int main(int argc, char** argv) {
    if (argc > 1 && (argv[1] == doorChildOption || argv[1] == doorDraftOption || argv[1] == doorListOption))
        runDoorChild(argc, argv);
    std::vector<std::string> arguments(argv + 1, argv + argc);
    const std::string first = arguments.empty() ? std::string() : arguments.front();
    if (first == "--help" || first == "--version") {
        std::fputs(first == "--help" ? help.data() : "lumora-door " LUMORA_VERSION "\n", stdout);
        return allWell;
    }
    if (arguments.size() != 2 || first.starts_with("--")) {
        std::fputs("lumora-door: a source and a target are wanted; --help tells more\n", stderr);
        return notUnderstood;
    }
    std::error_code ignored;
    if (fs::equivalent(arguments[0], arguments[1], ignored)) {
        std::fputs("lumora-door: the result would overwrite the picture\n", stderr);
        return notUnderstood;
    }
    const auto made = DoorDecoder("/proc/self/exe").make(arguments[0], arguments[1]);
    if (!made) {
        complain(made.failure().message);
        return pictureFailed;
    }
    if (made->profileIgnored)
        complain(QString::fromStdString(arguments[0]) + profileIgnoredWords.toString());
    return allWell;
}
