#include "assembly/OrderSheet.h"

#include "assembly/WorkAhead.h"
#include "common/AnsiCodePage.h"
#include "common/FixedText.h"
#include "common/PaperSize.h"
#include "session/SessionState.h"

#include <QFont>
#include <QFontMetrics>
#include <QPainter>
#include <QTextLayout>
#include <QTextOption>
#include <QTransform>

#include <algorithm>
#include <array>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

struct SizeStep {
    int upTo;
    PictureSize edited;
    PictureSize plain;
};

constexpr std::array<SizeStep, 5> sizeSteps = {{
    {10, {450, 580}, {500, 480}},
    {50, {450, 880}, {500, 880}},
    {70, {660, 880}, {660, 880}},
    {100, {750, 1000}, {750, 1000}},
    {200, {900, 1000}, {900, 1000}},
}};
constexpr PictureSize largestSheet = {1100, 1300};

// Pixels of a 96 dpi screen: 12 and 8 points.
constexpr int lineFontPixels = 16;
constexpr int leastFontPixels = 8;
constexpr int captionFontPixels = 11;
// Distance of the lines in pixels, independent of the font, so that the seventeen lines of an album end above its
// pictures.
constexpr int linePitch = 20;
constexpr QPoint textStart(10, 10);

QFont sheetFont(int pixels) {
    QFont font;
    font.setPixelSize(pixels);
    return font;
}

// The lines run from the left; the words of a Hebrew phrase keep their own order.
void drawTextLine(QPainter& painter, int x, int top, const QString& text) {
    painter.setLayoutDirection(Qt::LeftToRight);
    painter.drawText(QPoint(x, top + painter.fontMetrics().ascent()), text);
}

int widthOf(QString text, const QFont& font) {
    while (text.endsWith(u' '))
        text.chop(1);
    return QFontMetrics(font).horizontalAdvance(text);
}

// The largest font, from 16 down to 8 pixels, in which the text is no wider than room.
int fittingPixels(const QString& text, int room) {
    int pixels = lineFontPixels;
    while (pixels > leastFontPixels && widthOf(text, sheetFont(pixels)) > room)
        --pixels;
    return pixels;
}

QStringList brokenToWidth(const QString& text, const QFont& font, int room) {
    QTextOption option;
    option.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    option.setTextDirection(Qt::LeftToRight);
    QTextLayout layout(text, font);
    layout.setTextOption(option);
    QStringList pieces;
    layout.beginLayout();
    for (QTextLine line = layout.createLine(); line.isValid(); line = layout.createLine()) {
        line.setLineWidth(room);
        pieces += text.mid(line.textStart(), line.textLength());
    }
    layout.endLayout();
    return pieces;
}

QString shortenedToWidth(QString text, const QFont& font, int room) {
    const QString dots = u"..."_s;
    while (!text.isEmpty() && widthOf(text + dots, font) > room)
        text.chop(1);
    // The dots stand at the end of a Hebrew text, which is its left side.
    const bool hebrew = !text.isEmpty() && text.back().direction() == QChar::DirR;
    return text + dots + (hebrew ? u"\u200F"_s : QString());
}

struct DeliveryPlace {
    const char16_t* code;
    const char16_t* line;
};

// The place where the prints are fetched, by how the order started; the two kinds of order start in different ways. The
// places are the lab's branches.
constexpr std::array<DeliveryPlace, 3> plainPlaces = {{
    {u"KIN", u"קבלת תמונות בקניון"},
    {u"LOB", u"קבלת תמונות בלובי"},
    {u"NSM", u"קבלת תמונות בסניף"},
}};
constexpr std::array<DeliveryPlace, 3> editedPlaces = {{
    {u"HOM", u"קבלת תמונות בדואר"},
    {u"KNN", u"קבלת תמונות בקניון"},
    {u"PLZ", u"קבלת תמונות בפלאזה"},
}};

QString deliveryLine(const std::array<DeliveryPlace, 3>& places, const QString& kodMishloach) {
    for (const DeliveryPlace& place : places) {
        if (kodMishloach.left(3) == QString::fromUtf16(place.code))
            return QString::fromUtf16(place.line);
    }
    return {};
}

QString topLine(const SessionState& state, const QDateTime& now, const QString& delivery) {
    return u"No....."_s + state.MisparHazmana + u'_' + state.shemot.ser + u"    "_s +
           now.toString(u"dd/MM/yyyy HH:mm:ss"_s) + u"     "_s + delivery + u" ver: "_s + state.shemot.Girsa;
}

QString plainTopLine(const SessionState& state, const QDateTime& now) {
    return topLine(state, now, deliveryLine(plainPlaces, state.KodMishloach));
}

