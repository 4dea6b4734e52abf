#pragma once

#include "views/kit/Theme.h"

#include <QStringList>
#include <QWidget>

namespace lumora {

// The steps of an order; the step bar shows which one the customer is in.
enum class OrderStep { Start, Details, Pictures, Preparing, Sending, Done };

class StepBar : public QWidget {
    Q_OBJECT
public:
    StepBar(const Theme& theme, QWidget* parent);

    void setTexts(const QStringList& names, const QString& spokenPrefix);
    // share: how far the step itself is done, 0 to 1.
    void setStep(OrderStep step, double share = 0);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void speak();

    const Theme& m_theme;
    QStringList m_names;
    QString m_spokenPrefix;
    OrderStep m_step = OrderStep::Start;
    double m_share = 0;
};

} // namespace lumora
