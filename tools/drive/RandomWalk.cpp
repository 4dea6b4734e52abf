#include "drive/RandomWalk.h"

#include "app/Program.h"
#include "common/AnsiCodePage.h"
#include "drive/PageFaults.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/kit/HoldButton.h"
#include "views/kit/Overlay.h"
#include "views/window/MainWindow.h"
#include "views/window/MessagePanel.h"
#include "views/window/PageView.h"
#include "views/window/ScreenDialogs.h"

#include <QAbstractSlider>
#include <QComboBox>
#include <QDir>
#include <QJsonArray>
#include <QJsonDocument>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>

#include <algorithm>
#include <filesystem>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int betweenLooks = 2;       // milliseconds
constexpr int longestWait = 120'000;  // milliseconds of work, or of a page that offers nothing
constexpr int pressesOfTheEnd = 1500; // until a page counts as one without a way on
constexpr int leavingIsRare = 12;     // one of so many drawn exits is pressed
constexpr int goingAwayIsRare = 25;   // one of so many presses is the last of a customer on a kiosk
constexpr int restOfEyes = 150;       // milliseconds until a page lies as it will
constexpr int looksOfEyes = 8;
constexpr int turnOfClock = 1100; // milliseconds between two turns of the clock, which is asked each second
constexpr std::chrono::seconds silence{
    100}; // longer than a kiosk of a walk waits before it asks, and then for the answer

// What a customer types, by the box; a box that is not named takes any of them.
const QStringList names = {u"דנה לוי"_s, u"John O'Neil"_s, u"רות \"רותי\" כהן"_s, u"A"_s,
                           u"משפחת בן-דוד, חולון, קומה 3"_s};
const QStringList telephones = {u"03-1234567"_s, u"052-7654321"_s, u"+972-52-7654321"_s, u"0501234567"_s,
                                u"02 6543210 / 17"_s};
const QStringList addresses = {u"הרצל 5, תל אביב"_s, u"12 Long Street, Haifa 3312345"_s};
const QStringList mailNames = {u"dana"_s, u"ruth.cohen@example.com"_s};
const QStringList domains = {u"example.com"_s, u"example.org"_s};
const QStringList notes = {u"מתנה לסבתא"_s, u"Please call first"_s, QString(70, u'ש') + u" 12"_s};

const std::vector<std::pair<QString, const QStringList*>> typed = {
    {u"nnn.Text2"_s, &names},         {u"nnn.Text3"_s, &telephones},    {u"nnn.Text4"_s, &addresses},
    {u"nnn.Text1(0)"_s, &names},      {u"nnn.Text1(1)"_s, &telephones}, {u"nnn.Text1(2)"_s, &names},
    {u"nnn.Text1(3)"_s, &mailNames},  {u"nnn.Combo4Mail"_s, &domains},  {u"kyoskNew.Text1"_s, &mailNames},
    {u"kyoskNew.Combo1"_s, &domains}, {u"kyoskNew.Text2"_s, &notes},
};

const QStringList& wordsFor(const QString& control) {
    const auto at = std::find_if(typed.begin(), typed.end(), [&](const auto& row) { return row.first == control; });
    return at == typed.end() ? names : *at->second;
}

