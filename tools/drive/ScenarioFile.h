#pragma once

#include "common/Result.h"

#include <QByteArray>
#include <QPointF>
#include <QString>

#include <vector>

namespace lumora {

enum class ScenarioVerb {
    Page,
    Press,
    PressAt,
    Hold,
    Drag,
    Type,
    Choose,
    Tick,
    Pick,
    Answer,
    Expect,
    ExpectVisible,
    ExpectCount,
    ExpectItem,
    ExpectMessage,
    Until,
    Dump,
    Shot,
    Pause,
};

// One command. Which of the fields count is the verb's: see scenarioHelp().
struct ScenarioCommand {
    int line = 0; // of the file, from 1
    ScenarioVerb verb = ScenarioVerb::Page;
    QString page;
    QString control;       // "Command12", "Image1(0)"
    QString text;          // with its line breaks; also the path of pick and dump and the name of a shot
    double seconds = 0;    // page, until, pause, hold
    int number = 0;        // expect-count, expect-item
    bool yes = false;      // tick, answer, expect-visible
    QPointF from, to;      // press-at (from alone), drag: percent of the control's width and height
    bool rightKey = false; // press-at: of the mouse
};

// A text file that says what a customer does at the pages and what must be seen there: one command a line, blank lines
// and lines that begin with "#" are passed over, as is what follows " #" behind a command that takes no text.
class ScenarioFile {
public:
    // name is what messages call the file. The failure is of kind Damaged and reads "NAME:LINE: ...", for the first bad
    // line.
    static Result<ScenarioFile> parse(const QByteArray& bytes, const QString& name);
    static Result<ScenarioFile> load(const QString& hostPath);

    const QString& name() const { return m_name; }
    const std::vector<ScenarioCommand>& commands() const { return m_commands; }

private:
    QString m_name;
    std::vector<ScenarioCommand> m_commands;
};

// The commands, a line each, for --help.
QString scenarioHelp();

} // namespace lumora
