#include "app/Program.h"
#include "imaging/PictureMemory.h"
#include "views/window/Application.h"
#include "views/window/StartFailure.h"

#include <QByteArrayList>
#include <QCommandLineParser>

#include <algorithm>
#include <cstdio>

using namespace lumora;
using namespace Qt::StringLiterals;

namespace {

// Exit statuses.
constexpr int notStarted = 2;
constexpr int alreadyRunning = 3;

} // namespace

int main(int argc, char** argv) {
    keepPictureMemory();
    // Help needs no screen.
    const auto asksForHelp = [](const char* word) {
        return QByteArrayList{"-h", "--help", "-v", "--version"}.contains(QByteArray(word));
    };
    if (std::any_of(argv + 1, argv + argc, asksForHelp))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    Application application(argc, argv);
    Application::setApplicationVersion(QStringLiteral(LUMORA_VERSION));
    QCommandLineParser parser;
    parser.setApplicationDescription(u"Orders prints from a photo lab."_s);
    const QCommandLineOption help({u"h"_s, u"help"_s}, u"Show this help and end."_s);
    const QCommandLineOption version({u"v"_s, u"version"_s}, u"Show the version and end."_s);
    const QCommandLineOption lab(u"lab"_s, u"Read the lab's settings from FILE."_s, u"FILE"_s);
    const QCommandLineOption window(u"window"_s, u"Run in a window, not over the whole screen."_s);
    const QCommandLineOption area(u"operator"_s, u"Open the hidden area of the sending page, for the lab's people."_s);
    parser.addOptions({help, version, lab, window, area});
    if (!parser.parse(QCoreApplication::arguments()) || !parser.positionalArguments().isEmpty()) {
        std::fprintf(stderr, "lumora: %s\n",
                     qPrintable(parser.errorText().isEmpty()
                                    ? u"unexpected argument '%1'"_s.arg(parser.positionalArguments().first())
                                    : parser.errorText()));
        return notStarted;
    }
    if (parser.isSet(help)) {
        std::fputs(qPrintable(parser.helpText()), stdout);
        return 0;
    }
    if (parser.isSet(version)) {
        std::puts("lumora " LUMORA_VERSION);
        return 0;
    }

    ProgramOptions options;
    if (parser.isSet(lab))
        options.labFile = toHostPath(parser.value(lab));
    options.fullScreen = !parser.isSet(window);
    options.operatorArea = parser.isSet(area);
    Program program(std::move(options));
    if (const Result<void> started = program.start(); !started) {
        std::fprintf(stderr, "lumora: %s\n", qPrintable(started.failure().message));
        if (!program.otherCameForward())
            showStartFailure(started.failure().message);
        return started.failure().kind == Failure::Kind::InUse ? alreadyRunning : notStarted;
    }
    return QCoreApplication::exec();
}
