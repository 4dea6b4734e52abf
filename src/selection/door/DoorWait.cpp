#include "selection/door/DoorWait.h"

#include "common/DrivePath.h"
#include "selection/door/PictureDoor.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr qsizetype namesInMessage = 8;

} // namespace

DoorWait::DoorWait(const SessionState& state, const PictureDoor& door)
    : m_state(state)
    , m_door(door) {}

DoorWait::Then DoorWait::count(const QStringList& chosen, const std::function<bool(const QString&)>& isCopied) {
    m_chosen = chosen.size();
    m_waiting = std::ranges::count_if(
        chosen, [&](const QString& path) { return m_door.isWaiting(path) || (isCopied && isCopied(path)); });
    const auto notMade = std::ranges::find_if(chosen, [this](const QString& path) { return m_door.isNotMade(path); });
    m_notMade = notMade == chosen.end() ? QString() : *notMade;
    m_waits = m_waiting > 0;
    return m_waits ? Then::Wait : m_notMade.isEmpty() ? Then::GoOn : Then::TellNotMade;
}

double DoorWait::share() const {
    return m_chosen > 0 ? 1 - static_cast<double>(m_waiting) / static_cast<double>(m_chosen) : 1;
}

QString DoorWait::counted() const {
    return u"%1 / %2"_s.arg(m_chosen - m_waiting).arg(m_chosen);
}

bool DoorWait::tellsAtOnce(const QString& path) {
    return !m_waits && m_door.isNotMade(path) && !std::exchange(m_toldAtOnce, true);
}

QString DoorWait::notMadeWords(const QString& path) const {
    const DrivePath picture(m_door.shown(path));
    return m_state
        .wording(u"התמונה %1 לא הוכנה להזמנה.\nמה שכבר הוכן נשמר. %2\n%3",
                 u"The picture %1 could not be made ready.\nWhat is ready stays. %2\n%3")
        .arg(picture.leaf(), askForHelp(m_state), warnedWords(m_state, m_door.failureOf(path), picture));
}

QString DoorWait::takenOutWords() {
    const QStringList names = std::exchange(m_takenOut, {});
    return names.isEmpty() ? QString()
                           : m_state
                                 .wording(u"לא ניתן לקרוא תמונות אלה, והן הוצאו מההזמנה:\n%1",
                                          u"These pictures can't be read and were taken out of the order:\n%1")
                                 .arg(shortList(m_state, names, namesInMessage, u"\n"_s));
}

} // namespace lumora
