#pragma once

#include <QDateTime>

#include <vector>

namespace lumora {

// Borders of whole minutes between two times: 10:00:59 and 10:01:00 are one minute apart, 10:00:00 and 10:00:59 none.
// Negative when the second comes before the first.
qint64 MinuteBorders(const QDateTime& from, const QDateTime& to);

// A walk over mail packages: its pace, and what has become of each package. A package has more than two minutes by the
// clock's count of them, so that the next one goes two to three minutes later. Packages count from 0.
class PackageWalk {
public:
    void begin(int packages, const QDateTime& now);
    // The minutes of a package begin.
    void take(const QDateTime& now);

    // What the clock asks for: the next package, or the end when the one in hand is the last. The minutes stand still
    // at the end.
    enum class Step { Wait, Next, Over };
    Step step(int inHand, const QDateTime& now);
    // Counts on from the start of the package.
    void measure(const QDateTime& now);
    void clearMinutes() { m_minutes = 0; }
    double minutes() const { return m_minutes; }
    // Of the way that is behind, 0 to 1.
    double share(int inHand) const;

    enum class Fate { Waiting, Sending, Sent, Failed };
    void tell(int package, Fate fate) { m_fates[static_cast<std::size_t>(package)] = fate; }
    Fate fate(int package) const; // waiting for one that is not there
    int count() const { return static_cast<int>(m_fates.size()); }
    int count(Fate fate) const;
    bool allSent() const { return count() > 0 && count(Fate::Sent) == count(); }

private:
    QDateTime m_start;
    double m_minutes = 0;
    std::vector<Fate> m_fates;
};

} // namespace lumora