// The way on from each page, the first row that applies: a box that is empty is filled, a group of which nothing is
// marked gets a mark, and the rest is pressed.
enum class Way { Fill, Mark, Press };
struct WayRow {
    const char16_t* page;
    const char16_t* controls; // names, parted by a blank; the name of a group stands for one of its members
    Way way = Way::Press;
};
constexpr WayRow wayOn[] = {
    {u"hatchala", u"Command4Hemshech Command4Bitul"},
    {u"hatchala", u"List1"},
    {u"hatchala", u"Image1"},
    {u"nnn", u"Command9"},
    {u"nnn", u"Image1(0) Image1(1) Image1(1) Image1(2) Image1(6)"},
    {u"nnn", u"Text2", Way::Fill},
    {u"nnn", u"Text3", Way::Fill},
    {u"nnn", u"Text4", Way::Fill},
    {u"nnn", u"Command12"},
    {u"nnn", u"Option1", Way::Mark},
    {u"nnn", u"Option3"},
    {u"nnn", u"Image13", Way::Mark},
    {u"nnn", u"Command6"},
    {u"nnn", u"Option4 Option5"},
    {u"nnn", u"Check1", Way::Mark},
    {u"nnn", u"Command3"},
    {u"nnn", u"Text1(0)", Way::Fill},
    {u"nnn", u"Text1(1)", Way::Fill},
    {u"nnn", u"Text1(2)", Way::Fill},
    {u"nnn", u"Text1(3)", Way::Fill},
    {u"nnn", u"Command17"},
    {u"nnn", u"SoogAlb", Way::Mark},
    {u"nnn", u"Combo4Horim", Way::Mark},
    {u"nnn", u"Command16"},
    {u"nnn", u"Combo4Godel", Way::Mark},
    {u"nnn", u"Command18"},
    {u"nnn", u"Combo4Cricha", Way::Mark},
    {u"nnn", u"Command19"},
    {u"nnn", u"Combo4Niyar", Way::Mark},
    {u"nnn", u"Command20"},
    {u"nnn", u"Command21"},
    {u"nnn", u"Check6", Way::Mark},
    {u"nnn", u"Command22"},
    {u"kyoskNew", u"helpClose"},
    {u"kyoskNew", u"Command4"},
    {u"kyoskNew", u"Command20 Command21"},
    {u"kyoskNew", u"Command4Snif"},
    {u"kyoskNew", u"Text1", Way::Fill},
    {u"kyoskNew", u"Txt4Ml2", Way::Fill},
    {u"kyoskNew", u"Text2", Way::Fill},
    {u"kyoskNew", u"Combo1", Way::Fill},
    {u"kyoskNew", u"Command8 Command7"},
    {u"kyoskNew", u"firstFolder"},
    {u"kyoskNew", u"Image7 Image13 Picture1 Picture1 Command24"},
    {u"tFrmNew", u"hintsClose"},
    {u"tFrmNew", u"CommandDone"},
    {u"mikledet", u"CommandDone"},
    {u"RedI", u"CommandHelpClose"},
    {u"RedI", u"Image8"},
    {u"Form3", u"Command3"},
    {u"Havharot", u"Command1"},
    {u"MoogMeret", u"Command28"},
    {u"B3", u"Command4Bli Command4Bli Command4Hazor"},
    {u"Form2", u"Command4Bli Command4Bli Command4Hazor"},
    {u"B3", u"Command5"},
    {u"FtpFrm", u"Command4Bli Command4Bli Command4Hazor"},
    {u"FtpFrm", u"Command14"},
    {u"FtpFrm", u"Command28"},
    {u"FtpFrm", u"Command10"},
    {u"FtpFrm", u"Image5"},
    {u"FtpFrm", u"Command12"},
    {u"UploadForm", u"Command4Bli Command4Bli Command4Hazor"},
    {u"UploadForm", u"Command28"},
    {u"UploadForm", u"Command10"},
    {u"UploadForm", u"Image5"},
};

// Where the way back begins on each page; one of them can be pressed whenever nothing is at work.
constexpr WayRow wayBack[] = {
    {u"nnn", u"Command4 Command2 Image1(5) Image1(7) Command9"},
    {u"kyoskNew", u"changeDetails Image10 Command10 Command4 Command5 helpClose"},
    {u"tFrmNew", u"CommandDone hintsClose"},
    {u"mikledet", u"CommandDone"},
    {u"RedI", u"Image9"},
    {u"Form3", u"Command3"},
    {u"Havharot", u"Command1"},
    {u"MoogMeret", u"Command28 Command4Orders"},
    {u"SpltForm", u"Image3"},
    {u"B3", u"Command7 Command2 Command4Hazor"},
    {u"Form2", u"Command7 Command4Hazor"},
    {u"FtpFrm", u"changeOrder Command28 Command11 Image3 Command15 Command4Hazor"},
    {u"UploadForm", u"changeOrder Command28 endClose Image3 Command15 Command4Hazor"},
};

