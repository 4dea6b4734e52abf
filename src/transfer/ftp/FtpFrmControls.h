#pragma once

#include "common/DrivePath.h"
#include "transfer/delivery/SendingPage.h"

#include <QStringList>

namespace lumora {

// The controls of the page that sends by FTP.
struct FtpFrmControls : SendingControls {
    enum class PageSize {
        Full,
        Small, // a narrow strip while files are sent, so that the customer can use the screen
    };
    PageSize pageSize = PageSize::Full;

    // Label3 is the status line in the system's terms; Label4Do tells the same to a customer.
    Caption Label3{*this, u"Label3"};
    Caption Label46{*this, u"Label46"};                                // name of the order folder
    Caption Label7{*this, u"Label7"};                                  // number of files found in the folder
    Caption Label21{*this, u"Label21"};                                // pictures in all, copies counted
    Caption Label4Counts{*this, u"Label4Counts"};                      // pictures and files in a sentence
    Caption Label4Prints{*this, u"Label4Prints"};                      // pictures in a sentence
    Caption Label15{*this, u"Label15", Caption::At::Hidden};           // home delivery note
    Caption Label4Ktovet{*this, u"Label4Ktovet", Caption::At::Hidden}; // the delivery address
    Caption Picture2{*this, u"Picture2", Caption::At::Hidden};         // the summary, at success
    Caption numberPrompt{*this, u"numberPrompt"};                      // "your order number", at success
    Caption wholeNumber{*this, u"wholeNumber"};                        // the name under which the lab has the order
    QStringList Picture2Lines;                                         // its lines; saved as a small picture
    Caption Picture13{*this, u"Picture13", Caption::At::Hidden};       // the proof picture
    DrivePath Picture13File;

    // Label33 and Label20 both show the seconds of the countdown; Image10 and Image11 blink in turn.
    Caption Label33{*this, u"Label33"};
    Caption Label20{*this, u"Label20"};
    Caption Pic4Blink{*this, u"Pic4Blink"}; // both signs
    Caption Image10{*this, u"Image10"};
    Caption Image11{*this, u"Image11", Caption::At::Hidden};

    // Progress of the pass.
    static constexpr int Pic4ProgWidth = 1000;
    Caption LabelProg{*this, u"LabelProg"}; // "42  %"
    Caption Pic4Prog{*this, u"Pic4Prog", Caption::At::Hidden};
    int PicInProgWidth = 0;                                          // 0 to Pic4ProgWidth
    Caption Label4Bytes{*this, u"Label4Bytes", Caption::At::Hidden}; // "4.2 of 31.0 MB", of a kept session
    Caption PicInProgKatan{*this, u"PicInProgKatan", Caption::At::Hidden};
    int PicInProgKatanWidth = 0;                                             // pieces sent, 0 to Pic4ProgWidth
    Caption Label4Diff{*this, u"Label4Diff", Caption::At::Hidden};           // estimated minutes left
    Caption Label4DiffTitle{*this, u"Label4DiffTitle", Caption::At::Hidden}; // their heading
    Caption Label4Minutes{*this, u"Label4Minutes", Caption::At::Hidden};     // their unit
    Caption Picture1{*this, u"Picture1", Caption::At::Hidden};               // the bar that moves in each pause
    static constexpr int Picture1Full = 266;
    int Picture1Width = 0;                    // 0 to Picture1Full
    Caption Label34{*this, u"Label34"};       // number of the attempt
    Caption Label4siem{*this, u"Label4siem"}; // position in a chain of orders

    // The panel "not all arrived"; Picture6 joins its five parts to a sentence.
    Caption Picture6{*this, u"Picture6", Caption::At::Hidden};
    Caption Label4Nichshal{*this, u"Label4Nichshal"};      // "the computer failed to upload "
    Caption Label31{*this, u"Label31"};                    // the count of List9, which nothing fills; the lab's area
    Caption Label4Missing{*this, u"Label4Missing"};        // number of missing files
    Caption Label4Mitoch{*this, u"Label4Mitoch"};          // "files out of "
    Caption Label12{*this, u"Label12"};                    // files meant for sending
    Caption Label4Yooadoo{*this, u"Label4Yooadoo"};        // " files meant for sending "
    Caption Label4Hamtana{*this, u"Label4Hamtana"};        // what to do next; the lab's area
    Caption Label2{*this, u"Label2", Caption::At::Hidden}; // what went wrong
    Caption Label9{*this, u"Label9", Caption::At::Hidden}; // where the order is kept
    Caption Image6{*this, u"Image6", Caption::At::Hidden}; // sign of the panel
    Caption Frame9{*this, u"Frame9", Caption::At::Hidden}; // older bulk path: the failed round
    Caption Label4{*this, u"Label4"};                      // its number

