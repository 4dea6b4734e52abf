// The page of pictures: what is chosen from a card is copied, so that the card may go.
#include "common/FixedText.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "selection/CardWords.h"
#include "selection/door/PictureDoor.h"
#include "selection/pictures/kyoskNew.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"

#include <algorithm>
#include <string>

namespace lumora {

using namespace Qt::StringLiterals;
using CopyState = CardCopies::State;

namespace {

constexpr qsizetype namesTold = 8;

bool isBelow(const HostPath& file, const HostPath& folder) {
    const std::string& path = file.native();
    const std::size_t length = folder.native().size();
    return path.size() > length && path[length] == '/' && path.starts_with(folder.native());
}

} // namespace

void kyoskNew::noteCards() {
    m_cardsIn.clear();
    for (const Cards::Card& card : m_platform.cards.all()) {
        m_cardsIn.push_back(card.medium.folder);
        if (std::find(m_cardFolders.begin(), m_cardFolders.end(), card.medium.folder) == m_cardFolders.end())
            m_cardFolders.push_back(card.medium.folder);
    }
}

// Null for a picture that needs no copy: of no card, or under a name that fails in any case.
const PictureSource* kyoskNew::onCard(const QString& path) const {
    const PictureSource* source = m_door->sourceOf(path);
    if (!source || HasQuestionMark(path))
        return nullptr;
    const bool ofCard = std::any_of(m_cardFolders.begin(), m_cardFolders.end(),
                                    [&](const HostPath& folder) { return isBelow(source->file, folder); });
    return ofCard ? source : nullptr;
}

bool kyoskNew::isIn(const PictureSource& picture) const {
    return std::any_of(m_cardsIn.begin(), m_cardsIn.end(),
                       [&](const HostPath& folder) { return isBelow(picture.file, folder); });
}

// What the door has made of a picture is safe too.
CopyState kyoskNew::copyState(const QString& path) const {
    if (!m_copies || !onCard(path))
        return CopyState::Unknown;
    return m_door->stateOf(path) == PictureDoor::State::Ready ? CopyState::Kept : m_copies->stateOf(path);
}

QStringList kyoskNew::chosenOnCards(CopyState state) const {
    QStringList chosen;
    for (const QString& path : m_choice.basket().paths()) {
        if (copyState(path) == state)
            chosen += path;
    }
    return chosen;
}

void kyoskNew::copyChosen(bool again) {
    if (!m_copies)
        return;
    std::vector<CardCopies::Picture> wanted;
    for (const QString& path : m_choice.basket().paths()) {
        if (const PictureSource* picture = onCard(path); picture && copyState(path) != CopyState::Kept)
            wanted.push_back({path, *picture});
    }
    m_copies->want(wanted, again);
}

// A card that came back is read again, and one that went has taken along what could not be copied.
void kyoskNew::cardsChanged() {
    noteCards();
    bool again = false;
    for (const QString& path : m_choice.basket().paths()) {
        const PictureSource* picture = onCard(path);
        const CopyState state = copyState(path);
        again = again || (picture && ((state == CopyState::Missing && isIn(*picture)) ||
                                      (state == CopyState::NotKept && !isIn(*picture))));
    }
    copyChosen(again);
    orderPictures();
    showCards();
    Q_EMIT changed();
}

void kyoskNew::copySettled(const QString& path) {
    if (copyState(path) == CopyState::NotKept && m_choice.inBasket(path) && !m_notKeptTold)
        tellNotKept(m_copies->failureOf(path), shownPath(path));
    tellMissing();
    showCards();
    if (m_wait.waits())
        showWaiting();
    Q_EMIT changed();
}

void kyoskNew::tellNotKept(const Failure& why, const DrivePath& picture) {
    m_notKeptTold = true;
    m_platform.dialogs.message(
        m_state
            .wording(
                u"לא ניתן להעתיק את התמונות מהכרטיס.\nנא להשאיר את הכרטיס עד סוף ההזמנה.\n%1",
                u"The pictures can't be copied from the card.\nPlease leave the card in until the order is done.\n%1")
            .arg(warnedWords(m_state, why, picture)));
}

QString kyoskNew::namesOf(const QStringList& paths) const {
    QStringList names;
    for (const QString& path : paths)
        names += shownPath(path).leaf();
    return shortList(m_state, names, namesTold, u"\n"_s);
}

void kyoskNew::tellMissing() {
    if (m_wait.waits() || !chosenOnCards(CopyState::Waiting).isEmpty())
        return;
    const QStringList missing = chosenOnCards(CopyState::Missing);
    const bool anew = std::any_of(missing.begin(), missing.end(),
                                  [this](const QString& path) { return !m_missingTold.contains(path); });
    m_missingTold = missing;
    if (!anew)
        return;
    const QString told = m_state.wording(u"תמונות אלה לא הועתקו עדיין, ואינן בכרטיס:\n%1\nנא להכניס שוב את הכרטיס.",
                                         u"These pictures were not copied yet, and the card has gone:\n%1\n"
                                         u"Please put the card in again.");
    m_platform.dialogs.message(told.arg(namesOf(missing)));
}

bool kyoskNew::isCopied(const QString& path) const {
    return copyState(path) == CopyState::Waiting;
}

// The order goes on where the customer does without them.
void kyoskNew::askForMissing() {
    const QStringList missing = m_missingTold = chosenOnCards(CopyState::Missing);
    Q_EMIT changed();
    const QString question = m_state.wording(u"תמונות אלה לא הועתקו, ואינן בכרטיס:\n%1\nלהמשיך בלעדיהן?",
                                             u"These pictures were not copied, and the card has gone:\n%1\n"
                                             u"Go on without them?");
    if (!m_platform.dialogs.ask(question.arg(namesOf(missing))) || m_handedOver)
        return;
    for (const QString& path : missing) {
        if (m_choice.inBasket(path) && copyState(path) == CopyState::Missing)
            m_choice.remove(path);
    }
    showChoice();
    showWaiting();
}

void kyoskNew::showCopies() {
    CopyCount count;
    for (const QString& path : m_choice.basket().paths()) {
        const PictureSource* picture = onCard(path);
        if (!picture)
            continue;
        const CopyState state = copyState(path);
        count.kept += state == CopyState::Kept;
        count.waiting += state == CopyState::Waiting;
        count.missing += state == CopyState::Missing;
        count.onCard += state == CopyState::NotKept;
        count.isIn = count.isIn || (state == CopyState::Kept && isIn(*picture));
    }
    cardCopies.text = copyWords(count, m_state.english());
    cardCopies.visible = !cardCopies.text.isEmpty();
}

} // namespace lumora
