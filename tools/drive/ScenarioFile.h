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
    Touch,
    TouchAt,
    TouchType,
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
    UntilVisible,
    Dump,
    Shot,
    Pause,
};

// One command. scenarioHelp() tells which fields each verb uses.
struct ScenarioCommand {
    int line = 0; // line of the file, from 1
    ScenarioVerb verb = ScenarioVerb::Page;
    QString page;
    QString control;       // "Command12", "Image1(0)"
    QString text;          // unescaped; also the path of pick and dump, and the name of a shot
    double seconds = 0;    // page, until, until-visible, pause, hold
    int number = 0;        // expect-count, expect-item
    bool yes = false;      // tick, answer, expect-visible, until-visible
    QPointF from, to;      // press-at, touch-at (only from), drag: per cent of the control's width and height
    bool rightKey = false; // press-at: right mouse button
};

// A text file of what a customer does on the pages and what must be seen there, one command a line. Blank lines and
// lines that begin with "#" are skipped, and so is a " #" with what follows, unless the command takes a text.
class ScenarioFile {
public:
    // name: the file's name in messages. Fails at the first bad line with kind Damaged and "NAME:LINE: ...".
    static Result<ScenarioFile> parse(const QByteArray& bytes, const QString& name);
    static Result<ScenarioFile> load(const QString& hostPath);

    const QString& name() const { return m_name; }
    const std::vector<ScenarioCommand>& commands() const { return m_commands; }

private:
    QString m_name;
    std::vector<ScenarioCommand> m_commands;
};

// The commands, one a line, for --help.
QString scenarioHelp();

} // namespace lumora
