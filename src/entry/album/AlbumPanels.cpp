#include "entry/album/AlbumPanels.h"

#include "common/FixedText.h"
#include "entry/details/DetailStore.h"
#include "entry/details/DetailsCheck.h"
#include "order/TailTelephone.h"
#include "platform/Dialogs.h"
#include "session/SessionState.h"
#include "session/lab/MailDomains.h"

#include <algorithm>

// The photographer's events; the texts of the panels stand in AlbumPanelsTexts.cpp.

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int slideFrom = 48;
constexpr int slideStep = 16;
constexpr int slidePace = 16; // milliseconds, about a frame of the screen

} // namespace

AlbumPanels::AlbumPanels(SessionState& state, const Platform& platform, Controls& of)
    : AlbumControls(of)
    , m_state(state)
    , m_platform(platform)
    , Timer4Alboom(slidePace, [this] { slide(parentsShift, Timer4Alboom); })
    , Timer7(slidePace, [this] { slide(panelShift, Timer7); }) {
    Label17.text = notChosen;
    Label32.text = u"0"_s;
}

bool AlbumPanels::english() const {
    return m_state.english();
}

void AlbumPanels::begin() {
    if (!MailAddressGuard(m_state).keepsDomain(typedAddress()))
        Combo4Mail.fill(mailDomains(), mailDomainPrompt(english()));
    m_kind = -1;
    showKinds();
    Label17.text = kindName();
    addParents(false);
    Combo4Horim.fill({}, promptOf(AlbumChoice::ParentSize));
    Label36.text.clear();
    for (const ListRow& row : listTable())
        row.list.fill({}, promptOf(row.choice));
    for (CheckCaption& extra : Check3)
        extra.checked = false;
    Check6.checked = false;
    Pic4Alboom.visible = true;
    open(Panel::Photographer);
    Q_EMIT focusWanted(u"Text1(0)"_s);
}

void AlbumPanels::change() {
    const AlbumDetails& album = m_state.album;
    const TypedAddress address = TypedAddress::of(album.MailZalam);
    const QString boxes[] = {album.ShemZalam, album.TelZalam, album.ShemErooa, address.name};
    for (std::size_t i = 0; i < Text1.size(); ++i)
        Text1[i].text = boxes[i];
    Combo4Mail.fill(mailDomains(), address.untouched ? mailDomainPrompt(english()) : address.domain);
    Combo4Mail.take(Combo4Mail.rows.find(address.domain));
    m_kind = orderedRow(AlbumChoice::Kind, album.SoogLBM);
    showKinds();
    Label17.text = kindName();
    m_copies = std::clamp(Val16(album.KamutHorim), std::int16_t{0}, std::int16_t{mostParentCopies});
    Label32.text = QString::number(m_copies);
    Check4.checked = m_copies > 0;
    Combo4Horim.fill(itemsOf(AlbumChoice::ParentSize), promptOf(AlbumChoice::ParentSize));
    takeParentSize(Combo4Horim.rows.find(album.SoogHorim));
    fillLists();
    Combo4Godel.take(orderedRow(AlbumChoice::Size, album.GodelLBM));
    Combo4Cricha.take(orderedRow(AlbumChoice::Cover, album.SoogKricha));
    Combo4Niyar.take(orderedRow(AlbumChoice::Paper, album.SoogNiar));
    Combo4Tosefet.take(orderedRow(AlbumChoice::Extra, album.Tosafot1[0]));
    for (std::size_t i = 0; i < Check3.size(); ++i)
        Check3[i].checked = album.Tosafot2[i].endsWith(u"=1"_s);
    Pic4Alboom.visible = true;
    open(Panel::Kind);
}

void AlbumPanels::showChange(const QString& wayBack) {
    Command22.text = wayBack;
    for (Caption* part : std::initializer_list<Caption*>{&Check5, &Command28, &Check6, &Command25})
        part->visible = false;
}

void AlbumPanels::close() {
    stopSliding();
    Pic4Alboom.visible = false;
    showPanel();
}

bool AlbumPanels::back() {
    if (m_panel == Panel::Photographer)
        return false;
    open(static_cast<Panel>(static_cast<int>(m_panel) - 1));
    return true;
}

void AlbumPanels::tick(CheckCaption& box, bool checked) {
    box.checked = checked;
    Q_EMIT changed();
}

void AlbumPanels::take(ComboCaption& list, int row) {
    if (list.take(row))
        showPanel();
}

// --- who ---

void AlbumPanels::type(int box, const QString& text) {
    Text1.at(static_cast<std::size_t>(box)).text = text;
    Q_EMIT changed();
}

void AlbumPanels::typeDomain(const QString& text) {
    Combo4Mail.rows.setCurrentIndex(-1);
    Combo4Mail.text = text;
    Q_EMIT changed();
}

