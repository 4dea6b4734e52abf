#pragma once

#include "session/Caption.h"
#include "session/TextList.h"

#include <QString>
#include <QStringList>

namespace lumora {

// What the sending page shows and lists. The rules of sending write it, the view renders it; there is nothing else
// between them.
struct FtpBoard {
    static Caption hidden() {
        Caption caption;
        caption.visible = false;
        return caption;
    }
    static Caption greyed() {
        Caption caption;
        caption.enabled = false;
        return caption;
    }

    enum class PageSize {
        Full,
        Small, // while files travel the page is a narrow strip, so that the customer's screen is free
    };
    PageSize pageSize = PageSize::Full;
    QString caption; // title of the window

    // What happens now, which file of how many, what to do. Label3 is the status line in the system's own words; the
    // others say the same to a person who never saw this page.
    Caption Label3;
    Caption Label4File;   // "file 3 of 17: name"; empty while nothing travels
    Caption Label4Do;     // what the customer can do now
    Caption Label4Reason; // what the last failure of the line means; empty when there was none
    Caption Label46;      // name of the order folder
    Caption Label7;       // number of files found in the folder
    Caption Label21;      // pictures in all, copies counted
    Caption Label15;      // home delivery note; hidden in other orders
    Caption Label4Ktovet; // the delivery address below Label15

    // The countdown: the same number at both places. Image10 and Image11 blink against each other meanwhile.
    Caption Label33;
    Caption Label20;
    Caption Image10;
    Caption Image11 = hidden();

    // Progress over the files of the pass.
    static constexpr int Pic4ProgWidth = 1000;
    Caption LabelProg; // "42  %"
    int percent = 0;   // 0 to 100
    Caption Pic4Prog = hidden();
    int PicInProgWidth = 0;      // 0 to Pic4ProgWidth
    int PicInProgKatanWidth = 0; // pieces of one order, 0 to Pic4ProgWidth
    Caption Label4Diff;          // estimated minutes left; only when the order travels as pieces
    Caption Label4DiffTitle;
    Caption Picture1;      // the bar that runs in each pause
    int Picture1Width = 0; // 0 to 266
    Caption Label34;       // which attempt
    bool sending = false;  // a pass or its check is under way: start controls are ignored

    // The panel "not all arrived": five lines, two of them numbers.
    Caption Picture6 = hidden();
    Caption Label4Nichshal;    // "the computer failed to upload "
    Caption Label31;           // the count of a list that nothing fills
    Caption Label4Missing;     // the true number of missing files
    Caption Label4Mitoch;      // "files out of "
    Caption Label12;           // files meant for sending
    Caption Label4Yooadoo;     // " files meant for sending "
    Caption Label4Hamtana;     // what to do next
    Caption Label2 = hidden(); // what went wrong
    Caption Label9 = hidden(); // where the order is kept
    Caption Image6 = hidden(); // sign of the panel
    Caption Frame9 = hidden(); // older bulk path: which round failed
    Caption Label4;            // its round number

    // The summary: the order's lines, shown at success and kept as a small picture.
    Caption Picture2 = hidden();
    QStringList Picture2Lines;

    // "Close although nothing was sent?"
    Caption Picture7 = hidden(); // its text
    Caption Command14;           // do not close
    Caption Command16;           // close all the same

    // Buttons.
    Caption Command12;            // send
    Caption Command10;            // send again
    Caption Command28;            // a new order; shown in both end states
    Caption Command15;            // stop
    Caption Command21;            // stop
    Caption Command23;            // stop the countdown, go on
    Caption Command18;            // stop the countdown
    Caption Command11 = greyed(); // exit, once all has arrived
    Caption Command8;             // exit
    Caption Command22;            // "press here in case of a communication fault"
    Caption Command24;            // show Frame2
    Caption Command9;             // hide Frame2
    Caption Image3;               // close
    Caption Image4;               // copy the order number and open the folder
    Caption Image5;               // send now
    Caption Frame5;
    Caption Label6;
    Caption Label8;
    Caption Pic4Quik = hidden(); // nothing shows it
    Caption Label4siem;          // position in a chain of orders
    Caption Picture13 = hidden();
    QString Picture13File; // drive path

    // The hidden area of the makers: the lists and the manual panel. Frame2 is shown by Command24.
    Caption Frame2 = hidden();
    Caption Command13; // new order
    Caption Command1;  // resend
    Caption Command2;  // older bulk path
    Caption Command4;
    Caption Command3;  // put
    Caption Command5;  // get
    Caption Command6;  // del
    Caption Command7;  // make dir
    Caption Command17; // one order of the chain
    Caption Command19; // all orders of the chain
    Caption Command25; // check one order of the chain
    Caption Command27; // copy
    Caption File1Enabled;
    Caption Label5;  // remote directory asked for
    Caption Label37; // remote directory after the first level, as the server tells it, and without its slash
    Caption Label38;
    Caption Label40; // the same after the second level
    Caption Label41;
    CheckCaption chkPassive;
    CheckCaption optBin;
    CheckCaption optAscii;
    Caption cmdClosehOpen;
    Caption cmdInternetOpen;
    Caption txtProxy;

    TextList List1;          // names in the FTP home directory
    TextList List2;          // names after a make-dir or a manual operation
    TextList List3;          // full local paths of the files of the present pass
    TextList List4;          // names inside the first remote folder
    TextList List5;          // names inside the second: the order folders on the server
    TextList List6;          // names inside the order's folder on the server
    TextList List7;          // every path whose put failed
    TextList List8;          // leaf names used to count pictures
    TextList List9;          // shown as a count and never filled
    TextList List4Makor;     // the whole order; never shrinks
    TextList List4Broken;    // full local paths whose put failed and whose remains must leave the server
    TextList List4BrokenB;   // working copy of their leaf names
    TextList LogList;        // time-stamped lines of trouble
    TextList ListRezefFiles; // order folders of a chain; no page fills it
    TextList List4Tikiyot;   // folders of Command27; no page fills it
    int File1Index = -1;     // chosen entry of File1
};

} // namespace lumora
