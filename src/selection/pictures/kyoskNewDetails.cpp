// The page of pictures: size, paper and details are changed on the page before it, and the pictures stay chosen.
#include "editing/editor/tFrmNew.h"
#include "editing/render/StoredSmallView.h"
#include "order/CouponLimit.h"
#include "order/EditRecord.h"
#include "platform/Platform.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <QTimer>

#include <utility>

namespace lumora {

// This page makes the editor, which knows the paper, once for each order and once more for each other paper.
void kyoskNew::makeEditor() {
    m_chain.load<tFrmNew>();
    connect(&editor(), &tFrmNew::stored, this, &kyoskNew::storeRecord);
    connect(&editor(), &tFrmNew::storedMeanwhile, this, &kyoskNew::putRecord);
    connect(&editor(), &tFrmNew::left, this, &kyoskNew::leaveEditor);
    connect(&editor(), &tFrmNew::picked, this, &kyoskNew::showFolderOf);
}

void kyoskNew::unloadEditor() {
    for (const PageId id : {PageId::mikledet, PageId::RedI, PageId::Form3, PageId::tFrmNew, PageId::BigPics})
        m_chain.unload(id);
}

void kyoskNew::forgetEditing() {
    UnpackEditState(EditRecord::newPicture(), m_state.edit);
    m_state.edit.PicturePath = {};
    m_state.edit.EditState = EditRecord::beforeAnyPicture();
}

bool kyoskNew::mayChangeDetails() const {
    return m_chain.canFollow(pageId, Outcome::DetailsWanted);
}

void kyoskNew::openDetails() {
    if (m_handedOver || m_picking || m_before || !mayChangeDetails())
        return;
    stopWaiting();
    closeFinish();
    if (!plain())
        leaveEditor();
    m_before = std::make_unique<OrderDetails>(m_state.shemot);
    if (!m_chain.follow(pageId, Outcome::DetailsWanted))
        m_before.reset();
}

// The page has come back from the page of details.
void kyoskNew::takeChanges() {
    const std::unique_ptr<OrderDetails> before = std::exchange(m_before, nullptr);
    if (ChangesPrints(*before, m_state.shemot)) {
        m_choice.changePaper(*before, [this](const QString& path) { return m_resolution.sizeOf(path); });
        if (!plain())
            beginEditorAnew();
        decideCompression(); // what was answered for the paper before does not hold
    }
    Label4kpn3.visible = Label4kpn3Prompt.visible = CouponLimit(m_state).measures();
    showPaper();
    setTexts();
    // Drawing pumps events, and this page is not shown yet.
    QTimer::singleShot(0, this, [this] {
        if (!m_handedOver)
            drawPage();
    });
}

// The small views show the pictures on the paper before.
void kyoskNew::beginEditorAnew() {
    for (const QString& path : m_choice.basket().paths())
        StoredSmallView::discard(m_state, m_platform.files, DrivePath(path));
    unloadEditor();
    m_openCell = -1;
    forgetEditing();
    makeEditor();
}

} // namespace lumora
