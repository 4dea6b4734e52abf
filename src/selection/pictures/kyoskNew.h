#pragma once

#include "imaging/Bitmap.h"
#include "platform/files/Files.h"
#include "selection/Basket.h"
#include "selection/FolderPager.h"
#include "selection/PrintQuality.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"
#include "session/Ticker.h"

#include <array>
#include <functional>

namespace lumora {

class PageChain;
enum class Outcome;
struct Platform;
struct SessionState;
class tFrmNew;

// The page on which pictures are found, graded, counted and handed on. Twelve cells show a page of small pictures; a
// click chooses one, plus and minus count its copies. Clicks may arrive while the small pictures are drawn: a redraw
// that a later one overtook stops at once.
class kyoskNew : public Page {
    Q_OBJECT
public:
    kyoskNew(SessionState& state, const Platform& platform, PageChain& chain);
    ~kyoskNew() override;

    void load() override;
    void setTexts() override;

    // --- events ---

    // The height of the screen in logical pixels: below 700 a cell has 90, otherwise 115. Draws the page again only if
    // it changed.
    void setScreenHeight(int pixels);
    // How many real pixels a cell has on this screen; the large view follows in proportion. Draws the page again only
    // if it changed.
    void setCellPixels(int pixels);

    // The cells. An empty one does nothing.
    void Picture1_Click(int cell);  // chooses the picture
    void Command12_Click(int cell); // plus
    void Command13_Click(int cell); // minus

    // Finding pictures.
    void Image5_Click();    // adds the pictures of a further folder
    void Image16_Click();   // next page
    void Image15_Click();   // previous page
    void Command14_Click(); // only what was chosen
    void Image4_Click();    // turns the large view by 90 degrees
    void Picture2_Click();  // opens the picture of the large view on a page of its own
    void Image6_Click();    // opens and closes the help panel Frame2
    void Image11_Click();   // price list
    void Image17_Click();   // price list, on the closing panel

    // The offer of the whole folder.
    void Command24_Click();        // send all of it
    void Command25_Click();        // choose by hand
    void Command26_Click(int yes); // 0: send all of it, 1: choose by hand
    void Command23_Click();        // another folder: empties all
    void Timer1_Tick();
    void Timer2_Tick();

    // The basket.
    void Image8_Click();    // cancels all pictures of the page
    void Command11_Click(); // drops duplicate lines

    // Called by the editor.
    void Command5_Click(); // stores the small view of the picture in the editor
    void ZZvvA_Click();    // stores the edit record into the basket

    // Leaving.
    void Image10_Click();   // ends the program; asks first when pictures were chosen
    void Image23_Click();   // ends the program at once
    void Command15_Click(); // Frame3: yes, end
    void Command4_Click();  // Frame3: close the panel

    // Finishing.
    void Image7_Click();   // finish and send
    void Image13_Click();  // the same in an album order
    void Command3_Click(); // the step behind both
    void Command4Snif_Click(int branch);
    void Command4Snif_MouseMove(int branch); // also when it takes the focus
    void Image33_Click();                    // opens the collection panel
    void Command28_Click();                  // closes it without a choice
    void Command20_Click();                  // Picture7: not deeper
    void Command21_Click();                  // Picture7: deeper
    void Text1_Change(const QString& text);
    void Text2_Change(const QString& text);
    void Txt4Ml2_Change(const QString& text);
    void Combo1_Change(const QString& text); // typed
    void Combo1_Click(int index);            // chosen
    void Command8_Click();                   // on, with the address
    void Command7_Click();                   // on, without it
    void Command10_Click();                  // back to the pictures

    // --- state ---

    // Pictures are chosen as they are, and not edited.
    bool plain() const;

    // Plain, or open in the editor (orange, 33023).
    enum class KeyColour { System, Orange };
    struct KeyCaption : Caption {
        KeyColour colour = KeyColour::System;
    };
    // A small picture, already of its drawn size, to be centred in the cell; null when there is none.
    struct CellPicture {
        Bitmap bitmap;
        bool visible = true;
    };
    // The large view: either a picture or lines of guidance.
    struct LargeView {
        Bitmap bitmap;
        bool warning = false; // the warning of low quality, at the top left
        QStringList guide;
        bool visible = true;
    };

    int cellSize = 115;     // logical pixels
    int Label4FontSize = 0; // 12 on a small screen, else 0: the theme's own
    std::array<CellPicture, cellsOfPage> Picture1;
    std::array<Caption, cellsOfPage> Picture4; // the chosen mark; plus and minus lie in it
    std::array<Caption, cellsOfPage> Label4;   // copies
    std::array<Caption, cellsOfPage> Label5;   // end of the path, "*" when empty
    std::array<KeyCaption, cellsOfPage> Command12;
    std::array<KeyCaption, cellsOfPage> Command13;

    Basket List1;      // the basket
    TextList List2;    // the paths of the page in view, one a cell
    FolderPager List4; // all paths of the folders picked so far

