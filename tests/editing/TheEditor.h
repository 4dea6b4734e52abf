#pragma once

#include "common/FixedText.h"
#include "editing/caption/mikledet.h"
#include "editing/editor/BigPics.h"
#include "editing/editor/tFrmNew.h"
#include "imaging/files/PictureFile.h"
#include "order/EditRecord.h"
#include "session/Workspace.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

namespace lumora {

inline const DrivePath lying = u"C:\\p\\lying.jpg"_path;
inline const DrivePath standing = u"C:\\p\\standing.jpg"_path;

// The editor on a fresh drive with two red pictures. stored: the records that it gave away since a picture was opened.
class TheEditor : public testing::Test, protected PageRig {
protected:
    TheEditor() {
        state.Optint = OrderKind::EditedPrint;
        state.shemot.ppr = u"10/15"_s;
        state.shemot.Bord = u"NB"_s;
        EXPECT_TRUE(Workspace(state, machine.files).MakeWorkspace());
        makeFolder(u"C:\\p"_s);
        savePicture(lying, {400, 300}, Qt::red);
        savePicture(standing, {300, 400}, Qt::red);
        registerPage<tFrmNew>(PageId::tFrmNew);
        registerPage<mikledet>(PageId::mikledet);
        chain.registerPage(PageId::BigPics, [] { return std::make_unique<BigPics>(); });
        registerBare({PageId::kyoskNew});
    }

    void savePicture(const DrivePath& path, PictureSize size, QColor colour) {
        EXPECT_TRUE(saveJpeg(Bitmap(size.width, size.height, colour), host(path), 95));
    }
    // A frame of the preview with the list files that the categories are read by.
    void makeFrame(const QString& category, const QString& name, QColor colour) {
        const DrivePath folder = WorkspacePaths::misgarot(state) / category;
        EXPECT_TRUE(machine.files.makeFolder(folder));
        for (const QString& leaf : {u'k' + name + u".bmp"_s, name + u".bmp"_s, name + u".png"_s})
            EXPECT_TRUE(Bitmap(30, 20, colour).image().save(toText(host(folder / leaf))));
    }

    // The page, its stores recorded.
    tFrmNew& page() {
        auto* made = chain.find<tFrmNew>();
        if (made == nullptr) {
            made = &chain.load<tFrmNew>();
            QObject::connect(made, &tFrmNew::stored, [this] { stored += state.edit.EditState; });
        }
        return *made;
    }
    tFrmNew& open(const DrivePath& picture, const QString& record = EditRecord::newPicture()) {
        tFrmNew& editor = page();
        chain.show(PageId::tFrmNew);
        UnpackEditState(record, state.edit);
        state.edit.PicturePath = picture;
        editor.Command17_Click();
        stored.clear();
        return editor;
    }
    static QString recordWith(EditRecord::Column column, const QString& value,
                              QString record = EditRecord::newPicture()) {
        return record.replace(column.position - 1, column.width, LeftField(value, column.width));
    }
    QString field(EditRecord::Column column) const {
        return state.edit.EditState.mid(column.position - 1, column.width);
    }
    // Of the record that was stored last.
    QString storedField(EditRecord::Column column) const {
        return stored.value(stored.size() - 1).mid(column.position - 1, column.width);
    }
    const tFrmNewControls& shown() { return page().controls(); }
    const QImage& paper() { return shown().PicPic.image(); }
    QColor middle() { return paper().pixelColor(paper().rect().center()); }
    QColor corner() { return paper().pixelColor(2, 2); }

    // A button held for so many ticks.
    struct Button {
        void (tFrmNew::*down)();
        void (tFrmNew::*tick)();
        void (tFrmNew::*up)();
    };
    static constexpr Button right{&tFrmNew::Image135_MouseDown, &tFrmNew::Timer7_Tick, &tFrmNew::Image135_MouseUp};
    static constexpr Button left{&tFrmNew::Image115_MouseDown, &tFrmNew::Timer7_Tick, &tFrmNew::Image115_MouseUp};
    static constexpr Button up{&tFrmNew::Image125_MouseDown, &tFrmNew::Timer8_Tick, &tFrmNew::Image125_MouseUp};
    static constexpr Button down{&tFrmNew::Image145_MouseDown, &tFrmNew::Timer8_Tick, &tFrmNew::Image145_MouseUp};
    static constexpr Button turnRight{&tFrmNew::Image16_MouseDown, &tFrmNew::Timer6_Tick, &tFrmNew::Image16_MouseUp};
    static constexpr Button turnLeft{&tFrmNew::Image17_MouseDown, &tFrmNew::Timer6_Tick, &tFrmNew::Image17_MouseUp};
    void hold(const Button& button, int ticks) {
        (page().*button.down)();
        for (int i = 0; i < ticks; ++i)
            (page().*button.tick)();
        (page().*button.up)();
    }
    void holdImage2(int index, int ticks) {
        page().Image2_MouseDown(index);
        for (int i = 0; i < ticks; ++i)
            index < 2 ? page().Timer2_Tick() : page().Timer3_Tick();
        page().Image2_MouseUp(index);
    }

    QStringList stored;
};

} // namespace lumora
