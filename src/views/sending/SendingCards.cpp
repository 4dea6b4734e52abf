#include "views/sending/SendingCards.h"

#include "views/kit/Maker.h"

#include <QFrame>
#include <QHBoxLayout>
#include <QLabel>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

SendingCard makeSendingCard(const Theme& theme, QWidget* parent, const char* role) {
    auto* frame = new QFrame(parent);
    setRole(frame, role);
    auto* column = new QVBoxLayout(frame);
    column->setContentsMargins(theme.px(22), theme.px(18), theme.px(22), theme.px(18));
    column->setSpacing(theme.px(8));
    return {frame, column};
}

SendingCard makeSignedCard(const Theme& theme, QWidget* parent, const char* role, const QString& icon, QColor colour) {
    auto* frame = new QFrame(parent);
    setRole(frame, role);
    auto* row = new QHBoxLayout(frame);
    row->setContentsMargins(theme.px(20), theme.px(14), theme.px(20), theme.px(14));
    row->setSpacing(theme.px(16));
    auto* sign = new QLabel(frame);
    sign->setPixmap(theme.icon(icon, theme.px(36), colour));
    row->addWidget(sign, 0, Qt::AlignTop);
    auto* column = new QVBoxLayout;
    column->setSpacing(theme.px(4));
    row->addLayout(column, 1);
    return {frame, column};
}

QHBoxLayout* layOutSending(const Theme& theme, QWidget* progress, QWidget* side) {
    auto* row = new QHBoxLayout;
    row->setSpacing(theme.px(28));
    row->addWidget(progress, 3);
    row->addWidget(side, 2);
    return row;
}

SendingCard CardColumn::add(const char* role) const {
    const SendingCard made = makeSendingCard(theme, box, role);
    column->addWidget(made.frame);
    return made;
}

CardColumn makeCardColumn(const Theme& theme, QWidget* parent) {
    auto* box = new QWidget(parent);
    auto* column = new QVBoxLayout(box);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(theme.px(14));
    return {theme, box, column};
}

QString orderNameLine(const QString& name, bool english) {
    return atLineStart(fromLeft(QString(name).replace(u'_', u"_\u200B"_s)), english);
}

} // namespace lumora
