// A telephone's pictures on the page of pictures: when a first page of them shows, what the door costs where it has
// nothing to do, and an order of many names.

#include "Floor.h"
#include "Timing.h"
#include "assembly/plain/Form2.h"
#include "editing/editor/tFrmNew.h"
#include "imaging/PictureMemory.h"
#include "samples/SamplePhotographs.h"
#include "samples/SamplePictureFiles.h"
#include "selection/pictures/kyoskNew.h"
#include "session/Workspace.h"
#include "support/PageRig.h"

#include <QGuiApplication>
#include <QTemporaryDir>
#include <QTimer>

#include <algorithm>
#include <cstdio>

#include <sys/resource.h>

using namespace Qt::StringLiterals;

using namespace lumora;

namespace {

constexpr int cells = 12;
constexpr int distinct = 4; // the cells go round them: encoding a HEIC takes long, and each cell is decoded anew

// Photographs of 4000 x 3000 as a telephone writes them: quality 50, 4:2:0, P3, and a small picture of 320 pixels.
std::vector<HostPath> photographs(const QTemporaryDir& folder, bool heic) {
    std::vector<HostPath> files;
    for (int i = 0; i < distinct; ++i) {
        const QImage picture = samplePhotograph({4000, 3000}, static_cast<unsigned>(i + 1)).image();
        files.push_back(toHostPath(folder.filePath(u"%1"_s.arg(i))));
        writeBytes(files.back(),
                   heic ? heif(picture, {.profile = p3Profile(), .small = 320, .quality = 50, .chroma = "420"})
                        : saved(picture, "JPG", 90));
        std::printf("%s of %lld KB\n", heic ? "HEIC" : "JPEG",
                    static_cast<long long>(std::filesystem::file_size(files.back()) >> 10));
    }
    return files;
}

// A fresh machine, with so many names in one folder.
class Rig : PageRig {
public:
    Rig(const std::vector<HostPath>& files, int names, const QString& ending, DoorRules rules) {
        machine.platform.doorProgram = LUMORA_DOOR;
        state.door = rules;
        state.EnglishTips = 1;
        state.Optint = OrderKind::Print;
        state.profile.JppBase = 30;
        state.profile.JppChunks = 56;
        state.MisparHazmana = u"1"_s;
        state.shemot.ppr = u"10/15"_s;
        state.shemot.maat = u"מבריק"_s;
        state.shemot.Bord = u"NB"_s;
        state.shemot.TimeOfJob = u"2026_11_21_KUP_1234^"_s;
        state.shemot.ser = u"1234"_s;
        registerPage<kyoskNew>(PageId::kyoskNew);
        registerPage<tFrmNew>(PageId::tFrmNew);
        registerPage<Form2>(PageId::Form2);
        registerBare({PageId::hatchala, PageId::FtpFrm});
        makeFolder(u"C:\\p"_s);
        for (int i = 0; i < names; ++i) {
            const HostPath name = host(u"C:\\p\\%1.%2"_s.arg(i, 4, 10, QChar(u'0')).arg(ending));
            std::filesystem::copy_file(files[static_cast<std::size_t>(i) % files.size()], name);
        }
        if (!Workspace(state, machine.files).MakeWorkspace())
            fail("no workspace");
        m_first = DrivePath(u"C:\\p\\0000.%1"_s.arg(ending));
        chain.show(PageId::kyoskNew);
    }

    kyoskNew& page() { return *chain.find<kyoskNew>(); }
    void pick() {
        machine.dialogs.picks += m_first;
        page().Image5_Click();
    }
    bool allDrawn() {
        return std::ranges::none_of(page().controls().Picture1,
                                    [](const CellPicture& cell) { return cell.bitmap.isNull(); });
    }
    bool allMade() {
        return std::ranges::none_of(page().controls().Picture1, [](const CellPicture& cell) { return cell.waiting; }) &&
               allDrawn();
    }
    static void waitFor(const std::function<bool()>& done) {
        // Sleeps between the looks: the call of processEvents that takes a time never does, and took a processor.
        QTimer looks;
        looks.start(20);
        while (!done())
            QGuiApplication::processEvents(QEventLoop::AllEvents | QEventLoop::WaitForMoreEvents);
    }

