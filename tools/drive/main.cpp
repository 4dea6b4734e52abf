#include "app/Program.h"
#include "common/NoScreen.h"
#include "drive/RandomWalk.h"
#include "drive/ScenarioPlayer.h"
#include "views/window/Application.h"

#include <QCommandLineParser>
#include <QUrl>

#include <cstdio>
#include <cstdlib>

using namespace Qt::StringLiterals;

using namespace lumora;

namespace {

constexpr int aLineFailed = 1;
constexpr int notPlayed = 2;
constexpr int alreadyRunning = 3;

int complain(const QString& text, int status) {
    std::fprintf(stderr, "%s\n", qUtf8Printable(text));
    return status;
}

// Returns an empty size if the text is no size.
QSize sizeIn(const QString& text) {
    const QStringList sides = text.split(u'x');
    if (sides.size() != 2)
        return {};
    const QSize size(sides[0].toInt(), sides[1].toInt());
    return size.width() >= 640 && size.height() >= 480 && size.width() <= 7680 && size.height() <= 7680 ? size
                                                                                                        : QSize();
}

int startFailure(const Result<void>& started) {
    return complain(started.failure().message,
                    started.failure().kind == Failure::Kind::InUse ? alreadyRunning : notPlayed);
}

// The walk goes on where the customer has ended the program and starts it again.
int walk(RandomWalk& walk, const ProgramOptions& options) {
    while (!walk.isOver()) {
        Program program(options);
        if (const Result<void> started = program.start(); !started)
            return startFailure(started);
        QObject::connect(
            &walk, &RandomWalk::over, qApp, [] { QCoreApplication::exit(); }, Qt::QueuedConnection);
        walk.walk(program);
        QApplication::exec();
    }
    return walk.failure().isEmpty() ? EXIT_SUCCESS : complain(walk.failure(), aLineFailed);
}

int play(int argc, char** argv) {
    goWithoutScreen();
    Application application(argc, argv);
    Application::setApplicationVersion(QStringLiteral(LUMORA_VERSION));

    QCommandLineParser parser;
    parser.setApplicationDescription(
        u"Runs the pages of lumora without a screen and does at them what scenario files say, a command "
        u"a line:\n\n"_s +
        scenarioHelp() +
        u"\nA line that begins with # is a comment. \\n in a text is a line break, \\\\ a backslash.\n\n"
        u"Exit status: 0 all held, 1 a line failed, 2 nothing could be played, 3 another program "
        u"has the data folder."_s);
    parser.addHelpOption();
    parser.addVersionOption();
    parser.addOptions(
        {{u"lab"_s, u"The deployment file of the lab."_s, u"FILE"_s},
         {u"size"_s, u"The window, from 640x480 on."_s, u"WxH"_s, u"1280x1024"_s},
         {u"shots"_s, u"Where the pictures of shot go."_s, u"DIR"_s, u"."_s},
         {u"touch"_s, u"Presses and types with a finger where the lines name none."_s},
         {u"keys"_s, u"Presses, types and chooses with a keyboard alone, by Tab, arrows, Enter and blank."_s},
         {u"twice"_s,
          u"Presses once more, soon and at the same place or by the same key, behind each press that changes what is in front."_s},
         {u"walk"_s, u"In place of scenarios: presses what can be pressed, as this number draws it."_s, u"SEED"_s},
         {u"presses"_s, u"Of a walk, before it brings the order to its end."_s, u"NUMBER"_s, u"300"_s},
         {u"away"_s,
          u"Of a walk on a kiosk: now and then the customer goes, and the start page must come by itself."_s},
         {u"record"_s, u"Of a walk: an existing folder for what the pages showed."_s, u"DIR"_s, u"."_s}});
    parser.addPositionalArgument(u"SCENARIO..."_s,
                                 u"The files, played one after the other; of a walk the folders of pictures."_s);
    if (!parser.parse(QCoreApplication::arguments()))
        return complain(parser.errorText(), notPlayed);
    if (parser.isSet(u"help"_s))
        parser.showHelp();
    if (parser.isSet(u"version"_s))
        parser.showVersion();

    ProgramOptions options;
    options.opener = [](const QUrl&) { return true; };
    options.windowSize = sizeIn(parser.value(u"size"_s));
    if (options.windowSize.isEmpty())
        return complain(u"--size: %1 is no size such as 1280x1024"_s.arg(parser.value(u"size"_s)), notPlayed);
    if (parser.isSet(u"lab"_s))
        options.labFile = toHostPath(parser.value(u"lab"_s));

    if (parser.positionalArguments().isEmpty())
        return complain(u"No scenario is named; --help tells more."_s, notPlayed);
    if (parser.isSet(u"touch"_s) && parser.isSet(u"keys"_s))
        return complain(u"Presses come by --touch or by --keys"_s, notPlayed);
    const Hand hand = parser.isSet(u"touch"_s) ? Hand::Finger : parser.isSet(u"keys"_s) ? Hand::Keys : Hand::Mouse;
    if (parser.isSet(u"walk"_s)) {
        WalkClock clock;
        options.clock = &clock;
        RandomWalk seeded({parser.value(u"walk"_s).toUInt(), parser.value(u"presses"_s).toInt(),
                           parser.positionalArguments(), parser.value(u"record"_s), hand,
                           parser.isSet(u"away"_s) ? &clock : nullptr});
        return walk(seeded, options);
    }
    std::vector<ScenarioFile> files;
    for (const QString& path : parser.positionalArguments()) {
        Result<ScenarioFile> file = ScenarioFile::load(path);
        if (!file)
            return complain(file.failure().message, notPlayed);
        files.push_back(std::move(*file));
    }

    Program program(options);
    if (const Result<void> started = program.start(); !started)
        return startFailure(started);
    ScenarioPlayer player(program, std::move(files), {parser.value(u"shots"_s), hand, parser.isSet(u"twice"_s)});
    // quit() would close the window, which may ask the customer.
    QObject::connect(&player, &ScenarioPlayer::finished, &application, [] { QCoreApplication::exit(); });
    player.start();
    QApplication::exec();
    player.settle();
    return player.allHeld() ? EXIT_SUCCESS : complain(player.failure(), aLineFailed);
}

} // namespace

int main(int argc, char** argv) {
    return play(argc, argv);
}
