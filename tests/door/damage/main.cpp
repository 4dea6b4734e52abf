// Plays damaged files of all kinds through the door: each ends as a picture that is whole or as a failure, within the
// limits, and leaves nothing else. door_damage [--count 1000] [--seed 1] [--program PATH]

#include "common/HostFile.h"
#include "door/DoorDecoder.h"
#include "imaging/files/JpegCheck.h"
#include "samples/SamplePictureFiles.h"

#include <QTemporaryDir>

#include <cstdio>
#include <map>
#include <random>
#include <string>

using namespace lumora;
namespace fs = std::filesystem;

namespace {

QByteArray damaged(QByteArray bytes, std::mt19937& random) {
    const auto place = [&](qsizetype size) { return static_cast<qsizetype>(random() % static_cast<unsigned>(size)); };
    for (unsigned left = 1 + random() % 3; left > 0 && bytes.size() > 1; --left) {
        // Headers are short and decide much.
        const qsizetype at = place(random() % 2 == 0 ? std::min<qsizetype>(bytes.size(), 700) : bytes.size());
        const unsigned way = random() % 8;
        if (way == 0)
            bytes.truncate(at);
        else if (way == 1)
            bytes.remove(at, 1 + place(64));
        else if (way == 2)
            bytes.insert(at, bytes.mid(place(bytes.size()), 1 + place(64)));
        else
            bytes[at] = static_cast<char>(random() % 4 == 0 ? 0xFF : random());
    }
    return bytes;
}

} // namespace

int main(int argc, char** argv) {
    std::map<std::string, std::string> options{{"--count", "1000"}, {"--seed", "1"}, {"--program", LUMORA_DOOR}};
    for (int i = 1; i + 1 < argc; i += 2)
        options[argv[i]] = argv[i + 1];
    const int count = std::stoi(options["--count"]);
    std::mt19937 random(static_cast<unsigned>(std::stoi(options["--seed"])));
    const auto files = samplePictureFiles();
    const QTemporaryDir folder;
    const fs::path home = folder.path().toStdString();
    const DoorDecoder decoder(options["--program"], {10, qint64(1) << 30});
    std::map<std::string, int> ends;
    for (int i = 0; i < count; ++i) {
        const auto& [name, whole] = files[static_cast<std::size_t>(i) % files.size()];
        const QByteArray bytes = damaged(whole, random);
        fs::remove(home / "target.jpg");
        if (!writeWholeFile(home / "source", bytes))
            return 2;
        const auto made = decoder.make(home / "source", home / "target.jpg");
        const bool decoded = made && *DoorDecoder::needOf(home / "source") >= DoorNeed::Turn;
        const bool there = fs::exists(home / "target.jpg");
        const auto left = std::distance(fs::directory_iterator(home), fs::directory_iterator());
        if (there != made.ok() || left != (there ? 2 : 1) || (decoded && !checkJpegDecodes(home / "target.jpg"))) {
            (void)writeWholeFile("door-fault-" + std::to_string(i), bytes);
            std::printf("%s, variant %d of seed %s is a fault; door-fault-%d has it\n", name.c_str(), i,
                        options["--seed"].c_str(), i);
            return 1;
        }
        ++ends[made ? "made" : "refused, kind " + std::to_string(static_cast<int>(made.failure().kind))];
    }
    for (const auto& [end, times] : ends)
        std::printf("%s: %d\n", end.c_str(), times);
    return 0;
}
