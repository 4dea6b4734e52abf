#pragma once

#include "editing/ResolutionCaption.h"
#include "imaging/Bitmap.h"
#include "selection/FolderPager.h"
#include "session/Caption.h"
#include "session/TextList.h"

#include <QRectF>

namespace lumora {

// A control that a screen reader names by more than its text.
struct SpokenCaption : Caption {
    using Caption::Caption;
    QString spoken;
};

// A small picture. Its text is the path, empty in an empty cell; the bitmap has its drawn size, to be centred in the
// cell, and is null for a file that can't be read.
struct CellPicture : SpokenCaption {
    using SpokenCaption::SpokenCaption;
    Bitmap bitmap;
    QString name;         // the customer's own
    QString unreadable;   // why it can't be chosen
    bool waiting = false; // it is being made
};

// The large view: either a picture or lines of guidance.
struct LargeView : SpokenCaption {
    using SpokenCaption::SpokenCaption;
    Bitmap bitmap;
    bool poor = false; // the picture has few pixels: the warning is painted over it
    QString warning;
    QRectF paper; // over the picture, in shares of its sides as they are shown; null where no paper is drawn
    QStringList guide;
};

// The controls of the page of pictures.
struct kyoskNewControls : Controls {
    TextList List1{*this, u"List1"}; // the basket
    TextList List2{*this, u"List2"}; // the paths of the page in view, one a cell
    TextList List4{*this, u"List4"}; // all paths of the folders picked so far

    ControlArray<CellPicture, cellsOfPage> Picture1{*this, u"Picture1"};
    ControlArray<Caption, cellsOfPage> Picture4{*this, u"Picture4"}; // the chosen mark; plus and minus lie in it
    ControlArray<Caption, cellsOfPage> Label4{*this, u"Label4"};     // copies
    ControlArray<Caption, cellsOfPage> Label5{*this, u"Label5"};     // end of the path, "*" when empty
    ControlArray<ResolutionCaption, cellsOfPage> resolution{*this, u"resolution", Caption::At::Hidden};
    ControlArray<SpokenCaption, cellsOfPage> Command12{*this, u"Command12"}; // plus
    ControlArray<SpokenCaption, cellsOfPage> Command13{*this, u"Command13"}; // minus

    Caption copiesPanel{*this, u"copiesPanel", Caption::At::Hidden}; // the copies are typed on digits
    Bitmap copiesPicture;
    Caption copiesHead{*this, u"copiesHead"};
    Caption copiesTyped{*this, u"copiesTyped"};
    Caption copiesNote{*this, u"copiesNote"};
    ControlArray<Caption, 10> copiesDigit{*this, u"copiesDigit"};
    Caption copiesBack{*this, u"copiesBack"};
    Caption copiesCancel{*this, u"copiesCancel"};
    Caption copiesDone{*this, u"copiesDone"};

    Caption Title{*this, u"Title"};   // what to do on this page
    Caption Frame1{*this, u"Frame1"}; // the frame of the cells; text: what to do while there are none
    LargeView Picture2{*this, u"Picture2"};
    Caption Label1{*this, u"Label1"}; // the path of the picture in hand, or the number of lines after Command11
    Caption Label2{*this, u"Label2"}; // the path that Image4 turns
    Caption Label6{*this, u"Label6"}; // the grade
    ResolutionCaption largeResolution{*this, u"largeResolution", Caption::At::Hidden};
    Caption paperNote{*this, u"paperNote", Caption::At::Hidden}; // what becomes of the picture on its paper
    Caption Label7{*this, u"Label7"};                            // copies in all
    Caption Label7Prompt{*this, u"Label7Prompt"};
    Caption Label15{*this, u"Label15"}; // paper size
    Caption Label18{*this, u"Label18"};
    Caption changeDetails{*this, u"changeDetails"};          // size, paper and details
    Caption Label24{*this, u"Label24", Caption::At::Hidden}; // the edit record as it is, for the operator
    Caption Label25{*this, u"Label25"};                      // reminder of the folder choice
    Caption Label29{*this, u"Label29"};                      // the folder picked last
    Caption Label34{*this, u"Label34"};                      // how many pictures it and those before have
    Caption Label34Prompt{*this, u"Label34Prompt"};
    Caption pictureCount{*this, u"pictureCount"};                // the same in words
    Caption pageRange{*this, u"pageRange", Caption::At::Hidden}; // which of them are in view
    Caption Label9{*this, u"Label9"};                            // help
    Caption Frame2{*this, u"Frame2", Caption::At::Hidden};       // its panel
    Caption helpClose{*this, u"helpClose"};
    Caption emptyHead{*this, u"emptyHead"}; // while no folder is picked
    Caption firstFolder{*this, u"firstFolder"};
    Caption cardOffer{*this, u"cardOffer", Caption::At::Hidden};   // the card that is in
    Caption cardNote{*this, u"cardNote"};                          // what it holds
    Caption cardCopies{*this, u"cardCopies", Caption::At::Hidden}; // how far what was chosen from it is copied
    Caption Image4{*this, u"Image4", Caption::At::Hidden};         // with a picture in the large view
    Caption Command4Safa{*this, u"Command4Safa"};                  // to the other language, in its own word
    Caption Image5{*this, u"Image5"};
    Caption Image6{*this, u"Image6"};
    Caption Image7{*this, u"Image7"};
    Caption Image8{*this, u"Image8"};
    Caption Image10{*this, u"Image10"};
    Caption Image11{*this, u"Image11"};
    Caption Image13{*this, u"Image13"};
    Caption Image15{*this, u"Image15"};
    Caption Image16{*this, u"Image16"};
    Caption Image17{*this, u"Image17"};
    Caption Image19{*this, u"Image19", Caption::At::Hidden};
    Caption Image20{*this, u"Image20", Caption::At::Hidden};
    Caption Image23{*this, u"Image23"};
    Caption Image33{*this, u"Image33"};
    Caption Command11{*this, u"Command11"};
    Caption Command14{*this, u"Command14"};

