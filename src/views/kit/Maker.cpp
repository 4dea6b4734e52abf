#include "views/kit/Maker.h"

#include "views/kit/ScreenReader.h"

#include <QPainter>
#include <QStyle>
#include <QStyleOption>
#include <QTextLayout>
#include <QVariant>

#include <algorithm>

namespace lumora {

namespace {

// A card that shows only where something went wrong.
class CardFrame : public QFrame {
public:
    using QFrame::QFrame;

protected:
    void showEvent(QShowEvent* event) override {
        QFrame::showEvent(event);
        tellAlert(*this);
    }
};

// Draws its words as the page reads, whatever letter they begin with; the text itself stays as it was set.
class PageLabel : public QLabel {
public:
    using QLabel::QLabel;

protected:
    void paintEvent(QPaintEvent* event) override {
        if (text().isEmpty() || !pixmap().isNull())
            return QLabel::paintEvent(event);
        const QString shown = isolated(text());
        // In a row that runs from left to right in every language the words decide.
        const Qt::LayoutDirection words = layoutDirection() == directionOfPage() ? layoutDirection()
                                          : shown.isRightToLeft()                ? Qt::RightToLeft
                                                                                 : Qt::LeftToRight;
        const QRect room = contentsRect().adjusted(margin(), margin(), -margin(), -margin());
        const QStringList lines = wordWrap() ? broken(shown, words, room.width()) : shown.split(u'\n');
        QPainter painter(this);
        drawFrame(&painter);
        QStyleOption look;
        look.initFrom(this);
        const Qt::Alignment sides = QStyle::visualAlignment(words, alignment());
        const int out = overhang(lines, words);
        painter.translate(sides & Qt::AlignLeft ? out : sides & Qt::AlignRight ? -out : 0, 0);
        const int flags = static_cast<int>(sides) | Qt::TextDontClip |
                          (words == Qt::RightToLeft ? Qt::TextForceRightToLeft : Qt::TextForceLeftToRight);
        style()->drawItemText(&painter, room, flags, look.palette, isEnabled(), lines.join(u'\n'), foregroundRole());
    }

private:
    Qt::LayoutDirection directionOfPage() const {
        const QWidget* page = this;
        while (page->parentWidget() && !page->parentWidget()->isWindow())
            page = page->parentWidget();
        return page->layoutDirection();
    }

    // The lines that fit the width. The blank at which a line is broken goes, as Qt would draw it at the line's begin.
    QStringList broken(const QString& text, Qt::LayoutDirection words, int width) const {
        QTextOption option;
        option.setTextDirection(words);
        option.setWrapMode(QTextOption::WordWrap);
        QStringList lines;
        for (const QString& whole : text.split(u'\n')) {
            QTextLayout layout(whole, font());
            layout.setTextOption(option);
            layout.beginLayout();
            for (QTextLine line = layout.createLine(); line.isValid(); line = layout.createLine()) {
                line.setLineWidth(width);
                lines += whole.mid(line.textStart(), line.textLength()).trimmed();
            }
            layout.endLayout();
            if (whole.isEmpty())
                lines += whole;
        }
        return lines;
    }

