#include "views/window/Application.h"

#include "views/kit/ScreenReader.h"
#include "views/kit/Theme.h"

#include <cstdio>
#include <exception>

namespace lumora {

using namespace Qt::StringLiterals;

Application::Application(int& argc, char** argv)
    : QApplication(argc, argv) {
    setApplicationName(u"lumora"_s);
    setApplicationDisplayName(u"Lumora"_s);
    setQuitOnLastWindowClosed(false);
    Theme::apply(*this);
    tellScreenReaders();
}

void Application::setContrast(bool on) {
    Theme::setLook(on ? Theme::Look::Contrast : Theme::Look::Calm);
}

bool Application::notify(QObject* receiver, QEvent* event) {
    // No exception may pass through Qt's event loop: nothing behind it is certain to be whole.
    try {
        return QApplication::notify(receiver, event);
    } catch (const std::exception& fault) {
        std::fprintf(stderr, "lumora: the program has to end: %s\n", fault.what());
    } catch (...) {
        std::fprintf(stderr, "lumora: the program has to end: unknown fault\n");
    }
    std::fflush(stderr);
    _Exit(1);
}

} // namespace lumora
