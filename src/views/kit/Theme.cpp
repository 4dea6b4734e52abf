#include "views/kit/Theme.h"

#include <QApplication>
#include <QFile>
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

double Theme::factorFor(QSize window) {
    const double fit = std::min(window.width() / 1024.0, window.height() / 768.0);
    // Steps of a twentieth, so that dragging the window's edge does not build the page anew at each pixel.
    return std::clamp(std::floor(fit * 20.0) / 20.0, 0.75, 3.0);
}

int Theme::px(double length) const {
    return length == 0 ? 0 : std::max(1, static_cast<int>(std::lround(length * m_factor)));
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

QFont Theme::font(Type type) const {
    QFont font = QApplication::font();
    switch (type) {
    case Type::Small:
        font.setPixelSize(px(14));
        break;
    case Type::Body:
        font.setPixelSize(px(17));
        break;
    case Type::Strong:
        font.setPixelSize(px(17));
        font.setBold(true);
        break;
    case Type::Large:
        font.setPixelSize(px(20));
        font.setBold(true);
        break;
    case Type::Title:
        font.setPixelSize(px(27));
        font.setBold(true);
        break;
    case Type::Display:
        font.setPixelSize(px(40));
        font.setBold(true);
        break;
    }
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
    static const std::map<QString, QColor> colours = {{u"Paper"_s, Colour::Paper},
                                                      {u"Surface"_s, Colour::Surface},
                                                      {u"Sunken"_s, Colour::Sunken},
                                                      {u"Line"_s, Colour::Line},
                                                      {u"Edge"_s, Colour::Edge},
                                                      {u"Ink"_s, Colour::Ink},
                                                      {u"Muted"_s, Colour::Muted},
                                                      {u"Primary"_s, Colour::Primary},
                                                      {u"PrimaryDark"_s, Colour::PrimaryDark},
                                                      {u"PrimarySoft"_s, Colour::PrimarySoft},
                                                      {u"Sun"_s, Colour::Sun},
                                                      {u"SunSoft"_s, Colour::SunSoft},
                                                      {u"Danger"_s, Colour::Danger},
                                                      {u"DangerSoft"_s, Colour::DangerSoft},
                                                      {u"Good"_s, Colour::Good},
                                                      {u"GoodSoft"_s, Colour::GoodSoft},
                                                      {u"SkySoft"_s, Colour::SkySoft},
                                                      {u"VioletSoft"_s, Colour::VioletSoft}};
    // Less the border of two pixels that the style adds.
    const std::map<QString, int> sizes = {
        {u"target"_s, target() - 2}, {u"row"_s, target()}, {u"key"_s, key() - 2}, {u"halfKey"_s, key() / 2}};
    QFile file(u":/theme.qss"_s);
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QString sheet = QString::fromUtf8(file.readAll());
    static const QRegularExpression placeholder(u"@(\\d+)|\\$(target|row|halfKey|key|[A-Z]\\w+)"_s);
    QString result;
    qsizetype from = 0;
    for (auto it = placeholder.globalMatch(sheet); it.hasNext();) {
        const auto match = it.next();
        const QString name = match.captured(2);
        result += QStringView(sheet).mid(from, match.capturedStart() - from);
        if (name.isEmpty())
            result += QString::number(px(match.capturedView(1).toInt()));
        else if (const auto size = sizes.find(name); size != sizes.end())
            result += QString::number(size->second);
        else
            result += colours.at(name).name();
        from = match.capturedEnd();
    }
    return result += QStringView(sheet).mid(from);
}

void Theme::apply(QApplication& application) {
    QApplication::setStyle(QStyleFactory::create(u"Fusion"_s));
    // What texts name "David" comes with the free Hebrew fonts under a name of its own.
    QFont::insertSubstitution(u"David"_s, u"David CLM"_s);
    QFont font;
    font.setFamilies({u"Noto Sans"_s, u"Noto Sans Hebrew"_s, u"DejaVu Sans"_s});
    font.setPixelSize(17);
    application.setFont(font);
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
