#pragma once

#include <QDesktopServices>
#include <QObject>
#include <QStringList>
#include <QUrl>

namespace lumora {

// Takes what a page would open outside the program, for as long as it lives.
class NothingOpens : public QObject {
    Q_OBJECT
public:
    NothingOpens() {
        for (const QString& scheme : m_schemes)
            QDesktopServices::setUrlHandler(scheme, this, "take");
    }
    ~NothingOpens() override {
        for (const QString& scheme : m_schemes)
            QDesktopServices::unsetUrlHandler(scheme);
    }

public Q_SLOTS:
    void take(const QUrl&) {}

private:
    const QStringList m_schemes{QStringLiteral("http"), QStringLiteral("https"), QStringLiteral("file"),
                                QStringLiteral("mailto")};
};

} // namespace lumora
