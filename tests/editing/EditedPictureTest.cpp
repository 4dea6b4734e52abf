#include "editing/render/EditedPicture.h"
#include "imaging/scaling/Resample.h"
#include "order/EditRecord.h"
#include "session/SessionState.h"
#include "support/PictureDifference.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <cstdlib>
#include <tuple>
#include <vector>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

class EditedPictureTest : public testing::Test {
protected:
    void SetUp() override {
        ASSERT_TRUE(QDir(m_folder.path()).mkpath(u"frames/blue"_s));
        saveFrame("frames/blue/kab.bmp", Qt::green);
        saveFrame("frames/blue/ab.bmp", Qt::green);
        saveFrame("frames/blue/kcd.bmp", Qt::yellow);
        saveFrame("kout.bmp", Qt::red);
        QImage soft(800, 600, QImage::Format_RGB32);
        for (int y = 0; y < 600; ++y) {
            for (int x = 0; x < 800; ++x)
                soft.setPixel(x, y,
                              qRgb(static_cast<int>(128 + 100 * std::sin(x / 37.0)), 40 + y / 4,
                                   static_cast<int>(128 + 90 * std::cos((x + 2 * y) / 61.0))));
        }
        ASSERT_TRUE(soft.save(at("lying.png")));
        ASSERT_TRUE(soft.transformed(QTransform().rotate(90)).save(at("upright.png")));
    }

    QString at(const char* name) const { return m_folder.path() + u'/' + QString::fromUtf8(name); }
    std::filesystem::path path(const char* name) const { return at(name).toStdString(); }

    // A coloured border on black, which shows the picture.
    void saveFrame(const char* name, QColor colour) const {
        QImage frame(120, 80, QImage::Format_RGB32);
        frame.fill(colour);
        for (int y = 8; y < 72; ++y) {
            for (int x = 8; x < 112; ++x)
                frame.setPixel(x, y, 0xFF000000);
        }
        ASSERT_TRUE(frame.save(at(name)));
    }

    Bitmap preview(const char* file, const EditFields& edit, PaperSize paper = {10, 15}) const {
        auto opened = EditedPreview::open(path(file), paper, edit.ZoomPercent,
                                          edit.ToneFlag == 1 ? EditedPreview::Tone::Grey : EditedPreview::Tone::Colour);
        if (!opened)
            return {};
        return opened->render(edit, loadFrame(path("frames"), edit, FrameUse::Preview));
    }
    Bitmap print(const char* file, const EditFields& edit, PaperSize digits = {10, 15}) const {
        EditedPrint request;
        request.file = path(file);
        request.paper = digits;
        request.framesFolder = path("frames");
        const auto paper = renderEditedPrint(request, edit);
        return paper ? *paper : Bitmap();
    }

    QTemporaryDir m_folder;
};

EditFields fieldsOf(const QString& record) {
    EditFields edit;
    UnpackEditState(record, edit);
    return edit;
}

double differenceOf(const Bitmap& seen, const Bitmap& larger) {
    return meanDifference(seen, resampled(larger, {seen.width(), seen.height()}));
}

TEST_F(EditedPictureTest, thePrintReducedToThePreviewIsThePreview) {
    const std::tuple<const char*, PaperSize, const char*> cases[] = {
        {"lying.png", {10, 15}, "1   1   1   195150245 140 0  0  000"},
        {"lying.png", {10, 15}, "1   1   1   16760 200 170 0  0  000"},
        {"lying.png", {10, 15}, "1.3 1   0.8 360210300 90  1  0  000"},
        {"lying.png", {10, 15}, "1   1   1   180100999 999 0  0  000"},
        {"lying.png", {10, 15}, "1   1   1   180100225 150 0  0  ab 000000000blue"},
        {"lying.png", {13, 18}, "1.48-0.51   21370 -40 162 0  0  cd 000000000blue"},
        {"upright.png", {13, 18}, "1   1.3 1   27080 130 217 1  0  000"},
        {"upright.png",
         {13, 18},
         "1   1   1   187120150 207 0  0  000000000000          302 1 0 1 ddd       0  255255280300"
         "0  0 3 DejaVu Sans                   Lumora 2024"},
        {"upright.png", {10, 15}, "1   1   1.3 27080 130 217 1  0  cd 000000000blue"},
        {"upright.png",
         {10, 15},
         "1   1   1   180100150 225 0  0  000000000000          242 0 0 1 ddd       30 255255280200"
         "0  3 0 DejaVu Sans                   Lumora 2024"},
    };
    for (const auto& [file, paper, record] : cases) {
        const EditFields edit = fieldsOf(QString::fromLatin1(record));
        const Bitmap seen = preview(file, edit, paper);
        const Bitmap full = print(file, edit, paper);
        ASSERT_FALSE(seen.isNull() || full.isNull()) << record;
        EXPECT_LE(differenceOf(seen, full), 3.0) << record;
        EditFields bare = edit;
        bare.TextOn = 0;
        EXPECT_TRUE(edit.TextOn == 0 || print(file, bare, paper).image() != full.image()) << record;
        EXPECT_TRUE(edit.TextOn == 0 || preview(file, bare, paper).image() != seen.image()) << record;
    }
    // What the measure is worth: a print that is moved, turned or toned a little differently is told from the preview.
    const auto differs = [&](const char* record) {
        return differenceOf(preview("lying.png", fieldsOf(u"1   1   1   195150245 140 0  0  000"_s)),
                            print("lying.png", fieldsOf(QString::fromLatin1(record))));
    };
    EXPECT_GT(differs("1   1   1   195150257 140 0  0  000"), 3.0);
    EXPECT_GT(differs("1   1   1   202150245 140 0  0  000"), 3.0);
    EXPECT_GT(differs("1.1 1   1   195150245 140 0  0  000"), 3.0);
}

