#include "Walk.h"

#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "samples/SamplePhotographs.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/Take.h"
#include "views/window/DoubledPress.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"
#include "views/window/ScreenDialogs.h"

#include <QApplication>
#include <QComboBox>
#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QImage>
#include <QLineEdit>
#include <QLockFile>
#include <QPainter>
#include <QRegularExpression>
#include <QTest>

#include <gtest/gtest.h>

namespace lumora {

namespace {

// No order of a test may leave the machine: nobody listens at this port.
constexpr const char* labText = "[Server]\nHost = 127.0.0.1:9\nUser = u\nPassword = p\n[Lab]\nPhone = 03-1234567\n"
                                "Mail = lab@example.com\n";

// Beside the test program, made by the first of its processes and again where the program is newer: each test is a
// process of its own, which would spend half its time on them.
HostPath photographs() {
    static const QString folder = [] {
        const QString made = QCoreApplication::applicationDirPath() + u"/photographs"_s, unfinished = made + u".new"_s;
        QLockFile alone(made + u".lock"_s);
        EXPECT_TRUE(alone.lock());
        if (QFileInfo(made).lastModified() <= QFileInfo(QCoreApplication::applicationFilePath()).lastModified()) {
            QDir(made).removeRecursively();
            EXPECT_TRUE(QDir().mkpath(unfinished));
            EXPECT_TRUE(writeSamplePhotographs(toHostPath(unfinished), 14, 1.2).ok());
            EXPECT_TRUE(QDir().rename(unfinished, made));
        }
        return made;
    }();
    return toHostPath(folder);
}

} // namespace

Walk::Walk(QSize size, const QString& labSettings, Internet* line, Cards::Source media) {
    const HostPath root(m_folder.path().toStdString());
    std::filesystem::create_directories(root / "Pictures");
    QFile lab(m_folder.filePath(u"lab.ini"_s));
    EXPECT_TRUE(lab.open(QIODevice::WriteOnly));
    lab.write(labText + labSettings.toUtf8());
    lab.close();
    lab.setPermissions(QFile::ReadOwner | QFile::WriteOwner);
    qputenv("HOME", m_folder.path().toLocal8Bit()); // the picker's places
    ProgramOptions options;
    options.labFile = toHostPath(lab.fileName());
    options.dataFolder = root / "drive_c";
    options.windowSize = size;
    options.internet = line;
    options.opener = [this](const QUrl& url) {
        opened += url.toString();
        return true;
    };
    options.media = std::move(media);
    m_program = std::make_unique<Program>(std::move(options));
    const Result<void> started = m_program->start();
    EXPECT_TRUE(started.ok()) << (started ? "" : qPrintable(started.failure().message));
    std::filesystem::copy(photographs(), root / "Pictures");
    settle(60);
}

Walk::Walk(const Screen& screen, const QString& labSettings, Internet* line, Cards::Source media)
    : Walk(screen.size, labSettings + (screen.contrast ? u"[Look]\nContrast = yes\n"_s : QString()), line,
           std::move(media)) {
    if (screen.english)
        press(u"hatchala"_s, u"Check1"_s);
}

Walk::~Walk() = default;

DrivePath Walk::pictureFolder() const {
    return m_program->platform().files.drives().toDrive(HostPath(m_folder.path().toStdString()) / "Pictures");
}

QString focusName() {
    return QApplication::focusWidget() ? QApplication::focusWidget()->objectName() : QString();
}

Page* Walk::find(PageId id) {
    return m_program->chain().find(id);
}

void Walk::settle(int milliseconds) {
    QTest::qWait(milliseconds);
    // A busy machine may not have come to it in that time, nor to laying out what the page now says.
    m_program->window().renderNow();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::LayoutRequest);
    m_program->window().presses().rest();
}

void Walk::expectDone(const Result<void>& step) {
    EXPECT_TRUE(step.ok()) << (step ? "" : qPrintable(step.failure().message));
    settle();
}

void Walk::press(const QString& page, const QString& control, const QString& comes) {
    expectDone(finder().press(page, control));
    if (!comes.isEmpty())
        waitFor(comes);
}

void Walk::choose(const QString& page, const QString& control, const QString& row) {
    expectDone(finder().choose(page, control, row));
}

void Walk::activate() {
    m_program->window().activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&m_program->window()));
}

void Walk::key(Qt::Key code) {
    QWidget* target = QApplication::focusWidget();
    QTest::keyClick(target ? target : static_cast<QWidget*>(&m_program->window()), code);
    settle();
}

QWidget& Walk::control(const QString& name) {
    auto* widget = m_program->window().frontView()->findChild<QWidget*>(name);
    if (!widget)
        widget = m_program->window().findChild<QWidget*>(name);
    EXPECT_TRUE(widget) << qPrintable(name);
    return widget ? *widget : *m_program->window().frontView();
}

