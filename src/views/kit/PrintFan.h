#pragma once

#include "views/kit/Theme.h"

#include <QImage>
#include <QWidget>

#include <vector>

namespace lumora {

// Small pictures as prints in a hand: the first lies on top. Without any it is empty paper.
class PrintFan : public QWidget {
    Q_OBJECT
public:
    PrintFan(const Theme& theme, QWidget* parent);

    void setPrints(std::vector<QImage> prints);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void paintPrint(QPainter& painter, const QImage& print, double side) const;

    const Theme& m_theme;
    std::vector<QImage> m_prints;
};

} // namespace lumora
