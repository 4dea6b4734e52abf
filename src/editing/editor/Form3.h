#pragma once

#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"
#include "session/Caption.h"
#include "session/Page.h"

namespace lumora {

struct Platform;
struct SessionState;
class PageChain;

// A picture to look at, turned by quarters. Nothing of it is kept. Whoever opens the page calls showPicture and brings
// it to the front.
class Form3 : public Page {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::Form3;

    Form3(const SessionState& state, const Platform& platform, PageChain& chain);

    void load() override;
    void setTexts() override;

    // Opens the picture of a drive path, upright.
    void showPicture(const QString& path);

    // Events
    void Command1_Click(); // a quarter turn clockwise
    void Command2_Click(); // reads and draws the picture again
    void Command3_Click(); // closes the page

    // State
    Caption Label1; // the path of the picture
    Caption Command1, Command2, Command3;
    int angle = 0;           // 0, 90, 180 or 270 degrees clockwise
    PictureSize Picture2Box; // the box of the picture in logical pixels; the view puts it in the middle
    Bitmap Picture2;         // the turned picture, finer than its box; null when it can't be read

private:
    const SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
};

} // namespace lumora
