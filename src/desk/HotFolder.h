#pragma once

#include "common/HostFile.h"
#include "common/Result.h"
#include "desk/ArrivedOrder.h"
#include "desk/PrintLayout.h"

#include <QByteArray>
#include <QString>

#include <filesystem>

namespace lumora {

// The folder from which minilabs take pictures. An order is made ready in a room of its own in the hidden folder .desk,
// and its files move from there to their places: a file that has left the room is never made again, also when the
// minilab has taken it away meanwhile.
class HotFolder {
public:
    // Makes the folder where it is missing.
    static Result<HotFolder> open(const std::filesystem::path& folder);

    // The same for all machines that see this folder.
    const QString& id() const { return m_id; }

    // An empty room. Fails, as place and addLine do, where the folder is no longer the one that was opened, as a share
    // that was unmounted meanwhile.
    Result<QString> makeRoom(const QString& key) const;
    std::filesystem::path pathOf(const QString& room) const;
    void clear(const QString& room) const;
    QStringList rooms() const;
    // Whether makeReady has ended in it.
    bool isReady(const QString& room) const;
    // The room is this process's alone until the descriptor is closed or the process ends. Fails where another has it.
    Result<Descriptor> hold(const QString& room) const;
    bool isOld(const QString& room) const; // nothing was added for a day
    static QString keyOf(const QString& room);

    // Writes the pictures of the print files and the sheet into the room, synced, each below the folder that it goes
    // to; then the room is ready. Fails where one of that name waits for the minilab.
    Result<void> makeReady(const QString& room, const ArrivedOrder& order, const PrintLayout& layout,
                           PrintFileShape shape) const;
    // Moves what is still in the room to its place. A file that is there is never replaced. What another process moves
    // meanwhile counts as moved.
    Result<void> place(const QString& room) const;

    // A line, without its end, in the list of that name, unless a line with the same second field is there. The list
    // begins with the head.
    Result<void> addLine(const QString& list, const QByteArray& head, const QByteArray& line) const;

private:
    HotFolder(std::filesystem::path folder, QString id)
        : m_folder(std::move(folder))
        , m_id(std::move(id)) {}

    Result<void> checkId() const;

    std::filesystem::path m_folder;
    QString m_id;
};

} // namespace lumora
