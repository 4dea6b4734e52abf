#pragma once

#include "views/kit/Theme.h"

class QFrame;
class QHBoxLayout;
class QVBoxLayout;

namespace lumora {

// What the two sending pages are put together from.

struct SendingCard {
    QFrame* frame;
    QVBoxLayout* column; // of what stands in it
};
// role is that of the style sheet: "card", "notice", "alarm".
SendingCard makeSendingCard(const Theme& theme, QWidget* parent, const char* role);
// A line or two beside a sign.
SendingCard makeSignedCard(const Theme& theme, QWidget* parent, const char* role, const QString& icon, QColor colour);

// The two halves of the page: how the sending stands, and what it is about.
QHBoxLayout* layOutSending(const Theme& theme, QWidget* progress, QWidget* side);

// The other half, cards below one another.
struct CardColumn {
    const Theme& theme;
    QWidget* box;
    QVBoxLayout* column;
    SendingCard add(const char* role) const;
};
CardColumn makeCardColumn(const Theme& theme, QWidget* parent);

// An order's name as one piece that keeps its own direction and stands at the beginning of a line of the page. It holds
// underscores and no blanks, and may break behind one.
QString orderNameLine(const QString& name, bool english);

} // namespace lumora
