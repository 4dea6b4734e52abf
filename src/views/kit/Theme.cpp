#include "views/kit/Theme.h"

#include <QApplication>
#include <QFile>
#include <QFontInfo>
#include <QPainter>
#include <QPalette>
#include <QRegularExpression>
#include <QSize>
#include <QStringList>
#include <QStyleFactory>
#include <QSvgRenderer>

#include <algorithm>
#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// What the pages are drawn with, by the names that the sheet has.
const struct {
    const char16_t* name;
    QColor& colour;
    QColor calm;
    QColor contrast;
} colours[] = {
    {u"Paper", Theme::Colour::Paper, {0xF5, 0xF3, 0xEE}, {0xFF, 0xFF, 0xFF}},
    {u"Surface", Theme::Colour::Surface, {0xFF, 0xFF, 0xFF}, {0xFF, 0xFF, 0xFF}},
    {u"Sunken", Theme::Colour::Sunken, {0xEC, 0xE9, 0xE1}, {0xDC, 0xDC, 0xDC}},
    {u"Line", Theme::Colour::Line, {0xD5, 0xD0, 0xC5}, {0x4A, 0x4A, 0x4A}},
    {u"Groove", Theme::Colour::Groove, {0xEC, 0xE9, 0xE1}, {0x8C, 0x8C, 0x8C}},
    {u"Track", Theme::Colour::Track, {0xD5, 0xD0, 0xC5}, {0x8C, 0x8C, 0x8C}},
    {u"Here", Theme::Colour::Here, {0xFF, 0xFF, 0xFF}, {0xFF, 0xF6, 0xC2}},
    {u"Edge", Theme::Colour::Edge, {0x8A, 0x86, 0x7C}, {0x00, 0x00, 0x00}},
    {u"Ink", Theme::Colour::Ink, {0x1D, 0x25, 0x2C}, {0x00, 0x00, 0x00}},
    {u"Muted", Theme::Colour::Muted, {0x57, 0x5F, 0x66}, {0x30, 0x30, 0x30}},
    {u"Primary", Theme::Colour::Primary, {0x0E, 0x66, 0x6B}, {0x00, 0x3D, 0x42}},
    {u"PrimaryDark", Theme::Colour::PrimaryDark, {0x0A, 0x4E, 0x52}, {0x00, 0x26, 0x29}},
    {u"PrimarySoft", Theme::Colour::PrimarySoft, {0xDD, 0xEE, 0xED}, {0xC9, 0xF0, 0xEC}},
    {u"Sun", Theme::Colour::Sun, {0xF2, 0xA9, 0x3B}, {0xDC, 0x84, 0x00}},
    {u"SunEdge", Theme::Colour::SunEdge, {0xF2, 0xA9, 0x3B}, {0x7A, 0x4A, 0x00}},
    {u"SunSoft", Theme::Colour::SunSoft, {0xFD, 0xF0, 0xD9}, {0xFF, 0xF1, 0xD6}},
    {u"Danger", Theme::Colour::Danger, {0xB2, 0x32, 0x2A}, {0x8C, 0x00, 0x00}},
    {u"DangerSoft", Theme::Colour::DangerSoft, {0xFB, 0xE6, 0xE3}, {0xFF, 0xE9, 0xE6}},
    {u"Good", Theme::Colour::Good, {0x2B, 0x70, 0x3F}, {0x00, 0x45, 0x1B}},
    {u"GoodSoft", Theme::Colour::GoodSoft, {0xE1, 0xF1, 0xE4}, {0xDF, 0xF6, 0xE4}},
    {u"SkySoft", Theme::Colour::SkySoft, {0xD6, 0xEA, 0xF8}, {0xD6, 0xEA, 0xF8}},
    {u"VioletSoft", Theme::Colour::VioletSoft, {0xE6, 0xDC, 0xF5}, {0xE6, 0xDC, 0xF5}},
    {u"Marker", Theme::Colour::Marker, {0xFF, 0xD9, 0x1A}, {0xFF, 0xE6, 0x00}},
    {u"Focus", Theme::Colour::Focus, {0x1F, 0x5F, 0xE0}, {0x00, 0x2F, 0xD6}},
    {u"Veil", Theme::Colour::Veil, {0x1D, 0x25, 0x2C, 0x99}, {0x00, 0x00, 0x00, 0xCC}},
};

