#pragma once

#include "selection/kyoskNew.h"
#include "views/Theme.h"

#include <QWidget>

namespace lumora {

// The large view of the picture page: the picture with the warning of low quality, or lines of guidance.
class LargePicture : public QWidget {
    Q_OBJECT
public:
    LargePicture(const Theme& theme, QWidget* parent);
    void show(const kyoskNew::LargeView& view, const QString& warning);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    const Theme& m_theme;
    kyoskNew::LargeView m_view;
    QString m_warning;
};

} // namespace lumora
