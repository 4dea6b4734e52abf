#pragma once

#include "common/Result.h"

#include <QString>

namespace lumora {

// Keeps the lines of the log: what the program did, for those who look after the station. A line tells of pages, steps,
// codes and times; what a customer has typed or brought stays out of it.
class StationLog {
public:
    virtual ~StationLog() = default;
    // A line without its end. Called from any thread, by one at a time.
    virtual void write(const QString& line) = 0;
    // What goes to standard error arrives in the log.
    virtual bool isStandardError() const = 0;

protected:
    // From begin to end lines go to this log; of several the last one that has begun.
    void begin();
    void end();
};

// One step of the program. Kept nowhere while no log has begun.
void writeLog(const QString& step);
// A step that has failed, by the kind of its failure: the message may name a customer's file or an address.
void writeLog(const QString& step, const Failure& failure);

// Standard error is kept by the machine, and the log goes there.
bool isLoggedFromStandardError();

// A warning, without what may tell of a customer: paths, web and mail addresses, runs of five digits and more.
QString withoutCustomer(const QString& text);

} // namespace lumora
