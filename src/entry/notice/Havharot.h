#pragma once

#include "platform/Platform.h"
#include "session/Caption.h"
#include "session/Page.h"

namespace lumora {

class PageChain;
struct SessionState;

struct HavharotControls : Controls {
    Caption Title{*this, u"Title"};
    Caption Label1{*this, u"Label1"}; // the notice
    Caption Command1{*this, u"Command1"};
    Caption Command2{*this, u"Command2"};
    Caption Command3{*this, u"Command3"};
    Caption Command4{*this, u"Command4"};
};

// Havharot, "clarifications and warnings" in the glossary: the customer opens a notice from the menu of the details
// page, reads it, and returns to that page.
class Havharot : public Page, private HavharotControls {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::Havharot;

    Havharot(const SessionState& state, const Platform& platform, PageChain& chain);

    void setTexts() override;
    // A page with a way back only, for a tile that this lab does not use. Without the details page the way back leads
    // to the start page.
    void showPlain();

    // --- events ---

    void Command1_Click() { goOn(); }
    void Command2_Click() { endProgram(); }
    void Command3_Click() { openMailProgram(); } // so that the customer sees whether it is set up
    void Command4_Click() { tellHowToSetUpMail(); }

    // --- state ---

    const HavharotControls& controls() const override { return *this; }

private:
    void goOn();
    void endProgram();
    void openMailProgram();
    void tellHowToSetUpMail();

    const SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    bool m_plain = false;
};

} // namespace lumora
