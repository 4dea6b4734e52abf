#pragma once

#include "common/Result.h"
#include "drive/ControlFinder.h"
#include "platform/SystemClock.h"

#include <QElapsedTimer>
#include <QFile>
#include <QJsonObject>
#include <QObject>
#include <QPixmap>
#include <QSet>
#include <QStringList>
#include <QTimer>

#include <functional>
#include <optional>
#include <random>
#include <vector>

namespace lumora {

class PageView;
class Program;

// A clock that a walk turns on in place of waiting.
class WalkClock : public SystemClock {
public:
    std::chrono::milliseconds running() const override { return SystemClock::running() + ahead; }
    std::chrono::milliseconds ahead{0};
};

// A customer who presses whatever can be pressed, as a seed draws it, and then brings the order to its end. Before each
// press all that the page in front shows is written down, so that another program can compare the order with it.
//
// seen.jsonl has an object a line. "act" is a press as a scenario says it, with "page", "shown" (text by control),
// "marked" (controls that are ticked) and "words" (labels without a name), all from before the press; "front" is a page
// that came to the front, "said" a box or a question, "fault" what a person could stumble over on the page in front,
// which is looked at once in each state, "idled" the start page that came because nothing was pressed. Beside it "<n>"
// holds the order folders of the moment when line n told of a page, and "preview.<n>.png" the editor's paper as it was
// last before another picture.
class RandomWalk : public QObject {
    Q_OBJECT
public:
    struct Plan {
        unsigned seed = 0;
        int presses = 0;     // before the order is brought to its end
        QStringList folders; // host paths of the folders of pictures
        QString record;      // host path of an existing folder
        Hand hand = Hand::Mouse;
        WalkClock* clock = nullptr; // of a kiosk, where a customer may go away in the middle
    };
    explicit RandomWalk(Plan plan);

    // Walks on the pages of this run until the program ends or the walk is over; a run after that goes on.
    void walk(Program& program);

    bool isOver() const { return m_over; }
    // What stopped the walk; empty when the order came to its end.
    const QString& failure() const { return m_failure; }

Q_SIGNALS:
    void over();

private:
    struct Act {
        QString line; // as in a scenario
        std::function<Result<void>()> run;
    };

    void step();
    bool isStillLooking();
    QStringList missingWays(const PageView& view);
    bool isAway();
    bool hasOrderEnded();
    bool answerPanel();
    void pressInTheMiddle();
    void perform(Act act);
    std::optional<Act> nextOnTheWay();
    std::optional<Act> anyPress();
    std::optional<Act> anyPressOn(const PageView& view);
    std::optional<Act> actOn(const PageView& view, QWidget& widget);
    Act press(const QString& page, const QString& name) const;
    Act hold(const QString& page, const QString& name, int milliseconds);
    Act type(const QString& page, const QString& name);
    Act chooseRow(const QString& page, const QString& name, const QStringList& rows);
    std::vector<QWidget*> usable(const PageView& view) const;

    void pageShown(const QString& page);
    void write(QJsonObject line);
    QJsonObject seen(const PageView& view);
    void keepPaper(const PageView* view, const QString& title);
    void keepOrders();
    void stop(const QString& why);

    int draw(int below);
    template <class List>
    const auto& drawn(const List& list) {
        return list[draw(static_cast<int>(list.size()))];
    }

    Plan m_plan;
    std::mt19937 m_random;
    Program* m_program = nullptr;
    std::optional<ControlFinder> m_controls;
    QTimer m_timer;
    QTimer m_letGo;
    std::optional<ControlFinder::Held> m_held;
    QElapsedTimer m_sinceAct;
    QFile m_file;
    int m_line = 0;
    QString m_title; // what the page in front says of its picture
    QPixmap m_paper; // the editor's, as the line m_paperLine told it
    int m_paperLine = 0;
    int m_acts = 0;
    int m_pressAfter = 0;       // milliseconds of work until a press in the middle of it; 0: none
    bool m_acting = false;      // the handler of a press has not returned
    bool m_inTheMiddle = false; // the same of a press in the middle of work
    qsizetype m_said = 0;       // index in ScreenDialogs::shownTexts
    QString m_front;
    QString m_beforeFront;
    bool m_fromOrder = false; // the page before the one in front prepared or sent an order
    QSet<QString> m_looked;   // states of pages
    QString m_sight;
    QElapsedTimer m_sinceSight;
    int m_looks = 0;
    std::optional<QStringList> m_faults; // of the first look
    bool m_away = false;                 // the customer has gone
    QElapsedTimer m_sinceGone;
    QElapsedTimer m_sinceTurned; // of the clock
    bool m_over = false;
    QString m_failure;
};

} // namespace lumora