// Controls that end the program.
const QSet<QString> exits = {u"hatchala.Image3"_s,   u"kyoskNew.Command15"_s, u"kyoskNew.Image10"_s,
                             u"FtpFrm.Command8"_s,   u"FtpFrm.Command11"_s,   u"FtpFrm.Command16"_s,
                             u"FtpFrm.Image3"_s,     u"UploadForm.Image3"_s,  u"UploadForm.endClose"_s,
                             u"Havharot.Command2"_s, u"MoogMeret.Command6"_s, u"B3.Command7"_s,
                             u"Form2.Command7"_s};

bool isPreparing(const QString& page) {
    return page == u"B3" || page == u"Form2";
}
bool isSending(const QString& page) {
    return page == u"FtpFrm" || page == u"UploadForm";
}

bool canBeUsed(const QWidget& widget) {
    return widget.isVisible() && widget.isEnabled() && !widget.visibleRegion().isEmpty();
}

// A picture or a drawing that answers to the place of the press.
bool answersToPlace(const QWidget& widget) {
    static const QSet<QByteArray> drawings = {"lumora::EditorPaper", "lumora::RedEyeCanvas", "lumora::RedEyeOverview",
                                              "lumora::PaletteBar", "lumora::LargePicture"};
    return drawings.contains(widget.metaObject()->className()) || qobject_cast<const QAbstractSlider*>(&widget);
}

QStringList rowsOf(const QWidget& widget) {
    QStringList rows;
    if (const auto* box = qobject_cast<const QComboBox*>(&widget)) {
        for (int row = 0; row < box->count(); ++row)
            rows += box->itemText(row);
    } else if (const auto* list = qobject_cast<const QListWidget*>(&widget)) {
        for (int row = 0; row < list->count(); ++row)
            rows += list->item(row)->text();
    }
    return rows;
}

QString textOf(const PageView& view, const QWidget& widget) {
    if (const auto* edit = qobject_cast<const QLineEdit*>(&widget))
        return edit->text();
    if (const auto* box = qobject_cast<const QComboBox*>(&widget))
        return box->currentText();
    if (const QStringList rows = rowsOf(widget); !rows.isEmpty())
        return rows.join(u'\n');
    if (const PageView::Control* control = view.control(widget.objectName())) {
        if (control->text)
            return control->text();
        if (control->caption)
            return control->caption->text;
    }
    const auto* label = qobject_cast<const QLabel*>(&widget);
    return label ? label->text() : QString();
}

bool isMarked(const QWidget& widget) {
    const auto* button = qobject_cast<const QAbstractButton*>(&widget);
    return button && button->isChecked();
}

// Without the box that a caption is dragged by, which is no part of the print.
QPixmap paperAlone(QWidget& paper) {
    QPixmap drawn(paper.size());
    paper.render(&drawn, {}, {}, QWidget::DrawWindowBackground);
    return drawn;
}

// A control is named by the row of the table itself or is a member of the group that the row names.
bool goesBy(const QWidget& widget, const QString& name) {
    return widget.objectName() == name || widget.objectName().startsWith(name + u'(');
}

} // namespace

RandomWalk::RandomWalk(Plan plan)
    : m_plan(std::move(plan))
    , m_random(m_plan.seed)
    , m_file(QDir(m_plan.record).filePath(u"seen.jsonl"_s)) {
    if (!m_file.open(QIODevice::WriteOnly))
        stop(u"%1: %2"_s.arg(m_file.fileName(), m_file.errorString()));
    m_timer.setInterval(betweenLooks);
    connect(&m_timer, &QTimer::timeout, this, &RandomWalk::step);
    m_letGo.setSingleShot(true);
    connect(&m_letGo, &QTimer::timeout, this, [this] {
        if (const auto held = std::exchange(m_held, std::nullopt))
            m_controls->letGo(*held);
    });
}

