// How long a press takes: from the moment when the button of the mouse is let go to the next frame that is painted
// behind it, by kind of press, over the orders of the demo up to their preparation. Without a screen, so that the way
// from the frame to the glass is not in it.

#include "Timing.h"
#include "app/Program.h"
#include "drive/ScenarioPlayer.h"
#include "session/PageChain.h"
#include "views/window/Application.h"
#include "views/window/MainWindow.h"

#include <QDir>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <map>
#include <utility>

using namespace Qt::StringLiterals;

using namespace lumora;

namespace {

constexpr int framesBehind = 2; // the first may be the button's own, as the page is drawn some milliseconds later
constexpr double goal = 50;     // milliseconds
constexpr int pause = 400;      // milliseconds between two lines; later frames are the next line's

using ByPress = std::map<QString, std::vector<Times>>;

// A button's own look is no answer: what counts is the first frame behind what the page made of the press, where it
// made anything of it.
class Frames : public QObject {
public:
    Frames(Program& program, ByPress& times)
        : m_window(program.window())
        , m_times(times) {
        qApp->installEventFilter(this);
        connect(&program.chain(), &PageChain::shown, this, [this](Page* page) {
            change();
            connect(page, &Page::changed, this, [this] { change(); });
        });
    }
    ~Frames() override { keep(); }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override {
        if (event->type() == QEvent::MouseButtonRelease && watched->isWidgetType() &&
            m_window.isAncestorOf(static_cast<QWidget*>(watched))) {
            keep();
            m_press = nameOf(*static_cast<QWidget*>(watched));
            m_changed = false;
            m_behind = 0;
            m_took = {};
            m_since = timeNow();
        } else if (event->type() == QEvent::UpdateRequest && watched == &m_window && !m_press.isEmpty() &&
                   m_behind < framesBehind) {
            const bool changed = m_changed;
            watched->event(event);
            const Times now = timeNow();
            const double since = now.wall - m_since.wall;
            if (m_took.wall == 0 || (changed && (m_behind == 0 || since < pause)))
                m_took = {since, 0, now.thread - m_since.thread};
            m_behind += changed;
            return true;
        }
        return false;
    }

private:
    void change() { m_changed = m_changed || timeNow().wall - m_since.wall < pause; }
    void keep() {
        if (!m_press.isEmpty() && m_took.wall > 0)
            m_times[m_press].push_back(m_took);
        m_press.clear();
    }
    // Of a row of the same controls all are one kind.
    QString nameOf(const QWidget& pressed) const {
        const QWidget* named = &pressed;
        while (named->parentWidget() && (named->objectName().isEmpty() || named->objectName().startsWith(u"qt_")))
            named = named->parentWidget();
        return ControlFinder(m_window).frontPage() + u'.' + named->objectName().section(u'(', 0, 0);
    }

    MainWindow& m_window;
    ByPress& m_times;
    QString m_press;
    Times m_since;
    Times m_took;
    bool m_changed = false;
    int m_behind = 0;
};

bool make(const QStringList& command) {
    QProcess program;
    program.setStandardOutputFile(QProcess::nullDevice());
    program.start(command.front(), command.mid(1));
    return program.waitForFinished(-1) && program.exitCode() == 0;
}

// Up to the preparation, which has a server at its end.
QByteArray choosing(const QString& scenario) {
    QFile file(QStringLiteral(LUMORA_SCENARIOS) + u'/' + scenario + u"-order.scenario"_s);
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QByteArray whole = file.readAll();
    const qsizetype form = whole.indexOf("\npage Form2"), edited = whole.indexOf("\npage B3");
    QByteArray lines;
    for (const QByteArray& line : whole.left(std::max(form, edited) + 1).split('\n')) {
        if (!line.startsWith("shot "))
            lines += line + "\npause "_ba + QByteArray::number(pause) +
                     '\n'; // what comes of a press is seen before the next
    }
    return lines;
}

bool play(const QString& scenario, const QString& work, ByPress& times) {
    const Result<ScenarioFile> file = ScenarioFile::parse(choosing(scenario), scenario);
    QDir(work + u"/data/2000lumora"_s).removeRecursively();
    if (!file || file->commands().empty() ||
        !make({QStringLiteral(LUMORA_FRAMES), work + u"/data/2000lumora/misgarot"_s}))
        return false;
    ProgramOptions options;
    options.labFile = toHostPath(work + u"/lab.ini"_s);
    options.dataFolder = toHostPath(work + u"/data"_s);
    options.windowSize = {1024, 768};
    Program program(options);
    if (const Result<void> started = program.start(); !started) {
        std::fprintf(stderr, "%s\n", qUtf8Printable(started.failure().message));
        return false;
    }
    const Frames frames(program, times);
    ScenarioPlayer player(program, {*file}, {});
    QObject::connect(&player, &ScenarioPlayer::finished, qApp, [] { QCoreApplication::exit(); });
    player.start();
    QApplication::exec();
    player.settle();
    if (!player.allHeld())
        std::fprintf(stderr, "%s\n", qUtf8Printable(player.failure()));
    return player.allHeld();
}

} // namespace

int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    Application application(argc, argv);
    const int rounds = argc > 1 ? std::max(1, std::atoi(argv[1])) : 5;
    const char* megapixels = argc > 2 ? argv[2] : "12";

    const QTemporaryDir scratch;
    const QString work = scratch.path();
    QFile lab(work + u"/lab.ini"_s);
    if (!lab.open(QIODevice::WriteOnly) || !lab.setPermissions(QFile::ReadOwner | QFile::WriteOwner) ||
        lab.write("[Server]\nHost = 127.0.0.1:9\nUser = u\nPassword = p\n[Guards]\nCareful = yes\n") < 0)
        return EXIT_FAILURE;
    lab.close();
    if (!make({QStringLiteral(LUMORA_PICTURES), work + u"/data/shown"_s, u"14"_s, QString::fromLatin1(megapixels)}) ||
        !QFile::link(work + u"/data/shown"_s, work + u"/pictures"_s) || !QDir::setCurrent(work))
        return EXIT_FAILURE;

    ByPress times;
    for (int round = 0; round < rounds; ++round) {
        for (const QString& scenario : {u"first"_s, u"edited"_s, u"album"_s}) {
            if (!play(scenario, work, times))
                return EXIT_FAILURE;
        }
    }
    const auto spread = [](const std::vector<Times>& all, double Times::*of) {
        std::vector<double> values;
        for (const Times& one : all)
            values.push_back(one.*of);
        return spreadOf(std::move(values));
    };
    int slow = 0;
    for (const auto& [press, measured] : times) {
        const Spread wall = spread(measured, &Times::wall), thread = spread(measured, &Times::thread);
        slow += wall.highest > goal;
        std::printf("%-24s %3zu presses   median %6.1f ms, worst %6.1f   processor %6.1f, %6.1f%s\n",
                    qUtf8Printable(press), measured.size(), wall.median, wall.highest, thread.median, thread.highest,
                    wall.highest > goal ? "   over the goal" : "");
    }
    std::printf("%zu kinds of press, %d of them over %.0f ms at their worst\n", times.size(), slow, goal);
    return times.empty() ? EXIT_FAILURE : EXIT_SUCCESS;
}
