#pragma once

#include "order/MailAddressGuard.h"
#include "platform/files/Files.h"
#include "platform/media/Cards.h"
#include "selection/CardCopies.h"
#include "selection/ChangedPaper.h"
#include "selection/CopiesEntry.h"
#include "selection/FinishRule.h"
#include "selection/OrderResolution.h"
#include "selection/PictureChoice.h"
#include "selection/PrintQuality.h"
#include "selection/SmallPictures.h"
#include "selection/door/DoorWait.h"
#include "selection/pictures/kyoskNewControls.h"
#include "session/Page.h"
#include "session/PageFlow.h"
#include "session/Ticker.h"

#include <chrono>
#include <functional>
#include <initializer_list>
#include <memory>
#include <optional>

namespace lumora {

class PageChain;
class PictureDoor;
struct Platform;
struct HandOver;
struct OrderDetails;
struct SessionState;
class tFrmNew;

// kyoskNew, "choosing the pictures" in the glossary: the customer finds the pictures of an order, chooses and counts
// them, and sends them on. Clicks may arrive while the small pictures are drawn, so a redraw stops when a later one has
// begun.
class kyoskNew : public Page, private kyoskNewControls {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::kyoskNew;

    kyoskNew(SessionState& state, const Platform& platform, PageChain& chain);
    ~kyoskNew() override;

    void load() override;
    void setTexts() override;

    // --- events ---

    // How many real pixels the longer side of a small and of the large picture has on this screen. Draws the page again
    // only if the first changed.
    void setCellPixels(int pixels, int large);

    // The cells, 0 to 11. An empty one does nothing.
    void Picture1_Click(int cell) { choosePicture(cell); }
    void Command12_Click(int cell) { addCopies(cell, 1); }
    void Command13_Click(int cell) { addCopies(cell, -1); }

    // The number of copies of a chosen picture opens digits, where the lab has keys on the screen.
    void Label4_Click(int cell) { askCopies(cell); }
    void copiesDigit_Click(int digit) { typeCopies(digit); }
    void copiesBack_Click() { takeBackDigit(); }
    void copiesCancel_Click() { closeEntry(); }
    void copiesDone_Click() { takeEntry(); }

    // Finding pictures.
    void Image5_Click() { addFolder(); }
    void cardOffer_Click() { openCard(); }
    void Image16_Click() { turnTo(&PictureChoice::nextPage); }
    void Image15_Click() { turnTo(&PictureChoice::previousPage); }
    void Command14_Click() { turnTo(&PictureChoice::chosenPage); }
    void Image8_Click() { cancelPage(); }
    void Image4_Click() { turnLargeView(); }
    void Picture2_Click() { lookInLarge(); }
    void Image6_Click() { turnHelp(); }
    void Command4Safa_Click() { turnLanguage(); }
    void Image11_Click() { openPriceList(); }
    void Image17_Click() { openPriceList(); }

    // The offer of the whole folder.
    void Command24_Click() { chooseWholeFolder(); }
    void Command25_Click() { chooseByHand(); }
    void Command23_Click() { beginAgain(); }

    // The editor.
    void Command5_Click() { storeSmallView(); }
    void ZZvvA_Click() { storeRecord(); }

    // Size, paper and details.
    void changeDetails_Click() { openDetails(); }

    // Leaving.
    void Image10_Click() { askToLeave(); }
    void Command15_Click() { endProgram(); }
    void Command4_Click() { stay(); }

    // Finishing.
    void Image7_Click() { finish(); }
    void Image13_Click() { finishAlbum(); }
    void Command3_Click() { onceMade(&kyoskNew::checkAndClose); }
    void Command4Snif_Click(int branch) { chooseBranch(branch); }
    void Command4Snif_MouseMove(int branch) { showBranch(branch); } // also when it takes the focus
    void doorBack_Click() { stopWaiting(); }
    void Image33_Click() { offerBranches(); }
    void Command28_Click() { closeBranches(); }
    void Command20_Click() { setDeepCompression(false); }
    void Command21_Click() { setDeepCompression(true); }
    void Text1_Change(const QString& text) { type(Text1, text); }
    void Text2_Change(const QString& text) { type(Text2, text); }
    void Txt4Ml2_Change(const QString& text) { typeAlbumMail(text); }
    void Combo1_Change(const QString& text) { typeDomain(text); }
    void Combo1_Click(int index) { chooseDomain(index); }
    void Command8_Click() { goOnWithAddress(); }
    void Command7_Click() { goOnWithoutAddress(); }
    void Command10_Click() { closeFinish(); }
    void showCoarse_Click() { showCoarsePictures(); }

