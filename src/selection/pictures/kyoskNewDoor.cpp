// The page of pictures: those that are no ordinary JPEG files, and are made ready in the background.
#include "order/DoorFolders.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "selection/door/PictureDoor.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr qsizetype namesInMessage = 8;

} // namespace

// An order that comes back finds its pictures where they were made.
void kyoskNew::openDoor(const HandOver& before) {
    m_choice.setWorked([this](const QString& listed) { return m_door->worked(listed); });
    if (!m_door->isOpen())
        return;
    m_door->setFolder(before.back && !before.doorFolder.isEmpty() ? before.doorFolder
                                                                  : newDoorFolder(m_platform.files));
    m_door->setKept([this](const QString& path) { return m_choice.inBasket(path) || m_choice.page().contains(path); });
    connect(m_door.get(), &PictureDoor::settled, this, &kyoskNew::pictureSettled);
}

// The customer's own path.
DrivePath kyoskNew::shownPath(const QString& path) const {
    return DrivePath(m_door->shown(path));
}

QString kyoskNew::unreadableText(const QString& path) const {
    switch (m_door->failureOf(path).kind) {
    case Failure::Kind::Unsupported:
        return m_state.wording(u"סוג קובץ שלא ניתן להציג", u"a kind of file that can't be shown");
    case Failure::Kind::TimedOut:
    case Failure::Kind::TooLarge:
        return m_state.wording(u"התמונה גדולה מדי", u"this picture is too large");
    default:
        return m_state.wording(u"הקובץ פגום", u"this file is damaged");
    }
}

// The page in view first, then the next one, then the rest of what is chosen.
void kyoskNew::orderPictures(const QStringList& next) {
    if (!m_door->isOpen())
        return;
    QStringList wanted;
    if (!m_openWhenMade.isEmpty())
        wanted += m_openWhenMade;
    wanted += m_choice.page().items();
    wanted += next;
    wanted += m_choice.basket().paths();
    m_door->want(wanted);
}

QStringList kyoskNew::nextPictures() const {
    const FolderPager& folders = m_choice.folders();
    QStringList next;
    const int behind = std::min(folders.currentIndex() + cellsOfPage, folders.count());
    for (int i = std::max(folders.currentIndex(), 0); i < behind; ++i)
        next += m_door->worked(folders.item(i));
    return next;
}

void kyoskNew::pictureSettled(const QString& path) {
    if (m_handedOver)
        return;
    if (m_door->isNotMade(path) && !doorPanel.visible && !std::exchange(m_notMadeTold, true))
        tellNotMade(path);
    takeOutUnreadable(path);
    const bool told = chosenThat(&PictureDoor::isWaiting).isEmpty() && tellTakenOut();
    m_resolution.look(path);
    repaint(path);
    showChoice();
    const bool opens = m_openWhenMade == path;
    if (opens)
        m_openWhenMade.clear();
    if (!plain() && opens && !m_picking && m_chain.front() == this)
        choosePicture(List2.find(path));
    else if (plain() && m_largePath.text() == path)
        showLarge(m_largePath);
    if (doorPanel.visible && told)
        stopWaiting(); // the customer looks at what is left
    else if (doorPanel.visible)
        showWaiting();
    Q_EMIT changed();
}

void kyoskNew::findUnreadable(const QString& path, const Failure& why) {
    m_door->foundUnreadable(path, why);
    takeOutUnreadable(path);
}

void kyoskNew::takeOutUnreadable(const QString& path) {
    if (!m_door->isUnreadable(path) || !m_choice.inBasket(path))
        return;
    m_choice.remove(path);
    m_takenOut += shownPath(path).leaf();
}

// True when there was anything to tell.
bool kyoskNew::tellTakenOut() {
    if (m_takenOut.isEmpty())
        return false;
    QStringList names = m_takenOut.first(std::min(m_takenOut.size(), namesInMessage));
    if (m_takenOut.size() > namesInMessage)
        names += m_state.wording(u"ועוד %1", u"and %1 more").arg(m_takenOut.size() - namesInMessage);
    m_takenOut.clear();
    const QString told = m_state.wording(u"לא ניתן לקרוא תמונות אלה, והן הוצאו מההזמנה:\n%1",
                                         u"These pictures can't be read and were taken out of the order:\n%1");
    m_platform.dialogs.message(told.arg(names.join(u'\n')));
    return true;
}

QStringList kyoskNew::chosenThat(bool (PictureDoor::*is)(const QString&) const) const {
    QStringList chosen = m_choice.basket().paths();
    chosen.removeIf([&](const QString& path) { return !(*m_door.*is)(path); });
    return chosen;
}

// The order goes on once the last chosen picture is made; what a full disk did not take is tried once more.
void kyoskNew::finishOnceMade() {
    m_openWhenMade.clear();
    orderPictures();
    showWaiting();
}

void kyoskNew::showWaiting() {
    const qsizetype chosen = m_choice.basket().count();
    const qsizetype waiting = chosenThat(&PictureDoor::isWaiting).size();
    const QStringList notMade = chosenThat(&PictureDoor::isNotMade);
    doorPanel.visible = waiting > 0;
    doorShare = chosen > 0 ? 1 - static_cast<double>(waiting) / static_cast<double>(chosen) : 1;
    doorCount.text = u"%1 / %2"_s.arg(chosen - waiting).arg(chosen);
    if (waiting > 0)
        Q_EMIT changed();
    else if (notMade.isEmpty())
        openFinish();
    else
        tellNotMade(notMade.first());
}

void kyoskNew::tellNotMade(const QString& path) {
    const Failure why = m_door->failureOf(path);
    const QString reason =
        why.kind == Failure::Kind::NoSpace ? m_state.wording(u"הדיסק מלא", u"The disk is full") : why.message;
    m_platform.dialogs.message(
        m_state
            .wording(u"התמונה %1 לא הוכנה להזמנה.\nמה שכבר הוכן נשמר. נא לפנות לצוות.\n%2",
                     u"The picture %1 could not be made ready.\nWhat is ready stays. Please ask the staff.\n%2")
            .arg(shownPath(path).leaf(), reason));
}

void kyoskNew::stopWaiting() {
    doorPanel.visible = false;
    Q_EMIT changed();
}

} // namespace lumora
