#pragma once

#include "session/Caption.h"
#include "session/TextList.h"

#include <QPoint>

#include <array>

namespace lumora {

// What the red-eye page shows, beside its picture.
struct RedIControls : Controls {
    using At = Caption::At;

    QString caption;                                                      // drive path; "***" while there is no picture
    Caption RedTargetRectangle{*this, u"RedTargetRectangle", At::Hidden}; // the yellow circle
    Caption Image1{*this, u"Image1", At::Hidden};                         // the patch as it was, while the work runs
    Caption Frame6{*this, u"Frame6", At::Hidden};                         // a darkening button beside the patch
    QPoint Frame6Place;                                                   // of its corner, in pixels of the picture
    TextList List1{*this, u"List1"};                                      // pixels changed, "x^y" within the patch
    TextList List2{*this, u"List2"};                                      // List1 without repeats
    TextList Combo1{*this, u"Combo1"};                                    // what a turn of the wheel adds
    int HScroll1 = 0;
    static constexpr int HScroll1Max = 10;
    bool busy = false;                                    // a picture is being read or written
    Caption Label4Busy{*this, u"Label4Busy", At::Hidden}; // what the customer waits for

    // The pixel under the mouse, for the operator.
    Caption Label1{*this, u"Label1"}, Label2{*this, u"Label2"}, Label3{*this, u"Label3"}, Label12{*this, u"Label12"},
        Label24{*this, u"Label24"}, Label27{*this, u"Label27"}, Label28{*this, u"Label28"}, Rlbl{*this, u"Rlbl"},
        Glbl{*this, u"Glbl"}, Blbl{*this, u"Blbl"};
    // Peak and averages of the hand-placed variant.
    Caption Label6{*this, u"Label6"}, Label13{*this, u"Label13"}, Label16{*this, u"Label16"},
        Label17{*this, u"Label17"};
    enum class Order { Unknown, InOrder, OutOfOrder };
    Order Label6Order = Order::Unknown; // light green or light orange
    Caption Label25{*this, u"Label25"}; // peak redness,
    Caption Label30{*this, u"Label30"}; // less brightness,
    Caption Label31{*this, u"Label31"}; // divided by brightness
    Caption Label37{*this, u"Label37"}; // level of the repeat step
    Caption Label42{*this, u"Label42"}; // count of List1
    Caption Label43{*this, u"Label43"}; // of List2
    // What to do, step by step.
    Caption Label38{*this, u"Label38"}, Label40{*this, u"Label40"}, Label41{*this, u"Label41"},
        Label44{*this, u"Label44"}, Label45{*this, u"Label45", At::Hidden};
    Caption FrameHelp{*this, u"FrameHelp", At::Hidden}; // the instructions, all at once
    Caption LabelTitle{*this, u"LabelTitle"};

    Caption kofez{*this, u"kofez", At::Hidden}, Bsisi{*this, u"Bsisi"}, amok2{*this, u"amok2"}, amok3{*this, u"amok3"},
        amok4{*this, u"amok4"}, amok5{*this, u"amok5"}, amok{*this, u"amok"}, Memokad{*this, u"Memokad"},
        Rstor{*this, u"Rstor"}, Image2{*this, u"Image2"}, Image5{*this, u"Image5"}, Image6{*this, u"Image6"},
        Image7{*this, u"Image7"}, Image8{*this, u"Image8"}, Image9{*this, u"Image9"}, Image10{*this, u"Image10"},
        Image11{*this, u"Image11"}, Image12{*this, u"Image12"}, Image13{*this, u"Image13"}, Image14{*this, u"Image14"},
        Image15{*this, u"Image15"}, Image16{*this, u"Image16"}, Command3{*this, u"Command3"},
        Command6{*this, u"Command6"}, Command13{*this, u"Command13"}, CommandCloser{*this, u"CommandCloser"},
        CommandFurther{*this, u"CommandFurther"}, CommandMenu{*this, u"CommandMenu"},
        CommandMenuClose{*this, u"CommandMenuClose"}, CommandHelp{*this, u"CommandHelp"},
        CommandHelpClose{*this, u"CommandHelpClose"};

    // Words beside the controls: the four steps, and what is spoken. %1 is the picture's leaf name.
    struct {
        std::array<QString, 4> steps;
        QString picture, overview;
    } words;
};

} // namespace lumora
