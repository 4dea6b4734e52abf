#include "selection/pictures/kyoskNew.h"

#include "order/EditRecord.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

namespace lumora {

kyoskNew::kyoskNew(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::kyoskNew)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , File1(platform.files, QStringLiteral("*.jpg"))
    , Timer1(40, [this] { Timer1_Tick(); })
    , Timer2(500, [this] { Timer2_Tick(); }) {}

kyoskNew::~kyoskNew() = default;

bool kyoskNew::plain() const {
    return printsAsTheyAre(m_state.Optint);
}

void kyoskNew::load() {
    // Nothing of the last picture of an order before.
    UnpackEditState(EditRecord::newPicture(), m_state.edit);
    m_state.edit.PicturePath.clear();
    m_state.edit.EditState = EditRecord::beforeAnyPicture();
    m_state.BranchChoice.clear();
    List1.setForm(lineFormOf(m_state.Optint));

    for (Caption* hidden : {&Frame2, &Pic4Brose, &Picture66, &Label35, &Label36, &Image19, &Image20, &editorView,
                            &Frame3, &PicB4Sioom, &Frame4, &Pic4snifim, &Pic4Snif, &Picture7, &Txt4Ml2, &Label24})
        hidden->visible = false;
    // An album order has a finish of its own, until the whole folder is taken.
    Image13.visible = m_state.Optint == OrderKind::Album;
    Image7.visible = !Image13.visible;
    const bool coupon = m_state.coupon.HaKoopon == 1;
    for (Caption* couponOnly : {&Image33, &Command28, &Label4kpn3, &Label4kpn3Prompt})
        couponOnly->visible = coupon;
    const bool asksAddress = !m_state.TachanaMekomit;
    for (Caption* address : {&Label33, &Label17, &Text1, &Combo1, &Command8})
        address->visible = asksAddress;

    clearCells();
    SumCopies();
    if (!plain())
        loadEditor();
}

void kyoskNew::takeFocus(const QString& box) {
    focusBox = box;
    ++focusRequest;
}

void kyoskNew::say(const QString& hebrew, const QString& english) {
    m_platform.dialogs.message(m_state.wording(hebrew, english));
}

void kyoskNew::Image10_Click() {
    if (Val16(Label7.text) == 0) {
        m_chain.endProgram();
        return;
    }
    Frame3.visible = true;
    Q_EMIT changed();
}

void kyoskNew::Image23_Click() {
    m_chain.endProgram();
}

void kyoskNew::Command15_Click() {
    m_chain.endProgram();
}

void kyoskNew::Command4_Click() {
    Frame3.visible = false;
    Q_EMIT changed();
}

} // namespace lumora
