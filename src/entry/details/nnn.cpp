#include "entry/details/nnn.h"

#include "common/DrivePathText.h"
#include "entry/details/DetailStore.h"
#include "entry/details/TileMenu.h"
#include "entry/details/TimeOfJob.h"
#include "entry/details/VolumeMark.h"
#include "entry/notice/Havharot.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/files/Drives.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

// What the customer does on the page. nnnTexts.cpp has what the page says and shows.

namespace lumora {

namespace {

template <std::size_t N>
void checkOnly(std::array<CheckCaption, N>& options, int chosen) {
    for (std::size_t i = 0; i < N; ++i)
        options[i].checked = static_cast<int>(i) == chosen;
}

template <std::size_t N>
bool within(const std::array<CheckCaption, N>& options, int index) {
    return index >= 0 && index < static_cast<int>(options.size());
}

} // namespace

nnn::nnn(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::nnn)
    , album(state, platform)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain) {
    Frame1.visible = false;
    Label4kpn.visible = false;
    Command24.visible = false;
    connect(&album, &AlbumPanels::changed, this, &nnn::showStep);
    connect(&album, &AlbumPanels::focusWanted, this, &nnn::focusOn);
    connect(&album, &AlbumPanels::checked, this, &nnn::takeAlbum);
}

void nnn::load() {
    m_state.DiskRoot = m_platform.files.drives().programRoot();
    m_state.shemot.Girsa = QStringLiteral("4.00");
    fillSizes();
    Command5_Click();
}

// --- the menu ---

void nnn::Image1_Click(int tile) {
    if (m_leaving || tile < 0 || tile >= TileCount)
        return;
    if (tile == ExitTile) {
        m_chain.endProgram();
        return;
    }
    const bool ready = beginTile();
    switch (tile) {
    case PrintTile:
    case QuickTile:
    case SequenceTile:
        if (!ready)
            break;
        markedTile = tile;
        clearChoices();
        m_state.Optint = static_cast<OrderKind>(tile + 1);
        m_state.ModulRezef = tile == SequenceTile;
        open(Step::Details);
        focusOn(QStringLiteral("Text2"));
        break;
    case MailTile:
        if (!ready)
            break;
        clearChoices();
        m_state.Optint = OrderKind::Mail;
        if (!prepareOrder())
            break;
        if (m_chain.follow(PageId::nnn, Outcome::FinishedWanted))
            m_leaving = true;
        break;
    case AlbumTile:
        if (!ready)
            break;
        clearChoices();
        m_state.Optint = OrderKind::Album;
        album.begin();
        open(Step::Album);
        break;
    case RestartTile:
        m_state.Optint = OrderKind::Restart;
        m_leaving = true;
        m_chain.follow(PageId::nnn, Outcome::NewOrderWanted);
        break;
    case EnglishTile:
        m_state.EnglishTips = 1;
        Command5_Click();
        break;
    case OtherTile:
        m_state.Optint = OrderKind::Other;
        if (m_chain.follow(PageId::nnn, Outcome::NoticeAlone)) {
            m_chain.load<Havharot>().showPlain();
            m_leaving = true;
        }
        break;
    default:
        break;
    }
    Q_EMIT changed();
}

// What every tile does first. False when the workspace could not be made, which the customer has been told then.
bool nnn::beginTile() {
    fillSizes();
    if (const Result<QString> serial = ReadVolumeSerial(m_platform.volume, m_state.DiskRoot))
        VolumeSerial = *serial;
    else
        m_platform.dialogs.message(QStringLiteral("Error getting volume information."));
    m_state.shemot.ser = volumeMark(VolumeSerial);
    m_state.shemot.TimeOfJob = BuildTimeOfJob(m_platform.clock.now().date(), m_state.KodMishloach, m_state.shemot.ser);
    // A resend before must not leak into a new order.
    m_state.transfer.HazmanaP = 0;
    m_state.transfer.Mefurak = Travel::Whole;
    m_state.transfer.MailFlag = 0;
    const Result<void> made = Workspace(m_state, m_platform.files).MakeWorkspace();
    if (!made)
        m_platform.dialogs.message(made.failure().message);
    if (!Text2.text.isEmpty() && !Text3.text.isEmpty())
        Command12.enabled = true;
    return made.ok();
}

