// A whole order through its preparation page, beside the sum of what its pictures take to scale, or those of an edited
// order to render, one after another on one thread, in the same run; and the memory that an order of many pictures
// takes.

#include "Timing.h"
#include "assembly/PaperResize.h"
#include "assembly/edited/B3.h"
#include "assembly/plain/Form2.h"
#include "editing/editor/gdisave.h"
#include "editing/render/EditedPicture.h"
#include "imaging/PictureMemory.h"
#include "imaging/files/BmpFile.h"
#include "order/EditRecord.h"
#include "platform/QtEventPump.h"
#include "samples/SamplePhotographs.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "support/TestPlatform.h"

#include <QFile>
#include <QGuiApplication>

#include <algorithm>
#include <cstdio>

using namespace Qt::StringLiterals;

using namespace lumora;

namespace {

constexpr int distinctPictures = 12; // the list goes round them: reading from the disk is not what is measured
constexpr double cameraMegapixels = 12;

class OtherPage : public Page {
public:
    using Page::Page;
};

// A field of /proc/self/status in MiB: "VmRSS:", what the process holds now; "VmHWM:", the most it ever held.
double memory(const char* field) {
    QFile file(u"/proc/self/status"_s);
    if (!file.open(QIODevice::ReadOnly))
        return -1;
    for (const QByteArray& line : file.readAll().split('\n')) {
        if (line.startsWith(field))
            return line.mid(static_cast<qsizetype>(qstrlen(field))).simplified().split(' ').first().toDouble() / 1024;
    }
    return -1;
}

enum class Kind { Plain, Edited };

// What a customer may have done to picture i: two of three are only moved, zoomed, turned or made brighter; of every
// third in turn a tone, a frame, a caption and a corrected copy.
QString recordOf(int i) {
    QString text = EditRecord::newPicture();
    const auto set = [&text](EditRecord::Column column, const char* value) {
        text.replace(column.position - 1, column.width,
                     QString::fromLatin1(value).leftJustified(column.width, u' ', true));
    };
    set(EditRecord::PanX, "225");
    set(EditRecord::PanY, "150");
    if (i % 3 == 1) {
        set(EditRecord::ZoomPercent, "130");
        set(EditRecord::GainR, "1.12");
    } else if (i % 3 == 2) {
        set(EditRecord::RotationCode, "186");
        set(EditRecord::ZoomPercent, "110");
    } else if (i % 12 == 0) {
        set(EditRecord::ToneFlag, "1");
        set(EditRecord::GainB, "0.7");
    } else if (i % 12 == 3) {
        set(EditRecord::FrameName, "001");
        set(EditRecord::FrameFolder, "bench");
    } else if (i % 12 == 6) {
        set(EditRecord::TextOn, "1");
        set(EditRecord::TextFontSize, "30");
        set(EditRecord::TextX, "60");
        set(EditRecord::TextY, "200");
        set(EditRecord::TextRed, "255");
        set(EditRecord::TextFont, "DejaVu Sans");
        set(EditRecord::TextBody, "Summer 2026");
    } else {
        set(EditRecord::RedMarker, "RED");
    }
    return text;
}

class Bench {
public:
    explicit Bench(Kind kind, double megapixels = cameraMegapixels)
        : m_kind(kind)
        , m_platform{m_machine.files, m_machine.dialogs, m_machine.noInternet,
                     m_machine.mail,  m_machine.shell,   m_machine.clock,
                     m_pump,          m_machine.volume,  m_machine.instances,
                     m_machine.cards, m_machine.printer, {}}
        , m_chain(m_pump) {
        const HostPath folder = makeFolder("C:\\pics");
        makeFolder("C:\\vedron");
        auto written = writeSamplePhotographs(folder, distinctPictures, megapixels);
        if (!written) {
            std::fprintf(stderr, "%s\n", qPrintable(written.failure().message));
            std::exit(1);
        }
        m_pictures = *written;
        m_state.DiskRoot = m_machine.drives.programRoot();
        m_state.Optint = kind == Kind::Plain ? OrderKind::Print : OrderKind::EditedPrint;
        m_state.profile.JppBase = 30;
        m_state.profile.JppChunks = 56;
        m_state.shemot.ppr = u"10/15"_s;
        m_state.shemot.TimeOfJob = u"2026_11_21_KUP_1234^"_s;
        m_state.shemot.ser = u"1234"_s;
        for (const PageId id : {PageId::hatchala, PageId::FtpFrm})
            m_chain.registerPage(id, [id] { return std::make_unique<OtherPage>(id); });
        m_chain.registerPage(PageId::Form2, [this] { return std::make_unique<Form2>(m_state, m_platform, m_chain); });
        m_chain.registerPage(PageId::B3, [this] { return std::make_unique<B3>(m_state, m_platform, m_chain); });
        m_chain.registerPage(PageId::gdisave,
                             [this] { return std::make_unique<gdisave>(m_state, m_platform, m_chain); });
        if (kind == Kind::Edited)
            makeEdits();
    }

