#include "views/kit/Overlay.h"

#include "views/kit/Keyboard.h"
#include "views/kit/ScreenReader.h"
#include "views/kit/Scroller.h"

#include <QApplication>
#include <QEvent>
#include <QFrame>
#include <QKeyEvent>
#include <QPainter>
#include <QPushButton>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

Overlay::Overlay(const Theme& theme, QWidget* parent, std::initializer_list<Item> items)
    : QWidget(parent)
    , Maker(theme, this)
    , m_theme(theme) {
    hide();
    changesSight(*this);
    const Card card = makeCard("card", Pad::Wide, Space::Wide);
    m_card = card.frame;
    m_column = card.column;
    if (theme.scrolls()) {
        m_column = inColumn(Space::Wide);
        card.column->addWidget(inScroller(inBox(m_column), m_card));
        m_column->parentWidget()->installEventFilter(this);
    }
    add(*m_column, items);
    setFocusPolicy(Qt::StrongFocus);
    parent->installEventFilter(this);
}

void Overlay::addRow(std::initializer_list<Item> items, Space gap) const {
    m_column->addLayout(inRow(gap, items));
}

void Overlay::addButtons(QWidget* back, QWidget* main, First first) {
    addRow({back, Item::room(), main});
    setFirstFocus(first == First::Main ? main : back);
}

void Overlay::addButton(QWidget* only, Qt::Alignment side) {
    m_column->addWidget(only, 0, side);
    setFirstFocus(only);
}

void Overlay::whenEscaped(std::function<void()> handler) {
    connect(this, &Overlay::escaped, this, [handler = std::move(handler)] { handler(); });
}

void Overlay::setWidth(Width width) {
    m_width = width;
    place();
}

void Overlay::setFilling() {
    m_filling = true;
    place();
}

void Overlay::dismiss() {
    setOpen(false);
    deleteLater();
}

void Overlay::setOpen(bool open) {
    if (m_open == open)
        return;
    m_open = open;
    window()->update();
    if (open) {
        m_before = QApplication::focusWidget();
        setGeometry(parentWidget()->rect());
        show();
        raise();
        place();
        tellAlert(*this);
        (m_firstFocus ? m_firstFocus.data() : this)->setFocus(Qt::OtherFocusReason);
    } else {
        const bool hadFocus = isAncestorOf(QApplication::focusWidget()) || QApplication::focusWidget() == this;
        hide();
        if (hadFocus && m_before)
            m_before->setFocus(Qt::OtherFocusReason);
    }
}

void Overlay::setReveal(double share) {
    share = std::min(share, 1.0);
    if (m_reveal == share)
        return;
    m_reveal = share;
    cutCard();
}

void Overlay::cutCard() {
    if (m_reveal >= 1) {
        m_card->clearMask();
        return;
    }
    const int open = static_cast<int>(m_card->width() * m_reveal);
    m_card->setMask(QRegion((m_card->width() - open) / 2, 0, open, m_card->height()));
}

void Overlay::place() {
    const int room = m_theme.margin();
    const QSize available = size() - QSize(2 * room, 2 * room);
    QSize wanted = available;
    if (!m_filling) {
        static constexpr int widths[] = {640, 780, 920}; // of a 1024 by 768 window
        const int width = std::min(m_theme.px(widths[static_cast<int>(m_width)]), available.width());
        // A scroller has no height of its own: it takes that of what it holds.
        QWidget& inside = *m_column->parentWidget();
        const QMargins around =
            &inside == m_card ? QMargins() : m_card->layout()->contentsMargins() + m_card->contentsMargins();
        const int inner = width - around.left() - around.right();
        int height = m_column->hasHeightForWidth() ? m_column->totalHeightForWidth(inner) : inside.sizeHint().height();
        height = std::max(height, inside.minimumSizeHint().height()) + around.top() + around.bottom();
        wanted = {width, std::min(height, available.height())};
    }
    m_card->setGeometry((width() - wanted.width()) / 2, (height() - wanted.height()) / 2, wanted.width(),
                        wanted.height());
    cutCard();
}

bool Overlay::eventFilter(QObject* watched, QEvent* event) {
    if (watched == parentWidget() && event->type() == QEvent::Resize && m_open)
        setGeometry(parentWidget()->rect());
    if (watched == m_column->parentWidget() && event->type() == QEvent::LayoutRequest)
        place();
    return QWidget::eventFilter(watched, event);
}

bool Overlay::event(QEvent* event) {
    if (event->type() == QEvent::LayoutRequest)
        place();
    return QWidget::event(event);
}

void Overlay::resizeEvent(QResizeEvent*) {
    place();
}

bool Overlay::focusNextPrevChild(bool next) {
    // The keyboard goes round inside the panel.
    QWidget* from = QApplication::focusWidget();
    QWidget* at = from ? from : this;
    for (int i = 0; i < 1000; ++i) {
        at = next ? at->nextInFocusChain() : at->previousInFocusChain();
        if (at == from)
            return true;
        // The box inside a combo box hands the keyboard back to it.
        if (at != this && isAncestorOf(at) && !at->focusProxy() && at->isVisible() && at->isEnabled() &&
            (at->focusPolicy() & Qt::TabFocus)) {
            at->setFocus(next ? Qt::TabFocusReason : Qt::BacktabFocusReason);
            if (auto* scroller = m_card->findChild<QScrollArea*>({}, Qt::FindDirectChildrenOnly))
                scroller->ensureWidgetVisible(at);
            return true;
        }
    }
    return true;
}

void Overlay::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Escape) {
        Q_EMIT escaped();
        event->accept();
        return;
    }
    QWidget* focus = QApplication::focusWidget();
    if (!isAncestorOf(focus))
        focus = nullptr; // Enter in a list has opened another page, and presses nothing there
    if (!pressByEnter(*event, focus) && endsTyping(*event, focus))
        pressMain();
    event->accept(); // nothing of the page below answers meanwhile
}

void Overlay::pressMain() {
    for (auto* button : m_card->findChildren<QPushButton*>()) {
        if (button->property("role") == u"main"_s && button->isVisible() && button->isEnabled())
            return button->click();
    }
}

void Overlay::mousePressEvent(QMouseEvent* event) {
    event->accept();
}

void Overlay::paintEvent(QPaintEvent*) {
    // One veil, however many panels lie one above the other.
    if (frontOverlay(*window()) == this)
        QPainter(this).fillRect(rect(), Theme::Colour::Veil);
}

Overlay* frontOverlay(const QWidget& root) {
    // A panel of the window itself lies above those of a page; among those of one parent the last child is in front.
    const auto height = [&](const Overlay& overlay) {
        return std::pair(overlay.parentWidget() == &root, overlay.parentWidget()->children().indexOf(&overlay));
    };
    Overlay* front = nullptr;
    for (Overlay* overlay : root.findChildren<Overlay*>()) {
        if (overlay->isOpen() && overlay->isVisible() && (!front || height(*front) < height(*overlay)))
            front = overlay;
    }
    return front;
}

void giveFocus(QWidget& widget) {
    Overlay* front = frontOverlay(*widget.window());
    if (front && !front->isAncestorOf(&widget))
        front->setFocusBehind(&widget);
    else
        widget.setFocus(Qt::OtherFocusReason);
}

} // namespace lumora
