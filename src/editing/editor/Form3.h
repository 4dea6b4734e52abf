#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"
#include "session/Caption.h"
#include "session/Page.h"

namespace lumora {

struct Platform;
struct SessionState;
class PageChain;

struct Form3Controls : Controls {
    Caption Label1{*this, u"Label1"};     // drive path of the picture
    Caption fileName{*this, u"fileName"}; // its leaf name
    Caption Command1{*this, u"Command1"}, Command2{*this, u"Command2"}, Command3{*this, u"Command3"};
    int angle = 0;           // 0, 90, 180 or 270 degrees clockwise
    PictureSize Picture2Box; // the box of the picture in logical pixels; the view puts it in the middle
    Bitmap Picture2;         // the turned picture, finer than its box; null when it can't be read
    Caption unreadable{*this, u"unreadable", Caption::At::Hidden}; // stands in place of a picture that can't be read
};

// Form3, "a picture turned, to look at" in the glossary: the customer looks at one picture of the page of pictures,
// large. Nothing of it is kept.
class Form3 : public Page, private Form3Controls {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::Form3;

    Form3(const SessionState& state, const Platform& platform, PageChain& chain);

    void load() override;
    void setTexts() override;

    // --- events ---

    void open(const DrivePath& path); // shows the picture upright; the caller brings the page to the front
    void Command1_Click() { turn(); }
    void Command2_Click() { draw(); }
    void Command3_Click() { close(); }

    // --- state ---

    const Form3Controls& controls() const override { return *this; }

private:
    void turn(); // a quarter clockwise
    void draw(); // reads the file again
    Result<Bitmap> read();
    void close();

    const SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    DrivePath m_path; // of the picture
};

} // namespace lumora