    Caption Pic4Brose{*this, u"Pic4Brose", Caption::At::Hidden}; // shown while the file dialog is open
    QStringList Pic4BroseLines;

    // The offer of the whole folder; it stays below the cells, so that it can be taken back.
    Caption Picture66{*this, u"Picture66", Caption::At::Hidden};
    Caption Command23{*this, u"Command23"};
    Caption Command24{*this, u"Command24"};
    Caption Command25{*this, u"Command25"};
    ControlArray<Caption, 2> Command26{*this, u"Command26"};
    Caption Label35{*this, u"Label35", Caption::At::Hidden};
    int label35Left = 0; // logical pixels; Timer1 moves it
    Caption Label36{*this, u"Label36", Caption::At::Hidden};
    int pointerStep = 0; // 0 to 3; Timer2 moves the pointers Image19 and Image20 by it

    Caption doorPanel{*this, u"doorPanel", Caption::At::Hidden}; // the chosen pictures are being made
    Caption doorNote{*this, u"doorNote"};
    Caption doorCount{*this, u"doorCount"};
    double doorShare = 0; // 0 to 1, of the chosen pictures
    Caption doorBack{*this, u"doorBack"};

    Caption Frame3{*this, u"Frame3", Caption::At::Hidden}; // leaving with pictures chosen
    Caption Label11{*this, u"Label11"};
    Caption Command15{*this, u"Command15"};
    Caption Command4{*this, u"Command4"};

    Caption PicB4Sioom{*this, u"PicB4Sioom", Caption::At::Hidden}; // covers the page behind the closing panel
    Caption Frame4{*this, u"Frame4", Caption::At::Hidden};         // the closing panel
    Caption closingHead{*this, u"closingHead"};
    Caption Label19{*this, u"Label19"}; // paper size
    Caption Label20{*this, u"Label20"}; // copies
    Caption Label19Prompt{*this, u"Label19Prompt"};
    Caption Label20Prompt{*this, u"Label20Prompt"};
    Caption coarseNote{*this, u"coarseNote", Caption::At::Hidden}; // how many pictures will print coarse
    Caption showCoarse{*this, u"showCoarse", Caption::At::Hidden}; // leads to them
    Caption Label17{*this, u"Label17"};                            // prompt of the address
    Caption Label33{*this, u"Label33"};                            // the address is required
    Caption Label33Word{*this, u"Label33Word"};                    // whether it is there, and the way without it
    Caption Text1{*this, u"Text1"};                                // the address before its "@"
    SpokenCaption Combo1{*this, u"Combo1"};                        // and behind it, as chosen or typed
    QStringList Combo1Items;
    int Combo1Index = -1;
    Caption Txt4Ml2{*this, u"Txt4Ml2"}; // the whole address of an album order
    Caption Text2{*this, u"Text2"};     // the note
    Caption Text2Prompt{*this, u"Text2Prompt"};
    Caption LblKoopon{*this, u"LblKoopon"};
    Caption Label4kpn3{*this, u"Label4kpn3"}; // the quantity of the coupon
    Caption Label4kpn3Prompt{*this, u"Label4kpn3Prompt"};
    Caption Command7{*this, u"Command7"};
    Caption Command8{*this, u"Command8"};
    Caption Command10{*this, u"Command10"};

    Caption Pic4snifim{*this, u"Pic4snifim", Caption::At::Hidden}; // the collection panel, above the closing panel
    ControlArray<Caption, 11> Command4Snif{*this, u"Command4Snif"};
    Caption Pic4Snif{*this, u"Pic4Snif", Caption::At::Hidden}; // the card beside the branches
    Caption Label41{*this, u"Label41"};
    Caption Command28{*this, u"Command28"};

    Caption Picture7{*this, u"Picture7", Caption::At::Hidden}; // the question of deep compression
    Caption Label37{*this, u"Label37"};
    Caption Command20{*this, u"Command20"};
    Caption Command21{*this, u"Command21"};
};

} // namespace lumora
