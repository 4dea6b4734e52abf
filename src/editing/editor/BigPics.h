#pragma once

#include "editing/render/ColourLevels.h"
#include "editing/render/EditedPicture.h"
#include "imaging/Bitmap.h"
#include "session/Page.h"
#include "session/TextList.h"

#include <QRect>

#include <optional>

namespace lumora {

// The editor's work surfaces; nobody ever sees this page. The editor makes it with PageChain::load, puts the opened
// picture into CipCip and presses the buttons. Without a picture they do nothing.
class BigPics : public Page {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::BigPics;

    BigPics()
        : Page(PageId::BigPics) {}

    // Events
    void Command1_Click();     // turns the work picture grey
    void Command2_Click();     // the automatic level step: measures the work picture and leaves it as it is
    void Picture1Grey_Click(); // turns Picture1 grey

    // State
    std::optional<EditedPreview> CipCip; // the work picture of the editor
    Bitmap Picture1;                     // a second surface of the same use
    Bitmap Picture2;                     // the work picture, 400 wide, as it was measured
    QRect Image_crop;                    // the middle three quarters of Picture2, from which the samples come
    TextList List1, List2, List3;        // the samples of red, green and blue in text order

    // What the level step found. The lab's tools may come to read it; no page does.
    struct AutoLevels {
        ChannelValues gains{};
        ChannelValues floors{};
        float above = 10;    // the floors lie so much above the darkest sample
        float ceiling = 245; // to where the brightest may be brought
    };
    AutoLevels levels;
};

} // namespace lumora
