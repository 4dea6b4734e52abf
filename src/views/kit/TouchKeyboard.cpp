#include "views/kit/TouchKeyboard.h"

#include "views/kit/KeyRows.h"

#include <QStackedLayout>
#include <QTouchEvent>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int offersInRow = 6;

} // namespace

TouchKeyboard::TouchKeyboard(const Theme& theme, QWidget* parent, Layouts layouts)
    : QFrame(parent)
    , Maker(theme, this)
    , m_theme(theme)
    , m_layouts(std::move(layouts)) {
    setObjectName(u"keyboard"_s);
    setRole(this, "panel");
    setAttribute(Qt::WA_StyledBackground);
    setAttribute(Qt::WA_AcceptTouchEvents);
    changesSight(*this);
    hide();
    m_offerGrid = inGrid(Space::Tight);
    m_offers = leftToRight(m_offerGrid);
    auto* panels = new QWidget(this);
    m_panels = new QStackedLayout(panels);
    m_panels->addWidget(makeLetters());
    m_panels->addWidget(makeDigits());
    setLayout(inColumn(Space::Tight, {m_offers, panels}));
    layout()->setContentsMargins(theme.margins(Pad::Slim));
    relabel();
}

QPushButton* TouchKeyboard::key(const QString& types) {
    QPushButton* made = wordKey({}, [] {});
    setRole(made, "key");
    made->setProperty("letterOfAnyLanguage", true);
    name(*made, types);
    connect(made, &QPushButton::clicked, this, [this, made] { Q_EMIT typed(made->text()); });
    return made;
}

void TouchKeyboard::name(QPushButton& key, const QString& types) {
    key.setText(types);
    key.setAccessibleName(types);
    key.setObjectName(u"key(%1)"_s.arg(types));
}

QPushButton* TouchKeyboard::wordKey(const QString& name, std::function<void()> pressed) {
    QPushButton* made = plainButton(name, "quiet", std::move(pressed));
    made->setFocusPolicy(Qt::NoFocus);
    return toKey(made, m_theme);
}

void TouchKeyboard::addEditing(KeyRows& keys) {
    keys.back = wordKey(u"keyBack"_s, [this] { Q_EMIT back(); });
    setRole(keys.back, "key");
    setButtonIcon(keys.back, m_theme, u"backspace"_s, Theme::Colour::Ink);
    keys.back->setAutoRepeat(true);
    keys.enter = wordKey(u"keyNext"_s, [this] { Q_EMIT next(); });
    for (std::size_t digit = 0; digit < keys.digits.size(); ++digit)
        keys.digits[digit] = key(QString::number(digit));
    QPushButton* made = wordKey(u"keyDone"_s, [this] { Q_EMIT done(); });
    setRole(made, "done");
    keys.bottom.push_back({made, 2});
    m_back.push_back(keys.back);
    m_next.push_back(keys.enter);
    m_done.push_back(made);
}

QWidget* TouchKeyboard::makeLetters() {
    KeyRows keys;
    for (int at = 0; at < letterKeys; ++at)
        keys.letters.push_back(key({}));
    m_letterKeys = keys.letters;
    m_otherLetters = wordKey(u"keyLetters"_s, [this] {
        setLetters(m_letters == Letters::Hebrew ? Letters::Latin : Letters::Hebrew);
        Q_EMIT lettersChosen();
    });
    m_otherLetters->setProperty("letterOfAnyLanguage", true);
    m_capitalKey = wordKey(u"keyCapitals"_s, [this] { setCapitals(!m_capitals); });
    m_capitalKey->setCheckable(true);
    m_space = wordKey(u"keySpace"_s, [this] { Q_EMIT typed(u" "_s); });
    keys.bottom = {{m_otherLetters, 2}, {m_capitalKey, 2}, {key(u"@"_s), 1}, {m_space, 3}, {key(u"."_s), 1}};
    keys.besideZero = {key(u"-"_s), key(u"/"_s)};
    addEditing(keys);
    return inKeyRows(*this, m_theme, keys);
}

