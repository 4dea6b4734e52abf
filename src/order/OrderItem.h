#pragma once

#include "common/DrivePathText.h"
#include "common/FixedText.h"
#include "order/EditRecord.h"

#include <QString>
#include <QStringList>

#include <cstdint>

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

    // The copies of all lines but texts, held at 32767.
    static std::int16_t copiesOf(const QStringList& items) {
        double total = 0;
        for (const QString& item : items) {
            if (item.right(3) != QLatin1String("txt"))
                total += Val(item.left(2));
        }
        return HoldIn16Bits(total);
    }

    // The lab knows no names of fewer than five characters: such a line is passed over without a word.
    bool hasUsableName() const { return LeafName(path).size() >= 5; }
};

} // namespace lumora