    // The order of so many pictures; at(page) at each sign of progress.
    Times order(int pictures, const std::function<void(const PreparationPage&)>& at = {}) {
        m_state.MisparHazmana = QString::number(++m_number);
        for (int i = 0; i < pictures; ++i)
            m_state.handOver.lines +=
                u"1 1015GNB"_s + (m_kind == Kind::Edited ? recordOf(i) : QString()) + drivePath(i).text();
        const PageId id = m_kind == Kind::Plain ? PageId::Form2 : PageId::B3;
        m_chain.show(id);
        auto* page = dynamic_cast<PreparationPage*>(m_chain.find(id));
        if (at)
            QObject::connect(page, &Page::changed, page, [page, at] { at(*page); });
        const Times times = timed([page] {
            if (auto* plain = dynamic_cast<Form2*>(page))
                plain->Command3_Click();
            else if (auto* edited = dynamic_cast<B3*>(page))
                edited->Command5_Click();
        });
        const auto made = m_machine.files.names(m_state.transfer.OrderFolder, u"*.jpp"_s).size() - 1;
        if (made != pictures || m_chain.front()->id() != PageId::FtpFrm) {
            std::fprintf(stderr, "the order is not whole: %lld of %d prints\n%s\n", static_cast<long long>(made),
                         pictures, qPrintable(m_machine.dialogs.messages.join(u'\n')));
            std::exit(1);
        }
        m_chain.unload(PageId::FtpFrm);
        std::filesystem::remove_all(*m_machine.drives.toHost(m_state.transfer.OrderFolder));
        return times;
    }

    // The pictures alone, one after another.
    Times alone(int pictures) const {
        return timed([this, pictures] {
            for (int i = 0; i < pictures; ++i) {
                if (!(m_kind == Kind::Plain ? resizeToPaper(source(i), {10, 15}) : rendered(i)))
                    std::exit(1);
            }
        });
    }

private:
    const HostPath& source(int i) const { return m_pictures[static_cast<std::size_t>(i) % m_pictures.size()]; }
    DrivePath drivePath(int i) const { return m_machine.drives.toDrive(source(i)); }

    HostPath makeFolder(const char* path) {
        const HostPath folder = *m_machine.drives.toHost(DrivePath(QString::fromLatin1(path)));
        std::filesystem::create_directories(folder);
        return folder;
    }

