#include "order/OrderState.h"

#include "common/FixedText.h"
#include "order/OrderFolder.h"
#include "platform/files/Files.h"

#include <array>
#include <optional>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array phases = {"preparing", "prepared", "sending", "arrived", "reported"};
constexpr std::array ways = {"ftp", "http", "station", "mail"};
constexpr std::array senders = {"ftp", "http"};
constexpr std::array reports = {"not yet", "begun", "done"};

const QString choicePrefix = u"Choice."_s;
const QString lastKey = u"End"_s;

DrivePath statePath(const OrderFolder& folder) {
    return folder.statePath();
}

// A caption may hold line breaks, and behind a quote a break would end the line.
QString withoutBreaks(QString text) {
    return text.replace(u'%', u"%25"_s).replace(u'\r', u"%0D"_s).replace(u'\n', u"%0A"_s);
}

QString withBreaks(QString text) {
    return text.replace(u"%0A"_s, u"\n"_s).replace(u"%0D"_s, u"\r"_s).replace(u"%25"_s, u"%"_s);
}

class StateWriter {
public:
    void text(const QString& key, const QString& value) {
        m_output.pair(withoutBreaks(key), withoutBreaks(value));
        ++m_lines;
    }
    template <std::size_t N, class Enum>
    void word(const char* key, const std::array<const char*, N>& words, Enum value) {
        text(QLatin1StringView(key), QLatin1StringView(words[static_cast<std::size_t>(value)]));
    }
    void truth(const char* key, bool value) { text(QLatin1StringView(key), value ? u"yes" : u"no"); }

    QByteArray end() {
        m_output.text(lastKey).number(m_lines).endLine();
        return m_output.bytes();
    }

private:
    void text(QLatin1StringView key, QStringView value) { text(QString(key), value.toString()); }
    void text(QLatin1StringView key, QLatin1StringView value) { text(QString(key), QString(value)); }

    ListOutput m_output;
    int m_lines = 0;
};

template <std::size_t N, class Enum>
bool takeWord(const std::array<const char*, N>& words, const QString& value, Enum& taken) {
    for (std::size_t i = 0; i < N; ++i) {
        if (value == QLatin1StringView(words[i])) {
            taken = static_cast<Enum>(i);
            return true;
        }
    }
    return false;
}

bool takeTruth(const QString& value, bool& taken) {
    taken = value == u"yes";
    return taken || value == u"no";
}

// The length, a blank, the leaf name.
bool takeLength(QMap<QString, qint64>& lengths, const QString& value) {
    bool isNumber = false;
    const qint64 length = value.section(u' ', 0, 0).toLongLong(&isNumber);
    lengths[value.section(u' ', 1)] = length;
    return isNumber;
}

// False for a value that this version can't take.
bool takeEntry(OrderState& state, const QString& key, const QString& value) {
    if (key == u"Phase")
        return takeWord(phases, value, state.phase);
    if (key == u"Way")
        return takeWord(ways, value, state.way);
    if (key == u"Report")
        return takeWord(reports, value, state.report);
    if (key == u"FolderAsked")
        return takeWord(senders, value, state.folderAsked.emplace());
    if (key == u"FolderMadeByUs")
        return takeTruth(value, state.folderMadeByUs);
    if (key == u"FewerAgreed")
        return takeTruth(value, state.fewerAgreed);
    if (key == u"GivenUp")
        return takeTruth(value, state.givenUp);
    if (key == u"Held")
        return takeTruth(value, state.held);
    if (key == u"Lapsed")
        return takeTruth(value, state.lapsed);
    if (key == u"SentBefore")
        return takeTruth(value, state.sentBefore);
    if (key == u"Proven")
        return takeTruth(value, state.proven);
    if (key == u"ProvenByNameOnly")
        return takeTruth(value, state.provenByNameOnly);
    if (key == u"MisparHazmana")
        state.number = value;
    else if (key == u"Shemot.ser")
        state.serial = value;
    else if (key == u"Optint")
        state.kind = static_cast<OrderKind>(Val16(value));
    else if (key == u"FilesSent")
        state.filesSent = value.toInt();
    else if (key == u"FilesInAll")
        state.filesInAll = value.toInt();
    else if (key == u"Tries")
        state.tries = value.toInt();
    else if (key == u"WhyHebrew")
        state.why.hebrew = value;
    else if (key == u"WhyEnglish")
        state.why.english = value;
    else if (key == u"Replaces")
        state.replaces = value;
    else if (key == u"KeptIn")
        state.keptIn = value;
    else if (key == u"InHand")
        state.filesInHand += value;
    else if (key == u"Shoora")
        state.items += value;
    else if (key == u"Length")
        return takeLength(state.lengths, value);
    else if (key == u"Mark")
        state.marks += value;
    else if (key.startsWith(choicePrefix))
        state.choices += {key.mid(choicePrefix.size()), value};
    else
        state.further += {key, value};
    return true;
}

