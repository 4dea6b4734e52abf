#include "order/BasketLine.h"

#include "common/DrivePathText.h"
#include "order/EditRecord.h"

namespace lumora {

int BasketLine::pathColumn(LineForm form) {
    return form == LineForm::Full ? PrintCode::width + EditRecord::width : PrintCode::width;
}

QString BasketLine::compose(LineForm form) const {
    return form == LineForm::Full ? code + LeftField(editState, EditRecord::width) + path : code + path;
}

BasketLine BasketLine::split(const QString& line, LineForm form) {
    const int column = pathColumn(form);
    return {line.left(PrintCode::width), line.mid(PrintCode::width, column - PrintCode::width), line.mid(column)};
}

bool BasketLine::hasUsableName() const {
    return LeafName(path).size() >= 5;
}

} // namespace lumora
