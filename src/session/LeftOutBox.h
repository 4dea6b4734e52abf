#pragma once

#include "session/Caption.h"
#include "session/PageFlow.h"
#include "session/TextList.h"

namespace lumora {

class PageChain;
struct SessionState;

// The box that names the chosen pictures that are not in the order, each with the reason, and the card that repeats
// their number.
struct LeftOutControls {
    explicit LeftOutControls(Controls& page);

    Caption Pic4Hasserot;   // the box
    Caption Label4Hasserot; // how many there are
    TextList List4Hasserot; // their file names
    TextList List4Siba;     // the reason of each
    QString noPicture;      // stands for a picture that can't be shown
    Caption Command4Bli;    // goes on without them
    Caption Command4Hazor;  // back to the pictures, or to the start
    Caption Label4Kartis;   // the card
};

// Asks the customer about the chosen pictures that the preparation has left out (leftOut of the session). The box stays
// until it is answered. As built in, the order goes on behind it.
class LeftOutBox {
public:
    LeftOutBox(PageId page, SessionState& state, PageChain& chain, LeftOutControls& shown);

    // Pictures were left out, and the customer has not been asked.
    bool isDue() const;
    // Opens the box. WithoutPrints: nothing is left to go on with.
    enum class Order { HasPrints, WithoutPrints };
    void open(Order order = Order::HasPrints);
    bool isOpen() const { return m_shown.Pic4Hasserot.visible; }
    // The order waits for the answer.
    bool isAwaited() const;
    // The way back is offered until the order's sending has begun.
    void endWayBack();
    // Texts of box and card, in the language of the session.
    void show();

    // The answers close the box.
    void goOnWithout();
    // Gives the basket back to the page of pictures, and number, small views and corrected copies stay. True: that page
    // is shown, and the order's folder is no longer needed. Without a basket, as for an order that was taken up, goes
    // to the start page, and the folder stays.
    bool goBack();

private:
    bool leadsToPictures() const;
    void close();

    const PageId m_page;
    SessionState& m_state;
    PageChain& m_chain;
    LeftOutControls& m_shown;
    Order m_order = Order::HasPrints;
    bool m_wayBack = true;
};

// That so many pictures are not in the order, as a sentence; empty for none.
QString LeftOutText(const SessionState& state, qsizetype count);

} // namespace lumora
