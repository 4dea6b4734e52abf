#pragma once

#include "entry/album/AlbumCheck.h"
#include "entry/album/AlbumChoices.h"
#include "platform/Platform.h"
#include "session/Caption.h"
#include "session/TextList.h"
#include "session/Ticker.h"

#include <QObject>

#include <array>

namespace lumora {

struct SessionState;

// The panels of the details page on which a photographer orders a parent album: who, which kind with how many copies
// for the parents, size, cover, paper, extras, and the bill with the terms. One panel is open at a time. The page that
// owns them leads to the pictures once the album is checked.
class AlbumPanels : public QObject {
    Q_OBJECT
public:
    AlbumPanels(SessionState& state, const Platform& platform);

    enum class Panel {
        Photographer, // Text1, Combo4Mail, Check5, Command28, Command17
        Kind,         // SoogAlb, Label17, Check4, Command26, Label32, Command27, Combo4Horim, Label36, Command16
        Size,         // Combo4Godel, Command18
        Cover,        // Combo4Cricha, Command19
        Paper,        // Combo4Niyar, Command20
        Extras,       // Combo4Tosefet, Check3, Command21
        Bill,         // Pic4Bil, Check6, Command25, Command22
    };
    static constexpr int panelCount = 7;

    // A new album: nothing is chosen, and the photographer's panel is open. Who the photographer is stays.
    void begin();
    void close();
    // One panel back; false on the first.
    bool back();
    void setTexts();

    // --- events ---

    void Text1_Change(int box, const QString& text); // 0 name, 1 telephone, 2 event, 3 the mail address before the "@"
    void Combo4Mail_Change(const QString& text);     // typed
    void Combo4Mail_Click(int row);                  // chosen
    void Check5_Click(bool checked);                 // remember the photographer
    void Command28_Click();                          // the photographer from memory
    void Command17_Click();                          // on to the kind
    void SoogAlb_Click(int kind);
    void Check4_Click(bool checked); // a parent album too
    void Command26_Click();          // a copy less for the parents
    void Command27_Click();          // a copy more
    void Combo4Horim_Click(int row);
    void Command16_Click(); // fills the lists, and on to the size
    void Combo4Godel_Click(int row);
    void Command18_Click(); // fills the covers, and on to them
    void Combo4Cricha_Click(int row);
    void Command19_Click(); // fills the papers, and on to them
    void Combo4Niyar_Click(int row);
    void Command20_Click(); // fills the extras, and on to them
    void Combo4Tosefet_Click(int row);
    void Check3_Click(int extra, bool checked);
    void Command21_Click(); // on to the bill
    void Check6_Click(bool checked);
    void Command22_Click(); // the end: gathers, checks, and goes on with checked()
    void Command23_Click(); // gathers all fields and writes the bill
    void Timer4Alboom_Tick();
    void Timer7_Tick();

    // --- state ---

    struct Shade {
        int red, green, blue;
        bool operator==(const Shade&) const = default;
    };
    static constexpr Shade grey{180, 180, 180};
    static constexpr Shade blue{0, 0, 250};
    struct KindCaption : CheckCaption {
        Shade shade = grey;
    };
    // A list with what stands in its box: the prompt, or the item taken.
    struct Choice {
        TextList list;
        Caption box;
    };

    Panel panel = Panel::Photographer;
    Caption Pic4Alboom;  // visible while a panel is open; text: what it asks for
    Caption ChoiceSoFar; // kind, size, cover and paper, as far as chosen

    std::array<Caption, 4> Text1;
    std::array<Caption, 4> LabelText1;
    Choice Combo4Mail; // the box may hold a typed text
    CheckCaption Check5;
    Caption Command28;
    Caption Command17;

    std::array<KindCaption, 6> SoogAlb;
    std::array<Caption, 6> Label28; // captions of the kinds
    Caption Label17;                // the kind taken, "***" before
    CheckCaption Check4;
    Caption LabelParents; // what Label32 counts
    Caption Label32;      // copies for the parents
    Caption Command26, Command27;
    Choice Combo4Horim;
    Caption Label36; // size of the parent album, as taken
    Caption Command16;

    Choice Combo4Godel, Combo4Cricha, Combo4Niyar, Combo4Tosefet;
    Caption Command18, Command19, Command20, Command21;
    Caption LabelCheck3;
    std::array<CheckCaption, 6> Check3;

    Caption Pic4Bil;
    QStringList Pic4BilLines; // the fields of the album
    QStringList Pic4BilExtras;
    QStringList Pic4BilParents;
    CheckCaption Check6;
    Caption Command22, Command23, Command25;

    // Logical pixels that the open panel, and the parents' part of the kinds, still have to slide.
    int panelShift = 0;
    int parentsShift = 0;

Q_SIGNALS:
    void changed();
    void focusWanted(const QString& control);
    // The album holds together and stands in the session.
    void checked();

private:
    void open(Panel next);
    void showPanel();
    void fill(Choice& choice, const QStringList& items, const QString& prompt);
    void reword(Choice& choice, const QStringList& items, const QString& prompt);
    void take(Choice& choice, int row);
    void setCopies(int copies);
    void greyKinds();
    void gather();
    void writeBill();
    QString mailAddress() const;
    void refuse(const AlbumProblem& problem);
    QString promptOf(AlbumChoice choice) const;
    QStringList itemsOf(AlbumChoice choice) const;

    SessionState& m_state;
    const Platform& m_platform;
    Ticker Timer4Alboom;
    Ticker Timer7;
    int m_kind = -1; // index of the kind that Label17 names
};

} // namespace lumora
