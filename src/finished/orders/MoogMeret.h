#pragma once

#include "finished/mail/PackageWalk.h"
#include "finished/orders/FilesToSend.h"
#include "imaging/Bitmap.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"
#include "session/Ticker.h"

#include <vector>

namespace lumora {

class PageChain;
struct OrderDetails;
struct Platform;
struct SessionState;

// The page of orders that are already prepared. The customer picks one order folder and its files, and has them sent
// again by the order senders, or walked out as mail packages, one every few minutes. Nothing of an order is changed
// here, whatever becomes of the sending.
class MoogMeret : public Page {
    Q_OBJECT
public:
    MoogMeret(SessionState& state, const Platform& platform, PageChain& chain);

    void load() override;
    void setTexts() override;

    // --- events ---

    void List3_Click(int index);             // an order; also when it is chosen already
    void Dir1_Change(const QString& folder); // drive path
    void File1_Click(int index);             // marks a file, or takes its mark away
    void HScroll1_Change(int value);
    void VScroll1_Change(int value);
    void Command1_Click();       // choose all the files
    void Command21_Click();      // cancel the whole choice
    void Command4_Click();       // send again
    void Command2_Click();       // send by e-mail
    void Command5_Click();       // refresh the order list
    void Command19_Click();      // stop the walk
    void Command18_Click();      // exit, once the walk is over
    void Command6_Click();       // cancel all and leave the program
    void Command28_Click();      // back to the start page
    void Command4Orders_Click(); // from the walk that has ended back to the orders
    void Command4Pieces_Click(); // to the operator's page of pieces
    void List1_Click(int index); // a package, once the walk is over or stopped
    void Label13_Click();        // starts the package's minutes anew
    void Timer3_Tick();

    // Pressed by the page itself.
    void Command3_Click();  // lists the order that the session is at
    void Command20_Click(); // lists the packages
    void Command13_Click(); // begins the walk
    void Command12_Click(); // one step of the walk

    // --- state ---

    Caption Title;
    Caption Picture3; // step one: the orders
    Caption Label4Shalav1;
    TextList Dir1; // folders below the folder that Dir1 is at
    QString Dir1Path;
    TextList List2;     // full paths of the order folders
    TextList List3;     // their leaf names
    Caption Label4Rek;  // shown when there is no order at all
    Caption Label4Bhar; // shown while none is picked
    Caption Command5;

    Caption Picture2; // step two: the files of the chosen order, the yellow window
    Caption Label4Shalav2;
    FilesToSend File1;
    Caption Label1;      // files in the chosen order
    Caption Label5;      // pictures in the marked files
    Caption Label4Files; // what the two numbers count
    Caption Label4Prints;
    Caption Label4Pieces; // shown when only pieces are marked by themselves
    Caption Label4Reka;   // shown when the order has no file to send
    Caption Command1;
    Caption Command21;
    Caption Label23; // the customer's name, at four places
    Caption Label20;
    Caption Label10;
    Caption Label7;
    Caption Label4Lakoach; // whose order it is that was picked, as its text tells

    // The preview of the order's first file: a window of this size on Picture1, which lies 4 pixels further up and left
    // for each step of the scroll bars.
    static constexpr int previewWidth = 280;
    static constexpr int previewHeight = 210;
    static constexpr int scrollStep = 4;
    struct Scroll {
        int value = 0;
        int max = 0;
    };
    Bitmap Picture1; // null when the file is no picture
    Scroll HScroll1;
    Scroll VScroll1;

    Caption Label4Shalav3; // step three
    Caption Command4;
    Caption Command2;
    Caption Command6;
    Caption Command28;
    Caption Command4Orders;
    Caption Command4Pieces; // shown where the lab's file says so

    // The walk.
    TextList List1;      // the files to go, full paths; in the walk the current one is the package in hand
    Caption List1Shown;  // whether the customer sees it and may pick from it
    Caption Label9;      // "the sending was cut into small parts"
    Caption Label2;      // "the pictures are packed and will go in", and how many
    Caption Label3;      // "packages"
    Caption Label13;     // minutes on the present package
    Caption Label4Dakot; // "minutes on this package"
    Caption Label4Shaa;  // the time of day
    Caption Label4Mana;  // "package 2 of 5"
    Caption Label4Shem;  // name of the file in hand
    Caption Label4Doar;  // what the mail server said of the latest package
    Caption Label4Sof;   // what has come of the packages, and where the files are
    Caption Label24;     // "the exit button will work after all the packages"
    Caption Command13;
    Caption Command18;
    Caption Command19;
    Ticker Timer3; // 30 ms

    enum class Package { Waiting, Sending, Sent, Failed };
    Package package(int index) const;
    bool walking() const { return m_walking; }               // packages are on their way
    bool walkShown() const { return m_walking || m_walked; } // or were, and what came of it is looked at
    bool sending() const { return m_sending; }               // a message is: the mail server is being talked to

    // The signal is Page::changed().

private:
    void ShowFamilyCount();
    void loadPreview();
    void showOrder(const QString& folder);
    void showWhatIsMarked();
    void showSendButtons(bool shown);
    void selectPackage(int index);
    void sendPackage(int index);
    void endWalk();
    void leaveWalk();
    void showWalk();
    void showOutcome();
    bool mailSetUp() const;
    OrderDetails detailsOf(const QString& folder) const;
    void leaveProgram();

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    PackageWalk m_walk;
    std::vector<Package> m_packages; // of List1
    bool m_walking = false;
    bool m_walked = false;
    bool m_sending = false;
    bool m_leaving = false;
};

} // namespace lumora
