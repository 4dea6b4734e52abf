#include "views/mikledet/mikledetView.h"

#include "views/kit/CaptionField.h"
#include "views/kit/HoldButton.h"
#include "views/kit/Keyboard.h"
#include "views/kit/PaletteBar.h"

#include <QApplication>
#include <QCheckBox>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QPushButton>
#include <QStackedLayout>
#include <QVBoxLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

mikledetView::mikledetView(mikledet& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page)
    , m_shows(page.controls()) {
    setRole(this, "panel");
    auto* column = frame().content();
    column->setContentsMargins(theme.px(14), theme.px(8), theme.px(14), theme.px(8));
    column->setSpacing(theme.px(6));
    column->addLayout(makeTextRow());
    auto* row = new QWidget(this);
    m_row = new QStackedLayout(row);
    m_row->addWidget(makeAppearance());
    m_row->addWidget(makeSymbols());
    column->addWidget(row);
    column->addWidget(makeKeys());

    bindHidden(u"Title"_s, m_shows.Title);
    bindList(u"Combo1"_s, m_shows.Combo1List);
    bindHidden(u"Command10"_s, m_shows.Command10);
    bindHidden(u"Command13"_s, m_shows.Command13);
    bindHidden(u"Command14"_s, m_shows.Command14);
    start();
}

QPushButton* mikledetView::toKey(QPushButton* made) {
    setRole(made, made->property("role") == u"quiet"_s ? "wordKey" : "key");
    made->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    made->setFixedHeight(std::max(44, theme().px(50)));
    return made;
}

QPushButton* mikledetView::key(int number) {
    mikledet& page = m_page;
    auto* made = toKey(button(numbered("leter", number), m_shows.leter[static_cast<std::size_t>(number)], Role::Plain,
                              [&page, number] { page.leter_Click(number); }));
    made->setProperty("letterOfAnyLanguage", true);
    m_keys[static_cast<std::size_t>(number)] = made;
    return made;
}

template <class Down, class Up>
QPushButton* mikledetView::holdButton(const QString& name, const Caption& caption, const QString& icon, Down down,
                                      Up up) {
    mikledet& page = m_page;
    auto* made = new HoldButton({down, [&page] { page.tickOnceIfNone(); }, up}, this);
    setRole(made, "round");
    setIcon(made, icon, Theme::Colour::Ink);
    bind(name, made, caption);
    return made;
}

QLayout* mikledetView::makeTextRow() {
    mikledet& page = m_page;
    auto* row = new QHBoxLayout;
    row->setSpacing(theme().px(10));
    m_text = new CaptionField(
        {[&page](QChar character) { page.KeyPress(character); }, [&page] { page.Command6_Click(); }}, this);
    bind(u"Text1"_s, m_text, [this] { return m_shows.Text1.text; });
    row->addWidget(m_text, 1);
    row->addWidget(checkBox(u"Check4"_s, m_shows.Check4, [&page](bool on) { page.Check4_Click(on); }));
    row->addWidget(button(
        u"Command8"_s, m_shows.Command8, Role::Quiet, [&page] { page.Command8_Click(); }, u"trash"_s));
    auto* done = button(u"CommandDone"_s, m_shows.CommandDone, Role::Plain, [&page] { page.CommandDone_Click(); });
    setRole(done, "done");
    setIcon(done, u"tick"_s, Qt::white);
    row->addWidget(done);
    return row;
}