void Walk::pick(const QString& page, const QString& button, const DrivePath& path) {
    m_program->dialogs().nextPick = [this, path] { return path.isEmpty() ? pictureFolder() / u"IMG_0001.jpg" : path; };
    press(page, button);
    m_program->dialogs().nextPick = {};
    settle(300);
}

bool Walk::pressable(const QString& page, const QString& control) {
    const Result<bool> visible = finder().visible(page, control);
    return visible.ok() && *visible;
}

void Walk::type(const QString& page, const QString& control, const QString& text) {
    expectDone(finder().type(page, control, text));
}

void Walk::waitFor(const QString& page) {
    EXPECT_TRUE(QTest::qWaitFor([&] { return finder().frontPage() == page; }, 20000))
        << "in front: " << qPrintable(finder().frontPage()) << ", wanted: " << qPrintable(page)
        << ", boxes: " << qPrintable(m_program->dialogs().shownTexts.join(u" | "_s));
    settle();
}

void Walk::go(const QString& route, const std::function<void(const QString&)>& look) {
    for (const QString& step : route.split(u' ', Qt::SkipEmptyParts)) {
        const QString page = finder().frontPage();
        const QString control = step.section(QRegularExpression(u"[>=~+]"_s), 0, 0);
        if (step == u"!"_s)
            m_program->dialogs().closeMessages();
        else if (step.startsWith(u':'))
            look(step.mid(1));
        else if (step.contains(u'='))
            type(page, control, step.section(u'=', 1).replace(u'_', u' '));
        else if (step.contains(u'~'))
            choose(page, control, step.section(u'~', 1));
        else if (step.endsWith(u'+'))
            expectDone(finder().tick(page, control, true));
        else
            press(page, control, step.section(u'>', 1));
    }
}

void Walk::writeFrames() {
    const QString root = m_folder.filePath(u"drive_c/2000lumora/misgarot"_s);
    for (const auto& [category, count] : {std::pair("Classic", 8), std::pair("Party", 3)}) {
        const QDir folder(root + u'/' + QString::fromLatin1(category));
        ASSERT_TRUE(QDir().mkpath(folder.path()));
        for (int i = 1; i <= count; ++i) {
            QImage frame(450, 300, QImage::Format_RGB32);
            frame.fill(QColor::fromHsv(i * 40, i == 1 ? 0 : 160, i == 2 ? 30 : 230));
            const int border = 10 + 4 * i;
            QPainter(&frame).fillRect(frame.rect().adjusted(border, border, -border, -border), Qt::black);
            const QString name = QString::number(i).rightJustified(3, u'0');
            EXPECT_TRUE(frame.save(folder.filePath(u'k' + name + u".bmp"_s)));
            EXPECT_TRUE(frame.save(folder.filePath(name + u".bmp"_s)));
            EXPECT_TRUE(frame.save(folder.filePath(name + u".png"_s)));
        }
    }
}

void Walk::toEditor() {
    writeFrames();
    go(toMenu + u"Image1(1) "_s + toOptions + toBorder + toPictures);
    pick(u"kyoskNew"_s, u"Image5"_s);
    go(u"Picture1(0)>tFrmNew"_s);
}

DrivePath Walk::writeFlashPhotograph() {
    Bitmap picture = samplePhotograph(flashPhotograph, 5);
    QPainter painter(&picture.image());
    painter.setPen(Qt::NoPen);
    QRadialGradient pupil(redEye, 17);
    pupil.setColorAt(0, QColor(205, 34, 44));
    pupil.setColorAt(1, QColor(120, 110, 100));
    for (const auto& [radius, brush] :
         {std::pair(80, QBrush(QColor(222, 178, 150))), {30, QBrush(QColor(96, 62, 40))}, {17, QBrush(pupil)}}) {
        painter.setBrush(brush);
        painter.drawEllipse(redEye, radius, radius);
    }
    write(pictureFolder() / u"IMG_0001.jpg", take(encodeJpeg(picture, 95)));
    return pictureFolder() / u"IMG_0001.jpg";
}

void Walk::write(const DrivePath& path, const QByteArray& bytes) {
    const Files& files = m_program->platform().files;
    std::filesystem::create_directories(files.drives().toHost(path)->parent_path());
    EXPECT_TRUE(files.writeWhole(path, bytes).ok());
}

void Walk::shot(const QString& name) {
    settle();
    const QString folder = qEnvironmentVariable("LUMORA_SHOTS");
    if (folder.isEmpty())
        return;
    const QPixmap grab = m_program->window().grab();
    EXPECT_TRUE(grab.save(u"%1/%2-%3x%4.png"_s.arg(folder, name).arg(grab.width()).arg(grab.height())));
}

} // namespace lumora
