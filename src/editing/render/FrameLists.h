#pragma once

#include "common/DrivePath.h"

#include <QString>
#include <QStringList>

namespace lumora {

class Files;

// The frames of the folder of frames. A sub-folder is a category; it holds "k<name>.bmp", the frame that the preview
// shows, and list files of the bare name. A name that is too long for its field of the record is not offered.
class FrameLists {
public:
    static constexpr int longestCategory = 10;
    static constexpr int longestName = 3;

    FrameLists(const Files& files, DrivePath folder)
        : m_files(files)
        , m_folder(std::move(folder)) {}

    QStringList categories() const;

    // The names by one kind of list file, without its last four characters and without what begins with "k".
    enum class ListFile { Png, Bmp };
    QStringList names(const QString& category, ListFile kind) const;

    // The file that stands for a frame in the list; empty when there is none.
    DrivePath listFile(const QString& category, const QString& name) const;

private:
    const Files& m_files;
    DrivePath m_folder;
};

} // namespace lumora