    Caption Title;  // what to do on this page
    Caption Frame1; // the frame of the cells; text: what to do while there are none
    LargeView Picture2;
    Caption Label1; // the path of the picture in hand, or the number of lines after Command11
    Caption Label2; // the path that Image4 turns
    Caption Label6; // the grade
    Caption Label7; // copies in all
    Caption Label7Prompt;
    Caption Label15; // paper size
    Caption Label18;
    Caption Label24; // the edit record as it is, for the operator
    Caption Label25; // reminder of the folder choice
    Caption Label29; // the folder picked last
    Caption Label34; // how many pictures it and those before have
    Caption Label34Prompt;
    Caption Label9; // help
    Caption Frame2; // its panel
    Caption Image4, Image5, Image6, Image7, Image8, Image10, Image11, Image13, Image15, Image16, Image17, Image19,
        Image20, Image23, Image33;
    Caption Command11, Command14;

    Caption Pic4Brose; // shown while the file dialog is open
    QStringList Pic4BroseLines;

    Caption Picture66; // the offer of the whole folder; stays below the cells, so that it can be taken back
    Caption Command23, Command24, Command25;
    std::array<Caption, 2> Command26;
    Caption Label35;
    int label35Left = 0; // logical pixels; Timer1 moves it
    Caption Label36;
    int pointerStep = 0; // 0 to 3; Timer2 moves the pointers Image19 and Image20 by it

    Caption editorView; // shown while a picture is open in the editor

    Caption Frame3; // leaving with pictures chosen
    Caption Label11;
    Caption Command15, Command4;

    Caption PicB4Sioom;       // covers the page behind the closing panel
    Caption Frame4;           // the closing panel
    Caption Label19, Label20; // paper size, copies
    Caption Label19Prompt, Label20Prompt;
    Caption Label17; // prompt of Text1
    Caption Label33; // the address is required
    Caption Text1, Text2, Txt4Ml2;
    Caption Text2Prompt;
    Caption Combo1; // text: as chosen or typed
    QStringList Combo1Items;
    int Combo1Index = -1;
    Caption LblKoopon;
    Caption Label4kpn3; // the quantity of the coupon
    Caption Label4kpn3Prompt;
    Caption Command7, Command8, Command10;
    // The box that takes the keyboard next; a view moves the focus when the number has changed.
    QString focusBox;
    int focusRequest = 0;

    Caption Pic4snifim; // the collection panel, above the closing panel
    std::array<Caption, 11> Command4Snif;
    Caption Pic4Snif; // the card, beside the button of branchInHand
    Caption Label41;
    int branchInHand = -1;
    Caption Command28;

    Caption Picture7; // the question of deep compression, above the closing panel
    Caption Label37;
    Caption Command20, Command21;

private:
    enum class Guide { None, PicturesShown, ChooseByHand };

    void takeFocus(const QString& box);
    void say(const QString& hebrew, const QString& english);

    void pickFolder();
    void takeFolderOf(const QString& picture);
    void showFolderOffer();

    void turnPage(const std::function<void()>& step);
    void ShowPage();
    void FillChosenPage();
    void drawPage();
    void clearCells();
    void markChosen();
    void drawCells();
    void repaintStored(const QString& path);
    QString pictureToDraw(int cell) const;
    void setKeysPlain();
    void showLarge(const QString& path);
    void showGuide(Guide guide);
    void showGrade();

    PrintCode composeCode(int copies, PaperWords words);
    PrintCode composeCodeOfCell(int cell);
    void AddSimple(int cell);
    void AddForEditor(int cell);
    void AddWholeFolderLine(int index);
    tFrmNew* editor() const;
    void loadEditor();
    void openInEditor(int cell);
    void leaveEditor();
    void showFolderOf(const QString& picture);
    // What plus and minus share: the copies are written to the cell and to the line.
    void setCopies(int cell, int copies);
    int copiesOfCell(int cell) const { return Val16(Label4[static_cast<std::size_t>(cell)].text); }
    void unpackOpen(const QString& record);
    void SumCopies();

    bool couponRefuses();
    void FinishSimple();
    void fillDomains();
    bool openClosingPanel();
    void closeFinish();
    void HandToPreparation();
    void HandToSecondPage();
    void HandToSecondPageNoMail();
    bool handTo(Outcome chosen);
    QString noteOfOrder() const;
    void openBranches();
    void ShowBranchCard();

    void setBrowserTexts();
    void setClosingTexts();

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    FileList File1;
    Ticker Timer1;
    Ticker Timer2;
    int m_cellPixels = 115;
    int m_cell = 0;             // the current cell
    int m_rotation = 0;         // of the large view: 0, 90, 180, 270
    QChar m_paper = u' ';       // the letter of the code before
    unsigned m_drawing = 0;     // the number of the latest redraw
    bool m_picking = false;     // the file dialog is open
    bool m_promptStands = true; // Combo1 shows its prompt
    bool m_handedOver = false;
    Guide m_guide = Guide::None;
    PrintGrade m_grade = PrintGrade::Unmarked; // what Label6 tells, and of which size
    PictureSize m_gradedSize;
    bool m_handOverFailed = false; // told once, and not at each touch
};

} // namespace lumora
