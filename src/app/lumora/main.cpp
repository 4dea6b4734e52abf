#include "app/CodePrompt.h"
#include "app/Program.h"
#include "app/StationCommands.h"
#include "common/NoScreen.h"
#include "imaging/PictureMemory.h"
#include "session/lab/LabFile.h"
#include "station/ServiceNotice.h"
#include "views/window/Application.h"
#include "views/window/StartFailure.h"

#include <QByteArrayList>
#include <QCommandLineParser>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <iterator>

using namespace lumora;
using namespace Qt::StringLiterals;

namespace {

// Exit statuses.
constexpr int notStarted = 2;
constexpr int alreadyRunning = 3;

// Qt ends a program that finds no screen by abort(), after lines about its plugins.
void tellNoScreen(QtMsgType type, const QMessageLogContext& context, const QString& text) {
    if (type != QtFatalMsg) {
        if (qstrncmp(context.category, "qt.qpa", 6) != 0)
            std::fprintf(stderr, "%s\n", qPrintable(text));
        return;
    }
    const QByteArray screens[] = {qgetenv("WAYLAND_DISPLAY"), qgetenv("DISPLAY"), qgetenv("QT_QPA_PLATFORM")};
    if (std::all_of(std::begin(screens), std::end(screens), [](const QByteArray& name) { return name.isEmpty(); }))
        std::fputs("lumora: there is no screen to show the pages on: neither DISPLAY nor WAYLAND_DISPLAY is set.\n",
                   stderr);
    else
        std::fprintf(stderr,
                     "lumora: the screen to show the pages on does not answer (WAYLAND_DISPLAY=%s, DISPLAY=%s, "
                     "QT_QPA_PLATFORM=%s).\n",
                     screens[0].constData(), screens[1].constData(), screens[2].constData());
    std::fflush(stderr);
    _Exit(notStarted);
}

QString labFileHelp() {
    QString text =
        u"\nThe lab's settings are in lab.ini. Without --lab the first of these files is read that is there, and "
        "without any the built-in values hold:\n"_s;
    const std::vector<HostPath> places = labFilePlaces(toHostPath(QCoreApplication::applicationDirPath()));
    const std::optional<HostPath> found = FindLabFile(places);
    for (const HostPath& place : places)
        text += u"  %1%2\n"_s.arg(toText(place), place == found ? u" (is there)"_s : QString());
    return text;
}

} // namespace

int main(int argc, char** argv) {
    keepPictureMemory();
    if (std::any_of(argv + 1, argv + argc, [](const char* word) { return qstrcmp(word, "--kiosk-code") == 0; }))
        return promptForStaffCode();
    // These need no screen.
    const auto showsNoPage = [](const char* word) {
        return QByteArrayList{"-h", "--help", "-v", "--version", "--check", "--support", "--keys"}.contains(
            QByteArray(word).split('=').first());
    };
    const bool pages = std::none_of(argv + 1, argv + argc, showsNoPage);
    const QtMessageHandler usual = pages ? qInstallMessageHandler(tellNoScreen) : nullptr;
    if (!pages)
        goWithoutScreen();
    Application application(argc, argv);
    if (pages)
        qInstallMessageHandler(usual);
    Application::setApplicationVersion(QStringLiteral(LUMORA_VERSION));
    QCommandLineParser parser;
    parser.setApplicationDescription(u"Orders prints from a photo lab."_s);
    const QCommandLineOption help({u"h"_s, u"help"_s}, u"Show this help and end."_s);
    const QCommandLineOption version({u"v"_s, u"version"_s}, u"Show the version and end."_s);
    const QCommandLineOption lab(u"lab"_s, u"Read the lab's settings from FILE."_s, u"FILE"_s);
    const QCommandLineOption window(u"window"_s, u"Run in a window, not over the whole screen."_s);
    const QCommandLineOption area(u"operator"_s, u"Open the hidden area of the sending page, for the lab's people."_s);
    const QCommandLineOption code(u"kiosk-code"_s,
                                  u"Ask for the code of a kiosk's staff and print its line for lab.ini, [Kiosk]."_s);
    const QCommandLineOption check(
        u"check"_s,
        u"Try the lab's file, the disk, the fonts, the clock and the lab's server, and tell what to mend."_s);
    const QCommandLineOption write(u"write"_s, u"With --check: put a probe file on the server and delete it."_s);
    const QCommandLineOption support(
        u"support"_s, u"Write FILE, a ZIP file for whoever helps: versions, settings without passwords, log, orders."_s,
        u"FILE"_s);
    const QCommandLineOption keys(u"keys"_s, u"Print every key of lab.ini and what it allows."_s);
    parser.addOptions({help, version, lab, window, area, code, check, write, support, keys});
    if (!parser.parse(QCoreApplication::arguments()) || !parser.positionalArguments().isEmpty()) {
        std::fprintf(stderr, "lumora: %s\n",
                     qPrintable(parser.errorText().isEmpty()
                                    ? u"unexpected argument '%1'"_s.arg(parser.positionalArguments().first())
                                    : parser.errorText()));
        return notStarted;
    }
    if (parser.isSet(help)) {
        std::fputs(qPrintable(parser.helpText() + labFileHelp()), stdout);
        return 0;
    }
    if (parser.isSet(version)) {
        std::puts("lumora " LUMORA_VERSION);
        return 0;
    }

    ProgramOptions options;
    if (parser.isSet(lab))
        options.labFile = toHostPath(parser.value(lab));
    if (parser.isSet(write) && !parser.isSet(check)) {
        std::fputs("lumora: --write goes with --check\n", stderr);
        return notStarted;
    }
    if (parser.isSet(keys))
        return printLabKeys();
    if (parser.isSet(check))
        return checkStation(options, parser.isSet(write));
    if (parser.isSet(support))
        return writeSupportBundle(options, toHostPath(parser.value(support)));
    options.fullScreen = !parser.isSet(window);
    options.operatorArea = parser.isSet(area);
    Program program(std::move(options));
    if (const Result<void> started = program.start(); !started) {
        std::fprintf(stderr, "lumora: %s\n", qPrintable(started.failure().message));
        if (!program.otherCameForward())
            showStartFailure(started.failure().message);
        return started.failure().kind == Failure::Kind::InUse ? alreadyRunning : notStarted;
    }
    const ServiceNotice notice;
    return QCoreApplication::exec();
}