// A caption on white: all of it, and its letters without their shadow.
struct CaptionSeen {
    double scale = 1; // pixels for one of the preview
    QRectF all, letters;
    double ink = 0;        // pixels of the letters
    double leansRight = 0; // how far their upper half stands right of the lower one
};

CaptionSeen captionIn(const QImage& image, double scale) {
    QRect all, letters;
    std::vector<QPoint> points;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const QRgb c = image.pixel(x, y);
            if ((c & 0xFFFFFF) == 0xFFFFFF)
                continue;
            all |= QRect(x, y, 1, 1);
            if (std::abs(qRed(c) - 250) + std::abs(qGreen(c) - 30) + std::abs(qBlue(c) - 90) < 100) {
                letters |= QRect(x, y, 1, 1);
                points.emplace_back(x, y);
            }
        }
    }
    const auto scaled = [scale](const QRect& r) {
        return QRectF(r.x() / scale, r.y() / scale, r.width() / scale, r.height() / scale);
    };
    CaptionSeen seen{scale, scaled(all), scaled(letters), static_cast<double>(points.size())};
    const int middle = letters.center().y();
    double sum[2] = {}, count[2] = {};
    for (const QPoint point : points) {
        sum[point.y() > middle] += point.x() / scale;
        ++count[point.y() > middle];
    }
    seen.leansRight = sum[0] / count[0] - sum[1] / count[1];
    return seen;
}

TEST_F(EditedPictureTest, aCaptionHasItsColourPlaceSizeAndStyleInPreviewAndPrint) {
    Bitmap(400, 300, Qt::white).image().save(at("white.png"));
    EditFields base = fieldsOf(u"1   1   1   180100225 150 0  0  000"_s);
    base.TextOn = 1;
    base.TextFont = u"DejaVu Sans"_s;
    base.TextBody = u"HH\r\nH"_s;
    base.TextFontSize = 40;
    base.TextX = 2000; // the record has the first three digits
    base.TextY = 1000;
    base.TextRed = 250;
    base.TextGreen = 30;
    base.TextBlue = 90;
    const auto seenIn = [&](const EditFields& edit) {
        return std::array{captionIn(preview("white.png", edit).image(), 1),
                          captionIn(print("white.png", edit).image(), 10 / 3.0)};
    };
    // By the em an H of this font is 0.752 wide with 0.098 free at both sides, and 0.729 high; the base line lies 0.928
    // below the top of the line's box, and the pitch is 1.164. A line has a third of an em more than its letters.
    for (const auto& [em, align, vertical] :
         {std::tuple(40, 0, 0), {40, 1, 0}, {40, 2, 0}, {60, 0, 0}, {40, 0, 3}, {40, 1, 3}, {40, 2, 3}}) {
        EditFields edit = base;
        edit.TextFontSize = static_cast<std::int16_t>(em);
        edit.TextAlign = static_cast<std::int16_t>(align);
        edit.TextVertical = static_cast<std::int16_t>(vertical);
        const double along = em * (1 / 6.0 + 0.098 - (2 * 0.752 + 1 / 3.0) * align / 2),
                     length = em * (2 * 0.752 - 2 * 0.098);
        const double below = em * (0.928 - 0.729), height = em * (0.729 + 1.164);
        const QRectF wanted = vertical == 0 ? QRectF(198 + along, 98 + below, length, height)
                                            : QRectF(198 - below - height, 98 + along, height, length);
        for (const CaptionSeen& seen : seenIn(edit)) {
            SCOPED_TRACE(::testing::Message() << em << ' ' << align << ' ' << vertical << ' ' << seen.scale);
            for (const auto side : {&QRectF::left, &QRectF::top, &QRectF::right, &QRectF::bottom}) {
                EXPECT_NEAR((seen.letters.*side)(), (wanted.*side)(), 1.2);
                const bool shadowSide = side == &QRectF::right || side == &QRectF::bottom;
                EXPECT_NEAR((seen.all.*side)(), (wanted.*side)() + (shadowSide ? 2 : 0), 1.2) << "with the shadow";
            }
        }
    }
    base.TextBody = u"HH"_s;
    const auto plain = seenIn(base);
    for (const int style : {1, 2, 3}) {
        base.TextStyle = static_cast<std::int16_t>(style);
        const auto styled = seenIn(base);
        for (const std::size_t i : {0, 1}) {
            SCOPED_TRACE(style);
            EXPECT_EQ(styled[i].ink > 1.3 * plain[i].ink, (style & 1) != 0);
            EXPECT_EQ(styled[i].leansRight > plain[i].leansRight + 1, (style & 2) != 0);
        }
    }
}

