#include "common/StationLog.h"

#include <QRegularExpression>

#include <array>
#include <mutex>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

struct Begun {
    std::mutex mutex;
    StationLog* log = nullptr;
};

Begun& begun() {
    static Begun one;
    return one;
}

QString kindName(Failure::Kind kind) {
    static constexpr std::array<const char*, 12> names = {"not found", "no access",   "no space",   "damaged",
                                                          "too large", "unsupported", "refused",    "disconnected",
                                                          "timed out", "in use",      "no program", "other failure"};
    return QString::fromLatin1(names[static_cast<std::size_t>(kind)]);
}

} // namespace

void StationLog::begin() {
    const std::lock_guard lock(begun().mutex);
    begun().log = this;
}

void StationLog::end() {
    const std::lock_guard lock(begun().mutex);
    if (begun().log == this)
        begun().log = nullptr;
}

void writeLog(const QString& step) {
    const std::lock_guard lock(begun().mutex);
    if (begun().log)
        begun().log->write(step);
}

void writeLog(const QString& step, const Failure& failure) {
    writeLog(step + u": "_s + kindName(failure.kind));
}

bool isLoggedFromStandardError() {
    const std::lock_guard lock(begun().mutex);
    return begun().log && begun().log->isStandardError();
}

QString withoutCustomer(const QString& text) {
    // A path ends where the last reason begins: a folder's name may hold blanks and colons.
    static const QRegularExpression places(u"(\\b[a-z]+://|(?<![\\w.])[A-Za-z]:\\\\|(?<![\\w.])/)(.*(?=: )|.*)"_s,
                                           QRegularExpression::DotMatchesEverythingOption);
    static const QRegularExpression mails(u"\\S+@\\S+"_s);
    static const QRegularExpression numbers(u"[0-9][0-9 -]{3,}[0-9]"_s);
    QString told = text;
    told.replace(places, u"(path)"_s);
    told.replace(mails, u"(mail)"_s);
    told.replace(numbers, u"(number)"_s);
    return told;
}

} // namespace lumora
