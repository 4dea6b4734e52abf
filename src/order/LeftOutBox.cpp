#include "order/LeftOutBox.h"

#include "common/FixedText.h"
#include "order/OrderFolder.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {

using namespace Qt::StringLiterals;

LeftOutControls::LeftOutControls(Controls& page)
    : Pic4Hasserot(page, u"Pic4Hasserot", Caption::At::Hidden)
    , Label4Hasserot(page, u"Label4Hasserot")
    , List4Hasserot(page, u"List4Hasserot")
    , Command4Bli(page, u"Command4Bli")
    , Command4Hazor(page, u"Command4Hazor")
    , Label4Kartis(page, u"Label4Kartis", Caption::At::Hidden) {}

LeftOutBox::LeftOutBox(PageId page, SessionState& state, const Platform& platform, PageChain& chain,
                       LeftOutControls& shown)
    : m_page(page)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_shown(shown) {}

bool LeftOutBox::isDue() const {
    return !m_state.transfer.leftOut.isEmpty() && !m_state.transfer.leftOutAsked;
}

bool LeftOutBox::isAwaited() const {
    return m_state.Careful && isOpen();
}

bool LeftOutBox::leadsToPictures() const {
    return !m_state.handOver.basket.isEmpty() && m_chain.canFollow(m_page, Outcome::PicturesWanted);
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

// The page is left before its order goes, so that nothing of the order is written any more.
void LeftOutBox::goBack() {
    if (!isOpen() || !m_shown.Command4Hazor.visible)
        return;
    close();
    if (!leadsToPictures()) {
        m_chain.follow(m_page, Outcome::NewOrderWanted);
        return;
    }
    m_state.handOver.back = true;
    // The sending page has read the order's details from its log, which the code page may have changed.
    m_state.shemot = m_state.handOver.details;
    if (m_chain.follow(m_page, Outcome::PicturesWanted))
        removeOrder();
    else
        m_state.handOver.back = false;
}

// The thumbnails of the order sheet go too, since the next sheet shows all that are there.
void LeftOutBox::removeOrder() {
    const Files& files = m_platform.files;
    const DrivePath thumbnails = WorkspacePaths::jobFolder(m_state);
    for (const QString& name : files.names(thumbnails, u"*.bmp"_s))
        static_cast<void>(files.removeFile(thumbnails / name));
    const OrderFolder order = OrderFolder::chosen(m_state);
    const Result<void> removed =
        order.isChosen() && files.folderExists(order.path()) ? files.removeTree(order.path()) : Result<void>();
    if (!removed)
        m_platform.dialogs.message(removed.failure().message);
    m_state.transfer.OrderFolder = {};
    m_state.transfer.leftOut.clear();
}

QList<LeftOut> LeftOutOf(const QStringList& failed) {
    QList<LeftOut> pictures;
    for (const QString& path : failed)
        pictures += LeftOut{DrivePath(path), HasQuestionMark(path) ? LeftOut::Why::Name : LeftOut::Why::NotTold};
    return pictures;
}

} // namespace lumora
