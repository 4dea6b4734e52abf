#pragma once

#include "imaging/Bitmap.h"
#include "views/kit/Theme.h"

#include <QListWidget>

#include <functional>

class QStyledItemDelegate;

namespace lumora {

// The frames of a category as small pictures, each laid over a sample photograph. The rows' texts are the frames'
// names; the list itself is filled as any other list of a page.
class FrameThumbs : public QListWidget {
    Q_OBJECT
public:
    FrameThumbs(const Theme& theme, std::function<Bitmap(int)> picture, QWidget* parent);

    // The row of the frame on the picture, -1 for none.
    void setWorn(int row);

Q_SIGNALS:
    // By the mouse or a finger, by the arrows, or again by Space and Enter.
    void picked(int row);

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    void layOut();

    const Theme& m_theme;
    std::function<Bitmap(int)> m_picture;
    QStyledItemDelegate* m_thumb;
    int m_worn = -1;
};

} // namespace lumora
