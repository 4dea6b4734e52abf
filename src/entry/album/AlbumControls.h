#pragma once

#include "entry/ComboCaption.h"

#include <QStringList>

namespace lumora {

// What the panels of an album show; the controls belong to the details page.
struct AlbumControls {
    explicit AlbumControls(Controls& of)
        : page(of) {}

    Controls& page;

    Caption Pic4Alboom{page, u"Pic4Alboom", Caption::At::Hidden}; // seen while a panel is open; text: what it asks for
    Caption ChoiceSoFar;                                          // kind, size, cover and paper, as far as chosen

    // The photographer.
    ControlArray<Caption, 4> Text1{page, u"Text1"}; // name, telephone, event, the mail address before the "@"
    ControlArray<Caption, 4> LabelText1{page, u"LabelText1"};
    ComboCaption Combo4Mail{page, u"Combo4Mail"};      // mail domains; the box may hold a typed text
    Caption LabelCombo4Mail{page, u"LabelCombo4Mail"}; // what Combo4Mail is, spoken
    CheckCaption Check5{page, u"Check5"};
    Caption Command28{page, u"Command28"};
    Caption Command17{page, u"Command17"};

    // The kind, and the copies for the parents.
    struct Shade {
        int red, green, blue;
        bool operator==(const Shade&) const = default;
    };
    static constexpr Shade grey{180, 180, 180};
    static constexpr Shade blue{0, 0, 250};
    struct KindCaption : CheckCaption {
        using CheckCaption::CheckCaption;
        Shade shade = grey;
    };
    ControlArray<KindCaption, 6> SoogAlb{page, u"SoogAlb"};
    ControlArray<Caption, 6> Label28{page, u"Label28"}; // captions of the kinds
    Caption Label17{page, u"Label17"};                  // the kind taken, "***" before
    CheckCaption Check4{page, u"Check4"};
    Caption LabelParents{page, u"LabelParents"}; // what Label32 counts
    Caption Label32{page, u"Label32"};           // copies for the parents
    Caption Command26{page, u"Command26"};
    Caption Command27{page, u"Command27"};
    ComboCaption Combo4Horim{page, u"Combo4Horim"};
    Caption LabelCombo4Horim{page, u"LabelCombo4Horim"}; // what Combo4Horim is, spoken
    Caption Label36{page, u"Label36"};                   // size of the parent album, as taken
    Caption Command16{page, u"Command16"};

    // Size, cover, paper, extras.
    ComboCaption Combo4Godel{page, u"Combo4Godel"};
    ComboCaption Combo4Cricha{page, u"Combo4Cricha"};
    ComboCaption Combo4Niyar{page, u"Combo4Niyar"};
    ComboCaption Combo4Tosefet{page, u"Combo4Tosefet"};
    Caption Command18{page, u"Command18"};
    Caption Command19{page, u"Command19"};
    Caption Command20{page, u"Command20"};
    Caption Command21{page, u"Command21"};
    Caption LabelCheck3{page, u"LabelCheck3"};
    ControlArray<CheckCaption, 6> Check3{page, u"Check3"};

    // The bill and the terms.
    Caption Pic4Bil{page, u"Pic4Bil"};
    QStringList Pic4BilLines; // the fields of the album
    QStringList Pic4BilExtras;
    QStringList Pic4BilParents;
    CheckCaption Check6{page, u"Check6"};
    Caption Command22{page, u"Command22"};
    Caption Command23{page, u"Command23", Caption::At::Hidden}; // Command21 and Command22 do its work too
    Caption Command25{page, u"Command25"};

    // Logical pixels that the open panel, and the parents' part of the kinds, still have to slide.
    int panelShift = 0;
    int parentsShift = 0;
};

} // namespace lumora