QWidget* TouchKeyboard::makeDigits() {
    KeyRows keys;
    keys.besideZero = {key(u"+"_s), key(u"-"_s)};
    addEditing(keys);
    return inMiddle(inDigitRows(*this, m_theme, keys), 2);
}

void TouchKeyboard::setWords(const Words& words) {
    m_words = words;
    for (QPushButton* made : m_back)
        made->setAccessibleName(words.back);
    for (QPushButton* made : m_next)
        made->setText(words.next);
    for (QPushButton* made : m_done)
        made->setText(words.done);
    m_space->setText(words.space);
    m_capitalKey->setText(words.capitals);
    relabel();
}

void TouchKeyboard::setPanel(Panel panel) {
    m_panels->setCurrentIndex(static_cast<int>(panel));
}

void TouchKeyboard::setLetters(Letters letters) {
    m_letters = letters;
    m_capitals = false;
    relabel();
}

void TouchKeyboard::setCapitals(bool on) {
    m_capitals = on && m_letters == Letters::Latin;
    relabel();
}

void TouchKeyboard::setOffers(const QStringList& texts) {
    while (QLayoutItem* item = m_offerGrid->takeAt(0)) {
        item->widget()->hide();
        item->widget()->deleteLater();
        delete item;
    }
    for (int at = 0; at < texts.size(); ++at) {
        const QString& text = texts[at];
        QPushButton* made = wordKey(u"key(%1)"_s.arg(text), [this, text] { Q_EMIT offered(text); });
        made->setText(text);
        m_offerGrid->addWidget(made, at / offersInRow, at % offersInRow);
    }
    m_offers->setVisible(!texts.isEmpty());
}

void TouchKeyboard::setNext(bool there) {
    for (QPushButton* made : m_next)
        made->setEnabled(there);
}

bool TouchKeyboard::has(const QWidget& widget) {
    const QWidget* parent = &widget;
    while (parent && !qobject_cast<const TouchKeyboard*>(parent))
        parent = parent->parentWidget();
    return parent != nullptr;
}

bool TouchKeyboard::event(QEvent* event) {
    switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
        follow(static_cast<const QTouchEvent&>(*event));
        event->accept();
        return true;
    case QEvent::Hide:
    case QEvent::TouchCancel:
        for (const auto& [finger, key] : std::exchange(m_held, {})) {
            if (key)
                key->setDown(false);
        }
        break;
    default:
        break;
    }
    return QFrame::event(event);
}

// Of two fingers the mouse would follow the first alone, and who types fast has the second one down by then.
void TouchKeyboard::follow(const QTouchEvent& touch) {
    for (const QEventPoint& point : touch.points()) {
        const QPoint at = point.position().toPoint();
        if (point.state() == QEventPoint::Pressed) {
            auto* key = qobject_cast<QPushButton*>(childAt(at));
            if (key && key->isEnabled())
                (m_held[point.id()] = key)->setDown(true);
        } else if (point.state() == QEventPoint::Released) {
            const auto held = m_held.extract(point.id());
            QPushButton* key = held ? held.mapped().data() : nullptr;
            if (!key)
                continue;
            key->setDown(false);
            if (childAt(at) == key)
                key->click();
        }
    }
}

void TouchKeyboard::relabel() {
    const bool hebrew = m_letters == Letters::Hebrew;
    for (std::size_t at = 0; at < m_letterKeys.size(); ++at) {
        const QChar small = (hebrew ? m_layouts.hebrew : m_layouts.latin)[static_cast<qsizetype>(at)];
        name(*m_letterKeys[at], m_capitals ? small.toUpper() : small);
    }
    m_otherLetters->setText(hebrew ? m_words.latin : m_words.hebrew);
    m_capitalKey->setEnabled(!hebrew);
    m_capitalKey->setChecked(m_capitals);
}

} // namespace lumora
