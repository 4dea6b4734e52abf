#include "editing/editor/LineFrameChoice.h"

#include <algorithm>
#include <array>

namespace lumora {
namespace {

constexpr std::array<int, 17> numbers = {1, 2, 5, 6, 7, 8, 13, 14, 21, 22, 23, 24, 25, 26, 27, 28, 29};

} // namespace

QStringList LineFrameChoice::styles() {
    QStringList texts;
    for (const int number : numbers)
        texts += QString::number(number);
    return texts;
}

bool LineFrameChoice::step(int places) {
    const int next = m_style + places;
    if (next < -1)
        return false;
    m_style = std::clamp(next, 0, static_cast<int>(numbers.size()) - 1);
    return true;
}

QString LineFrameChoice::code() const {
    return m_letter + styles().value(m_style).rightJustified(2, u'0');
}

} // namespace lumora
