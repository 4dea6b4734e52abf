#pragma once

#include "entry/album/AlbumCheck.h"
#include "entry/album/AlbumControls.h"
#include "order/AlbumChoices.h"
#include "order/MailAddressGuard.h"
#include "platform/Platform.h"
#include "session/Ticker.h"

#include <QObject>

#include <vector>

namespace lumora {

struct SessionState;

// The parent album (glossary: Pic4Alboom) on the details page: here a photographer gives name and event, takes kind,
// size, cover, paper and extras, and agrees to the bill. The page leads to the pictures once the album is checked.
class AlbumPanels : public QObject, private AlbumControls {
    Q_OBJECT
public:
    AlbumPanels(SessionState& state, const Platform& platform, Controls& of);

    // Exactly one is open, in their order.
    enum class Panel { Photographer, Kind, Size, Cover, Paper, Extras, Bill };
    static constexpr int panelCount = 7;

    // A new album: nothing is chosen, and the photographer's panel is open. The photographer's details stay.
    void begin();
    // The album of the session is changed: the panels show it, from its kind on.
    void change();
    // Hides what is asked of a new album alone: the terms were agreed to, and what is remembered was decided.
    void showChange(const QString& wayBack);
    void close();
    // One panel back; false on the first.
    bool back();
    void setTexts();
    // Something was typed or chosen that a cancel would throw away.
    bool isBegun() const;

    // --- events ---

    void Text1_Change(int box, const QString& text) { type(box, text); }
    void Combo4Mail_Change(const QString& text) { typeDomain(text); }
    void Combo4Mail_Click(int row) { take(Combo4Mail, row); }
    void Check5_Click(bool checked) { tick(Check5, checked); } // remember the photographer
    void Command28_Click() { recallPhotographer(); }
    void Command17_Click() { leavePhotographer(); }
    void SoogAlb_Click(int kind) { takeKind(kind); }
    void Check4_Click(bool checked) { addParents(checked); }
    void Command26_Click() { oneCopyLess(); }
    void Command27_Click() { oneCopyMore(); }
    void Combo4Horim_Click(int row) { takeParentSize(row); }
    void Command16_Click() { leaveKind(); }
    void Combo4Godel_Click(int row) { take(Combo4Godel, row); }
    void Command18_Click() { goOnTo(Panel::Cover); }
    void Combo4Cricha_Click(int row) { take(Combo4Cricha, row); }
    void Command19_Click() { goOnTo(Panel::Paper); }
    void Combo4Niyar_Click(int row) { take(Combo4Niyar, row); }
    void Command20_Click() { goOnTo(Panel::Extras); }
    void Combo4Tosefet_Click(int row) { take(Combo4Tosefet, row); }
    void Check3_Click(int extra, bool checked) { tick(Check3.at(static_cast<std::size_t>(extra)), checked); }
    void Command21_Click() { goOnToBill(); }
    void Check6_Click(bool checked) { tick(Check6, checked); } // agrees to the terms
    void Command22_Click() { finish(); }
    void Command23_Click() { gather(); }
    void Timer4Alboom_Tick() { slide(parentsShift, Timer4Alboom); }
    void Timer7_Tick() { slide(panelShift, Timer7); }

    // --- state ---

    const AlbumControls& controls() const { return *this; }
    Panel panel() const { return m_panel; }
    // Combo4Mail shows its prompt, and what is typed takes its place.
    bool promptStands() const { return typedAddress().untouched; }

Q_SIGNALS:
    void changed();
    void focusWanted(const QString& control);
    // The album has passed its check and is in the session.
    void checked();

private:
    struct PanelRow;
    std::vector<PanelRow> panelTable();
    // The four lists that have a panel of their own.
    struct ListRow {
        Panel panel;
        ComboCaption& list;
        AlbumChoice choice;
    };
    std::vector<ListRow> listTable();

    void open(Panel next);
    // Carefully what the open panel has to have is asked for before it is left.
    bool isWhole();
    void goOnTo(Panel next);
    void fillLists();
    void showPanel();
    QString choiceSoFar() const;

    void tick(CheckCaption& box, bool checked);
    void take(ComboCaption& list, int row);
    void type(int box, const QString& text);
    void typeDomain(const QString& text);
    void recallPhotographer();
    void leavePhotographer();
    bool telephoneMayBe();
    void showKinds();
    void takeKind(int kind);
    void addParents(bool wanted);
    void oneCopyLess();
    void oneCopyMore();
    void setCopies(int copies);
    void takeParentSize(int row);
    void leaveKind();
    void goOnToBill();
    void gather();
    void writeBill();
    void finish();
    struct FaultRow;
    static FaultRow placeOf(const AlbumProblem& problem);
    void refuse(const AlbumProblem& problem);
    void slide(int& shift, Ticker& timer);
    void stopSliding();
    TypedAddress typedAddress() const;
    QString mailAddress() const;
    QString kindName() const; // "***" before a kind is taken
    QString extraLine(const QString& name, std::size_t extra) const;
    QString promptOf(AlbumChoice choice) const { return albumPrompt(choice, english()); }
    QStringList itemsOf(AlbumChoice choice) const { return albumItems(choice, english()); }
    bool english() const;

    SessionState& m_state;
    const Platform& m_platform;
    Ticker Timer4Alboom;
    Ticker Timer7;
    Panel m_panel = Panel::Photographer;
    int m_kind = -1;  // index of the kind that is taken
    int m_copies = 0; // for the parents
};

} // namespace lumora
