#pragma once

#include "editing/render/ColourLevels.h"
#include "editing/render/EditedPicture.h"
#include "imaging/Bitmap.h"
#include "session/Page.h"
#include "session/TextList.h"

#include <QRect>

#include <optional>

namespace lumora {

struct BigPicsControls : Controls {
    std::optional<EditedPreview> CipCip; // the work picture of the editor
    Bitmap Picture1;                     // a second surface of the same use
    Bitmap Picture2;                     // the work picture, 400 wide, as it was measured
    QRect Image_crop;                    // the middle three quarters of Picture2: the samples come from it
    TextList List1{*this, u"List1"};     // the samples of red in text order
    TextList List2{*this, u"List2"};     // of green
    TextList List3{*this, u"List3"};     // of blue

    // What the level step found.
    struct AutoLevels {
        ChannelValues gains{};
        ChannelValues floors{};
        float above = 10;    // the floors lie so much above the darkest sample
        float ceiling = 245; // to where the brightest may be brought
    };
    AutoLevels levels;
};

// BigPics, "the editor's work picture" in the glossary: a page without a view, from which the editor draws its previews
// and by which it measures the picture.
class BigPics : public Page, private BigPicsControls {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::BigPics;

    BigPics()
        : Page(pageId) {}

    // Events. Without a picture they do nothing.
    void open(EditedPreview picture) { CipCip = std::move(picture); }
    void close() { CipCip.reset(); }
    void turnGrey();
    void measureLevels(); // leaves the work picture as it is

    void Command1_Click() { turnGrey(); }
    void Command2_Click() { measureLevels(); }

    // BigPicsUnused.cpp
    void openSecond(Bitmap picture);
    void Picture1Grey_Click();

    // State
    const BigPicsControls& controls() const override { return *this; }
    EditedPreview* workPicture() { return CipCip ? &*CipCip : nullptr; }
};

} // namespace lumora
