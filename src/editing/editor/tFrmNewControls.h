#pragma once

#include "editing/ResolutionCaption.h"
#include "editing/render/CropFrame.h"
#include "editing/render/LineFramePalette.h"
#include "editing/render/TextLabelPlace.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"
#include "session/Caption.h"
#include "session/TextList.h"

namespace lumora {

// What the editor shows. Positions are in the logical pixels of the paper.
struct tFrmNewControls : Controls {
    Bitmap PicPic;          // what the paper shows, in the scale that was asked for; null while no picture is open
    PictureSize PicPicSize; // the paper in logical pixels
    Caption Labeltext{*this, u"Labeltext", Caption::At::Hidden}; // blanks, as long as the caption
    TextLabelBox LabeltextBox;                                   // the box that marks the caption

    Caption Label10{*this, u"Label10"};                                      // the turn
    Caption Label11{*this, u"Label11"};                                      // the zoom
    Caption Label13{*this, u"Label13"};                                      // the record, for the operator
    Caption Label5{*this, u"Label5"};                                        // how many frames the category has
    Caption Label6{*this, u"Label6"};                                        // the frame in hand, "3  / "
    Caption Label4{*this, u"Label4"};                                        // the palette's index
    ResolutionCaption resolution{*this, u"resolution", Caption::At::Hidden}; // at which the open picture prints
    int VScrollZ = 100;                                                      // VScrollZMin to VScrollZMax
    static constexpr int VScrollZMin = 40;
    static constexpr int VScrollZMax = 210;

    TextList Combo4List{*this, u"Combo4"}; // categories of frames
    TextList Combo2List{*this, u"Combo2"}; // frames of the category
    TextList Combo5List{*this, u"Combo5"}; // styles of line frames
    Caption Combo4{*this, u"Combo4"};      // what the boxes say
    Caption Combo2{*this, u"Combo2"}, Combo5{*this, u"Combo5"};
    CheckCaption Misgerett{*this, u"Misgerett"};

    LineFramePalette palette; // pic4Msgrt with its marker PicInMsgrt
    CropFrame crop;

    Caption Frame3{*this, u"Frame3", Caption::At::Hidden};     // the panel of the tones
    Caption Frame4{*this, u"Frame4", Caption::At::Hidden};     // the panel of the turns
    Caption Picture3{*this, u"Picture3", Caption::At::Hidden}; // the tools; shown once a picture is open
    Caption Image19{*this, u"Image19"};                        // what to do while none is
    Caption Frame5{*this, u"Frame5"};                          // the spare panel of the operator
    Caption Title{*this, u"Title"};                            // the leaf name of the picture

    ControlArray<Caption, 11> Image2{*this, u"Image2"};
    int sunkImage2 = -1; // the held button of Image2 that has its border down
    Caption Image135{*this, u"Image135"}, Image115{*this, u"Image115"}, Image125{*this, u"Image125"},
        Image145{*this, u"Image145"}, Image15{*this, u"Image15"}, Image16{*this, u"Image16"},
        Image17{*this, u"Image17"}, Image18{*this, u"Image18"}, Image27{*this, u"Image27"}, Image4{*this, u"Image4"},
        Image5{*this, u"Image5"}, Image9{*this, u"Image9"}, Image11{*this, u"Image11"}, Image12{*this, u"Image12"},
        Image13{*this, u"Image13"}, Image20{*this, u"Image20"}, Image21{*this, u"Image21"}, Image22{*this, u"Image22"},
        Image28{*this, u"Image28"}, Image29{*this, u"Image29"}, Command2{*this, u"Command2"},
        Command4{*this, u"Command4"}, Command6{*this, u"Command6"}, Command8{*this, u"Command8"},
        Command9{*this, u"Command9"}, Command18{*this, u"Command18"}, CommandDone{*this, u"CommandDone"},
        CommandImprove{*this, u"CommandImprove"};
    Caption Command10{*this, u"Command10", Caption::At::Hidden}; // the paper sizes
    Caption Command12{*this, u"Command12", Caption::At::Hidden}, Command23{*this, u"Command23", Caption::At::Hidden},
        Command24{*this, u"Command24", Caption::At::Hidden};
    Caption Command13{*this, u"Command13"}; // the crop markers
    Caption Command14{*this, u"Command14"}, Command15{*this, u"Command15"}, Command16{*this, u"Command16"};

    bool hintsAsLabels = false; // Image29: a pointer that can't hover reads the hints below the buttons

    // The titles of the groups of tools.
    Caption placeTitle{*this, u"placeTitle"}, turnTitle{*this, u"turnTitle"}, lightTitle{*this, u"lightTitle"},
        framesTitle{*this, u"framesTitle"};
    Caption Frame4Opener{*this, u"Frame4Opener"}; // opens the panel of the turns for a finger, which can't hover
    Caption hintsClose{*this, u"hintsClose"};

    // What is spoken. %1 is a picture's leaf name.
    struct {
        QString categories, framesOfCategory, operatorPanel, lineStyles;
        QString emptyCell, openCell, otherCell;
    } words;
};

} // namespace lumora
