#include "app/Program.h"

#include "app/PageRegister.h"
#include "app/UsualPlaces.h"
#include "common/HostFile.h"
#include "common/Warning.h"
#include "kiosk/IdleEnd.h"
#include "kiosk/OrderKeeping.h"
#include "kiosk/StaffCode.h"
#include "platform/ForwardCall.h"
#include "platform/Instances.h"
#include "platform/NetworkCards.h"
#include "platform/Platform.h"
#include "platform/QtEventPump.h"
#include "platform/QueuePrinter.h"
#include "platform/SystemClock.h"
#include "platform/files/Drives.h"
#include "platform/files/Files.h"
#include "platform/files/MarkedVolume.h"
#include "platform/files/StatVolume.h"
#include "platform/line/PocoInternet.h"
#include "platform/line/SmtpMail.h"
#include "platform/media/SystemMedia.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/lab/LabFile.h"
#include "station/KeptLog.h"
#include "transfer/waiting/WaitingSending.h"
#include "views/window/Application.h"
#include "views/window/KioskPanels.h"
#include "views/window/MainWindow.h"
#include "views/window/ScreenDialogs.h"

#include <QCoreApplication>
#include <QGuiApplication>
#include <QScreen>
#include <QTimer>

#include <cassert>
#include <optional>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

// Each member uses only those above it, as it is made.
struct Program::Parts {
    Parts(Deployment read, const HostPath& dataFolder, Instances run, Internet* line, Cards::Source media,
          DesktopShell::Opener opener, const Clock* time)
        : deployment(std::move(read))
        , drives(dataFolder, deployment.programLetter, Drives::defaultMediaRoots(), deployment.driveOrder)
        , files(drives)
        , instances(std::move(run))
        , fileSystem(drives)
        , volume(fileSystem, dataFolder, NetworkCards(),
                 [](const Failure& why) {
                     writeWarning(u"the mark of the data folder can't be kept: %1"_s.arg(why.message));
                 })
        , cards(deployment.watchedCards ? std::move(media) : Cards::Source(), deployment.door.everyFormat)
        , clock(time ? *time : systemClock)
        , internet({}, deployment.ftpType, deployment.encryption)
        , shell(drives, std::move(opener))
        , chain(pump)
        , window(chain, state)
        , dialogs(window, state, platform)
        , platform{files,   dialogs,      line ? *line : internet, mail, shell, clock, pump, volume, instances, cards,
                   printer, doorProgram()}
        , waiting(state, platform, chain, deployment)
        , idle(deployment.kiosk, platform, chain)
        , staffCode(state, files, clock)
        , keeping(state, platform)
        , kioskPanels(window, state, chain, idle, staffCode) {
        // A browser would lie over the pages, and shows the files of this machine.
        shell.mayOpen = [this] { return !state.closedToCustomers(); };
        chain.mayEnd = [this] { return !state.closedToCustomers(); };
        kioskPanels.staffCameIn = [this] {
            dialogs.message(state.wording(u"כלי הצוות פתוחים עד שיחזור דף הפתיחה.",
                                          u"The staff's tools are open until the start page comes anew."));
        };
        // A medium has its letter before any page hears what it holds.
        cards.setLook([this, roots = drives.mediaRoots()]() -> std::function<void()> {
            return [this, found = Drives::findMedia(roots)] { drives.giveLetters(found); };
        });
        dialogs.beforePick = [this] { drives.refreshMedia(); };
        window.mayEnd = [this] {
            const bool choosing = chain.find(PageId::nnn) || chain.find(PageId::kyoskNew);
            if (state.closedToCustomers()) // the start page comes
                return !choosing || dialogs.ask(state.wording(u"לוותר על ההזמנה ולחזור לדף הפתיחה?",
                                                              u"Give the order up and go back to the first page?"));
            return dialogs.ask(choosing ? state.wording(u"לצאת מהתוכנה? הזמנה שעדיין לא נשלחה לא תישמר.",
                                                        u"Leave the program? An order that was not sent yet is lost.")
                                        : state.wording(u"לצאת מהתוכנה?", u"Leave the program?"));
        };
    }

    Deployment deployment;
    SessionState state;
    Drives drives;
    Files files;
    Instances instances;
    StatVolume fileSystem;
    MarkedVolume volume;
    Cards cards;
    SystemClock systemClock;
    const Clock& clock;
    QtEventPump pump;
    PocoInternet internet;
    SmtpMail mail;
    QueuePrinter printer;
    DesktopShell shell;
    PageChain chain;
    MainWindow window;
    ScreenDialogs dialogs;
    Platform platform;
    WaitingSending waiting;
    IdleEnd idle;
    StaffCode staffCode;
    OrderKeeping keeping;
    KioskPanels kioskPanels;
    std::optional<ForwardCalls> forwardCalls;
};

