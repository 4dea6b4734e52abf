#include "views/window/MessagePanel.h"

#include "views/kit/Maker.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace lumora {

MessagePanel::MessagePanel(const Theme& theme, QWidget* parent, Kind kind, const QString& title, const QString& text,
                           const QStringList& buttons)
    : Overlay(theme, parent) {
    setObjectName(QStringLiteral("messagePanel"));
    setAccessibleName(title.isEmpty() ? text.simplified() : title);
    setCardWidth(600);
    auto* top = new QHBoxLayout;
    top->setSpacing(theme.px(20));
    auto* sign = new QLabel(this);
    sign->setPixmap(theme.icon(kind == Kind::Question ? QStringLiteral("info") : QStringLiteral("warning"),
                               theme.px(44), Theme::Colour::Primary));
    top->addWidget(sign, 0, Qt::AlignTop);
    auto* words = new QVBoxLayout;
    words->setSpacing(theme.px(8));
    if (!title.isEmpty()) {
        auto* head = makeLabel(this, "large");
        head->setText(isolated(title));
        words->addWidget(head);
    }
    auto* body = makeLabel(this, title.isEmpty() ? "strong" : "body");
    body->setText(isolated(text.trimmed()));
    body->setObjectName(QStringLiteral("messageText"));
    body->setAlignment(Qt::AlignLeading | Qt::AlignVCenter);
    words->addWidget(body);
    top->addLayout(words, 1);
    column()->addLayout(top);
    auto* row = new QHBoxLayout;
    row->setSpacing(theme.gap());
    row->addStretch(1);
    for (int i = static_cast<int>(buttons.size()) - 1; i >= 0; --i) {
        auto* button = new QPushButton(isolated(buttons[i]), this);
        setRole(button, i == 0 ? "main" : "secondary");
        button->setFocusPolicy(Qt::TabFocus);
        button->setAccessibleName(buttons[i]);
        button->setObjectName(i == 0 ? QStringLiteral("messageYes") : QStringLiteral("messageNo"));
        connect(button, &QPushButton::clicked, this, [this, i] { Q_EMIT answered(i == 0); });
        row->addWidget(button);
        if (i == 0)
            setFirstFocus(button);
    }
    column()->addLayout(row);
    connect(this, &Overlay::escaped, this, [this, kind] { Q_EMIT answered(kind == Kind::Message); });
}

} // namespace lumora
