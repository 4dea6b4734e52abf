#pragma once

#include <QApplication>

namespace lumora {

// The application of every program that shows pages: fonts, palette and style are set here. An exception that no
// handler caught becomes a message on the error stream and ends the process with status 1.
class Application : public QApplication {
    Q_OBJECT
public:
    // argc and argv must live as long as the application.
    Application(int& argc, char** argv);

    // The look of all pages: our own one of strong contrast, or the calm one.
    static void setContrast(bool on);

    bool notify(QObject* receiver, QEvent* event) override;
};

} // namespace lumora