TEST_F(EditedPictureTest, aPreviewForALargerScreenIsTheSamePicture) {
    const EditFields edit = fieldsOf(u"1   1   1.1 195150245 140 0  0  ab 000000000blue"_s);
    auto opened = EditedPreview::open(path("lying.png"), {10, 15}, 100, EditedPreview::Tone::Colour, 2);
    ASSERT_TRUE(opened);
    const auto frame = loadFrame(path("frames"), edit, FrameUse::Preview);
    const Bitmap small = opened->render(edit, frame);
    const Bitmap large = opened->render(edit, frame, 2);
    EXPECT_EQ(large.image().size(), QSize(900, 600));
    EXPECT_LE(differenceOf(small, large), 3.0);
    EXPECT_EQ(opened->render(edit, frame).image(), small.image())
        << "what is kept for one scale leaves the other alone";
    EXPECT_GT(differenceOf(small, opened->render(edit, std::nullopt)), 3.0) << "a frame that is taken off is gone";
    opened->turnGrey();
    EXPECT_LE(differenceOf(opened->render(edit, frame), opened->render(edit, frame, 2)), 3.0);
}

TEST_F(EditedPictureTest, framesAreTakenFromTheirFolderOnly) {
    const auto frame = [&](const char* folder, const char* name, FrameUse use) {
        EditFields edit;
        edit.FrameFolder = QString::fromLatin1(folder);
        edit.FrameName = QString::fromLatin1(name);
        const auto loaded = loadFrame(path("frames"), edit, use);
        return loaded ? QColor(loaded->image().pixel(0, 0)) : QColor();
    };
    saveFrame("frames/blue/ab.bmp", Qt::cyan);
    EXPECT_EQ(frame("blue", "ab", FrameUse::Preview), QColor(Qt::green));
    EXPECT_EQ(frame("blue", "ab", FrameUse::Print), QColor(Qt::cyan));
    EXPECT_EQ(frame("blue", "cd", FrameUse::Print), QColor(Qt::yellow)) << "what was seen is printed";
    std::filesystem::rename(path("frames/blue/kcd.bmp"), path("frames/blue/KCD.Bmp"));
    EXPECT_EQ(frame("blue", "cd", FrameUse::Preview), QColor(Qt::yellow)) << "letter case does not count";
    for (const char* folder : {"..", "blue/../..", "blue\\..\\..", "/tmp", "C:"})
        EXPECT_FALSE(frame(folder, "out", FrameUse::Preview).isValid()) << folder;
    for (const char* name : {"000", "999", "", "zz", "../../kout"})
        EXPECT_FALSE(frame("blue", name, FrameUse::Preview).isValid()) << name;
}

TEST_F(EditedPictureTest, aPictureNeverOpenedPrintsStretchedAndOneThatCanNotBeReadIsAFailure) {
    const QImage unopened = print("lying.png", fieldsOf(EditRecord::newPicture())).image();
    const auto whole = loadPictureScaled(path("lying.png"), {1500, 1000});
    ASSERT_TRUE(whole);
    EXPECT_EQ(unopened, whole->image().convertToFormat(unopened.format()));
    EXPECT_EQ(print("lying.png", fieldsOf(QString(200, u'x'))).image(), unopened) << "a record of letters is none";
    EXPECT_EQ(print("lying.png", fieldsOf(QString(200, u'9'))).width(), 1500);
    EXPECT_EQ(preview("lying.png", fieldsOf(QString(200, u'-'))).width(), 450);
    EXPECT_FALSE(EditedPreview::open(path("none.jpg"), {10, 15}, 100, EditedPreview::Tone::Colour));
    EditedPrint request;
    request.file = path("frames");
    request.paper = {10, 15};
    EXPECT_FALSE(renderEditedPrintToJpeg(request, EditFields()));
}

} // namespace
} // namespace lumora
