#pragma once

#include "entry/ComboCaption.h"

namespace lumora {

// What the details page shows, but for the panels of an album.
struct nnnControls : Controls {
    Caption Title{*this, u"Title"};         // what the open step asks for
    double stepShare = 0;                   // of the steps of the page, those that are done: 0 to 1
    Caption Choice{*this, u"Choice"};       // size, kind, border and fit, as far as chosen
    Caption Label4Tel{*this, u"Label4Tel"}; // the lab's telephone, for a question
    Caption Command2{*this, u"Command2"};   // cancel
    Caption Command4{*this, u"Command4"};   // one step back
    // To the other language, in its own word; the menu has a tile to English.
    Caption Command4Anglit{*this, u"Command4Anglit"};
    Caption Command4Ivrit{*this, u"Command4Ivrit"};

    // The menu.
    ControlArray<Caption, 10> Image1{*this, u"Image1"};    // tiles, with a line of explanation as hint
    int markedTile = -1;                                   // of the tiles 0 to 2
    Caption Command14{*this, u"Command14"};                // asks whether to clean the history
    Caption Command15{*this, u"Command15"};                // clarifications and warnings
    Caption Frame1{*this, u"Frame1", Caption::At::Hidden}; // the question whether to clean the history
    Caption Command7{*this, u"Command7"};                  // clean
    Caption Command9{*this, u"Command9"};                  // keep

    // Details.
    Caption LabelText2{*this, u"LabelText2"}; // captions of the boxes
    Caption LabelText3{*this, u"LabelText3"};
    Caption LabelText4{*this, u"LabelText4"};
    Caption Text2{*this, u"Text2"}; // name; the text is what the customer typed
    Caption Text3{*this, u"Text3"}; // telephone
    Caption Text4{*this, u"Text4"}; // delivery address, shown for home delivery
    bool Text4Calls = false;        // the address is missing and its box calls for attention
    CheckCaption Check2{*this, u"Check2"};
    Caption Command10{*this, u"Command10"};
    Caption Command12{*this, u"Command12"};

    // Options: sizes and kinds of paper.
    Caption Frame4{*this, u"Frame4"};
    Caption LabelSizes{*this, u"LabelSizes"};
    Caption LabelKinds{*this, u"LabelKinds"};
    ControlArray<CheckCaption, 3> Option1{*this, u"Option1"};    // the quick sizes
    ComboCaption Combo1{*this, u"Combo1"};                       // all sizes on offer
    Caption LabelCombo1{*this, u"LabelCombo1"};                  // what Combo1 is, spoken
    ControlArray<CheckCaption, 2> Option3{*this, u"Option3"};    // matte, glossy
    Caption Label4kpn{*this, u"Label4kpn", Caption::At::Hidden}; // pictures that a coupon holds
    Caption Command8{*this, u"Command8"};

    // Border.
    Caption Picture4{*this, u"Picture4"};
    ControlArray<CheckCaption, 10> Image13{*this, u"Image13"}; // text: the border code's name
    int Picture16 = -1;                                        // index of the border shown large; -1 none
    Caption LabelPicture16{*this, u"LabelPicture16"};          // its name
    Caption Command6{*this, u"Command6"};

    // Fit or fill.
    Caption Picture5{*this, u"Picture5"};
    CheckCaption Option4{*this, u"Option4"};
    CheckCaption Option5{*this, u"Option5"};
    Caption Label2{*this, u"Label2"}; // "FIT"
    Caption Label3{*this, u"Label3"}; // "FIL"

    // Terms.
    Caption LabelChoice{*this, u"LabelChoice"}; // heads of the choice and of the terms
    Caption LabelCheck1{*this, u"LabelCheck1"};
    CheckCaption Check1{*this, u"Check1"};
    Caption Command29{*this, u"Command29"};
    Caption LabelTerms{*this, u"LabelTerms"}; // the hint that Command30 closes
    Caption Command30{*this, u"Command30"};
    Caption Image4{*this, u"Image4"}; // decoration
    Caption Label8{*this, u"Label8"}; // the arrow to the last button
    Caption Command3{*this, u"Command3"};
    Caption Command24{*this, u"Command24",
                      Caption::At::Hidden}; // the same of an album, whose own last button presses it
};

} // namespace lumora
