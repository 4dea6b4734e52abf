#include "editing/render/LineFramePalette.h"

#include <QLatin1StringView>

namespace lumora {

void LineFramePalette::moveTo(QPointF at) {
    if (at.x() < 1 || at.y() < 1 || at.x() >= columns * cell || at.y() >= bottom)
        return;
    m_index = static_cast<int>(at.x() / cell) * rows + static_cast<int>(at.y() / cell);
}

QRect LineFramePalette::marker() const {
    return {m_index / rows * cell, m_index % rows * cell, cell, cell};
}

QChar LineFramePalette::letterOf(int cellIndex) {
    return QLatin1StringView("WRPSKGYH8BTU")[cellIndex];
}

} // namespace lumora
