#pragma once

#include "common/DrivePath.h"
#include "platform/files/HostPath.h"

#include <QChar>
#include <QString>

#include <cstdint>
#include <map>
#include <optional>
#include <vector>

namespace lumora {

// The drive letters and the folders of this machine behind them. The program's letter (C: by default) is the data
// folder, Z: the root of the file system; mounted media take the free letters from D: on, so that a memory card shows
// as a drive.
class Drives {
public:
    // mediaRoots: folders whose sub-folders are mounted media, as /media/<user> and /run/media/<user>. A medium that is
    // mounted twice has one letter; a medium that is taken out keeps its letter. offeredFirst: letters that drives()
    // lists first, in this order.
    Drives(HostPath dataFolder, QChar programLetter = u'C', std::vector<HostPath> mediaRoots = defaultMediaRoots(),
           QString offeredFirst = {});

    static std::vector<HostPath> defaultMediaRoots();
    // $XDG_DATA_HOME/lumora/drive_c, or ~/.local/share/lumora/drive_c.
    static HostPath defaultDataFolder();

    QChar programLetter() const { return m_programLetter; }
    // The root of all workspace paths, as "C:\".
    DrivePath programRoot() const;
    const HostPath& dataFolder() const { return m_dataFolder; }

    // Looks for media that were mounted or removed since the last call.
    void refreshMedia() { giveLetters(findMedia(m_mediaRoots)); }
    // The same in two steps. A mount that is slow holds the first, which any thread may call.
    static std::vector<HostPath> findMedia(const std::vector<HostPath>& roots);
    void giveLetters(const std::vector<HostPath>& found);
    const std::vector<HostPath>& mediaRoots() const { return m_mediaRoots; }

    struct Drive {
        QChar letter;
        HostPath folder;
        QString name; // the medium's label, or the folder's name
        bool removable;
        bool offeredFirst;
    };
    std::vector<Drive> drives() const;

    // No value for a text without a drive letter, for a letter without a folder, and for a path that leaves its drive
    // by "..". A long leaf name is shortened as by ShortenedName.
    std::optional<HostPath> toHost(const DrivePath& path) const;

    // The drive path below the deepest folder that has a letter; Z: for a path below no other. A name that is not UTF-8
    // comes back from toHost unchanged.
    DrivePath toDrive(const HostPath& hostPath) const;

private:
    HostPath m_dataFolder;
    QChar m_programLetter;
    std::vector<HostPath> m_mediaRoots;
    QString m_offeredFirst;
    std::map<QChar, HostPath> m_media;
};

// A file name may have 255 bytes on this machine, and a leaf name made of a whole Hebrew path takes two bytes a letter.
// A longer name is cut; "~" and eight hexadecimal digits of a checksum of the whole name follow, then its ending of up
// to five characters. So different names stay different.
QString ShortenedName(const QString& name);

} // namespace lumora
