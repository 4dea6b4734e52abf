#include "editing/editor/gdisave.h"

#include "imaging/files/PictureFile.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/CaptionTexts.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <algorithm>
#include <array>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int genericError = 1;

constexpr std::array<const char*, 21> statusTexts = {
    "",
    "Generic Error.",
    "Invalid Parameter.",
    "Out Of Memory.",
    "Object Busy.",
    "Insufficient Buffer.",
    "Not Implemented.",
    "Win32 Error.",
    "Wrong State.",
    "Aborted.",
    "File Not Found.",
    "Value Overflow.",
    "Access Denied.",
    "Unknown Image Format.",
    "FontFamily Not Found.",
    "FontStyle Not Found.",
    "Not TrueType Font.",
    "Unsupported Gdiplus Version.",
    "Gdiplus Not Initialized.",
    "Property Not Found.",
    "Property Not Supported.",
};

// The drawing library's status number for a failure.
int statusOf(Failure::Kind kind) {
    switch (kind) {
    case Failure::Kind::NotFound:
        return 10;
    case Failure::Kind::AccessDenied:
        return 12;
    case Failure::Kind::NoSpace:
        return 7;
    case Failure::Kind::Damaged:
    case Failure::Kind::Unsupported:
        return 13;
    case Failure::Kind::TooLarge:
        return 3;
    default:
        return genericError;
    }
}

} // namespace

gdisave::gdisave(const SessionState& state, const Platform& platform, PageChain& chain, Starter start)
    : Page(pageId)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_start(std::move(start)) {}

void gdisave::load() {
    GdiReady = false;
    // Drawing needs no start on this system, so only a starter that the caller gives can fail.
    const int status = m_start ? m_start() : 0;
    ShowGdiStatus(status);
    if (status != 0)
        m_platform.dialogs.message(u"GDI+ not inizialized."_s, u"GDI Error"_s);
    GdiReady = status == 0;
    setTexts();
}

void gdisave::setTexts() {
    setCaptions(m_state, {{cmdSaveAsJpg, u"שמור את התמונה", u"Save the picture"},
                          {Command1, u"בטל", u"Cancel"},
                          {Command2, u"שלח", u"Send"},
                          {Command5, u"Command5"},
                          {Command6, u"save info"},
                          {Command7, u"Command7_litlpic"},
                          {Label1, u"איכות: ", u"Quality: "}});
    Label1.text += QString::number(HScroll1);
    Q_EMIT changed();
}

// The FTP sender takes the sheet as ".jpp", the HTTP sender and a local station take it as ".jpg".
bool gdisave::saveOrderSheet(const Bitmap& picture) {
    PicPic = picture;
    if (!GdiReady)
        return false;
    bool saved = true;
    const auto save = [&](const QString& ending) {
        const QString name = SheetName(m_state.MisparHazmana, m_state.shemot.ser, ending);
        saved = SaveJpeg(PicPic, OrderFolder::chosen(m_state).filePath(name), 90) && saved;
    };
    if (m_state.transfer.SugSheliach == Sender::Ftp)
        save(u".jpp"_s);
    if (m_state.transfer.SugSheliach == Sender::Http || m_state.TachanaMekomit)
        save(u".jpg"_s);
    return saved;
}

void gdisave::saveProof(const Bitmap& picture) {
    LitlPic = picture;
    if (GdiReady)
        SaveJpeg(LitlPic, WorkspacePaths::proofPicture(m_state), 70);
}

bool gdisave::SaveJpeg(const Bitmap& picture, const DrivePath& path, int quality) {
    if (picture.isNull()) {
        ShowGdiStatus(2, path.text());
        return false;
    }
    if (!FindEncoderClsid(u"image/jpeg"_s)) {
        m_platform.dialogs.message(u"Konnte keinen passenden Encoder ermitteln."_s, u"Encoder Error"_s);
        return false;
    }
    const Result<QByteArray> jpeg = encodeJpeg(picture, std::clamp(quality, HScroll1Min, HScroll1Max));
    const Result<void> saved = jpeg ? m_platform.files.writeWhole(path, *jpeg) : Result<void>(jpeg.failure());
    if (!saved)
        showFailure(saved.failure());
    return saved.ok();
}

void gdisave::showFailure(const Failure& failure) {
    ShowGdiStatus(statusOf(failure.kind), failure.message);
}

int gdisave::ShowGdiStatus(int status, const QString& detail) {
    if (status == 0)
        return status;
    QString text = GdiStatusText(status) + u" GDI+ Error:"_s + QString::number(status);
    if (!detail.isEmpty())
        text += u'\n' + detail;
    m_platform.dialogs.message(text, u"GDI Error"_s);
    return status;
}

QString gdisave::GdiStatusText(int status) {
    if (status < 1 || status >= static_cast<int>(statusTexts.size()))
        return u"Unknown GDI+ Error."_s;
    return QString::fromLatin1(statusTexts[static_cast<std::size_t>(status)]);
}

std::optional<gdisave::Encoder> gdisave::FindEncoderClsid(const QString& mimeType) {
    if (mimeType.compare(QLatin1String("image/jpeg"), Qt::CaseInsensitive) == 0)
        return Encoder::Jpeg;
    return std::nullopt;
}

} // namespace lumora
