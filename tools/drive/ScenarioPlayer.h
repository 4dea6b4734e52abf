#pragma once

#include "common/DrivePath.h"
#include "drive/ControlFinder.h"
#include "drive/ScenarioFile.h"

#include <QElapsedTimer>
#include <QObject>
#include <QStringList>
#include <QTimer>

#include <optional>

namespace lumora {

class Program;

// Plays scenario files on the pages as a customer would, from the event loop, so that it can also watch and stop work
// that is under way. Before it touches a control it closes all open message boxes.
// A line waits until the work started by the lines before it has ended. Only page, until, until-visible, pause, shot,
// dump, pick and answer run during such work; after a page, until, until-visible or pause that was fulfilled during it
// the next line runs at once.
class ScenarioPlayer : public QObject {
    Q_OBJECT
public:
    struct Manner {
        QString shots;             // the folder of the pictures on this machine
        Hand hand = Hand::Mouse;   // of all but the lines that touch
        bool pressesTwice = false; // once more behind each press that changes what is in front
    };
    ScenarioPlayer(Program& program, std::vector<ScenarioFile> files, Manner manner);

    void start() { m_timer.start(); }

    // Called when the event loop has ended: lines that are left fail, since the program has ended.
    void settle() { step(); }

    // Empty while all lines held; else "FILE:LINE: what was wanted, what was found" of the failed line.
    const QString& failure() const { return m_failure; }
    bool allHeld() const { return m_finished && m_failure.isEmpty(); }

Q_SIGNALS:
    // Emitted when all lines held or one failed.
    void finished();

private:
    // The result of trying a line.
    struct Look {
        bool held = false;
        QString wanted;
        QString found;
        double patience = 0; // seconds until a line that does not hold fails
    };

    void step();
    bool mayRunNow(ScenarioVerb verb) const;
    void touch(const ScenarioCommand& command);
    Result<void> use(const ScenarioCommand& command);
    void letGo();
    void pressAgain();
    QList<QPointer<const QWidget>> inFront() const;
    Look look(const ScenarioCommand& command);
    Look lookForMessage(const QString& wanted);
    Look waitForPause(double seconds) const;
    Look dump(const ScenarioCommand& command) const;
    Look shoot(const QString& name) const;
    Look preparePick(const QString& hostPath);
    std::optional<DrivePath> takePick();
    std::optional<bool> takeAnswer();

    void moveOn();
    QString place() const;
    void fail(const QString& place, const QString& wanted, const QString& found);
    void fail(const QString& sentence);
    void finish();

    Program& m_program;
    ControlFinder m_controls;
    ControlFinder m_finger;
    std::vector<ScenarioFile> m_files;
    Manner m_manner;

    QTimer m_timer;
    std::size_t m_file = 0;
    std::size_t m_command = 0;
    QElapsedTimer m_atThisLine;
    std::optional<ControlFinder::Held> m_held;
    QTimer m_letGo;
    QTimer m_pressAgain;
    QList<QPointer<const QWidget>> m_before; // what was in front before the press
    const ControlFinder* m_pressing = nullptr;
    bool m_goesOnInTheMiddle = false;
    bool m_finished = false;
    qsizetype m_messagesTaken = 0; // index in ScreenDialogs::shownTexts
    QList<DrivePath> m_picks;
    QList<bool> m_answers;
    QString m_failure;
};

} // namespace lumora
