#include "imaging/drawing/CaptionDraw.h"
#include "imaging/drawing/Drawing.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <functional>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

// Hebrew, digits and Latin in one line: what was drawn is held against the same signs in the order in which a reader
// sees them from the left, forced to stand so, and against the line mirrored and unturned.

const QString family = u"DejaVu Sans"_s;

QString reversed(QString text) {
    std::reverse(text.begin(), text.end());
    return text;
}

// Draws a text from its left end.
using Draw = std::function<void(Bitmap&, const QString&)>;

Bitmap drawn(const Draw& draw, const QString& text) {
    Bitmap paper(700, 90, Qt::white);
    draw(paper, text);
    return paper;
}

// The share of the ink of a that lies elsewhere in b.
double difference(const Bitmap& a, const Bitmap& b) {
    double ink = 1;
    double off = 0;
    for (int i = 0; i < a.width() * a.height(); ++i) {
        const QPoint at(i % a.width(), i / a.width());
        ink += 255 - qGray(a.image().pixel(at));
        off += std::abs(qGray(a.image().pixel(at)) - qGray(b.image().pixel(at)));
    }
    return off / ink;
}

void expectOrder(const char* what, const Draw& draw) {
    const QString shalom = u"שלום"_s;
    const QString abg = u"אבג"_s;
    const std::pair<QString, QString> cases[] = {
        {shalom, reversed(shalom)},
        {shalom + u" Lumora 2024"_s, reversed(shalom) + u" Lumora 2024"_s},
        {abg + u" 123 abc"_s, u"123 "_s + reversed(abg) + u" abc"_s}, // digits belong to the Hebrew before them
        {u"abc "_s + abg + u" 12"_s, u"abc 12 "_s + reversed(abg)},
        {u"("_s + abg + u")"_s, u"("_s + reversed(abg) + u")"_s},
        {shalom + u' ' + abg + u"!"_s, reversed(shalom + u' ' + abg) + u"!"_s},
        {u"12/2024"_s, u"12/2024"_s},
    };
    const auto forced = [&](const QString& text) { return drawn(draw, u'\u202D' + text + u'\u202C'); };
    for (const auto& [text, fromTheLeft] : cases) {
        const Bitmap line = drawn(draw, text);
        const double right = difference(line, forced(fromTheLeft));
        EXPECT_LT(right, 0.1) << what << ": " << qPrintable(text);
        for (const QString& wrong : {text, reversed(text), reversed(fromTheLeft)}) {
            if (wrong != fromTheLeft) {
                EXPECT_GT(difference(line, forced(wrong)), right + 0.1) << what << ": " << qPrintable(text);
            }
        }
    }
}

void drawCaption(Bitmap& paper, const PictureCaption& caption) {
    drawInk(paper, inkOf(caption, {paper.width(), paper.height()}));
}

PictureCaption captionAt(int x, const QString& text, int emSize = 40) {
    PictureCaption caption;
    caption.text = text;
    caption.family = family;
    caption.emSize = emSize;
    caption.x = x;
    caption.y = 20;
    return caption;
}

TEST(CaptionOrder, HebrewWithDigitsAndLatinStandsAsItIsReadOnPicturesAndSheet) {
    expectOrder("across", [](Bitmap& paper, const QString& text) { drawCaption(paper, captionAt(10, text)); });
    expectOrder("down", [](Bitmap& paper, const QString& text) {
        Bitmap turnedPaper = turned(paper, QuarterTurn::Right);
        PictureCaption caption = captionAt(70, text);
        caption.run = PictureCaption::Run::Down;
        caption.y = 10;
        drawCaption(turnedPaper, caption);
        paper = turned(turnedPaper, QuarterTurn::Left);
    });
    expectOrder("sheet", [](Bitmap& paper, const QString& text) {
        drawText(paper, {10, 20}, text, {family, 40, Qt::black, false});
    });
}

