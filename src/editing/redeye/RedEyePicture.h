#pragma once

#include "common/Result.h"
#include "editing/redeye/RedEye.h"
#include "editing/redeye/RedUndoCopy.h"
#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"

#include <QPoint>
#include <QRect>
#include <QRegion>
#include <QStringList>

#include <cstdint>
#include <filesystem>
#include <optional>
#include <utility>
#include <vector>

namespace lumora {

// The picture of one visit to the red-eye page: its corrections, and how they are taken back. keep() comes before each
// correction.
class RedEyePicture {
public:
    // What the customer's file holds in parts of the picture that do not overlap, each with its place.
    using Originals = std::vector<std::pair<QPoint, Bitmap>>;
    // The parts in which a picture of the same size differs from the file.
    static Originals differences(const Bitmap& file, const Bitmap& picture);

    // The picture with its overview. file: where the undo copy goes; empty: nowhere, and keep() fails. originals: of a
    // picture that was corrected before.
    void begin(Bitmap picture, Bitmap overview, PictureSize overviewSize, const std::filesystem::path& file,
               Originals originals = {});
    void clear();
    // Ends the undo copy; its file stays if it holds a step back.
    void end() { m_undo.end(); }

    // Keeps the picture as it is now for one step back, and for cancelAll() what the customer's file holds in the part
    // that changes. Waits for the disk while isReady() is false.
    bool isReady() const { return m_undo.isReady(); }
    Result<void> keep(const QRect& part);

    void drawOverview();
    void findPeak(QPoint centre);
    // Makes the circle's square the patch in work. False: it is the same place as before.
    bool takePatch(const QRect& circle);
    // Greys the patch round the strongest red near centre. Returns the pixels changed, "x^y" within the patch.
    QStringList correct(QPoint centre);
    // The hand-placed variant, which begins at a point of the patch: so many passes. Returns what the last one found.
    RedEye::PatchStats correctByHand(int passes, QPoint meant);
    void darken(const QStringList& pixels);
    void markChanged() { RedChanged = true; }

    bool canGoBack() const { return m_undo.canRestore(); }
    Result<void> goBack();
    // Brings back the customer's file.
    bool canCancel() const { return RedChanged || m_wasCorrected; }
    void cancelAll();
    // Whether a pixel is another one than in the customer's file.
    bool differsFromFile() const;

    // State: const from outside.
    Bitmap Picture1;              // the whole picture at full size: what is edited
    Bitmap Picture3;              // the overview
    PictureSize Picture3Size;     // its logical size: 250 wide or 300 high
    Bitmap Image1Picture;         // the patch as it was
    Bitmap Picture7;              // the patch in work
    Bitmap Picture2;              // the result
    QRect patchPlace;             // where Picture7 belongs in Picture1
    std::int16_t RedFixLevel = 0; // how much deeper the correction goes
    bool RedChanged = false;      // Picture1 differs from the file
    int RedPeakValue = 0;
    int RedPeakX = 0;
    int RedPeakY = 0;
    int RedPeakBrightness = 1;
    RedEye::Peak peak; // what findPeak found

private:
    void putPatchBack();
    void afterGoingBack(const QRegion& changedPart);

    RedUndoCopy m_undo;
    bool m_changedBefore = false; // RedChanged when the undo copy was made
    bool m_wasCorrected = false;  // before this visit
    QRegion m_corrected;          // where Picture1 may differ from the customer's file
    Originals m_originals;        // what the file holds there
};

} // namespace lumora