// Set by setLook(), as the colours are.
Theme::Look shownLook = Theme::Look::Calm;
int leastLetters = 0; // set by setLetters()

constexpr int bodyText = 17;             // at a factor of 1
constexpr double largestGrowth = 1.0625; // what the smallest pages have room for

// A piece of a line without the signs of the sentence around it; told apart where it has more than words.
QString apart(QString piece, bool behindLetter) {
    static const QRegularExpression code(u"[0-9_@\\\\/^]|\\w\\.\\w"_s);
    if (!code.match(piece).hasMatch())
        return piece;
    const auto lone = [&](QChar sign) {
        return sign == u'(' ? !piece.contains(u')') : sign == u')' ? !piece.contains(u'(') : piece.count(sign) % 2 == 1;
    };
    qsizetype from = 0;
    qsizetype to = piece.size();
    while (piece[from] == u' ' || (behindLetter && piece[from] == u'-') ||
           (u"(\"'"_s.contains(piece[from]) && lone(piece[from])))
        ++from;
    while (u".,;:!?- "_s.contains(piece[to - 1]) || (u"()\"'"_s.contains(piece[to - 1]) && lone(piece[to - 1])))
        --to;
    return piece.left(from) + fromLeft(piece.mid(from, to - from)) + piece.mid(to);
}

QString withCodesApart(const QString& line) {
    if (line.contains(QChar(0x2066)))
        return line;
    // A path goes to the end of its line. What else stands together is told apart as one, or its words would change
    // places; the parts of a list stay in its order.
    static const QRegularExpression path(u"[A-Za-z]:\\\\.*|(?<!\\S)/[^\\s/][^/]*/.*"_s);
    static const QRegularExpression together(u"(?![,;:])[!-~]+?(?: [!-~]+?)*(?=[,;:] |$|[^ -~]| (?![!-~]))"_s);
    const qsizetype end = line.indexOf(path);
    const QString words = line.left(end < 0 ? line.size() : end);
    QString result;
    qsizetype at = 0;
    for (auto it = together.globalMatch(words); it.hasNext();) {
        const auto match = it.next();
        const bool behindLetter = match.capturedStart() > 0 && words[match.capturedStart() - 1].isLetter();
        result += words.mid(at, match.capturedStart() - at) + apart(match.captured(), behindLetter);
        at = match.capturedEnd();
    }
    return result + words.mid(at) + (end < 0 ? QString() : fromLeft(line.mid(end)));
}

} // namespace

Theme::Fit Theme::fitFor(QSize window) {
    const bool tall = window.height() * 4 >= window.width() * 5;
    const QSizeF page = tall ? QSizeF(900, 1500) : QSizeF(1024, 768);
    const double fit = std::min(window.width() / page.width(), window.height() / page.height());
    // Steps of a twentieth, so that dragging the window's edge does not build the page anew at each pixel.
    return {std::clamp(std::floor(fit * 20.0) / 20.0, 0.6, 3.0), tall};
}

int Theme::px(double length) const {
    return length == 0 ? 0 : std::max(1, static_cast<int>(std::lround(length * factor())));
}

int Theme::size(Space space) const {
    static constexpr int pixels[] = {0, 4, 8, 12, 18, 28};
    return px(pixels[static_cast<int>(space)]);
}

int Theme::size(IconSize sign) const {
    static constexpr int pixels[] = {20, 24, 32, 44, 96};
    return px(pixels[static_cast<int>(sign)]);
}

int Theme::size(Extent extent) const {
    static constexpr int pixels[] = {120, 150, 210, 360, 680};
    return px(pixels[static_cast<int>(extent)]);
}

