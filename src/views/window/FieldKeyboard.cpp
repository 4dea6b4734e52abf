#include "views/window/FieldKeyboard.h"

#include "editing/caption/KeyLayout.h"
#include "session/SessionState.h"
#include "session/lab/MailDomains.h"
#include "views/kit/EditableCombo.h"
#include "views/kit/FingerMoves.h"
#include "views/kit/LiftedStack.h"
#include "views/kit/Overlay.h"
#include "views/kit/TouchKeyboard.h"

#include <QAbstractScrollArea>
#include <QApplication>
#include <QLineEdit>
#include <QMouseEvent>
#include <QPlainTextEdit>
#include <QTextEdit>
#include <QTimer>

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The field that the widget is, or is a part of; null where text can't be typed by anybody's touch.
QWidget* fieldOf(QWidget* widget) {
    if (auto* box = qobject_cast<QComboBox*>(widget))
        widget = box->lineEdit();
    if (widget && qobject_cast<QAbstractScrollArea*>(widget->parentWidget()))
        widget = widget->parentWidget();
    if (!widget || !widget->isEnabled() || !widget->isVisible() || widget->property("ownKeys").toBool())
        return nullptr;
    if (const auto* line = qobject_cast<QLineEdit*>(widget))
        return line->isReadOnly() || line->echoMode() != QLineEdit::Normal ? nullptr : widget;
    if (const auto* plain = qobject_cast<QPlainTextEdit*>(widget))
        return plain->isReadOnly() ? nullptr : widget;
    if (const auto* rich = qobject_cast<QTextEdit*>(widget))
        return rich->isReadOnly() ? nullptr : widget;
    return nullptr;
}

QComboBox* boxOf(const QWidget& field) {
    return qobject_cast<QComboBox*>(field.parentWidget());
}

// What stands before the cursor.
QString textBefore(const QWidget& field) {
    if (const auto* line = qobject_cast<const QLineEdit*>(&field))
        return line->text().left(line->hasSelectedText() ? line->selectionStart() : line->cursorPosition());
    if (const auto* plain = qobject_cast<const QPlainTextEdit*>(&field))
        return plain->toPlainText().left(plain->textCursor().selectionStart());
    const auto& rich = static_cast<const QTextEdit&>(field);
    return rich.toPlainText().left(rich.textCursor().selectionStart());
}

// The letters of the caption's keyboard; its keys without a letter have what names and addresses need.
QString letterKeys(KeyLayout::Letters letters, const QString& others) {
    QString keys;
    qsizetype other = 0;
    for (const int place : KeyLayout::places()) {
        const QString letter = KeyLayout::caption(place, letters);
        keys += letter == u" "_s || letter.isEmpty() ? others.mid(other++, 1) : letter;
    }
    return keys;
}

} // namespace

FieldKeyboard::FieldKeyboard(QWidget& window, const Theme& theme, const SessionState& state)
    : QObject(&window)
    , m_window(window)
    , m_theme(theme)
    , m_state(state) {
    qApp->installEventFilter(this);
    connect(qApp, &QApplication::focusChanged, this, &FieldKeyboard::lookSoon);
}

void FieldKeyboard::forget() {
    sink();
    delete std::exchange(m_keys, nullptr);
}

bool FieldKeyboard::eventFilter(QObject* watched, QEvent* event) {
    auto* widget = qobject_cast<QWidget*>(watched);
    if (!widget || widget->window() != &m_window || m_state.screenKeys == ScreenKeys::Never)
        return false;
    switch (event->type()) {
    case QEvent::MouseButtonRelease:
        if (m_state.screenKeys == ScreenKeys::Always || isTouch(static_cast<const QMouseEvent&>(*event)))
            m_touched = fieldOf(widget);
        lookSoon();
        break;
    case QEvent::KeyPress:
        sink();
        break;
    case QEvent::LayoutDirectionChange:
        // The page has turned its language below the keys.
        if (m_field && widget->isAncestorOf(m_field))
            setUp();
        break;
    default:
        break;
    }
    return false;
}

// At the end of the event, when the focus is where it will be.
void FieldKeyboard::lookSoon() {
    if (!std::exchange(m_waits, true))
        QTimer::singleShot(0, this, &FieldKeyboard::look);
}

void FieldKeyboard::look() {
    m_waits = false;
    if (QGuiApplication::mouseButtons() != Qt::NoButton)
        return; // what is pressed must not move away below the finger
    QWidget* const touched = std::exchange(m_touched, nullptr);
    QWidget* const field = fieldOf(m_window.focusWidget());
    if (field && field == touched)
        rise(*field);
    else if (!field || field != m_field)
        sink();
}

void FieldKeyboard::make() {
    m_keys = new TouchKeyboard(
        m_theme, &m_window,
        {letterKeys(KeyLayout::Letters::Hebrew, u"'\u05F4"_s), letterKeys(KeyLayout::Letters::Small, u"'_?"_s)});
    connect(m_keys, &TouchKeyboard::typed, this, &FieldKeyboard::type);
    connect(m_keys, &TouchKeyboard::back, this, &FieldKeyboard::takeBack);
    connect(m_keys, &TouchKeyboard::next, this, &FieldKeyboard::goOn);
    connect(m_keys, &TouchKeyboard::done, this, &FieldKeyboard::sink);
    connect(m_keys, &TouchKeyboard::offered, this, &FieldKeyboard::takeOffer);
    connect(m_keys, &TouchKeyboard::lettersChosen, this, &FieldKeyboard::capitalise);
}

