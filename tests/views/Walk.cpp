#include "Walk.h"

#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "samples/SamplePhotographs.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/Take.h"
#include "views/kit/ChoiceCards.h"
#include "views/kit/Overlay.h"
#include "views/kit/TouchKeyboard.h"
#include "views/window/DoubledPress.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"
#include "views/window/ScreenDialogs.h"

#include <QAbstractButton>
#include <QAbstractItemModel>
#include <QAbstractScrollArea>
#include <QAccessible>
#include <QApplication>
#include <QComboBox>
#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QImage>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QLockFile>
#include <QPainter>
#include <QPushButton>
#include <QRegularExpression>
#include <QScrollArea>
#include <QTest>

#include <gtest/gtest.h>

#include <algorithm>

namespace lumora {

namespace {

// No order of a test may leave the machine: nobody listens at this port.
constexpr const char* labText = "[Server]\nHost = 127.0.0.1:9\nUser = u\nPassword = p\n[Lab]\nPhone = 03-1234567\n"
                                "Mail = lab@example.com\n";

bool hasHebrew(const QString& text) {
    return std::any_of(text.begin(), text.end(),
                       [](QChar c) { return c.unicode() >= 0x0590 && c.unicode() <= 0x05FF; });
}

QString nameOf(const QWidget& widget) {
    return u"%1 \"%2\""_s.arg(QString::fromLatin1(widget.metaObject()->className()), widget.objectName());
}

void unnamed(QAccessibleInterface* node, QStringList& faults) {
    if (!node || !node->isValid() || node->state().invisible)
        return;
    switch (node->role()) {
    case QAccessible::Button:
    case QAccessible::CheckBox:
    case QAccessible::RadioButton:
    case QAccessible::EditableText:
    case QAccessible::ComboBox:
    case QAccessible::List:
        if (node->text(QAccessible::Name).trimmed().isEmpty() && node->object() &&
            node->object()->objectName() != u"qt_scrollarea_viewport"_s)
            faults += u"no accessible name: %1 \"%2\""_s.arg(
                QString::fromLatin1(node->object()->metaObject()->className()), node->object()->objectName());
        break;
    default:
        break;
    }
    if (node->role() == QAccessible::ComboBox)
        return; // its rows are a window of their own
    for (int i = 0; i < node->childCount(); ++i)
        unnamed(node->child(i), faults);
}

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

QString rowsOf(const QAbstractItemModel& model) {
    QString all;
    for (int row = 0; row < model.rowCount(); ++row)
        all += model.index(row, 0).data().toString() + u' ';
    return all;
}

// Of those that can be chosen.
int leastRow(const QWidget& widget) {
    int least = 44;
    if (const auto* box = qobject_cast<const QComboBox*>(&widget); box && box->count() > 0) {
        box->view()->ensurePolished();
        least = box->view()->sizeHintForRow(0);
    }
    const auto* list = qobject_cast<const QListWidget*>(&widget);
    for (int i = 0; list && list->focusPolicy() != Qt::NoFocus && i < list->count(); ++i) {
        if (list->item(i)->flags() & Qt::ItemIsEnabled)
            least = std::min(least, list->visualItemRect(list->item(i)).height());
    }
    return least;
}

bool insideScroller(const QWidget& widget) {
    for (const QWidget* parent = widget.parentWidget(); parent; parent = parent->parentWidget()) {
        if (qobject_cast<const QAbstractScrollArea*>(parent))
            return true;
    }
    return false;
}

// Drawn with room around it, the label puts ink outside its place. The rim of a letter may reach a pixel out.
bool cutsInk(QLabel& label) {
    constexpr int room = 30;
    constexpr int rim = 1;
    const QRect place = label.geometry();
    const QMargins margins = label.contentsMargins();
    label.setContentsMargins(margins + room);
    label.setGeometry(place + QMargins(room, room, room, room));
    QImage drawn(label.size(), QImage::Format_Alpha8);
    drawn.fill(0);
    label.render(&drawn, {}, {}, QWidget::RenderFlags());
    label.setContentsMargins(margins);
    label.setGeometry(place);
    const QRect seen(QPoint(room - rim, room - rim), place.size() + QSize(2 * rim, 2 * rim));
    for (int y = 0; y < drawn.height(); ++y) {
        for (int x = 0; x < drawn.width(); ++x) {
            if (!seen.contains(x, y) && drawn.constScanLine(y)[x] > 64)
                return true;
        }
    }
    return false;
}

QString clippedText(const QWidget& widget) {
    if ((qobject_cast<const QPushButton*>(&widget) || widget.inherits("QCheckBox")) &&
        widget.sizeHint().width() > widget.width() + 1)
        return u"needs %1 and is %2 wide"_s.arg(widget.sizeHint().width()).arg(widget.width());
    return {};
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
    : Walk(screen.size, labSettings, line, std::move(media)) {
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
    m_program->window().renderNow(); // a busy machine may not have come to it in that time
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

QStringList Walk::faults() {
    const bool english = m_program->state().english();
    QStringList result;
    MainWindow& window = m_program->window();
    unnamed(QAccessible::queryAccessibleInterface(&window), result);
    const Overlay* panel = frontOverlay(window);
    const auto* keys = window.findChild<TouchKeyboard*>();
    const QWidget* root = keys && keys->isVisible() ? static_cast<const QWidget*>(keys)
                          : panel                   ? static_cast<const QWidget*>(panel)
                                                    : window.frontView();
    if (root->layoutDirection() != (english ? Qt::LeftToRight : Qt::RightToLeft))
        result += u"the page runs the other way"_s;
    if (english && hasHebrew(window.windowTitle()))
        result += u"a Hebrew title"_s;
    for (const Controls::Entry& entry : m_program->chain().front()->controls().all()) {
        if (!entry.caption)
            continue;
        const auto* cards = root->findChild<ChoiceCards*>(entry.name);
        const auto* mark = cards ? cards->card(entry.caption->text) : root->findChild<QAbstractButton*>(entry.name);
        if (mark && mark->isCheckable() &&
            mark->isChecked() != (cards || static_cast<const CheckCaption&>(*entry.caption).checked))
            result += u"%1 shows another mark than the page has"_s.arg(entry.name);
    }
    for (const auto* area : root->findChildren<QScrollArea*>()) {
        const auto parts = area->widget()->findChildren<QWidget*>(Qt::FindDirectChildrenOnly);
        for (auto at = parts.begin(); at != parts.end(); ++at) {
            for (auto other = parts.begin(); other != at; ++other) {
                if ((*at)->isVisible() && (*other)->isVisible() && (*at)->geometry().intersects((*other)->geometry()))
                    result += u"%1 lies over %2"_s.arg(nameOf(**at), nameOf(**other));
            }
        }
    }
    for (QWidget* widget : root->findChildren<QWidget*>()) {
        if (!widget->isVisible() || widget->size().isEmpty())
            continue;
        const auto* button = qobject_cast<const QAbstractButton*>(widget);
        const bool control =
            button ||
            (qobject_cast<const QLineEdit*>(widget) && !qobject_cast<const QComboBox*>(widget->parentWidget())) ||
            qobject_cast<const QComboBox*>(widget);
        const bool partOfBox = widget->parentWidget() && widget->parentWidget()->inherits("QComboBox");
        const bool foreign = insideScroller(*widget) || partOfBox;
        if (control && !partOfBox && (widget->width() < 44 || widget->height() < 44))
            result += u"%1 is %2x%3, under 44"_s.arg(nameOf(*widget)).arg(widget->width()).arg(widget->height());
        if (const int row = leastRow(*widget); row < 44)
            result += u"%1 has rows of %2, under 44"_s.arg(nameOf(*widget)).arg(row);
        if (control && !foreign) {
            if (widget->objectName().isEmpty())
                result += u"no object name: "_s + nameOf(*widget);
            const QRect whole = widget->rect();
            if (widget->visibleRegion().boundingRect() != whole)
                result += u"%1 is cut off"_s.arg(nameOf(*widget));
        }
        if (!foreign) {
            const QString clipped = clippedText(*widget);
            if (!clipped.isEmpty())
                result += u"%1: %2"_s.arg(nameOf(*widget), clipped);
            if (auto* label = qobject_cast<QLabel*>(widget); label && !label->text().isEmpty() && cutsInk(*label))
                result += u"%1 \"%2\" loses ink at an edge"_s.arg(nameOf(*label), label->text());
            if (qobject_cast<const QLabel*>(widget) && widget->visibleRegion().boundingRect() != widget->rect())
                result += u"%1 \"%2\" is cut off"_s.arg(nameOf(*widget), qobject_cast<const QLabel*>(widget)->text());
        }
        if (!foreign && button && (button->text() + button->accessibleName()).trimmed().isEmpty())
            result += u"no caption: "_s + nameOf(*widget);
        if (english && !widget->property("letterOfAnyLanguage").toBool()) {
            QString said = widget->accessibleName() + widget->accessibleDescription() + widget->toolTip();
            if (button)
                said += button->text();
            if (const auto* label = qobject_cast<const QLabel*>(widget))
                said += label->text();
            if (const auto* box = qobject_cast<const QComboBox*>(widget))
                said += box->placeholderText() + box->currentText() + rowsOf(*box->model());
            if (const auto* line = qobject_cast<const QLineEdit*>(widget))
                said += line->placeholderText();
            if (const auto* list = qobject_cast<const QListWidget*>(widget))
                said += rowsOf(*list->model());
            if (hasHebrew(said))
                result += u"Hebrew on an English page: %1: %2"_s.arg(nameOf(*widget), said);
        }
    }
    return result;
}

} // namespace lumora
