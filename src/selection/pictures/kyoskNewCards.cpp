// The page of pictures: the card or stick that was put in is offered.
#include "common/AnsiCodePage.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "selection/CardWords.h"
#include "selection/PlaceNames.h"
#include "selection/pictures/kyoskNew.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

void kyoskNew::watchCards() {
    if (!m_platform.cards.areWatched())
        return;
    m_watch.emplace(m_platform.cards);
    connect(&m_platform.cards, &Cards::changed, this, [this] {
        if (!m_handedOver)
            cardsChanged();
    });
    connect(m_copies.get(), &CardCopies::settled, this, [this](const QString& path) {
        if (!m_handedOver)
            copySettled(path);
    });
    noteCards();
}

// The card that came last is offered, until its newest pictures are among those of the page.
void kyoskNew::showCards() {
    if (!m_platform.cards.areWatched())
        return;
    CardWords words = noCardWords(m_state.english());
    m_cardPicture = {};
    for (const Cards::Card& card : m_platform.cards.all()) {
        DrivePath picture;
        if (card.summary && card.summary->pictures > 0) {
            // As the picker tells it.
            picture = m_platform.files.drives().toDrive(card.summary->newestPicture);
            if (!m_state.door.any())
                picture = DrivePath(AnsiCodePage::squeeze(picture.text()));
        }
        if (!picture.isEmpty() && m_choice.folders().paths().contains(picture.text())) {
            if (m_cardPicture.isEmpty())
                words = openedCardWords(m_state.english());
            continue;
        }
        words = cardWords(card, m_platform.clock.now().date(), m_state.english());
        m_cardPicture = picture;
    }
    cardOffer.visible = true;
    cardOffer.enabled = words.opens;
    cardOffer.text = words.head;
    cardNote.text = words.note;
    showCopies();
}

// As in the picker, whose places customers know.
QString kyoskNew::folderName() const {
    const DrivePath folder(Label29.text.trimmed());
    if (!folder.leaf().isEmpty())
        return folder.leaf();
    for (const Drives::Drive& drive : m_platform.files.drives().drives()) {
        if (drive.removable && folder.text().startsWith(drive.letter))
            return placeOf(drive.folder, m_platform.cards.all(), m_state.english()).words;
    }
    return folder.text();
}

void kyoskNew::openCard() {
    if (m_picking || m_handedOver || m_cardPicture.isEmpty())
        return;
    m_picking = true;
    turnPage([this] {
        const DrivePath picture = m_cardPicture;
        if (!refusesName(picture))
            showFolderOf(picture);
    });
    m_picking = false;
}

} // namespace lumora
