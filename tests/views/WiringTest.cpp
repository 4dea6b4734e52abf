#include "Walk.h"

#include "drive/NothingOpens.h"
#include "editing/redeye/RedI.h"
#include "imaging/files/PictureFile.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/FakeWebLab.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"
#include "views/window/ScreenDialogs.h"

#include <QApplication>
#include <QBuffer>
#include <QCheckBox>
#include <QClipboard>
#include <QPainter>
#include <QRegularExpression>
#include <QTest>
#include <QTimer>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <set>

namespace lumora {

namespace {

// The lines of wiring.txt, which tells its own language.
const QStringList& table() {
    static QFile file(QStringLiteral(LUMORA_WIRING));
    static const bool open = file.open(QIODevice::ReadOnly);
    static const QStringList lines = QString::fromUtf8(file.readAll()).split(u'\n');
    EXPECT_TRUE(open);
    return lines;
}

std::vector<std::string> pages() {
    std::vector<std::string> names;
    for (const QString& heading : table().filter(QRegularExpression(u"^page "_s)))
        names.push_back(heading.mid(5).toStdString());
    return names;
}

// "leter(3..5)" is leter(3), leter(4) and leter(5).
QStringList controlsOf(QString names) {
    static const QRegularExpression range(u"(\\S+)\\((\\d+)\\.\\.(\\d+)\\)"_s);
    for (auto found = range.match(names); found.hasMatch(); found = range.match(names)) {
        QString all;
        for (int i = found.captured(2).toInt(); i <= found.captured(3).toInt(); ++i)
            all += u"%1(%2) "_s.arg(found.captured(1)).arg(i);
        names.replace(found.captured(), all);
    }
    return names.split(u' ', Qt::SkipEmptyParts);
}

using Facts = QMap<QString, QString>;

// A program with a lab in memory.
class Scene {
public:
    explicit Scene(const QString& labSettings)
        : m_walk({1024, 768}, labSettings, &m_lab) {
        m_walk.activate();
        QApplication::clipboard()->clear();
        m_lab.folders[m_walk.program().state().profile.FtpFolder2];
    }
    void go(const QString& route);
    void expectChanges(const QString& control, const QStringList& gesture, QString changes);
    QString front() const { return ControlFinder(m_walk.program().window()).frontPage(); }
    QStringList names() const;

private:
    QString fact(const QString& name);
    Facts facts(const QStringList& changes);
    bool holds(const QString& change, const Facts& before, const Facts& now) const;
    Result<void> use(const QString& control, const QStringList& words);

