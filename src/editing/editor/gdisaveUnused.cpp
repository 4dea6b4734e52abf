// What the page must have and nothing calls: the scratch picture, reading a picture, the quality bar, and the buttons
// that do nothing.
#include "editing/editor/gdisave.h"

#include "imaging/files/PictureFile.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/Workspace.h"

#include <algorithm>

namespace lumora {

void gdisave::saveScratch(const Bitmap& picture) {
    PicPic = picture;
    if (GdiReady)
        SaveJpeg(PicPic, WorkspacePaths::scratchPicture(m_state), 80);
}

void gdisave::Command1_Click() {
    m_chain.unload(pageId);
}

void gdisave::HScroll1_Change(int value) {
    HScroll1 = std::clamp(value, HScroll1Min, HScroll1Max);
    setTexts();
}

Bitmap gdisave::PictureFromFile(const DrivePath& path) {
    const std::optional<HostPath> host = m_platform.files.drives().toHost(path);
    const Result<Bitmap> picture = host ? loadPicture(*host) : Failure{Failure::Kind::NotFound, path.text()};
    if (picture)
        return *picture;
    showFailure(picture.failure());
    return {};
}

void gdisave::cmdSaveAsJpg_Click() {}
void gdisave::Command2_Click() {}
void gdisave::Command3_Click() {}
void gdisave::Command4_Click() {}
void gdisave::Command8_Click() {}
void gdisave::Command9_Click() {}

} // namespace lumora
