#pragma once

#include "views/kit/CardButtons.h"

#include <array>

namespace lumora {

// One small picture of the strip below the editor: a tap opens it. The one in the editor is marked, and those that are
// ordered have a tick.
class StripCell : public CardButton {
    Q_OBJECT
public:
    StripCell(const Theme& theme, QWidget* parent);

    struct Look {
        QImage picture;
        bool filled = false;
        bool ordered = false;
        bool open = false;
    };
    void show(const Look& look);

protected:
    void paintEvent(QPaintEvent* event) override;
    void paintInside(QPainter&, const QRectF&) override {}

private:
    Look m_look;
};

} // namespace lumora
