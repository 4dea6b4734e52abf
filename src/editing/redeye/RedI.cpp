#include "editing/redeye/RedI.h"

#include "common/DrivePathText.h"
#include "common/FixedText.h"
#include "editing/editor/tFrmNew.h"
#include "editing/redeye/RedOverview.h"
#include "order/EditRecord.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/BlockingCall.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <algorithm>
#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int holdPace = 100;
constexpr int noticeTime = 4000;
constexpr int arrowStep = 2;
constexpr double tremble = 8; // units of the viewing area that a finger moves without meaning to drag
constexpr int overviewDensity = 2;
const QStringList wheelSteps = {u"2"_s, u"0"_s, u"-2"_s};

} // namespace

RedI::RedI(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::RedI)
    , Timer1(holdPace, [this] { Timer1_Tick(); })
    , Timer2(holdPace, [this] { Timer2_Tick(); })
    , Timer3(holdPace, [this] { Timer3_Tick(); })
    , Timer4(holdPace, [this] { Timer4_Tick(); })
    , Timer5(holdPace, [this] { Timer5_Tick(); })
    , Timer7(noticeTime, [this] { Timer7_Tick(); })
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain) {}

RedI::~RedI() = default;

void RedI::load() {
    caption = notChosen;
    Combo1.append(wheelSteps);
    Combo1.setCurrentIndex(1);
    RedTargetRectangle.visible = false;
    Image1.visible = Frame6.visible = Label45.visible = kofez.visible = FrameHelp.visible = Label4Busy.visible = false;
    showState();
}

void RedI::open(const QString& path) {
    if (busy)
        return;
    stopHolds();
    m_undo.end();
    Picture1 = Picture3 = Picture7 = Picture2 = Image1Picture = Bitmap();
    patchPlace = {};
    m_corrected = {};
    m_originals.clear();
    forgetLists();
    RedTargetRectangle.visible = Frame6.visible = Label45.visible = kofez.visible = FrameHelp.visible = false;
    RedChanged = m_changedBefore = false;
    RedFixLevel = 0;
    m_step = Step::FindEye;
    caption = notChosen;
    waitFor(m_state.wording(u"התמונה נפתחת, רגע אחד…"_s, u"Opening the picture, one moment…"_s));
    m_chain.follow(PageId::tFrmNew, Outcome::RedEyesWanted);
    m_platform.pump.pump(); // so that the page is seen before the reading begins

    struct Opened {
        Bitmap picture;
        Bitmap overview;
        PictureSize overviewSize;
    };
    const std::optional<HostPath> host = m_platform.files.drives().toHost(path);
    Result<Opened> opened = RunBlocking([&host, &path]() -> Result<Opened> {
        Result<Bitmap> picture = host ? loadPicture(*host) : Failure{Failure::Kind::NotFound, path};
        if (!picture)
            return picture.failure();
        const Bitmap white = onWhite(*picture);
        if (white.isNull())
            return Failure{Failure::Kind::TooLarge, path};
        const PictureSize size = RedOverview::size({white.width(), white.height()});
        const Bitmap overview = RedOverview::draw(white, {size.width * overviewDensity, size.height * overviewDensity});
        return Opened{white, overview, size};
    });
    busy = false;
    Label4Busy.visible = false;
    if (!opened) {
        m_platform.dialogs.message(
            m_state
                .wording(u"לא ניתן לפתוח את התמונה לתיקון.\n%1"_s, u"The picture can't be opened for correction.\n%1"_s)
                .arg(opened.failure().message));
        close();
        return;
    }
    Picture1 = std::move(opened->picture);
    Picture3 = std::move(opened->overview);
    Picture3Size = opened->overviewSize;
    caption = path;

    const int longer = std::max(Picture1.width(), Picture1.height());
    m_circleSize = std::clamp(longer / 100, 12, 80);
    Magnification = m_circleSize >= 48 ? 1 : m_circleSize >= 24 ? 2 : 4;
    RedSearchX = Picture1.width() / 2;
    RedSearchY = Picture1.height() / 2;
    bringToCentre(QPoint(RedSearchX, RedSearchY));
    static_cast<void>(Workspace(m_state, m_platform.files).MakeWorkspace()); // what failed is told when it is needed
    if (const auto copy = m_platform.files.drives().toHost(undoPath()))
        m_undo.begin(Picture1, *copy);
    setTexts();
}

QString RedI::undoPath() const {
    return JoinDrivePath(WorkspacePaths::tempred(m_state), u"000.bmp"_s);
}

QRect RedI::circle() const {
    return {RedSearchX - m_circleSize / 2, RedSearchY - m_circleSize / 2, m_circleSize, m_circleSize};
}

