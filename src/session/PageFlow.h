#pragma once

#include "session/Page.h"

#include <optional>
#include <vector>

namespace lumora {

// What happened on a page, of all that leads to another one.
enum class Outcome {
    OrderBegun,     // the customer begins an order
    SendingWanted,  // the sending page is asked for, with no order
    PicturesWanted, // kind and details are known, or a prepared order goes back to its pictures
    FinishedWanted, // an earlier order is wanted
    NoticeWanted,   // the notice is read, and the customer comes back
    NoticeAlone,    // the notice is all that the tile has
    EditorWanted,   // a picture is edited
    CaptionWanted,  // a picture gets a caption
    RedEyesWanted,  // red eyes are corrected
    TurnedWanted,   // a picture is looked at, turned
    EditingDone,    // back to the page before the editor or its keyboard
    PlainChosen,    // the pictures go to print as they are
    EditedChosen,   // the pictures go to print as they were edited
    PreparedForFtp, // the order folder is whole; its sender
    PreparedForHttp,
    PreparedForLater, // the order is found among the finished ones
    KeptAtStation,    // the order stays on this computer
    ResentByFtp,      // a finished order goes once more
    ResentByHttp,
    PiecesWanted, // a finished order is cut or joined
    PiecesDone,
    NewOrderWanted, // back to the start
    PlainTakenUp,   // an unfinished preparation goes on, or an order is prepared again
    EditedTakenUp,
    SendingTakenUpByFtp, // an unfinished sending goes on
    SendingTakenUpByHttp,
    DetailsWanted, // size, paper or details are changed, and the pictures stay chosen
};

// One way through the program. A page that is left is unloaded; one that waits lies below the next.
struct PageWay {
    enum class From { IsLeft, Waits };

    PageId from;
    Outcome outcome;
    PageId to;
    From then;
};

// All ways from page to page.
const std::vector<PageWay>& pageFlow();

// No value where the page has no such outcome.
std::optional<PageWay> wayFrom(PageId from, Outcome outcome);

} // namespace lumora
