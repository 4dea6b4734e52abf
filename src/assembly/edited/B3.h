#pragma once

#include "assembly/PreparationPage.h"
#include "assembly/edited/EditedPrints.h"
#include "editing/render/PicturePlacement.h"
#include "session/Ticker.h"

#include <optional>

namespace lumora {

// The preparation of an edited order: each picture is rendered with all that its record says and packed into a print
// file of the order folder; the order sheet is drawn from the rendered prints. It takes the lines of the hand-over when
// it loads and starts by itself once it was seen for two seconds.
class B3 : public PreparationPage {
    Q_OBJECT
public:
    B3(SessionState& state, const Platform& platform, PageChain& chain);
    ~B3() override;

    void load() override;
    void setTexts() override;

    // Events
    void Timer2_Tick();    // once, presses Command5
    void Command5_Click(); // the whole preparation, and the hand-over to the sender
    void Command2_Click(); // both leave the program at once, with the folder as it is
    void Command7_Click();
    void Command1_Click() {} // a button that does nothing; it is not shown

    // State, beside what both preparation pages have; the lines of List1 are print code (9), edit record (200) and path
    TextList List2;      // file names of the pictures, the one in work current
    Bitmap Picture3;     // the print of the picture in work, 300 wide
    Caption Label4Title; // title of the page
    Caption Label1;      // the warning not to delete the pictures yet, two lines
    Caption Label2;
    Caption Command1, Command2, Command5, Command7;
    Ticker Timer2;

private:
    void setPreparing(bool on) override;
    void fillList2();
    bool prepareOrder();
    void PrepareOnePicture(int index, PrintPacker& packer, EditedPrints& prints);
    Result<QByteArray> RenderEditedPicture(const BasketLine& item, EditedPrints& prints);
    Result<void> keepToneCopy(const BasketLine& item, NewContent& copy);
    void saveThumbnail(const BasketLine& item, const QString& scratch);
    bool BuildOrderSheet();

    std::optional<PaperSize> m_paper; // as it was when the page was loaded
    QString m_jobFolder;
};

} // namespace lumora
