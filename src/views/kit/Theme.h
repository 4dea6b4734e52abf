#pragma once

#include <QColor>
#include <QFont>
#include <QIcon>
#include <QMargins>
#include <QPixmap>
#include <QString>

#include <algorithm>
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

// The look of every page, in one place. Lengths are given for a window of 1024 by 768, or for an upright one of 900 by
// 1500, and grow with it by one factor.
class Theme {
public:
    enum class Look {
        Calm, // Ink on Paper, Ink and Muted on Surface, and white on Primary and Danger keep a contrast of 4.5 or more
        Contrast // black on white with strong edges: each text keeps a contrast of 7 or more
    };
    // As the look of the application has them: setLook() gives their values.
    struct Colour {
        static inline QColor Paper;   // behind everything
        static inline QColor Surface; // cards, fields
        static inline QColor Sunken;  // wells, tracks
        static inline QColor Line;    // hairlines
        static inline QColor Groove;  // of a gauge
        static inline QColor Track;   // the way that is still to come
        static inline QColor Here;    // the field that is typed into
        static inline QColor Edge;    // outlines of what can be pressed (3:1)
        static inline QColor Ink;     // text
        static inline QColor Muted;   // second text
        static inline QColor Primary; // the main action, what is chosen
        static inline QColor PrimaryDark;
        static inline QColor PrimarySoft;
        static inline QColor Sun; // the one warm accent; never a text colour
        static inline QColor SunEdge;
        static inline QColor SunSoft;
        static inline QColor Danger;
        static inline QColor DangerSoft;
        static inline QColor Good;
        static inline QColor GoodSoft;
        // The red-eye page's texts name these two: the buttons that move the circle, and those that size it.
        static inline QColor SkySoft;
        static inline QColor VioletSoft;
        static inline QColor Marker; // the yellow circle itself
        static inline QColor Focus;  // the ring around the control that has the keyboard
        static inline QColor Veil;   // over a page that has a panel in front
    };
    // To be called before a page is made: what is on the screen keeps the look that it has.
    static void setLook(Look look);
    // The same for the desktop's letters, in pixels: no page's are smaller, up to a sixteenth more than its window
    // gives.
    static void setLetters(int pixels);

    struct Fit {
        double factor = 1;
        bool tall = false; // clearly taller than wide: what stands side by side stands one below the other
        bool operator==(const Fit&) const = default;
    };
    // The largest logical page that fits the window.
    static Fit fitFor(QSize window);

    explicit Theme(Fit fit)
        : m_fit(fit) {}

    const Fit& fit() const { return m_fit; }
    double factor() const { return m_fit.factor; }
    bool isTall() const { return m_fit.tall; }
    int px(double length) const;

    int size(Space space) const;
    int size(IconSize sign) const;
    int size(Extent extent) const;
    QMargins margins(Pad pad) const;
    int gap() const { return size(Space::Normal); }
    int margin() const { return size(isTight() ? Space::Wide : Space::Far); } // of a page
    int corner() const { return px(14); }
    int edge() const; // in pixels of the screen: the outline of a card and of what can be pressed
    Qt::PenStyle edgeStyle(bool enabled) const;
    int hair() const { return px(2); }  // a line that is to be noticed
    int thick() const { return px(3); } // a line around what is chosen
    // Below 800 by 600, where what does not fit scrolls.
    bool scrolls() const { return factor() < smallest; }
    // No control or row that can be pressed is smaller than this: a finger's width, and less below 800 by 600.
    int least() const { return scrolls() ? 36 : 44; }
    // Controls take more of the window than they would by its factor.
    bool isTight() const { return px(48) < least(); }
    int target() const { return std::max(least(), px(48)); }
    // Plus and minus of a small picture: as small as a target may be.
    int key() const { return std::max(least(), px(44)); }

    // The sizes of text.
    enum class Type { Note, Small, Tall, Word, Body, Strong, Field, Large, Key, Title, Display, Number, Giant };
    int text(Type type) const;
    // By how much the desktop's letters make ours larger than the factor does.
    double growth() const;
    QFont font(Type type) const;

    // One of our own drawings (views/icons), in one colour.
    QPixmap icon(const QString& name, int size, QColor colour) const;
    QIcon buttonIcon(const QString& name, int size, QColor colour, QColor whenDisabled) const;

    QString styleSheet() const;

    // Fonts, style and the calm look of the application; the desktop's font as it stands before.
    static void apply(QApplication& application);

private:
    static constexpr double smallest = 0.75; // of a window of 800 by 600
    int side(double length) const;           // of a button, beside its words
    Fit m_fit;
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