QMargins Theme::margins(Pad pad) const {
    static constexpr QSize pixels[] = {{8, 6}, {16, 10}, {18, 14}, {30, 22}};
    const QSize room = pixels[static_cast<int>(pad)];
    return {px(room.width()), px(room.height()), px(room.width()), px(room.height())};
}

int Theme::text(Type type) const {
    static constexpr int pixels[] = {13, 14, 15, 16, bodyText, bodyText, 19, 20, 22, 27, 40, 52, 84};
    return px(pixels[static_cast<int>(type)] * growth());
}

double Theme::growth() const {
    return std::clamp(leastLetters / (bodyText * factor()), 1.0, largestGrowth);
}

int Theme::side(double length) const {
    // What larger letters take comes from the room beside them, so that a bar of buttons stays as wide as it is; six
    // times the growth is what the fullest one needs.
    return px(length * (1 - 6 * (growth() - 1)));
}

int Theme::edge() const {
    return shownLook == Look::Contrast ? 2 : 1;
}

Qt::PenStyle Theme::edgeStyle(bool enabled) const {
    // What is disabled is told by more than a shade.
    return !enabled && shownLook == Look::Contrast ? Qt::DashLine : Qt::SolidLine;
}

QFont Theme::font(Type type) const {
    QFont font = QApplication::font();
    font.setPixelSize(text(type));
    font.setBold(type == Type::Strong || type >= Type::Large);
    return font;
}

QPixmap Theme::icon(const QString& name, int size, QColor colour) const {
    QPixmap& pixmap = m_icons[{name, {size, colour.rgb()}}];
    if (pixmap.isNull()) {
        QFile file(u":/icons/"_s + name + u".svg"_s);
        if (!file.open(QIODevice::ReadOnly))
            return {};
        QByteArray drawing = file.readAll();
        drawing.replace("#000000", colour.name().toLatin1());
        QSvgRenderer renderer(drawing);
        const double ratio = qApp->devicePixelRatio();
        pixmap = QPixmap(QSize(size, size) * ratio);
        pixmap.fill(Qt::transparent);
        QPainter painter(&pixmap);
        renderer.render(&painter);
        painter.end();
        pixmap.setDevicePixelRatio(ratio);
    }
    return pixmap;
}

QIcon Theme::buttonIcon(const QString& name, int size, QColor colour, QColor whenDisabled) const {
    QIcon result;
    result.addPixmap(icon(name, size, colour), QIcon::Normal);
    result.addPixmap(icon(name, size, whenDisabled), QIcon::Disabled);
    return result;
}

