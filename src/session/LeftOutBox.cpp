#include "session/LeftOutBox.h"

#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/WayBack.h"

namespace lumora {

using namespace Qt::StringLiterals;

LeftOutControls::LeftOutControls(Controls& page)
    : Pic4Hasserot(page, u"Pic4Hasserot", Caption::At::Hidden)
    , Label4Hasserot(page, u"Label4Hasserot")
    , List4Hasserot(page, u"List4Hasserot")
    , List4Siba(page, u"List4Siba")
    , Command4Bli(page, u"Command4Bli")
    , Command4Hazor(page, u"Command4Hazor")
    , Label4Kartis(page, u"Label4Kartis", Caption::At::Hidden) {}

LeftOutBox::LeftOutBox(PageId page, SessionState& state, PageChain& chain, LeftOutControls& shown)
    : m_page(page)
    , m_state(state)
    , m_chain(chain)
    , m_shown(shown) {}

bool LeftOutBox::isDue() const {
    return !m_state.transfer.leftOut.isEmpty() && !m_state.transfer.leftOutAsked;
}

bool LeftOutBox::isAwaited() const {
    return m_state.Careful && isOpen();
}

bool LeftOutBox::leadsToPictures() const {
    return lumora::leadsToPictures(m_page, m_state, m_chain);
}

void LeftOutBox::open(Order order) {
    m_order = order;
    m_shown.Pic4Hasserot.visible = true;
    show();
}

void LeftOutBox::close() {
    m_shown.Pic4Hasserot.visible = false;
}

void LeftOutBox::endWayBack() {
    m_wayBack = false;
    show();
}

void LeftOutBox::goOnWithout() {
    m_state.transfer.leftOutAsked = true;
    close();
}

bool LeftOutBox::goBack() {
    if (!isOpen() || !m_shown.Command4Hazor.visible)
        return false;
    close();
    if (!leadsToPictures()) {
        m_chain.follow(m_page, Outcome::NewOrderWanted);
        return false;
    }
    return goBackToPictures(m_page, m_state, m_chain);
}

} // namespace lumora