void RedI::Command6_Click() {
    if (!ready())
        return;
    Picture3Size = RedOverview::size({Picture1.width(), Picture1.height()});
    Picture3 =
        RedOverview::draw(Picture1, {Picture3Size.width * overviewDensity, Picture3Size.height * overviewDensity});
    showState();
}

// Moving about

void RedI::Picture3_Click(QPointF at) {
    if (!ready())
        return;
    place({static_cast<int>(at.x() * Picture1.width()), static_cast<int>(at.y() * Picture1.height())});
    bringToCentre(QPoint(RedSearchX, RedSearchY));
    m_step = Step::Place;
    setTexts();
}

void RedI::Picture1_MouseDown(Button button, QPointF at) {
    if (!ready())
        return;
    if (button == Button::Right) {
        m_drag.release();
        kofez_Open();
        return;
    }
    m_drag.press(at);
    m_pressed = at;
    m_dragged = false;
}

void RedI::Picture1_MouseMove(QPointF at) {
    if (!ready())
        return;
    const QPoint pixel(static_cast<int>(std::floor(at.x())), static_cast<int>(std::floor(at.y())));
    if (!Picture7.isNull() && patchPlace.contains(pixel))
        Picture7_MouseMove(at - patchPlace.topLeft());
    else if (Picture1.image().valid(pixel))
        showPixel(Picture1.image().pixel(pixel), pixel);
    if (!m_drag.held())
        return;
    m_dragged = m_dragged || ((at - m_pressed) * Magnification).manhattanLength() > tremble;
    if (!m_dragged)
        return;
    // Points are those of the picture, which moves under the pointer: it follows softly.
    const QPointF way = m_drag.distance(at) * Magnification;
    moveTo(Picture1Left + way.x(), Picture1Top + way.y());
    Q_EMIT changed();
}

void RedI::Picture1_MouseUp(QPointF at) {
    if (!m_drag.held())
        return;
    m_drag.release();
    const QPoint pixel(static_cast<int>(std::floor(at.x())), static_cast<int>(std::floor(at.y())));
    if (m_dragged || !ready() || !Picture1.image().valid(pixel))
        return;
    place(pixel);
    m_step = Step::Aim;
    setTexts();
}

void RedI::Picture1_MouseLost() {
    m_drag.release();
    stopHolds();
}

void RedI::Image12_MouseDown() {
    startHold(Timer2);
}

void RedI::Image13_MouseDown() {
    startHold(Timer3);
}

void RedI::Image14_MouseDown() {
    startHold(Timer4);
}

void RedI::Image15_MouseDown() {
    startHold(Timer5);
}

void RedI::Arrow_MouseUp() {
    stopHolds();
    if (!canCorrect())
        return;
    m_step = Step::Aim;
    setTexts();
}

void RedI::Timer2_Tick() {
    if (m_held.ticks(Timer2))
        moveCircle(0, -arrowStep);
}

void RedI::Timer3_Tick() {
    if (m_held.ticks(Timer3))
        moveCircle(0, arrowStep);
}

void RedI::Timer4_Tick() {
    if (m_held.ticks(Timer4))
        moveCircle(-arrowStep, 0);
}

void RedI::Timer5_Tick() {
    if (m_held.ticks(Timer5))
        moveCircle(arrowStep, 0);
}

void RedI::CommandCloser_Click() {
    magnify(Magnification * 2);
}

void RedI::CommandFurther_Click() {
    magnify(Magnification / 2);
}

void RedI::magnify(int to) {
    if (!ready() || to < 1 || to > largestMagnification)
        return;
    const QPointF middle = RedTargetRectangle.visible
                               ? QPointF(RedSearchX, RedSearchY)
                               : (viewingCentre - QPointF(Picture1Left, Picture1Top)) / Magnification;
    Magnification = to;
    bringToCentre(middle);
    showState();
}

// The picture never leaves the middle of the viewing area, so that it can't be lost.
void RedI::moveTo(double left, double top) {
    Picture1Left = std::clamp(left, viewingCentre.x() - static_cast<double>(Picture1.width()) * Magnification,
                              static_cast<double>(viewingCentre.x()));
    Picture1Top = std::clamp(top, viewingCentre.y() - static_cast<double>(Picture1.height()) * Magnification,
                             static_cast<double>(viewingCentre.y()));
}

void RedI::bringToCentre(QPointF at) {
    moveTo(viewingCentre.x() - at.x() * Magnification, viewingCentre.y() - at.y() * Magnification);
}

// Another place is another eye: what was found for the last one is forgotten.
void RedI::place(QPoint centre) {
    RedSearchX = std::clamp(centre.x(), 0, Picture1.width() - 1);
    RedSearchY = std::clamp(centre.y(), 0, Picture1.height() - 1);
    RedTargetRectangle.visible = true;
    Frame6.visible = false;
    RedFixLevel = 0;
    showLevel();
    forgetLists();
}

