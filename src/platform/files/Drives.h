#pragma once

#include "platform/files/HostPath.h"

#include <QChar>
#include <QString>

#include <cstdint>
#include <map>
#include <optional>
#include <vector>

namespace lumora {

// The drive letters that the system speaks of, and the folders of this machine that stand behind them: the program's
// own letter (C: unless the deployment says otherwise) is the data folder, Z: is the root of the file system, and
// mounted media take the free letters from D: on, so that a memory card shows as a drive.
class Drives {
public:
    // mediaRoots: folders whose sub-folders are mounted media, as /media/<user>/CARD and /run/media/<user>/CARD. A
    // medium that appears twice takes one letter; a medium keeps its letter, also when it is taken out meanwhile.
    // offeredFirst: letters of the drives that drives() puts in front, in this order.
    Drives(HostPath dataFolder, QChar programLetter = u'C', std::vector<HostPath> mediaRoots = defaultMediaRoots(),
           QString offeredFirst = {});

    static std::vector<HostPath> defaultMediaRoots();
    // $XDG_DATA_HOME/lumora/drive_c, or ~/.local/share/lumora/drive_c.
    static HostPath defaultDataFolder();

    QChar programLetter() const { return m_programLetter; }
    // "C:\": the root of all workspace paths.
    QString programRoot() const;
    const HostPath& dataFolder() const { return m_dataFolder; }

    // Looks for media that came or went since the last call.
    void refreshMedia();

    struct Drive {
        QChar letter;
        HostPath folder;
        QString name; // what a person calls it: the medium's label, or the folder's name
        bool removable;
        bool offeredFirst;
    };
    std::vector<Drive> drives() const;

    // No value for a text without a drive letter, for a letter without a folder, and for a path that leaves its drive
    // by "..". A long leaf name is shortened by the rule of ShortenedName, the same at each call.
    std::optional<HostPath> toHost(const QString& drivePath) const;

    // The drive path with the deepest matching drive; Z: serves for what lies on no other. Names of bytes that are no
    // UTF-8 keep their bytes: they come back from toHost as they were.
    QString toDrive(const HostPath& hostPath) const;

private:
    HostPath m_dataFolder;
    QChar m_programLetter;
    std::vector<HostPath> m_mediaRoots;
    QString m_offeredFirst;
    std::map<QChar, HostPath> m_media;
};

// A file name may have 255 bytes here, and a flat name made of a whole path in Hebrew takes two bytes a letter. A
// longer name is cut and closed with "~" and eight hexadecimal digits of a checksum of the whole, before its ending of
// up to five characters, so that two names that differ stay different.
QString ShortenedName(const QString& name);

} // namespace lumora
