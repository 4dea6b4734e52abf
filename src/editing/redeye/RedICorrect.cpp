// The red-eye page: its corrections, and what the operator reads of them.
#include "editing/redeye/RedI.h"

#include "common/FixedText.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/BlockingCall.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

void RedI::RedFix(int level) {
    if (!canCorrect() || !keepUndoCopy(m_sight.circle()))
        return;
    m_picture.RedFixLevel = HoldIn16Bits(level);
    correct();
    m_picture.RedFixLevel = 0;
    markCorrected();
}

// The level stays, so that each press goes deeper.
void RedI::deepen() {
    constexpr int deeper = 10;
    kofez.visible = false;
    if (!canCorrect() || !keepUndoCopy(m_sight.circle())) {
        showState();
        return;
    }
    m_picture.RedFixLevel = HoldIn16Bits(m_picture.RedFixLevel + deeper);
    correct();
    showLevel();
    markCorrected();
}

void RedI::deepenAndClean() {
    deepen();
    CleanList();
}

void RedI::fixFromMenu(int level) {
    closeMenu();
    RedFix(level);
}

void RedI::correct() {
    takePatch();
    m_drag.release();
    List1.append(m_picture.correct(m_sight.centre()));
    Image1.visible = false;
    showPeak();
    Frame6.visible = true;
    showCounts();
}

void RedI::findPeak() {
    if (!ready())
        return;
    m_picture.findPeak(m_sight.centre());
    showPeak();
}

void RedI::takePatch() {
    constexpr int besidePatch = 40;
    if (m_picture.takePatch(m_sight.circle()))
        forgetLists(); // they hold points of another patch
    const QRect patch = m_picture.patchPlace;
    Frame6.visible = false;
    Frame6Place = {patch.left() + patch.width() + besidePatch, patch.top() - besidePatch};
    Image1.visible = true;
}

void RedI::correctByHand() {
    constexpr int passes = 3;
    correctByHand(passes, QPoint(m_sight.circleSize / 2, m_sight.circleSize / 2));
}

void RedI::correctByHand(int passes, QPoint meant) {
    kofez.visible = false;
    if (!canCorrect() || !keepUndoCopy(m_sight.circle())) {
        showState();
        return;
    }
    takePatch();
    const RedEye::PatchStats stats = m_picture.correctByHand(passes, meant);
    Label13.text = QString::number(stats.peak.redness);
    m_averageRedness = static_cast<float>(stats.averageRedness);
    Label16.text = PlainNumber(*m_averageRedness);
    Label17.text = PlainNumber(static_cast<float>(stats.averageBrightness));
    Image1.visible = false;
    markCorrected();
}

void RedI::setLevel(int tens) {
    if (!ready() || !keepUndoCopy({}))
        return;
    HScroll1 = std::clamp(tens, 0, HScroll1Max);
    m_picture.RedFixLevel = HoldIn16Bits(HScroll1 * 10);
    showLevel();
    m_picture.markChanged();
    showState();
}

// Darkening

void RedI::darken() {
    if (!ready())
        return;
    CleanList();
    if (List2.isEmpty())
        return;
    m_picture.darken(List2.items());
    showState();
}

void RedI::darkenWithNotice() {
    tellWhenToDarken();
    darken();
}

void RedI::tellWhenToDarken() {
    Frame6.visible = false;
    Timer7.start();
    show(Label45, true);
}

void RedI::hideNotice() {
    Timer7.stop();
    show(Label45, false);
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
    const Result<void> folders = Workspace(m_state, m_platform.files).MakeWorkspace();
    const auto keep = [&] { return folders ? m_picture.keep(part) : folders; };
    // The undo copy may still be under way: the customer waits for it and is told.
    Result<void> kept;
    if (m_picture.isReady()) {
        kept = keep();
    } else {
        waitFor(m_state.wording(u"רגע אחד, נשמר עותק לביטול…"_s, u"One moment, keeping a copy for undo…"_s));
        kept = RunBlocking(keep);
        endWait();
        showState();
    }
    if (!kept)
        tellFailure(u"לא ניתן לשמור עותק לביטול, ולכן התיקון לא נעשה.\n%1"_s,
                    u"No copy for undo can be kept, so the correction was not made.\n%1"_s, kept.failure());
    return kept.ok();
}

void RedI::goBack() {
    if (!ready() || !m_picture.canGoBack())
        return;
    if (const Result<void> back = m_picture.goBack(); !back)
        tellFailure(u"לא ניתן לבטל את הצעד.\n%1"_s, u"The step can't be undone.\n%1"_s, back.failure());
    else
        afterGoingBack();
}

void RedI::cancelAll() {
    kofez.visible = false;
    if (!ready())
        return;
    m_picture.cancelAll();
    afterGoingBack();
}

void RedI::afterGoingBack() {
    stopHolds();
    forgetLists();
    showLevel();
    Frame6.visible = false;
    m_step = RedTargetRectangle.visible ? Step::Aim : Step::FindEye;
    setTexts();
}

void RedI::markCorrected() {
    m_picture.markChanged();
    m_step = Step::Corrected;
    setTexts();
}

// The menu and the instructions

void RedI::openMenu() {
    if (!ready())
        return;
    stopHolds();
    show(kofez, true);
}

void RedI::openHelp() {
    stopHolds();
    show(FrameHelp, true);
}

// For the operator

void RedI::showPeak() {
    const RedEye::Peak& peak = m_picture.peak;
    Label25.text = QString::number(peak.redness);
    Label30.text = QString::number(peak.redness - peak.brightness);
    Label31.text = QString::number(peak.ratio(), 'g', 15);
    Q_EMIT changed();
}

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
    Label28.text = PlainNumber(static_cast<float>(m_picture.peak.ratio() * 7 - m_picture.RedFixLevel));
    Q_EMIT changed();
}

void RedI::readPatch(QPoint pixel) {
    if (!m_picture.Picture7.image().valid(pixel))
        return;
    const QRgb value = m_picture.Picture7.image().pixel(pixel);
    showPixel(value, pixel + m_picture.patchPlace.topLeft());
    const int redness = RedEye::redness(value);
    Label6.text = QString::number(redness);
    Label6Order = !m_averageRedness                                  ? Order::Unknown
                  : static_cast<float>(redness) >= *m_averageRedness ? Order::InOrder
                                                                     : Order::OutOfOrder;
}

QString RedI::readings() const {
    return u"R %1 G %2 B %3 · %4 − %5 = %6 · %7 | %8"_s.arg(
        Rlbl.text, Glbl.text, Blbl.text, Label3.text, Label12.text, Label24.text, Label28.text,
        QStringList{Label25.text, Label30.text, Label31.text, Label37.text, Label42.text, Label43.text}.join(u" · "_s));
}

void RedI::showCounts() {
    Label42.text = QString::number(List1.count());
    Label43.text = QString::number(List2.count());
}

void RedI::showLevel() {
    Label37.text = QString::number(m_picture.RedFixLevel);
}

} // namespace lumora
