#pragma once

#include <QObject>
#include <QStringList>
#include <QUrl>

namespace lumora {

// Takes what a page would open outside the program, for as long as it lives.
class NothingOpens : public QObject {
    Q_OBJECT
public:
    NothingOpens();
    ~NothingOpens() override;

    QStringList taken;

public Q_SLOTS:
    void take(const QUrl& url) { taken += url.toString(); }
};

} // namespace lumora