int RandomWalk::draw(int below) {
    return static_cast<int>(m_random() % static_cast<unsigned>(std::max(1, below)));
}

void RandomWalk::walk(Program& program) {
    m_program = &program;
    m_controls.emplace(program.window(), m_plan.hand);
    m_held.reset();
    m_acting = m_inTheMiddle = false;
    m_said = 0;
    m_away = false;
    const Files& files = program.platform().files;
    program.dialogs().nextPick = [this, &files]() -> std::optional<DrivePath> {
        const DrivePath folder = files.drives().toDrive(toHostPath(drawn(m_plan.folders)));
        const QStringList pictures = files.names(folder, u"*.jpg;*.jpeg"_s);
        if (draw(8) == 0 || pictures.isEmpty()) {
            write({{u"picked"_s, QString()}});
            return DrivePath();
        }
        const QString picked = AnsiCodePage::squeeze((folder / drawn(pictures)).text());
        write({{u"picked"_s, picked}});
        return DrivePath(picked);
    };
    connect(&program.chain(), &PageChain::shown, this, [this](Page* page) { pageShown(pageName(page->id())); });
    pageShown(m_controls->frontPage());
    m_sinceAct.start();
    m_timer.start();
}

void RandomWalk::pageShown(const QString& page) {
    const QString before = m_beforeFront = std::exchange(m_front, page);
    write({{u"front"_s, page}, {u"before"_s, before}});
    if (isSending(page) || isPreparing(before))
        keepOrders();
    m_fromOrder = isSending(before) || isPreparing(before);
}

void RandomWalk::stop(const QString& why) {
    if (m_over)
        return;
    keepPaper(nullptr, {});
    write({{u"end"_s, why.isEmpty() ? u"the order has come to its end"_s : why}});
    m_failure = why;
    m_over = true;
    m_timer.stop();
    Q_EMIT over();
}

void RandomWalk::write(QJsonObject line) {
    line.insert(u"n"_s, ++m_line);
    m_file.write(QJsonDocument(line).toJson(QJsonDocument::Compact) + '\n');
    m_file.flush();
}

QJsonObject RandomWalk::seen(const PageView& view) {
    QJsonObject shown;
    QJsonArray marked;
    QJsonArray words;
    for (const QWidget* widget : view.findChildren<QWidget*>()) {
        if (!widget->isVisible() || widget->objectName().startsWith(u"qt_"))
            continue;
        if (const auto* label = qobject_cast<const QLabel*>(widget); label && widget->objectName().isEmpty()) {
            if (!label->text().isEmpty())
                words += label->text();
        } else if (!widget->objectName().isEmpty()) {
            shown.insert(widget->objectName(), textOf(view, *widget));
            if (isMarked(*widget))
                marked += widget->objectName();
        }
    }
    return {{u"shown"_s, shown}, {u"marked"_s, marked}, {u"words"_s, words}};
}

// What the editor showed last of a picture stays under the line that told of it.
void RandomWalk::keepPaper(const PageView* view, const QString& title) {
    auto* paper = view ? view->findChild<QWidget*>(u"PicPic"_s) : nullptr;
    const bool isShown = paper && paper->isVisible();
    if (!m_paper.isNull() && (!isShown || title != m_title))
        m_paper.save(QDir(m_plan.record).filePath(u"preview.%1.png"_s.arg(m_paperLine)), "PNG", 89);
    m_title = title;
    m_paper = isShown ? paperAlone(*paper) : QPixmap();
    m_paperLine = m_line;
}

// Links are enough: the program replaces files as a whole.
void RandomWalk::keepOrders() {
    const Files& files = m_program->platform().files;
    for (const auto& [drivePath, name] : {std::pair(u"C:\\2000lumora\\!!000"_s, u"orders"_s),
                                          std::pair(u"C:\\2000lumora\\zmany\\tempred"_s, u"corrected"_s)}) {
        const auto from = files.drives().toHost(DrivePath(drivePath));
        const HostPath to = toHostPath(m_plan.record) / std::to_string(m_line) / name.toStdString();
        std::error_code error;
        if (!from || !std::filesystem::is_directory(*from, error))
            continue;
        std::filesystem::create_directories(to, error);
        std::filesystem::copy(
            *from, to, std::filesystem::copy_options::recursive | std::filesystem::copy_options::create_hard_links,
            error);
        if (error)
            return stop(u"the order folders can't be kept: %1"_s.arg(QString::fromStdString(error.message())));
    }
}

