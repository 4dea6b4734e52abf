#pragma once

#include "common/Result.h"

#include <QString>

namespace lumora {

class Files;
struct SessionState;

// The folder of one order and the names of what lies in it, from the session as it stands: all of them are drive paths.
class OrderFolder {
public:
    // A plain order's folder ends in "P" when HazmanaP says so; an edited order's never does.
    enum class Ending { BySession, Plain };

    OrderFolder(const SessionState& state, Ending ending);

    const QString& name() const { return m_name; } // also the folder's name on the server
    const QString& path() const { return m_path; }
    QString logPath() const { return logBase() + QStringLiteral(".txt"); }
    // The stem that the senders know the order by.
    QString logBase() const { return m_path + u'\\' + m_name; }
    QString printFilePath(const QString& fileName) const { return m_path + u'\\' + fileName; }
    // extension with its dot.
    QString sheetPath(const QString& extension) const { return m_path + u'\\' + m_sheet + extension; }

private:
    QString m_name;
    QString m_path;
    QString m_sheet;
};

// Sees to it that the order number of the session has a folder to itself. A folder without a log was left by an order
// that was given up: its print files go. One with a log is another order's, whose number came again because the counter
// was lost: the number rises to the next free one, and so it does where an old print file can't be removed.
void claimOrderNumber(SessionState& state, const Files& files, OrderFolder::Ending ending);

// Makes the folder, and those above it where they are missing.
Result<void> makeOrderFolder(const SessionState& state, const Files& files, const OrderFolder& folder);

} // namespace lumora
