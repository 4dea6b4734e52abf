#include "views/kit/FocusRing.h"

#include <QApplication>
#include <QEvent>
#include <QPainter>
#include <QTimer>

namespace lumora {

using namespace Qt::StringLiterals;

FocusRing::FocusRing(const Theme& theme, QWidget* window)
    : QWidget(window)
    , m_theme(theme) {
    setAttribute(Qt::WA_TransparentForMouseEvents);
    setFocusPolicy(Qt::NoFocus);
    setObjectName(u"focusRing"_s);
    hide();
    qApp->installEventFilter(this);
    connect(qApp, &QApplication::focusChanged, this, [this](QWidget*, QWidget* now) {
        m_target = now;
        follow();
    });
}

bool FocusRing::eventFilter(QObject* watched, QEvent* event) {
    switch (event->type()) {
    case QEvent::KeyPress:
        if (!m_keyboard) {
            m_keyboard = true;
            m_target = QApplication::focusWidget();
            follow();
        }
        break;
    case QEvent::MouseButtonPress:
    case QEvent::TouchBegin:
        if (m_keyboard) {
            m_keyboard = false;
            follow();
        }
        break;
    case QEvent::Move:
    case QEvent::Resize:
    case QEvent::Show:
    case QEvent::Hide:
        if (m_keyboard && m_target && watched->isWidgetType() && watched != this &&
            (watched == m_target || static_cast<QWidget*>(watched)->isAncestorOf(m_target)))
            QTimer::singleShot(0, this, &FocusRing::follow);
        break;
    default:
        break;
    }
    return false;
}

void FocusRing::follow() {
    if (!m_keyboard || !m_target || !m_target->isVisible() || m_target->window() != window() || m_target == window() ||
        m_target->property("ownRing").toBool()) {
        hide();
        return;
    }
    const int around = m_theme.thick() + m_theme.hair();
    QRect seen = m_target->rect().translated(m_target->mapTo(window(), QPoint()));
    for (QWidget* parent = m_target->parentWidget(); parent && parent != window(); parent = parent->parentWidget())
        seen &= parent->rect().translated(parent->mapTo(window(), QPoint()));
    setGeometry(seen.adjusted(-around, -around, around, around));
    raise();
    show();
}

void FocusRing::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const double thick = m_theme.thick();
    painter.setPen(QPen(Qt::white, thick + 2));
    const QRectF ring = QRectF(rect()).adjusted(thick, thick, -thick, -thick);
    painter.drawRoundedRect(ring, m_theme.corner(), m_theme.corner());
    painter.setPen(QPen(Theme::Colour::Focus, thick));
    painter.drawRoundedRect(ring, m_theme.corner(), m_theme.corner());
}

} // namespace lumora
