#include "drive/ScenarioFile.h"

#include <QFile>
#include <QStringDecoder>

#include <algorithm>
#include <array>
#include <cmath>
#include <optional>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

enum class Takes {
    Page,
    Control,
    Seconds,
    OptionalSeconds,
    Milliseconds,
    Number,
    Flag,  // 0 or 1
    YesNo, // yes or no
    From,  // two percentages
    To,
    OptionalRight,
    Word,
    Text,     // rest of the line, may be empty
    SomeText, // rest of the line, not empty
};

struct Grammar {
    ScenarioVerb verb;
    const char* word;
    std::vector<Takes> takes;
    const char* help;
};

constexpr double patienceOfPage = 30; // seconds, if the line names none

const std::array<Grammar, 23>& grammars() {
    static const std::array<Grammar, 23> all{{
        {ScenarioVerb::Page,
         "page",
         {Takes::Page, Takes::OptionalSeconds},
         "NAME [SECONDS]: wait until that page is in front"},
        {ScenarioVerb::Press, "press", {Takes::Control}, "PAGE.CONTROL"},
        {ScenarioVerb::Touch,
         "touch",
         {Takes::Control},
         "PAGE.CONTROL, or a key on the screen by its name, \"keyboard.keyDone\": with a finger"},
        {ScenarioVerb::TouchAt,
         "touch-at",
         {Takes::Control, Takes::From},
         "PAGE.CONTROL X Y: percent of its width and height, with a finger"},
        {ScenarioVerb::TouchType,
         "touch-type",
         {Takes::Control, Takes::SomeText},
         "PAGE.CONTROL TEXT: touches a box and then the keys on the screen"},
        {ScenarioVerb::PressAt,
         "press-at",
         {Takes::Control, Takes::From, Takes::OptionalRight},
         "PAGE.CONTROL X Y [right]: percent of its width and height"},
        {ScenarioVerb::Hold,
         "hold",
         {Takes::Control, Takes::Milliseconds},
         "PAGE.CONTROL MILLISECONDS: press, wait, let go"},
        {ScenarioVerb::Drag,
         "drag",
         {Takes::Control, Takes::From, Takes::To},
         "PAGE.CONTROL X1 Y1 X2 Y2: in percent, in 20 equal moves"},
        {ScenarioVerb::Type, "type", {Takes::Control, Takes::Text}, "PAGE.CONTROL TEXT: replaces what the box holds"},
        {ScenarioVerb::Choose,
         "choose",
         {Takes::Control, Takes::SomeText},
         "PAGE.CONTROL TEXT: a row of a list or a combo box"},
        {ScenarioVerb::Tick, "tick", {Takes::Control, Takes::Flag}, "PAGE.CONTROL 0|1"},
        {ScenarioVerb::Pick,
         "pick",
         {Takes::SomeText},
         "HOSTPATH: the answer of the next file dialog; of a folder its first picture"},
        {ScenarioVerb::Answer, "answer", {Takes::YesNo}, "yes|no: of the next question box"},
        {ScenarioVerb::Expect, "expect", {Takes::Control, Takes::Text}, "PAGE.CONTROL TEXT"},
        {ScenarioVerb::ExpectVisible, "expect-visible", {Takes::Control, Takes::YesNo}, "PAGE.CONTROL yes|no"},
        {ScenarioVerb::ExpectCount, "expect-count", {Takes::Control, Takes::Number}, "PAGE.LIST N"},
        {ScenarioVerb::ExpectItem,
         "expect-item",
         {Takes::Control, Takes::Number, Takes::Text},
         "PAGE.LIST N TEXT: N counts from 0"},
        {ScenarioVerb::ExpectMessage, "expect-message", {Takes::Text}, "TEXT: of the oldest box not yet expected"},
        {ScenarioVerb::Until,
         "until",
         {Takes::Control, Takes::Seconds, Takes::Text},
         "PAGE.CONTROL SECONDS TEXT: wait for a text"},
        {ScenarioVerb::UntilVisible,
         "until-visible",
         {Takes::Control, Takes::Seconds, Takes::YesNo},
         "PAGE.CONTROL SECONDS yes|no: wait until it is shown or hidden"},
        {ScenarioVerb::Dump,
         "dump",
         {Takes::Control, Takes::SomeText},
         "PAGE.CONTROL FILE: a text, or the items of a list"},
        {ScenarioVerb::Shot, "shot", {Takes::Word}, "NAME: a PNG of the page in front"},
        {ScenarioVerb::Pause, "pause", {Takes::Milliseconds}, "MILLISECONDS"},
    }};
    return all;
}

