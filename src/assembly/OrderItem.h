#pragma once

#include "common/DrivePathText.h"
#include "editing/EditRecord.h"

#include <QString>

namespace lumora {

// A line of the basket as an order holds it, cut by position: print code, in an edited order the edit record, path.
struct OrderItem {
    enum class Form { Plain, Edited };

    QString code;   // 9 characters
    QString record; // EditRecord::width characters, edited orders only
    QString path;   // the rest, in any length

    static OrderItem split(const QString& item, Form form) {
        constexpr int codeWidth = 9;
        const int recordWidth = form == Form::Edited ? EditRecord::width : 0;
        return {item.left(codeWidth), item.mid(codeWidth, recordWidth), item.mid(codeWidth + recordWidth)};
    }

    // The lab knows no names of fewer than five characters: such a line is passed over without a word.
    bool hasUsableName() const { return LeafName(path).size() >= 5; }
};

} // namespace lumora
