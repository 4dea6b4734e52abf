#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"
#include "imaging/Bitmap.h"
#include "session/Caption.h"
#include "session/Page.h"

#include <functional>
#include <optional>

namespace lumora {

struct Platform;
struct SessionState;
class PageChain;

struct gdisaveControls : Controls {
    Bitmap PicPic;  // the picture of the preparation page
    Bitmap LitlPic; // the summary of the sending page
    bool GdiReady = false;
    static constexpr int HScroll1Min = 0;
    static constexpr int HScroll1Max = 100;
    int HScroll1 = 85;
    Caption Label1{*this, u"Label1"}; // the value of HScroll1
    Caption Command1{*this, u"Command1"}, Command2{*this, u"Command2"}, Command5{*this, u"Command5"},
        Command6{*this, u"Command6"}, Command7{*this, u"Command7"}, cmdSaveAsJpg{*this, u"cmdSaveAsJpg"};
};

// gdisave, "saves pictures" in the glossary: a page without a view, by which the preparation and sending pages save
// their pictures as JPEG files. It stays loaded until the program ends and saves nothing unless GdiReady is set.
class gdisave : public Page, private gdisaveControls {
    Q_OBJECT
public:
    static constexpr PageId pageId = PageId::gdisave;

    // Starts the drawing library and tells its status, 0 for success.
    using Starter = std::function<int()>;

    gdisave(const SessionState& state, const Platform& platform, PageChain& chain, Starter start = {});

    void load() override;
    void setTexts() override;

    // --- events ---

    bool
    saveOrderSheet(const Bitmap& picture); // quality 90, under the names of the order's sheet; true if all are saved
    void saveProof(const Bitmap& picture); // quality 70, as 000.jpg
    void Command6_Click() { saveOrderSheet(PicPic); }
    void Command7_Click() { saveProof(LitlPic); }

    // Saves under a drive path; the quality is held within 0 to 100. A failure is shown and gives false.
    bool SaveJpeg(const Bitmap& picture, const DrivePath& path, int quality);
    // Shows a status that is not 0 in a box, with the path and reason behind it where they are known. Returns the
    // status.
    int ShowGdiStatus(int status, const QString& detail = {});

    // gdisaveUnused.cpp
    void saveScratch(const Bitmap& picture); // quality 80, as the picture of the current step
    void Command5_Click() { saveScratch(PicPic); }
    void Command1_Click(); // closes the page
    void HScroll1_Change(int value);
    void cmdSaveAsJpg_Click();
    void Command2_Click();
    void Command3_Click();
    void Command4_Click();
    void Command8_Click();
    void Command9_Click();
    Bitmap PictureFromFile(const DrivePath& path); // null when the file can't be read; the failure is shown

    // --- state ---

    const gdisaveControls& controls() const override { return *this; }
    static QString GdiStatusText(int status);
    enum class Encoder { Jpeg };
    // The encoder of a MIME type, whatever its letter case.
    static std::optional<Encoder> FindEncoderClsid(const QString& mimeType);

private:
    void showFailure(const Failure& failure);

    const SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    Starter m_start;
};

} // namespace lumora