void AlbumPanels::recallPhotographer() {
    const Result<std::optional<DetailStore::Photographer>> stored =
        DetailStore(m_state, m_platform.files).albumDetails();
    if (!stored || !*stored) {
        m_platform.dialogs.message(stored ? detailsMessage(DetailsMessage::NothingStored, english())
                                          : stored.failure().message);
        Q_EMIT focusWanted(u"Text1(0)"_s);
        return;
    }
    const std::pair<std::size_t, QString> fields[] = {
        {0, (*stored)->name}, {1, (*stored)->telephone}, {3, (*stored)->mailName}};
    for (const auto& [box, text] : fields) {
        if (!text.isEmpty())
            Text1[box].text = text;
    }
    Q_EMIT changed();
}

void AlbumPanels::leavePhotographer() {
    if (!telephoneMayBe())
        return;
    if (MailAddressGuard(m_state).lacksDomain(typedAddress())) {
        m_platform.dialogs.message(m_state.wording(u"נא לבחור או להקליד את ספק הדואר,\nאחרי השטרודל",
                                                   u"Please choose or type the mail provider,\nbehind the at sign"));
        Q_EMIT focusWanted(u"Combo4Mail"_s);
        return;
    }
    if (!isWhole())
        return;
    if (Check5.checked && !m_state.kiosk.on) {
        const Result<void> saved =
            DetailStore(m_state, m_platform.files).SaveAlbumDetails({Text1[0].text, Text1[1].text, Text1[3].text});
        // The order goes on even if the details can't be stored.
        if (!saved)
            m_platform.dialogs.message(saved.failure().message);
    }
    showKinds();
    open(Panel::Kind);
}

// Only a telephone that the print files carry has to fit there.
bool AlbumPanels::telephoneMayBe() {
    if (m_state.albumTail != AlbumTail::Photographer)
        return true;
    const bool fits = TailTelephone(m_state).mayGoOnWith(Text1[1].text, m_platform.dialogs);
    if (!Pic4Alboom.visible)
        return false;
    if (!fits)
        Q_EMIT focusWanted(u"Text1(1)"_s);
    return fits;
}

// --- which kind, and the parents' copies ---

// All kinds are grey but the one that is taken.
void AlbumPanels::showKinds() {
    for (std::size_t i = 0; i < SoogAlb.size(); ++i) {
        SoogAlb[i].checked = static_cast<int>(i) == m_kind;
        SoogAlb[i].shade = SoogAlb[i].checked ? blue : grey;
    }
}

void AlbumPanels::takeKind(int kind) {
    if (kind < 0 || kind >= static_cast<int>(SoogAlb.size()))
        return;
    m_kind = kind;
    showKinds();
    Label17.text = kindName();
    // Each kind that is looked at adds its five sizes to those that are there.
    Combo4Horim.fill(Combo4Horim.rows.items() + itemsOf(AlbumChoice::ParentSize), promptOf(AlbumChoice::ParentSize));
    Label36.text.clear();
    parentsShift = slideFrom;
    Timer4Alboom.start();
    showPanel();
}

void AlbumPanels::addParents(bool wanted) {
    Check4.checked = wanted;
    setCopies(wanted ? 1 : 0);
}

void AlbumPanels::setCopies(int copies) {
    m_copies = copies;
    Label32.text = QString::number(copies);
    showPanel();
}

void AlbumPanels::oneCopyLess() {
    if (m_copies > 1)
        setCopies(m_copies - 1);
    else
        addParents(false);
}

void AlbumPanels::oneCopyMore() {
    setCopies(std::min(m_copies + 1, mostParentCopies));
}

void AlbumPanels::takeParentSize(int row) {
    Combo4Horim.take(row);
    Label36.text = Combo4Horim.rows.currentItem();
    showPanel();
}

void AlbumPanels::leaveKind() {
    if (const std::optional<QString> problem =
            checkParentAlbum(m_state, m_copies, m_kind >= 0 && Combo4Horim.taken())) {
        m_platform.dialogs.message(*problem);
        Q_EMIT focusWanted(m_kind < 0 ? u"SoogAlb(0)"_s : u"Combo4Horim"_s);
        return;
    }
    fillLists();
    goOnTo(Panel::Size);
}

// A list is filled once, so that the choice stays when the panels open again.
void AlbumPanels::fillLists() {
    for (const ListRow& row : listTable()) {
        if (row.list.rows.isEmpty())
            row.list.fill(itemsOf(row.choice), promptOf(row.choice));
    }
}

// --- size, cover, paper, extras ---

void AlbumPanels::goOnToBill() {
    gather();
    open(Panel::Bill);
}

