#pragma once

#include <QStackedLayout>
#include <QWidget>

namespace lumora {

// A stack whose page can be moved up at its full size, so that what lies low on it is seen above what covers it.
class LiftedStack : public QStackedLayout {
public:
    using QStackedLayout::QStackedLayout;

    void lift(int pixels) {
        m_lift = pixels;
        setGeometry(parentWidget()->rect());
    }
    void setGeometry(const QRect& room) override { QStackedLayout::setGeometry(room.translated(0, -m_lift)); }

private:
    int m_lift = 0;
};

} // namespace lumora
