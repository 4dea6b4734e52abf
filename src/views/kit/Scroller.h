#pragma once

#include <QScrollArea>

namespace lumora {

// Takes as much room as there is, and shows the rest of what it holds by scrolling.
inline QScrollArea* inScroller(QWidget* inside, QWidget* parent) {
    auto* made = new QScrollArea(parent);
    made->setWidgetResizable(true);
    made->setFrameShape(QFrame::NoFrame);
    made->setFocusPolicy(Qt::NoFocus);
    made->setWidget(inside);
    return made;
}

} // namespace lumora
