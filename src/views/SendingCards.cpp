#include "views/SendingCards.h"

#include "views/PageFrame.h"

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

QString orderNameLine(const QString& name, bool english) {
    // The first mark of direction decides at which side a label begins.
    return QChar(english ? 0x200E : 0x200F) + (QChar(0x2066) + QString(name).replace(u'_', u"_\u200B"_s)) +
           QChar(0x2069);
}

} // namespace lumora
