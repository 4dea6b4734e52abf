#include "drive/ScenarioPlayer.h"

#include "app/Program.h"
#include "common/AnsiCodePage.h"
#include "common/DrivePath.h"
#include "common/PictureName.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/kit/Overlay.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"
#include "views/window/ScreenDialogs.h"

#include <QDir>
#include <QFileInfo>
#include <QPixmap>
#include <QSaveFile>

#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int betweenSteps = 5;         // milliseconds
constexpr int secondPress = 100;        // milliseconds behind the first, as of a shaking or impatient hand
constexpr double patienceOfMessage = 5; // seconds; a timer of the page may show the box
constexpr double patienceOfWork = 900;  // seconds until work that does not end has failed

bool touches(ScenarioVerb verb) {
    return verb == ScenarioVerb::Press || verb == ScenarioVerb::PressAt || verb == ScenarioVerb::Hold ||
           verb == ScenarioVerb::Drag || verb == ScenarioVerb::Type || verb == ScenarioVerb::Choose ||
           verb == ScenarioVerb::Tick || verb == ScenarioVerb::Touch || verb == ScenarioVerb::TouchAt ||
           verb == ScenarioVerb::TouchType;
}

QString deed(ScenarioVerb verb) {
    switch (verb) {
    case ScenarioVerb::Hold:
        return u"hold"_s;
    case ScenarioVerb::Drag:
        return u"drag"_s;
    case ScenarioVerb::Touch:
    case ScenarioVerb::TouchAt:
        return u"touch"_s;
    case ScenarioVerb::TouchType:
    case ScenarioVerb::Type:
        return u"type into"_s;
    case ScenarioVerb::Choose:
        return u"choose from"_s;
    case ScenarioVerb::Tick:
        return u"tick"_s;
    default:
        return u"press"_s;
    }
}

QString quoted(const QString& text) {
    QString shown = text;
    shown.replace(u'\\', u"\\\\"_s).replace(u'\n', u"\\n"_s);
    return u'"' + shown + u'"';
}

QString inWords(const Result<QString>& text) {
    return text ? quoted(*text) : text.failure().message;
}
QString inWords(const Result<int>& count) {
    return count ? QString::number(*count) : count.failure().message;
}
QString inWords(const Result<bool>& flag) {
    return !flag ? flag.failure().message : *flag ? u"yes"_s : u"no"_s;
}

} // namespace

ScenarioPlayer::ScenarioPlayer(Program& program, std::vector<ScenarioFile> files, Manner manner)
    : m_program(program)
    , m_controls(program.window(), manner.hand)
    , m_finger(program.window(), Hand::Finger)
    , m_files(std::move(files))
    , m_manner(std::move(manner)) {
    m_program.dialogs().nextPick = [this] { return takePick(); };
    m_program.dialogs().nextAnswer = [this] { return takeAnswer(); };
    m_timer.setInterval(betweenSteps);
    connect(&m_timer, &QTimer::timeout, this, &ScenarioPlayer::step);
    m_letGo.setSingleShot(true);
    m_letGo.setTimerType(Qt::PreciseTimer);
    connect(&m_letGo, &QTimer::timeout, this, &ScenarioPlayer::letGo);
    m_pressAgain.setSingleShot(true);
    m_pressAgain.setTimerType(Qt::PreciseTimer);
    m_pressAgain.setInterval(secondPress);
    connect(&m_pressAgain, &QTimer::timeout, this, &ScenarioPlayer::pressAgain);
    m_atThisLine.start();
}

void ScenarioPlayer::step() {
    while (m_file < m_files.size() && m_command == m_files[m_file].commands().size()) {
        ++m_file;
        m_command = 0;
    }
    if (m_finished || m_held)
        return;
    const bool busy = m_program.platform().pump.pumping();
    if (m_file == m_files.size()) {
        if (!busy)
            finish();
        return;
    }
    if (m_program.chain().goesToStart() && m_atThisLine.elapsed() < patienceOfWork * 1000)
        return;
    if (m_program.chain().hasEnded())
        return fail(place(), u"a running program"_s, u"it has ended"_s);

    const ScenarioCommand& command = m_files[m_file].commands()[m_command];
    if (!mayRunNow(command.verb)) {
        if (m_atThisLine.elapsed() > patienceOfWork * 1000)
            fail(place(), u"the end of the work before this line"_s, u"work without end"_s);
        return;
    }
    if (touches(command.verb)) {
        if (!m_pressAgain.isActive())
            touch(command);
        return;
    }

    m_program.window().renderNow();
    const Look seen = look(command);
    if (seen.held) {
        if (command.verb == ScenarioVerb::Page || command.verb == ScenarioVerb::Until ||
            command.verb == ScenarioVerb::UntilVisible || command.verb == ScenarioVerb::Pause)
            m_goesOnInTheMiddle = busy;
        moveOn();
    } else if (m_atThisLine.elapsed() >= seen.patience * 1000) {
        fail(place(), seen.wanted, seen.found);
    }
}

