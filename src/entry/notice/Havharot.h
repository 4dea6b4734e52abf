#pragma once

#include "platform/Platform.h"
#include "session/Caption.h"
#include "session/Page.h"

namespace lumora {

class PageChain;
struct SessionState;

// Clarifications and warnings: a notice that the details page shows by a button of its own, and that gives way to it
// again.
class Havharot : public Page {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::Havharot;

    Havharot(SessionState& state, const Platform& platform, PageChain& chain);

    void setTexts() override;
    // A plain page with just a way back, for a tile behind which this lab has put nothing. With the details page gone
    // the way back leads to the start page.
    void showPlain();

    // --- events ---

    void Command1_Click(); // go on
    void Command2_Click(); // leave the program
    void Command3_Click(); // opens the mail program, so that the customer sees whether it is set up
    void Command4_Click(); // how to set it up

    // --- state ---

    Caption Title;
    Caption Label1; // the notice
    Caption Command1;
    Caption Command2;
    Caption Command3;
    Caption Command4;

private:
    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    bool m_plain = false;
};

} // namespace lumora
