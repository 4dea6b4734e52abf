#pragma once

#include <QDateTime>

#include <vector>

namespace lumora {

// Number of starts of a minute between two times: 1 from 10:00:59 to 10:01:00, 0 from 10:00:00 to 10:00:59. Negative
// when to is before from.
qint64 MinuteBorders(const QDateTime& from, const QDateTime& to);

// The pace of the mail packages, and the state of each. The next package begins when more than two starts of a minute
// have passed, that is, after two to three minutes. Packages count from 0.
class PackageWalk {
public:
    void begin(int packages, const QDateTime& now);
    // Starts the minutes of a package.
    void take(const QDateTime& now);

    // Whether to wait, to begin the next package that was not sent, or to end after the last one. The minutes stop at
    // the end.
    enum class Step { Wait, Next, Over };
    Step step(int inHand, const QDateTime& now);
    // Takes the minutes since the start of the package.
    void measure(const QDateTime& now);
    void clearMinutes() { m_minutes = 0; }
    double minutes() const { return m_minutes; }
    // The part of all packages' time that has passed, 0 to 1.
    double share(int inHand) const;

    enum class Fate { Waiting, Sending, Sent, Failed };
    void tell(int package, Fate fate) { m_fates[static_cast<std::size_t>(package)] = fate; }
    Fate fate(int package) const;    // Waiting for a package that does not exist
    int nextUnsent(int after) const; // -1 when there is none; after is -1 for the first
    int count() const { return static_cast<int>(m_fates.size()); }
    int count(Fate fate) const;
    bool allSent() const { return count() > 0 && count(Fate::Sent) == count(); }

private:
    QDateTime m_start;
    double m_minutes = 0;
    std::vector<Fate> m_fates;
};

} // namespace lumora
