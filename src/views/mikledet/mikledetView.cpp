#include "views/mikledet/mikledetView.h"

#include "views/kit/CaptionField.h"
#include "views/kit/KeyRows.h"
#include "views/kit/Keyboard.h"
#include "views/kit/PaletteBar.h"

#include <QApplication>
#include <QCheckBox>
#include <QKeyEvent>
#include <QStackedLayout>

namespace lumora {

using namespace Qt::StringLiterals;

mikledetView::mikledetView(mikledet& page, const SessionState& state, const Theme& theme)
    : HoldingView(page, state, theme) {
    setRole(this, "panel");
    frame().content()->setContentsMargins(theme.margins(Pad::Slim));
    frame().content()->setSpacing(theme.size(Space::Small));
    m_spoken.emplace_back(this, &c.Title.text);
    QLayout* text = makeTextRow();
    auto* row = new QWidget(this);
    m_row = new QStackedLayout(row);
    m_row->addWidget(makeAppearance());
    m_row->addWidget(makeSymbols());
    add(*frame().content(), {text, row, makeKeys()});
    start();
}

QPushButton* mikledetView::key(int number) {
    const auto at = static_cast<std::size_t>(number);
    m_keys[at] = toKey(button(c.leter[at], Role::Plain, &mikledet::leter_Click, number), theme());
    m_keys[at]->setProperty("letterOfAnyLanguage", true);
    return m_keys[at];
}

QPushButton* mikledetView::toRound(QPushButton* made, const Caption& caption) {
    setRole(made, "round");
    m_spoken.emplace_back(made, &caption.hint);
    return made;
}

QPushButton* mikledetView::holdButton(const Caption& caption, const char* icon, std::function<void()> down,
                                      std::function<void()> up) {
    auto* made = new HoldButton(held(std::move(down), std::move(up)), this);
    setIcon(made, QString::fromLatin1(icon), Theme::Colour::Ink);
    bind(made, caption);
    return toRound(made, caption);
}

QPushButton* mikledetView::choice(const CheckCaption& caption, const QString& spoken, std::function<void()> clicked) {
    auto* made = new QPushButton(this);
    made->setFocusPolicy(Qt::TabFocus);
    bindChoice(made, caption, std::move(clicked));
    m_spoken.emplace_back(made, &spoken);
    return made;
}

QLayout* mikledetView::makeTextRow() {
    m_text = new CaptionField({toPage(&mikledet::KeyPress), toPage(&mikledet::Command6_Click)}, this);
    bindName(m_text, c.Text1);
    m_spoken.emplace_back(m_text, &c.words.text);
    QWidget* shows = checkBox(c.Check4, toPage(&mikledet::Check4_Click));
    QWidget* remove = button(c.Command8, Role::Quiet, &mikledet::Command8_Click, u"trash"_s);
    QPushButton* done = button(c.CommandDone, Role::Plain, &mikledet::CommandDone_Click);
    setRole(done, "done");
    setIcon(done, u"tick"_s, Qt::white);
    return inRow(Space::Small, {{m_text, 1}, shows, remove, done});
}

QWidget* mikledetView::makeAppearance() {
    QWidget* larger =
        holdButton(c.Image1, "letter-larger", toPage(&mikledet::Image1_MouseDown), toPage(&mikledet::Image1_MouseUp));
    QWidget* smaller =
        holdButton(c.Image2, "letter-smaller", toPage(&mikledet::Image2_MouseDown), toPage(&mikledet::Image2_MouseUp));
    // The arrows stand as they point, in both languages.
    QHBoxLayout* arrows = inRow(Space::Tight);
    static constexpr const char* icons[] = {"arrow-left", "arrow-right", "arrow-up", "arrow-down"};
    for (const int direction : {0, 2, 3, 1})
        arrows->addWidget(holdButton(
            c.Image15[static_cast<std::size_t>(direction)], icons[direction],
            [this, direction] { m_page.Image15_MouseDown(direction); }, toPage(&mikledet::Image15_MouseUp)));
    m_style = toRound(button(c.Image3, Role::Plain, &mikledet::Image3_Click, u"letter-regular"_s), c.Image3);
    m_direction = toRound(button(c.Image4, Role::Plain, &mikledet::Image4_Click, u"text-across"_s), c.Image4);
    QHBoxLayout* anchors = inRow(Space::Tight);
    static constexpr const char* anchorIcons[] = {"anchor-near", "anchor-centre", "anchor-far"};
    for (int alignment = 0; alignment < 3; ++alignment) {
        const CheckCaption& caption = c.Image5[static_cast<std::size_t>(alignment)];
        QPushButton* made = choice(caption, caption.hint, [this, alignment] { m_page.Image5_Click(alignment); });
        setRole(made, "round");
        setIcon(made, QString::fromLatin1(anchorIcons[alignment]), Theme::Colour::Ink);
        anchors->addWidget(made);
    }
    m_palette = new PaletteBar(theme(), toPage(&mikledet::Picture18_MouseDown), this);
    bind(m_palette, c.Picture18);
    m_spoken.emplace_back(m_palette, &c.Picture18.hint);
    return inBox(inRow(Space::Tight, {larger,
                                      smaller,
                                      Space::Small,
                                      leftToRight(arrows),
                                      Space::Small,
                                      m_style,
                                      m_direction,
                                      Space::Small,
                                      leftToRight(anchors),
                                      Space::Small,
                                      {m_palette, 1}}));
}

QWidget* mikledetView::makeSymbols() {
    // In two lines where they would be narrower than a finger.
    QGridLayout* grid = inGrid(Space::Tight);
    const int columns = theme().isTall() || theme().isTight() ? KeyLayout::symbolKeys / 2 : KeyLayout::symbolKeys;
    for (int i = 0; i < KeyLayout::symbolKeys; ++i)
        grid->addWidget(key(KeyLayout::firstSymbol + i), i / columns, i % columns);
    QWidget* box = leftToRight(grid);
    bindName(box, c.Frame1);
    return box;
}

QWidget* mikledetView::makeKeys() {
    KeyRows keys;
    for (const int place : KeyLayout::places())
        keys.letters.push_back(key(place));
    keys.back = toKey(button(c.Command3, Role::Plain, &mikledet::Command3_Click, u"backspace"_s), theme());
    m_spoken.emplace_back(keys.back, &c.Command3.hint);
    keys.enter = toKey(button(c.Command7, Role::Quiet, &mikledet::Command7_Click, u"enter"_s), theme());
    for (const int digit : {1, 2, 3, 4, 5, 6, 7, 8, 9, 0})
        keys.digits[static_cast<std::size_t>(digit)] = key(KeyLayout::firstDigit + digit);

    const auto letters = [&](const CheckCaption& caption, const QString& spoken, void (mikledet::*clicked)()) {
        QPushButton* made = toKey(choice(caption, spoken, toPage(clicked)), theme());
        made->setProperty("letterOfAnyLanguage", true);
        keys.bottom.push_back({made, 1});
    };
    letters(c.Command4, c.words.hebrewLetters, &mikledet::Command4_Click);
    letters(c.Command9, c.words.smallLetters, &mikledet::Command9_Click);
    letters(c.Command2, c.words.capitalLetters, &mikledet::Command2_Click);
    const auto wordKey = [&](const Caption& caption, void (mikledet::*clicked)(), int width) {
        keys.bottom.push_back({toKey(button(caption, Role::Quiet, clicked), theme()), width});
    };
    wordKey(c.Command5, &mikledet::Command5_Click, 1);
    wordKey(c.Command1, &mikledet::Command1_Click, 4);
    wordKey(c.Command6, &mikledet::Command6_Click, 3);
    return inKeyRows(*this, theme(), keys);
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

void mikledetView::showIcon(QPushButton* button, const QString& icon) {
    if (button->property("shownIcon") == icon)
        return; // setting the same icon would repaint the button
    button->setProperty("shownIcon", icon);
    setIcon(button, icon, Theme::Colour::Ink);
}

void mikledetView::render() {
    for (const auto& [widget, said] : m_spoken)
        speak(widget, *said);
    m_text->showCaption(c.Text1.text);
    m_text->setAlignment(Qt::AlignAbsolute | Qt::AlignVCenter | (state().english() ? Qt::AlignLeft : Qt::AlignRight));
    m_row->setCurrentIndex(c.Frame1.visible ? 1 : 0);
    m_palette->show(c.Picture18Image.image(), m_page.colour());
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
        speak(made, blank ? c.words.blankKey : made->text());
    }
}

} // namespace lumora