    // A frame, and the corrected copies of the pictures that are marked.
    void makeEdits() {
        makeFolder("C:\\2000lumora\\zmany\\tempred");
        Bitmap frame(1500, 1000, Qt::black);
        QImage& image = frame.image();
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                if (x < 60 || y < 60 || x >= image.width() - 60 || y >= image.height() - 60)
                    image.setPixel(x, y, qRgb(220, 200, 120));
            }
        }
        bool made = saveBmp(frame, makeFolder("C:\\2000lumora\\misgarot\\bench") / "001.bmp").ok();
        for (int i = 9; i < distinctPictures; i += 12) {
            const auto picture = loadPicture(source(i));
            made = made && picture && saveBmp(*picture, corrected(i)).ok();
        }
        if (!made)
            std::exit(1);
    }
    HostPath corrected(int i) const {
        return *m_machine.drives.toHost(WorkspacePaths::corrected(m_state, drivePath(i)));
    }

    Result<QByteArray> rendered(int i) const {
        EditFields edit;
        UnpackEditState(recordOf(i), edit);
        EditedPrint print;
        print.file = edit.RedMarker == EditRecord::corrected ? corrected(i) : source(i);
        print.paper = {10, 15};
        print.framesFolder = *m_machine.drives.toHost(DrivePath(u"C:\\2000lumora\\misgarot"_s));
        return renderEditedPrintToJpeg(print, edit);
    }

    const Kind m_kind;
    TestPlatform m_machine;
    QtEventPump m_pump;
    Platform m_platform;
    SessionState m_state;
    PageChain m_chain;
    std::vector<HostPath> m_pictures;
    int m_number = 100;
};

int ratio(Kind kind, int pictures, int rounds) {
    const char* work = kind == Kind::Plain ? "scaling" : "rendering";
    Bench bench(kind);
    bench.order(distinctPictures); // warm
    std::vector<double> ratios;
    std::vector<double> processor;
    for (int round = 0; round < rounds; ++round) {
        // In turn first, so that neither always has the warmer machine.
        Times alone;
        Times order;
        if (round % 2 == 0)
            alone = bench.alone(pictures);
        order = bench.order(pictures);
        if (round % 2 != 0)
            alone = bench.alone(pictures);
        ratios.push_back(order.wall / alone.wall);
        processor.push_back(order.processor / alone.processor);
        std::printf("%d pictures: %s alone %.0f ms (processor %.0f), whole order %.0f ms (processor %.0f), ratio %.2f "
                    "(processor %.2f)\n",
                    pictures, work, alone.wall, alone.processor, order.wall, order.processor, ratios.back(),
                    processor.back());
        std::fflush(stdout);
    }
    std::printf("median ratio %.2f (goal %s on two cores), processor %.2f (goal 1.10)\n", spreadOf(ratios).median,
                kind == Kind::Plain ? "0.58" : "0.60", spreadOf(processor).median);
    return 0;
}

int peakMemory(Kind kind, int pictures, double megapixels) {
    Bench bench(kind, megapixels);
    std::printf("before the order %.0f MiB (most so far, with the making of the pictures: %.0f)\n", memory("VmRSS:"),
                memory("VmHWM:"));
    // The most so far starts anew.
    QFile clear(u"/proc/self/clear_refs"_s);
    if (!clear.open(QIODevice::WriteOnly) || clear.write("5") != 1)
        std::printf("the mark of the most could not be reset\n");
    clear.close();
    int last = 0;
    const Times times = bench.order(pictures, [&](const PreparationPage& page) {
        const int at = page.controls().Label17.text.toInt();
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
    keepPictureMemory();
    QGuiApplication application(argc, argv);
    QStringList arguments = QCoreApplication::arguments();
    const Kind kind = arguments.removeAll(u"edited"_s) > 0 ? Kind::Edited : Kind::Plain;
    if (arguments.value(1) == QLatin1String("ratio"))
        return ratio(kind, arguments.value(2, u"100"_s).toInt(), arguments.value(3, u"3"_s).toInt());
    if (arguments.value(1) == QLatin1String("memory"))
        return peakMemory(kind, arguments.value(2, u"300"_s).toInt(),
                          arguments.value(3, QString::number(cameraMegapixels)).toDouble());
    std::fprintf(stderr, "bench_order ratio [PICTURES] [ROUNDS] [edited]\n"
                         "bench_order memory [PICTURES] [MEGAPIXELS] [edited]\n");
    return 2;
}