    // What no view offers.
    void Image23_Click() { endProgram(); }
    void Command11_Click() { removeDuplicates(); }
    void Command26_Click(int yes) { answerOffer(yes); }
    void Timer1_Tick() { moveLabel35(); }
    void Timer2_Tick() { movePointers(); }

    // --- state ---

    const kyoskNewControls& controls() const override { return *this; }
    bool isWorking() const override; // goes on with the order by itself
    // Pictures are chosen as they are, and not edited.
    bool plain() const;
    // The cell whose picture is open in the editor, or -1.
    int openCell() const { return m_openCell; }
    // A folder was picked or a picture chosen: the cells replace the first step.
    bool showsCells() const { return !List4.isEmpty() || !List1.isEmpty(); }
    bool typesCopies() const;
    // The box of the closing panel that takes the address.
    AddressBox addressBox() const;
    bool addressTyped() const;
    // The box that takes the keyboard next; a view moves the focus when the number has changed.
    const QString& focusBox() const { return m_focusBox; }
    int focusRequest() const { return m_focusRequest; }
    // The folder picked last.
    QString folderName() const;
    // Combo1 shows its prompt, and what is typed takes its place.
    bool promptStands() const { return m_promptStands; }

private:
    enum class Guide { None, PicturesShown, ChooseByHand };

    void say(const char16_t* hebrew, const char16_t* english);
    void takeBack(const HandOver& before);
    void showChoice();
    void showCell(int cell);
    void takeInHand(const QString& path);
    void askToLeave();
    void endProgram();
    void stay();

    void addFolder();
    void pickFolder();
    bool refusesName(const DrivePath& picture);
    void showFolderOf(const DrivePath& picture);
    void takeFolderOf(const DrivePath& picture);
    void showFolderOffer();
    void watchCards();
    void showCards();
    void openCard();
    const PictureSource* onCard(const QString& path) const;
    bool isIn(const PictureSource& picture) const;
    CardCopies::State copyState(const QString& path) const;
    QStringList chosenOnCards(CardCopies::State state) const;
    void copyChosen(bool again);
    void noteCards();
    void cardsChanged();
    void copySettled(const QString& path);
    void tellNotKept(const Failure& why, const DrivePath& picture);
    void tellMissing();
    void askForMissing();
    bool isCopied(const QString& path) const;
    void showCopies();
    QString namesOf(const QStringList& paths) const;
    void turnPage(const std::function<void()>& step);
    void showPictureCount();
    void turnTo(void (PictureChoice::*page)());
    void drawPage();
    void drawCells();
    void drawDrafts();
    void readAhead();
    void clearCells();
    void repaint(const QString& path);
    HostPath hostOf(const DrivePath& path) const;
    DrivePath pictureToDraw(const QString& path) const;
    void showLarge(const DrivePath& path);
    void showPaper();
    void showGuide(Guide guide);
    void turnLargeView();
    void lookInLarge();
    void turnHelp();
    void openPriceList();
    void turnLanguage();

    void choosePicture(int cell);
    void takeIntoEditor(const QString& path);
    void addCopies(int cell, int more);
    void setCopies(int cell, int copies);
    void askCopies(int cell);
    void typeCopies(int digit);
    void takeBackDigit();
    void showEntry();
    void closeEntry();
    void takeEntry();
    void beginWithoutEdits(const DrivePath& picture);
    void cancelPage();
    void chooseWholeFolder();
    void chooseByHand();
    void beginAgain();
    void removeDuplicates();
    void answerOffer(int yes);
    void moveLabel35();
    void movePointers();

