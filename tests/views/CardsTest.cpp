#include "PageLook.h"

#include "platform/Platform.h"
#include "platform/files/Drives.h"
#include "platform/files/Files.h"
#include "platform/media/MediaFolders.h"
#include "samples/SamplePhotographs.h"
#include "samples/SamplePictureFiles.h"
#include "selection/pictures/kyoskNew.h"
#include "session/SessionState.h"
#include "support/TestPlatform.h"
#include "views/kit/ElidedLabel.h"
#include "views/window/PicturePicker.h"

#include <QDateTime>
#include <QFile>
#include <QListWidget>
#include <QRegularExpression>
#include <QTest>

namespace lumora {
namespace {

const QString toThePictures = toDetails + toOptions + toBorder + toTerms + toPictures;

// A folder of media in which a name that ends in ".card" is mounted.
struct Slots {
    QTemporaryDir folder;
    Cards::Source source = [this] {
        return std::make_unique<MediaFolders>(std::vector{toHostPath(folder.path())},
                                              [](const HostPath& path) { return path.extension() == ".card"; });
    };
    // A camera's card with the pictures of the walk.
    void putIn(Walk& walk, const HostPath& name) const {
        const HostPath media = toHostPath(folder.path());
        const HostPath camera = media / "being made" / "DCIM" / "101CANON";
        std::filesystem::create_directories(camera);
        std::filesystem::copy(*walk.program().platform().files.drives().toHost(walk.pictureFolder()), camera);
        std::filesystem::rename(media / "being made", media / name);
    }
};

class CardsLook : public PageLook {};

TEST_P(CardsLook, OffersACardThatIsPutInAndOpensItsNewestFolder) {
    Slots media;
    Walk walk(GetParam(), u"[Door]\nCards = watched\n"_s, nullptr, media.source);
    go(walk, toThePictures + u":12-no-card"_s);
    const auto& shown = walk.page<kyoskNew>(PageId::kyoskNew).controls();
    EXPECT_FALSE(shown.cardOffer.enabled);
    media.putIn(walk, "EOS.card");
    ASSERT_TRUE(QTest::qWaitFor([&] { return shown.cardOffer.enabled; }, 20000));
    go(walk, u":12-card cardOffer"_s);
    walk.settle(300);
    EXPECT_EQ(shown.List4.count(), 14);
    EXPECT_TRUE(shown.List4.item(0).contains(u"\\EOS.card\\DCIM\\101CANON\\")) << qPrintable(shown.List4.item(0));
    EXPECT_FALSE(shown.cardOffer.enabled) << "it is open";
    look(walk, u"12-card-opened"_s);
    walk.page<kyoskNew>(PageId::kyoskNew).Command12_Click(0);
    ASSERT_TRUE(
        QTest::qWaitFor([&] { return shown.cardCopies.visible && !shown.cardCopies.text.contains(u'1'); }, 20000));
    look(walk, u"12-card-copied"_s);
    media.putIn(walk, "HOLIDAY.card");
    ASSERT_TRUE(QTest::qWaitFor([&] { return shown.cardOffer.enabled; }, 20000));
    look(walk, u"12-card-beside"_s);
    lookAtPicker(walk, u"kyoskNew"_s, u"Image5"_s, u"11-picker-cards"_s, u"card(1)"_s);
    EXPECT_EQ(shown.List4.count(), 28);
    std::filesystem::remove_all(toHostPath(media.folder.path()) / "HOLIDAY.card");
    EXPECT_TRUE(QTest::qWaitFor([&] { return !shown.cardOffer.enabled; }, 20000));
}

TEST(StoredCards, AreNotLookedFor) {
    Walk walk(QSize(1024, 768), {}, nullptr, []() -> std::unique_ptr<RemovableMedia> {
        ADD_FAILURE() << "looked for";
        return std::make_unique<MediaFolders>();
    });
    walk.go(toThePictures);
    EXPECT_FALSE(walk.pressable(u"kyoskNew"_s, u"cardOffer"_s));
}

TEST(PicturePicker, OpensACardAtItsNewestFolderAndShowsItsDays) {
    TestPlatform machine;
    SessionState state;
    state.EnglishTips = 1;
    state.door.everyFormat = true;
    const HostPath media = toHostPath(machine.folder.path()) / "media";
    const QDateTime now = machine.clock.now();
    const std::pair<const char*, int> files[] = {{"100CANON/a.jpg", 70}, {"101CANON/old.jpg", 60},
                                                 {"101CANON/b.jpg", 15}, {"101CANON/c.HEIC", 1},
                                                 {"101CANON/a.jpg", 15}, {"101CANON/notes.txt", 1}};
    for (const auto& [name, hoursAgo] : files) {
        const HostPath path = media / "EOS" / "DCIM" / name;
        std::filesystem::create_directories(path.parent_path());
        QFile file(toText(path));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly) &&
                    file.write(path.extension() == ".HEIC" ? heif(patches(64, 64), {}) : QByteArray()) >= 0 &&
                    file.flush() && file.setFileTime(now.addSecs(-3600 * hoursAgo), QFileDevice::FileModificationTime));
    }
    const auto isMounted = [](const HostPath&) { return true; };
    Cards cards([&] { return std::make_unique<MediaFolders>(std::vector{media}, isMounted); }, true);
    cards.setLook([&, roots = machine.drives.mediaRoots()]() -> std::function<void()> {
        return [&, found = Drives::findMedia(roots)] { machine.drives.giveLetters(found); };
    });
    const Cards::Watch watch(cards);
    ASSERT_TRUE(QTest::qWaitFor([&] { return !cards.all().empty() && cards.all()[0].summary; }, 20000));
    EXPECT_EQ(cards.all()[0].summary->pictures, 5) << "of every format";
    EXPECT_EQ(machine.drives.toDrive(media / "EOS"), u"D:\\"_path) << "known before its count";
    const Theme theme(Theme::Fit{});
    QWidget window;
    Platform platform = machine.with(cards);
    platform.doorProgram = media / "hangs";
    ASSERT_TRUE(writeWholeFile(platform.doorProgram, "#!/bin/sh\nexec sleep 600\n") &&
                QFile::setPermissions(toText(platform.doorProgram), QFile::ReadOwner | QFile::ExeOwner));
    const PicturePicker picker(theme, &window, state, platform, u"x"_s, {}, {}, Dialogs::Offer::Pictures);
    const auto* grid = picker.findChild<QListWidget*>(u"pickerGrid"_s);
    QStringList rows;
    for (int row = 0; row < grid->count(); ++row)
        rows += grid->item(row)->text();
    EXPECT_EQ(rows.join(u'|'),
              u"Today · Saturday, 21 November 2026|c.HEIC|Yesterday · Friday, 20 November 2026|a.jpg|b.jpg|"
              "Thursday, 19 November 2026|old.jpg");
    EXPECT_EQ(grid->currentRow(), 1);
    const auto told = [&](int row) { return grid->item(row)->data(Qt::AccessibleTextRole).toString(); };
    EXPECT_TRUE(QTest::qWaitFor([&] { return told(3) == u"a.jpg, The file is damaged"; }, 20000));
    EXPECT_EQ(told(1), u"") << "it hangs, and holds none behind it";
    const auto* card = picker.findChild<QAbstractButton*>(u"place(0)"_s);
    EXPECT_EQ(card->accessibleName(), u"EOS"_s) << "as its tile";
    EXPECT_EQ(picker.findChild<ElidedLabel*>()->accessibleName(),
              u"EOS \u203A \u2068DCIM\u2069 \u203A \u2068101CANON\u2069"_s);
    for (const char* name : {"LATER", "LAST"})
        std::filesystem::create_directories(media / name);
    const auto* third = picker.findChild<QAbstractButton*>(u"card(2)"_s);
    const auto places = [&] {
        QStringList folders;
        for (const auto* place : picker.findChildren<QAbstractButton*>(QRegularExpression(u"^place"_s)))
            folders += place->property("folder").toString();
        return folders.filter(toText(media));
    };
    EXPECT_TRUE(QTest::qWaitFor([&] { return places().size() == 3 && !third->isHidden(); }, 20000));
}

INSTANTIATE_TEST_SUITE_P(Screens, CardsLook, PageLook::screens(), PageLook::nameOf);

} // namespace
} // namespace lumora