void RandomWalk::step() {
    if (m_over || m_held || m_program->chain().hasEnded())
        return;
    const QStringList& said = m_program->dialogs().shownTexts;
    for (; m_said < said.size(); ++m_said)
        write({{u"said"_s, said[m_said]}});
    if (m_away)
        m_away = isAway();
    if (m_away || isStillLooking() || answerPanel())
        return;
    if (m_acting || m_program->platform().pump.pumping()) {
        if (m_sinceAct.elapsed() > longestWait)
            stop(u"work without end on %1"_s.arg(m_front));
        else if (m_pressAfter > 0 && m_sinceAct.elapsed() > m_pressAfter && !m_inTheMiddle)
            pressInTheMiddle();
        return;
    }
    m_program->window().renderNow();
    if (m_acts > m_plan.presses + pressesOfTheEnd)
        return stop(u"no way to the end of the order from %1"_s.arg(m_front));
    if (m_acts >= m_plan.presses && hasOrderEnded())
        return stop({});
    // Only a press uses up what the seed draws, however long the page lets it wait.
    const std::mt19937 before = m_random;
    if (m_plan.clock && m_acts < m_plan.presses && !m_program->chain().front()->isUntouched() &&
        draw(goingAwayIsRare) == 0) {
        write({{u"away"_s, m_front}});
        m_away = true;
        m_sinceGone.start();
        m_sinceTurned.start();
        return;
    }
    const bool atWork = m_front == u"kyoskNew" || m_front == u"tFrmNew" || m_front == u"mikledet" || m_front == u"RedI";
    const bool onTheWay = m_acts >= m_plan.presses ? draw(10) > 0 : draw(atWork ? 4 : 2) == 0;
    std::optional<Act> act = onTheWay ? nextOnTheWay() : std::nullopt;
    // A page whose work begins by itself, or that waits for a count, offers nothing for a while.
    if (!act && !(onTheWay && (isPreparing(m_front) || isSending(m_front)) && m_sinceAct.elapsed() < 300))
        act = anyPress();
    if (act)
        return perform(std::move(*act));
    m_random = before;
    if (m_sinceAct.elapsed() > longestWait)
        stop(u"%1 has no way on"_s.arg(m_front));
}

// Each state of a page is looked at once, when it has come to rest.
bool RandomWalk::isStillLooking() {
    const PageView* view = m_program->window().frontView();
    if (!view)
        return false;
    m_program->window().renderNow();
    const QWidget* panel = frontOverlay(m_program->window());
    const QWidget& seenNow = panel ? *panel : static_cast<const QWidget&>(*view);
    QString sight = m_front + (m_program->state().english() ? u" English"_s : u" Hebrew"_s);
    for (const QWidget* widget : seenNow.findChildren<QWidget*>()) {
        const auto* label = qobject_cast<const QLabel*>(widget);
        if (widget->isVisible() && !widget->objectName().startsWith(u"qt_"))
            sight += u' ' + (panel && label ? label->text() : widget->objectName());
    }
    if (m_looked.contains(sight))
        return false;
    if (std::exchange(m_sight, sight) != sight) {
        m_sinceSight.start();
        m_looks = 0;
        m_faults.reset();
    }
    // On a busy machine the time may pass before anything is laid out.
    if (++m_looks < looksOfEyes || m_sinceSight.elapsed() < (m_faults ? 10 : 1) * restOfEyes)
        return true;
    QStringList data = m_plan.folders + names + telephones + addresses + mailNames + notes;
    for (const QString& folder : m_plan.folders)
        data += QDir(folder).entryList(QDir::Files);
    if (const auto frames = m_program->platform().files.drives().toHost(DrivePath(u"C:\\2000lumora\\misgarot"_s)))
        data += QDir(QString::fromStdString(frames->string())).entryList(QDir::Dirs);
    for (const auto& shop : m_program->state().profile.Shops)
        data += shop.name;
    const QStringList faults = pageFaults(*m_program, data.join(u' ')) + missingWays(*view);
    const bool again = !m_faults && !faults.isEmpty();
    if (again) { // what moves is none
        m_faults = faults;
        m_sinceSight.start();
        m_looks = 0;
        return true;
    }
    m_looked += sight;
    for (const QString& fault : faults) {
        if (m_faults->contains(fault))
            write({{u"fault"_s, fault}, {u"where"_s, m_front}, {u"english"_s, m_program->state().english()}});
    }
    return false;
}

