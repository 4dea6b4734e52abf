#include "entry/details/nnn.h"

#include "common/FixedText.h"
#include "common/PaperSize.h"
#include "entry/details/TileMenu.h"
#include "order/ChoiceWords.h"
#include "session/SessionState.h"

#include <algorithm>

// The steps of the page: their order, their titles and what each shows.

namespace lumora {

using namespace Qt::StringLiterals;

struct nnn::StepRow {
    Step step;
    bool asked; // on the way of this order of prints
    const char16_t* hebrew;
    const char16_t* english;
    std::vector<Caption*> parts; // seen on this step alone
};

std::vector<nnn::StepRow> nnn::stepTable() {
    const bool prints = m_state.Optint == OrderKind::Print || m_state.Optint == OrderKind::Sequence;
    std::vector<StepRow> table = {
        {Step::Menu, false, u"מה תרצו להזמין?", u"What would you like to order?", {&Command15}},
        {Step::Details,
         true,
         u"הפרטים שלכם",
         u"Your details",
         {&LabelText2, &Text2, &LabelText3, &Text3, &Check2, &Command10, &Command12}},
        {Step::Options,
         true,
         u"גודל וסוג נייר",
         u"Paper size and kind",
         {&Frame4, &LabelSizes, &LabelKinds, &Combo1, &Option3[0], &Option3[1]}},
        {Step::Border, prints && m_state.GvulMuzag == 1, u"בחירת מסגרת", u"Choose a border", {&Picture4}},
        {Step::Fit,
         prints && m_state.FitMuzag,
         u"התאמה או מילוי",
         u"Fit or fill",
         {&Picture5, &Option4, &Option5, &Label2, &Label3}},
        {Step::Terms, true, u"תנאי שימוש", u"Terms of use", {&Check1, &Command29, &Image4, &Label8, &Command3}},
        {Step::Album, false, u"", u"", {}}, // the open panel has its own title
    };
    for (CheckCaption& border : Image13)
        table[static_cast<std::size_t>(Step::Border)].parts.push_back(&border);
    return table;
}

void nnn::open(Step next) {
    m_step = next;
    showStep();
}

// Opens the next step that the order asks for. A step that is passed over takes its default.
void nnn::goOnFrom(Step from) {
    for (const StepRow& row : stepTable()) {
        if (row.step <= from)
            continue;
        if (row.asked)
            return open(row.step);
        if (row.step == Step::Border)
            m_state.shemot.Bord = borderCode(0);
        if (row.step == Step::Fit)
            m_state.shemot.FillFit = u"FIL"_s;
    }
}

void nnn::goBack() {
    Command12.enabled = true;
    if (m_step == Step::Album) {
        if (!m_album.back())
            cancel();
        return;
    }
    Step before = Step::Menu;
    for (const StepRow& row : stepTable()) {
        if (row.step < m_step && row.asked)
            before = row.step;
    }
    if (before == Step::Menu && isChanging())
        return cancel();
    open(before);
}

void nnn::showStep() {
    const std::vector<StepRow> table = stepTable();
    for (const StepRow& row : table) {
        for (Caption* part : row.parts) {
            part->visible = row.step == m_step;
            if (row.step == Step::Terms)
                part->enabled = part->visible;
        }
    }
    const bool menu = m_step == Step::Menu;
    const bool options = m_step == Step::Options;
    const auto tiles = visibleTiles(m_state);
    for (std::size_t i = 0; i < Image1.size(); ++i)
        Image1[i].visible = menu && tiles[i];
    Image1[EnglishTile].visible = Image1[EnglishTile].visible && !m_state.english();
    Command4Anglit.visible = !menu && !m_state.english();
    Command4Ivrit.visible = m_state.english();
    Command14.visible = menu && m_state.MinuyPaar != 2 && !m_state.closedToCustomers();
    if (m_state.kiosk.on)
        Check2.visible = Command10.visible = false;
    Command2.visible = Command4.visible = !menu;
    Command7.visible = Command9.visible = Frame1.visible;
    LabelText4.visible = Text4.visible = m_step == Step::Details && m_state.MishloachHabaita;
    for (std::size_t i = 0; i < Option1.size(); ++i) {
        Option1[i].text = m_quickSizes[i];
        Option1[i].hint = PaperSize::ofText(m_quickSizes[i])
                              ? m_state.wording(u"%1 ס\"מ", u"%1 cm").arg(m_quickSizes[i].trimmed())
                              : m_quickSizes[i];
        Option1[i].visible = options && !m_quickSizes[i].isEmpty();
    }
    Command8.visible = options && (Option3[0].checked || Option3[1].checked);
    Command8.enabled = m_state.shemot.ppr != notChosen;
    Command6.visible = m_step == Step::Border && Picture16 >= 0;
    LabelPicture16.text =
        Picture16 >= 0 ? chosenBorder() : m_state.wording(u"עדיין לא נבחרה מסגרת", u"No border chosen yet");
    LabelTerms.visible = Command30.visible = m_step == Step::Terms && m_termsHint;
    Label4Tel.text = m_state.profile.LabPhone;
    showProgress(table);
    if (isChanging())
        showChange();
    Q_EMIT changed();
}

void nnn::showProgress(const std::vector<StepRow>& table) {
    const AlbumControls& album = m_album.controls();
    const bool ofAlbum = m_step == Step::Album;
    const auto asked = [&](Step last) {
        return std::count_if(table.begin(), table.end(),
                             [&](const StepRow& row) { return row.asked && row.step <= last; });
    };
    const auto done = ofAlbum ? static_cast<long>(m_album.panel()) : asked(m_step) - 1;
    const auto all = ofAlbum ? static_cast<long>(AlbumPanels::panelCount) : asked(Step::Terms);
    stepShare = m_step == Step::Menu ? 0 : static_cast<double>(done) / static_cast<double>(std::max(all, 1L));
    const StepRow& row = table[static_cast<std::size_t>(m_step)];
    Title.text = ofAlbum ? album.Pic4Alboom.text.trimmed() : m_state.wording(row.hebrew, row.english);
    Choice.text = ofAlbum ? album.ChoiceSoFar.text : choiceSoFar();
    // The terms show the choice in a card of their own.
    Choice.visible = ofAlbum ? album.ChoiceSoFar.visible : !Choice.text.isEmpty() && m_step != Step::Terms;
}

QString nnn::chosenBorder() const {
    const Caption& border = Image13[static_cast<std::size_t>(Picture16)];
    return border.hint.isEmpty() ? border.text : u"%1: %2"_s.arg(border.text, border.hint);
}

QString nnn::choiceSoFar() const {
    QStringList choice;
    if (m_step == Step::Menu || m_step == Step::Details)
        return {};
    if (m_state.shemot.ppr != notChosen)
        choice += m_state.shemot.ppr;
    if (m_state.shemot.maat != notChosen)
        choice += paperWord(m_state, m_state.shemot.maat);
    if (Picture16 >= 0)
        choice += chosenBorder();
    if (m_step == Step::Terms && (Option4.checked || Option5.checked))
        choice += Option4.checked ? Option4.text : Option5.text;
    return choice.join(u" · "_s);
}

} // namespace lumora
