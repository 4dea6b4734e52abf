#pragma once

#include "assembly/Preparation.h"
#include "imaging/Bitmap.h"
#include "session/Caption.h"
#include "session/LeftOutBox.h"
#include "session/Page.h"
#include "session/PageFlow.h"
#include "session/TextList.h"

namespace lumora {

struct Platform;
struct SessionState;
class PageChain;

// The controls that both preparation pages have.
struct PreparationControls : Controls {
    TextList List1{*this, u"List1"};                  // the lines of the basket
    TextList List4fail{*this, u"List4fail"};          // paths that could not be prepared
    Caption Label5{*this, u"Label5"};                 // copies in all
    Caption Label17{*this, u"Label17"};               // position of the picture in work, from 1; empty before the first
    Caption Label16{*this, u"Label16"};               // how many pictures there are
    Caption Label4Progress{*this, u"Label4Progress"}; // what is happening, with position and count
    Caption Label4Picture{*this, u"Label4Picture"};   // file name of the picture in work
    Caption Label4fail{*this, u"Label4fail"};         // how many could not be prepared; hidden when all could
    Caption Picture5{*this, u"Picture5", Caption::At::Hidden}; // the order sheet's box
    Bitmap Picture5Image;
    LeftOutControls leftOut{*this};
};

// What the two pages share that turn a basket into an order folder (Form2, B3): the list with its progress, the words
// for all that can go wrong, and the hand-over to a sender.
class PreparationPage : public Page, protected PreparationEvents {
    Q_OBJECT
public:
    // Events of the box of left out pictures.
    void Command4Bli_Click() { goOnWithout(); }
    void Command4Hazor_Click() { goBack(); }

    // State
    const PreparationControls& controls() const override = 0;
    bool isPreparing() const { return m_preparing; }
    bool isWorking() const override { return m_preparing; }
    // How far the work has come, 0 to 1, and the position and the count in words for a gauge.
    double share() const;
    QString positionText() const { return QString::number(m_position); }
    QString countText() const;
    QString totalText() const;
    // What List1 is called where it is not seen.
    QString listText() const;
    // As SmallLeftOut().
    Bitmap smallLeftOut(int index, int cell) const;
    bool isSheetShown() const { return controls().Picture5.visible && !controls().Picture5Image.isNull(); }

protected:
    // shown: of the page's own controls, which are made later.
    PreparationPage(PageId id, SessionState& state, const Platform& platform, PageChain& chain, LeftOutControls& shown);

    virtual PreparationControls& shared() = 0;

    enum class Stage { Waiting, Checking, Sheet, Pictures, Closing, Done };

    // Takes the lines of the hand-over. True when the page before asks for the start.
    bool takeLines();
    // False, and told, when there is nothing to prepare.
    bool somethingChosen();
    // The two lines of the warning not to delete the pictures yet.
    QString doNotDelete() const;
    QString untilPrinted() const;

    // No button starts anything while it is on.
    virtual void setPreparing(bool on);
    void setStage(Stage stage, int position = 0);
    // All sentences about progress, in the language of the session.
    virtual void showProgress();

    // What the preparation tells.
    void packing(int position) override;
    void drawingSheet(int position) override { setStage(Stage::Sheet, position); }
    void closing() override { setStage(Stage::Closing); }
    void counted() override;
    void inWork(const DrivePath& picture) override;
    void notPrepared(const DrivePath& picture) override;
    void notWritten(NotWritten what, const Failure& failure) override;
    void filesNotWritten(int count) override;
    bool sheetDrawn(const Bitmap& sheet) override;
    bool yield() override;

    // The order is complete: follows the page flow to the sender, which asks about pictures that were left out. A local
    // station keeps its orders; there and on the way to the finished orders the question is asked here.
    void handOver(Outcome toSender);
    // True once the page has done its work, or waits for the answer.
    bool handedOver() const { return m_handedOver || m_leftOut.isOpen(); }
    // Asks what to do without any print.
    void askWithoutPrints();
    void leaveProgram();

    void tell(const QString& hebrew, const QString& english, const QString& reason = {});

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;

private:
    void goOnWithout();
    void goBack();

    LeftOutBox m_leftOut;
    Outcome m_toSender = Outcome::PreparedForFtp;
    Stage m_stage = Stage::Waiting;
    int m_position = 0;
    int m_count = 0;
    bool m_preparing = false;
    bool m_handedOver = false;
};

} // namespace lumora