// A panel's own buttons are its ways. What is at work goes on by itself.
QStringList RandomWalk::missingWays(const PageView& view) {
    const auto canBePressed = [](const QWidget* widget) {
        return canBeUsed(*widget) && ControlFinder::whyNotPressable(*widget).isEmpty();
    };
    if (const Overlay* panel = frontOverlay(m_program->window())) {
        const auto buttons = panel->findChildren<QAbstractButton*>();
        if (std::any_of(buttons.begin(), buttons.end(), canBePressed))
            return {};
        QStringList why{u"no way out of panel %1:"_s.arg(panel->objectName())};
        for (const QAbstractButton* button : buttons)
            why += button->objectName() + u' ' + ControlFinder::whyNotPressable(*button);
        return {why.join(u' ')};
    }
    if (m_acting || m_program->chain().isAnyWorking() || m_program->platform().pump.pumping())
        return {};
    // The keys on the screen cover the page's buttons until they are done.
    const auto done = m_program->window().findChildren<QAbstractButton*>(u"keyDone"_s);
    if (std::any_of(done.begin(), done.end(), canBePressed))
        return {};
    QStringList missing;
    const std::vector<QWidget*> widgets = usable(view);
    const auto leads = [&](const WayRow& row) {
        if (m_front != QString::fromUtf16(row.page))
            return false;
        const QStringList controls = QString::fromUtf16(row.controls).split(u' ');
        return std::any_of(widgets.begin(), widgets.end(), [&](const QWidget* widget) {
            return canBePressed(widget) && std::any_of(controls.begin(), controls.end(),
                                                       [&](const QString& name) { return goesBy(*widget, name); });
        });
    };
    if (!isPreparing(m_front) && !isSending(m_front) && std::none_of(std::begin(wayOn), std::end(wayOn), leads))
        missing += u"no way on"_s;
    if (m_front != u"hatchala" && std::none_of(std::begin(wayBack), std::end(wayBack), leads))
        missing += u"no way back"_s;
    return missing;
}

// The start page comes by itself, in the first language and with nothing of the customer who has gone.
bool RandomWalk::isAway() {
    const Page* front = m_program->chain().front();
    if (front && front->id() == PageId::hatchala && front->isUntouched() && !m_program->dialogs().isWaiting() &&
        !frontOverlay(m_program->window())) {
        write({{u"idled"_s, true}});
        return false;
    }
    if (m_sinceTurned.elapsed() > turnOfClock) {
        m_plan.clock->ahead += silence;
        m_sinceTurned.start();
    }
    if (m_sinceGone.elapsed() > longestWait)
        stop(u"nobody is there, and the start page does not come from %1"_s.arg(m_front));
    return true;
}

// The order was sent, or the start page tells that it stays at this station.
bool RandomWalk::hasOrderEnded() {
    const PageView* view = m_program->window().frontView();
    if (!m_fromOrder || m_front != u"hatchala" || !view)
        return false;
    QJsonObject line = seen(*view);
    const bool ended = isSending(m_beforeFront) || line.value(u"shown"_s).toObject().contains(u"Notice"_s);
    if (ended) {
        line.insert(u"page"_s, m_front);
        write(line);
    }
    m_fromOrder = false;
    return ended;
}

