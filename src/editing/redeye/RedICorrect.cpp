// The corrections of the red-eye page: what works on pixels.

#include "editing/redeye/RedI.h"

#include "common/DrivePathText.h"
#include "common/FixedText.h"
#include "editing/redeye/RedOverview.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/BlockingCall.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <QPainter>

#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int deeper = 10;
constexpr int besidePatch = 40;
constexpr int passesByHand = 3;
constexpr int passesAtPoint = 4;

void paintOver(Bitmap& picture, QPoint at, const Bitmap& part) {
    QPainter painter(&picture.image());
    painter.setCompositionMode(QPainter::CompositionMode_Source);
    painter.drawImage(at, part.image());
}

} // namespace

void RedI::RedFix(int level) {
    if (!canCorrect() || !keepUndoCopy(circle()))
        return;
    RedFixLevel = HoldIn16Bits(level);
    correct();
    RedFixLevel = 0;
    markChanged();
}

void RedI::amok_Click() {
    kofez.visible = false;
    if (!canCorrect() || !keepUndoCopy(circle())) {
        showState();
        return;
    }
    // The level stays: each press goes deeper.
    RedFixLevel = HoldIn16Bits(RedFixLevel + deeper);
    correct();
    showLevel();
    markChanged();
}

void RedI::Image16_Click() {
    amok_Click();
    CleanList();
}

void RedI::correct() {
    Frame6.visible = false;
    Command13_Click();
    takePatch();
    m_drag.release();
    List1.append(RedEye::correct(Picture1, patchPlace, m_peak.ratio(), RedFixLevel));
    Image1.visible = false;
    Picture7 = Bitmap(Picture1.image().copy(patchPlace));
    Picture2 = Picture7;
    refreshOverview(patchPlace);
    Frame6.visible = true;
    showCounts();
}

void RedI::Command13_Click() {
    if (!ready())
        return;
    m_peak = RedEye::findPeak(Picture1, {RedSearchX, RedSearchY});
    RedPeakValue = m_peak.redness;
    RedPeakX = m_peak.x;
    RedPeakY = m_peak.y;
    RedPeakBrightness = m_peak.brightness;
    Label25.text = QString::number(m_peak.redness);
    Label30.text = QString::number(m_peak.redness - m_peak.brightness);
    Label31.text = QString::number(m_peak.ratio(), 'g', 15);
    Q_EMIT changed();
}

void RedI::takePatch() {
    if (patchPlace != circle())
        forgetLists(); // its points are those of another patch
    patchPlace = circle();
    Image1Picture = Bitmap(Picture1.image().copy(patchPlace));
    Picture7 = Image1Picture;
    Image1.visible = true;
    Frame6Place = {patchPlace.left() + patchPlace.width() + besidePatch, patchPlace.top() - besidePatch};
}

void RedI::putPatchBack() {
    paintOver(Picture1, patchPlace.topLeft(), Picture7);
    Picture2 = Picture7;
    refreshOverview(patchPlace);
}

void RedI::Command3_Click() {
    fixByHand(passesByHand, std::nullopt);
}

void RedI::Image1_MouseUp() {
    fixByHand(passesByHand, std::nullopt);
}

void RedI::Image1_MouseDown(Button button, QPointF at) {
    if (button == Button::Right)
        fixByHand(passesAtPoint, QPoint(static_cast<int>(std::floor(at.x())), static_cast<int>(std::floor(at.y()))));
}

void RedI::fixByHand(int passes, std::optional<QPoint> centre) {
    kofez.visible = false;
    if (!canCorrect() || !keepUndoCopy(circle())) {
        showState();
        return;
    }
    Frame6.visible = false;
    takePatch();
    for (int pass = 0; pass < passes; ++pass) {
        takeStats();
        // The first pass goes round the point that was meant, the later ones round the strongest pixel.
        if (pass == 0) {
            const QPoint meant = centre.value_or(QPoint(Picture7.width() / 2, Picture7.height() / 2));
            RedPeakX = meant.x();
            RedPeakY = meant.y();
        }
        RedEye::fixAround(Picture7, {RedPeakX, RedPeakY}, {RedPeakValue, RedPeakX, RedPeakY, RedPeakBrightness});
    }
    Image1.visible = false;
    putPatchBack();
    markChanged();
}

