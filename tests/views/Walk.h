#pragma once

#include "app/Program.h"
#include "drive/ControlFinder.h"
#include "drive/PageFaults.h"
#include "imaging/files/PictureFile.h"
#include "session/Page.h"
#include "support/DrivePathLiteral.h"

#include <QDir>
#include <QSize>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <functional>

namespace lumora {

using namespace Qt::StringLiterals;

class Internet;

// The name of the widget that has the keyboard.
QString focusName();

struct Screen {
    QSize size;
    bool english;
    bool contrast = false; // [Look] Contrast of the lab's file
    int letters = 0;       // of the desktop, in pixels
};

// Parts of a route, from the start page on.
inline const QString toMenu = u"Image1>nnn "_s;
inline const QString toDetails = toMenu + u"Image1(0) "_s;
inline const QString toOptions = u"Text2=Dana_Levi Text3=03-1234567 Command12 "_s;
inline const QString toBorder = u"Option1(0) Option3(1) "_s;
inline const QString toTerms = u"Image13(0) Command6 "_s;
inline const QString toPictures = u"Check1 Command3>kyoskNew "_s;

// The whole program on a fresh drive with a folder of pictures, used as a customer uses it: by pressing controls that
// are visible, enabled and not covered. A step that fails is a failure of the test that takes it.
class Walk {
public:
    explicit Walk(QSize size, const QString& labSettings = {}, Internet* line = nullptr, Cards::Source media = {});
    // In that language, turned to on the start page.
    explicit Walk(const Screen& screen, const QString& labSettings = {}, Internet* line = nullptr,
                  Cards::Source media = {});
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
    bool pressable(const QString& page, const QString& control);
    // Lets the program work until the page is in front, for some seconds at most.
    void waitFor(const QString& page);
    // Works and looks for a while, as a person does before the next press.
    void settle(int milliseconds = 30);
    // Gives the window the keyboard, and hits a key of it.
    void activate();
    void key(Qt::Key code);
    // The widget of a name, on the page in front or below it; a failure where there is none.
    QWidget& control(const QString& name);
    // The lab's picker gives the first picture, or this one, to what the button opens.
    void pick(const QString& page, const QString& button, const DrivePath& path = {});

    // Goes a route of steps with a blank between them: "Command3" is pressed on the page in front, "Command3>kyoskNew"
    // and that page waited for, "Text2=Dana_Levi" typed with a blank for the _, "Combo1~30/60" chosen, "Check4+"
    // ticked, "!" closes the boxes, ":menu" looks.
    void go(const QString& route, const std::function<void(const QString& name)>& look = {});
    // A quick order with the first picture open in the editor. The lab has frames in two categories.
    void toEditor();
    void writeFrames();
    // The first picture becomes one of this size with a red eye, there.
    DrivePath writeFlashPhotograph();
    static constexpr PictureSize flashPhotograph{2400, 1800};
    static constexpr QPoint redEye{900, 700};

    // A file in a folder that is made where it is missing.
    void write(const DrivePath& path, const QByteArray& bytes);
    // Writes the window to the folder that LUMORA_SHOTS names; without one nothing is written.
    void shot(const QString& name);
    // What the desktop was asked to open.
    QStringList opened;
    // All that is wrong with what the window shows now: each line names the control.
    QStringList faults() { return pageFaults(program()); }

private:
    Page* find(PageId id);
    ControlFinder finder() { return ControlFinder(m_program->window()); }
    void expectDone(const Result<void>& step);

    QTemporaryDir m_folder{QDir::tempPath() + u"/with-a-path-as-long-as-those-of-memory-cards-XXXXXX"_s};
    std::unique_ptr<Program> m_program;
};

} // namespace lumora
