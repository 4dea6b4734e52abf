#pragma once

#include "editing/caption/KeyLayout.h"
#include "imaging/Bitmap.h"
#include "session/Caption.h"
#include "session/TextList.h"

#include <array>
#include <cstdint>

namespace lumora {

// What the caption's keyboard shows.
struct mikledetControls : Controls {
    Caption Text1{*this, u"Text1"}; // what was typed; lines end in CR LF
    ControlArray<Caption, KeyLayout::keys> leter{*this, u"leter"};
    KeyLayout::Letters letters = KeyLayout::Letters::Hebrew; // what the letter keys are labelled with
    CheckCaption Check4{*this, u"Check4"};                   // the caption is on the picture
    TextList Combo1List{*this, u"Combo1"};
    Caption Combo1{*this, u"Combo1"};                      // the font
    Caption Frame1{*this, u"Frame1", Caption::At::Hidden}; // the panel of further symbols, keys firstSymbol and on
    Bitmap Picture18Image;                                 // the palette: equal fields of one colour each, side by side
    Caption Picture18{*this, u"Picture18"};
    std::int16_t SizeStep = 0;
    std::int16_t MoveStepX = 0;
    std::int16_t MoveStepY = 0;
    Caption Title{*this, u"Title"}, Command1{*this, u"Command1"};
    CheckCaption Command2{*this, u"Command2"}; // the chosen letters are ticked
    Caption Command3{*this, u"Command3"};
    CheckCaption Command4{*this, u"Command4"};
    Caption Command5{*this, u"Command5"}, Command6{*this, u"Command6"}, Command7{*this, u"Command7"},
        Command8{*this, u"Command8"};
    CheckCaption Command9{*this, u"Command9"};
    Caption Command10{*this, u"Command10"}, Command13{*this, u"Command13"}, Command14{*this, u"Command14"},
        CommandDone{*this, u"CommandDone"}, Image1{*this, u"Image1"}, Image2{*this, u"Image2"},
        Image3{*this, u"Image3"}, Image4{*this, u"Image4"};
    ControlArray<Caption, 4> Image15{*this, u"Image15"};    // left, right, up, down
    ControlArray<CheckCaption, 3> Image5{*this, u"Image5"}; // near, centre, far

    // What is spoken of controls that show no words of their own.
    struct {
        QString text, hebrewLetters, smallLetters, capitalLetters, blankKey;
    } words;
};

} // namespace lumora
