#include "views/kit/EditableCombo.h"

#include <QLineEdit>
#include <QSignalBlocker>

namespace lumora {

EditableCombo::EditableCombo(QWidget* parent, std::function<void(int)> chosen,
                             std::function<void(const QString&)> typed)
    : QComboBox(parent) {
    setEditable(true);
    setInsertPolicy(QComboBox::NoInsert);
    setProperty("ownRing", true); // its border shows the focus
    connect(this, &QComboBox::activated, this, [chosen = std::move(chosen)](int row) { chosen(row); });
    connect(lineEdit(), &QLineEdit::textEdited, this, [typed = std::move(typed)](const QString& text) { typed(text); });
}

void EditableCombo::display(const QStringList& rows, int row, const QString& text) {
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

} // namespace lumora
