#include "Walk.h"

#include "editing/redeye/RedI.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/FakeWebLab.h"
#include "support/Take.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"
#include "views/window/ScreenDialogs.h"

#include <QAbstractButton>
#include <QApplication>
#include <QBuffer>
#include <QCheckBox>
#include <QClipboard>
#include <QRegularExpression>
#include <QTest>
#include <QTimer>

#include <gtest/gtest.h>

#include <set>

namespace lumora {

namespace {

// The lines of wiring.txt, which tells its own language.
const QStringList& table() {
    static const QStringList lines = [] {
        QFile file(QStringLiteral(LUMORA_WIRING));
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return QString::fromUtf8(file.readAll()).split(u'\n');
    }();
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

// A change as the table tells it: a name, a sign, and the value or the name of what had it. "!" is none.
struct Change {
    explicit Change(const QString& told)
        : name(told.section(QRegularExpression(u"[=~+!-]"_s), 0, 0))
        , sign(told.mid(name.size(), 1))
        , value(told.mid(name.size() + 1).replace(u'_', u' '))
        , source(value.startsWith(u'@') ? value.mid(1) : name) {}
    bool holds(const Facts& before, const Facts& now) const {
        const QString is = now[name], wanted = source == name ? value : before[source];
        const double more = is.toDouble() - before[name].toDouble();
        if (sign == u"!"_s)
            return is == before[name];
        return is != before[name] &&
               (sign.isEmpty() || (sign == u"="_s && is == wanted) || (sign == u"~"_s && is.contains(wanted)) ||
                (sign == u"+"_s && more > 0) || (sign == u"-"_s && more < 0));
    }
    QString name, sign, value, source;
};

// A program with a lab in memory.
class Scene {
public:
    explicit Scene(const QString& labSettings)
        : m_walk({1024, 768}, labSettings, &m_lab) {
        m_walk.activate();
        QApplication::clipboard()->clear();
        m_lab.folders[m_state.profile.FtpFolder2];
        m_dialogs.nextAnswer = [] { return std::optional(true); };
        m_dialogs.nextPick = [this] {
            const DrivePath& order = m_state.transfer.OrderFolder;
            return std::optional(front() == u"SpltForm"_s ? order / (order.leaf() + u".txt"_s)
                                                          : m_walk.pictureFolder() / u"IMG_0001.jpg");
        };
    }
    QStringList names();
    QString front() const { return m_finder.frontPage(); }
    void go(const QString& route);
    void expectChanges(const QString& control, const QStringList& gesture, QString told);

private:
    QString fact(const QString& name);
    Facts facts(const std::vector<Change>& changes);
    Result<void> attempt(const QString& control, const QStringList& words);
    void use(const QString& control, const QStringList& words);

    FakeWebLab m_lab;
    Walk m_walk;
    SessionState& m_state = m_walk.program().state();
    MainWindow& m_window = m_walk.program().window();
    ScreenDialogs& m_dialogs = m_walk.program().dialogs();
    const ControlFinder m_finder{m_window};
};

// The controls of the view in front: what it has bound, and what else takes the keyboard.
QStringList Scene::names() {
    QStringList names;
    const PageView* view = m_window.frontView();
    for (const QWidget* widget : view->findChildren<QWidget*>(QRegularExpression(u"^(?!qt_)."_s))) {
        if (view->control(widget->objectName()) || widget->focusPolicy() & Qt::TabFocus)
            names += widget->objectName();
    }
    return names;
}

QString Scene::fact(const QString& name) {
    const PageChain& chain = m_walk.program().chain();
    const RedEyeSight sight = chain.find<RedI>() ? chain.find<RedI>()->sight() : RedEyeSight();
    const QMap<QString, QVariant> fields = {{u"x"_s, sight.RedSearchX},
                                            {u"y"_s, sight.RedSearchY},
                                            {u"circle"_s, sight.circleSize},
                                            {u"glass"_s, sight.Magnification},
                                            {u"kind"_s, static_cast<int>(m_state.Optint)},
                                            {u"shop"_s, m_state.KodMishloach},
                                            {u"branch"_s, m_state.BranchChoice},
                                            {u"deep"_s, m_state.DchisaAmoka},
                                            {u"mail"_s, m_state.shemot.Mail},
                                            {u"focus"_s, focusName()},
                                            {u"front"_s, front()},
                                            {u"ended"_s, chain.hasEnded()},
                                            {u"box"_s, m_dialogs.shownTexts.join(u'|')},
                                            {u"opened"_s, m_walk.opened.join(u'|')},
                                            {u"copied"_s, QApplication::clipboard()->text()},
                                            {u"asked"_s, m_lab.urls.join(u'|')}};
    const PageView* view = m_window.frontView();
    if (fields.contains(name) || !view || view->isDetached())
        return fields[name].toString();
    const QString id = name.section(u'.', 0, 0), what = name.section(u'.', 1);
    if (id == u"record"_s)
        return m_state.edit.EditState.mid(what.section(u',', 0, 0).toInt() - 1, what.section(u',', 1).toInt())
            .trimmed();
    if (what == u"text"_s)
        return take(m_finder.text(front(), id));
    auto* widget = view->findChild<QWidget*>(id);
    const auto* button = qobject_cast<QAbstractButton*>(widget);
    const Controls::Entry* entry = view->page().controls().find(id);
    const QImage seen = what == u"look"_s && widget ? widget->grab().toImage() : QImage();
    return QString::number(what == u"count"_s     ? take(m_finder.count(front(), id))
                           : what == u"look"_s    ? qHashBits(seen.constBits(), seen.sizeInBytes())
                           : what == u"enabled"_s ? widget && widget->isEnabled()
                           : what == u"checked"_s ? button && button->isChecked()
                           : widget               ? widget->isVisible()
                                                  : entry && entry->caption && entry->caption->visible);
}

Facts Scene::facts(const std::vector<Change>& changes) {
    m_window.renderNow();
    Facts facts;
    for (const Change& change : changes) {
        facts[change.name] = fact(change.name);
        facts[change.source] = fact(change.source);
    }
    return facts;
}

void Scene::go(const QString& route) {
    const DrivePath pictures = m_walk.pictureFolder();
    const QString line = u"1 1015GNB"_s + pictures.text() + u"\\IMG_000%1.jpg"_s;
    const std::map<QString, std::function<void()>> acts = {
        {u"@frames"_s, [&] { m_walk.writeFrames(); }},
        {u"@home"_s, [&] { m_state.MishloachHabaita = true; }},
        {u"@damaged"_s, [&] { m_walk.write(pictures / u"IMG_0002.jpg", "no picture"); }},
        {u"@large"_s,
         [&] {
             QByteArray png;
             QBuffer buffer(&png);
             QImage(8000, 8000, QImage::Format_Mono).save(&buffer, "PNG");
             for (const auto& name : {u"A1.png"_s, u"A2.png"_s, u"A3.png"_s})
                 m_walk.write(pictures / name, png);
         }},
        {u"@red"_s, [&] { m_walk.writeFlashPhotograph(); }},
        {u"@lines"_s,
         [&] {
             m_state.handOver.lines.append({line.arg(1), line.arg(3)});
         }},
        {u"@Form2"_s, [&] { m_walk.program().chain().show(PageId::Form2); }},
        {u"@away"_s, [&] { m_walk.program().chain().unload(PageId::FtpFrm); }},
        {u"@line"_s, [&] { m_lab.deadConnects = m_lab.deadPosts = m_lab.deadPosts ? 0 : FakeLab::always; }}};
    for (const QString& step : route.split(u' ', Qt::SkipEmptyParts)) {
        const Change awaited(step.mid(1));
        if (acts.contains(step))
            acts.at(step)();
        else if (step.startsWith(u'@'))
            go(table().filter(QRegularExpression(u'^' + step + u' ')).value(0).section(u' ', 1));
        else if (step.startsWith(u'?'))
            EXPECT_TRUE(QTest::qWaitFor([&] { return awaited.holds({}, facts({awaited})); }, 20000))
                << qPrintable(step);
        else if (step.contains(QRegularExpression(u"[=~!]"_s)))
            m_walk.go(step);
        else
            use(step.section(u'>', 0, 0), {u"click"_s});
        if (step.contains(u'>'))
            go(u"?front="_s + step.section(u'>', 1));
    }
}

Result<void> Scene::attempt(const QString& control, const QStringList& words) {
    const QString page = front(), how = words[0], what = words.value(1);
    const auto point = [](const QString& told) {
        return QPointF(told.section(u',', 0, 0).toDouble(), told.section(u',', 1).toDouble());
    };
    auto* widget = m_window.frontView()->findChild<QWidget*>(control);
    const auto* box = qobject_cast<QCheckBox*>(widget);
    const Result<QString> row = m_finder.item(page, control, what.toInt());
    if (how == u"at"_s || how == u"right"_s)
        return m_finder.pressAt(page, control, point(what), how == u"at"_s ? Qt::LeftButton : Qt::RightButton);
    if (how == u"drag"_s)
        return m_finder.drag(page, control, point(what), point(words.value(2)));
    if (how == u"type"_s)
        return m_finder.type(page, control, what);
    if (how == u"choose"_s)
        return m_finder.choose(page, control, row ? *row : what);
    if (how == u"click"_s || how == u"during"_s)
        return box ? m_finder.tick(page, control, !box->isChecked()) : m_finder.press(page, control);
    if (how == u"key"_s && widget)
        widget->setFocus();
    if (how == u"key"_s)
        m_walk.key(QKeySequence(what)[0].key());
    if (how == u"close"_s)
        m_window.close();
    if (how == u"hover"_s)
        QApplication::sendEvent(widget, std::make_unique<QEnterEvent>(QPointF(), QPointF(), QPointF()).get());
    return {};
}

// A gesture may wait until a panel has slid to its place, or the work that it is for has begun.
void Scene::use(const QString& control, const QStringList& words) {
    Result<void> done;
    QTimer timer;
    QObject::connect(&timer, &QTimer::timeout, &timer, [&] {
        if ((done = attempt(control, words)).ok())
            timer.stop();
    });
    timer.start(0);
    if (words[0] == u"during"_s)
        go(words.mid(1).join(u' '));
    EXPECT_TRUE(QTest::qWaitFor([&] { return !timer.isActive(); }, 5000))
        << qPrintable(done ? control : done.failure().message);
}

void Scene::expectChanges(const QString& control, const QStringList& gesture, QString told) {
    told.replace(u'#', control.section(u'(', 1).section(u')', 0, 0)).replace(u'>', u"front="_s);
    for (const QString& name : {u"front"_s, u"ended"_s, u"box"_s, u"opened"_s, u"copied"_s})
        told += told.contains(name) ? u""_s : u" %1!"_s.arg(name);
    const QStringList words = told.split(u' ', Qt::SkipEmptyParts);
    const std::vector<Change> changes(words.begin(), words.end());
    if (gesture.size() > 1)
        go(gesture[0].mid(3));
    const Facts before = facts(changes);
    use(control, gesture.back().split(u' '));
    const auto missed = [&] {
        const Facts now = facts(changes);
        QString all;
        for (const Change& change : changes) {
            if (!change.holds(before, now))
                all += u"%1 was \"%2\" and is \"%3\"\n"_s.arg(change.name, before[change.name], now[change.name]);
        }
        return all.toStdString();
    };
    (void)QTest::qWaitFor([&] { return missed().empty(); }, 5000);
    m_walk.settle(0);
    EXPECT_EQ(missed(), "");
    m_dialogs.closeMessages();
    m_walk.settle(0);
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
    std::set<QString> told{u"Page"_s}, seen{u"Page"_s};
    QString lab;
    std::unique_ptr<Scene> scene;
    for (qsizetype at = table().indexOf(u"page "_s + QString::fromStdString(page)) + 1;
         !table().value(at, u"page "_s).startsWith(u"page "_s); ++at) {
        const QString& line = table()[at];
        SCOPED_TRACE("wiring.txt:" + std::to_string(at + 1) + ": " + line.toStdString());
        const QString kind = line.section(u' ', 0, 0), rest = line.section(u' ', 1);
        const QStringList columns = line.split(u" | "_s);
        if (kind == u"lab"_s)
            lab = QString(rest).replace(u';', u'\n') + u'\n';
        if (kind == u"at"_s) {
            scene.reset();
            scene =
                std::make_unique<Scene>(std::exchange(lab, {}) + (careful ? u"[Guards]\nCareful = yes\n"_s : u""_s));
        }
        if (kind == u"at"_s || kind == u"go"_s)
            scene->go(rest);
        if (kind == u"at"_s) {
            ASSERT_EQ(scene->front().toStdString(), page);
            for (const QString& name : scene->names())
                seen.insert(name);
        }
        for (const QString& control : controlsOf(kind == u"no"_s      ? rest.section(u": "_s, 1)
                                                 : columns.size() > 1 ? columns[0]
                                                                      : QString())) {
            told.insert(control);
            if (columns.size() == 3 || (columns.size() == 4 && (columns[3] == u"careful"_s) == careful))
                scene->expectChanges(control, columns[1].split(u" then "_s), columns[2]);
        }
    }
    for (const QString& name : told)
        EXPECT_TRUE(seen.contains(name)) << qPrintable(name) << " is no control of the view";
    for (const QString& name : seen)
        EXPECT_TRUE(told.contains(name)) << qPrintable(name) << " has no line";
}

INSTANTIATE_TEST_SUITE_P(Pages, Wiring, ::testing::Combine(::testing::ValuesIn(pages()), ::testing::Bool()),
                         Wiring::nameOf);

} // namespace lumora