bool isBlank(QChar c) {
    return c == u' ' || c == u'\t';
}

// Turns "\n" into a line break and "\\" into a backslash; any other backslash stays.
QString unescaped(const QString& text) {
    QString result;
    for (qsizetype i = 0; i < text.size(); ++i) {
        const QChar next = i + 1 < text.size() ? text[i + 1] : QChar();
        if (text[i] == u'\\' && (next == u'n' || next == u'\\')) {
            result += next == u'n' ? u'\n' : u'\\';
            ++i;
        } else {
            result += text[i];
        }
    }
    return result;
}

// The rest of a line, read word by word.
class Rest {
public:
    explicit Rest(QString text)
        : m_text(std::move(text)) {}

    // Empty at the end of the line. The one blank after the word is read too: a text begins right behind it.
    QString word() {
        qsizetype begin = 0;
        while (begin < m_text.size() && isBlank(m_text[begin]))
            ++begin;
        qsizetype end = begin;
        while (end < m_text.size() && !isBlank(m_text[end]))
            ++end;
        const QString result = m_text.mid(begin, end - begin);
        m_text = m_text.mid(end + 1);
        return result;
    }
    QString text() { return std::exchange(m_text, {}); }
    bool nothingLeft() const {
        const QString left = m_text.trimmed();
        return left.isEmpty() || left.startsWith(u'#');
    }

private:
    QString m_text;
};

std::optional<double> numberIn(const QString& word) {
    bool ok = false;
    const double number = word.toDouble(&ok);
    return ok && std::isfinite(number) && number >= 0 ? std::optional(number) : std::nullopt;
}

QString takePlace(Rest& rest, QPointF& place) {
    for (double* side : {&place.rx(), &place.ry()}) {
        const QString word = rest.word();
        const std::optional<double> percent = numberIn(word);
        if (!percent || *percent > 100)
            return u"a percentage is wanted, not \"%1\""_s.arg(word);
        *side = *percent;
    }
    return {};
}