    FakeWebLab m_lab;
    mutable Walk m_walk;
    NothingOpens m_opened;
    Facts m_last; // after the line before
};

// The controls of the view in front: what it has bound, and what else takes the keyboard.
QStringList Scene::names() const {
    QStringList names;
    const PageView* view = m_walk.program().window().frontView();
    for (const QWidget* widget : view->findChildren<QWidget*>(QRegularExpression(u"^(?!qt_)."_s))) {
        if (view->control(widget->objectName()) || widget->focusPolicy() & Qt::TabFocus)
            names += widget->objectName();
    }
    return names;
}

QString Scene::fact(const QString& name) {
    const SessionState& state = m_walk.program().state();
    const PageChain& chain = m_walk.program().chain();
    const auto* redEye = chain.find<RedI>();
    const RedEyeSight sight = redEye ? redEye->sight() : RedEyeSight();
    static const QStringList fields =
        u"x y circle glass kind shop branch deep mail focus front ended box opened copied asked"_s.split(u' ');
    const QVariantList values{sight.RedSearchX,
                              sight.RedSearchY,
                              sight.circleSize,
                              sight.Magnification,
                              static_cast<int>(state.Optint),
                              state.KodMishloach,
                              state.BranchChoice,
                              state.DchisaAmoka,
                              state.shemot.Mail,
                              focusName(),
                              front(),
                              chain.hasEnded(),
                              m_walk.program().dialogs().shownTexts.join(u'|'),
                              m_opened.taken.join(u'|'),
                              QApplication::clipboard()->text(),
                              m_lab.urls.join(u'|')};
    if (const qsizetype at = fields.indexOf(name); at >= 0)
        return values[at].toString();
    const PageView* view = m_walk.program().window().frontView();
    const QString id = name.section(u'.', 0, 0);
    const QString what = name.section(u'.', 1);
    if (id == u"record"_s)
        return state.edit.EditState.mid(what.section(u',', 0, 0).toInt() - 1, what.section(u',', 1).toInt()).trimmed();
    if (!view || view->isDetached())
        return {};
    const PageView::Control bound = view->control(id) ? *view->control(id) : PageView::Control();
    const Controls::Entry* entry = view->page().controls().find(id);
    const Caption* caption = bound.caption ? bound.caption : entry ? entry->caption : nullptr;
    const TextList* list = bound.list ? bound.list : entry ? entry->list : nullptr;
    if (what == u"look"_s) {
        QBuffer bytes;
        bound.widget->grab().save(&bytes, "PPM");
        return QString::number(qHash(bytes.data()));
    }
    if (what == u"text"_s)
        return bound.text ? bound.text() : caption ? caption->text : QString();
    int number = bound.widget && bound.widget->isVisible(); // "shown"
    if (what == u"row"_s || what == u"count"_s)
        number = !list ? -1 : what == u"row"_s ? list->currentIndex() : list->count();
    else if (caption && what != u"shown"_s)
        number = what == u"visible"_s   ? caption->visible
                 : what == u"enabled"_s ? caption->enabled
                                        : static_cast<const CheckCaption*>(caption)->checked;
    return QString::number(number);
}

Facts Scene::facts(const QStringList& changes) {
    m_walk.program().window().renderNow();
    Facts facts;
    for (const QString& change : changes) {
        for (const QString& name : change.split(QRegularExpression(u"[=~+-]@?"_s)))
            facts[name] = fact(name);
    }
    return facts;
}

bool Scene::holds(const QString& change, const Facts& before, const Facts& now) const {
    const qsizetype at = change.indexOf(QRegularExpression(u"[=~+-]"_s));
    const QString name = change.left(at);
    const QString is = now[name];
    const QString was = before[name];
    if (at < 0 || is == was)
        return is != was;
    QString wanted = change.mid(at + 1).replace(u'_', u' ');
    if (wanted.startsWith(u'@'))
        wanted = wanted == u"@last"_s ? m_last[name] : before[wanted.mid(1)];
    if (change[at] == u'=')
        return is == wanted;
    if (change[at] == u'~')
        return is.contains(wanted);
    const double more = is.trimmed().toDouble() - (wanted.isEmpty() ? was : wanted).trimmed().toDouble();
    return change[at] == u'+' ? more > 0 : more < 0;
}

void Scene::go(const QString& route) {
    SessionState& state = m_walk.program().state();
    const QMap<QString, std::function<void()>> acts = {
        {u"@folder"_s, [&] { m_walk.pick(u"kyoskNew"_s, u"Image5"_s); }},
        {u"@editor"_s, [&] { m_walk.toEditor(); }},
        {u"@home"_s, [&] { state.MishloachHabaita = true; }},
        {u"@damaged"_s, [&] { m_walk.write(m_walk.pictureFolder() / u"IMG_0002.jpg", "no picture"); }},
        {u"@red"_s,
         [&] {
             QImage eye(1200, 900, QImage::Format_RGB32);
             QRadialGradient red(444, 351, 14);
             red.setColorAt(0, QColor(205, 34, 44));
             red.setColorAt(1, QColor(120, 110, 100));
             QPainter(&eye).fillRect(eye.rect(), red);
             m_walk.write(m_walk.pictureFolder() / u"IMG_0001.jpg", *encodeJpeg(Bitmap(eye), 95));
         }},
        {u"@lines"_s,
         [&] {
             for (const QString& name : {u"IMG_0001.jpg"_s, u"IMG_0003.jpg"_s})
                 state.handOver.lines += u"1 1015GNB"_s + (m_walk.pictureFolder() / name).text();
         }},
        {u"@Form2"_s, [&] { m_walk.program().chain().show(PageId::Form2); }},
        {u"@away"_s, [&] { m_walk.program().chain().unload(PageId::FtpFrm); }},
        {u"@line"_s, [&] { m_lab.deadConnects = m_lab.deadPosts = m_lab.deadPosts ? 0 : FakeLab::always; }}};
    for (const QString& step : route.split(u' ', Qt::SkipEmptyParts)) {
        if (acts.contains(step))
            acts[step]();
        else if (step.startsWith(u'@'))
            go(table().filter(QRegularExpression(u'^' + step + u' ')).value(0).section(u' ', 1));
        else if (!step.startsWith(u'?'))
            m_walk.go(step);
        else
            EXPECT_TRUE(QTest::qWaitFor([&] { return holds(step.mid(1), {}, facts({step.mid(1)})); }, 20000));
    }
}

Result<void> Scene::use(const QString& control, const QStringList& words) {
    const ControlFinder finder(m_walk.program().window());
    const QString how = words[0];
    const QString what = words.value(1);
    const auto point = [&](int at) {
        return QPointF(words.value(at).section(u',', 0, 0).toDouble(), words.value(at).section(u',', 1).toDouble());
    };
    QWidget* widget = control == u"Page"_s ? nullptr : &m_walk.control(control);
    const auto* box = qobject_cast<QCheckBox*>(widget);
    const PageView::Control* bound = m_walk.program().window().frontView()->control(control);
    Result<void> done;
    if (how == u"click"_s && box)
        return finder.tick(front(), control, !box->isChecked());
    if (how == u"at"_s || how == u"right"_s)
        return finder.pressAt(front(), control, point(1), how == u"at"_s ? Qt::LeftButton : Qt::RightButton);
    if (how == u"drag"_s)
        return finder.drag(front(), control, point(1), point(2));
    if (how == u"type"_s)
        return finder.type(front(), control, what);
    if (how == u"choose"_s)
        return finder.choose(front(), control, bound && bound->list ? bound->list->item(what.toInt()) : what);
    if (widget && how == u"key"_s)
        widget->setFocus();
    if (how == u"key"_s)
        m_walk.key(QKeySequence(what)[0].key());
    if (how == u"close"_s)
        m_walk.program().window().close();
    if (how == u"hover"_s) {
        QEnterEvent enter({}, {}, {});
        QApplication::sendEvent(widget, &enter);
    }
    // A press may wait until a panel has slid to its place, or the work that it is for has begun.
    QTimer timer;
    QObject::connect(&timer, &QTimer::timeout, &timer, [&] {
        if ((done = finder.press(front(), control)).ok())
            timer.stop();
    });
    if (how == u"click"_s || how == u"during"_s)
        timer.start(0);
    if (how == u"during"_s)
        go(words.mid(1).join(u' '));
    (void)QTest::qWaitFor([&] { return !timer.isActive(); }, 5000);
    return done;
}

void Scene::expectChanges(const QString& control, const QStringList& gesture, QString changes) {
    changes.replace(u'#', control.section(u'(', 1).section(u')', 0, 0)).replace(u'>', u"front="_s);
    const QStringList wanted = changes.split(u' ', Qt::SkipEmptyParts);
    QStringList looked{u"front"_s, u"ended"_s, u"box"_s, u"opened"_s, u"copied"_s};
    looked += wanted;
    ScreenDialogs& dialogs = m_walk.program().dialogs();
    const DrivePath& order = m_walk.program().state().transfer.OrderFolder;
    dialogs.nextAnswer = [&] { return std::optional(gesture.back().endsWith(u"yes"_s)); };
    dialogs.nextPick = [&] {
        return std::optional(!gesture.back().endsWith(u"file"_s) ? DrivePath()
                             : front() == u"SpltForm"_s
                                 ? order / m_walk.program().platform().files.names(order, u"*.jpp"_s)[0]
                                 : m_walk.pictureFolder() / u"IMG_0001.jpg");
    };
    if (gesture.size() > 1)
        go(gesture[0].mid(3));
    const Facts before = facts(looked);
    const Result<void> done = use(control, gesture.back().split(u' '));
    EXPECT_TRUE(done.ok()) << (done ? "" : qPrintable(done.failure().message));
    Facts now;
    (void)QTest::qWaitFor(
        [&] {
            now = facts(looked);
            return std::all_of(wanted.begin(), wanted.end(), [&](const QString& c) { return holds(c, before, now); });
        },
        5000);
    m_walk.settle();
    now = facts(looked);
    for (const QString& change : wanted)
        EXPECT_TRUE(holds(change, before, now))
            << qPrintable(change) << ": " << qPrintable(QStringList(now.values()).join(u' '));
    for (const QString& name : looked.mid(0, 5))
        EXPECT_TRUE(changes.contains(name) || now[name] == before[name]) << qPrintable(name + u": "_s + now[name]);
    m_last = now;
    dialogs.closeMessages();
    m_walk.settle();
}

class Wiring : public ::testing::TestWithParam<std::tuple<std::string, bool>> {
public:
    static std::string nameOf(const ::testing::TestParamInfo<ParamType>& info) {
        return std::get<0>(info.param) + (std::get<1>(info.param) ? "Careful" : "");
    }
};

} // namespace

TEST_P(Wiring, OfEachControlIsThatOfTheTable) {
    const auto& [page, careful] = GetParam();
    std::set<std::string> told{"Page"};
    std::set<std::string> seen{"Page"};
    QString lab;
    std::unique_ptr<Scene> scene;
    const auto noted = [](const QStringList& names, std::set<std::string>& all) {
        for (const QString& name : names)
            all.insert(name.toStdString());
    };
    for (qsizetype at = table().indexOf(u"page "_s + QString::fromStdString(page)) + 1;
         !table().value(at, u"page "_s).startsWith(u"page "_s); ++at) {
        const QString& line = table()[at];
        SCOPED_TRACE("wiring.txt:" + std::to_string(at + 1) + ": " + line.toStdString());
        const QStringList columns = line.split(u" | "_s);
        const QString rest = line.section(u' ', 1);
        if (line.startsWith(u"lab "_s))
            lab = QString(rest).replace(u';', u'\n') + u'\n';
        else if (line.startsWith(u"no "_s))
            noted(controlsOf(rest.section(u": "_s, 1)), told);
        else if (line.startsWith(u"at "_s)) {
            scene.reset();
            scene = std::make_unique<Scene>(std::exchange(lab, {}) +
                                            (careful ? u"[Guards]\nCareful = yes\n"_s : QString()));
            scene->go(rest);
            ASSERT_EQ(scene->front().toStdString(), page);
            noted(scene->names(), seen);
        } else if (line.startsWith(u"go "_s))
            scene->go(rest);
        for (const QString& control : controlsOf(columns.size() > 1 ? columns[0] : QString())) {
            noted({control}, told);
            if (columns.size() < 4 || (columns[3] == u"careful"_s) == careful)
                scene->expectChanges(control, columns[1].split(u" then "_s), columns[2]);
        }
    }
    EXPECT_THAT(told, ::testing::ContainerEq(seen)) << "lines, and controls of the view";
}

INSTANTIATE_TEST_SUITE_P(Pages, Wiring, ::testing::Combine(::testing::ValuesIn(pages()), ::testing::Bool()),
                         Wiring::nameOf);

} // namespace lumora
