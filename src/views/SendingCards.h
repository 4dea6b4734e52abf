#pragma once

#include "views/Theme.h"

class QFrame;
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

// An order's name as one piece that keeps its own direction and stands at the beginning of a line of the page. It holds
// underscores and no blanks, and may break behind one.
QString orderNameLine(const QString& name, bool english);

} // namespace lumora