QWidget* mikledetView::makeAppearance() {
    mikledet& page = m_page;
    auto* box = new QWidget(this);
    auto* row = new QHBoxLayout(box);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(theme().px(4));
    const auto gap = [&] { row->addSpacing(theme().px(10)); };

    row->addWidget(holdButton(
        u"Image1"_s, m_shows.Image1, u"letter-larger"_s, [&page] { page.Image1_MouseDown(); },
        [&page] { page.Image1_MouseUp(); }));
    row->addWidget(holdButton(
        u"Image2"_s, m_shows.Image2, u"letter-smaller"_s, [&page] { page.Image2_MouseDown(); },
        [&page] { page.Image2_MouseUp(); }));
    gap();
    // The arrows stand as they point, in both languages.
    auto* arrows = new QWidget(box);
    arrows->setLayoutDirection(Qt::LeftToRight);
    auto* arrowRow = new QHBoxLayout(arrows);
    arrowRow->setContentsMargins(0, 0, 0, 0);
    arrowRow->setSpacing(theme().px(4));
    static constexpr const char* icons[] = {"arrow-left", "arrow-right", "arrow-up", "arrow-down"};
    for (const int direction : {0, 2, 3, 1})
        arrowRow->addWidget(holdButton(
            numbered("Image15", direction), m_shows.Image15[static_cast<std::size_t>(direction)],
            QString::fromLatin1(icons[direction]), [&page, direction] { page.Image15_MouseDown(direction); },
            [&page] { page.Image15_MouseUp(); }));
    row->addWidget(arrows);
    gap();
    const auto toRound = [](QPushButton* made) {
        setRole(made, "round");
        return made;
    };
    m_style = toRound(button(
        u"Image3"_s, m_shows.Image3, Role::Plain, [&page] { page.Image3_Click(); }, u"letter-regular"_s));
    row->addWidget(m_style);
    m_direction = toRound(button(
        u"Image4"_s, m_shows.Image4, Role::Plain, [&page] { page.Image4_Click(); }, u"text-across"_s));
    row->addWidget(m_direction);
    gap();
    auto* anchors = new QWidget(box);
    anchors->setLayoutDirection(Qt::LeftToRight);
    auto* anchorRow = new QHBoxLayout(anchors);
    anchorRow->setContentsMargins(0, 0, 0, 0);
    anchorRow->setSpacing(theme().px(4));
    static constexpr const char* anchorIcons[] = {"anchor-near", "anchor-centre", "anchor-far"};
    for (int alignment = 0; alignment < 3; ++alignment) {
        auto* made = new QPushButton(anchors);
        setRole(made, "round");
        made->setFocusPolicy(Qt::TabFocus);
        setIcon(made, QString::fromLatin1(anchorIcons[alignment]), Theme::Colour::Ink);
        bindChoice(numbered("Image5", alignment), made, m_shows.Image5[static_cast<std::size_t>(alignment)],
                   [&page, alignment] { page.Image5_Click(alignment); });
        anchorRow->addWidget(made);
    }
    row->addWidget(anchors);
    gap();
    m_palette = new PaletteBar(
        theme(), [&page](QPoint at) { page.Picture18_MouseDown(at); }, box);
    bind(u"Picture18"_s, m_palette, m_shows.Picture18);
    row->addWidget(m_palette, 1);
    return box;
}

QWidget* mikledetView::makeSymbols() {
    auto* box = new QWidget(this);
    box->setLayoutDirection(Qt::LeftToRight);
    auto* row = new QHBoxLayout(box);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(theme().px(4));
    for (int i = 0; i < KeyLayout::symbolKeys; ++i)
        row->addWidget(key(KeyLayout::firstSymbol + i));
    bind(u"Frame1"_s, box, [] { return QString(); });
    return box;
}

// The keys lie as on a real keyboard, whose letters run from left to right in both languages.
QWidget* mikledetView::makeKeys() {
    mikledet& page = m_page;
    auto* box = new QWidget(this);
    box->setLayoutDirection(Qt::LeftToRight);
    auto* grid = new QGridLayout(box);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setSpacing(theme().px(6));
    constexpr int keyColumns = KeyLayout::columns;
    const auto places = KeyLayout::places();
    for (int at = 0; at < KeyLayout::letterKeys; ++at)
        grid->addWidget(key(places[static_cast<std::size_t>(at)]), at / keyColumns, at % keyColumns);

    auto* back = toKey(button(
        u"Command3"_s, m_shows.Command3, Role::Plain, [&page] { page.Command3_Click(); }, u"backspace"_s));
    grid->addWidget(back, 0, keyColumns);
    auto* enter = toKey(button(
        u"Command7"_s, m_shows.Command7, Role::Quiet, [&page] { page.Command7_Click(); }, u"enter"_s));
    enter->setMaximumHeight(QWIDGETSIZE_MAX);
    enter->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
    grid->addWidget(enter, 1, keyColumns, 2, 1);

    // As on a telephone.
    constexpr int digits = keyColumns + 2;
    for (int digit = 1; digit <= 9; ++digit)
        grid->addWidget(key(KeyLayout::firstDigit + digit), (digit - 1) / 3, digits + (digit - 1) % 3);
    grid->addWidget(key(KeyLayout::firstDigit), 3, digits, 1, 3);

    const auto letters = [&](const char* name, const CheckCaption& caption, std::function<void()> clicked) {
        auto* made = new QPushButton(box);
        made->setFocusPolicy(Qt::TabFocus);
        made->setProperty("letterOfAnyLanguage", true);
        bindChoice(QString::fromLatin1(name), made, caption, std::move(clicked));
        return toKey(made);
    };
    grid->addWidget(letters("Command4", m_shows.Command4, [&page] { page.Command4_Click(); }), 3, 0);
    grid->addWidget(letters("Command9", m_shows.Command9, [&page] { page.Command9_Click(); }), 3, 1);
    grid->addWidget(letters("Command2", m_shows.Command2, [&page] { page.Command2_Click(); }), 3, 2);
    m_more = toKey(button(u"Command5"_s, m_shows.Command5, Role::Quiet, [&page] { page.Command5_Click(); }));
    grid->addWidget(m_more, 3, 3);
    auto* space = toKey(button(u"Command1"_s, m_shows.Command1, Role::Quiet, [&page] { page.Command1_Click(); }));
    grid->addWidget(space, 3, 4, 1, 4);
    auto* clear = toKey(button(u"Command6"_s, m_shows.Command6, Role::Quiet, [&page] { page.Command6_Click(); }));
    grid->addWidget(clear, 3, 8, 1, 3);

    for (int i = 0; i < keyColumns; ++i)
        grid->setColumnStretch(i, 10);
    grid->setColumnStretch(keyColumns, 14);
    grid->setColumnMinimumWidth(keyColumns + 1, theme().px(8));
    for (int i = 0; i < 3; ++i)
        grid->setColumnStretch(digits + i, 10);
    return box;
}