// --- the end ---

void AlbumPanels::finish() {
    gather();
    stopSliding();
    if (const std::optional<AlbumProblem> problem = CheckAlbum(m_state, Text1[3].text)) {
        refuse(*problem);
        return;
    }
    takeAlbumOrder(m_state);
    Q_EMIT checked();
}

// Copies all fields of the panels into the session and writes the bill from them.
void AlbumPanels::gather() {
    AlbumDetails album; // nothing of an earlier album stays
    album.ShemZalam = Text1[0].text.trimmed();
    album.TelZalam = Text1[1].text.trimmed();
    album.ShemErooa = Text1[2].text.trimmed();
    album.MailZalam = mailAddress();
    album.SoogLBM = m_kind >= 0 ? orderedItem(AlbumChoice::Kind, m_kind) : notChosen;
    album.SoogKricha = orderedItem(AlbumChoice::Cover, Combo4Cricha.rows.currentIndex());
    album.SoogNiar = orderedItem(AlbumChoice::Paper, Combo4Niyar.rows.currentIndex());
    album.Tosafot1[0] = orderedItem(AlbumChoice::Extra, Combo4Tosefet.rows.currentIndex());
    for (std::size_t i = 0; i < Check3.size(); ++i)
        album.Tosafot2[i] = extraLine(orderedItem(AlbumChoice::SpecialExtra, static_cast<int>(i)), i);
    album.GodelLBM = orderedItem(AlbumChoice::Size, Combo4Godel.rows.currentIndex());
    album.KamutHorim = QString::number(m_copies);
    album.SoogHorim = Combo4Horim.rows.currentItem();
    m_state.album = album;
    writeBill();
    Q_EMIT changed();
}

TypedAddress AlbumPanels::typedAddress() const {
    const QString domain = Combo4Mail.text.trimmed();
    return {Text1[3].text.trimmed(), domain, domain.isEmpty() || domain == mailDomainPrompt(english())};
}

// A whole address in the first box is taken as it is while no domain was chosen.
QString AlbumPanels::mailAddress() const {
    const TypedAddress typed = typedAddress();
    return typed.untouched && typed.name.contains(u'@') ? typed.name : MailAddressGuard(m_state).address(typed);
}

struct AlbumPanels::FaultRow {
    Panel panel;
    QString control;
};

// Where the photographer sets the fault right.
AlbumPanels::FaultRow AlbumPanels::placeOf(const AlbumProblem& problem) {
    using enum AlbumProblem::Place;
    switch (problem.place) {
    case Name:
        return {Panel::Photographer, u"Text1(0)"_s};
    case Telephone:
        return {Panel::Photographer, u"Text1(1)"_s};
    case Event:
        return {Panel::Photographer, u"Text1(2)"_s};
    case Mail:
        return {Panel::Photographer, u"Text1(3)"_s};
    case Kind:
        return {Panel::Kind, u"SoogAlb(0)"_s};
    case Size:
        return {Panel::Size, u"Combo4Godel"_s};
    case Cover:
        return {Panel::Cover, u"Combo4Cricha"_s};
    case Paper:
        return {Panel::Paper, u"Combo4Niyar"_s};
    }
    return {Panel::Photographer, {}};
}

void AlbumPanels::refuse(const AlbumProblem& problem) {
    const FaultRow place = placeOf(problem);
    m_platform.dialogs.message(problem.message);
    open(place.panel);
    Q_EMIT focusWanted(place.control);
}

bool AlbumPanels::isBegun() const {
    return m_panel != Panel::Photographer ||
           std::ranges::any_of(Text1, [](const Caption& box) { return !box.text.trimmed().isEmpty(); });
}

// The check goes from panel to panel, so that its first fault is the open panel's unless that one is whole.
bool AlbumPanels::isWhole() {
    if (!m_state.Careful)
        return true;
    gather();
    const std::optional<AlbumProblem> problem = CheckAlbum(m_state, Text1[3].text);
    if (!problem || placeOf(*problem).panel > m_panel)
        return true;
    refuse(*problem);
    return false;
}

void AlbumPanels::goOnTo(Panel next) {
    if (isWhole())
        open(next);
}

// --- the panels themselves ---

void AlbumPanels::open(Panel next) {
    m_panel = next;
    panelShift = slideFrom;
    Timer7.start();
    showPanel();
}

void AlbumPanels::slide(int& shift, Ticker& timer) {
    shift = std::max(shift - slideStep, 0);
    if (shift == 0)
        timer.stop();
    Q_EMIT changed();
}

void AlbumPanels::stopSliding() {
    Timer4Alboom.stop();
    Timer7.stop();
    panelShift = parentsShift = 0;
}

} // namespace lumora
