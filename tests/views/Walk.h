#pragma once

#include "app/Program.h"
#include "drive/ControlFinder.h"
#include "session/Page.h"
#include "support/DrivePathLiteral.h"

#include <QSize>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <functional>

namespace lumora {

class Internet;

// The name of the widget that has the keyboard.
QString focusName();

struct Screen {
    QSize size;
    bool english;
};

// The whole program on a fresh drive with a folder of pictures, used as a customer uses it: by pressing controls that
// are visible, enabled and not covered. A step that fails is a failure of the test that takes it.
class Walk {
public:
    explicit Walk(QSize size, const QString& labSettings = {}, Internet* line = nullptr);
    // In that language, turned to on the start page.
    explicit Walk(const Screen& screen, const QString& labSettings = {}, Internet* line = nullptr);
    ~Walk();

    Program& program() { return *m_program; }
    DrivePath pictureFolder() const;
    template <class P>
    P& page(PageId id) {
        return static_cast<P&>(*find(id));
    }

    // Presses, and waits for the page that comes of it.
    void press(const QString& page, const QString& control, const QString& comes = {});
    void type(const QString& page, const QString& control, const QString& text);
    void choose(const QString& page, const QString& control, const QString& row);
    void tick(const QString& page, const QString& control);
    bool pressable(const QString& page, const QString& control);
    // Lets the program work until the page is in front, for some seconds at most.
    void waitFor(const QString& page);
    void settle(int milliseconds = 30);
    // Gives the window the keyboard, and hits a key of it.
    void activate();
    void key(Qt::Key code);
    // The widget of a name, on the page in front or below it; a failure where there is none.
    QWidget& control(const QString& name);
    // The lab's picker gives the first picture, or this one, to what the button opens.
    void pick(const QString& page, const QString& button, const DrivePath& path = {});

    // From the start page to the page and step named.
    void toMenu();
    void toDetails();
    void toOptions();
    void toBorder();
    void toTerms();
    void toPictures();
    void choosePictures();
    void toClosing();
    // A quick order with the first picture open in the editor. The lab has frames in two categories.
    void toEditor();

    // A file in a folder that is made where it is missing.
    void write(const DrivePath& path, const QByteArray& bytes);
    // Writes the window to the folder that LUMORA_SHOTS names; without one nothing is written.
    void shot(const QString& name);
    // All that is wrong with what the window shows now: each line names the control.
    QStringList faults();

private:
    Page* find(PageId id);
    ControlFinder finder() { return ControlFinder(m_program->window()); }
    void expectDone(const Result<void>& step);
    void writeFrames();

    QTemporaryDir m_folder;
    std::unique_ptr<Program> m_program;
};

} // namespace lumora