void RedI::takeStats() {
    const RedEye::PatchStats stats = RedEye::patchStats(Picture7);
    Label13.text = QString::number(stats.peak.redness);
    if (stats.peak.redness > 0) {
        RedPeakValue = stats.peak.redness;
        RedPeakX = stats.peak.x;
        RedPeakY = stats.peak.y;
        RedPeakBrightness = stats.peak.brightness;
    }
    Label16.text = PlainNumber(static_cast<float>(stats.averageRedness));
    Label17.text = PlainNumber(static_cast<float>(stats.averageBrightness));
}

void RedI::HScroll1_Change(int value) {
    if (!ready() || !keepUndoCopy({}))
        return;
    HScroll1 = std::clamp(value, 0, HScroll1Max);
    RedFixLevel = HoldIn16Bits(HScroll1 * 10);
    showLevel();
    RedChanged = true;
    showState();
}

// Darkening

void RedI::Image6_Click() {
    Image6_MouseMove();
    darken();
}

void RedI::Frame6_Click() {
    darken();
}

void RedI::darken() {
    if (!ready())
        return;
    CleanList();
    if (List2.isEmpty())
        return;
    RedEye::darken(Picture7, Picture7.image().rect(), List2.items());
    m_undo.changedOtherwise(patchPlace & Picture1.image().rect());
    putPatchBack();
    showState();
}

void RedI::Image6_MouseMove() {
    Label45.visible = true;
    Frame6.visible = false;
    Timer7.start();
    Q_EMIT changed();
}

void RedI::Timer7_Tick() {
    Timer7.stop();
    Label45.visible = false;
    Q_EMIT changed();
}

void RedI::CleanList() {
    List2.clear();
    List2.append(RedEye::withoutRepeats(List1.items()));
    showCounts();
}

void RedI::forgetLists() {
    List1.clear();
    List2.clear();
    showCounts();
}

// Going back

bool RedI::keepUndoCopy(const QRect& part) {
    const QRect inside = part & Picture1.image().rect();
    const Result<void> folders = Workspace(m_state, m_platform.files).MakeWorkspace();
    const auto keep = [&] { return folders ? m_undo.keep(Picture1, inside) : folders; };
    // Who is quicker than the disk waits for it, and is told so.
    Result<void> kept;
    if (m_undo.isReady()) {
        kept = keep();
    } else {
        waitFor(m_state.wording(u"רגע אחד, נשמר עותק לביטול…"_s, u"One moment, keeping a copy for undo…"_s));
        kept = RunBlocking(keep);
        busy = false;
        Label4Busy.visible = false;
        showState();
    }
    if (!kept) {
        m_platform.dialogs.message(m_state
                                       .wording(u"לא ניתן לשמור עותק לביטול, ולכן התיקון לא נעשה.\n%1"_s,
                                                u"No copy for undo can be kept, so the correction was not made.\n%1"_s)
                                       .arg(kept.failure().message));
        return false;
    }
    m_changedBefore = RedChanged;
    // What the customer's file holds there, so that all corrections can be cancelled without reading it again.
    for (const QRect& fresh : QRegion(inside) - m_corrected)
        m_originals.emplace_back(fresh.topLeft(), Bitmap(Picture1.image().copy(fresh)));
    m_corrected += inside;
    return true;
}

void RedI::Image7_Click() {
    if (!ready() || !m_undo.canRestore())
        return;
    const Result<QRegion> restored = m_undo.restore(Picture1);
    if (!restored) {
        m_platform.dialogs.message(m_state.wording(u"לא ניתן לבטל את הצעד.\n%1"_s, u"The step can't be undone.\n%1"_s)
                                       .arg(restored.failure().message));
        return;
    }
    RedChanged = m_changedBefore;
    afterGoingBack(*restored);
}