Failure damagedState(const QString& why) {
    return {Failure::Kind::Damaged, u"the order's state %1"_s.arg(why)};
}

} // namespace

QByteArray OrderState::write() const {
    StateWriter writer;
    writer.word("Phase", phases, phase);
    writer.text(u"MisparHazmana"_s, number);
    writer.text(u"Shemot.ser"_s, serial);
    writer.text(u"Optint"_s, QString::number(static_cast<int>(kind)));
    writer.word("Way", ways, way);
    if (folderAsked)
        writer.word("FolderAsked", senders, *folderAsked);
    writer.truth("FolderMadeByUs", folderMadeByUs);
    if (fewerAgreed)
        writer.truth("FewerAgreed", true);
    if (sentBefore)
        writer.truth("SentBefore", true);
    writer.truth("ProvenByNameOnly", provenByNameOnly);
    if (proven)
        writer.truth("Proven", true);
    writer.word("Report", reports, report);
    if (phase == Phase::Sending && filesInAll > 0) {
        writer.text(u"FilesSent"_s, QString::number(filesSent));
        writer.text(u"FilesInAll"_s, QString::number(filesInAll));
    }
    if (phase < Phase::Arrived && tries > 0) {
        writer.text(u"Tries"_s, QString::number(tries));
        writer.text(u"WhyHebrew"_s, why.hebrew);
        writer.text(u"WhyEnglish"_s, why.english);
    }
    if (phase < Phase::Arrived && givenUp)
        writer.truth("GivenUp", true);
    if (phase < Phase::Sending && held)
        writer.truth("Held", true);
    if (phase < Phase::Reported && lapsed)
        writer.truth("Lapsed", true);
    for (const QString& path : filesInHand)
        writer.text(u"InHand"_s, path);
    if (!replaces.isEmpty())
        writer.text(u"Replaces"_s, replaces);
    if (phase < Phase::Reported) {
        for (const auto& [key, value] : choices)
            writer.text(choicePrefix + key, value);
    }
    for (auto length = lengths.cbegin(); length != lengths.cend(); ++length)
        writer.text(u"Length"_s, QString::number(length.value()) + u' ' + length.key());
    if (phase <= Phase::Prepared) {
        if (!keptIn.isEmpty())
            writer.text(u"KeptIn"_s, keptIn);
        for (const QString& item : items)
            writer.text(u"Shoora"_s, item);
        for (const QString& mark : marks)
            writer.text(u"Mark"_s, mark);
    }
    for (const auto& [key, value] : further)
        writer.text(key, value);
    return writer.end();
}

Result<OrderState> OrderState::parse(const QByteArray& bytes) {
    QList<ListOutputEntry> entries = ReadListOutput(bytes);
    const bool whole = bytes.endsWith("\r\n") && !entries.isEmpty() && entries.last().key == lastKey &&
                       entries.last().value == QString::number(entries.size() - 1);
    if (!whole)
        return damagedState(u"is not whole"_s);
    entries.removeLast();
    OrderState state;
    bool phaseTold = false;
    for (const auto& [writtenKey, writtenValue] : std::as_const(entries)) {
        const QString key = withBreaks(writtenKey);
        const QString value = withBreaks(writtenValue);
        phaseTold = phaseTold || key == u"Phase";
        if (!takeEntry(state, key, value))
            return damagedState(u"has \"%1\" for %2"_s.arg(value, key));
    }
    if (!phaseTold)
        return damagedState(u"has no phase"_s);
    return state;
}

Result<void> WriteOrderState(const Files& files, const OrderFolder& folder, const OrderState& state) {
    return files.writeWhole(statePath(folder), state.write());
}

Result<OrderState> ReadOrderState(const Files& files, const OrderFolder& folder) {
    const DrivePath path = statePath(folder);
    const Result<QByteArray> bytes = files.read(path);
    if (!bytes)
        return bytes.failure();
    Result<OrderState> state = OrderState::parse(*bytes);
    if (!state)
        return Failure{state.failure().kind, u"%1: %2"_s.arg(path.text(), state.failure().message)};
    return state;
}

} // namespace lumora