void FieldKeyboard::rise(QWidget& field) {
    if (!m_keys)
        make();
    if (m_field != &field) {
        m_field = &field;
        // A finger beside a text of the other direction would come before it.
        if (auto* line = qobject_cast<QLineEdit*>(&field); line && !line->hasSelectedText())
            line->end(false);
        setUp();
    }
    place();
    m_keys->raise();
    m_keys->show();
}

void FieldKeyboard::sink() {
    m_field = nullptr;
    if (!m_keys || m_keys->isHidden())
        return;
    lift(nullptr, 0);
    m_keys->hide();
}

void FieldKeyboard::setUp() {
    const auto say = [this](const char16_t* hebrew, const char16_t* english) {
        return m_state.wording(hebrew, english);
    };
    m_keys->setLayoutDirection(m_state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    m_keys->setWords({say(u"מחק את האות האחרונה", u"Take back the last letter"), say(u"הבא", u"Next"),
                      say(u"סיום", u"Done"), say(u"רווח", u"Space"), say(u"אותיות גדולות", u"Capitals"), u"עברית"_s,
                      u"English"_s});
    const Qt::InputMethodHints hints = m_field->inputMethodHints();
    const bool digits = hints & (Qt::ImhDialableCharactersOnly | Qt::ImhDigitsOnly | Qt::ImhFormattedNumbersOnly);
    const bool mail = hints & Qt::ImhEmailCharactersOnly;
    m_keys->setPanel(digits ? TouchKeyboard::Panel::Digits : TouchKeyboard::Panel::Letters);
    m_keys->setLetters(m_state.english() || mail ? TouchKeyboard::Letters::Latin : TouchKeyboard::Letters::Hebrew);
    m_keys->setOffers(mail ? mailDomains() : QStringList());
    m_keys->setNext(nextField() != nullptr);
    capitalise();
}

// The first letter of a word is a large one, but for an address.
void FieldKeyboard::capitalise() {
    if (!m_field) // its page may go while a key is held
        return;
    const QString before = textBefore(*m_field);
    m_keys->setCapitals(!(m_field->inputMethodHints() & Qt::ImhEmailCharactersOnly) &&
                        (before.isEmpty() || before.back().isSpace()));
}

void FieldKeyboard::place() {
    if (!m_field)
        return;
    m_keys->layout()->activate();
    const int height = m_keys->sizeHint().height();
    m_keys->setGeometry(0, m_window.height() - height, m_window.width(), height);
    QWidget* part = m_field;
    while (part->parentWidget() != &m_window)
        part = part->parentWidget();
    const int lowest = m_field->mapTo(part, QPoint(0, m_field->height())).y() + m_theme.gap();
    lift(part, std::clamp(lowest - m_keys->y(), 0, height));
}

void FieldKeyboard::lift(QWidget* part, int pixels) {
    auto& pages = static_cast<LiftedStack&>(*m_window.layout());
    if (m_lifted && m_lifted != part && pages.indexOf(m_lifted) < 0)
        m_lifted->move(0, 0);
    const bool page = part && pages.indexOf(part) >= 0;
    pages.lift(page ? pixels : 0);
    if (part && !page)
        part->move(0, -pixels);
    m_lifted = part;
}

void FieldKeyboard::type(const QString& text) {
    const QPointer<QWidget> field = m_field;
    if (!field)
        return;
    if (text == u"@"_s && domainBoxOf(*field)) {
        goOn();
        return;
    }
    if (auto* line = qobject_cast<QLineEdit*>(field))
        line->insert(text);
    else if (auto* plain = qobject_cast<QPlainTextEdit*>(field))
        plain->insertPlainText(text);
    else
        static_cast<QTextEdit&>(*field).insertPlainText(text);
    if (m_field)
        capitalise();
}

void FieldKeyboard::takeBack() {
    if (auto* line = qobject_cast<QLineEdit*>(m_field))
        line->backspace();
    else if (auto* plain = qobject_cast<QPlainTextEdit*>(m_field))
        plain->textCursor().deletePreviousChar();
    else if (auto* rich = qobject_cast<QTextEdit*>(m_field))
        rich->textCursor().deletePreviousChar();
    if (m_field)
        capitalise();
}

// The next field of the same page or panel in the order of the Tab key.
QWidget* FieldKeyboard::nextField() const {
    QWidget* const from = boxOf(*m_field) ? boxOf(*m_field) : m_field.data();
    const Overlay* front = frontOverlay(m_window);
    for (QWidget* at = from->nextInFocusChain(); at != &m_window && at != from; at = at->nextInFocusChain()) {
        QWidget* field = at->focusPolicy() & Qt::TabFocus ? fieldOf(at) : nullptr;
        if (field && field != m_field && (!front || front->isAncestorOf(field)))
            return field;
    }
    return nullptr;
}

void FieldKeyboard::goOn() {
    QWidget* next = m_field ? nextField() : nullptr;
    if (!next)
        return;
    (boxOf(*next) ? boxOf(*next) : next)->setFocus(Qt::OtherFocusReason);
    rise(*next);
}

void FieldKeyboard::takeOffer(const QString& text) {
    if (!m_field)
        return;
    QComboBox* box = boxOf(*m_field) ? boxOf(*m_field) : domainBoxOf(*m_field);
    if (box) {
        const int row = box->findText(text);
        box->setCurrentIndex(row);
        Q_EMIT box->activated(row);
    } else if (auto* line = qobject_cast<QLineEdit*>(m_field)) {
        const QString name = line->text().section(u'@', 0, 0);
        line->selectAll();
        line->insert(name + u'@' + text);
    }
}

} // namespace lumora