namespace {

// Only under X11 may a program raise its own window.
bool displayAllowsRaising() {
    return QGuiApplication::platformName() == QLatin1String("xcb");
}

void bringForward(QWidget& window) {
    window.setWindowState((window.windowState() & ~Qt::WindowMinimized) | Qt::WindowActive);
    window.raise();
    window.activateWindow();
}

} // namespace

Program::Program(ProgramOptions options)
    : m_options(std::move(options)) {}

Program::~Program() {
    writeLog(u"end"_s);
}

Result<void> Program::start() {
    assert(!m_parts);
    const std::optional<HostPath> labFile = usedLabFile(m_options);
    LabFileReading reading;
    if (labFile)
        reading = ReadLabFile(*labFile);
    for (const QString& warning : reading.warnings)
        writeWarning(warning);
    if (reading.deployment.KeepLog)
        m_log = std::make_unique<KeptLog>();
    writeLog(u"start: lumora %1, Qt %2"_s.arg(QStringLiteral(LUMORA_VERSION), QString::fromLatin1(qVersion())));
    if (!reading.errors.isEmpty())
        return Failure{Failure::Kind::Damaged, reading.errors.join(u'\n')};
    Application::setContrast(reading.deployment.contrast);
    if (m_options.operatorArea)
        reading.deployment.OperatorArea = true;

    const HostPath dataFolder = usedDataFolder(m_options, reading.deployment);
    std::error_code error;
    const bool made = std::filesystem::create_directories(dataFolder, error);
    if (error) {
        return Failure{Failure::Kind::AccessDenied, u"%1: the data folder can't be made: %2"_s.arg(
                                                        toText(dataFolder), QString::fromStdString(error.message()))};
    }
    // A folder that existed before keeps its permissions, since others may use it; the folders that the program makes
    // in it are closed to others.
    if (made)
        std::filesystem::permissions(dataFolder, std::filesystem::perms::owner_all, error);

    const auto startTime = std::filesystem::file_time_type::clock::now();
    Instances run(dataFolder, reading.deployment.Careful ? Instances::Lock::Exclusive : Instances::Lock::Shared);
    if (run.fault() && reading.deployment.Careful) {
        return Failure{Failure::Kind::InUse,
                       u"the data folder can't be locked, and another program in it would not be noticed: %1\n"
                       "\u2067לא ניתן לנעול את תיקיית הנתונים, ולכן תוכנה נוספת שפועלת בה לא תתגלה.\u2069"_s.arg(
                           run.fault()->message)};
    }
    if (run.fault())
        writeWarning(u"the data folder can't be locked: %1"_s.arg(run.fault()->message));
    if (run.refused()) {
        m_otherCameForward = CallForward(dataFolder);
        return Failure{
            Failure::Kind::InUse,
            u"%1: the program is already running with this data folder; close its other window first.\n"
            "\u2067התוכנה כבר פועלת עם תיקיית נתונים זו. יש לסגור קודם את החלון האחר.\u2069"_s.arg(toText(dataFolder))};
    }
    if (!run.another())
        removeLeftovers(dataFolder, startTime);

    m_parts =
        std::make_unique<Parts>(std::move(reading.deployment), dataFolder, std::move(run), m_options.internet,
                                m_options.media ? m_options.media : systemMedia, m_options.opener, m_options.clock);
    Parts& parts = *m_parts;
    registerPages(parts.chain, parts.state, parts.platform, parts.deployment);
    QObject::connect(&parts.chain, &PageChain::shown, &parts.window, [&parts](const Page* page) {
        const Result<void> kept = page->id() == PageId::hatchala ? parts.keeping.look() : Result<void>();
        if (!kept)
            writeWarning(u"an order that was kept long enough can't be removed: %1"_s.arg(kept.failure().message));
    });
    QObject::connect(&parts.chain, &PageChain::shown, &parts.window,
                     [](const Page* page) { writeLog(u"page "_s + pageName(page->id())); });
    registerViews(parts.window, parts.chain, parts.state, parts.files);
    // A question may run an event loop of its own; each of them has to return before the process ends.
    QObject::connect(
        &parts.chain, &PageChain::ended, qApp, [] { QCoreApplication::exit(0); }, Qt::QueuedConnection);

    QSize size = m_options.windowSize;
    if (size.isEmpty()) {
        const QScreen* screen = QGuiApplication::primaryScreen();
        size = screen ? screen->availableSize().boundedTo({1280, 960}) : QSize(1024, 768);
    }
    parts.window.resize(size);
    parts.chain.show(PageId::hatchala);
    if (m_options.fullScreen)
        parts.window.showFullScreen();
    else
        parts.window.show();
    if (displayAllowsRaising())
        parts.forwardCalls.emplace(dataFolder, [&parts] { bringForward(parts.window); });
    return {};
}

SessionState& Program::state() {
    return m_parts->state;
}

PageChain& Program::chain() {
    return m_parts->chain;
}

MainWindow& Program::window() {
    return m_parts->window;
}

ScreenDialogs& Program::dialogs() {
    return m_parts->dialogs;
}

const Platform& Program::platform() const {
    return m_parts->platform;
}

} // namespace lumora
