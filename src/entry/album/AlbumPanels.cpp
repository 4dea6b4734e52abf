#include "entry/album/AlbumPanels.h"

#include "common/DrivePathText.h"
#include "entry/details/DetailStore.h"
#include "entry/details/DetailsCheck.h"
#include "platform/Dialogs.h"
#include "session/SessionState.h"
#include "session/lab/MailDomains.h"

#include <algorithm>

// What the photographer does on the panels. AlbumPanelsTexts.cpp has what they say and show.

namespace lumora {

namespace {

constexpr int slideFrom = 48;
constexpr int slideStep = 16;
constexpr int slidePace = 16; // milliseconds, about a frame of the screen

QString nameOf(const char* array, int index) {
    return QStringLiteral("%1(%2)").arg(QLatin1String(array)).arg(index);
}

} // namespace

AlbumPanels::AlbumPanels(SessionState& state, const Platform& platform)
    : m_state(state)
    , m_platform(platform)
    , Timer4Alboom(slidePace, [this] { Timer4Alboom_Tick(); })
    , Timer7(slidePace, [this] { Timer7_Tick(); }) {
    Pic4Alboom.visible = false;
    Label17.text = notChosen;
    Label32.text = QStringLiteral("0");
}

void AlbumPanels::begin() {
    fill(Combo4Mail, mailDomains(), mailDomainPrompt(m_state.english()));
    greyKinds();
    m_kind = -1;
    Label17.text = notChosen;
    Check4.checked = false;
    setCopies(0);
    fill(Combo4Horim, {}, promptOf(AlbumChoice::ParentSize));
    Label36.text.clear();
    for (const auto& [choice, list] : {std::pair{&Combo4Godel, AlbumChoice::Size},
                                       {&Combo4Cricha, AlbumChoice::Cover},
                                       {&Combo4Niyar, AlbumChoice::Paper},
                                       {&Combo4Tosefet, AlbumChoice::Extra}})
        fill(*choice, {}, promptOf(list));
    for (CheckCaption& extra : Check3)
        extra.checked = false;
    Check6.checked = false;
    Pic4Alboom.visible = true;
    open(Panel::Photographer);
    Q_EMIT focusWanted(nameOf("Text1", 0));
}

void AlbumPanels::close() {
    Timer4Alboom.stop();
    Timer7.stop();
    panelShift = parentsShift = 0;
    Pic4Alboom.visible = false;
    showPanel();
}

bool AlbumPanels::back() {
    if (panel == Panel::Photographer)
        return false;
    open(static_cast<Panel>(static_cast<int>(panel) - 1));
    return true;
}

// --- who ---

void AlbumPanels::Text1_Change(int box, const QString& text) {
    Text1.at(static_cast<std::size_t>(box)).text = text;
    Q_EMIT changed();
}

void AlbumPanels::Combo4Mail_Change(const QString& text) {
    Combo4Mail.list.setCurrentIndex(-1);
    Combo4Mail.box.text = text;
    Q_EMIT changed();
}

void AlbumPanels::Combo4Mail_Click(int row) {
    take(Combo4Mail, row);
}

void AlbumPanels::Check5_Click(bool checked) {
    Check5.checked = checked;
    Q_EMIT changed();
}

void AlbumPanels::Command28_Click() {
    const Result<std::optional<DetailStore::Photographer>> stored =
        DetailStore(m_state, m_platform.files).albumDetails();
    if (!stored || !*stored) {
        m_platform.dialogs.message(stored ? detailsMessages(m_state.english())[0] : stored.failure().message);
        Q_EMIT focusWanted(nameOf("Text1", 0));
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

void AlbumPanels::Command17_Click() {
    if (Check5.checked) {
        const Result<void> saved =
            DetailStore(m_state, m_platform.files).SaveAlbumDetails({Text1[0].text, Text1[1].text, Text1[3].text});
        // A memory that can't be kept holds up no order.
        if (!saved)
            m_platform.dialogs.message(saved.failure().message);
    }
    greyKinds();
    open(Panel::Kind);
}

// --- which kind, and the parents' copies ---

void AlbumPanels::greyKinds() {
    for (KindCaption& kind : SoogAlb) {
        kind.shade = grey;
        kind.checked = false;
    }
}

void AlbumPanels::SoogAlb_Click(int kind) {
    if (kind < 0 || kind >= static_cast<int>(SoogAlb.size()))
        return;
    const auto at = static_cast<std::size_t>(kind);
    greyKinds();
    SoogAlb[at].shade = blue;
    SoogAlb[at].checked = true;
    m_kind = kind;
    Label17.text = Label28[at].text;
    // Added to what is there: each kind that is looked at brings its five.
    Combo4Horim.list.append(itemsOf(AlbumChoice::ParentSize));
    Combo4Horim.list.setCurrentIndex(-1);
    Combo4Horim.box.text = promptOf(AlbumChoice::ParentSize);
    Label36.text.clear();
    parentsShift = slideFrom;
    Timer4Alboom.start();
    showPanel();
}

void AlbumPanels::Check4_Click(bool checked) {
    Check4.checked = checked;
    setCopies(checked ? 1 : 0);
}

void AlbumPanels::setCopies(int copies) {
    Label32.text = QString::number(copies);
    showPanel();
}

void AlbumPanels::Command26_Click() {
    const int copies = Label32.text.toInt() - 1;
    if (copies <= 0)
        Check4_Click(false);
    else
        setCopies(copies);
}

void AlbumPanels::Command27_Click() {
    setCopies(std::min(Label32.text.toInt() + 1, mostParentCopies));
}

void AlbumPanels::Combo4Horim_Click(int row) {
    take(Combo4Horim, row);
    Label36.text = Combo4Horim.list.currentItem();
    showPanel();
}

void AlbumPanels::Command16_Click() {
    const bool parentsChosen = Label17.text != notChosen && Combo4Horim.list.currentIndex() >= 0;
    if (const std::optional<QString> problem = checkParentAlbum(m_state, Label32.text, parentsChosen)) {
        m_platform.dialogs.message(*problem);
        Q_EMIT focusWanted(Label17.text == notChosen ? nameOf("SoogAlb", 0) : QStringLiteral("Combo4Horim"));
        return;
    }
    for (Choice* choice : {&Combo4Cricha, &Combo4Niyar, &Combo4Tosefet})
        choice->list.clear();
    Command18_Click();
    Command19_Click();
    Command20_Click();
    fill(Combo4Godel, itemsOf(AlbumChoice::Size), promptOf(AlbumChoice::Size));
    open(Panel::Size);
}

// --- size, cover, paper, extras: a list that is filled keeps what was taken when the panel is passed again ---

void AlbumPanels::Combo4Godel_Click(int row) {
    take(Combo4Godel, row);
}

void AlbumPanels::Command18_Click() {
    if (Combo4Cricha.list.isEmpty())
        fill(Combo4Cricha, itemsOf(AlbumChoice::Cover), promptOf(AlbumChoice::Cover));
    open(Panel::Cover);
}

void AlbumPanels::Combo4Cricha_Click(int row) {
    take(Combo4Cricha, row);
}

void AlbumPanels::Command19_Click() {
    if (Combo4Niyar.list.isEmpty())
        fill(Combo4Niyar, itemsOf(AlbumChoice::Paper), promptOf(AlbumChoice::Paper));
    open(Panel::Paper);
}

void AlbumPanels::Combo4Niyar_Click(int row) {
    take(Combo4Niyar, row);
}

void AlbumPanels::Command20_Click() {
    if (Combo4Tosefet.list.isEmpty())
        fill(Combo4Tosefet, itemsOf(AlbumChoice::Extra), promptOf(AlbumChoice::Extra));
    open(Panel::Extras);
}

void AlbumPanels::Combo4Tosefet_Click(int row) {
    take(Combo4Tosefet, row);
}

void AlbumPanels::Check3_Click(int extra, bool checked) {
    Check3.at(static_cast<std::size_t>(extra)).checked = checked;
    Q_EMIT changed();
}

void AlbumPanels::Command21_Click() {
    Command23_Click();
    open(Panel::Bill);
}

// --- the end ---

void AlbumPanels::Check6_Click(bool checked) {
    Check6.checked = checked;
    Q_EMIT changed();
}

void AlbumPanels::Command23_Click() {
    gather();
    writeBill();
    Q_EMIT changed();
}

void AlbumPanels::Command22_Click() {
    Command23_Click();
    Timer4Alboom.stop();
    Timer7.stop();
    panelShift = parentsShift = 0;
    if (const std::optional<AlbumProblem> problem = CheckAlbum(m_state, Text1[3].text)) {
        refuse(*problem);
        return;
    }
    takeAlbumOrder(m_state);
    Q_EMIT checked();
}

void AlbumPanels::gather() {
    AlbumDetails album; // of an album before nothing stays
    album.ShemZalam = Text1[0].text.trimmed();
    album.TelZalam = Text1[1].text.trimmed();
    album.ShemErooa = Text1[2].text.trimmed();
    album.MailZalam = mailAddress();
    album.SoogLBM = Label17.text;
    album.SoogKricha = Combo4Cricha.box.text;
    album.SoogNiar = Combo4Niyar.box.text;
    album.Tosafot1[0] = Combo4Tosefet.box.text;
    for (std::size_t i = 0; i < Check3.size(); ++i)
        album.Tosafot2[i] = Check3[i].text + u'=' + QString::number(Check3[i].checked ? 1 : 0);
    album.GodelLBM = Combo4Godel.box.text;
    album.KamutHorim = Label32.text;
    album.SoogHorim = Label36.text;
    m_state.album = album;
}

// Who types the whole address into the first box means no other.
QString AlbumPanels::mailAddress() const {
    const QString name = Text1[3].text.trimmed();
    const QString domain = Combo4Mail.box.text.trimmed();
    if (name.contains(u'@') && domain == mailDomainPrompt(m_state.english()))
        return name;
    return name + u'@' + domain;
}

// The panel on which the fault is set right comes forward.
void AlbumPanels::refuse(const AlbumProblem& problem) {
    using Place = AlbumProblem::Place;
    const auto show = [&](Panel where, const QString& control) {
        m_platform.dialogs.message(problem.message);
        open(where);
        Q_EMIT focusWanted(control);
    };
    switch (problem.place) {
    case Place::Name:
        return show(Panel::Photographer, nameOf("Text1", 0));
    case Place::Telephone:
        return show(Panel::Photographer, nameOf("Text1", 1));
    case Place::Event:
        return show(Panel::Photographer, nameOf("Text1", 2));
    case Place::Mail:
        return show(Panel::Photographer, nameOf("Text1", 3));
    case Place::Kind:
        return show(Panel::Kind, nameOf("SoogAlb", 0));
    case Place::Size:
        return show(Panel::Size, QStringLiteral("Combo4Godel"));
    case Place::Cover:
        return show(Panel::Cover, QStringLiteral("Combo4Cricha"));
    case Place::Paper:
        return show(Panel::Paper, QStringLiteral("Combo4Niyar"));
    }
}

// --- the panels themselves ---

void AlbumPanels::open(Panel next) {
    panel = next;
    panelShift = slideFrom;
    Timer7.start();
    showPanel();
}

void AlbumPanels::Timer4Alboom_Tick() {
    parentsShift = std::max(parentsShift - slideStep, 0);
    if (parentsShift == 0)
        Timer4Alboom.stop();
    Q_EMIT changed();
}

void AlbumPanels::Timer7_Tick() {
    panelShift = std::max(panelShift - slideStep, 0);
    if (panelShift == 0)
        Timer7.stop();
    Q_EMIT changed();
}

void AlbumPanels::fill(Choice& choice, const QStringList& items, const QString& prompt) {
    choice.list.clear();
    choice.list.append(items);
    choice.box.text = prompt;
}

void AlbumPanels::take(Choice& choice, int row) {
    if (row < 0 || row >= choice.list.count())
        return;
    choice.list.setCurrentIndex(row);
    choice.box.text = choice.list.currentItem();
    showPanel();
}

} // namespace lumora
