#include "views/window/StartFailure.h"

#include "views/kit/Theme.h"
#include "views/window/MessagePanel.h"

#include <QEventLoop>
#include <QGuiApplication>
#include <QWidget>

namespace lumora {

void showStartFailure(const QString& text) {
    if (QGuiApplication::platformName() == QStringLiteral("offscreen") ||
        QGuiApplication::platformName() == QStringLiteral("minimal"))
        return;
    const Theme theme(1.0);
    QWidget window;
    window.setObjectName(QStringLiteral("lumoraWindow"));
    window.setAttribute(Qt::WA_StyledBackground);
    window.setWindowTitle(QStringLiteral("Lumora"));
    window.setStyleSheet(theme.styleSheet());
    window.resize(900, 600);
    MessagePanel panel(theme, &window, MessagePanel::Kind::Message,
                       QStringLiteral("התוכנה אינה יכולה להתחיל · The program can't start"),
                       QStringLiteral("\u2066%1\u2069").arg(text), {QStringLiteral("סגור · Close")});
    panel.setCardWidth(780);
    QEventLoop loop;
    QObject::connect(&panel, &MessagePanel::answered, &loop, &QEventLoop::quit);
    window.show();
    panel.setOpen(true);
    loop.exec();
}

} // namespace lumora