    // "Close although nothing was sent?"
    Caption Picture7{*this, u"Picture7", Caption::At::Hidden}; // its text
    Caption Command14{*this, u"Command14"};                    // do not close
    Caption Command16{*this, u"Command16"};                    // close all the same

    // Buttons.
    Caption Command12{*this, u"Command12"};                      // send
    Caption Command10{*this, u"Command10", Caption::At::Hidden}; // send again
    Caption Command15{*this, u"Command15", Caption::At::Greyed}; // stop
    Caption Command21{*this, u"Command21", Caption::At::Greyed}; // stop
    Caption Command23{*this, u"Command23"};                      // stop the countdown or go on
    Caption Command18{*this, u"Command18"};                      // stop the countdown
    Caption Command11{*this, u"Command11", Caption::At::Greyed}; // exit, after all has arrived
    Caption Command8{*this, u"Command8"};                        // exit
    Caption Command22{*this, u"Command22"};                      // "press here in case of a communication fault"
    Caption Command24{*this, u"Command24"};                      // show Frame2
    Caption Command9{*this, u"Command9"};                        // hide Frame2
    Caption Image4{*this, u"Image4"};                            // copy the order number and open the folder
    Caption Image5{*this, u"Image5"};                            // send now
    Caption Frame5{*this, u"Frame5"};
    Caption Label6{*this, u"Label6"};
    Caption Label8{*this, u"Label8"};
    Caption Pic4Quik{*this, u"Pic4Quik", Caption::At::Hidden}; // a chain follows the countdown; never visible

    // The lab's own area: the lists, the chain and the manual panel.
    Caption Frame2{*this, u"Frame2", Caption::At::Hidden};
    Caption Label4ToSend{*this, u"Label4ToSend"}; // headings of List3, List6, List7, List4Broken and LogList
    Caption Label4OnServer{*this, u"Label4OnServer"};
    Caption Label4Failed{*this, u"Label4Failed"};
    Caption Label4Remains{*this, u"Label4Remains"};
    Caption Label4Log{*this, u"Label4Log"};
    Caption Label4List9{*this, u"Label4List9"}; // heading of Label31
    Caption Command13{*this, u"Command13"};     // new order
    Caption Command1{*this, u"Command1"};       // resend
    Caption Command2{*this, u"Command2"};       // older bulk path
    Caption Command4{*this, u"Command4"};

    Caption Label4Orders{*this, u"Label4Orders"};                // heading of ListRezefFiles
    Caption Label4Rezef{*this, u"Label4Rezef"};                  // there is no chain
    Caption Command17{*this, u"Command17", Caption::At::Greyed}; // one order of the chain
    Caption Command19{*this, u"Command19", Caption::At::Greyed}; // all orders of the chain
    Caption Command25{*this, u"Command25", Caption::At::Greyed}; // check one order of the chain

    Caption Label4Manual{*this, u"Label4Manual"}; // heading of the manual panel
    Caption cmdInternetOpen{*this, u"cmdInternetOpen"};
    Caption cmdClosehOpen{*this, u"cmdClosehOpen"};
    CheckCaption chkPassive{*this, u"chkPassive"};
    CheckCaption optBin{*this, u"optBin"};
    CheckCaption optAscii{*this, u"optAscii"};
    Caption Label4Proxy{*this, u"Label4Proxy"};
    Caption txtProxy{*this, u"txtProxy"}; // no connection heeds it
    Caption Command3{*this, u"Command3"}; // put
    Caption Command5{*this, u"Command5"}; // get
    Caption Command6{*this, u"Command6"}; // del
    Caption Command7{*this, u"Command7"}; // make dir
    Caption File1Enabled;
    Caption Label4File1{*this, u"Label4File1"}; // headings of File1, List1, List4, List5 and List2
    Caption Label4Home{*this, u"Label4Home"};
    Caption Label4Level1{*this, u"Label4Level1"};
    Caption Label4Level2{*this, u"Label4Level2"};
    Caption Label4Present{*this, u"Label4Present"};
    Caption Label5{*this, u"Label5"};   // remote directory asked for
    Caption Label37{*this, u"Label37"}; // remote directory at the first level, as the server tells it
    Caption Label38{*this, u"Label38"}; // the same without the leading slash
    Caption Label40{*this, u"Label40"}; // the same at the second level
    Caption Label41{*this, u"Label41"};
    Caption Command27{*this, u"Command27"}; // copy
};

} // namespace lumora
