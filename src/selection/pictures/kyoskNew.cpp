#include "selection/pictures/kyoskNew.h"

#include "common/DrivePath.h"
#include "common/FixedText.h"
#include "common/PictureName.h"
#include "editing/ResolutionWords.h"
#include "editing/editor/tFrmNew.h"
#include "order/CouponLimit.h"
#include "order/EditRecord.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "selection/door/PictureDoor.h"
#include "session/LabPages.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/lab/MailDomains.h"

#include <QTimer>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

kyoskNew::kyoskNew(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(pageId)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_door(std::make_unique<PictureDoor>(platform.files, DoorDecoder(platform.doorProgram), state.door))
    , m_wait(state, *m_door)
    , m_choice(state)
    , m_resolution(state, platform.files)
    , File1(platform.files, picturePatterns(state.door.everyFormat),
            state.door.any() ? FileList::Names::Stored : FileList::Names::InCodePage)
    , Timer1(40, [this] { moveLabel35(); })
    , Timer2(500, [this] { movePointers(); }) {
    connect(&chain, &PageChain::shown, this, [this](const Page* page) {
        if (page == this && m_before)
            takeChanges();
    });
}

// Nothing leads any more to what was made for an order that was not handed over.
kyoskNew::~kyoskNew() {
    m_copies.reset();
    if (!m_handedOver && !m_door->folder().isEmpty())
        static_cast<void>(m_platform.files.removeTree(m_door->folder()));
}

bool kyoskNew::plain() const {
    return printsAsTheyAre(m_state.Optint);
}

AddressBox kyoskNew::addressBox() const {
    return addressBoxOf(m_state.Optint, m_state.TachanaMekomit);
}

void kyoskNew::load() {
    forgetEditing(); // nothing stays of the last picture of an earlier order
    m_choice.setForm(lineFormOf(m_state.Optint));
    decideCompression();

    // An album order has a finish of its own, until the whole folder is taken.
    Image13.visible = m_state.Optint == OrderKind::Album;
    Image7.visible = !Image13.visible;
    const bool coupon = m_state.coupon.HaKoopon == 1;
    Image33.visible = Command28.visible = coupon;
    Label4kpn3.visible = Label4kpn3Prompt.visible = CouponLimit(m_state).measures();
    const AddressBox box = addressBox();
    Text1.visible = Combo1.visible = box == AddressBox::Mail;
    Txt4Ml2.visible = box == AddressBox::AlbumMail;
    Label17.visible = Command8.visible = box != AddressBox::None;
    Label33.visible = Label33Word.visible = box != AddressBox::None && !m_state.DoarReshut;

    const HandOver before = std::exchange(m_state.handOver, {});
    openDoor(before);
    if (before.back)
        takeBack(before);
    else
        m_state.BranchChoice.clear();
    watchCards();
    showChoice();
    if (!plain())
        makeEditor();
}

// Address, note and branch are those that were chosen before.
void kyoskNew::takeBack(const HandOver& before) {
    m_tookBack = true;
    m_choice.takeBack(before.basket, before.pictures);
    for (const QString& path : m_choice.basket().paths())
        m_door->worked(path);
    m_choice.nextPage();
    showPictureCount();
    showGuide(Guide::PicturesShown);
    Text1.text = before.closing.Text1;
    m_promptStands = before.closing.promptStands;
    Combo1.text = m_promptStands ? mailDomainPrompt(m_state.english()) : before.closing.Combo1;
    Combo1Index = before.closing.Combo1Index;
    Text2.text = before.closing.Text2;
    // Drawing pumps events, and this page is not shown yet.
    QTimer::singleShot(0, this, [this] {
        if (!m_handedOver)
            drawPage();
    });
}

void kyoskNew::say(const char16_t* hebrew, const char16_t* english) {
    m_platform.dialogs.message(m_state.wording(hebrew, english));
}

// Lists and cells show what the choice holds.
void kyoskNew::showChoice() {
    List1 = m_choice.basket().lines();
    List2 = m_choice.page();
    List4 = m_choice.folders().paths();
    Label7.text = QString::number(m_choice.basket().SumCopies());
    Image15.enabled = m_choice.hasPreviousPage();
    Image16.enabled = m_choice.hasNextPage();
    showRange();
    for (int cell = 0; cell < cellsOfPage; ++cell)
        showCell(cell);
    copyChosen(false);
    showCards();
    Q_EMIT changed();
}

void kyoskNew::showCell(int cell) {
    const auto at = static_cast<std::size_t>(cell);
    const QString path = m_choice.path(cell);
    const QString copies = QString::number(m_choice.copies(cell));
    const QString name = shownPath(path).leaf();
    const auto words = [&](const char16_t* hebrew, const char16_t* english) {
        return m_state.wording(hebrew, english).arg(name);
    };
    const std::optional<PrintResolution> prints = m_resolution.of(path, m_choice.recordOf(path).value_or(QString()));
    resolution[at].show(prints);
    Picture1[at].text = path;
    Picture1[at].name = path.isEmpty() ? QString() : name;
    Picture1[at].waiting = m_door->isWaiting(path);
    Picture1[at].unreadable = m_door->isUnreadable(path) ? unreadableText(path) : QString();
    Picture4[at].visible = m_choice.chosen(cell);
    Label4[at].text = copies;
    Label5[at].text = path.isEmpty() ? u"*"_s : RightPart(shownPath(path).text(), 20);
    Picture1[at].spoken = path.isEmpty()               ? m_state.wording(u"תא ריק", u"Empty place")
                          : m_door->isUnreadable(path) ? name + u", "_s + Picture1[at].unreadable
                          : m_choice.chosen(cell)
                              ? m_state.wording(u"%1, נבחרה, עותקים: %2", u"%1, chosen, copies: %2").arg(name, copies)
                          : plain() ? words(u"%1, לחיצה בוחרת", u"%1, press to choose")
                                    : words(u"%1, לחיצה פותחת לעריכה", u"%1, press to edit");
    if (prints)
        Picture1[at].spoken +=
            u", "_s + ResolutionDots(*prints) + u": "_s + ResolutionWord(prints->grade(), m_state.english());
    Command12[at].spoken = words(u"עותק נוסף של %1", u"One more copy of %1");
    Command13[at].spoken = words(u"עותק אחד פחות של %1", u"One copy less of %1");
}

void kyoskNew::takeInHand(const QString& path) {
    m_largePath = DrivePath(path);
    Label1.text = Label2.text = shownPath(path).text();
}

void kyoskNew::askToLeave() {
    if (m_choice.basket().SumCopies() == 0)
        return endProgram();
    Frame3.visible = true;
    Q_EMIT changed();
}

void kyoskNew::endProgram() {
    m_chain.endProgram();
}

void kyoskNew::stay() {
    Frame3.visible = false;
    Q_EMIT changed();
}

void kyoskNew::turnHelp() {
    if (!Frame2.visible && LabPages(m_state, m_platform).openHelp())
        return;
    Frame2.visible = !Frame2.visible;
    Q_EMIT changed();
}

void kyoskNew::turnLanguage() {
    m_state.EnglishTips = m_state.english() ? 0 : 1;
    m_chain.setAllTexts(); // also of the editor, which is loaded behind this page
}

void kyoskNew::openPriceList() {
    LabPages(m_state, m_platform).openPriceList();
}

} // namespace lumora
