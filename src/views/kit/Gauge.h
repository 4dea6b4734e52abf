#pragma once

#include "views/kit/Theme.h"

#include <QWidget>

namespace lumora {

// How far a long work has come: a ring that fills, with a number or a sign in its middle.
class Gauge : public QWidget {
    Q_OBJECT
public:
    enum class Mood { Busy, Held, Unclear, Good, Bad };
    Gauge(const Theme& theme, QWidget* parent);

    // share 0 to 1; the small line stands below the large one.
    void show(double share, const QString& large, const QString& small);
    void showSign(Mood mood);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    const Theme& m_theme;
    double m_share = 0;
    QString m_large;
    QString m_small;
    Mood m_mood = Mood::Busy;
};

} // namespace lumora
