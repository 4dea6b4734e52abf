#include "editing/redeye/RedI.h"

#include "common/FixedText.h"
#include "editing/editor/tFrmNew.h"
#include "editing/redeye/RedOverview.h"
#include "order/EditRecord.h"
#include "order/KeptPictures.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/BlockingCall.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"
#include "session/Workspace.h"

#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int holdPace = 100;
constexpr int noticeTime = 4000;
constexpr double tremble = 8; // units of the viewing area that a finger moves without meaning to drag
const QStringList wheelSteps = {u"2"_s, u"0"_s, u"-2"_s};

QPoint pixelAt(QPointF at) {
    return {static_cast<int>(std::floor(at.x())), static_cast<int>(std::floor(at.y()))};
}

} // namespace

RedI::RedI(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(pageId)
    , m_state(state)
    , m_edit(state.edit)
    , m_platform(platform)
    , m_chain(chain)
    , m_kept(state, platform.files)
    , Timer1(holdPace, [this] { resizeOnce(); })
    , Timer2(holdPace, [this] { moveCircle(Timer2, 0, -arrowStep); })
    , Timer3(holdPace, [this] { moveCircle(Timer3, 0, arrowStep); })
    , Timer4(holdPace, [this] { moveCircle(Timer4, -arrowStep, 0); })
    , Timer5(holdPace, [this] { moveCircle(Timer5, arrowStep, 0); })
    , Timer7(noticeTime, [this] { hideNotice(); }) {}

RedI::~RedI() = default;

void RedI::load() {
    caption = notChosen;
    Combo1.append(wheelSteps);
    Combo1.setCurrentIndex(1);
    showState();
}

void RedI::open(const DrivePath& path) {
    if (busy)
        return;
    stopHolds();
    m_picture.clear();
    forgetLists();
    for (Caption* hidden : {&RedTargetRectangle, &Frame6, &Label45, &kofez, &FrameHelp})
        hidden->visible = false;
    m_step = Step::FindEye;
    caption = notChosen;
    waitFor(m_state.wording(u"התמונה נפתחת, רגע אחד…"_s, u"Opening the picture, one moment…"_s));
    m_chain.follow(PageId::tFrmNew, Outcome::RedEyesWanted);
    m_platform.pump.pump(); // so that the page is seen before the reading begins

    struct Opened {
        Bitmap picture;
        Bitmap overview;
        PictureSize overviewSize;
        RedEyePicture::Originals originals;
    };
    const Drives& drives = m_platform.files.drives();
    const auto load =
        [kept = KeptPictures(m_platform.files, m_state.keptFolder)](const DrivePath& from) -> Result<Bitmap> {
        const std::optional<HostPath> host = kept.hostOf(from);
        Result<Bitmap> picture = host ? loadPicture(*host) : Failure{Failure::Kind::NotFound, from.text()};
        if (!picture)
            return picture;
        Bitmap white = onWhite(*picture);
        if (white.isNull())
            return Failure{Failure::Kind::TooLarge, from.text()};
        return white;
    };
    const DrivePath beginning = m_kept.begin(path);
    Result<Opened> opened = RunBlocking([&]() -> Result<Opened> {
        Result<Bitmap> picture = load(path);
        RedEyePicture::Originals originals;
        if (picture && beginning != path) {
            const Bitmap file = std::move(*picture);
            picture = load(beginning);
            if (picture && picture->image().size() == file.image().size())
                originals = RedEyePicture::differences(file, *picture);
            else if (picture)
                picture = file; // the copy belongs to another picture that had this name
        }
        if (!picture)
            return picture.failure();
        const PictureSize size = RedOverview::size({picture->width(), picture->height()});
        return Opened{*picture, RedOverview::draw(*picture, RedOverview::pixels(size)), size, std::move(originals)};
    });
    endWait();
    if (!opened) {
        tellFailure(u"לא ניתן לפתוח את התמונה לתיקון.\n%1"_s, u"The picture can't be opened for correction.\n%1"_s,
                    {opened.failure().kind, warnedWords(m_state, opened.failure(), path)});
        close();
        return;
    }
    caption = path.text();
    m_sight.open({opened->picture.width(), opened->picture.height()});
    // A failure is told when the folders are needed.
    static_cast<void>(Workspace(m_state, m_platform.files).MakeWorkspace());
    const DrivePath undoCopy = WorkspacePaths::tempred(m_state) / u"000.bmp";
    m_picture.begin(std::move(opened->picture), std::move(opened->overview), opened->overviewSize,
                    drives.toHost(undoCopy).value_or(HostPath()), std::move(opened->originals));
    setTexts();
}

void RedI::drawOverview() {
    if (!ready())
        return;
    m_picture.drawOverview();
    showState();
}

// Moving about

void RedI::goTo(QPointF share) {
    if (!ready())
        return;
    const PictureSize size = m_sight.picture;
    place({static_cast<int>(share.x() * size.width), static_cast<int>(share.y() * size.height)});
    m_sight.bringToCentre(m_sight.centre());
    m_step = Step::Place;
    setTexts();
}

void RedI::press(Button button, QPointF at) {
    if (!ready())
        return;
    if (button == Button::Right) {
        m_drag.release();
        openMenu();
        return;
    }
    m_drag.press(at);
    m_pressed = at;
    m_dragged = false;
}

void RedI::drag(QPointF at) {
    if (!ready())
        return;
    const QPoint pixel = pixelAt(at);
    if (!m_picture.Picture7.isNull() && m_picture.patchPlace.contains(pixel))
        readPatch(pixel - m_picture.patchPlace.topLeft());
    else if (m_picture.Picture1.image().valid(pixel))
        showPixel(m_picture.Picture1.image().pixel(pixel), pixel);
    if (!m_drag.held())
        return;
    m_dragged = m_dragged || ((at - m_pressed) * m_sight.Magnification).manhattanLength() > tremble;
    if (!m_dragged)
        return;
    // The pointer is in pixels of the picture, which itself moves under it.
    m_sight.movePicture(m_drag.distance(at) * m_sight.Magnification);
    Q_EMIT changed();
}

void RedI::letGo(QPointF at) {
    if (!m_drag.held())
        return;
    m_drag.release();
    const QPoint pixel = pixelAt(at);
    if (m_dragged || !ready() || !m_picture.Picture1.image().valid(pixel))
        return;
    place(pixel);
    m_step = Step::Aim;
    setTexts();
}

void RedI::loseHold() {
    m_drag.release();
    stopHolds();
}

void RedI::beginHold(Ticker& timer) {
    stopHolds();
    if (canCorrect())
        m_held.press(timer);
}

void RedI::endArrow() {
    endHold();
    if (!canCorrect())
        return;
    m_step = Step::Aim;
    setTexts();
}

void RedI::moveCircle(const Ticker& timer, int right, int down) {
    if (!m_held.ticks(timer))
        return;
    if (!canCorrect()) {
        stopHolds();
        return;
    }
    m_sight.moveCircle(right, down);
    Q_EMIT changed();
}

void RedI::magnify(int to) {
    if (ready() && m_sight.magnify(to, RedTargetRectangle.visible ? m_sight.centre() : m_sight.middle()))
        showState();
}

// The lists belong to the eye at the former place.
void RedI::place(QPoint centre) {
    m_sight.place(centre);
    RedTargetRectangle.visible = true;
    Frame6.visible = false;
    m_picture.RedFixLevel = 0;
    showLevel();
    forgetLists();
}

// The circle's size

void RedI::holdSize(int step) {
    m_sizeStep = step;
    beginHold(Timer1);
}

void RedI::resizeOnce() {
    if (m_held.ticks(Timer1))
        resizeCircle(m_sizeStep);
}

void RedI::turnWheel(int index) {
    Combo1.setCurrentIndex(index);
    resizeCircle(static_cast<int>(Val(Combo1.currentItem())));
    Combo1.setCurrentIndex(1); // so that the next turn is a change again
}

void RedI::resizeCircle(int by) {
    if (!canCorrect()) {
        stopHolds();
    } else if (m_sight.resizeCircle(by)) {
        forgetLists();
        showState();
    }
}

// Leaving

void RedI::accept() {
    if (!ready())
        return;
    stopHolds();
    switch (m_kept.accept(m_picture)) {
    case KeptCorrection::Accept::Nothing:
        break;
    case KeptCorrection::Accept::GiveUp:
        giveUpCorrected();
        break;
    case KeptCorrection::Accept::Save:
        if (const Result<void> saved = saveCorrected(); !saved) {
            tellFailure(u"התמונה המתוקנת לא נשמרה. התיקונים עדיין כאן.\n%1"_s,
                        u"The corrected picture was not saved. The corrections are still here.\n%1"_s, saved.failure());
            showState();
            return;
        }
        m_edit.RedMarker = EditRecord::corrected;
        m_chain.load<tFrmNew>().takeCorrection();
        break;
    }
    close();
}

void RedI::leave() {
    if (!busy)
        close();
}

Result<void> RedI::saveCorrected() {
    const Files& files = m_platform.files;
    if (const Result<void> made = Workspace(m_state, files).MakeWorkspace(); !made)
        return made;
    if (const Result<void> made = files.makeFolder(WorkspacePaths::jobFolder(m_state) / u"red_folder"); !made)
        return made;
    const DrivePath target = WorkspacePaths::corrected(m_state, DrivePath(caption));
    const std::optional<HostPath> host = files.drives().toHost(target);
    if (!host)
        return Failure{Failure::Kind::NotFound, target.text()};
    waitFor(m_state.wording(u"התמונה המתוקנת נשמרת, רגע אחד…"_s, u"Saving the corrected picture, one moment…"_s));
    m_platform.pump.pump();
    const Result<void> saved = RunBlocking([this, &host] { return saveBmp(m_picture.Picture1, *host); });
    endWait();
    return saved;
}

// A copy that can't be removed is read by nobody, since the record has no mark.
void RedI::giveUpCorrected() {
    m_edit.RedMarker = EditRecord::notMarked;
    static_cast<void>(m_platform.files.removeFile(WorkspacePaths::corrected(m_state, DrivePath(caption))));
    m_chain.load<tFrmNew>().takeCorrection();
}

void RedI::close() {
    stopHolds();
    Timer7.stop();
    m_picture.end();
    m_chain.unload(pageId);
}

// What is shown

void RedI::waitFor(const QString& text) {
    busy = true;
    Label4Busy.text = text;
    Label4Busy.visible = true;
    showState();
}

void RedI::endWait() {
    busy = false;
    Label4Busy.visible = false;
}

void RedI::tellFailure(const QString& hebrew, const QString& english, const Failure& failure) const {
    m_platform.dialogs.message(m_state.wording(hebrew, english).arg(failure.message));
}

void RedI::show(Caption& control, bool on) {
    control.visible = on;
    Q_EMIT changed();
}

void RedI::showState() {
    const bool able = canCorrect();
    for (Caption* control : {&Image2, &Image10, &Image11, &Image12, &Image13, &Image14, &Image15, &Image16, &Command3,
                             &Command13, &Bsisi, &amok2, &amok3, &amok4, &amok5, &amok, &Memokad})
        control->enabled = able;
    Image6.enabled = Frame6.enabled = ready() && !List1.isEmpty();
    Image7.enabled = ready() && m_picture.canGoBack();
    Image5.enabled = Rstor.enabled = ready() && m_picture.canCancel();
    CommandMenu.enabled = Image8.enabled = Command6.enabled = ready();
    Image9.enabled = !busy;
    CommandCloser.enabled = ready() && m_sight.Magnification < RedEyeSight::largestMagnification;
    CommandFurther.enabled = ready() && m_sight.Magnification > 1;
    Q_EMIT changed();
}

} // namespace lumora
