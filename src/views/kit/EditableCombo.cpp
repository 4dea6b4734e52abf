#include "views/kit/EditableCombo.h"

#include <QEvent>
#include <QLineEdit>
#include <QSignalBlocker>
#include <QStyledItemDelegate>
#include <QTimer>

namespace lumora {

EditableCombo::EditableCombo(QWidget* parent, std::function<void(int)> chosen,
                             std::function<void(const QString&)> typed)
    : QComboBox(parent) {
    setEditable(true);
    styleRows(*this);
    setInsertPolicy(QComboBox::NoInsert);
    setProperty("ownRing", true); // its border shows the focus
    lineEdit()->installEventFilter(this);
    connect(this, &QComboBox::activated, this, [chosen = std::move(chosen)](int row) { chosen(row); });
    connect(lineEdit(), &QLineEdit::textEdited, this, [typed = std::move(typed)](const QString& text) { typed(text); });
}

void EditableCombo::display(const QStringList& rows, int row, const QString& text, Says says) {
    m_prompt = says == Says::Prompt ? text : QString();
    const QSignalBlocker quiet(this);
    QStringList shown;
    for (int i = 0; i < count(); ++i)
        shown += itemText(i);
    if (shown != rows) {
        clear();
        addItems(rows);
    }
    if (currentIndex() != row)
        setCurrentIndex(row);
    const QSignalBlocker quietToo(lineEdit());
    if (currentText() != text)
        setEditText(text);
}

void EditableCombo::focusInEvent(QFocusEvent* event) {
    QComboBox::focusInEvent(event);
    choosePrompt();
}

bool EditableCombo::eventFilter(QObject* watched, QEvent* event) {
    if (watched == lineEdit() && event->type() == QEvent::MouseButtonRelease)
        QTimer::singleShot(0, this, &EditableCombo::choosePrompt); // the release itself places the cursor
    return QComboBox::eventFilter(watched, event);
}

void EditableCombo::choosePrompt() {
    if (!m_prompt.isEmpty() && currentText() == m_prompt)
        lineEdit()->selectAll();
}

void styleRows(QComboBox& box) {
    box.setItemDelegate(new QStyledItemDelegate(&box));
}

void setDomainBox(QLineEdit& field, EditableCombo& box) {
    field.setInputMethodHints(Qt::ImhEmailCharactersOnly);
    box.setInputMethodHints(Qt::ImhEmailCharactersOnly); // its box that is typed in has those of the whole
    field.setProperty("domainBox", QVariant::fromValue<QWidget*>(&box));
}

QComboBox* domainBoxOf(const QWidget& field) {
    auto* box = qobject_cast<QComboBox*>(field.property("domainBox").value<QWidget*>());
    return box && box->isVisible() ? box : nullptr;
}

} // namespace lumora
