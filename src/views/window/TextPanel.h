#pragma once

#include "platform/files/HostPath.h"
#include "views/kit/Overlay.h"

namespace lumora {

// A text of the lab over the page. Only pictures that lie in the text's own folder or below it are shown; a link leads
// to a place of the same text or nowhere.
class TextPanel : public Overlay {
    Q_OBJECT
public:
    // html: as in a file that lies in this folder.
    TextPanel(const Theme& theme, QWidget* parent, const QString& title, const QString& html, const HostPath& folder,
              const QString& closing);

Q_SIGNALS:
    void closed();
};

} // namespace lumora