QString customerLine(const OrderDetails& shemot) {
    return u"  Name...."_s + shemot.n1 + u"        Tel....."_s + shemot.n2 + u"      "_s + shemot.n4;
}

QString addressLine(const OrderDetails& shemot) {
    return u"    "_s + shemot.n3 + u"      "_s;
}

QString totalLine(const OrderDetails& shemot, const QString& beforeMail) {
    return u"  Total pictures..."_s + QString::number(shemot.TotalPics) + u"   Border=  "_s + shemot.Bord + beforeMail +
           u"Mail  "_s + shemot.Mail;
}

} // namespace

PictureSize orderSheetSize(SheetKind kind, int items) {
    for (const SizeStep& step : sizeSteps) {
        if (items <= step.upTo)
            return kind == SheetKind::Edited ? step.edited : step.plain;
    }
    return largestSheet;
}

QColor orderSheetBackground(SheetKind kind, const SessionState& state) {
    if (kind != SheetKind::Edited && state.shemot.ppr == mixedSizes)
        return {255, 192, 255};
    return kind == SheetKind::Album ? QColor(220, 220, 150) : QColor(Qt::white);
}

QList<SheetLine> plainSheetLines(const SessionState& state, const QDateTime& now) {
    const OrderDetails& shemot = state.shemot;
    const QString paper =
        shemot.ppr == mixedSizes
            ? shemot.ppr + u"   paper  Kind"_s + shemot.Soog2 + u' ' + shemot.Soog1
            : u"  Paper size...."_s + shemot.ppr + u"       paper  Kind"_s + shemot.maat + u"    "_s + shemot.FillFit;
    return {{plainTopLine(state, now)},    {customerLine(shemot)}, {addressLine(shemot)}, {paper},
            {totalLine(shemot, u"   "_s)}, {shemot.Hearot}};
}

QList<SheetLine> editedSheetLines(const SessionState& state, const QDateTime& now) {
    const OrderDetails& shemot = state.shemot;
    return {{topLine(state, now, deliveryLine(editedPlaces, state.KodMishloach) + u' ')},
            {customerLine(shemot)},
            {addressLine(shemot)},
            {u"  Paper size...."_s + shemot.ppr + u"       paper Kind  "_s + shemot.maat},
            {totalLine(shemot, u"     "_s)},
            {u"  "_s + shemot.Hearot}};
}

QList<SheetLine> albumSheetLines(const SessionState& state, const QDateTime& now) {
    const AlbumDetails& album = state.album;
    const SheetLine rule{QString(89, u'-')};
    const QString gap(7, u' ');
    const auto& extras = album.Tosafot2;
    return {
        {plainTopLine(state, now)},
        {u"  ShemZalam...."_s + album.ShemZalam + u"        TelZalam....."_s + album.TelZalam + u"      "_s +
             state.shemot.n4,
         true},
        // The address is on the line of the event.
        {u"  ShemErooa...."_s + album.ShemErooa + u"    "_s + state.shemot.n3 + u"      "_s, true},
        {u"  MailZalam...."_s + album.MailZalam},
        {u"  Total pictures..."_s + QString::number(state.shemot.TotalPics)},
        rule,
        {u"  GodelLBM...."_s + album.GodelLBM + u"       SoogLBM...."_s + album.SoogLBM + u"     SoogNiar...."_s +
         album.SoogNiar},
        {u"  SoogKricha...."_s + album.SoogKricha},
        rule,
        {u' ' + extras[0] + gap + extras[1] + gap + extras[2] + gap + extras[3] + u"  "_s},
        {u' ' + extras[4] + gap + extras[5] + gap + extras[6] + gap + extras[7] + gap + extras[8] + u"     "_s},
        rule,
        {u' ' + album.KamutHorim + u"  אלבום הורים  "_s, true},
        {u"   סוג  אלבום  הורים  "_s + album.SoogHorim + u"   "_s, true},
        rule,
        {u"  Hearot...."_s + state.shemot.Hearot, true},
        rule,
    };
}

SheetPlace sheetPlaceOf(PictureSize picture) {
    const double ratio = static_cast<double>(picture.height) / std::max(picture.width, 1);
    const bool turned = ratio >= 1;
    const double across = turned ? sheetCellSize / ratio : sheetCellSize * ratio;
    const int height = std::max(1, static_cast<int>(RoundHalfEven(across)));
    return {turned ? PictureSize{height, sheetCellSize} : PictureSize{sheetCellSize, height}, turned};
}