// Reads an argument; gives what is wrong with it, or an empty text.
QString take(Takes what, Rest& rest, ScenarioCommand& command) {
    if (what == Takes::Text || what == Takes::SomeText) {
        command.text = unescaped(rest.text());
        return what == Takes::SomeText && command.text.trimmed().isEmpty() ? u"a text is missing"_s : QString();
    }
    if (what == Takes::OptionalSeconds) {
        command.seconds = patienceOfPage;
        if (rest.nothingLeft())
            return {};
    }

    if (what == Takes::OptionalRight && rest.nothingLeft())
        return {};
    if (what == Takes::From || what == Takes::To)
        return takePlace(rest, what == Takes::From ? command.from : command.to);

    const QString word = rest.word();
    if (word.isEmpty() || word.startsWith(u'#'))
        return u"the line ends too early"_s;
    const std::optional<double> number = numberIn(word);
    switch (what) {
    case Takes::Page:
        command.page = word;
        return {};
    case Takes::Control: {
        const qsizetype dot = word.indexOf(u'.');
        command.page = word.left(dot);
        command.control = word.mid(dot + 1);
        if (dot < 1 || command.control.isEmpty())
            return u"PAGE.CONTROL is wanted, not \"%1\""_s.arg(word);
        return {};
    }
    case Takes::Word:
        command.text = word;
        if (word.contains(u'/'))
            return u"a name without \"/\" is wanted, not \"%1\""_s.arg(word);
        return {};
    case Takes::Seconds:
    case Takes::OptionalSeconds:
    case Takes::Milliseconds:
        if (!number)
            return u"a time is wanted, not \"%1\""_s.arg(word);
        command.seconds = what == Takes::Milliseconds ? *number / 1000 : *number;
        return {};
    case Takes::Number:
        if (!number || *number != std::floor(*number) || *number > 1e9)
            return u"a whole number is wanted, not \"%1\""_s.arg(word);
        command.number = static_cast<int>(*number);
        return {};
    case Takes::Flag:
    case Takes::YesNo: {
        const QString on = what == Takes::Flag ? u"1"_s : u"yes"_s;
        const QString off = what == Takes::Flag ? u"0"_s : u"no"_s;
        command.yes = word == on;
        if (word != on && word != off)
            return u"%1 or %2 is wanted, not \"%3\""_s.arg(on, off, word);
        return {};
    }
    case Takes::OptionalRight:
        command.rightKey = true;
        return word == u"right" ? QString() : u"right or nothing is wanted, not \"%1\""_s.arg(word);
    case Takes::From:
    case Takes::To:
    case Takes::Text:
    case Takes::SomeText:
        break;
    }
    return {};
}

QString parseLine(const QString& text, ScenarioCommand& command) {
    Rest rest(text);
    const QString verb = rest.word();
    const auto grammar = std::find_if(grammars().begin(), grammars().end(),
                                      [&](const Grammar& one) { return verb == QLatin1StringView(one.word); });
    if (grammar == grammars().end())
        return u"there is no command \"%1\""_s.arg(verb);
    command.verb = grammar->verb;
    for (const Takes what : grammar->takes) {
        const QString wrong = take(what, rest, command);
        if (!wrong.isEmpty())
            return u"%1: %2 (%1 %3)"_s.arg(verb, wrong, QLatin1StringView(grammar->help));
    }
    if (!rest.nothingLeft())
        return u"%1: too much on the line: \"%2\""_s.arg(verb, rest.text().trimmed());
    return {};
}

} // namespace

Result<ScenarioFile> ScenarioFile::parse(const QByteArray& bytes, const QString& name) {
    QStringDecoder decoder(QStringDecoder::Utf8);
    const QString whole = decoder(bytes);
    if (decoder.hasError())
        return Failure{Failure::Kind::Damaged, u"%1:1: the file is not in UTF-8"_s.arg(name)};

    ScenarioFile file;
    file.m_name = name;
    int number = 0;
    for (QString line : whole.split(u'\n')) {
        ++number;
        if (line.endsWith(u'\r'))
            line.chop(1);
        const QString bare = line.trimmed();
        if (bare.isEmpty() || bare.startsWith(u'#'))
            continue;
        ScenarioCommand command;
        command.line = number;
        const QString wrong = parseLine(line, command);
        if (!wrong.isEmpty())
            return Failure{Failure::Kind::Damaged, u"%1:%2: %3"_s.arg(name).arg(number).arg(wrong)};
        file.m_commands.push_back(std::move(command));
    }
    return file;
}

Result<ScenarioFile> ScenarioFile::load(const QString& hostPath) {
    QFile file(hostPath);
    if (!file.open(QIODevice::ReadOnly))
        return Failure{Failure::Kind::NotFound, u"%1: %2"_s.arg(hostPath, file.errorString())};
    return parse(file.readAll(), hostPath);
}

QString scenarioHelp() {
    QString text;
    for (const Grammar& grammar : grammars())
        text += u"  %1 %2\n"_s.arg(QLatin1StringView(grammar.word), QLatin1StringView(grammar.help));
    return text;
}

} // namespace lumora
