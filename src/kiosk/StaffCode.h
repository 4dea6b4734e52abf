#pragma once

#include "common/DrivePath.h"

#include <QByteArray>
#include <QString>

#include <chrono>

namespace lumora {

class Clock;
class Files;
struct SessionState;

// The line "iterations:salt:hash" of the lab's file, by PBKDF2 with SHA-256; salt and hash in hexadecimal digits.
QString StaffCodeLine(const QString& code, const QByteArray& salt, int iterations);
// The same with a salt of the machine's own and the iterations that are usual now.
QString NewStaffCodeLine(const QString& code);
// The staff types it on the screen.
inline constexpr int shortestStaffCode = 4; // digits
inline constexpr int longestStaffCode = 12;
bool IsStaffCode(const QString& code);

// Lets the staff in. From the fifth wrong try in a row each costs a minute. How many there were is kept in the data
// folder before a try is looked at, so that pulling the plug saves nothing; behind a restart the minute runs anew,
// since a clock that is set proves nothing.
class StaffCode {
public:
    static constexpr int freeTries = 4;
    static constexpr std::chrono::minutes penalty{1};

    StaffCode(const SessionState& state, const Files& files, const Clock& clock);

    enum class Answer { Right, Wrong, TooSoon };
    Answer give(const QString& code);
    int secondsToWait() const;

private:
    DrivePath path() const;
    int stored() const;
    void keep(int wrong);

    const SessionState& m_state;
    const Files& m_files;
    const Clock& m_clock;
    int m_wrong = -1; // -1: not read yet
    std::chrono::milliseconds m_freeFrom;
};

} // namespace lumora
