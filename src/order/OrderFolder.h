#pragma once

#include "common/Result.h"

#include <QString>

#include <utility>

namespace lumora {

class Files;
struct SessionState;

// The folder of one order and what lies in it under fixed names. All are drive paths.
class OrderFolder {
public:
    // path may be empty or "***": no order is chosen.
    explicit OrderFolder(QString path)
        : m_path(std::move(path)) {}

    // The order that is being sent or looked at: OrderFolder of the session.
    static OrderFolder chosen(const SessionState& state);

    // The order that is being prepared. A plain order's folder ends in "P" when HazmanaP says so; an edited order's
    // never does.
    enum class Ending { BySession, Plain };
    static OrderFolder inPreparation(const SessionState& state, Ending ending);

    bool isChosen() const;
    const QString& path() const { return m_path; }
    QString name() const; // also the folder's name on the server
    QString filePath(const QString& fileName) const;
    QString logPath() const { return filePath(name() + QStringLiteral(".txt")); }
    // The stem that the senders know the order by: the log's path without its ending.
    QString logBase() const { return filePath(name()); }
    // The list of broken files.
    QString brokenFilesPath() const { return filePath(QStringLiteral("kashloo.txt")); }

private:
    QString m_path;
};

// The first number, from that of the session on, whose order has a folder to itself. A folder without a log was left by
// an order that was given up: its print files are removed. One with a log is another order's, whose number came again
// because the counter was lost: the next number is tried, and so it is where an old print file can't be removed.
QString freeOrderNumber(const SessionState& state, const Files& files, OrderFolder::Ending ending);

// Makes the folder, and the two above it where they are missing.
Result<void> makeOrderFolder(const Files& files, const OrderFolder& folder);

} // namespace lumora
