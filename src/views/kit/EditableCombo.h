#pragma once

#include <QComboBox>
#include <QStringList>

#include <functional>

namespace lumora {

// A box that offers rows and takes a typed text too. What a program sets in it calls neither of the two.
class EditableCombo : public QComboBox {
    Q_OBJECT
public:
    EditableCombo(QWidget* parent, std::function<void(int)> chosen, std::function<void(const QString&)> typed);
    void display(const QStringList& rows, int row, const QString& text);
};

} // namespace lumora
