#include "views/window/PageView.h"

#include "imaging/files/PictureFile.h"
#include "platform/files/Files.h"
#include "views/kit/CardButtons.h"
#include "views/kit/ChoiceCards.h"
#include "views/kit/EditableCombo.h"
#include "views/kit/Keyboard.h"
#include "views/kit/ScreenReader.h"

#include <QAbstractButton>
#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QSignalBlocker>
#include <QVBoxLayout>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// About a frame of the screen: long loops pump far more often than a person can see.
constexpr int renderPace = 16;

QString shownOnButton(const QString& text) {
    return isolated(text.trimmed()).replace(u'&', u"&&"_s);
}

void fillCombo(QComboBox& box, const TextList& list, const Caption& caption) {
    const QSignalBlocker quiet(box);
    bool same = box.count() == list.count();
    for (int i = 0; same && i < list.count(); ++i)
        same = box.itemData(i).toString() == list.item(i);
    if (!same) {
        box.clear();
        for (const QString& item : list.items())
            box.addItem(isolated(item), item);
    }
    const int row = list.find(caption.text);
    box.setPlaceholderText(isolated(caption.text));
    if (box.currentIndex() != row)
        box.setCurrentIndex(row);
}

void fillList(QListWidget& widget, const TextList& list, const std::function<QString(const QString&)>& shown) {
    const QSignalBlocker quiet(widget);
    bool same = widget.count() == list.count();
    for (int i = 0; same && i < list.count(); ++i)
        same = widget.item(i)->data(Qt::UserRole).toString() == list.item(i);
    if (!same) {
        widget.clear();
        for (const QString& item : list.items()) {
            auto* row = new QListWidgetItem(isolated(shown ? shown(item) : item.trimmed()), &widget);
            row->setData(Qt::UserRole, item);
        }
    }
    if (widget.currentRow() != list.currentIndex())
        widget.setCurrentRow(list.currentIndex());
}

} // namespace

PageView::PageView(Page& page, const SessionState& state, const Theme& theme)
    : Maker(theme, this)
    , m_page(page)
    , m_state(state)
    , m_theme(theme) {
    setObjectName(pageName(page.id()));
    setRole(this, "page");
    changesSight(*this);
    setAttribute(Qt::WA_StyledBackground);
    setFocusPolicy(Qt::NoFocus);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    m_frame = new PageFrame(theme, this);
    column->addWidget(m_frame);
    m_soon.setSingleShot(true);
    connect(&m_soon, &QTimer::timeout, this, &PageView::renderNow);
    connect(&page, &Page::changed, this, &PageView::schedule);
}

void PageView::start() {
    if (isPanel())
        m_frame->showContentOnly();
    m_dirty = true;
    renderNow();
}

void PageView::schedule() {
    m_dirty = true;
    if (m_detached || m_soon.isActive())
        return;
    const qint64 since = m_sinceRender.isValid() ? m_sinceRender.elapsed() : renderPace;
    m_soon.start(static_cast<int>(std::clamp<qint64>(renderPace - since, 0, renderPace)));
}