Bitmap laidOnSheet(const Bitmap& upright, const SheetPlace& place) {
    return place.turned ? Bitmap(upright.image().transformed(QTransform().rotate(90))) : upright;
}

Result<Bitmap> sheetThumbnail(const std::filesystem::path& source) {
    const Result<PictureSize> size = readPictureSize(source);
    if (!size)
        return size.failure();
    const SheetPlace place = sheetPlaceOf(*size);
    const Result<Bitmap> upright = loadPictureScaled(source, place.upright);
    return upright ? Result<Bitmap>(laidOnSheet(*upright, place)) : upright;
}

PlacedLines placeSheetLines(const QList<SheetLine>& lines, int sheetWidth) {
    std::vector<PlacedText> texts;
    const int room = sheetWidth - 2 * textStart.x();
    int top = textStart.y();
    for (const SheetLine& line : lines) {
        // A break inside a remark starts a line of its own.
        for (const QString& part : QString(line.text).remove(u'\r').split(u'\n')) {
            const int pixels = fittingPixels(part, room);
            const QFont font = sheetFont(pixels);
            QStringList pieces = {part};
            const bool inLog = !line.onlyHere && AnsiCodePage::squeeze(part) == part;
            if (widthOf(part, font) > room)
                pieces = inLog ? QStringList{shortenedToWidth(part, font, room)} : brokenToWidth(part, font, room);
            const int pitch = QFontMetrics(font).lineSpacing();
            for (qsizetype i = 0; i < pieces.size(); ++i)
                texts.push_back({pieces[i], pixels, top + static_cast<int>(i) * pitch});
            top += pieces.size() == 1 ? linePitch : std::max(linePitch, static_cast<int>(pieces.size()) * pitch);
        }
    }
    return {std::move(texts), top};
}

OrderSheet::OrderSheet(SheetKind kind, PictureSize size, QColor background)
    : m_kind(kind)
    , m_size(size)
    , m_background(background)
    , m_bitmap(size.width, size.height, background) {}

void OrderSheet::drawLines(const QList<SheetLine>& lines) {
    const PlacedLines placed = placeSheetLines(lines, m_size.width);
    m_added = std::max(0, placed.bottom - firstRowTop());
    if (m_added > 0)
        m_bitmap = Bitmap(m_size.width, m_size.height + m_added, m_background);
    QPainter painter(&m_bitmap.image());
    painter.setPen(Qt::black);
    for (const PlacedText& line : placed.texts) {
        painter.setFont(sheetFont(line.fontPixels));
        drawTextLine(painter, textStart.x(), line.top, line.text);
    }
}

int OrderSheet::firstRowTop() const {
    return sheetCellSize + (m_kind == SheetKind::Album ? 282 : 81) + m_added;
}

int OrderSheet::capacityOf(PictureSize size) {
    const int lastRow = size.height / sheetCellSize - 1;
    const int lastColumn = size.width / sheetCellSize - 2;
    return lastRow * (lastColumn + 1);
}

void OrderSheet::drawContactSheet(const std::vector<SheetCell>& cells, const std::function<bool(int)>& after) {
    const int count = std::min(capacity(), static_cast<int>(cells.size()));
    WorkAhead<Result<Bitmap>> thumbnails(count, [&cells](int i) -> WorkAhead<Result<Bitmap>>::Work {
        const auto source = cells[static_cast<std::size_t>(i)].source;
        return [source]() -> Result<Bitmap> {
            return source ? sheetThumbnail(*source) : Failure{Failure::Kind::NotFound, {}};
        };
    });
    drawContactSheet(
        cells, [&](const std::function<void()>& whileWaiting) { return thumbnails.take(whileWaiting); }, after);
}

void OrderSheet::drawContactSheet(const std::vector<SheetCell>& cells, const NextPicture& next,
                                  const std::function<bool(int)>& after) {
    const int columns = m_size.width / sheetCellSize - 1;
    const int count = std::min(capacity(), static_cast<int>(cells.size()));
    for (int i = 0; i < count; ++i) {
        bool wanted = true;
        const Result<Bitmap> picture = next([&] { wanted = wanted && after(i); });
        if (wanted && picture) {
            const QPoint at((sheetCellSize + 2) * (i % columns) + 5, firstRowTop() + sheetCellSize * (i / columns));
            QPainter painter(&m_bitmap.image());
            painter.drawImage(at, picture->image());
            painter.setFont(sheetFont(captionFontPixels));
            painter.setPen(Qt::black);
            drawTextLine(painter, at.x(), at.y() + picture->height(), cells[static_cast<std::size_t>(i)].caption);
        }
        if (!wanted || !after(i))
            return;
    }
}

} // namespace lumora