// "***" marks what was not chosen yet, and nothing of an earlier order shows as chosen.
void nnn::clearChoices() {
    OrderDetails& shemot = m_state.shemot;
    shemot.maat = notChosen;
    shemot.n1 = notChosen;
    shemot.n2 = notChosen;
    shemot.n3 = notChosen;
    shemot.ppr = notChosen;
    shemot.FillFit = QStringLiteral("NNN");
    shemot.Bord.clear();
    checkOnly(Option1, -1);
    checkOnly(Option3, -1);
    checkOnly(Image13, -1);
    Picture16 = -1;
    Option4.checked = false;
    Option5.checked = false;
    Check1.checked = false;
    m_termsHint = true;
    Label4kpn.visible = false;
    album.close();
    fillSizes();
}

// --- details ---

void nnn::Text2_Change(const QString& text) {
    Text2.text = text;
    Command12.enabled = true;
    Q_EMIT changed();
}

void nnn::Text3_Change(const QString& text) {
    Text3.text = text;
    Command12.enabled = true;
    Q_EMIT changed();
}

void nnn::Text4_Change(const QString& text) {
    Text4.text = text;
    Text4Calls = false;
    Command12.enabled = true;
    Q_EMIT changed();
}

void nnn::Check2_Click(bool checked) {
    Check2.checked = checked;
    Q_EMIT changed();
}

void nnn::Command10_Click() {
    const Result<std::optional<DetailStore::Customer>> stored = DetailStore(m_state, m_platform.files).details();
    if (!stored || !*stored) {
        m_platform.dialogs.message(stored ? m_messages[0] : stored.failure().message);
        focusOn(QStringLiteral("Text2"));
        return;
    }
    Text2.text = (*stored)->name;
    Text3.text = (*stored)->telephone;
    Command12.enabled = false;
    open(Step::Options);
}

void nnn::Command12_Click() {
    if (!Command12.enabled || !IsPhoneOk(Text3.text))
        return;
    if (const std::optional<DetailsProblem> problem = checkTyped(m_state, Text2.text, Text4.text)) {
        m_platform.dialogs.message(problem->message);
        focusOn(problem->place == DetailsProblem::Place::Name ? QStringLiteral("Text2") : QStringLiteral("Text4"));
        return;
    }
    open(Step::Options);
    saveDetails();
}

void nnn::saveDetails() {
    // A memory that can't be kept holds up no order.
    const Result<void> saved = DetailStore(m_state, m_platform.files).SaveDetails({Text2.text, Text3.text});
    if (!saved)
        m_platform.dialogs.message(saved.failure().message);
}

// --- options ---

void nnn::Option1_Click(int index) {
    if (!within(Option1, index))
        return;
    const QString size = Option1[static_cast<std::size_t>(index)].text.trimmed();
    checkOnly(Option1, index);
    CouponState& coupon = m_state.coupon;
    if (size == u"10/15" || size == u"20/30") {
        coupon.MisparKoopon = size == u"10/15" ? coupon.SmallCount : coupon.LargeCount;
        Label4kpn.text = QString::number(coupon.MisparKoopon);
        Label4kpn.visible = coupon.MisparKoopon > 0;
    }
    Combo1List.setCurrentIndex(-1);
    Combo1.text = size;
    m_state.shemot.ppr = size;
    showStep();
}

void nnn::Combo1_Click(int index) {
    if (index < 0 || index >= Combo1List.count())
        return;
    checkOnly(Option1, -1);
    Combo1List.setCurrentIndex(index);
    Combo1.text = Combo1List.currentItem();
    m_state.shemot.ppr = Combo1.text.trimmed();
    showStep();
}

