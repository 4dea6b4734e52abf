#include "entry/album/AlbumPanels.h"

#include "common/FixedText.h"
#include "session/CaptionTexts.h"
#include "session/lab/MailDomains.h"

// What the panels say and show.

namespace lumora {

using namespace Qt::StringLiterals;

struct AlbumPanels::PanelRow {
    Panel panel;
    QString title;
    std::vector<Caption*> parts; // seen on this panel alone
};

std::vector<AlbumPanels::PanelRow> AlbumPanels::panelTable() {
    std::vector<PanelRow> table = {
        {Panel::Photographer,
         m_state.wording(u"אלבום הורים: פרטי הצלם", u"Parent album: the photographer"),
         {&Combo4Mail, &Check5, &Command28, &Command17}},
        {Panel::Kind, promptOf(AlbumChoice::Kind), {&Label17, &Check4, &Command16}},
        {Panel::Size, promptOf(AlbumChoice::Size), {&Combo4Godel, &Command18}},
        {Panel::Cover, promptOf(AlbumChoice::Cover), {&Combo4Cricha, &Command19}},
        {Panel::Paper, promptOf(AlbumChoice::Paper), {&Combo4Niyar, &Command20}},
        {Panel::Extras, promptOf(AlbumChoice::Extra), {&Combo4Tosefet, &LabelCheck3, &Command21}},
        {Panel::Bill,
         m_state.wording(u"סיכום ותנאי שימוש", u"Summary and terms of use"),
         {&Pic4Bil, &Check6, &Command25, &Command22}},
    };
    const auto add = [&](Panel panel, auto& captions) {
        for (Caption& caption : captions)
            table[static_cast<std::size_t>(panel)].parts.push_back(&caption);
    };
    add(Panel::Photographer, Text1);
    add(Panel::Photographer, LabelText1);
    add(Panel::Kind, SoogAlb);
    add(Panel::Kind, Label28);
    add(Panel::Extras, Check3);
    return table;
}

std::vector<AlbumPanels::ListRow> AlbumPanels::listTable() {
    return {{Panel::Size, Combo4Godel, AlbumChoice::Size},
            {Panel::Cover, Combo4Cricha, AlbumChoice::Cover},
            {Panel::Paper, Combo4Niyar, AlbumChoice::Paper},
            {Panel::Extras, Combo4Tosefet, AlbumChoice::Extra}};
}

void AlbumPanels::setTexts() {
    setCaptions(m_state, {
                             {LabelText1[0], u"שם הצלם", u"Photographer's name"},
                             {LabelText1[1], u"טלפון", u"Telephone"},
                             {LabelText1[2], u"שם האירוע", u"Name of the event"},
                             {LabelText1[3], u"דואר אלקטרוני", u"E-mail address"},
                             {LabelCombo4Mail, u"ספק הדואר, אחרי השטרודל", u"Mail provider, behind the at sign"},
                             {Check5, u"זכור פרטים לפעם הבאה", u"Remember my details for next time"},
                             {Command28, u"פרטים מהזיכרון", u"Details from memory"},
                             {Command16, u"המשך", u"Next"},
                             {Command17, u"המשך", u"Next"},
                             {Command18, u"המשך", u"Next"},
                             {Command19, u"המשך", u"Next"},
                             {Command20, u"המשך", u"Next"},
                             {Command21, u"לסיכום", u"To the summary"},
                             {Command22, u"המשך לבחירת התמונות", u"On to the pictures"},
                             {Command23, u"הצג סיכום", u"Show the summary"},
                             {Command25, u"קרא תנאי שימוש", u"Read the terms of use"},
                             {Check4, u"להוסיף אלבום הורים", u"Add a parent album"},
                             {LabelParents, u"עותקים להורים", u"Copies for the parents"},
                             {Command26, u"−", u"−"},
                             {Command27, u"+", u"+"},
                             {Check6, u"מסכים תנאי שימוש", u"I agree to the terms of use"},
                             {Pic4Bil, u"סיכום ההזמנה", u"Your album"},
                         });
    Command26.hint = m_state.wording(u"עותק פחות", u"One copy less");
    Command27.hint = m_state.wording(u"עותק נוסף", u"One copy more");
    LabelCheck3.text = promptOf(AlbumChoice::SpecialExtra);
    LabelCombo4Horim.text = promptOf(AlbumChoice::ParentSize);

    const QStringList kinds = itemsOf(AlbumChoice::Kind);
    for (std::size_t i = 0; i < SoogAlb.size(); ++i)
        SoogAlb[i].text = Label28[i].text = kinds[static_cast<qsizetype>(i)];
    Label17.text = kindName();
    const QStringList extras = itemsOf(AlbumChoice::SpecialExtra);
    for (std::size_t i = 0; i < Check3.size(); ++i)
        Check3[i].text = extras[static_cast<qsizetype>(i)];

    // The domains and the parents' sizes are the same in both languages, and the first box may hold a typed text.
    if (Combo4Mail.text.isEmpty() || Combo4Mail.text == mailDomainPrompt(!english()))
        Combo4Mail.text = mailDomainPrompt(english());
    if (!Combo4Horim.taken())
        Combo4Horim.text = promptOf(AlbumChoice::ParentSize);
    // A row that was taken stays taken in the other language.
    for (const ListRow& row : listTable()) {
        const int taken = row.list.rows.currentIndex();
        row.list.fill(row.list.rows.isEmpty() ? QStringList() : itemsOf(row.choice), promptOf(row.choice));
        row.list.take(taken);
    }
    if (Pic4Alboom.visible && m_panel == Panel::Bill)
        gather();
    showPanel();
}

void AlbumPanels::showPanel() {
    const std::vector<PanelRow> table = panelTable();
    for (const PanelRow& row : table) {
        for (Caption* part : row.parts)
            part->visible = Pic4Alboom.visible && row.panel == m_panel;
    }
    if (m_state.kiosk.on)
        Check5.visible = Command28.visible = false;
    for (Caption* part :
         std::initializer_list<Caption*>{&LabelParents, &Label32, &Command26, &Command27, &Combo4Horim, &Label36})
        part->visible = Check4.visible && Check4.checked;
    Pic4Alboom.text = table[static_cast<std::size_t>(m_panel)].title;
    ChoiceSoFar.text = choiceSoFar();
    ChoiceSoFar.visible = Pic4Alboom.visible && m_panel != Panel::Bill && !ChoiceSoFar.text.isEmpty();
    Q_EMIT changed();
}

QString AlbumPanels::kindName() const {
    return m_kind >= 0 ? itemsOf(AlbumChoice::Kind)[m_kind] : notChosen;
}

QString AlbumPanels::choiceSoFar() const {
    QStringList chosen;
    if (m_kind >= 0)
        chosen += kindName();
    for (const ComboCaption* list : {&Combo4Godel, &Combo4Cricha, &Combo4Niyar}) {
        if (list->taken())
            chosen += list->text;
    }
    return chosen.join(u" · "_s);
}

QString AlbumPanels::extraLine(const QString& name, std::size_t extra) const {
    return name + u'=' + QString::number(Check3[extra].checked ? 1 : 0);
}

// The bill is in the language of the page; the order itself is in Hebrew.
void AlbumPanels::writeBill() {
    const AlbumDetails& album = m_state.album;
    Pic4BilLines = {album.ShemZalam,   album.ShemErooa,  album.TelZalam,     album.MailZalam,  kindName(),
                    Combo4Cricha.text, Combo4Niyar.text, Combo4Tosefet.text, Combo4Godel.text, album.HearotLBM};
    Pic4BilLines.removeAll(QString());
    Pic4BilExtras.clear();
    for (std::size_t i = 0; i < Check3.size(); ++i)
        Pic4BilExtras += extraLine(Check3[i].text, i);
    const QString parents = m_state.wording(u"אלבום הורים", u"Parent album");
    const QString rule(25, u'_');
    Pic4BilParents = {rule, u"  "_s + parents + u"  "_s + album.KamutHorim, album.SoogHorim + u'=' + parents, rule};
}

} // namespace lumora
