#pragma once

#include "assembly/PrintPacker.h"
#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "order/OrderFolder.h"
#include "order/OrderLog.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"

#include <functional>
#include <optional>

namespace lumora {

struct Platform;
struct SessionState;
class PageChain;
enum class Outcome;

// What the two pages share that turn a basket into an order folder: the list with its progress, the loop over the
// pictures, what is written behind it, the hand-over to a sender, and the words for all that can go wrong.
class PreparationPage : public Page {
    Q_OBJECT
public:
    // State
    TextList List1;         // the lines of the basket
    TextList List4fail;     // paths of the pictures that could not be prepared
    Caption Label5;         // copies in all
    Caption Label17;        // position of the picture in work, from 1; empty before the first
    Caption Label16;        // how many pictures there are
    Caption Label4Progress; // a sentence: what is happening, with position and count
    Caption Label4Picture;  // file name of the picture in work
    Caption Label4fail;     // a sentence: how many could not be prepared; hidden when all could
    Caption Picture5;       // the order sheet's box
    Bitmap Picture5Image;
    int progressMaximum = 0; // for a bar: as Label16 and Label17
    int progressValue = 0;
    bool preparing = false;

    // The two lines of the warning not to delete the pictures yet.
    static QString doNotDelete(const SessionState& state);
    static QString untilPrinted(const SessionState& state);

protected:
    PreparationPage(PageId id, SessionState& state, const Platform& platform, PageChain& chain);

    enum class Stage { Waiting, Checking, Sheet, Pictures, Closing, Done };

    // Takes the lines of the hand-over; answers whether the page before asks for the start.
    bool takeLines();
    void CountTotalPics();
    // False, with words, when there is nothing to prepare.
    bool somethingChosen();

    // While it is on no button starts anything.
    virtual void setPreparing(bool on);
    void setStage(Stage stage, int position = 0);
    // All sentences about progress, in the language of the session.
    virtual void showProgress();
    void addFailed(const QString& path);

    // The folder of the order, told to the senders too. False, with words, when it can't be made.
    bool openFolder(const OrderFolder& folder);
    // step() for each line of List1, the page painted behind each. False when a click ended the program.
    bool forEachPicture(const std::function<void(int)>& step);
    // Adds what could not be packed to List4fail and says why, once for a whole order.
    bool pack(PrintPacker& packer, const PrintPacker::Line& line, const std::function<Result<QByteArray>()>& picture);
    void tellWriteFailure(const Failure& failure);
    void countOrder();
    // False, with words: without its log an order does not leave.
    bool writeLog(const OrderFolder& folder, OrderLog::Layout layout);

    // The order is whole: shows the page that goes on with it, or none at a local station, and leaves.
    void handOver(Outcome prepared);
    bool handedOver() const { return m_handedOver; }

    void tell(const QString& hebrew, const QString& english, const QString& reason = {});
    // Lets the page paint and a click through. False when that click ended the program.
    bool yield();

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    int m_writeFailures = 0;

private:
    Stage m_stage = Stage::Waiting;
    bool m_handedOver = false;
};

} // namespace lumora