void nnn::Option3_Click(int index) {
    if (!within(Option3, index))
        return;
    checkOnly(Option3, index);
    m_state.shemot.maat = Option3[static_cast<std::size_t>(index)].text.trimmed();
    afterKind();
}

void nnn::Command8_Click() {
    for (std::size_t i = 0; i < Option3.size(); ++i) {
        if (Option3[i].checked) {
            Option3_Click(static_cast<int>(i));
            return;
        }
    }
}

void nnn::afterKind() {
    if (asksBorder()) {
        open(Step::Border);
    } else {
        m_state.shemot.Bord = borderCode(0);
        Command6_Click();
    }
}

void nnn::Image13_MouseDown(int index) {
    if (!within(Image13, index))
        return;
    checkOnly(Image13, index);
    Picture16 = index;
    m_state.shemot.Bord = borderCode(index);
    showStep();
}

void nnn::Command6_Click() {
    if (asksFit()) {
        open(Step::Fit);
        return;
    }
    m_state.shemot.FillFit = QStringLiteral("FIL");
    open(Step::Terms);
}

void nnn::Option4_Click() {
    Option4.checked = true;
    Option5.checked = false;
    m_state.shemot.FillFit = QStringLiteral("FIT");
    open(Step::Terms);
}

void nnn::Option5_Click() {
    Option4.checked = false;
    Option5.checked = true;
    m_state.shemot.FillFit = QStringLiteral("FIL");
    open(Step::Terms);
}

bool nnn::asksBorder() const {
    return (m_state.Optint == OrderKind::Print || m_state.Optint == OrderKind::Sequence) && m_state.GvulMuzag == 1;
}

bool nnn::asksFit() const {
    return (m_state.Optint == OrderKind::Print || m_state.Optint == OrderKind::Sequence) && m_state.FitMuzag;
}

// --- terms, and on to the pictures ---

void nnn::Check1_Click(bool checked) {
    Check1.checked = checked;
    Q_EMIT changed();
}

void nnn::Command29_Click() {
    m_platform.shell.openWebPage(m_state.profile.SiteUrl);
}

void nnn::Command30_Click() {
    m_termsHint = false;
    showStep();
}

void nnn::Command3_Click() {
    if (m_leaving || !termsAgreed(Check1))
        return;
    takeDetails(m_state, Text2.text, Text3.text, Text4.text);
    if (const std::optional<DetailsProblem> problem = CheckDetails(m_state)) {
        refuse(*problem);
        return;
    }
    rememberOrForget();
    if (m_state.Optint >= OrderKind::Print && m_state.Optint <= OrderKind::Sequence)
        GoToSelection();
}

void nnn::rememberOrForget() {
    if (Check2.checked) {
        saveDetails();
    } else if (const Result<void> forgotten = DetailStore(m_state, m_platform.files).forgetDetails(); !forgotten) {
        m_platform.dialogs.message(forgotten.failure().message);
    }
}

void nnn::takeAlbum() {
    rememberOrForget();
    takeDetails(m_state, Text2.text, Text3.text, Text4.text);
    Command24_Click();
}

void nnn::Command24_Click() {
    if (m_leaving || !termsAgreed(album.Check6))
        return;
    m_state.Optint = OrderKind::Album;
    m_state.ModulRezef = true;
    if (beginTile())
        GoToSelection();
}

// A failed check opens the step on which the customer sets it right.
void nnn::refuse(const DetailsProblem& problem) {
    using Place = DetailsProblem::Place;
    m_platform.dialogs.message(problem.message);
    switch (problem.place) {
    case Place::Name:
        open(Step::Details);
        focusOn(QStringLiteral("Text2"));
        break;
    case Place::Telephone:
        open(Step::Details);
        focusOn(QStringLiteral("Text3"));
        break;
    case Place::Address:
        Text4Calls = true;
        open(Step::Details);
        focusOn(QStringLiteral("Text4"));
        break;
    case Place::Size:
    case Place::Kind:
        open(Step::Options);
        break;
    case Place::Border:
        open(Step::Border);
        break;
    }
    // Whoever is sent back to the details must get on again from there.
    Command12.enabled = true;
    Q_EMIT changed();
}

