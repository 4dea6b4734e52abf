#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"

#include <QString>

#include <utility>

namespace lumora {

class Files;
struct SessionState;

// The drive path of an order's folder, and of its files with fixed names.
class OrderFolder {
public:
    // path is empty or "***" when no order is chosen.
    explicit OrderFolder(DrivePath path)
        : m_path(std::move(path)) {}

    // The order that is being sent or looked at (OrderFolder of the session).
    static OrderFolder chosen(const SessionState& state);

    // The order that is being prepared. With BySession the folder's name ends in "P" if HazmanaP is set; an edited
    // order's folder never does.
    enum class Ending { BySession, Plain };
    static OrderFolder inPreparation(const SessionState& state, Ending ending);

    bool isChosen() const;
    const DrivePath& path() const { return m_path; }
    QString name() const; // also the folder's name on the server
    DrivePath filePath(const QString& fileName) const;
    DrivePath logPath() const { return filePath(name() + QStringLiteral(".txt")); }
    // The log's path without its ending, by which the senders refer to the order.
    DrivePath logBase() const { return filePath(name()); }
    DrivePath brokenFilesPath() const { return filePath(QStringLiteral("kashloo.txt")); }
    // Hidden, and never listed, sent or counted.
    DrivePath statePath() const { return filePath(QStringLiteral(".order")); }
    DrivePath keptWorkPath() const { return filePath(QStringLiteral(".kept")); } // a folder
    DrivePath fetchedLogPath() const { return filePath(QStringLiteral(".log-there")); }

private:
    DrivePath m_path;
};

// Makes the folder of a new order under the first number, from that of the session on, that no other order has, and
// gives the session that number. Taken is a number whose folder of this name is there, and one of an order of any day
// without a log: that order is unfinished, and its files stay. The failure names the folder that can't be made.
Result<OrderFolder> claimOrderFolder(SessionState& state, const Files& files, OrderFolder::Ending ending);

// Makes the folder and its two parents where they are missing.
Result<void> makeOrderFolder(const Files& files, const OrderFolder& folder);

} // namespace lumora