QString Theme::styleSheet() const {
    // Less the border that the style adds.
    const int border = 2 * edge();
    std::map<QString, QString> values;
    for (const auto& [name, pixels] : {std::pair(u"target", target() - border),
                                       {u"tall", std::max(least() - border, px(52))},
                                       {u"least", least()},
                                       {u"leastKey", least() - border},
                                       {u"row", target()},
                                       {u"main", std::max(least(), px(58))},
                                       {u"side", side(18)},
                                       {u"sideMain", side(34)},
                                       {u"sideSecondary", side(22)},
                                       {u"sideQuiet", side(12)},
                                       {u"key", key() - border},
                                       {u"halfKey", key() / 2}})
        values[QString::fromUtf16(name)] = QString::number(pixels);
    for (const auto& [name, type] : {std::pair(u"Note", Type::Note),
                                     {u"Small", Type::Small},
                                     {u"Tall", Type::Tall},
                                     {u"Word", Type::Word},
                                     {u"Body", Type::Body},
                                     {u"Field", Type::Field},
                                     {u"Large", Type::Large},
                                     {u"Key", Type::Key},
                                     {u"Title", Type::Title},
                                     {u"Display", Type::Display},
                                     {u"Number", Type::Number},
                                     {u"Giant", Type::Giant}})
        values[u"text"_s + QString::fromUtf16(name)] = QString::number(text(type)) + u"px"_s;
    for (const auto& row : colours)
        values[QString::fromUtf16(row.name)] = row.colour.name();
    const bool strong = shownLook == Look::Contrast;
    values[u"edge"_s] = u"%1px"_s.arg(edge());
    values[u"mark"_s] = u"%1px"_s.arg(edge() + 1);
    values[u"off"_s] = strong ? u"dashed"_s : u"solid"_s;
    // What has no outline in the calm look.
    values[u"bare"_s] = strong ? u"%1px solid %2"_s.arg(edge()).arg(Colour::Edge.name()) : u"none"_s;
    values[u"bareOff"_s] = strong ? u"%1px dashed %2"_s.arg(edge()).arg(Colour::Line.name()) : u"none"_s;
    values[u"quiet"_s] = strong ? Colour::Line.name() : u"transparent"_s;
    QFile file(u":/theme.qss"_s);
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QString sheet = QString::fromUtf8(file.readAll());
    static const QRegularExpression placeholder(
        u"@(\\d+)|\\$(target|tall|leastKey|least|row|main|sideMain|sideSecondary|sideQuiet|side|halfKey|key|edge|mark|off|bareOff|bare|quiet|text[A-Z]\\w+|[A-Z]\\w+)"_s);
    QString result;
    qsizetype from = 0;
    for (auto it = placeholder.globalMatch(sheet); it.hasNext();) {
        const auto match = it.next();
        const QString name = match.captured(2);
        result += QStringView(sheet).mid(from, match.capturedStart() - from);
        if (name.isEmpty())
            result += QString::number(px(match.capturedView(1).toInt()));
        else
            result += values.at(name);
        from = match.capturedEnd();
    }
    return result += QStringView(sheet).mid(from);
}

void Theme::apply(QApplication& application) {
    setLetters(QFontInfo(QApplication::font()).pixelSize());
    QApplication::setStyle(QStyleFactory::create(u"Fusion"_s));
    // What texts name "David" comes with the free Hebrew fonts under a name of its own.
    QFont::insertSubstitution(u"David"_s, u"David CLM"_s);
    QFont font;
    font.setFamilies({u"Noto Sans"_s, u"Noto Sans Hebrew"_s, u"DejaVu Sans"_s});
    font.setPixelSize(bodyText);
    application.setFont(font);
    setLook(Look::Calm);
}

void Theme::setLetters(int pixels) {
    leastLetters = pixels;
}

void Theme::setLook(Look look) {
    shownLook = look;
    for (const auto& row : colours)
        row.colour = look == Look::Contrast ? row.contrast : row.calm;
    QPalette palette;
    palette.setColor(QPalette::Window, Colour::Paper);
    palette.setColor(QPalette::Base, Colour::Surface);
    palette.setColor(QPalette::Button, Colour::Surface);
    palette.setColor(QPalette::WindowText, Colour::Ink);
    palette.setColor(QPalette::Text, Colour::Ink);
    palette.setColor(QPalette::ButtonText, Colour::Ink);
    palette.setColor(QPalette::PlaceholderText, Colour::Muted);
    palette.setColor(QPalette::Highlight, Colour::Primary);
    palette.setColor(QPalette::HighlightedText, Qt::white);
    QApplication::setPalette(palette);
}

QString fromLeft(const QString& text) {
    return QChar(0x2066) + text + QChar(0x2069);
}

QString atLineStart(const QString& text, bool english) {
    // The first mark of direction decides at which side a label begins.
    return QChar(english ? 0x200E : 0x200F) + text;
}

QString isolated(const QString& text) {
    QString result = text;
    result.replace(u"\r\n"_s, u"\n"_s).replace(u'\r', u'\n');
    // Qt draws a right-to-left line that ends with a blank that much too far to the right, and the label cuts it.
    static const QRegularExpression blanksAtLineEnds(u"(?:^|(?<=\n))[ \t]+|[ \t]+(?=\n|$)"_s);
    result.remove(blanksAtLineEnds);
    QStringList lines = result.split(u'\n');
    std::transform(lines.begin(), lines.end(), lines.begin(), withCodesApart);
    return lines.join(u'\n');
}

} // namespace lumora
