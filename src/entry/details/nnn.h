#pragma once

#include "common/Result.h"
#include "entry/album/AlbumPanels.h"
#include "entry/details/DetailsCheck.h"
#include "entry/details/nnnControls.h"
#include "platform/Platform.h"
#include "session/Page.h"
#include "session/SessionState.h"

#include <optional>

namespace lumora {

class PageChain;
struct HistoryState;

// nnn, "details of the order" in the glossary: the customer takes the kind of order from a menu and then, step by step,
// gives name, paper, border and fit and agrees to the terms, up to the choice of pictures.
class nnn : public Page, private nnnControls {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::nnn;

    nnn(SessionState& state, const Platform& platform, PageChain& chain);

    void load() override;
    void setTexts() override;

    // Exactly one is open. The steps of an order of prints stand in their order.
    enum class Step { Menu, Details, Options, Border, Fit, Terms, Album };

    // --- events ---

    void Image1_Click(int tile) { takeTile(tile); }
    void Text2_Change(const QString& text) { type(Text2, text); }
    void Text3_Change(const QString& text) { type(Text3, text); }
    void Text4_Change(const QString& text) { typeAddress(text); }
    void Check2_Click(bool checked) { tick(Check2, checked); } // remember the details
    void Command10_Click() { recallDetails(); }
    void Command12_Click() { leaveDetails(); }
    void Option1_Click(int index) { takeQuickSize(index); } // also when it is chosen already
    void Combo1_Click(int row) { takeListedSize(row); }
    void Option3_Click(int index) { takePaperKind(index); } // also when it is chosen already
    void Command8_Click() { keepPaperKind(); }
    void Image13_MouseDown(int index) { takeBorder(index); }
    void Command6_Click() { goOnFrom(Step::Border); }
    void Option4_Click() { takeFit(Option4); }
    void Option5_Click() { takeFit(Option5); }
    void Check1_Click(bool checked) { tick(Check1, checked); } // agrees to the terms
    void Command29_Click() { readTerms(); }
    void Command30_Click() { closeTermsHint(); }
    void Command3_Click() { finishPrints(); }
    void Command24_Click() { finishAlbum(); }
    void Command4_Click() { goBack(); }
    void Command2_Click() { cancel(); }
    void Command5_Click() { setTexts(); }
    void Command14_Click() { askToClean(true); }
    void Command7_Click() { cleanHistory(); }
    void Command9_Click() { askToClean(false); }
    void Command15_Click() { showNotice(); }
    void Command4Anglit_Click() { turnTo(Language::English); }
    void Command4Ivrit_Click() { turnTo(Language::Hebrew); }

    // Called by nothing: nnnUnused.cpp.
    void QuickCheck();
    enum class Coupon { Small, Large }; // for 220 and 3, or 350 and 5 pictures
    void CouponOrder(Coupon coupon);

    // --- state ---

    const nnnControls& controls() const override { return *this; }
    Step step() const { return m_step; }
    const AlbumPanels& album() const { return m_album; }
    AlbumPanels& album() { return m_album; } // for its events

    // The control that takes the keyboard next; a view moves the focus when the number has changed.
    struct Focus {
        QString control;
        int request = 0;
    };
    const Focus& focus() const { return m_focus; }

private:
    // The page was opened by the page of pictures.
    bool isChanging() const { return m_before.has_value(); }
    void beginChange();
    void showChange();
    void leaveChange();
    void cancelChange();
    bool asksToCancelAlbum();

    struct StepRow;
    std::vector<StepRow> stepTable();

    void open(Step next);
    void goOnFrom(Step from);
    void showStep();
    void showProgress(const std::vector<StepRow>& table);
    QString chosenBorder() const;
    QString choiceSoFar() const;

    void takeTile(int tile);
    enum class Language { Hebrew, English };
    void turnTo(Language language);
    bool beginOrder();
    void beginPrints(int tile);
    void beginAlbum();
    void goToFinishedOrders();
    void startAgain();
    void showOtherPage();
    void clearChoices();

    void type(Caption& box, const QString& text);
    void typeAddress(const QString& text);
    void tick(CheckCaption& box, bool checked);
    void recallDetails();
    void leaveDetails();
    bool telephoneMayBe();
    void rememberOrForget();
    void fillSizes();
    QString sizesPrompt() const;
    QString paperKind(int index) const; // of Option3
    void takeQuickSize(int index);
    void takeListedSize(int row);
    void showCoupon(std::optional<int> limit);
    void takePaperKind(int index);
    void keepPaperKind();
    void takeBorder(int index);
    void takeFit(const CheckCaption& taken);
    void readTerms();
    void closeTermsHint();
    bool termsAgreed(const CheckCaption& box);
    bool nameGiven();
    void finishPrints();
    void takeAlbum();
    void finishAlbum();
    void refuse(const DetailsProblem& problem);
    bool prepareOrder();
    void GoToSelection();
    void goBack();
    void cancel();
    void askToClean(bool asked);
    void cleanHistory();
    void showHistory(const HistoryState& history);
    bool asksToMarkLegacy(const HistoryState& history);
    bool asksToCleanNotProven(const HistoryState& history);
    void showNotice();

    void focusOn(const QString& control);
    void tell(const char16_t* hebrew, const char16_t* english);
    // Tells the customer of a failure; true without one.
    bool succeeded(const Result<void>& done);

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    AlbumPanels m_album;
    Step m_step = Step::Menu;
    // What the order had when the page was opened by the page of pictures.
    struct Before {
        OrderDetails details;
        CouponState coupon;
        AlbumDetails album;
    };
    std::optional<Before> m_before;
    Focus m_focus;
    std::array<QString, 3> m_quickSizes; // of Option1; an empty one is not on offer
    QString VolumeSerial;
    bool m_termsHint = true; // not closed by the customer yet
    bool m_leaving = false;
};

} // namespace lumora
