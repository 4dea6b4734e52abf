#pragma once

#include "PlainOrder.h"

#include "assembly/edited/B3.h"
#include "common/FixedText.h"
#include "editing/editor/gdisave.h"
#include "order/EditRecord.h"
#include "session/Workspace.h"

namespace lumora {

using Changes = QList<std::pair<EditRecord::Column, QString>>;

// A picture that was opened in the editor and left as it is, with some fields changed.
inline QString record(const Changes& changes = {}) {
    QString text = EditRecord::newPicture();
    const auto set = [&](EditRecord::Column column, const QString& value) {
        text.replace(column.position - 1, column.width, LeftField(value, column.width));
    };
    set(EditRecord::PanX, u"225"_s);
    set(EditRecord::PanY, u"150"_s);
    for (const auto& [column, value] : changes)
        set(column, value);
    return text;
}

inline const Changes toned = {{EditRecord::ToneFlag, u"1"_s}};
inline const Changes redEyesCorrected = {{EditRecord::RedMarker, u"RED"_s}};
inline const Changes both = toned + redEyesCorrected;

class PreparingAnEditedOrder : public PreparingAPlainOrder {
protected:
    PreparingAnEditedOrder() {
        state.Optint = OrderKind::EditedPrint;
        registerPage<B3>(PageId::B3);
        registerPage<gdisave>(PageId::gdisave);
        for (const char* path : {"C:\\2000lumora", "C:\\2000lumora\\zmany", "C:\\2000lumora\\zmany\\tempred"})
            makeFolder(QString::fromLatin1(path));
    }

    static QString edited(const QString& path, const QString& edits = record(), const QString& copies = u"1 "_s) {
        return copies + u"1015GNB"_s + edits + path;
    }
    B3& open(const QStringList& items) {
        state.handOver.lines = items;
        chain.show(PageId::B3);
        return *dynamic_cast<B3*>(chain.find(PageId::B3));
    }
    // The page of either kind of order, and its start.
    PreparationPage& openEither(bool edits, const QStringList& items) {
        state.Optint = edits ? OrderKind::EditedPrint : OrderKind::Print;
        return edits ? static_cast<PreparationPage&>(open(items)) : openWith(items);
    }
    static void start(PreparationPage& page) {
        page.id() == PageId::B3 ? static_cast<B3&>(page).Command5_Click() : static_cast<Form2&>(page).Command3_Click();
    }
    // The paths that failed.
    QStringList prepare(const QStringList& items) {
        B3& page = open(items);
        const TextList& failed = page.controls().List4fail;
        page.Timer2_Tick();
        return failed.items();
    }
    // What the red-eye page would have left: bitmap data under the picture's own name.
    void giveCorrected(const QString& path, QColor colour) {
        EXPECT_TRUE(Bitmap(40, 30, colour).image().save(hostText(correctedPath(path)), "BMP"));
    }
    DrivePath correctedPath(const QString& path) const { return WorkspacePaths::corrected(state, DrivePath(path)); }
    QString hostText(const DrivePath& path) const { return toText(host(path)); }
    bool exists(const DrivePath& path) const { return machine.files.fileExists(path); }

    // The picture inside the print file of that place in the list.
    QImage print(int index) const {
        for (const QString& name : printFiles(state.MisparHazmana)) {
            const Result<PrintFileContent> content = unpacked(name, state.MisparHazmana);
            if (content && name.mid(9, 4).toInt() == index)
                return QImage::fromData(content->picture, "JPEG");
        }
        return {};
    }
    static void expectColour(const QImage& picture, QPoint at, QColor wanted) {
        ASSERT_FALSE(picture.isNull());
        const QColor found = picture.pixelColor(at);
        EXPECT_NEAR(found.red(), wanted.red(), 4);
        EXPECT_NEAR(found.green(), wanted.green(), 4);
        EXPECT_NEAR(found.blue(), wanted.blue(), 4);
    }

    const DrivePath bw = u"C:\\2000lumora\\bw.bmp"_path;
    const DrivePath jobFolder = u"C:\\2000lumora\\zmany\\job_folder"_path;
};

} // namespace lumora
