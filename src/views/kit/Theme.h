#pragma once

#include <QColor>
#include <QFont>
#include <QIcon>
#include <QMargins>
#include <QPixmap>
#include <QString>

#include <map>
#include <utility>

class QApplication;

namespace lumora {

// The room between neighbours.
enum class Space { None, Tight, Small, Normal, Wide, Far };
// The room between the edge of a card and what it holds.
enum class Pad { Tight, Slim, Normal, Wide };
// The side of an icon: of a small key, of a button, at a line of words, of a box, of an empty page.
enum class IconSize { Small, Button, Line, Box, Page };

// Widths and heights: of a small drawing, a short field, a wide one, a bar, a form.
enum class Extent { Drawing, Field, WideField, Bar, Form };

// The look of every page, in one place. Lengths are given for a window of 1024 by 768 and grow with it by one factor.
class Theme {
public:
    // Ink on Paper, Ink and Muted on Surface, and white on Primary and Danger keep a contrast of 4.5 or more.
    struct Colour {
        static constexpr QColor Paper{0xF5, 0xF3, 0xEE};   // behind everything
        static constexpr QColor Surface{0xFF, 0xFF, 0xFF}; // cards, fields
        static constexpr QColor Sunken{0xEC, 0xE9, 0xE1};  // wells, tracks
        static constexpr QColor Line{0xD5, 0xD0, 0xC5};    // hairlines
        static constexpr QColor Edge{0x8A, 0x86, 0x7C};    // outlines of what can be pressed (3:1)
        static constexpr QColor Ink{0x1D, 0x25, 0x2C};     // text
        static constexpr QColor Muted{0x57, 0x5F, 0x66};   // second text
        static constexpr QColor Primary{0x0E, 0x66, 0x6B}; // the main action, what is chosen
        static constexpr QColor PrimaryDark{0x0A, 0x4E, 0x52};
        static constexpr QColor PrimarySoft{0xDD, 0xEE, 0xED};
        static constexpr QColor Sun{0xF2, 0xA9, 0x3B}; // the one warm accent; never a text colour
        static constexpr QColor SunSoft{0xFD, 0xF0, 0xD9};
        static constexpr QColor Danger{0xB2, 0x32, 0x2A};
        static constexpr QColor DangerSoft{0xFB, 0xE6, 0xE3};
        static constexpr QColor Good{0x2B, 0x70, 0x3F};
        static constexpr QColor GoodSoft{0xE1, 0xF1, 0xE4};
        // The red-eye page's texts name these two: the buttons that move the circle, and those that size it.
        static constexpr QColor SkySoft{0xD6, 0xEA, 0xF8};
        static constexpr QColor VioletSoft{0xE6, 0xDC, 0xF5};
        static constexpr QColor Marker{0xFF, 0xD9, 0x1A};     // the yellow circle itself
        static constexpr QColor Focus{0x1F, 0x5F, 0xE0};      // the ring around the control that has the keyboard
        static constexpr QColor Veil{0x1D, 0x25, 0x2C, 0x99}; // over a page that has a panel in front
    };

    // The factor of the largest logical page that fits the window.
    static double factorFor(QSize window);

    explicit Theme(double factor)
        : m_factor(factor) {}

    double factor() const { return m_factor; }
    int px(double length) const;

    int size(Space space) const;
    int size(IconSize sign) const;
    int size(Extent extent) const;
    QMargins margins(Pad pad) const;
    int gap() const { return size(Space::Normal); }
    int margin() const { return size(Space::Far); } // of a page
    int corner() const { return px(14); }
    int hair() const { return px(2); }  // a line that is to be noticed
    int thick() const { return px(3); } // a line around what is chosen
    // No control that can be pressed is smaller than this, on any window.
    int target() const { return px(48) < 44 ? 44 : px(48); }
    // Plus and minus of a small picture: as small as a target may be.
    int key() const { return px(44) < 44 ? 44 : px(44); }

    enum class Type { Small, Body, Strong, Large, Title, Display };
    QFont font(Type type) const;

    // One of our own drawings (views/icons), in one colour.
    QPixmap icon(const QString& name, int size, QColor colour) const;
    QIcon buttonIcon(const QString& name, int size, QColor colour, QColor whenDisabled) const;

    QString styleSheet() const;

    // Fonts, palette and style of the application.
    static void apply(QApplication& application);

private:
    double m_factor;
    mutable std::map<std::pair<QString, std::pair<int, QRgb>>, QPixmap> m_icons;
};

// A text as labels show it: lines end in no blank, and the places that must keep their own direction (sizes, paths,
// addresses, "3 / 12") are set apart, so that a sentence in Hebrew does not turn them over.
QString isolated(const QString& text);
// Names and paths run from left to right in a Hebrew line too.
QString fromLeft(const QString& text);
// A line that begins with a text of its own direction, and still stands at the side of its page.
QString atLineStart(const QString& text, bool english);

} // namespace lumora