QWidget* mikledetView::firstFocus() const {
    return m_text;
}

void mikledetView::escape() {
    m_page.CommandDone_Click();
}

void mikledetView::keyPressEvent(QKeyEvent* event) {
    if (!pressByEnter(*event, QApplication::focusWidget()) && !m_text->take(*event))
        PageView::keyPressEvent(event);
}

void mikledetView::sayAll() {
    speak(this, m_shows.Title.text);
    speak(m_text, m_shows.words.text);
    const std::pair<const char*, const Caption*> images[] = {
        {"Command3", &m_shows.Command3}, {"Image1", &m_shows.Image1}, {"Image2", &m_shows.Image2},
        {"Image3", &m_shows.Image3},     {"Image4", &m_shows.Image4}, {"Picture18", &m_shows.Picture18}};
    for (const auto& [name, caption] : images)
        speak(control(QString::fromLatin1(name))->widget, caption->hint);
    for (int i = 0; i < 4; ++i)
        speak(control(numbered("Image15", i))->widget, m_shows.Image15[static_cast<std::size_t>(i)].hint);
    for (int i = 0; i < 3; ++i)
        speak(control(numbered("Image5", i))->widget, m_shows.Image5[static_cast<std::size_t>(i)].hint);
    speak(control(u"Command4"_s)->widget, m_shows.words.hebrewLetters);
    speak(control(u"Command9"_s)->widget, m_shows.words.smallLetters);
    speak(control(u"Command2"_s)->widget, m_shows.words.capitalLetters);
}

void mikledetView::showIcon(QPushButton* button, const QString& icon) {
    if (button->property("shownIcon") == icon)
        return; // a button that is given its icon again paints itself again
    button->setProperty("shownIcon", icon);
    setIcon(button, icon, Theme::Colour::Ink);
}

void mikledetView::render() {
    sayAll();
    m_text->showCaption(m_shows.Text1.text);
    m_text->setAlignment(Qt::AlignAbsolute | Qt::AlignVCenter | (state().english() ? Qt::AlignLeft : Qt::AlignRight));
    m_row->setCurrentIndex(m_shows.Frame1.visible ? 1 : 0);
    m_palette->show(m_shows.Picture18Image.image(), m_page.colour());
    static constexpr const char* styles[] = {"letter-regular", "letter-bold", "letter-italic", "letter-bold-italic"};
    showIcon(m_style, QString::fromLatin1(styles[m_page.style()]));
    showIcon(m_direction, m_page.runsDown() ? u"text-down"_s : u"text-across"_s);
    // A key without a letter types a blank and shows the sign of one.
    for (QPushButton* made : m_keys) {
        const bool blank = made->text().isEmpty();
        if (blank == made->icon().isNull()) {
            if (blank)
                setIcon(made, u"blank"_s, Theme::Colour::Muted);
            else
                made->setIcon({});
        }
        if (blank)
            speak(made, m_shows.words.blankKey);
        else
            speak(made, made->text());
    }
}

} // namespace lumora
