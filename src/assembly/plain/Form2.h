#pragma once

#include "assembly/OrderSheet.h"
#include "assembly/PreparationPage.h"

#include <QPoint>

#include <optional>

namespace lumora {

// The preparation of a plain order: each picture is scaled to the paper, or copied as it is, and packed into a print
// file of the order folder, with the order sheet and the order log beside them. It takes the lines of the hand-over
// when it loads and, when the hand-over asks for it, presses its own start once it is painted.
class Form2 : public PreparationPage {
    Q_OBJECT
public:
    Form2(SessionState& state, const Platform& platform, PageChain& chain);
    ~Form2() override;

    void load() override;
    void setTexts() override;

    // Events
    void Command3_Click(); // start: drops what is no JPEG, lets the page paint, goes on with Command6
    void Command6_Click(); // the whole preparation, and the hand-over to the sender
    void Command1_Click(); // removes the chosen picture from the list
    void Command7_Click(); // leaves the program
    void Command4_Click(); // draws the sheet of an album order, to look at
    void Command5_Click(); // draws the pictures of the sheet again, to look at
    void Command8_Click(); // puts the sheet back to its corner
    void List1_Click(int index);
    void Picture5_MouseDown(QPoint at); // the sheet can be dragged; positions are those of the page
    void Picture5_MouseMove(QPoint at);
    void Picture5_MouseUp();

    // State, beside what both preparation pages have; the lines of List1 are print code (9 characters) and path
    TextList List4removed; // paths that were dropped because they are no JPEG files
    Caption Label4removed; // a sentence above List4removed; hidden when nothing was dropped
    Caption Label6;        // the warning not to delete the pictures yet, two lines
    Caption Label10;
    Caption Label1; // title of the page
    Caption Command1, Command3, Command4, Command5, Command6, Command7, Command8;
    QPoint Picture5Position{5, 5};

private:
    class Prints;

    void KeepOnlyJpeg();
    void setPreparing(bool on) override;
    void showProgress() override;
    SheetKind sheetKind() const; // of the order, album or prints
    bool drawSheet(SheetKind kind);
    bool prepareOrder();
    void PackOnePicture(int index, PrintPacker& packer, Prints& prints);

    std::optional<QPoint> m_dragFrom;
};

} // namespace lumora