void RedI::moveCircle(int dx, int dy) {
    if (!canCorrect()) {
        stopHolds();
        return;
    }
    const QPoint before(RedSearchX, RedSearchY);
    RedSearchX = std::clamp(RedSearchX + dx, 0, Picture1.width() - 1);
    RedSearchY = std::clamp(RedSearchY + dy, 0, Picture1.height() - 1);
    moveTo(Picture1Left - (RedSearchX - before.x()) * Magnification,
           Picture1Top - (RedSearchY - before.y()) * Magnification);
    Q_EMIT changed();
}

// The circle's size

void RedI::Image10_MouseDown() {
    m_sizeStep = -1;
    startHold(Timer1);
}

void RedI::Image11_MouseDown() {
    m_sizeStep = 1;
    startHold(Timer1);
}

void RedI::Size_MouseUp() {
    stopHolds();
}

void RedI::Timer1_Tick() {
    if (m_held.ticks(Timer1))
        resizeCircle(m_sizeStep);
}

void RedI::Combo1_Change(int index) {
    Combo1.setCurrentIndex(index);
    resizeCircle(static_cast<int>(Val(Combo1.currentItem())));
    Combo1.setCurrentIndex(1); // so that the next turn is a change again
}

void RedI::resizeCircle(int by) {
    if (!canCorrect()) {
        stopHolds();
        return;
    }
    const int longer = std::max(Picture1.width(), Picture1.height());
    const int size = std::clamp(m_circleSize + by, smallestCircle, std::clamp(longer, smallestCircle, largestCircle));
    if (size == m_circleSize)
        return;
    m_circleSize = size;
    forgetLists();
    showState();
}

void RedI::startHold(Ticker& timer) {
    stopHolds();
    if (canCorrect())
        m_held.press(timer);
}

void RedI::tickOnceIfNone() {
    m_held.tickOnceIfNone();
}

void RedI::stopHolds() {
    m_held.release();
}

// Leaving

void RedI::Image8_Click() {
    if (!ready())
        return;
    stopHolds();
    if (RedChanged) {
        if (const Result<void> saved = saveCorrected(); !saved) {
            m_platform.dialogs.message(
                m_state
                    .wording(u"התמונה המתוקנת לא נשמרה. התיקונים עדיין כאן.\n%1"_s,
                             u"The corrected picture was not saved. The corrections are still here.\n%1"_s)
                    .arg(saved.failure().message));
            showState();
            return;
        }
        m_state.edit.RedMarker = EditRecord::corrected;
        m_chain.load<tFrmNew>().Command5_Click();
    }
    close();
}

void RedI::Image9_Click() {
    if (!busy)
        close();
}

Result<void> RedI::saveCorrected() {
    const Files& files = m_platform.files;
    if (const Result<void> made = Workspace(m_state, files).MakeWorkspace(); !made)
        return made;
    if (const Result<void> made = files.makeFolder(JoinDrivePath(WorkspacePaths::jobFolder(m_state), u"red_folder"_s));
        !made)
        return made;
    const QString target = WorkspacePaths::corrected(m_state, caption);
    const std::optional<HostPath> host = files.drives().toHost(target);
    if (!host)
        return Failure{Failure::Kind::NotFound, target};
    waitFor(m_state.wording(u"התמונה המתוקנת נשמרת, רגע אחד…"_s, u"Saving the corrected picture, one moment…"_s));
    m_platform.pump.pump();
    const Result<void> saved = RunBlocking([this, &host] { return saveBmp(Picture1, *host); });
    busy = false;
    Label4Busy.visible = false;
    return saved;
}

void RedI::close() {
    stopHolds();
    Timer7.stop();
    m_undo.end();
    m_chain.unload(PageId::RedI);
}

void RedI::waitFor(const QString& text) {
    busy = true;
    Label4Busy.text = text;
    Label4Busy.visible = true;
    showState();
}

void RedI::showState() {
    const bool able = canCorrect();
    for (Caption* control : {&Image2, &Image10, &Image11, &Image12, &Image13, &Image14, &Image15, &Image16, &Command3,
                             &Command13, &Bsisi, &amok2, &amok3, &amok4, &amok5, &amok, &Memokad})
        control->enabled = able;
    Image6.enabled = Frame6.enabled = ready() && !List1.isEmpty();
    Image7.enabled = ready() && m_undo.canRestore();
    Image5.enabled = Rstor.enabled = ready() && RedChanged;
    CommandMenu.enabled = Image8.enabled = Command6.enabled = ready();
    Image9.enabled = !busy;
    CommandCloser.enabled = ready() && Magnification < largestMagnification;
    CommandFurther.enabled = ready() && Magnification > 1;
    Q_EMIT changed();
}

} // namespace lumora
