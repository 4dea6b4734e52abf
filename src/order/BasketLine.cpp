#include "order/BasketLine.h"

#include "order/EditRecord.h"

namespace lumora {

int BasketLine::pathColumn(LineForm form) {
    return form == LineForm::Full ? PrintCode::width + EditRecord::width : PrintCode::width;
}

QString BasketLine::compose(LineForm form) const {
    return form == LineForm::Full ? code + LeftField(editState, EditRecord::width) + path.text() : code + path.text();
}

BasketLine BasketLine::split(const QString& line, LineForm form) {
    const int column = pathColumn(form);
    return {line.left(PrintCode::width), line.mid(PrintCode::width, column - PrintCode::width),
            DrivePath(line.mid(column))};
}

bool BasketLine::hasUsableName() const {
    return path.leaf().size() >= 5;
}

} // namespace lumora
