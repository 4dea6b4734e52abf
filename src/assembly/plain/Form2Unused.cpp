// What the controls do that the page has and no view shows: the sheet drawn to look at, and dragged over the page.
#include "assembly/plain/Form2.h"

namespace lumora {

void Form2::drawAlbumSheet() {
    if (isPreparing())
        return;
    m_preparation.count(List1.items());
    drawToLookAt(SheetKind::Album);
}

void Form2::redrawSheet() {
    drawToLookAt(m_preparation.isAlbum() ? SheetKind::Album : SheetKind::Plain);
}

void Form2::drawToLookAt(SheetKind kind) {
    if (isPreparing())
        return;
    setPreparing(true);
    const bool goOn = m_preparation.drawSheet(kind, List1.items()).has_value();
    setPreparing(false);
    if (goOn)
        setStage(Stage::Waiting);
}

void Form2::putSheetBack() {
    Picture5Position = {5, 5};
    Q_EMIT changed();
}

void Form2::takeSheet(QPoint at) {
    m_dragFrom = at - Picture5Position;
}

void Form2::dragSheet(QPoint at) {
    if (!m_dragFrom)
        return;
    Picture5Position = at - *m_dragFrom;
    Q_EMIT changed();
}

void Form2::dropSheet() {
    m_dragFrom.reset();
}

} // namespace lumora
