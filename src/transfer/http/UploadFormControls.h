#pragma once

#include "transfer/delivery/SendingControls.h"

namespace lumora {

// The controls of the page that sends by HTTP.
struct UploadFormControls : SendingControls {
    Caption TxtWeb{*this, u"TxtWeb"};         // the last answer, or the list file's text
    Caption TxtFromWeb{*this, u"TxtFromWeb"}; // the list file's text
    Caption TxtUrl{*this, u"TxtUrl"};         // the rest of the upload's query

    static constexpr int Picture1FullWidth = 330;
    Caption Picture1{*this, u"Picture1", Caption::At::Hidden}; // panel of the countdown
    int Picture1Width = 0;
    Caption Picture5{*this, u"Picture5", Caption::At::Hidden};
    Caption Picture6{*this, u"Picture6", Caption::At::Hidden}; // the end panel
    Caption Pic4Timer{*this, u"Pic4Timer", Caption::At::Hidden};
    Caption Pic4Hamten{*this, u"Pic4Hamten", Caption::At::Hidden}; // the bar that moves in each pause
    static constexpr int Pic4HamtenFull = 66;
    int Pic4HamtenWidth = 0; // 0 to Pic4HamtenFull
    static constexpr int PicSargel2Width = 1000;
    int PicSargel1Width = 0; // 0 to PicSargel2Width

    Caption Image4{*this, u"Image4"};
    Caption Image5{*this, u"Image5", Caption::At::Hidden};       // send again
    Caption Command2{*this, u"Command2", Caption::At::Hidden};   // refresh
    Caption Command3{*this, u"Command3", Caption::At::Hidden};   // stop
    Caption Command10{*this, u"Command10", Caption::At::Hidden}; // continue
    Caption sendNow{*this, u"sendNow", Caption::At::Hidden};     // without waiting for the count
    Caption Command15{*this, u"Command15", Caption::At::Greyed}; // stop, enabled during a sending
    Caption endClose{*this, u"endClose", Caption::At::Hidden};   // close, at the end

    Caption Label1{*this, u"Label1"};                                // number of the attempt
    Caption Label4{*this, u"Label4"};                                // index of the last posted file
    Caption Label7{*this, u"Label7"};                                // percent
    Caption Label8{*this, u"Label8"};                                // seconds of the countdown
    Caption Label9{*this, u"Label9", Caption::At::Hidden};           // "sending"
    Caption Label10{*this, u"Label10"};                              // the shop's telephone
    Caption Label4Tel{*this, u"Label4Tel", Caption::At::Hidden};     // the same in a sentence
    Caption Label11{*this, u"Label11", Caption::At::Hidden};         // "this order went up in full"
    Caption Label12{*this, u"Label12"};                              // files left
    Caption Label4Left{*this, u"Label4Left", Caption::At::Hidden};   // the same in a sentence
    Caption Label13{*this, u"Label13"};                              // "the sending starts in"
    Caption Label14{*this, u"Label14"};                              // "seconds"
    Caption Label4Count{*this, u"Label4Count", Caption::At::Hidden}; // the countdown in a sentence, or Label11
    Caption Label15{*this, u"Label15"};                              // name of the order folder
    Caption Label16{*this, u"Label16"};                              // the same in the end panel
    Caption Label4Rshom{*this, u"Label4Rshom"};                      // "write down the order number"
    Caption Label4Alu{*this, u"Label4Alu"};                          // "the files went up"
    Caption Label4Tashlum{*this, u"Label4Tashlum"};                  // "call the shop about payment"
    Caption Label4Notru{*this, u"Label4Notru"};                      // "files left to send"
    Caption Pic4Trouble{*this, u"Pic4Trouble", Caption::At::Hidden}; // card of a failure during a sending

    // The lab's own area: the lists, the server's answers and the lab's tests of its scripts.
    Caption Frame2{*this, u"Frame2", Caption::At::Hidden};
    Caption Command24{*this, u"Command24"};       // shows Frame2
    Caption Command9{*this, u"Command9"};         // hides it
    Caption Label4Kvazim{*this, u"Label4Kvazim"}; // headings of the four lists
    Caption Label4Hossarim{*this, u"Label4Hossarim"};
    Caption Label4AfterWeb{*this, u"Label4AfterWeb"};
    Caption Label4InOrder{*this, u"Label4InOrder"};
    Caption Label4Answer{*this, u"Label4Answer"}; // headings of TxtWeb, TxtFromWeb and TxtUrl
    Caption Label4ListFile{*this, u"Label4ListFile"};
    Caption Label4Query{*this, u"Label4Query"};
    Caption Command1{*this, u"Command1"}; // post a test picture
    Caption Command5{*this, u"Command5"}; // post nothing to the listing
    Caption Command6{*this, u"Command6"}; // listing of a test folder
    Caption Command7{*this, u"Command7"}; // check the order
    Caption Command8{*this, u"Command8"}; // fetch the list file
};

} // namespace lumora
