#include "views/window/StartFailure.h"

#include "views/kit/Theme.h"
#include "views/window/MessagePanel.h"

#include <QEventLoop>
#include <QGuiApplication>
#include <QWidget>

namespace lumora {

using namespace Qt::StringLiterals;

void showStartFailure(const QString& text) {
    if (QGuiApplication::platformName() == u"offscreen"_s || QGuiApplication::platformName() == u"minimal"_s)
        return;
    const Theme theme(Theme::Fit{});
    QWidget window;
    window.setObjectName(u"lumoraWindow"_s);
    window.setAttribute(Qt::WA_StyledBackground);
    window.setWindowTitle(u"Lumora"_s);
    window.setStyleSheet(theme.styleSheet());
    window.resize(900, 600);
    MessagePanel panel(theme, &window, MessagePanel::Kind::Message,
                       u"התוכנה אינה יכולה להתחיל · The program can't start"_s, u"\u2066%1\u2069"_s.arg(text),
                       {u"סגור · Close"_s});
    panel.setWidth(Overlay::Width::Wide);
    QEventLoop loop;
    QObject::connect(&panel, &MessagePanel::answered, &loop, &QEventLoop::quit);
    window.show();
    panel.setOpen(true);
    loop.exec();
}

} // namespace lumora