void PageView::renderNow() {
    m_soon.stop();
    if (m_detached || !m_dirty)
        return;
    m_dirty = false;
    setLayoutDirection(m_state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    m_frame->steps().setTexts(m_state.english()
                                  ? QStringList{u"Start"_s, u"Details"_s, u"Pictures"_s, u"Preparing"_s, u"Sending"_s}
                                  : QStringList{u"התחלה"_s, u"פרטים"_s, u"תמונות"_s, u"הכנה"_s, u"שליחה"_s},
                              wording(u"שלב: "_s, u"Step: "_s));
    renderBindings();
    render();
    m_sinceRender.start();
}

void PageView::detach() {
    m_detached = true;
    m_soon.stop();
    disconnect(&m_page, &Page::changed, this, nullptr);
}

const PageView::Control* PageView::control(const QString& name) const {
    const auto at =
        std::find_if(m_controls.begin(), m_controls.end(), [&](const Control& c) { return c.name == name; });
    return at == m_controls.end() ? nullptr : &*at;
}

void PageView::renderBindings() {
    for (const Control& control : m_controls) {
        QWidget* widget = control.widget;
        if (!widget)
            continue;
        if (control.list) {
            if (auto* list = qobject_cast<QListWidget*>(widget))
                fillList(*list, *control.list, control.reading);
            else if (auto* box = qobject_cast<QComboBox*>(widget); box && control.caption)
                fillCombo(*box, *control.list, *control.caption);
            else if (auto* cards = qobject_cast<ChoiceCards*>(widget))
                cards->display(control.list->items(), control.list->currentIndex());
        }
        if (!control.caption)
            continue;
        const Caption& caption = *control.caption;
        // A checkable button is bound to nothing but a CheckCaption.
        if (auto* check = qobject_cast<QAbstractButton*>(widget); check && check->isCheckable()) {
            const QSignalBlocker quiet(check);
            check->setChecked(static_cast<const CheckCaption&>(caption).checked);
        }
        if (auto* edit = qobject_cast<QLineEdit*>(widget)) {
            const bool leftwards = edit->layoutDirection() == Qt::RightToLeft;
            edit->setAlignment(Qt::AlignAbsolute | Qt::AlignVCenter | (leftwards ? Qt::AlignRight : Qt::AlignLeft));
            if (edit->text() != caption.text) {
                const QSignalBlocker quiet(edit);
                edit->setText(caption.text);
            }
        } else if (auto* button = qobject_cast<QAbstractButton*>(widget)) {
            QString text = shownOnButton(caption.text);
            if (!button->icon().isNull() && !text.isEmpty()) // space between the sign and the word
                text = QChar(0xA0) + text + QChar(0xA0);
            if (button->text() != text)
                button->setText(text);
            if (!button->property("spoken").toBool())
                button->setAccessibleName(caption.text.simplified());
        } else if (auto* label = qobject_cast<QLabel*>(widget)) {
            const QString text = control.reading ? control.reading(caption.text) : isolated(caption.text);
            if (label->text() != text)
                label->setText(text);
        }
        // A label without a word takes no room.
        const bool seen = caption.visible && !(qobject_cast<QLabel*>(widget) && caption.text.isEmpty());
        if (widget->isHidden() == seen)
            widget->setVisible(seen);
        if (widget->isEnabledTo(widget->parentWidget()) != caption.enabled)
            widget->setEnabled(caption.enabled);
        if (widget->toolTip() != caption.hint)
            widget->setToolTip(caption.hint);
    }
}

void PageView::keyPressEvent(QKeyEvent* event) {
    QWidget* focus = QApplication::focusWidget();
    if (pressByEnter(*event, focus))
        return;
    if (endsTyping(*event, focus)) {
        for (const Control& control : m_controls) {
            auto* main = qobject_cast<QPushButton*>(control.widget);
            if (main && main->property("role") == u"main"_s && main->isVisible() && main->isEnabled()) {
                main->click();
                return;
            }
        }
    }
    if (event->key() == Qt::Key_Escape)
        escape();
    else
        QWidget::keyPressEvent(event);
}

QPushButton* PageView::button(const Caption& caption, Role role, std::function<void()> clicked, const QString& icon) {
    auto* made = new QPushButton(this);
    static constexpr const char* roles[] = {"main", "secondary", "plain", "quiet", "danger"};
    setRole(made, roles[static_cast<int>(role)]);
    made->setFocusPolicy(Qt::TabFocus);
    if (!icon.isEmpty())
        setIcon(made, icon,
                role == Role::Main     ? QColor(Qt::white)
                : role == Role::Danger ? Theme::Colour::Danger
                                       : Theme::Colour::Ink);
    connect(made, &QPushButton::clicked, this, [clicked = std::move(clicked)] { clicked(); });
    bind(made, caption);
    return made;
}

QLabel* PageView::label(const Caption& caption, const char* type) {
    QLabel* made = makeLabel(this, type);
    bind(made, caption);
    return made;
}

QLabel* PageView::lineLabel(const Caption& caption, const char* type) {
    QLabel* made = label(caption, type);
    made->setWordWrap(false);
    return made;
}

QLabel* PageView::label(const Caption& caption, const char* type, Reading reading) {
    QLabel* made = label(caption, type);
    m_controls.back().reading = std::move(reading);
    return made;
}

QLabel* PageView::echo(const Caption& caption, const char* type) {
    QLabel* made = makeLabel(this, type);
    follow(made, caption);
    return made;
}

QListWidget* PageView::listing(const TextList& rows, Reading reading) {
    auto* made = new QListWidget(this);
    made->setTextElideMode(Qt::ElideMiddle); // the end of a file's name tells most
    made->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    made->setFocusPolicy(Qt::NoFocus);
    const int icon = m_theme.size(IconSize::Button);
    made->setIconSize({icon, icon});
    bindList(made, rows, std::move(reading));
    return made;
}

QListWidget* PageView::list(const TextList& rows, std::function<void(int)> picked, Reading reading) {
    QListWidget* made = listing(rows, std::move(reading));
    made->setFocusPolicy(Qt::StrongFocus);
    made->setProperty("picked", true); // its rows are as high as buttons
    const auto taken = [made, picked = std::move(picked)](QListWidgetItem* item) { picked(made->row(item)); };
    connect(made, &QListWidget::itemClicked, this, taken);
    connect(made, &QListWidget::itemActivated, this, taken);
    return made;
}

void PageView::bindName(QWidget* widget, const Caption& caption) {
    bind(nameOf(caption), widget, [&caption] { return caption.text; });
}

QLineEdit* PageView::field(const Caption& caption, std::function<void(const QString&)> edited) {
    auto* made = new QLineEdit(this);
    made->setProperty("ownRing", true); // its border shows the focus
    connect(made, &QLineEdit::textEdited, this, [edited = std::move(edited)](const QString& text) { edited(text); });
    bind(made, caption);
    return made;
}

QCheckBox* PageView::checkBox(const CheckCaption& caption, std::function<void(bool)> clicked) {
    auto* made = new QCheckBox(this);
    made->setFocusPolicy(Qt::TabFocus);
    connect(made, &QCheckBox::clicked, this, [this, clicked = std::move(clicked)](bool on) {
        clicked(on);
        schedule();
    });
    bind(made, caption);
    return made;
}

QComboBox* PageView::comboBox(const TextList& list, const Caption& caption, std::function<void(int)> activated) {
    auto* made = new QComboBox(this);
    styleRows(*made);
    made->setProperty("ownRing", true);
    connect(made, &QComboBox::activated, this, [activated = std::move(activated)](int row) { activated(row); });
    bind(made, caption);
    m_controls.back().list = &list;
    return made;
}

ChoiceCards* PageView::choiceCards(const TextList& list, const Caption& caption, int columns,
                                   std::function<CardButton*(int)> maker, std::function<void(int)> activated) {
    auto* made = new ChoiceCards(m_theme, this, columns, std::move(maker));
    connect(made, &ChoiceCards::activated, this, [this, activated = std::move(activated)](int row) {
        activated(row);
        schedule(); // the press has turned the mark over by itself, which the page may not accept
    });
    bind(made, caption);
    m_controls.back().list = &list;
    return made;
}

void PageView::bind(QWidget* widget, const Caption& caption) {
    const QString name = nameOf(caption);
    widget->setObjectName(name);
    m_controls.push_back({name, widget, &caption, nullptr, {}});
}

void PageView::follow(QWidget* widget, const Caption& caption) {
    m_controls.push_back({{}, widget, &caption, nullptr, {}});
}

void PageView::bindChoice(QAbstractButton* button, const CheckCaption& caption, std::function<void()> clicked) {
    button->setCheckable(true);
    excludeOthers(*button);
    connect(button, &QAbstractButton::clicked, this, [this, clicked = std::move(clicked)] {
        clicked();
        schedule();
    });
    bind(button, caption);
}

void PageView::bind(const QString& name, QWidget* widget, std::function<QString()> text) {
    widget->setObjectName(name);
    m_controls.push_back({name, widget, nullptr, nullptr, std::move(text)});
}

void PageView::bindList(const QString& name, const TextList& list, QWidget* widget, Reading reading) {
    if (widget)
        widget->setObjectName(name);
    m_controls.push_back({name, widget, nullptr, &list, {}, std::move(reading)});
}

void PageView::setDirectedIcon(QPushButton* button, Way way) {
    const bool right = (way == Way::Forwards) != (layoutDirection() == Qt::RightToLeft);
    const QString icon = right ? u"arrow-right"_s : u"arrow-left"_s;
    if (button->property("directedIcon") == icon)
        return; // setting the same icon would repaint the button
    button->setProperty("directedIcon", icon);
    setIcon(button, icon, button->property("role") == u"main"_s ? QColor(Qt::white) : Theme::Colour::Ink);
}

void PageView::setIcon(QAbstractButton* button, const QString& icon, QColor colour) {
    setButtonIcon(button, m_theme, icon, colour);
}

void PageView::setIcon(QListWidgetItem* row, const QString& icon, QColor colour) {
    row->setIcon(m_theme.icon(icon, m_theme.size(IconSize::Button), colour));
}

void PageView::speak(QWidget* widget, const QString& text) const {
    widget->setProperty("spoken", true);
    widget->setAccessibleName(text);
}

QImage loadedPicture(const Files& files, const DrivePath& path) {
    const auto file = files.drives().toHost(path);
    if (!file)
        return {};
    const auto picture = loadPicture(*file);
    return picture ? picture->image() : QImage();
}

} // namespace lumora
