#pragma once

#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"

#include <QPoint>

#include <optional>

namespace lumora {

struct Platform;
struct SessionState;
class PageChain;

// The preparation of a plain order: each picture is scaled to the paper, or copied as it is, and packed into a print
// file of the order folder, with the order sheet and the order log beside them. It takes the lines of the hand-over
// when it loads and, when the hand-over asks for it, presses its own start once it is painted.
class Form2 : public Page {
    Q_OBJECT
public:
    Form2(SessionState& state, const Platform& platform, PageChain& chain);
    ~Form2() override;

    void load() override;
    void setTexts() override;

    // Events
    void Command3_Click(); // start: drops what is no JPEG, lets the page paint, goes on with Command6
    void Command6_Click(); // the whole preparation, and the hand-over to the sender
    void Command1_Click(); // removes the chosen picture from the list
    void Command7_Click(); // leaves the program
    void Command4_Click(); // draws the sheet of an album order, to look at
    void Command5_Click(); // draws the pictures of the sheet again, to look at
    void Command8_Click(); // puts the sheet back to its corner
    void List1_Click(int index);
    void Picture5_MouseDown(QPoint at); // the sheet can be dragged; positions are those of the page
    void Picture5_MouseMove(QPoint at);
    void Picture5_MouseUp();

    // State
    TextList List1;         // the lines of the basket: print code (9 characters), path
    TextList List4fail;     // paths of the pictures that could not be prepared
    TextList List4removed;  // paths that were dropped because they are no JPEG files
    Caption Label5;         // copies in all
    Caption Label17;        // position of the picture in work, from 1; empty before the first
    Caption Label16;        // how many pictures there are
    Caption Label4Progress; // a sentence: what is happening, with position and count
    Caption Label4Picture;  // file name of the picture in work
    Caption Label4fail;     // a sentence: how many could not be prepared; hidden when all could
    Caption Label4removed;  // a sentence above List4removed; hidden when nothing was dropped
    Caption Label6;         // the warning not to delete the pictures yet, two lines
    Caption Label10;
    Caption Label1; // title of the page
    Caption Command1, Command3, Command4, Command5, Command6, Command7, Command8;
    Caption Picture5; // the order sheet's box
    Bitmap Picture5Image;
    QPoint Picture5Position{5, 5};
    int progressMaximum = 0; // for a bar: as Label16 and Label17
    int progressValue = 0;
    bool preparing = false;

private:
    enum class Stage { Waiting, Checking, Sheet, Pictures, Closing, Done };
    class Steps;

    void KeepOnlyJpeg();
    void CountTotalPics();
    void setPreparing(bool on);
    void setStage(Stage stage, int position = 0);
    void showProgress();
    bool drawSheet(bool album);
    bool prepareOrder();
    void PackOnePicture(int index, Steps& steps);
    void addFailed(const QString& path);
    void tellWriteFailure(const Failure& failure);
    void tell(const QString& hebrew, const QString& english, const QString& reason);
    void handOver();
    bool yield();

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    Stage m_stage = Stage::Waiting;
    QString m_manifestLine; // what a manifest would tell of the step in work: length, code, running number, name
    int m_runningNumber = 1;
    int m_writeFailures = 0;
    bool m_handedOver = false;
    std::optional<QPoint> m_dragFrom;
};

} // namespace lumora
