#pragma once

#include <QDateTime>

namespace lumora {

// Borders of whole minutes between two times: 10:00:59 and 10:01:00 are one minute apart, 10:00:00 and 10:00:59 none.
// Negative when the second comes before the first.
qint64 MinuteBorders(const QDateTime& from, const QDateTime& to);

// The pace of a walk over mail packages. A package has more than two minutes by the clock's count of them, so that the
// next one goes two to three minutes later.
class PackageWalk {
public:
    void begin(const QDateTime& now);

    // What the clock asks for: the next package, or the end when the one in hand is the last of count. The minutes
    // stand still at the end.
    enum class Step { Wait, Next, Over };
    Step step(int selected, int count, const QDateTime& now);

    // Counts on from the start of the package.
    void measure(const QDateTime& now);

    void clearMinutes() { m_elapsed = 0; }
    double minutes() const { return m_elapsed; }

private:
    QDateTime m_start;
    double m_elapsed = 0;
};

} // namespace lumora