// A box or a question lies over the page.
bool RandomWalk::answerPanel() {
    for (MessagePanel* panel : m_program->window().findChildren<MessagePanel*>()) {
        if (!panel->isVisible())
            continue;
        const QList<QPushButton*> buttons = panel->findChildren<QPushButton*>();
        QList<QPushButton*> usableButtons;
        std::copy_if(buttons.begin(), buttons.end(), std::back_inserter(usableButtons),
                     [](const QPushButton* button) { return ControlFinder::whyNotPressable(*button).isEmpty(); });
        if (usableButtons.isEmpty()) {
            if (m_sinceAct.elapsed() > longestWait)
                stop(u"a box that can't be answered"_s);
            return true;
        }
        QPushButton* const pressed = drawn(usableButtons);
        write({{u"answered"_s, pressed->text()}});
        m_sinceAct.start();
        // The answer ends the loop of the question, and its handler goes on below this one.
        QMetaObject::invokeMethod(pressed, "click", Qt::QueuedConnection);
        m_said = m_program->dialogs().shownTexts.size();
        return true;
    }
    return false;
}

void RandomWalk::pressInTheMiddle() {
    m_pressAfter = 0;
    const PageView* view = m_program->window().frontView();
    if (!view || !(isPreparing(m_front) || isSending(m_front)))
        return;
    if (std::optional<Act> act = anyPress())
        perform(std::move(*act));
}

// The handler runs from an event of its own, so that the walk goes on where it waits in a loop.
void RandomWalk::perform(Act act) {
    const PageView* view = m_program->window().frontView();
    QJsonObject line = view ? seen(*view) : QJsonObject();
    line.insert(u"act"_s, act.line);
    line.insert(u"page"_s, m_front);
    write(line);
    keepPaper(view, line[u"shown"_s][u"Title"_s].toString());
    if (++m_acts == m_plan.presses)
        write({{u"ending"_s, true}});
    m_pressAfter = draw(6) == 0 ? 1 + draw(300) : 0;
    bool& running = m_acting ? m_inTheMiddle : m_acting;
    running = true;
    m_sinceAct.start();
    QMetaObject::invokeMethod(
        this,
        [this, &running, act = std::move(act)] {
            if (const Result<void> done = act.run(); !done)
                write({{u"refused"_s, done.failure().message}});
            running = false;
        },
        Qt::QueuedConnection);
}

std::vector<QWidget*> RandomWalk::usable(const PageView& view) const {
    std::vector<QWidget*> found;
    for (QWidget* widget : view.findChildren<QWidget*>()) {
        if (!widget->objectName().isEmpty() && !widget->objectName().startsWith(u"qt_") && canBeUsed(*widget))
            found.push_back(widget);
    }
    return found;
}

std::optional<RandomWalk::Act> RandomWalk::nextOnTheWay() {
    const PageView* view = m_program->window().frontView();
    if (!view)
        return std::nullopt;
    const std::vector<QWidget*> widgets = usable(*view);
    for (const WayRow& row : wayOn) {
        if (m_front != QString::fromUtf16(row.page))
            continue;
        std::vector<QWidget*> fit;
        for (const QString& name : QString::fromUtf16(row.controls).split(u' ')) {
            for (QWidget* widget : widgets) {
                if (goesBy(*widget, name) && ControlFinder::whyNotPressable(*widget).isEmpty() &&
                    !(name == u"Picture1" && textOf(*view, *widget).isEmpty()))
                    fit.push_back(widget);
            }
        }
        if (fit.empty() || (row.way == Way::Mark && std::any_of(fit.begin(), fit.end(), [](const QWidget* widget) {
                                return isMarked(*widget);
                            })))
            continue;
        QWidget& taken = *drawn(fit);
        if (row.way == Way::Fill && !textOf(*view, taken).isEmpty() && !qobject_cast<QComboBox*>(&taken))
            continue;
        if (row.way == Way::Fill && qobject_cast<QComboBox*>(&taken) && textOf(*view, taken).contains(u'.'))
            continue;
        if (std::optional<Act> act = actOn(*view, taken))
            return act;
    }
    return std::nullopt;
}

