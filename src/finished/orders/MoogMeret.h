#pragma once

#include "finished/mail/PackageWalk.h"
#include "finished/orders/FilesToSend.h"
#include "imaging/Bitmap.h"
#include "order/WaitingOrders.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"
#include "session/Ticker.h"

namespace lumora {

class OrderFolder;
class PageChain;
struct OrderDetails;
struct Platform;

struct MoogMeretControls : Controls {
    Caption Title{*this, u"Title"};

    // Panels that only group controls and have no name.
    Caption hintPanel; // what to do while no order is picked
    Caption walkPanel; // the packages that are sent by mail
    Caption waysPanel; // the preview and the ways to send, or the result of the walk
    Caption endPanel;  // the result

    Caption Picture3{*this, u"Picture3", Caption::At::Hidden}; // step one: the orders
    Caption Label4Shalav1{*this, u"Label4Shalav1"};
    TextList Dir1{*this, u"Dir1"}; // folders below Dir1Path
    DrivePath Dir1Path;
    TextList List2{*this, u"List2"};                             // full paths of the order folders
    TextList List3{*this, u"List3"};                             // their leaf names
    Caption Label4Rek{*this, u"Label4Rek", Caption::At::Hidden}; // shown when there is no order
    Caption Label4Bhar{*this, u"Label4Bhar"};                    // shown when no order is picked
    Caption Command5{*this, u"Command5"};                        // refresh
    Caption Command4Pieces{*this, u"Command4Pieces", Caption::At::Hidden};

    Caption Picture2{*this, u"Picture2", Caption::At::Hidden}; // step two: the files of the picked order
    Caption Label4Shalav2{*this, u"Label4Shalav2"};
    TextList File1{*this, u"File1"};            // leaf names; the current one was touched last
    Caption Label1{*this, u"Label1"};           // files in the order
    Caption Label5{*this, u"Label5"};           // pictures of the marked files, copies counted
    Caption Label4Files{*this, u"Label4Files"}; // the units of Label1 and Label5
    Caption Label4Prints{*this, u"Label4Prints"};
    Caption Label4Pieces{*this, u"Label4Pieces", Caption::At::Hidden}; // "only pieces are marked"
    Caption Label4Reka{*this, u"Label4Reka", Caption::At::Hidden};     // shown when the order has no file to send
    Caption Command1{*this, u"Command1"};                              // all files
    Caption Command21{*this, u"Command21"};                            // mark none
    Caption Label23{*this, u"Label23"};                                // the customer's name, at four places
    Caption Label20{*this, u"Label20"};
    Caption Label10{*this, u"Label10"};
    Caption Label7{*this, u"Label7"};
    Caption Label4Lakoach{*this, u"Label4Lakoach"}; // the customer named in the order's log

    Caption waitingPanel; // orders that are not sent yet, beside the hint
    Caption Label4Mamtinot{*this, u"Label4Mamtinot"};
    TextList List4Mamtinot{*this, u"List4Mamtinot"}; // oldest first
    Caption Command4Nase{*this, u"Command4Nase"};    // sends the chosen one now
    Caption Command4Vater{*this, u"Command4Vater"};  // gives it up

    Caption Label4Shalav3{*this, u"Label4Shalav3", Caption::At::Hidden}; // step three
    // The preview of the order's first file: a window of this size on Picture1, which moves scrollStep pixels up and
    // left for each step of the scroll bars.
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
    Caption Label4Tmuna{*this, u"Label4Tmuna"};                          // spoken description of the preview
    Caption Command4{*this, u"Command4"};                                // send again
    Caption Command2{*this, u"Command2"};                                // send by mail
    Caption Label4EinDoar{*this, u"Label4EinDoar", Caption::At::Hidden}; // why it can't be
    Caption Command6{*this, u"Command6"};                                // leave the program
    Caption Command28{*this, u"Command28"};                              // new order
    Caption Command4Orders{*this, u"Command4Orders", Caption::At::Hidden};

    TextList List1{*this, u"List1"};            // files to send, full paths; the current one is the present package
    Caption Label9{*this, u"Label9"};           // "the sending was cut into small parts"
    Caption Label2{*this, u"Label2"};           // "the pictures are packed and will go in" and the count
    Caption Label3{*this, u"Label3"};           // "packages"
    Caption Label13{*this, u"Label13"};         // minutes of the present package
    Caption Label4Dakot{*this, u"Label4Dakot"}; // "minutes on this package"
    Caption Label4Shaa{*this, u"Label4Shaa"};   // the time of day
    Caption Label4Mana{*this, u"Label4Mana"};   // "package 2 of 5"
    Caption Label4Shem{*this, u"Label4Shem"};   // name of the present package's file
    Caption Label4Doar{*this, u"Label4Doar"};   // reply of the mail server to the last package
    Caption Label4Sof{*this, u"Label4Sof"};     // result of the packages, and where the files are
    Caption Label24{*this, u"Label24"};         // "the exit button will work after all the packages"
    Caption Command13{*this, u"Command13", Caption::At::Hidden};
    Caption Command18{*this, u"Command18"}; // exit; shown when the walk has ended
    Caption Command19{*this, u"Command19"}; // stop the walk
};

// MoogMeret, "finished" in the glossary: the customer picks an order prepared earlier and its files, and sends them
// again by the order's sender, or by mail in packages, one every few minutes. The order's folder never changes.
class MoogMeret : public Page, private MoogMeretControls {
    Q_OBJECT
public:
    MoogMeret(SessionState& state, const Platform& platform, PageChain& chain);

