#pragma once

#include "assembly/PreparationPage.h"
#include "assembly/edited/EditedPreparation.h"
#include "common/PaperSize.h"
#include "session/Ticker.h"

#include <optional>

namespace lumora {

// The lines of List1 are print code (9), edit record (200) and path.
struct B3Controls : PreparationControls {
    TextList List2{*this, u"List2"};            // file names of the pictures, the one in work current
    Caption Label4Title{*this, u"Label4Title"}; // title of the page
    Caption Label1{*this, u"Label1"};           // the warning not to delete the pictures yet, two lines
    Caption Label2{*this, u"Label2"};
    Caption Command1{*this, u"Command1", Caption::At::Hidden}; // removes a picture from the list; never visible
    Caption Command2{*this, u"Command2"};
    Caption Command5{*this, u"Command5"};
    Caption Command7{*this, u"Command7"};
    Bitmap Picture3; // the print of the picture in work, 300 wide
};

// Preparing an edited order ("B3" in the glossary): the customer waits while each picture is rendered with all that its
// record says and packed into a print file of the order folder; the order sheet is drawn from the rendered prints. The
// page takes the lines of the hand-over when it loads and starts by itself two seconds later.
class B3 : public PreparationPage, private B3Controls {
    Q_OBJECT
public:
    B3(SessionState& state, const Platform& platform, PageChain& chain);
    ~B3() override;

    void load() override;
    void setTexts() override;

    // Events
    void Timer2_Tick() { prepare(); }
    void Command5_Click() { prepare(); }
    void Command2_Click() { stopAndLeave(); }
    void Command7_Click() { stopAndLeave(); }

    // State
    const B3Controls& controls() const override { return *this; }
    bool isPrintShown() const { return !Picture5.visible && !Picture3.isNull(); }

private:
    PreparationControls& shared() override { return *this; }
    void setPreparing(bool on) override;
    void prepare();
    void stopAndLeave();
    void packing(int position) override;
    void drawingSheet(int position) override;
    void printed(const Bitmap& small) override;
    bool sheetDrawn(const Bitmap& sheet) override;

    Ticker Timer2; // 2000 ms: the start by itself
    EditedPreparation m_preparation;
    std::optional<PaperSize> m_paper; // as it was when the page was loaded
};

} // namespace lumora
