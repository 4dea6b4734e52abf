#include "views/kit/Theme.h"

#include <QApplication>
#include <QFile>
#include <QPainter>
#include <QPalette>
#include <QRegularExpression>
#include <QSize>
#include <QStyleFactory>
#include <QSvgRenderer>

#include <algorithm>
#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

double Theme::factorFor(QSize window) {
    const double fit = std::min(window.width() / 1024.0, window.height() / 768.0);
    // Steps of a twentieth, so that dragging the window's edge does not build the page anew at each pixel.
    return std::clamp(std::floor(fit * 20.0) / 20.0, 0.75, 3.0);
}

int Theme::px(double length) const {
    return length == 0 ? 0 : std::max(1, static_cast<int>(std::lround(length * m_factor)));
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

namespace {

QString hex(QColor colour) {
    return colour.name();
}

} // namespace

QString Theme::styleSheet() const {
    // Lengths stand as @12 (scaled) and colours as $Ink, so that the sheet reads as one.
    static const QString sheet = QString::fromUtf8(R"(
* { color: $Ink; font-size: @17px; }
QWidget#lumoraWindow, QWidget[role="page"] { background: $Paper; }
QWidget[role="panel"] { background: $Paper; border-top: 2px solid $Edge; }
QLabel { background: transparent; }
QLabel[type="small"] { font-size: @14px; }
QLabel[type="muted"] { color: $Muted; }
QLabel[type="smallMuted"] { color: $Muted; font-size: @14px; }
QLabel[type="strong"] { font-weight: bold; }
QLabel[type="large"] { font-size: @20px; font-weight: bold; }
QLabel[type="title"] { font-size: @27px; font-weight: bold; }
QLabel[type="display"] { font-size: @40px; font-weight: bold; }
QLabel[type="number"] { font-size: @52px; font-weight: bold; color: $PrimaryDark; }
QLabel[type="good"] { color: $Good; font-weight: bold; }
QLabel[type="danger"] { color: $Danger; font-weight: bold; }

QFrame[role="card"] { background: $Surface; border: 1px solid $Line; border-radius: @16px; }
QFrame[role="well"] { background: $Sunken; border: none; border-radius: @14px; }
QFrame[role="notice"] { background: $SunSoft; border: 1px solid $Sun; border-radius: @14px; }
QFrame[role="alarm"] { background: $DangerSoft; border: 1px solid $Danger; border-radius: @14px; }
QFrame[role="success"] { background: $GoodSoft; border: 1px solid $Good; border-radius: @14px; }
QFrame[role="bar"] { background: $Surface; border: none; border-top: 1px solid $Line; }
QFrame[role="header"] { background: $Surface; border: none; border-bottom: 1px solid $Line; }

QPushButton { min-height: %targetpx; min-width: %targetpx; padding: 0 @18px; border: 1px solid $Edge;
  border-radius: @13px; background: $Surface; font-weight: bold; }
QPushButton:hover { background: $PrimarySoft; border-color: $Primary; }
QPushButton:pressed { background: $Sunken; }
QPushButton:checked { background: $PrimarySoft; border: 2px solid $Primary; }
QPushButton:disabled { background: $Sunken; border-color: $Line; color: $Muted; }
QPushButton[role="main"] { min-height: @58px; min-width: @150px; padding: 0 @34px; font-size: @20px; border: none;
  background: $Primary; color: white; }
QPushButton[role="main"]:hover, QPushButton[role="main"]:pressed { background: $PrimaryDark; }
QPushButton[role="main"]:disabled { background: $Sunken; color: $Muted; }
QPushButton[role="secondary"] { min-height: @58px; padding: 0 @22px; }
QPushButton[role="quiet"] { border: 1px solid transparent; background: transparent; font-weight: normal; padding: 0 @12px; }
QPushButton[role="quiet"]:hover { background: $Sunken; }
QPushButton[role="danger"] { border-color: $Danger; color: $Danger; }
QPushButton[role="danger"]:hover { background: $DangerSoft; border-color: $Danger; }
QPushButton[role="danger"]:disabled { border-color: $Line; color: $Muted; }
QPushButton[sinks="true"]:pressed { border: 2px inset $Edge; background: $Sunken; }
QPushButton[role="main"][sinks="true"]:pressed { border: 3px inset $Primary; background: $PrimaryDark; }
QPushButton[role="tall"] { min-height: @52px; padding: 0 @8px; font-size: @15px; }
QPushButton[role="tool"] { padding: 0; min-width: 44px; min-height: 44px; border: none; }
QPushButton[role="round"] { padding: 0; min-width: %keypx; min-height: %keypx; border-radius: %halfKeypx; }
QPushButton[role="done"] { border: none; background: $Primary; color: white; padding: 0 @26px; }
QPushButton[role="done"]:hover, QPushButton[role="done"]:pressed { background: $PrimaryDark; }
QPushButton[role="done"]:disabled { background: $Sunken; color: $Muted; }
QPushButton[role="key"], QPushButton[role="wordKey"] { padding: 0; min-width: @32px; min-height: %keypx;
  border: 1px solid $Line; border-bottom: 2px solid $Edge; border-radius: @10px; font-size: @22px; font-weight: normal; }
QPushButton[role="wordKey"] { font-size: @16px; font-weight: bold; }
QPushButton[role="key"]:pressed, QPushButton[role="wordKey"]:pressed { background: $PrimarySoft; border-color: $Primary; }
QPushButton[role="key"]:checked, QPushButton[role="wordKey"]:checked { background: $PrimarySoft; border: 2px solid $Primary; }

QPushButton[role="sky"], QPushButton[role="violet"] { padding: 0; }
QPushButton[role="sky"] { background: $SkySoft; }
QPushButton[role="violet"] { background: $VioletSoft; }
QPushButton[role="sky"]:pressed, QPushButton[role="violet"]:pressed { background: $Sunken; }
QPushButton[role="sky"]:disabled, QPushButton[role="violet"]:disabled { background: $Sunken; }

QLineEdit, QPlainTextEdit, QComboBox { min-height: %targetpx; padding: 0 @14px; border: 2px solid $Edge; border-radius: @12px;
  background: $Surface; selection-background-color: $Primary; selection-color: white; font-size: @19px; }
QPlainTextEdit { padding: @8px @10px; }
QLineEdit:focus, QPlainTextEdit:focus, QComboBox:focus { border-color: $Primary; }
QLineEdit:disabled, QComboBox:disabled { background: $Sunken; border-color: $Line; color: $Muted; }
QLineEdit[wanted="true"] { background: $GoodSoft; border-color: $Good; }
QComboBox::drop-down { width: @44px; border: none; }
QComboBox::down-arrow { image: url(:/icons/chevron-down.svg); width: @22px; height: @22px; }
QComboBox QAbstractItemView { border: 1px solid $Edge; background: $Surface; outline: none; padding: @4px;
  selection-background-color: $PrimarySoft; selection-color: $Ink; }
QComboBox QAbstractItemView::item, QListWidget::item { min-height: %targetpx; padding: 0 @12px; border-radius: @8px; }
QListWidget { border: 1px solid $Line; border-radius: @14px; background: $Surface; padding: @6px; outline: none; }
QListWidget[names="true"] { font-size: @14px; }
QListWidget[dense="true"]::item { min-height: @30px; padding: 0 @8px; }
QListWidget::item:selected { background: $PrimarySoft; color: $Ink; }

QCheckBox { min-height: %targetpx; spacing: @12px; background: transparent; }
QCheckBox::indicator, QListWidget::indicator { width: @28px; height: @28px; border: 2px solid $Edge; border-radius: @8px; background: $Surface; }
QCheckBox::indicator:hover { border-color: $Primary; }
QCheckBox::indicator:checked, QListWidget::indicator:checked { background: $Primary; border-color: $Primary; image: url(:/icons/tick-white.svg); }

QProgressBar { min-height: @18px; max-height: @18px; border: none; border-radius: @9px; background: $Sunken; text-align: center; }
QProgressBar::chunk { border-radius: @9px; background: $Primary; }

QScrollArea, QScrollArea > QWidget > QWidget { background: transparent; border: none; }
QScrollBar:vertical { width: @14px; background: transparent; margin: 0; }
QScrollBar:horizontal { height: @14px; background: transparent; margin: 0; }
QScrollBar::handle { background: $Edge; border-radius: @7px; min-height: @44px; min-width: @44px; }
QScrollBar::add-line, QScrollBar::sub-line, QScrollBar::add-page, QScrollBar::sub-page { background: none; border: none; width: 0; height: 0; }
QToolTip { background: $Ink; color: white; border: none; padding: @6px @10px; }
)");
    QString result = sheet;
    const std::pair<const char*, QColor> colours[] = {{"$PrimaryDark", Colour::PrimaryDark},
                                                      {"$PrimarySoft", Colour::PrimarySoft},
                                                      {"$Primary", Colour::Primary},
                                                      {"$Paper", Colour::Paper},
                                                      {"$Surface", Colour::Surface},
                                                      {"$SkySoft", Colour::SkySoft},
                                                      {"$VioletSoft", Colour::VioletSoft},
                                                      {"$Sunken", Colour::Sunken},
                                                      {"$Line", Colour::Line},
                                                      {"$Edge", Colour::Edge},
                                                      {"$Ink", Colour::Ink},
                                                      {"$Muted", Colour::Muted},
                                                      {"$SunSoft", Colour::SunSoft},
                                                      {"$Sun", Colour::Sun},
                                                      {"$DangerSoft", Colour::DangerSoft},
                                                      {"$Danger", Colour::Danger},
                                                      {"$GoodSoft", Colour::GoodSoft},
                                                      {"$Good", Colour::Good}};
    for (const auto& [name, colour] : colours)
        result.replace(QLatin1StringView(name), hex(colour));
    result.replace("%target"_L1, QString::number(target() - 2));
    result.replace("%key"_L1, QString::number(key() - 2));
    result.replace("%halfKey"_L1, QString::number(key() / 2));
    static const QRegularExpression length(u"@(\\d+)"_s);
    QString scaled;
    qsizetype from = 0;
    for (auto it = length.globalMatch(result); it.hasNext();) {
        const auto match = it.next();
        scaled += QStringView(result).mid(from, match.capturedStart() - from);
        scaled += QString::number(px(match.capturedView(1).toInt()));
        from = match.capturedEnd();
    }
    scaled += QStringView(result).mid(from);
    return scaled;
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
    // Paths, addresses of the web and of mail, names of files, sizes, "3 / 12", percentages, telephone numbers.
    static const QRegularExpression ownDirection(
        u"[A-Za-z]:\\\\[^\\n]*|(?<!\\S)/[^/\\n]+/[^\\n]*|[\\w.+-]+@[\\w.-]*|https?://\\S+"
        "|(?<!\\S)[!-~]+\\.[A-Za-z]{3}(?![\\w.])"
        "|\\d+(?:\\s*[/x,_-]\\s*\\d+|[:.]\\d+)+(?:\\s?%)?|\\d+\\s?%|\\+\\d+"_s);
    QString result = text;
    result.replace(u"\r\n"_s, u"\n"_s).replace(u'\r', u'\n');
    qsizetype shift = 0;
    for (auto it = ownDirection.globalMatch(result); it.hasNext();) {
        const auto match = it.next();
        result.insert(match.capturedStart() + shift, QChar(0x2066));
        result.insert(match.capturedEnd() + shift + 1, QChar(0x2069));
        shift += 2;
    }
    return result;
}

} // namespace lumora