    void load() override;
    void setTexts() override;

    // --- events ---

    void Command5_Click() { refreshOrders(); }
    void List3_Click(int index) { pickOrder(index); } // a click on the picked order picks it again
    void File1_Click(int index) { turnMark(index); }
    void Command1_Click() { markAll(); }
    void Command21_Click() { markNone(); }
    void HScroll1_Change(int value) { scroll(HScroll1, value); }
    void VScroll1_Change(int value) { scroll(VScroll1, value); }
    void Command4_Click() { sendAgain(); }
    void Command2_Click() { sendByMail(); }
    void Timer3_Tick() { stepWalk(); }
    void Label13_Click() { clearMinutes(); }
    void Command19_Click() { stopWalk(); }
    void List1_Click(int index) { pickPackage(index); }
    void Command4Orders_Click() { refreshOrders(); }
    void Command4Pieces_Click() { showPieces(); }
    void Command28_Click() { beginNewOrder(); }
    void List4Mamtinot_Click(int index) { chooseWaiting(index); }
    void Command4Nase_Click() { tryNow(); }
    void Command4Vater_Click() { giveUp(); }
    void Command18_Click() { leaveAfterWalk(); }
    void Command6_Click() { leaveProgram(); }

    // Events of controls that nobody sees; in MoogMeretUnused.cpp.
    void Command3_Click();
    void Command12_Click();
    void Command13_Click();
    void Command20_Click();
    void Dir1_Change(const DrivePath& folder);

    // --- state ---

    enum class Phase {
        Orders,  // no order is picked
        Picked,  // an order is picked and its files are marked
        Walking, // its files are sent as mail packages
        Walked,  // the walk has ended; a package that was not sent may be picked again
        Leaving, // the customer goes to another page or ends the program
    };
    Phase phase() const { return m_phase; }
    const MoogMeretControls& controls() const override { return *this; }
    const FilesToSend& files() const { return m_files; }
    // An order as the list shows it; hint says that it is in pieces, mark that it was not finished. Otherwise they are
    // empty.
    struct OrderRow {
        QString text;
        QString hint;
        QString mark;
    };
    OrderRow orderRow(const QString& folderName) const;
    const PackageWalk& walk() const { return m_walk; }
    // The state of the mail. Good: the server has taken the present package, after the walk all packages.
    enum class Answer { None, Sending, Good, Bad };
    Answer answer() const;
    int packagesDone() const; // packages sent; without a mail server, packages shown
    bool clockRuns() const { return Timer3.running(); }

    // The signal is Page::changed().

private:
    void enter(Phase phase);
    bool mayAct() const;
    bool sending() const { return m_walk.count(PackageWalk::Fate::Sending) > 0; }

    void refreshOrders();
    void listOrderInHand();
    void openFolder(const DrivePath& folder);
    void listFiles(const DrivePath& folder);
    void pickOrder(int index);

    // MoogMeretUnfinished.cpp
    bool mayBePicked(const OrderFolder& folder);
    void offerToFinish(const OrderFolder& folder);
    void offerToThrowAway(const OrderFolder& folder);
    void finishOrder(const OrderFolder& folder);

    // MoogMeretWaiting.cpp
    void listWaiting();
    void chooseWaiting(int index);
    void tryNow();
    void giveUp();
    const UnfinishedOrder* chosenWaiting() const;
    QString megabytesOf(const OrderFolder& folder) const;

    void showOrder(const DrivePath& folder);
    void showWhatIsMarked();
    void loadPreview();
    void scroll(Scroll& bar, int value);
    void turnMark(int index);
    void markAll();
    void markNone();
    void ShowFamilyCount();
    void sendAgain();
    void tellNothingIsMarked(const QString& words);
    void beginNewOrder();
    void showPieces();
    void leaveAfterWalk();
    void leaveProgram();

    // MoogMeretTexts.cpp
    void tellReplaced(const OrderFolder& again);
    void tellNotFinished();
    void tellGone(const UnfinishedOrder& order);
    bool asksToFinish();
    bool asksToSendWithoutDetails();
    bool asksToGoOnWithoutGone(const UnfinishedOrder& order);
    bool asksToThrowAway(const QString& number);
    bool asksToGiveUp(const QString& number);
    void tellNotGivenUp(const Failure& failure);
    QString waitingRow(const CountedOrder& waiting) const;
    bool asks(const char16_t* hebrew, const char16_t* english, const QStringList& numbers = {});

    void sendByMail();
    bool mayBeMailed();
    bool asksToGoOn();
    void walkFrom(int first);
    void listPackages();
    void beginWalk();
    void stepWalk();
    void stopWalk();
    void endWalk();
    void clearMinutes();
    void pickPackage(int index);
    void selectPackage(int index);
    void sendPackage(int index);
    QString packageText() const;
    void showWalk();
    void showOutcome();
    bool mailSetUp() const { return m_state.profile.mail.setUp(); }
    bool mailIsOffered() const { return mailSetUp() || !m_state.Careful; }
    OrderDetails detailsOf(const DrivePath& folder) const;

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    FilesToSend m_files;
    QStringList m_notFinished; // names of the listed orders whose preparation did not come to its end
    QStringList m_givenUp;     // and of those that the staff has given up
    QList<CountedOrder> m_waiting;
    PackageWalk m_walk;
    bool m_walksWholeOrder = false; // all prints of the order are among the packages
    Ticker Timer3;
    Phase m_phase = Phase::Orders;
};

} // namespace lumora