bool ScenarioPlayer::mayRunNow(ScenarioVerb verb) const {
    if (m_goesOnInTheMiddle || !m_program.platform().pump.pumping())
        return true;
    switch (verb) {
    case ScenarioVerb::Page:
    case ScenarioVerb::Until:
    case ScenarioVerb::UntilVisible:
    case ScenarioVerb::Pause:
    case ScenarioVerb::Shot:
    case ScenarioVerb::Dump:
    case ScenarioVerb::Pick:
    case ScenarioVerb::Answer:
        return true;
    default:
        return false;
    }
}

// The handler of the control may pump and so run the next lines; the position moves on before it.
void ScenarioPlayer::touch(const ScenarioCommand& command) {
    const QString here = place();
    m_goesOnInTheMiddle = false;
    moveOn();

    m_program.dialogs().closeMessages();
    m_program.window().renderNow();
    if (m_manner.pressesTwice) {
        m_before = inFront();
        m_pressing =
            command.verb == ScenarioVerb::Touch || command.verb == ScenarioVerb::TouchAt ? &m_finger : &m_controls;
        m_pressAgain.start(); // the handler may pump
    }
    const Result<void> touched = use(command);
    if (!touched)
        fail(u"%1: the line wants to %2 %3.%4, but %5"_s.arg(here, deed(command.verb), command.page, command.control,
                                                             touched.failure().message));
}

Result<void> ScenarioPlayer::use(const ScenarioCommand& command) {
    const QString& page = command.page;
    const QString& control = command.control;
    switch (command.verb) {
    case ScenarioVerb::PressAt:
        return m_controls.pressAt(page, control, command.from, command.rightKey ? Qt::RightButton : Qt::LeftButton);
    case ScenarioVerb::Touch:
        return m_finger.press(page, control);
    case ScenarioVerb::TouchAt:
        return m_finger.pressAt(page, control, command.from);
    case ScenarioVerb::TouchType:
        return m_finger.touchType(page, control, command.text);
    case ScenarioVerb::Drag:
        return m_controls.drag(page, control, command.from, command.to);
    case ScenarioVerb::Type:
        return m_controls.type(page, control, command.text);
    case ScenarioVerb::Choose:
        return m_controls.choose(page, control, command.text);
    case ScenarioVerb::Tick:
        return m_controls.tick(page, control, command.yes);
    case ScenarioVerb::Hold: {
        const Result<ControlFinder::Held> held = m_controls.hold(page, control);
        if (!held)
            return held.failure();
        m_held = *held;
        m_letGo.start(static_cast<int>(std::lround(command.seconds * 1000)));
        return {};
    }
    default:
        return m_controls.press(page, control);
    }
}

void ScenarioPlayer::letGo() {
    if (const auto held = std::exchange(m_held, std::nullopt))
        m_controls.letGo(*held);
}

// What a second press could hit that was not there for the first: a page, or a panel over it.
QList<QPointer<const QWidget>> ScenarioPlayer::inFront() const {
    QList<QPointer<const QWidget>> shown;
    shown += m_program.window().frontView();
    for (const Overlay* panel : m_program.window().findChildren<Overlay*>()) {
        if (panel->isVisible())
            shown += panel;
    }
    return shown;
}

void ScenarioPlayer::pressAgain() {
    if (!m_program.chain().hasEnded() && inFront() != m_before)
        m_pressing->pressAgain();
}

ScenarioPlayer::Look ScenarioPlayer::look(const ScenarioCommand& command) {
    const QString name = command.page + u'.' + command.control;
    switch (command.verb) {
    case ScenarioVerb::Page: {
        const QString front = m_controls.frontPage();
        return {front == command.page, u"page %1"_s.arg(command.page),
                front.isEmpty() ? u"no page"_s : u"page %1"_s.arg(front), command.seconds};
    }
    case ScenarioVerb::Expect:
    case ScenarioVerb::Until: {
        const Result<QString> text = m_controls.text(command.page, command.control);
        return {text && *text == command.text, name + u' ' + quoted(command.text), inWords(text), command.seconds};
    }
    case ScenarioVerb::ExpectVisible:
    case ScenarioVerb::UntilVisible: {
        const Result<bool> visible = m_controls.visible(command.page, command.control);
        return {visible && *visible == command.yes, name + (command.yes ? u" visible: yes"_s : u" visible: no"_s),
                inWords(visible), command.seconds};
    }
    case ScenarioVerb::ExpectCount: {
        const Result<int> count = m_controls.count(command.page, command.control);
        return {count && *count == command.number, u"%1 count %2"_s.arg(name).arg(command.number), inWords(count)};
    }
    case ScenarioVerb::ExpectItem: {
        const Result<QString> item = m_controls.item(command.page, command.control, command.number);
        return {item && *item == command.text, u"%1 item %2 "_s.arg(name).arg(command.number) + quoted(command.text),
                inWords(item)};
    }
    case ScenarioVerb::ExpectMessage:
        return lookForMessage(command.text);
    case ScenarioVerb::Pause:
        return waitForPause(command.seconds);
    case ScenarioVerb::Dump:
        return dump(command);
    case ScenarioVerb::Shot:
        return shoot(command.text);
    case ScenarioVerb::Pick:
        return preparePick(command.text);
    case ScenarioVerb::Answer:
        m_answers += command.yes;
        return {true, {}, {}};
    case ScenarioVerb::Press:
    case ScenarioVerb::PressAt:
    case ScenarioVerb::Hold:
    case ScenarioVerb::Drag:
    case ScenarioVerb::Type:
    case ScenarioVerb::Choose:
    case ScenarioVerb::Tick:
    case ScenarioVerb::Touch:
    case ScenarioVerb::TouchAt:
    case ScenarioVerb::TouchType:
        break; // done by touch()
    }
    return {};
}

