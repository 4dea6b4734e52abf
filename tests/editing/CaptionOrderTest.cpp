#include "imaging/drawing/CaptionDraw.h"
#include "imaging/drawing/Drawing.h"

#include <QFont>
#include <QFontMetricsF>

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <functional>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

// Hebrew, digits and Latin in one line: what was drawn is held against the same letters drawn one by one at the
// places where a reader expects them, and against the line mirrored and unturned.

const QString family = u"DejaVu Sans"_s;
constexpr int size = 40;

QString reversed(QString text) {
    std::reverse(text.begin(), text.end());
    return text;
}

// Draws a text with its left end a fixed way from x.
using Draw = std::function<void(Bitmap&, double x, const QString&)>;

Bitmap inOneGo(const Draw& draw, const QString& text) {
    Bitmap paper(700, 90, Qt::white);
    draw(paper, 10, text);
    return paper;
}

Bitmap pieceByPiece(const Draw& draw, const QString& fromTheLeft) {
    QFont font(family);
    font.setPixelSize(size);
    font.setHintingPreference(QFont::PreferNoHinting);
    const QFontMetricsF metrics(font);
    Bitmap paper(700, 90, Qt::white);
    double x = 10;
    // What is no Hebrew goes in one piece, for its kerning: nothing inside it changes places.
    for (qsizetype at = 0; at < fromTheLeft.size();) {
        const auto isHebrew = [&](qsizetype i) { return fromTheLeft[i].script() == QChar::Script_Hebrew; };
        qsizetype end = at + 1;
        while (!isHebrew(at) && end < fromTheLeft.size() && !isHebrew(end))
            ++end;
        const QString piece = fromTheLeft.mid(at, end - at);
        draw(paper, x, piece);
        x += metrics.horizontalAdvance(piece);
        at = end;
    }
    return paper;
}

// The share of the ink of a that lies elsewhere in b.
double difference(const Bitmap& a, const Bitmap& b) {
    double ink = 0;
    double off = 0;
    for (int y = 0; y < a.height(); ++y) {
        for (int x = 0; x < a.width(); ++x) {
            ink += 255 - qGray(a.image().pixel(x, y));
            off += std::abs(qGray(a.image().pixel(x, y)) - qGray(b.image().pixel(x, y)));
        }
    }
    return off / std::max(1.0, ink);
}

void expectOrder(const char* what, const Draw& draw) {
    struct Case {
        QString text, fromTheLeft;
    };
    const QString shalom = u"שלום"_s;
    const QString abg = u"אבג"_s;
    const Case cases[] = {
        {shalom, reversed(shalom)},
        {shalom + u" Lumora 2024"_s, reversed(shalom) + u" Lumora 2024"_s},
        {abg + u" 123 abc"_s, u"123 "_s + reversed(abg) + u" abc"_s}, // digits belong to the Hebrew before them
        {u"abc "_s + abg + u" 12"_s, u"abc 12 "_s + reversed(abg)},
        {u"("_s + abg + u")"_s, u"("_s + reversed(abg) + u")"_s},
        {shalom + u' ' + abg + u"!"_s, reversed(shalom + u' ' + abg) + u"!"_s},
        {u"12/2024"_s, u"12/2024"_s},
    };
    for (const Case& given : cases) {
        const Bitmap drawn = inOneGo(draw, given.text);
        const double right = difference(drawn, pieceByPiece(draw, given.fromTheLeft));
        EXPECT_LT(right, 0.4) << what << ": " << qPrintable(given.text);
        for (const QString& wrong : {given.text, reversed(given.text), reversed(given.fromTheLeft)}) {
            if (wrong != given.fromTheLeft) {
                EXPECT_GT(difference(drawn, pieceByPiece(draw, wrong)), right + 0.1)
                    << what << ": " << qPrintable(given.text) << " could be taken for " << qPrintable(wrong);
            }
        }
    }
}

void drawCaption(Bitmap& paper, const PictureCaption& caption) {
    drawInk(paper, inkOf(caption, {paper.width(), paper.height()}));
}

PictureCaption captionAt(double x, const QString& text) {
    PictureCaption caption;
    caption.text = text;
    caption.family = family;
    caption.emSize = size;
    caption.x = static_cast<int>(x + 0.5);
    caption.y = 20;
    return caption;
}

TEST(CaptionOrder, HebrewWithDigitsAndLatinStandsAsItIsReadOnPicturesAndSheet) {
    expectOrder("across", [](Bitmap& paper, double x, const QString& text) { drawCaption(paper, captionAt(x, text)); });
    expectOrder("down", [](Bitmap& paper, double x, const QString& text) {
        Bitmap turnedPaper = turned(paper, QuarterTurn::Right);
        PictureCaption caption = captionAt(0, text);
        caption.run = PictureCaption::Run::Down;
        caption.x = 70;
        caption.y = static_cast<int>(x + 0.5);
        drawCaption(turnedPaper, caption);
        paper = turned(turnedPaper, QuarterTurn::Left);
    });
    expectOrder("sheet", [](Bitmap& paper, double x, const QString& text) {
        drawText(paper, {static_cast<int>(x + 0.5), 20}, text, {family, size, Qt::black, false});
    });
}

TEST(CaptionOrder, ALineIsOneLineHoweverLongAndBreaksOnlyWhereEnterWasPressed) {
    const auto inkBelow = [](const QString& text, int y) {
        Bitmap paper(300, 200, Qt::white);
        drawCaption(paper, captionAt(5, text));
        double ink = 0;
        for (int x = 0; x < paper.width(); ++x) {
            for (int row = y; row < paper.height(); ++row)
                ink += 255 - qGray(paper.image().pixel(x, row));
        }
        return ink;
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

} // namespace
} // namespace lumora