    // How far the first letter of a line reaches out of the place where the line begins.
    int overhang(const QStringList& lines, Qt::LayoutDirection words) const {
        int out = 0;
        for (const QString& line : lines) {
            const auto first = std::find_if(line.begin(), line.end(), [](QChar sign) { return sign.isPrint(); });
            if (first != line.end())
                out = std::max(out, words == Qt::RightToLeft ? -fontMetrics().rightBearing(*first)
                                                             : -fontMetrics().leftBearing(*first));
        }
        return out;
    }
};

} // namespace

QLabel* makeLabel(QWidget* parent, const char* type) {
    auto* label = new PageLabel(parent);
    label->setProperty("type", QString::fromLatin1(type));
    label->setTextFormat(Qt::PlainText);
    label->setWordWrap(true);
    return label;
}

QLabel* centred(QLabel* label) {
    label->setAlignment(Qt::AlignCenter);
    return label;
}

void keepPlaceWhenHidden(QWidget& widget) {
    QSizePolicy policy = widget.sizePolicy();
    policy.setRetainSizeWhenHidden(true);
    widget.setSizePolicy(policy);
}

void changesSight(QWidget& widget) {
    widget.setProperty("changesSight", true);
}

void setRole(QWidget* widget, const char* role) {
    widget->setProperty("role", QString::fromLatin1(role));
}

void changeRole(QWidget* widget, const char* role) {
    if (widget->property("role") == QString::fromLatin1(role))
        return;
    changeLook(widget, "role", QString::fromLatin1(role));
    if (widget->isVisible())
        tellAlert(*widget);
}

void changeLook(QWidget* widget, const char* property, const QVariant& value) {
    if (widget->property(property) == value)
        return;
    widget->setProperty(property, value);
    widget->setStyleSheet(widget->styleSheet());
}

void setButtonIcon(QAbstractButton* button, const Theme& theme, const QString& icon, QColor colour) {
    const int size = theme.size(IconSize::Button);
    button->setIcon(theme.buttonIcon(icon, size, colour, Theme::Colour::Muted));
    button->setIconSize({size, size});
}

void Maker::add(QBoxLayout& to, std::initializer_list<Item> items) const {
    for (const Item& item : items) {
        if (item.widget)
            to.addWidget(item.widget, item.stretch, item.alignment);
        else if (item.layout)
            to.addLayout(item.layout, item.stretch);
        else if (item.stretch > 0)
            to.addStretch(item.stretch);
        else
            to.addSpacing(m_theme.size(item.space));
    }
}

QHBoxLayout* Maker::inRow(Space gap, std::initializer_list<Item> items) const {
    auto* row = new QHBoxLayout;
    row->setSpacing(m_theme.size(gap));
    add(*row, items);
    return row;
}

QVBoxLayout* Maker::inColumn(Space gap, std::initializer_list<Item> items) const {
    auto* column = new QVBoxLayout;
    column->setSpacing(m_theme.size(gap));
    add(*column, items);
    return column;
}

QBoxLayout* Maker::across(Space gap, std::initializer_list<Item> items, Upright order) const {
    QBoxLayout* line = m_theme.isTall() ? static_cast<QBoxLayout*>(inColumn(gap)) : inRow(gap);
    add(*line, items);
    if (m_theme.isTall() && order == Upright::LastOnTop)
        line->setDirection(QBoxLayout::BottomToTop);
    return line;
}

QGridLayout* Maker::inGrid(Space gap) const {
    auto* grid = new QGridLayout;
    grid->setSpacing(m_theme.size(gap));
    return grid;
}

QWidget* Maker::inBox(QLayout* inside) const {
    auto* box = new QWidget(m_parent);
    inside->setContentsMargins(0, 0, 0, 0);
    box->setLayout(inside);
    return box;
}

QWidget* Maker::leftToRight(QLayout* inside) const {
    QWidget* box = inBox(inside);
    box->setLayoutDirection(Qt::LeftToRight);
    return box;
}

QWidget* Maker::inMiddle(QWidget* inside, int share) const {
    return inBox(inRow(Space::None, {Item::room(), {inside, m_theme.isTall() ? 3 * share : share}, Item::room()}));
}

Card Maker::makeCard(const char* role, Pad pad, Space gap) const {
    auto* frame = new CardFrame(m_parent);
    setRole(frame, role);
    QVBoxLayout* column = inColumn(gap);
    column->setContentsMargins(m_theme.margins(pad));
    frame->setLayout(column);
    return {frame, column};
}

Card Maker::makeSignedCard(const char* role, const QString& icon, QColor colour) const {
    const Card card = makeCard(role, Pad::Normal);
    QVBoxLayout* column = inColumn(Space::Tight);
    card.column->addLayout(inRow(Space::Wide, {{sign(icon, IconSize::Line, colour), 0, Qt::AlignTop}, {column, 1}}));
    return {card.frame, column};
}

QLabel* Maker::words(const char* type, const QString& text) const {
    QLabel* label = makeLabel(m_parent, type);
    label->setText(text);
    return label;
}

QLabel* Maker::oneLine(const char* type) const {
    QLabel* label = makeLabel(m_parent, type);
    label->setWordWrap(false);
    return label;
}

QLabel* Maker::sign(const QString& icon, IconSize size, QColor colour) const {
    auto* label = new QLabel(m_parent);
    label->setPixmap(m_theme.icon(icon, m_theme.size(size), colour));
    return label;
}

QPushButton* Maker::plainButton(const QString& name, const char* role, std::function<void()> clicked) const {
    auto* button = new QPushButton(m_parent);
    setRole(button, role);
    button->setObjectName(name);
    button->setFocusPolicy(Qt::TabFocus);
    QObject::connect(button, &QPushButton::clicked, m_parent, [clicked = std::move(clicked)] { clicked(); });
    return button;
}

} // namespace lumora
