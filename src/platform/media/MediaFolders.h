#pragma once

#include "platform/media/RemovableMedia.h"

#include <QFileSystemWatcher>
#include <QTimer>

#include <functional>

namespace lumora {

// Finds media where systems mount them: /media/NAME, /media/USER/NAME, /run/media/USER/NAME. A mounting over an empty
// folder is no change of the folder, so they are also looked at every second.
class MediaFolders : public RemovableMedia {
    Q_OBJECT
public:
    using IsMounted = std::function<bool(const HostPath& folder)>;
    // roots: folders that hold media, or folders of users that hold them.
    explicit MediaFolders(std::vector<HostPath> roots = {"/media", "/run/media"}, IsMounted isMounted = isMountPoint);

    void begin() override;

    // Another file system than that of the folder above.
    static bool isMountPoint(const HostPath& folder);

private:
    void look();
    void lookIn(const HostPath& root, int deeper, std::vector<Medium>& media);

    std::vector<HostPath> m_roots;
    IsMounted m_isMounted;
    QTimer m_poll;
    QFileSystemWatcher m_watcher;
    std::vector<Medium> m_last;
    bool m_told = false;
};

} // namespace lumora
