// A whole order through the preparation page, beside the sum of what its pictures take to scale one after another on
// one thread, in the same run; and the memory that an order of many pictures takes.

#include "assembly/Form2.h"
#include "assembly/PaperResize.h"
#include "platform/QtEventPump.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/SamplePhotographs.h"
#include "support/TestPlatform.h"

#include <QElapsedTimer>
#include <QFile>
#include <QGuiApplication>

#include <algorithm>
#include <cstdio>
#include <ctime>

using namespace lumora;

namespace {

constexpr int distinctPictures = 12; // the list goes round them: reading from the disk is not what is measured
constexpr double megapixels = 12;

class OtherPage : public Page {
public:
    using Page::Page;
};

// Wall clock and processor time of all threads, in milliseconds.
struct Times {
    double wall = 0;
    double processor = 0;
};

template <class Work>
Times timed(Work work) {
    QElapsedTimer wall;
    wall.start();
    const std::clock_t before = std::clock();
    work();
    return {static_cast<double>(wall.nsecsElapsed()) / 1e6,
            1000.0 * static_cast<double>(std::clock() - before) / CLOCKS_PER_SEC};
}

// A field of /proc/self/status in MiB: "VmRSS:", what the process holds now; "VmHWM:", the most it ever held.
double memory(const char* field) {
    QFile file(QStringLiteral("/proc/self/status"));
    if (!file.open(QIODevice::ReadOnly))
        return -1;
    for (const QByteArray& line : file.readAll().split('\n')) {
        if (line.startsWith(field))
            return line.mid(static_cast<qsizetype>(qstrlen(field))).simplified().split(' ').first().toDouble() / 1024;
    }
    return -1;
}

class Bench {
public:
    Bench()
        : m_platform{m_machine.files, m_machine.dialogs, m_machine.noInternet, m_machine.shell, m_machine.clock,
                     m_pump,          m_machine.volume}
        , m_chain(m_pump) {
        std::filesystem::create_directories(*m_machine.drives.toHost(QStringLiteral("C:\\vedron")));
        const HostPath folder = *m_machine.drives.toHost(QStringLiteral("C:\\pics"));
        std::filesystem::create_directories(folder);
        auto written = writeSamplePhotographs(folder, distinctPictures, megapixels);
        if (!written) {
            std::fprintf(stderr, "%s\n", qPrintable(written.failure().message));
            std::exit(1);
        }
        m_pictures = *written;
        m_state.DiskRoot = m_machine.drives.programRoot();
        m_state.Optint = 1;
        m_state.profile.JppBase = 30;
        m_state.profile.JppChunks = 56;
        m_state.shemot.ppr = QStringLiteral("10/15");
        m_state.shemot.TimeOfJob = QStringLiteral("2026_11_21_KUP_1234^");
        m_state.shemot.ser = QStringLiteral("1234");
        for (const PageId id : {PageId::hatchala, PageId::FtpFrm})
            m_chain.registerPage(id, [id] { return std::make_unique<OtherPage>(id); });
        m_chain.registerPage(PageId::Form2, [this] { return std::make_unique<Form2>(m_state, m_platform, m_chain); });
    }

    // The order of so many pictures; at(page) at each sign of progress.
    Times order(int pictures, const std::function<void(const Form2&)>& at = {}) {
        m_state.MisparHazmana = QString::number(++m_number);
        for (int i = 0; i < pictures; ++i)
            m_state.handOver.lines += QStringLiteral("1 1015GNB") + m_machine.drives.toDrive(source(i));
        m_chain.show(PageId::Form2);
        auto* page = dynamic_cast<Form2*>(m_chain.find(PageId::Form2));
        if (at)
            QObject::connect(page, &Page::changed, page, [page, at] { at(*page); });
        const Times times = timed([page] { page->Command3_Click(); });
        const auto made = m_machine.files.names(m_state.transfer.OrderFolder, QStringLiteral("*.jpp")).size() - 1;
        if (made != pictures || m_chain.front()->id() != PageId::FtpFrm) {
            std::fprintf(stderr, "the order is not whole: %lld of %d prints\n%s\n", static_cast<long long>(made),
                         pictures, qPrintable(m_machine.dialogs.messages.join(u'\n')));
            std::exit(1);
        }
        m_chain.unload(PageId::FtpFrm);
        std::filesystem::remove_all(*m_machine.drives.toHost(m_state.transfer.OrderFolder));
        return times;
    }

    Times scalingAlone(int pictures) const {
        return timed([this, pictures] {
            for (int i = 0; i < pictures; ++i) {
                if (!resizeToPaper(source(i), {10, 15}))
                    std::exit(1);
            }
        });
    }

private:
    const HostPath& source(int i) const { return m_pictures[static_cast<std::size_t>(i) % m_pictures.size()]; }

    TestPlatform m_machine;
    QtEventPump m_pump;
    Platform m_platform;
    SessionState m_state;
    PageChain m_chain;
    std::vector<HostPath> m_pictures;
    int m_number = 100;
};

double median(std::vector<double> values) {
    std::sort(values.begin(), values.end());
    return values[values.size() / 2];
}

int ratio(int pictures, int rounds) {
    Bench bench;
    bench.order(distinctPictures); // warm
    std::vector<double> ratios;
    for (int round = 0; round < rounds; ++round) {
        // In turn first, so that neither always has the warmer machine.
        Times alone;
        Times order;
        if (round % 2 == 0)
            alone = bench.scalingAlone(pictures);
        order = bench.order(pictures);
        if (round % 2 != 0)
            alone = bench.scalingAlone(pictures);
        ratios.push_back(order.wall / alone.wall);
        std::printf(
            "%d pictures: scaling alone %.0f ms (processor %.0f), whole order %.0f ms (processor %.0f), ratio %.2f\n",
            pictures, alone.wall, alone.processor, order.wall, order.processor, ratios.back());
        std::fflush(stdout);
    }
    std::printf("median ratio %.2f\n", median(ratios));
    return 0;
}

int peakMemory(int pictures) {
    Bench bench;
    std::printf("before the order %.0f MiB (most so far, with the making of the pictures: %.0f)\n", memory("VmRSS:"),
                memory("VmHWM:"));
    // The most so far starts anew.
    QFile clear(QStringLiteral("/proc/self/clear_refs"));
    if (!clear.open(QIODevice::WriteOnly) || clear.write("5") != 1)
        std::printf("the mark of the most could not be reset\n");
    clear.close();
    int last = 0;
    const Times times = bench.order(pictures, [&](const Form2& page) {
        const int at = page.Label17.text.toInt();
        if (at != last && at > 0 && at % std::max(1, pictures / 6) == 0)
            std::printf("picture %3d: %.0f MiB, most %.0f\n", at, memory("VmRSS:"), memory("VmHWM:"));
        last = at;
    });
    std::printf("%d pictures of %.0f megapixels in %.0f ms: at most %.0f MiB\n", pictures, megapixels, times.wall,
                memory("VmHWM:"));
    return 0;
}

} // namespace

int main(int argc, char** argv) {
    QGuiApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.value(1) == QLatin1String("ratio"))
        return ratio(arguments.value(2, QStringLiteral("100")).toInt(),
                     arguments.value(3, QStringLiteral("3")).toInt());
    if (arguments.value(1) == QLatin1String("memory"))
        return peakMemory(arguments.value(2, QStringLiteral("300")).toInt());
    std::fprintf(stderr, "bench_order ratio [PICTURES] [ROUNDS] | bench_order memory [PICTURES]\n");
    return 2;
}
