#include "transfer/delivery/PreparedAgain.h"

#include "common/FixedText.h"
#include "order/OrderChoices.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "order/UnfinishedOrders.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"

namespace lumora {

namespace {

// A server may deny each folder and open it all the same.
constexpr int mostInARow = 3;

} // namespace

Outcome PreparedAgain::way() const {
    return printsAsTheyAre(m_order.state().kind) ? Outcome::PlainTakenUp : Outcome::EditedTakenUp;
}

bool PreparedAgain::isPossible() const {
    const OrderState& kept = m_order.state();
    return m_state.handOver.renumbered < mostInARow && !kept.items.isEmpty() &&
           !ReplacementOf(m_state, m_platform.files, m_order.folder()) &&
           GonePictures(m_state, m_platform.files, {m_order.folder(), kept}) == 0;
}

bool PreparedAgain::handOver(const IsTaken& isTaken) {
    const OrderState& kept = m_order.state();
    const bool plain = printsAsTheyAre(kept.kind);
    const auto ending = plain ? OrderFolder::Ending::BySession : OrderFolder::Ending::Plain;
    const SessionState before = m_state;
    TakeChoices(kept.choices, m_state);
    for (double number = Val(kept.number) + 1.0;; ++number) {
        m_state.MisparHazmana = QString::number(number, 'f', 0);
        const OrderFolder folder = OrderFolder::inPreparation(m_state, ending);
        if (m_platform.files.folderExists(folder.path()))
            continue;
        const std::optional<bool> taken = isTaken(folder.name());
        if (!taken) {
            m_state = before;
            return false;
        }
        if (!*taken)
            break;
    }
    ++m_state.handOver.renumbered;
    m_state.handOver.lines = kept.items;
    m_state.handOver.basket.clear();
    m_state.handOver.takenUp = {};
    m_state.keptFolder = DrivePath(kept.keptIn);
    m_state.handOver.pressStart = plain; // the page of edited orders starts by itself
    m_state.handOver.replaced = m_order.folder().path();
    return true;
}

} // namespace lumora