    void openDoor(const HandOver& before);
    QStringList nextPictures() const;
    void orderPictures(const QStringList& next = {});
    void pictureSettled(const QString& path);
    void tellNotMade(const QString& path);
    void showDraft(const QString& path);
    void findUnreadable(const QString& path, const Failure& why);
    void takeOutUnreadable(const QString& path);
    bool tellTakenOut();
    void onceMade(void (kyoskNew::*goOn)());
    void showWaiting();
    void stopWaiting();
    QString unreadableText(const QString& path) const;
    DrivePath shownPath(const QString& path) const;

    void openDetails();
    bool mayChangeDetails() const;
    void takeChanges();
    void beginEditorAnew();
    void makeEditor();
    void unloadEditor();
    void forgetEditing();

    tFrmNew& editor() const;
    void leaveEditor();
    void storeSmallView();
    void storeRecord();
    int putRecord();

    void finish();
    void openFinish();
    void finishAlbum();
    void checkAndClose();
    bool couponRefuses();
    DeepCompression decideCompression();
    void openClosingPanel();
    void countCoarse();
    void showCoarsePictures();
    void closeFinish();
    void openBranches();
    void nameBranches();
    void offerBranches();
    void chooseBranch(int branch);
    void showBranch(int branch);
    void closeBranches();
    bool homeAddressKnown();
    void focusOn(const QString& box);
    void focusOnFirstPicture();
    void setDeepCompression(bool deep);
    void type(Caption& box, const QString& text);
    void showAddressWord();
    void typeAlbumMail(const QString& text);
    void typeDomain(const QString& text);
    void chooseDomain(int index);
    TypedAddress typedAddress() const;
    void goOnWithAddress();
    void goOnWithoutAddress();
    void handOver(const QString& mail);

    void setBrowserTexts();
    void setClosingTexts();
    void setPaperTexts();
    void setCoarseTexts();
    void showRange();

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    std::unique_ptr<PictureDoor> m_door;
    DoorWait m_wait;
    std::chrono::milliseconds m_waitMoved{}; // of the running clock
    void (kyoskNew::*m_onceMade)() = &kyoskNew::openFinish;
    PictureChoice m_choice;
    CopiesEntry m_copiesEntry;
    int m_countedCell = 0; // whose copies are typed
    QString m_countedPath;
    OrderResolution m_resolution;
    SmallPictures m_small;
    FileList File1;
    std::optional<Cards::Watch> m_watch;
    std::unique_ptr<CardCopies> m_copies; // none where the lab shows no cards
    std::vector<HostPath> m_cardFolders;  // of all cards that were in
    std::vector<HostPath> m_cardsIn;
    QStringList m_missingTold; // chosen pictures that a card was pulled with
    bool m_notKeptTold = false;
    DrivePath m_cardPicture; // the newest of the card that is offered; empty when none can be opened
    Ticker Timer1;
    Ticker Timer2;
    int m_cellPixels = 115;
    double m_largeScale = 1;
    int m_openCell = -1;
    int m_rotation = 0;                     // of the large view: 0, 90, 180, 270
    unsigned m_drawing = 0;                 // the number of the latest redraw
    DrivePath m_largePath;                  // the picture of the large view, which Image4 turns
    bool m_countShown = false;              // a folder was picked, and its pictures were counted
    bool m_picking = false;                 // the file dialog is open
    bool m_promptStands = true;             // Combo1 shows its prompt
    std::unique_ptr<OrderDetails> m_before; // while the page of details changes them
    bool m_tookBack = false;                // the order was prepared before, and came back
    bool m_handedOver = false;
    bool m_handOverFailed = false; // told once, and not at each touch
    Guide m_guide = Guide::None;
    PrintGrade m_grade = PrintGrade::Unmarked; // what Label6 tells, and of which size
    PictureSize m_gradedSize;
    PictureSize m_largeSize; // of the picture in the large view
    QString m_openWhenMade;  // the picture that goes into the editor once it is made
    QStringList m_coarse;    // the paths that the closing panel tells of
    QString m_focusBox;
    int m_focusRequest = 0;
};

} // namespace lumora
