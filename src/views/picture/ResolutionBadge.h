#pragma once

#include "editing/ResolutionCaption.h"
#include "views/kit/Painting.h"

#include <QWidget>

namespace lumora {

// The mark of a picture's resolution, painted with its lower left corner at a point of a tile: the sign and the colours
// of its grade, and its words.
void drawResolution(QPainter& painter, const Theme& theme, QPointF lowerLeft, const ResolutionCaption& mark);

// The same in a row of its own.
class ResolutionBadge : public QWidget {
public:
    ResolutionBadge(const Theme& theme, QWidget* parent);
    void display(const ResolutionCaption& mark);
    QSize sizeHint() const override;
    QSize minimumSizeHint() const override { return sizeHint(); }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    const Theme& m_theme;
    ResolutionCaption m_mark;
};

} // namespace lumora
