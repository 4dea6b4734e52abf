#include "views/window/MessagePanel.h"

#include "views/kit/ScreenReader.h"

namespace lumora {

using namespace Qt::StringLiterals;

MessagePanel::MessagePanel(const Theme& theme, QWidget* parent, Kind kind, const QString& title, const QString& text,
                           const QStringList& buttons)
    : Overlay(theme, parent) {
    setObjectName(u"messagePanel"_s);
    setAccessibleName(title.isEmpty() ? text.simplified() : title);
    if (kind == Kind::Message)
        setAlert(*this);
    QLabel* body = words(title.isEmpty() ? "strong" : "body", isolated(text.trimmed()));
    body->setObjectName(u"messageText"_s);
    body->setAlignment(Qt::AlignLeading | Qt::AlignVCenter);
    QVBoxLayout* said = inColumn(Space::Small);
    if (!title.isEmpty())
        said->addWidget(words("large", isolated(title)));
    said->addWidget(body);
    addRow({{sign(kind == Kind::Question ? u"info"_s : u"warning"_s, IconSize::Box), 0, Qt::AlignTop}, {said, 1}},
           Space::Wide);
    QHBoxLayout* row = inRow(Space::Normal, {Item::room()});
    for (int i = static_cast<int>(buttons.size()) - 1; i >= 0; --i) {
        QPushButton* button = plainButton(i == 0 ? u"messageYes"_s : u"messageNo"_s, i == 0 ? "main" : "secondary",
                                          [this, i] { Q_EMIT answered(i == 0); });
        button->setText(isolated(buttons[i]));
        button->setAccessibleName(buttons[i]);
        row->addWidget(button);
        if (i == 0)
            setFirstFocus(button);
    }
    column()->addLayout(row);
    whenEscaped([this, kind] { Q_EMIT answered(kind == Kind::Message); });
}

} // namespace lumora
