#include "entry/details/nnn.h"

#include "common/FixedText.h"
#include "entry/details/DetailStore.h"
#include "entry/details/RememberedDetails.h"
#include "entry/details/TileMenu.h"
#include "entry/details/VolumeMark.h"
#include "entry/notice/Havharot.h"
#include "order/CouponLimit.h"
#include "order/HistoryState.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/TailTelephone.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/files/Drives.h"
#include "session/LabPages.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

// What the customer does on the page. nnnSteps.cpp has the steps and what each shows, nnnTexts.cpp what the page says.

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

template <std::size_t N>
void checkOnly(ControlArray<CheckCaption, N>& options, int chosen) {
    for (std::size_t i = 0; i < N; ++i)
        options[i].checked = static_cast<int>(i) == chosen;
}

template <std::size_t N>
bool within(const ControlArray<CheckCaption, N>&, int index) {
    return index >= 0 && index < static_cast<int>(N);
}

} // namespace

nnn::nnn(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(pageId)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_album(state, platform, *this) {
    connect(&m_album, &AlbumPanels::changed, this, &nnn::showStep);
    connect(&m_album, &AlbumPanels::focusWanted, this, &nnn::focusOn);
    connect(&m_album, &AlbumPanels::checked, this, &nnn::takeAlbum);
}

void nnn::load() {
    m_state.DiskRoot = m_platform.files.drives().programRoot();
    m_state.shemot.Girsa = u"4.00"_s;
    fillSizes();
    setTexts();
    if (m_chain.find(PageId::kyoskNew))
        beginChange();
}

// --- the menu ---

void nnn::takeTile(int tile) {
    if (m_leaving || tile < 0 || tile >= TileCount)
        return;
    if (tile == ExitTile) {
        m_chain.endProgram();
        return;
    }
    const bool ready = beginOrder();
    switch (tile) {
    case PrintTile:
    case QuickTile:
    case SequenceTile:
        if (ready)
            beginPrints(tile);
        break;
    case MailTile:
        goToFinishedOrders();
        break;
    case AlbumTile:
        if (ready)
            beginAlbum();
        break;
    case RestartTile:
        startAgain();
        break;
    case EnglishTile:
        turnTo(Language::English);
        break;
    case OtherTile:
        showOtherPage();
        break;
    default:
        break;
    }
    Q_EMIT changed();
}

void nnn::turnTo(Language language) {
    m_state.EnglishTips = language == Language::English ? 1 : 0;
    m_chain.setAllTexts(); // also of the pages that wait for this one
}

// Does what all tiles have in common. False when the workspace could not be made; the customer has been told.
bool nnn::beginOrder() {
    fillSizes();
    if (const Result<QString> serial = ReadVolumeSerial(m_platform.volume, m_state.DiskRoot))
        VolumeSerial = *serial;
    else
        m_platform.dialogs.message(u"Error getting volume information."_s);
    m_state.shemot.ser = volumeMark(VolumeSerial);
    m_state.shemot.TimeOfJob = BuildTimeOfJob(m_platform.clock.now().date(), m_state.KodMishloach, m_state.shemot.ser);
    // A new order must not take over the flags of a resend.
    m_state.transfer.HazmanaP = 0;
    m_state.transfer.Mefurak = Travel::Whole;
    m_state.transfer.MailFlag = 0;
    const bool made = succeeded(Workspace(m_state, m_platform.files).MakeWorkspace());
    if (!Text2.text.isEmpty() && !Text3.text.isEmpty())
        Command12.enabled = true;
    return made;
}

void nnn::beginPrints(int tile) {
    markedTile = tile;
    clearChoices();
    m_state.Optint = orderKindOf(tile);
    m_state.ModulRezef = tile == SequenceTile;
    open(Step::Details);
    focusOn(u"Text2"_s);
}

void nnn::beginAlbum() {
    clearChoices();
    m_state.Optint = OrderKind::Album;
    m_album.begin();
    open(Step::Album);
}

void nnn::goToFinishedOrders() {
    clearChoices();
    m_state.Optint = orderKindOf(MailTile);
    prepareOrder(); // the orders of a full disk are there all the same
    if (m_chain.follow(pageId, Outcome::FinishedWanted))
        m_leaving = true;
}

void nnn::startAgain() {
    m_state.Optint = OrderKind::Restart;
    m_leaving = true;
    m_chain.follow(pageId, Outcome::NewOrderWanted);
}

void nnn::showOtherPage() {
    m_state.Optint = OrderKind::Other;
    if (!m_chain.follow(pageId, Outcome::NoticeAlone))
        return;
    m_chain.load<Havharot>().showPlain();
    m_leaving = true;
}

// "***" marks what was not chosen yet, and nothing of an earlier order shows as chosen.
void nnn::clearChoices() {
    OrderDetails& shemot = m_state.shemot;
    for (QString* field : {&shemot.maat, &shemot.n1, &shemot.n2, &shemot.n3, &shemot.ppr})
        *field = notChosen;
    shemot.FillFit = u"NNN"_s;
    shemot.Bord.clear();
    checkOnly(Option1, -1);
    checkOnly(Option3, -1);
    checkOnly(Image13, -1);
    Picture16 = -1;
    Option4.checked = Option5.checked = Check1.checked = false;
    m_termsHint = true;
    Label4kpn.visible = false;
    CouponLimit(m_state).begin();
    m_album.close();
    fillSizes();
}

// --- details ---

void nnn::type(Caption& box, const QString& text) {
    box.text = text;
    Command12.enabled = true;
    Q_EMIT changed();
}

void nnn::typeAddress(const QString& text) {
    Text4Calls = false;
    type(Text4, text);
}

void nnn::tick(CheckCaption& box, bool checked) {
    box.checked = checked;
    Q_EMIT changed();
}

void nnn::recallDetails() {
    const Result<std::optional<DetailStore::Customer>> stored = DetailStore(m_state, m_platform.files).details();
    if (!stored || !*stored) {
        m_platform.dialogs.message(stored ? detailsMessage(DetailsMessage::NothingStored, m_state.english())
                                          : stored.failure().message);
        focusOn(u"Text2"_s);
        return;
    }
    Text2.text = (*stored)->name;
    Text3.text = (*stored)->telephone;
    if (!telephoneMayBe())
        return;
    Command12.enabled = false;
    open(Step::Options);
}

void nnn::leaveDetails() {
    if (!Command12.enabled || !IsPhoneOk(Text3.text))
        return;
    if (const std::optional<DetailsProblem> problem = checkTyped(m_state, Text2.text, Text4.text)) {
        m_platform.dialogs.message(problem->message);
        focusOn(problem->place == DetailsProblem::Place::Name ? u"Text2"_s : u"Text4"_s);
        return;
    }
    if (!telephoneMayBe())
        return;
    open(Step::Options);
    if (isChanging())
        return;
    // The order goes on even if the details can't be stored.
    succeeded(RememberedDetails(m_state, m_platform.files).typed({Text2.text, Text3.text}, Check2.checked));
}

// A question's loop may close the page.
bool nnn::telephoneMayBe() {
    const bool fits = TailTelephone(m_state).mayGoOnWith(Text3.text, m_platform.dialogs);
    if (m_leaving || m_chain.hasEnded())
        return false;
    if (!fits)
        focusOn(u"Text3"_s);
    return fits;
}

void nnn::rememberOrForget() {
    succeeded(RememberedDetails(m_state, m_platform.files).ordered({Text2.text, Text3.text}, Check2.checked));
}

// --- paper, border, fit ---

void nnn::fillSizes() {
    QStringList sizes;
    for (const QString& size : m_state.profile.SizeList) {
        if (!size.isEmpty() && !sizes.contains(size))
            sizes += size;
    }
    Combo1.fill(sizes, sizesPrompt());
}

void nnn::takeQuickSize(int index) {
    if (!within(Option1, index))
        return;
    const QString size = m_quickSizes[static_cast<std::size_t>(index)].trimmed();
    checkOnly(Option1, index);
    Combo1.rows.setCurrentIndex(-1);
    Combo1.text = size;
    m_state.shemot.ppr = size;
    showCoupon(CouponLimit(m_state).takeQuickSize(size));
    showStep();
}

void nnn::takeListedSize(int row) {
    if (!Combo1.take(row))
        return;
    checkOnly(Option1, -1);
    m_state.shemot.ppr = Combo1.text.trimmed();
    showCoupon(CouponLimit(m_state).takeListedSize());
    showStep();
}

void nnn::showCoupon(std::optional<int> limit) {
    if (!limit)
        return;
    Label4kpn.text = QString::number(*limit);
    Label4kpn.visible = *limit > 0;
    if (*limit == 0 && m_state.coupon.HaKoopon == 1)
        tell(u"הקופון תקף רק לגדלים 10/15 ו-20/30 שעל הכרטיסים.\nלגודל שבחרתם אין קופון.",
             u"The coupon is good for the sizes 10/15 and 20/30 on the cards.\nThe size you chose has none.");
}

void nnn::takePaperKind(int index) {
    if (!within(Option3, index))
        return;
    checkOnly(Option3, index);
    m_state.shemot.maat = paperKind(index);
    goOnFrom(Step::Options);
}

// Goes on with the paper kind that was taken before.
void nnn::keepPaperKind() {
    for (int i = 0; within(Option3, i); ++i) {
        if (Option3[static_cast<std::size_t>(i)].checked)
            return takePaperKind(i);
    }
}

void nnn::takeBorder(int index) {
    if (!within(Image13, index))
        return;
    checkOnly(Image13, index);
    Picture16 = index;
    m_state.shemot.Bord = borderCode(index);
    showStep();
}

void nnn::takeFit(const CheckCaption& taken) {
    Option4.checked = &taken == &Option4;
    Option5.checked = &taken == &Option5;
    m_state.shemot.FillFit = Option4.checked ? u"FIT"_s : u"FIL"_s;
    goOnFrom(Step::Fit);
}

// --- terms, and on to the pictures ---

void nnn::readTerms() {
    LabPages(m_state, m_platform).openTerms();
}

void nnn::closeTermsHint() {
    m_termsHint = false;
    showStep();
}

void nnn::finishPrints() {
    if (m_leaving || !(isChanging() || termsAgreed(Check1)))
        return;
    takeDetails(m_state.shemot, Text2.text, Text3.text, Text4.text);
    if (const std::optional<DetailsProblem> problem = CheckDetails(m_state)) {
        refuse(*problem);
        return;
    }
    if (isChanging())
        return leaveChange();
    rememberOrForget();
    if (m_state.Optint >= OrderKind::Print && m_state.Optint <= OrderKind::Sequence)
        GoToSelection();
}

void nnn::takeAlbum() {
    if (isChanging()) {
        if (!m_leaving)
            leaveChange();
        return;
    }
    rememberOrForget();
    takeDetails(m_state.shemot, Text2.text, Text3.text, Text4.text);
    finishAlbum();
}

void nnn::finishAlbum() {
    if (m_leaving || !termsAgreed(m_album.controls().Check6))
        return;
    m_state.Optint = OrderKind::Album;
    m_state.ModulRezef = true;
    if (beginOrder())
        GoToSelection();
}

// Opens the step on which the customer sets the fault right.
void nnn::refuse(const DetailsProblem& problem) {
    using Place = DetailsProblem::Place;
    m_platform.dialogs.message(problem.message);
    switch (problem.place) {
    case Place::Name:
        open(Step::Details);
        focusOn(u"Text2"_s);
        break;
    case Place::Telephone:
        open(Step::Details);
        focusOn(u"Text3"_s);
        break;
    case Place::Address:
        Text4Calls = true;
        open(Step::Details);
        focusOn(u"Text4"_s);
        break;
    case Place::Size:
    case Place::Kind:
        open(Step::Options);
        break;
    case Place::Border:
        open(Step::Border);
        break;
    }
    // Details taken from memory have switched the button off.
    Command12.enabled = true;
    Q_EMIT changed();
}

bool nnn::prepareOrder() {
    const Workspace workspace(m_state, m_platform.files);
    Result<void> done = workspace.MakeCounterFolder();
    if (done)
        done = workspace.MakeOrderFolder();
    if (done)
        done = workspace.CleanWorkspace(m_state.MisparHazmana);
    return succeeded(done);
}

void nnn::GoToSelection() {
    m_state.transfer.MailFlag = 0;
    if (!prepareOrder())
        return;
    m_leaving = true;
    if (m_chain.follow(pageId, Outcome::PicturesWanted))
        return;
    m_leaving = false;
    tell(u"דף בחירת התמונות עדיין אינו זמין בגרסה זו",
         u"The page for choosing pictures is not yet available in this version");
}

// --- ways back ---

void nnn::cancel() {
    if (m_leaving || (m_step == Step::Album && !isChanging() && !asksToCancelAlbum()))
        return;
    if (isChanging())
        return cancelChange();
    Command12.enabled = true;
    Frame1.visible = false;
    markedTile = -1;
    m_album.close();
    open(Step::Menu);
}

// --- beside the order ---

void nnn::askToClean(bool asked) {
    Frame1.visible = asked;
    if (asked)
        showHistory(HistoryState::of(m_state, m_platform.files));
    showStep();
}

void nnn::cleanHistory() {
    const HistoryState before = HistoryState::of(m_state, m_platform.files);
    if (!before.legacy.isEmpty() && asksToMarkLegacy(before))
        succeeded(before.markLegacyArrived(m_platform.files));
    const HistoryState history = HistoryState::of(m_state, m_platform.files);
    const bool keeps = history.areGuarded(m_state) && !asksToCleanNotProven(history);
    if (m_leaving)
        return;
    Workspace(m_state, m_platform.files).CleanHistory([&](const DrivePath& folder) {
        return keeps && history.contains(folder);
    });
    tell(u"ניקיון ההיסטוריה הושלם\nמדובר על קבצים הקשורים לתוכנה זו בלבד",
         u"The history has been cleaned\nThis concerns files of this program only");
    askToClean(false);
}

void nnn::showNotice() {
    m_chain.follow(pageId, Outcome::NoticeWanted);
}

void nnn::focusOn(const QString& control) {
    m_focus = {control, m_focus.request + 1};
    Q_EMIT changed();
}

void nnn::tell(const char16_t* hebrew, const char16_t* english) {
    m_platform.dialogs.message(m_state.wording(hebrew, english));
}

bool nnn::succeeded(const Result<void>& done) {
    if (!done)
        m_platform.dialogs.message(done.failure().message);
    return done.ok();
}

} // namespace lumora
