#pragma once

#include "session/Caption.h"
#include "session/TextList.h"

namespace lumora {

// A list of which the customer takes one row. The caption's text is the prompt, or the row that was taken.
struct ComboCaption : Caption {
    using Caption::Caption;

    TextList rows;

    bool taken() const { return rows.currentIndex() >= 0; }
    // Nothing is taken then.
    void fill(const QStringList& items, const QString& prompt) {
        rows.clear();
        rows.append(items);
        text = prompt;
    }
    // False, and nothing changes, for a row that is not there.
    bool take(int row) {
        if (row < 0 || row >= rows.count())
            return false;
        rows.setCurrentIndex(row);
        text = rows.currentItem();
        return true;
    }
};

} // namespace lumora
