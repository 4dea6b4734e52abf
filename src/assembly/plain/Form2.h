#pragma once

#include "assembly/PreparationPage.h"
#include "assembly/plain/PlainPreparation.h"

#include <QPoint>

#include <optional>

namespace lumora {

// The lines of List1 are print code (9) and path.
struct Form2Controls : PreparationControls {
    TextList List4removed{*this, u"List4removed"};  // paths that were dropped because they are no JPEG files
    Caption Label4removed{*this, u"Label4removed"}; // how many were dropped; hidden when nothing was
    Caption Label1{*this, u"Label1"};               // title of the page
    Caption Label6{*this, u"Label6"};               // the warning not to delete the pictures yet, two lines
    Caption Label10{*this, u"Label10"};
    Caption Command1{*this, u"Command1"};
    Caption Command3{*this, u"Command3"};
    Caption Command4{*this, u"Command4"};
    Caption Command5{*this, u"Command5", Caption::At::Hidden};
    Caption Command6{*this, u"Command6", Caption::At::Hidden};
    Caption Command7{*this, u"Command7"};
    Caption Command8{*this, u"Command8", Caption::At::Hidden};
    QPoint Picture5Position{5, 5}; // on the page
};

// Preparing a plain order ("Form2" in the glossary): the customer waits while each picture is scaled to the paper, or
// copied as it is, and packed into a print file of the order folder, with the order sheet and the order log beside
// them. The page takes the lines of the hand-over when it loads and, when the hand-over asks for it, starts by itself
// once it is painted.
class Form2 : public PreparationPage, private Form2Controls {
    Q_OBJECT
public:
    Form2(SessionState& state, const Platform& platform, PageChain& chain);
    ~Form2() override;

    void load() override;
    void setTexts() override;

    // Events
    void Command3_Click() { start(); }
    void Command1_Click() { removeChosen(); }
    void Command7_Click() { leaveProgram(); }
    void List1_Click(int index) { choose(index); }

    // Events of controls that no view shows
    void Command6_Click() { prepare(); }
    void Command4_Click() { drawAlbumSheet(); }
    void Command5_Click() { redrawSheet(); }
    void Command8_Click() { putSheetBack(); }
    void Picture5_MouseDown(QPoint at) { takeSheet(at); }
    void Picture5_MouseMove(QPoint at) { dragSheet(at); }
    void Picture5_MouseUp() { dropSheet(); }

    // State
    const Form2Controls& controls() const override { return *this; }
    bool isListShown() const { return !isPreparing() && !List1.isEmpty(); }
    bool isTroubleShown() const { return Label4fail.visible || Label4removed.visible; }

private:
    PreparationControls& shared() override { return *this; }
    void start(); // drops what is no JPEG, lets the page paint, then prepares
    void prepare();
    void removeChosen();
    void choose(int index);

    void keepOnlyJpeg();
    void setPreparing(bool on) override;
    void showProgress() override;
    bool sheetDrawn(const Bitmap& sheet) override;

    void drawAlbumSheet(); // to look at
    void redrawSheet();
    void drawToLookAt(SheetKind kind);
    void putSheetBack(); // to its corner
    void takeSheet(QPoint at);
    void dragSheet(QPoint at);
    void dropSheet();

    PlainPreparation m_preparation;
    std::optional<QPoint> m_dragFrom;
};

} // namespace lumora
