// The page of pictures: those that are no ordinary JPEG files, and are made ready in the background.
#include "order/DoorFolders.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "selection/door/PictureDoor.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

// An order that comes back finds its pictures where they were made.
void kyoskNew::openDoor(const HandOver& before) {
    m_choice.setWorked([this](const QString& listed) { return m_door->worked(listed); });
    m_state.keptFolder = {};
    const bool keepsCards = m_platform.cards.areWatched();
    if (!m_door->isOpen() && !keepsCards)
        return;
    m_door->setFolder(before.back && !before.doorFolder.isEmpty() ? before.doorFolder : newDoorFolder(m_platform.files),
                      keepsCards);
    m_door->setKept([this](const QString& path) { return m_choice.inBasket(path); },
                    [this](const QString& path) { return m_choice.page().contains(path); });
    if (keepsCards) {
        m_state.keptFolder = m_door->folder();
        m_copies = std::make_unique<CardCopies>(m_platform.files, m_state.keptFolder);
    }
    connect(m_door.get(), &PictureDoor::settled, this, &kyoskNew::pictureSettled);
    connect(m_door.get(), &PictureDoor::drafted, this, &kyoskNew::showDraft);
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
    if (m_door->folder().isEmpty())
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
    const bool pulled = m_copies && m_copies->stateOf(path) == CardCopies::State::Missing;
    if (!pulled && m_wait.tellsAtOnce(path))
        tellNotMade(path);
    takeOutUnreadable(path);
    const QStringList chosen = m_choice.basket().paths();
    const bool anyWaits = std::ranges::any_of(chosen, [this](const QString& one) { return m_door->isWaiting(one); });
    const bool told = !anyWaits && tellTakenOut();
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
    if (m_wait.waits() && told)
        stopWaiting(); // the customer looks at what is left
    else if (m_wait.waits())
        showWaiting();
    Q_EMIT changed();
}

void kyoskNew::tellNotMade(const QString& path) {
    m_platform.dialogs.message(m_wait.notMadeWords(path));
}

void kyoskNew::showDraft(const QString& path) {
    const int cell = List2.find(path);
    if (cell < 0 || cell >= cellsOfPage || !Picture1[static_cast<std::size_t>(cell)].bitmap.isNull())
        return;
    Picture1[static_cast<std::size_t>(cell)].bitmap = m_door->draft(path, m_cellPixels);
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
    m_wait.takeOut(shownPath(path).leaf());
}

// True when there was anything to tell.
bool kyoskNew::tellTakenOut() {
    const QString words = m_wait.takenOutWords();
    if (!words.isEmpty())
        m_platform.dialogs.message(words);
    return !words.isEmpty();
}

// Goes on once the last chosen picture is made, and copied where it lies on a card; what a full disk did not take is
// tried once more.
void kyoskNew::onceMade(void (kyoskNew::*goOn)()) {
    m_openWhenMade.clear();
    m_onceMade = goOn;
    orderPictures();
    copyChosen(true);
    showWaiting();
}

// A card that hangs does not hold the page for good.
bool kyoskNew::isWorking() const {
    return m_wait.waits() && m_platform.clock.running() - m_waitMoved < std::chrono::minutes(5);
}

void kyoskNew::showWaiting() {
    m_waitMoved = m_platform.clock.running();
    const DoorWait::Then then =
        m_wait.count(m_choice.basket().paths(), [this](const QString& path) { return isCopied(path); });
    doorPanel.visible = m_wait.waits();
    doorShare = m_wait.share();
    doorCount.text = m_wait.counted();
    if (then == DoorWait::Then::Wait)
        Q_EMIT changed();
    else if (!chosenOnCards(CardCopies::State::Missing).isEmpty())
        askForMissing();
    else if (then == DoorWait::Then::GoOn)
        (this->*m_onceMade)();
    else
        tellNotMade(m_wait.notMade());
}

void kyoskNew::stopWaiting() {
    m_wait.stop();
    doorPanel.visible = false;
    Q_EMIT changed();
}

} // namespace lumora
