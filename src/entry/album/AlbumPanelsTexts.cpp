#include "entry/album/AlbumPanels.h"

#include "common/DrivePathText.h"
#include "session/SessionState.h"
#include "session/lab/MailDomains.h"

// What the panels say and show; AlbumPanels.cpp has what the photographer does on them.

namespace lumora {

QString AlbumPanels::promptOf(AlbumChoice choice) const {
    return albumPrompt(choice, m_state.english());
}

QStringList AlbumPanels::itemsOf(AlbumChoice choice) const {
    return albumItems(choice, m_state.english());
}

// The list in the other language; what was taken stays taken.
void AlbumPanels::reword(Choice& choice, const QStringList& items, const QString& prompt) {
    const int row = choice.list.currentIndex();
    if (!choice.list.isEmpty())
        fill(choice, items, prompt);
    choice.list.setCurrentIndex(row);
    choice.box.text = row >= 0 ? choice.list.currentItem() : prompt;
}

void AlbumPanels::setTexts() {
    const SessionState& s = m_state;
    LabelText1[0].text = s.wording(u"שם הצלם"_qs, u"Photographer's name"_qs);
    LabelText1[1].text = s.wording(u"טלפון"_qs, u"Telephone"_qs);
    LabelText1[2].text = s.wording(u"שם האירוע"_qs, u"Name of the event"_qs);
    LabelText1[3].text = s.wording(u"דואר אלקטרוני"_qs, u"E-mail address"_qs);
    Check5.text = s.wording(u"זכור פרטים לפעם הבאה"_qs, u"Remember my details for next time"_qs);
    Command28.text = s.wording(u"פרטים מהזיכרון"_qs, u"Details from memory"_qs);
    for (Caption* next : {&Command16, &Command17, &Command18, &Command19, &Command20})
        next->text = s.wording(u"המשך"_qs, u"Next"_qs);
    Command21.text = s.wording(u"לסיכום"_qs, u"To the summary"_qs);
    Command22.text = s.wording(u"המשך לבחירת התמונות"_qs, u"On to the pictures"_qs);
    Command23.text = s.wording(u"הצג סיכום"_qs, u"Show the summary"_qs);
    Command25.text = s.wording(u"קרא תנאי שימוש"_qs, u"Read the terms of use"_qs);
    Check4.text = s.wording(u"להוסיף אלבום הורים"_qs, u"Add a parent album"_qs);
    LabelParents.text = s.wording(u"עותקים להורים"_qs, u"Copies for the parents"_qs);
    Command26.text = u"−"_qs;
    Command26.hint = s.wording(u"עותק פחות"_qs, u"One copy less"_qs);
    Command27.text = u"+"_qs;
    Command27.hint = s.wording(u"עותק נוסף"_qs, u"One copy more"_qs);
    Check6.text = s.wording(u"מסכים תנאי שימוש"_qs, u"I agree to the terms of use"_qs);
    Pic4Bil.text = s.wording(u"סיכום ההזמנה"_qs, u"Your album"_qs);
    LabelCheck3.text = promptOf(AlbumChoice::SpecialExtra);

    const QStringList kinds = itemsOf(AlbumChoice::Kind);
    for (std::size_t i = 0; i < SoogAlb.size(); ++i)
        SoogAlb[i].text = Label28[i].text = kinds[static_cast<qsizetype>(i)];
    Label17.text = m_kind >= 0 ? kinds[m_kind] : notChosen;
    const QStringList extras = itemsOf(AlbumChoice::SpecialExtra);
    for (std::size_t i = 0; i < Check3.size(); ++i)
        Check3[i].text = extras[static_cast<qsizetype>(i)];

    // The domains and the parents' sizes are the same in both languages, and the first box may hold a typed text.
    if (Combo4Mail.box.text.isEmpty() || Combo4Mail.box.text == mailDomainPrompt(!s.english()))
        Combo4Mail.box.text = mailDomainPrompt(s.english());
    if (Combo4Horim.list.currentIndex() < 0)
        Combo4Horim.box.text = promptOf(AlbumChoice::ParentSize);
    reword(Combo4Godel, itemsOf(AlbumChoice::Size), promptOf(AlbumChoice::Size));
    reword(Combo4Cricha, itemsOf(AlbumChoice::Cover), promptOf(AlbumChoice::Cover));
    reword(Combo4Niyar, itemsOf(AlbumChoice::Paper), promptOf(AlbumChoice::Paper));
    reword(Combo4Tosefet, itemsOf(AlbumChoice::Extra), promptOf(AlbumChoice::Extra));
    if (Pic4Alboom.visible && panel == Panel::Bill)
        Command23_Click();
    showPanel();
}

// Which controls belong to the open panel, and what it asks for.
void AlbumPanels::showPanel() {
    const auto is = [this](Panel which) { return Pic4Alboom.visible && panel == which; };
    const auto show = [](bool visible, std::initializer_list<Caption*> parts) {
        for (Caption* part : parts)
            part->visible = visible;
    };
    for (std::size_t i = 0; i < Text1.size(); ++i)
        show(is(Panel::Photographer), {&Text1[i], &LabelText1[i]});
    show(is(Panel::Photographer), {&Combo4Mail.box, &Check5, &Command28, &Command17});

    for (std::size_t i = 0; i < SoogAlb.size(); ++i)
        show(is(Panel::Kind), {&SoogAlb[i], &Label28[i]});
    show(is(Panel::Kind), {&Label17, &Check4, &Command16});
    show(is(Panel::Kind) && Check4.checked,
         {&LabelParents, &Label32, &Command26, &Command27, &Combo4Horim.box, &Label36});

    show(is(Panel::Size), {&Combo4Godel.box, &Command18});
    show(is(Panel::Cover), {&Combo4Cricha.box, &Command19});
    show(is(Panel::Paper), {&Combo4Niyar.box, &Command20});
    show(is(Panel::Extras), {&Combo4Tosefet.box, &LabelCheck3, &Command21});
    for (CheckCaption& extra : Check3)
        extra.visible = is(Panel::Extras);
    show(is(Panel::Bill), {&Pic4Bil, &Check6, &Command25, &Command22});
    Command23.visible = false; // Command21 and Command22 press it

    switch (panel) {
    case Panel::Photographer:
        Pic4Alboom.text = m_state.wording(u"אלבום הורים: פרטי הצלם"_qs, u"Parent album: the photographer"_qs);
        break;
    case Panel::Kind:
        Pic4Alboom.text = promptOf(AlbumChoice::Kind);
        break;
    case Panel::Size:
        Pic4Alboom.text = promptOf(AlbumChoice::Size);
        break;
    case Panel::Cover:
        Pic4Alboom.text = promptOf(AlbumChoice::Cover);
        break;
    case Panel::Paper:
        Pic4Alboom.text = promptOf(AlbumChoice::Paper);
        break;
    case Panel::Extras:
        Pic4Alboom.text = promptOf(AlbumChoice::Extra);
        break;
    case Panel::Bill:
        Pic4Alboom.text = m_state.wording(u"סיכום ותנאי שימוש"_qs, u"Summary and terms of use"_qs);
        break;
    }

    QStringList chosen;
    if (m_kind >= 0)
        chosen += Label17.text;
    for (const Choice* choice : {&Combo4Godel, &Combo4Cricha, &Combo4Niyar}) {
        if (choice->list.currentIndex() >= 0)
            chosen += choice->box.text;
    }
    ChoiceSoFar.text = chosen.join(u" · "_qs);
    ChoiceSoFar.visible = Pic4Alboom.visible && panel != Panel::Bill && !chosen.isEmpty();
    Q_EMIT changed();
}

void AlbumPanels::writeBill() {
    const AlbumDetails& album = m_state.album;
    Pic4BilLines = {album.ShemZalam,  album.ShemErooa, album.TelZalam,    album.MailZalam, album.SoogLBM,
                    album.SoogKricha, album.SoogNiar,  album.Tosafot1[0], album.GodelLBM,  album.HearotLBM};
    Pic4BilLines.removeAll(QString());
    Pic4BilExtras = QStringList(album.Tosafot2.begin(), album.Tosafot2.end());
    Pic4BilExtras.removeAll(QString());
    const QString parents = m_state.wording(u"אלבום הורים"_qs, u"Parent album"_qs);
    const QString rule(25, u'_');
    Pic4BilParents = {rule, u"  "_qs + parents + u"  "_qs + album.KamutHorim, album.SoogHorim + u'=' + parents, rule};
}

} // namespace lumora