void RedI::Rstor_Click() {
    kofez.visible = false;
    if (caption == notChosen || !ready())
        return;
    for (const auto& [at, original] : m_originals)
        paintOver(Picture1, at, original);
    m_undo.changedOtherwise(m_corrected);
    RedChanged = false;
    afterGoingBack(m_corrected);
}

// The patch in work belongs to a correction that is no more.
void RedI::afterGoingBack(const QRegion& changedPart) {
    stopHolds();
    for (const QRect& rect : changedPart)
        refreshOverview(rect);
    forgetLists();
    RedFixLevel = 0;
    showLevel();
    Frame6.visible = false;
    Picture7 = Picture2 = Bitmap();
    patchPlace = {};
    m_step = RedTargetRectangle.visible ? Step::Aim : Step::FindEye;
    setTexts();
}

void RedI::markChanged() {
    RedChanged = true;
    m_step = Step::Corrected;
    setTexts();
}

void RedI::refreshOverview(const QRect& changedPart) {
    RedOverview::refresh(Picture3, Picture1, changedPart);
}

// The menu

void RedI::kofez_Open() {
    if (!ready())
        return;
    stopHolds();
    kofez.visible = true;
    Q_EMIT changed();
}

void RedI::kofez_Close() {
    kofez.visible = false;
    Q_EMIT changed();
}

void RedI::CommandHelp_Click() {
    stopHolds();
    FrameHelp.visible = true;
    Q_EMIT changed();
}

void RedI::CommandHelpClose_Click() {
    FrameHelp.visible = false;
    Q_EMIT changed();
}

void RedI::fixFromMenu(int level) {
    kofez_Close();
    RedFix(level);
}

void RedI::Bsisi_Click() {
    fixFromMenu(0);
}

void RedI::amok2_Click() {
    fixFromMenu(15);
}

void RedI::amok3_Click() {
    fixFromMenu(30);
}

void RedI::amok4_Click() {
    fixFromMenu(45);
}

void RedI::amok5_Click() {
    fixFromMenu(65);
}

void RedI::Memokad_Click() {
    kofez_Close();
}

// For the operator

void RedI::showPixel(QRgb pixel, QPoint at) {
    const int redness = RedEye::redness(pixel);
    const int brightness = RedEye::brightness(pixel);
    Rlbl.text = QString::number(qRed(pixel));
    Glbl.text = QString::number(qGreen(pixel));
    Blbl.text = QString::number(qBlue(pixel));
    Label1.text = QString::number(at.x());
    Label2.text = QString::number(at.y());
    Label3.text = QString::number(redness);
    Label12.text = QString::number(brightness);
    Label24.text = QString::number(redness - brightness);
    Label27.text = PlainNumber(static_cast<float>(redness) / std::max(1, brightness));
    Label28.text = PlainNumber(static_cast<float>(m_peak.ratio() * 7 - RedFixLevel));
    Q_EMIT changed();
}

void RedI::Picture7_MouseMove(QPointF at) {
    const QPoint pixel(static_cast<int>(std::floor(at.x())), static_cast<int>(std::floor(at.y())));
    if (!Picture7.image().valid(pixel))
        return;
    const QRgb value = Picture7.image().pixel(pixel);
    showPixel(value, pixel + patchPlace.topLeft());
    Label6.text = QString::number(RedEye::redness(value));
    Label6Order = Label16.text.isEmpty()                  ? Order::Unknown
                  : Val(Label6.text) >= Val(Label16.text) ? Order::InOrder
                                                          : Order::OutOfOrder;
}

void RedI::showCounts() {
    Label42.text = QString::number(List1.count());
    Label43.text = QString::number(List2.count());
}

void RedI::showLevel() {
    Label37.text = QString::number(RedFixLevel);
}

} // namespace lumora