    // The whole folder as one order, up to its whole folder of prints. Tells how many there are.
    qsizetype order() {
        pick();
        const Times making = timed([this] {
            page().Command24_Click();
            page().Image7_Click();
            waitFor([this] { return page().controls().Frame4.visible; });
        });
        std::printf("made ready in %.1f s, at most\n", making.wall / 1000);
        printPeakMemory();
        page().Command8_Click();
        const Times preparing = timed([this] { dynamic_cast<Form2*>(chain.find(PageId::Form2))->Command3_Click(); });
        std::printf("prepared in %.1f s\n", preparing.wall / 1000);
        for (const QString& message : machine.dialogs.messages)
            std::printf("%s\n", qPrintable(message));
        return machine.files.names(state.transfer.OrderFolder, u"*.jpp"_s).size() - 1;
    }

private:
    DrivePath m_first;
};

constexpr DoorRules everything{true, true, true};

int sight(int rounds) {
    const QTemporaryDir folder;
    const std::vector<HostPath> files = photographs(folder, true);
    std::vector<double> drafts, whole;
    for (int round = 0; round < rounds; ++round) {
        Rig rig(files, cells, u"heic"_s, everything);
        whole.push_back(timed([&] {
                            drafts.push_back(timed([&] {
                                                 rig.pick();
                                                 Rig::waitFor([&] { return rig.allDrawn(); });
                                             }).wall);
                            Rig::waitFor([&] { return rig.allMade(); });
                        }).wall);
        std::printf("drafts %.0f ms, pictures %.0f ms\n", drafts.back(), whole.back());
        std::fflush(stdout);
    }
    std::printf("median: drafts %.0f ms, pictures %.0f ms\n", spreadOf(drafts).median, spreadOf(whole).median);
    return 0;
}

int jpeg(int rounds) {
    const QTemporaryDir folder;
    const std::vector<HostPath> files = photographs(folder, false);
    const auto firstPage = [&](DoorRules rules) {
        Rig rig(files, cells, u"jpg"_s, rules);
        const Times times = timed([&] { rig.pick(); });
        return rig.allMade() ? times : Times();
    };
    (void)firstPage({});
    std::vector<double> wall, processor;
    for (int round = 0; round < rounds; ++round) {
        const bool openFirst = round % 2 != 0;
        const Times first = firstPage(openFirst ? everything : DoorRules());
        const Times second = firstPage(openFirst ? DoorRules() : everything);
        const Times& open = openFirst ? first : second;
        const Times& closed = openFirst ? second : first;
        wall.push_back(open.wall / closed.wall);
        processor.push_back(open.processor / closed.processor);
        std::printf("as built in %.1f ms (processor %.1f), with the door %.1f ms (processor %.1f)\n", closed.wall,
                    closed.processor, open.wall, open.processor);
    }
    const Spread all = spreadOf(processor);
    std::printf("with the door / as built in: median %.4f, processor %.4f (%.4f to %.4f)\n", spreadOf(wall).median,
                all.median, all.lowest, all.highest);
    return 0;
}

int names(int count) {
    const QTemporaryDir folder;
    Rig rig(photographs(folder, true), count, u"heic"_s, everything);
    const qsizetype prints = rig.order();
    rusage children{};
    getrusage(RUSAGE_CHILDREN, &children);
    std::printf("%lld prints of %d names; a child took at most %ld MiB; this program at most\n",
                static_cast<long long>(prints), count, children.ru_maxrss >> 10);
    printPeakMemory();
    return prints == count ? 0 : 1;
}

} // namespace

int main(int argc, char** argv) {
    keepPictureMemory();
    QGuiApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    const QString what = arguments.value(1);
    const int number = arguments.value(2).toInt();
    if (what == u"sight"_s)
        return sight(number > 0 ? number : 5);
    if (what == u"jpeg"_s)
        return jpeg(number > 0 ? number : 20);
    if (what == u"names"_s)
        return names(number > 0 ? number : 1000);
    std::fprintf(stderr, "bench_door sight|jpeg [ROUNDS], names [NAMES]\n");
    return 2;
}