bool nnn::prepareOrder() {
    const Workspace workspace(m_state, m_platform.files);
    Result<void> done = workspace.MakeCounterFolder();
    if (done)
        done = workspace.MakeOrderFolder();
    if (done)
        done = workspace.CleanWorkspace();
    if (!done)
        m_platform.dialogs.message(done.failure().message);
    return done.ok();
}

void nnn::GoToSelection() {
    m_state.transfer.MailFlag = 0;
    if (!prepareOrder())
        return;
    m_leaving = true;
    if (m_chain.follow(PageId::nnn, Outcome::PicturesWanted))
        return;
    m_leaving = false;
    tell(QStringLiteral("דף בחירת התמונות עדיין אינו זמין בגרסה זו"),
         QStringLiteral("The page for choosing pictures is not yet available in this version"));
}

// The quick form has one box, in which the customer leaves a name or a number: it stands for both.
void nnn::QuickCheck() {
    if (m_leaving || !nameGiven())
        return;
    OrderDetails& shemot = m_state.shemot;
    shemot.n1 = Text2.text.trimmed();
    shemot.n2 = Text2.text.trimmed();
    shemot.ppr = QStringLiteral("10/15");
    shemot.maat = QStringLiteral("מבריק");
    shemot.Bord = borderCode(0);
    shemot.FillFit = QStringLiteral("FIT");
    if (!Check2.checked) {
        if (const Result<void> gone = DetailStore(m_state, m_platform.files).forgetQuickDetails(); !gone)
            m_platform.dialogs.message(gone.failure().message);
    }
    m_state.Optint = OrderKind::EditedPrint;
    GoToSelection();
}

void nnn::CouponOrder(Coupon coupon) {
    m_state.coupon.SmallCount = coupon == Coupon::Small ? 220 : 350;
    m_state.coupon.LargeCount = coupon == Coupon::Small ? 3 : 5;
    Option1[0].text = QStringLiteral("10/15");
    Option1[1].text = QStringLiteral("20/30");
    if (termsAgreed(Check1))
        nameGiven();
    Q_EMIT changed();
}

// --- ways back ---

void nnn::Command4_Click() {
    Command12.enabled = true;
    switch (step) {
    case Step::Menu:
    case Step::Details:
        open(Step::Menu);
        break;
    case Step::Options:
        open(Step::Details);
        break;
    case Step::Border:
        open(Step::Options);
        break;
    case Step::Fit:
        open(asksBorder() ? Step::Border : Step::Options);
        break;
    case Step::Terms:
        open(asksFit() ? Step::Fit : asksBorder() ? Step::Border : Step::Options);
        break;
    case Step::Album:
        if (!album.back())
            Command2_Click();
        break;
    }
}

void nnn::Command2_Click() {
    Command12.enabled = true;
    Frame1.visible = false;
    markedTile = -1;
    album.close();
    open(Step::Menu);
}

// --- beside the order ---

void nnn::Command14_Click() {
    Frame1.visible = true;
    showStep();
}

void nnn::Command9_Click() {
    Frame1.visible = false;
    showStep();
}

void nnn::Command15_Click() {
    m_chain.follow(PageId::nnn, Outcome::NoticeWanted);
}

void nnn::focusOn(const QString& box) {
    focusBox = box;
    ++focusRequest;
    Q_EMIT changed();
}

void nnn::tell(const QString& hebrew, const QString& inEnglish) {
    m_platform.dialogs.message(m_state.wording(hebrew, inEnglish));
}

void nnn::open(Step next) {
    step = next;
    showStep();
}

} // namespace lumora