std::optional<RandomWalk::Act> RandomWalk::anyPress() {
    if (const PageView* below = m_program->window().viewBelow(); below && draw(3) == 0) {
        if (std::optional<Act> act = anyPressOn(*below))
            return act;
    }
    const PageView* front = m_program->window().frontView();
    return front ? anyPressOn(*front) : std::nullopt;
}

std::optional<RandomWalk::Act> RandomWalk::anyPressOn(const PageView& view) {
    std::vector<QWidget*> widgets = usable(view);
    while (!widgets.empty()) {
        const int at = draw(static_cast<int>(widgets.size()));
        QWidget& widget = *widgets[static_cast<std::size_t>(at)];
        widgets.erase(widgets.begin() + at);
        const bool leaves = exits.contains(view.objectName() + u'.' + widget.objectName());
        if (leaves && (m_acts >= m_plan.presses || draw(leavingIsRare) > 0))
            continue;
        if (std::optional<Act> act = actOn(view, widget))
            return act;
    }
    return std::nullopt;
}

std::optional<RandomWalk::Act> RandomWalk::actOn(const PageView& view, QWidget& widget) {
    const QString page = view.objectName();
    const QString name = widget.objectName();
    if (!ControlFinder::whyNotPressable(widget).isEmpty())
        return std::nullopt;
    auto* box = qobject_cast<QComboBox*>(&widget);
    if (qobject_cast<QLineEdit*>(&widget) || (box && box->isEditable() && draw(2) == 0))
        return type(page, name);
    if (box || qobject_cast<QListWidget*>(&widget)) {
        const QStringList rows = rowsOf(widget);
        return rows.isEmpty() ? std::nullopt : std::optional(chooseRow(page, name, rows));
    }
    if (qobject_cast<HoldButton*>(&widget) && draw(2) == 0)
        return hold(page, name, 60 + draw(500));
    if (qobject_cast<QAbstractButton*>(&widget))
        return press(page, name);
    if (!answersToPlace(widget))
        return std::nullopt;
    const QPointF from(draw(101), draw(101));
    const QPointF to(draw(101), draw(101));
    const QString line = u" %1.%2 %3 %4"_s.arg(page, name).arg(from.x()).arg(from.y());
    if (draw(2) == 0)
        return Act{u"press-at"_s + line, [this, page, name, from] { return m_controls->pressAt(page, name, from); }};
    return Act{u"drag"_s + line + u" %1 %2"_s.arg(to.x()).arg(to.y()),
               [this, page, name, from, to] { return m_controls->drag(page, name, from, to); }};
}

RandomWalk::Act RandomWalk::press(const QString& page, const QString& name) const {
    return {u"press %1.%2"_s.arg(page, name), [this, page, name] { return m_controls->press(page, name); }};
}

RandomWalk::Act RandomWalk::hold(const QString& page, const QString& name, int milliseconds) {
    return {u"hold %1.%2 %3"_s.arg(page, name).arg(milliseconds), [this, page, name, milliseconds]() -> Result<void> {
                const Result<ControlFinder::Held> held = m_controls->hold(page, name);
                if (!held)
                    return held.failure();
                m_held = *held;
                m_letGo.start(milliseconds);
                return {};
            }};
}

RandomWalk::Act RandomWalk::type(const QString& page, const QString& name) {
    const QString text = drawn(wordsFor(page + u'.' + name));
    return {u"type %1.%2 %3"_s.arg(page, name, text),
            [this, page, name, text] { return m_controls->type(page, name, text); }};
}

RandomWalk::Act RandomWalk::chooseRow(const QString& page, const QString& name, const QStringList& rows) {
    const QString row = drawn(rows);
    return {u"choose %1.%2 %3"_s.arg(page, name, row),
            [this, page, name, row] { return m_controls->choose(page, name, row); }};
}

} // namespace lumora
