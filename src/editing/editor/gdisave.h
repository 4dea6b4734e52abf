#pragma once

#include "imaging/Bitmap.h"
#include "session/Caption.h"
#include "session/Page.h"

#include <functional>
#include <optional>

namespace lumora {

struct Platform;
struct SessionState;
class PageChain;

// The service page that saves pictures as JPEG; nobody ever sees it. Other pages make it with PageChain::load, put
// their picture into PicPic or LitlPic and press a button. It stays loaded until the program ends.
class gdisave : public Page {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::gdisave;

    // Starts the drawing library and tells its status, 0 for success.
    using Starter = std::function<int()>;

    gdisave(SessionState& state, const Platform& platform, PageChain& chain, Starter start = {});

    void load() override;
    void setTexts() override;

    // Events. A button acts only when GdiReady is set.
    void Command5_Click(); // PicPic as the scratch picture, quality 80
    void Command6_Click(); // PicPic as the order sheet, quality 90
    void Command7_Click(); // LitlPic as the proof picture 000.jpg, quality 70
    void Command1_Click(); // closes the page
    void HScroll1_Change(int value);
    // Buttons of the page that do nothing.
    void cmdSaveAsJpg_Click() {}
    void Command2_Click() {}
    void Command3_Click() {}
    void Command4_Click() {}
    void Command8_Click() {}
    void Command9_Click() {}

    // State
    Bitmap PicPic;  // the picture of the preparation page
    Bitmap LitlPic; // the summary of the sending page
    bool GdiReady = false;
    static constexpr int HScroll1Min = 0;
    static constexpr int HScroll1Max = 100;
    int HScroll1 = 85;
    Caption Label1; // the value of HScroll1
    Caption Command1, Command2, Command5, Command6, Command7, cmdSaveAsJpg;

    // Saves under a drive path; the quality is held within 0 to 100. A failure is shown and gives false.
    bool SaveJpeg(const Bitmap& picture, const QString& path, int quality);
    // Shows a status that is not 0 in a box, with the path and reason behind it where they are known. Returns the
    // status.
    int ShowGdiStatus(int status, const QString& detail = {});
    static QString GdiStatusText(int status);

    enum class Encoder { Jpeg };
    // The encoder of a MIME type, whatever its letter case.
    static std::optional<Encoder> FindEncoderClsid(const QString& mimeType);

    // Null when the file can't be read; the failure is shown.
    Bitmap PictureFromFile(const QString& path);

private:
    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    Starter m_start;
};

} // namespace lumora