TEST(CaptionOrder, ALineIsOneLineHoweverLongAndBreaksOnlyWhereEnterWasPressed) {
    const auto inkBelow = [](const QString& text, int y) {
        Bitmap paper(300, 200, Qt::white);
        drawCaption(paper, captionAt(5, text));
        return difference(Bitmap(paper.image().copy(0, y, 300, 200 - y)), Bitmap(300, 200 - y, Qt::white));
    };
    const int secondLine = 20 + 46; // a line is 1.16 em high
    EXPECT_EQ(inkBelow(QString(70, u'ש'), secondLine + 4), 0) << "wrapped";
    EXPECT_EQ(inkBelow(u"Yes "_s.repeated(17), secondLine + 4), 0) << "wrapped at a blank";
    EXPECT_GT(inkBelow(u"אב\r\nגד"_s, secondLine + 4), 0);
    EXPECT_GT(inkBelow(u"\r\n\r\nגד"_s, secondLine + 46), 0) << "an empty line takes its room";
    EXPECT_EQ(inkBelow({}, 0), 0);
    // A break paints nothing and adds nothing to its line.
    const auto far = [](const QString& text) {
        Bitmap paper(300, 90, Qt::white);
        PictureCaption caption = captionAt(250, text);
        caption.align = PictureCaption::Align::Far;
        drawCaption(paper, caption);
        return paper.image();
    };
    EXPECT_EQ(far(u"abc\r\n"_s), far(u"abc"_s));
}

TEST(CaptionDraw, LeavesOutAFontThatIsMissingAndDrawsDavidOnPicturesAndSheet) {
    for (const auto& [name, shows] : {std::pair(u"No Such Family"_s, false), std::pair(u"David"_s, true)}) {
        PictureCaption caption = captionAt(0, u"שלום Lumora\r\n2024"_s, 24);
        caption.family = name;
        Bitmap paper(200, 80, Qt::white);
        drawInk(paper, inkOf(caption, {200, 80}));
        EXPECT_EQ(paper.image() != Bitmap(200, 80, Qt::white).image(), shows) << qPrintable(name);
        Bitmap sheet(200, 80, Qt::white);
        drawText(sheet, {5, 5}, caption.text, {.family = name, .pixelSize = 24});
        EXPECT_EQ(sheet.image().copy(0, 38, 200, 42) != Bitmap(200, 42, Qt::white).image(), shows) << "two lines";
    }
}

TEST(CaptionDraw, WhatIsKeptBetweenTicksShowsAsIfItWereMadeAnew) {
    CaptionInks inks;
    PictureCaption caption = captionAt(0, u"שלום Lumora\r\n2024"_s, 24);
    PaperScale scale;
    const std::function<void()> steps[] = {
        [&] { caption.x = 40; },
        [&] { caption.y = 190; },
        [&] { caption.emSize = 31; },
        [&] { caption.align = PictureCaption::Align::Centre; },
        [&] {
            scale = PaperScale{1.5, 1.5};
        },
        [&] { caption.run = PictureCaption::Run::Down; },
        [&] { caption.colour = Qt::red; },
        [&] { caption.emSize = 99; }, // larger than the paper: no longer kept
        [&] { caption.text = u"A"_s; },
        [&] { caption.family = u"No Such Family"_s; },
        [&] { caption.family = u"DejaVu Sans"_s; },
    };
    for (std::size_t i = 0; i < std::size(steps); ++i) {
        steps[i]();
        Bitmap kept(300, 200, Qt::white);
        Bitmap fresh = kept;
        drawInk(kept, inks.inkOf(caption, {300, 200}, scale));
        drawInk(fresh, inkOf(caption, {300, 200}, scale));
        // Outlines fall on 64ths of a pixel, which may round otherwise at another place.
        for (int at = 0; at < 300 * 200; ++at) {
            const auto green = [at](const Bitmap& paper) { return qGreen(paper.image().pixel(at % 300, at / 300)); };
            ASSERT_NEAR(green(kept), green(fresh), 8) << "step " << i;
        }
    }
}

} // namespace
} // namespace lumora
