#include "views/window/StaffPanel.h"

#include "kiosk/StaffCode.h"
#include "session/SessionState.h"
#include "views/kit/KeyRows.h"

#include <QKeyEvent>
#include <QTimer>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

StaffPanel::StaffPanel(const Theme& theme, QWidget* parent, const SessionState& state, StaffCode& code)
    : Overlay(theme, parent)
    , m_state(state)
    , m_code(code)
    , m_dots(centred(oneLine("title")))
    , m_words(centred(words("muted")))
    , m_second(new QTimer(this)) {
    setObjectName(u"staffPanel"_s);
    setLayoutDirection(state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    const auto named = [](QPushButton* button, const QString& text) {
        button->setText(text);
        button->setAccessibleName(text);
        return button;
    };
    const QString title = state.wording(u"כניסת צוות", u"For the staff");
    setAccessibleName(title);
    m_dots->setObjectName(u"staffDots"_s);
    m_words->setObjectName(u"staffWords"_s);
    KeyRows keys;
    for (std::size_t i = 0; i < keys.digits.size(); ++i) {
        const QString digit = QString::number(i);
        keys.digits[i] = toKey(
            named(plainButton(u"staffDigit(%1)"_s.arg(i), "plain", [this, digit] { type(digit); }), digit), theme);
    }
    QPushButton* back = toKey(plainButton(u"staffTakeBack"_s, "plain", [this] { takeBack(); }), theme);
    keys.besideZero[1] = back;
    back->setAccessibleName(state.wording(u"מחק ספרה", u"Take back a digit"));
    setButtonIcon(back, theme, u"backspace"_s, Theme::Colour::Ink);
    add(*column(), {centred(words("large", title)), m_dots, m_words, inMiddle(inDigitRows(*this, theme, keys), 2)});
    QPushButton* cancel = named(plainButton(u"staffCancel"_s, "secondary", [this] { Q_EMIT closed(); }),
                                state.wording(u"ביטול", u"Cancel"));
    m_enter = named(plainButton(u"staffEnter"_s, "main", [this] { give(); }), state.wording(u"כניסה", u"Enter"));
    addButtons(cancel, m_enter);
    whenEscaped([this] { Q_EMIT closed(); });
    connect(m_second, &QTimer::timeout, this, &StaffPanel::render);
    m_second->start(1000);
    render();
}

void StaffPanel::type(const QString& digit) {
    if (m_typed.size() < longestStaffCode)
        m_typed += digit;
    m_told.clear();
    render();
}

void StaffPanel::takeBack() {
    m_typed.chop(1);
    render();
}

void StaffPanel::give() {
    const StaffCode::Answer answer = m_code.give(std::exchange(m_typed, {}));
    if (answer == StaffCode::Answer::Right) {
        Q_EMIT opened();
        return;
    }
    m_told = m_state.wording(u"הקוד אינו נכון", u"This code is not right");
    render();
}

void StaffPanel::render() {
    const int seconds = m_code.secondsToWait();
    m_dots->setText(m_typed.isEmpty() ? QString(QChar(0x2013)) : QString(m_typed.size(), QChar(0x25CF)));
    m_words->setText(seconds > 0 ? m_state
                                       .wording(u"יותר מדי ניסיונות. אפשר לנסות שוב בעוד %1 שניות.",
                                                u"Too many tries. You can try again in %1 seconds.")
                                       .arg(seconds)
                     : m_told.isEmpty() ? m_state.wording(u"נא להקיש את קוד הצוות", u"Type the code of the staff")
                                        : m_told);
    m_enter->setEnabled(seconds == 0 && !m_typed.isEmpty());
}

void StaffPanel::keyPressEvent(QKeyEvent* event) {
    if (event->key() >= Qt::Key_0 && event->key() <= Qt::Key_9)
        type(QString::number(event->key() - Qt::Key_0));
    else if (event->key() == Qt::Key_Backspace)
        takeBack();
    else
        Overlay::keyPressEvent(event);
}

} // namespace lumora
