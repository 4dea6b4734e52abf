#pragma once

#include <QComboBox>
#include <QStringList>

#include <functional>

class QLineEdit;

namespace lumora {

// A box that offers rows and takes a typed text too. What a program sets in it calls neither of the two. A prompt is
// chosen whole when the box takes the keyboard or is tapped, so that typing replaces it.
class EditableCombo : public QComboBox {
    Q_OBJECT
public:
    EditableCombo(QWidget* parent, std::function<void(int)> chosen, std::function<void(const QString&)> typed);
    enum class Says { Prompt, Choice };
    void display(const QStringList& rows, int row, const QString& text, Says says);

protected:
    void focusInEvent(QFocusEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void choosePrompt();

    QString m_prompt; // empty while the box says something else
};

// The rows of a list that opens are as high as the style sheet says; by itself a box draws them as a menu does.
void styleRows(QComboBox& box);
// The box takes the domain of the mail address that begins in the field, behind the "@" between them.
void setDomainBox(QLineEdit& field, EditableCombo& box);
// Null where the field has none.
QComboBox* domainBoxOf(const QWidget& field);

} // namespace lumora
