#include "views/kit/DigitGrid.h"

#include "views/kit/Theme.h"

#include <QGridLayout>
#include <QPushButton>

namespace lumora {

QGridLayout* digitGrid(const Theme& theme, const std::array<QPushButton*, 10>& digits, QPushButton* back) {
    auto* grid = new QGridLayout;
    grid->setSpacing(theme.size(Space::Small));
    const auto place = [&](QPushButton* key, int row, int column) {
        key->setMinimumSize(theme.px(84), theme.px(60));
        grid->addWidget(key, row, column);
    };
    for (int digit = 1; digit <= 9; ++digit)
        place(digits[static_cast<std::size_t>(digit)], (digit - 1) / 3, (digit - 1) % 3);
    place(digits[0], 3, 1);
    place(back, 3, 2);
    return grid;
}

} // namespace lumora