ScenarioPlayer::Look ScenarioPlayer::lookForMessage(const QString& wanted) {
    const QStringList& shown = m_program.dialogs().shownTexts;
    const QString said = u"the message "_s + quoted(wanted);
    if (m_messagesTaken >= shown.size())
        return {false, said, u"no message"_s, patienceOfMessage};
    // Some texts end their lines with a carriage return, which a scenario can't contain.
    QString oldest = shown[m_messagesTaken++];
    oldest.replace(u"\r\n"_s, u"\n"_s).replace(u'\r', u'\n');
    return {oldest == wanted, said, quoted(oldest)};
}

ScenarioPlayer::Look ScenarioPlayer::waitForPause(double seconds) const {
    return {static_cast<double>(m_atThisLine.elapsed()) >= seconds * 1000, {}, {}, seconds + patienceOfWork};
}

ScenarioPlayer::Look ScenarioPlayer::dump(const ScenarioCommand& command) const {
    const QString wanted = u"what %1.%2 holds in %3"_s.arg(command.page, command.control, command.text);
    QString content;
    if (const Result<int> count = m_controls.count(command.page, command.control)) {
        for (int i = 0; i < *count; ++i) {
            const Result<QString> item = m_controls.item(command.page, command.control, i);
            if (!item)
                return {false, wanted, item.failure().message};
            content += *item + u'\n';
        }
    } else {
        const Result<QString> text = m_controls.text(command.page, command.control);
        if (!text)
            return {false, wanted, text.failure().message};
        content = *text + u'\n';
    }
    QSaveFile file(command.text);
    const bool written = file.open(QIODevice::WriteOnly) && file.write(content.toUtf8()) >= 0 && file.commit();
    return {written, wanted, file.errorString()};
}

ScenarioPlayer::Look ScenarioPlayer::shoot(const QString& name) const {
    const QString path = QDir(m_manner.shots).filePath(name + u".png"_s);
    return {QDir().mkpath(m_manner.shots) && m_program.window().grab().save(path, "PNG"), u"the picture "_s + path,
            u"it can't be written"_s};
}

ScenarioPlayer::Look ScenarioPlayer::preparePick(const QString& hostPath) {
    const QFileInfo picked(hostPath);
    const Files& files = m_program.platform().files;
    const DoorRules& door = m_program.state().door;
    DrivePath path = files.drives().toDrive(toHostPath(picked.canonicalFilePath()));
    if (picked.isDir()) {
        const QStringList pictures = files.storedNames(path, picturePatterns(door.everyFormat));
        if (pictures.isEmpty())
            return {false, u"a picture in "_s + hostPath, u"none"_s};
        path = path / pictures.front();
    } else if (!picked.isFile()) {
        return {false, u"the file "_s + hostPath, u"it does not exist"_s};
    }
    m_picks += door.any() ? path : DrivePath(AnsiCodePage::squeeze(path.text())); // as the picker gives it
    return {true, {}, {}};
}

std::optional<DrivePath> ScenarioPlayer::takePick() {
    if (!m_picks.isEmpty())
        return m_picks.takeFirst();
    fail(place(), u"no file dialog"_s, u"one, and no pick was prepared for it"_s);
    return DrivePath();
}

std::optional<bool> ScenarioPlayer::takeAnswer() {
    if (!m_answers.isEmpty())
        return m_answers.takeFirst();
    fail(place(), u"no question"_s,
         u"one, and no answer was prepared for it: "_s +
             quoted(m_program.dialogs().shownTexts.value(m_program.dialogs().shownTexts.size() - 1)));
    return false;
}

void ScenarioPlayer::moveOn() {
    ++m_command;
    m_atThisLine.start();
}

QString ScenarioPlayer::place() const {
    if (m_file == m_files.size())
        return u"at the end"_s;
    const ScenarioFile& file = m_files[m_file];
    const std::size_t command = std::min(m_command, file.commands().size() - 1);
    return u"%1:%2"_s.arg(file.name()).arg(file.commands()[command].line);
}

void ScenarioPlayer::fail(const QString& where, const QString& wanted, const QString& found) {
    fail(u"%1: wanted %2, found %3"_s.arg(where, wanted, found));
}

void ScenarioPlayer::fail(const QString& sentence) {
    if (m_failure.isEmpty())
        m_failure = sentence;
    finish();
}

void ScenarioPlayer::finish() {
    m_timer.stop();
    if (!std::exchange(m_finished, true))
        Q_EMIT finished();
}

} // namespace lumora
