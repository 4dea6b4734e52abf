#include "ThePage.h"

#include "order/DoorFolders.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "order/OrderState.h"
#include "samples/SamplePhotographs.h"
#include "samples/SamplePictureFiles.h"
#include "selection/door/DoorNames.h"
#include "selection/door/ListPictures.h"
#include "selection/door/PictureDoor.h"

#include <QFile>
#include <QSet>

namespace lumora {
namespace {

TEST(DoorNames, AreInTheCodePageAndThereOnce) {
    const struct {
        QStringList names;
        QStringList behind;
    } cases[] = {
        {{u"a.heic"_s, u"a.jpg"_s, u"a.png"_s}, {u"a (2).jpg"_s, u"a.jpg"_s, u"a (3).jpg"_s}},
        {{u"A.JPG"_s, u"a.webp"_s, u"b.Jpg"_s}, {u"A.JPG"_s, u"a (2).jpg"_s, u"b.jpg"_s}},
        {{u"cafe.jpeg"_s, u"café.jpg"_s}, {u"cafe.jpg"_s, u"cafe (2).jpg"_s}},
        {{u"שבת שלום.heic"_s, u"1€.tif"_s}, {u"שבת שלום.jpg"_s, u"1€.jpg"_s}},
        {{u"写真.png"_s, u"写.jpg"_s, u"a:b*.gif"_s}, {u"picture 1.jpg"_s, u"picture 2.jpg"_s, u"ab.jpg"_s}},
    };
    for (const auto& row : cases)
        EXPECT_EQ(doorNames(row.names), row.behind) << qPrintable(row.names.join(u' '));
}

const QString doorFolders = u"C:\\2000lumora\\zmany\\door"_s;

class TheDoor : public ThePage {
protected:
    TheDoor() {
        state.door = {true, true, true};
        state.EnglishTips = 1;
        machine.platform.doorProgram = LUMORA_DOOR;
        makeFolder(u"C:\\p"_path);
        const QByteArray jpeg = saved(picture, "JPG");
        put(u"a.jpg"_s, jpeg);
        const QByteArray turned = jpegWith(jpeg, exif(6, false, saved(patches(16, 12), "JPG")), "broken");
        put(u"b.jpg"_s, turned);
        put(u"café.jpg"_s, jpeg);
        put(u"d.heic"_s, heif(picture, {.small = 32}));
        put(u"e.jpg"_s, turned.left(turned.size() * 7 / 10));
        put(u"f.txt"_s, "no picture");
        put(u"g.webp"_s, "empty");
    }

    void put(const QString& name, const QByteArray& bytes) { write(u"C:\\p"_path / name, bytes); }

    kyoskNew& openWithTheFolder() {
        kyoskNew& page = open();
        pick(page, u"C:\\p\\a.jpg"_s);
        return page;
    }
    void waitForCells(const kyoskNew& page) {
        waitUntil([&page] {
            const auto& cells = page.controls().Picture1;
            return std::none_of(cells.begin(), cells.end(), [](const CellPicture& cell) { return cell.waiting; });
        });
    }
    QStringList made() const { return machine.files.collect(DrivePath(doorFolders), Files::Depth::WithSubfolders); }
    QStringList folders() const { return machine.files.folders(DrivePath(doorFolders)); }

    const QImage picture = patches(48, 32);
};

TEST_F(TheDoor, ShowsEachPictureUprightUnderItsOwnNameAndOrdersWhatCanBePrinted) {
    testing::internal::CaptureStderr();
    kyoskNew& page = openWithTheFolder();
    const kyoskNewControls& shown = page.controls();
    EXPECT_EQ(shown.pictureCount.text, u"6 pictures"_s);
    EXPECT_TRUE(shown.Picture1[3].waiting) << "its turn comes while the customer looks";
    for (const std::size_t draft : {1, 4})
        EXPECT_GT(shown.Picture1[draft].bitmap.height(), shown.Picture1[draft].bitmap.width()) << draft;
    bool drafted = false;
    QObject::connect(&page, &Page::changed, [&] {
        const bool made = machine.files.fileExists(DrivePath(shown.Picture1[3].text));
        drafted = drafted || (!made && !shown.Picture1[3].bitmap.isNull());
    });
    EXPECT_EQ(shown.Picture1[5].unreadable, u"a kind of file that can't be shown"_s) << "told by its header";
    waitForCells(page);
    const QStringList names{u"a.jpg"_s, u"b.jpg"_s, u"café.jpg"_s, u"d.heic"_s, u"e.jpg"_s, u"g.webp"_s};
    EXPECT_TRUE(drafted) << "its small picture comes before it";
    const std::string warned = testing::internal::GetCapturedStderr();
    EXPECT_NE(warned.find("/b.jpg: its colour profile is broken and was ignored\n"), warned.npos) << warned;
    for (std::size_t cell = 0; cell < 6; ++cell) {
        EXPECT_EQ(shown.Picture1[cell].name, names[qsizetype(cell)]);
        EXPECT_EQ(shown.Picture1[cell].bitmap.isNull(), cell > 3) << cell;
    }
    EXPECT_GT(shown.Picture1[1].bitmap.height(), shown.Picture1[1].bitmap.width()) << "held upright";
    EXPECT_TRUE(shown.resolution[3].visible);
    EXPECT_EQ(shown.Picture1[4].unreadable, u"this file is damaged"_s);
    EXPECT_EQ(shown.List2.item(0), u"C:\\p\\a.jpg"_s) << "used where it lies";

    page.Picture1_Click(4);
    page.Command12_Click(5);
    EXPECT_TRUE(shown.List1.isEmpty());
    page.Picture1_Click(3);
    EXPECT_EQ(shown.Label2.text, u"C:\\p\\d.heic"_s);
    page.Command24_Click(); // the whole folder
    page.Image7_Click();
    page.Command8_Click();
    ASSERT_EQ(chain.front()->id(), PageId::Form2);
    QStringList printed;
    for (const QString& line : state.handOver.lines) {
        printed += LeafName(line);
        EXPECT_TRUE(machine.files.fileExists(DrivePath(line.mid(9)))) << qPrintable(line);
    }
    EXPECT_EQ(printed, QStringList({u"d.jpg"_s, u"a.jpg"_s, u"b.jpg"_s, u"cafe.jpg"_s}));

    // Back from the preparation all is as it was; left for another order nothing stays.
    state.handOver.back = true;
    chain.unload(PageId::kyoskNew);
    EXPECT_EQ(made().size(), 3);
    kyoskNew& again = open();
    waitForCells(again);
    EXPECT_EQ(again.controls().Label7.text, u"4"_s);
    EXPECT_EQ(again.controls().Picture1[3].name + again.controls().Label4[3].text, u"d.heic1"_s);
    chain.unload(PageId::kyoskNew);
    waitUntil([this] { return folders().isEmpty(); });
}

TEST_F(TheDoor, HoldsTheOrderUntilItsPicturesAreMadeAndSaysWhichAreTakenOut) {
    for (int i = 0; i < 14; ++i)
        put(u"z%1.png"_s.arg(i), saved(picture, "PNG").left(i == 13 ? 300 : 1000000));
    kyoskNew& page = openWithTheFolder();
    page.Command24_Click();
    page.Image7_Click();
    EXPECT_TRUE(page.controls().doorPanel.visible && !page.controls().Frame4.visible);
    page.doorBack_Click();
    EXPECT_FALSE(page.controls().doorPanel.visible);
    page.Command3_Click();
    EXPECT_TRUE(page.controls().doorCount.text.endsWith(u" / 19"_s) && !page.controls().Frame4.visible);
    waitUntil([&page] { return !page.controls().doorPanel.visible; });
    EXPECT_FALSE(page.controls().Frame4.visible) << "the box is read first";
    page.Image7_Click();
    EXPECT_TRUE(page.controls().Frame4.visible);
    EXPECT_EQ(page.controls().Label20.text, u"17"_s);
    EXPECT_EQ(machine.dialogs.messages,
              QStringList(u"These pictures can't be read and were taken out of the order:\ne.jpg\nz13.png"_s));
}

TEST_F(TheDoor, KeepsAnOrderWhosePicturesCouldNotBeMade) {
    machine.platform.doorProgram = host(u"C:\\door"_s); // not there, as room on a disk that is full
    kyoskNew& page = openWithTheFolder();
    page.Picture1_Click(3);
    for (const int told : {1, 2, 3}) {
        if (told > 1)
            page.Image7_Click();
        waitUntil([&] { return machine.dialogs.messages.size() == told && !page.controls().doorPanel.visible; });
    }
    EXPECT_EQ(machine.dialogs.messages.last(),
              u"The picture d.heic could not be made ready.\nWhat is ready stays. Please ask the shop.\n"
              u"A program is missing on this computer"_s);
    EXPECT_EQ(page.controls().List1.count(), 1);
    EXPECT_FALSE(page.controls().Frame4.visible);
    std::filesystem::create_symlink(LUMORA_DOOR, machine.platform.doorProgram);
    page.Image7_Click();
    waitUntil([&page] { return page.controls().Frame4.visible; });
}

TEST_F(TheDoor, MakesRoomByWhatIsNotKept) {
    PictureDoor door(machine.files, DoorDecoder(LUMORA_DOOR), state.door);
    door.setFolder(DrivePath(doorFolders) / u"1", false);
    const QStringList made{door.worked(u"C:\\p\\b.jpg"_s), door.worked(u"C:\\p\\café.jpg"_s),
                           door.worked(u"C:\\p\\d.heic"_s)};
    door.setKept([&](const QString& path) { return path == made[0]; }, {}, 1);
    for (const QString& path : made) {
        door.want({path});
        waitUntil([&] { return !door.isWaiting(path); });
    }
    EXPECT_EQ(door.stateOf(made[0]), PictureDoor::State::Ready);
    EXPECT_TRUE(door.isWaiting(made[1]) && !machine.files.fileExists(DrivePath(made[1])));
    EXPECT_EQ(door.stateOf(made[2]), PictureDoor::State::Ready) << "the latest";
}

qint64 bytesRead() {
    QFile counts(u"/proc/self/io"_s);
    EXPECT_TRUE(counts.open(QIODevice::ReadOnly));
    return counts.readLine().mid(7).trimmed().toLongLong(); // "rchar: 123"
}

TEST_F(TheDoor, ShowsWhatTheHeadersHoldAtOnceAndThenThePicturesThemselves) {
    makeFolder(u"C:\\q"_path);
    QImage old(160, 120, QImage::Format_RGB32); // of another picture, which a program has left there
    old.fill(Qt::red);
    const QByteArray photograph = samplePhotographFile({1500, 1000}, 1);
    ASSERT_GT(photograph.size() * 12, 3'000'000);
    for (int i = 0; i < 30; ++i)
        write(u"C:\\q"_path / u"%1.jpg"_s.arg(10 + i), jpegWith(photograph, exif(1, false, saved(old, "JPG"))));
    kyoskNew& page = open();
    const auto& cells = page.controls().Picture1;
    const auto isDraft = [&](std::size_t cell) {
        const QImage& drawn = cells[cell].bitmap.image();
        return !drawn.isNull() && drawn.pixelColor(drawn.rect().center()).red() > 240 && drawn.size() == QSize(115, 77);
    };
    const qint64 before = bytesRead();
    qint64 firstSight = 0;
    QObject::connect(&page, &Page::changed, [&] {
        if (firstSight == 0 && isDraft(0) && isDraft(11))
            firstSight = bytesRead() - before;
    });
    pick(page, u"C:\\q\\10.jpg"_s);
    EXPECT_GT(firstSight, 12 * 1000);
    EXPECT_LT(firstSight, 1'000'000);
    for (std::size_t cell = 0; cell < cells.size(); ++cell)
        EXPECT_FALSE(isDraft(cell)) << cell;
}

TEST_F(TheDoor, ShowsPicturesOfEveryKindInAListOfFiles) {
    put(u"plain.heic"_s, heif(picture, {}));
    put(u"large.png"_s, saved(patches(1200, 800), "PNG"));
    using Kind = Failure::Kind;
    const struct {
        const char* name;
        QSize size = {96, 64};
        Kind kind = Kind::Other;
        const char* program = LUMORA_DOOR;
    } cases[] = {
        {"a.jpg"},
        {"b.jpg", {64, 96}},
        {"d.heic", {96, 60}},
        {"plain.heic"},
        {"large.png"},
        {"e.jpg", {}, Kind::Damaged},
        {"g.webp", {}, Kind::Unsupported},
        {"large.png", {}, Kind::NoProgram, "/nowhere"},
        {"a.jpg", {96, 64}, Kind::Other, "/nowhere"},
    };
    for (const auto& [name, size, kind, program] : cases) {
        SCOPED_TRACE(name);
        ListPictures list(program, state.door, 96);
        std::optional<Result<Bitmap>> told;
        QObject::connect(&list, &ListPictures::done, [&](int row, const Result<Bitmap>& result) {
            EXPECT_EQ(row, 2);
            told = result;
        });
        list.read(1, host(u"C:\\p\\a.jpg"_s));
        list.stop();
        list.read(2, host(u"C:\\p"_path / QString::fromLatin1(name)));
        waitUntil([&] { return told.has_value(); });
        ASSERT_EQ(told->ok(), !size.isEmpty());
        EXPECT_EQ(told->ok() ? (*told)->image().size() : QSize(), size);
        EXPECT_EQ(told->ok() ? Kind::Other : told->failure().kind, kind);
    }
}

TEST_F(TheDoor, OpensAPictureInTheEditorOnceItIsMade) {
    state.Optint = OrderKind::EditedPrint;
    kyoskNew& page = openWithTheFolder();
    page.Picture1_Click(3);
    waitUntil([this] { return chain.front() == chain.find<tFrmNew>(); });
    EXPECT_TRUE(state.edit.PicturePath.text().endsWith(u"\\d.jpg"_s));
    EXPECT_EQ(page.openCell(), 3);
}

TEST_F(TheDoor, OffersAndUsesJpegFilesAsTheyLieUnlessTheLabAsksForMore) {
    state.door = {};
    kyoskNew& asBuiltIn = openWithTheFolder();
    EXPECT_EQ(asBuiltIn.controls().List2.items(),
              QStringList({u"C:\\p\\a.jpg"_s, u"C:\\p\\b.jpg"_s, u"C:\\p\\caf?.jpg"_s, u"C:\\p\\e.jpg"_s}));
    EXPECT_TRUE(folders().isEmpty());
    chain.unload(PageId::kyoskNew);
    state.door.upright = true;
    put(u"a.jpg"_s, jpegWith(saved(picture, "JPG"), {}, adobeProfile()));
    kyoskNew& upright = openWithTheFolder();
    const QStringList paths = upright.controls().List2.items();
    EXPECT_EQ(paths.first(), u"C:\\p\\a.jpg"_s) << "its colours are as stored";
    EXPECT_TRUE(paths.value(1).startsWith(doorFolders) && paths.size() == 4);
}

TEST_F(TheDoor, KeepsTheFoldersOfOrdersThatMayStillBePreparedAndNoOther) {
    const auto make = [this] {
        const DrivePath folder = newDoorFolder(machine.files);
        makeFolder(folder);
        write(folder / u"x.jpg", "x");
        return folder;
    };
    const DrivePath own = make();
    const DrivePath other = make();
    const OrderFolder order(u"C:\\2000lumora\\!!000\\a"_path);
    makeFolder(order.path());
    const QStringList lines{u"1 1015GNB"_s + own.text() + u"\\k\\a.jpg"_s,
                            u"1 1015GNBD:"_s + other.text().mid(2) + u"\\k\\a.jpg"_s}; // of a customer's card
    const auto keep = [&](OrderState::Phase phase, OrderState::Way way) {
        OrderState kept;
        kept.number = u"7"_s;
        kept.phase = phase;
        kept.way = way;
        kept.items = lines;
        EXPECT_TRUE(WriteOrderState(machine.files, order, kept));
        tidyDoorFolders(state, machine.files);
        return folders();
    };
    EXPECT_EQ(keep(OrderState::Phase::Preparing, OrderState::Way::Station), QStringList(own.leaf()));
    EXPECT_EQ(keep(OrderState::Phase::Prepared, OrderState::Way::Ftp), QStringList(own.leaf()));
    // Its folder goes with the first sending; what lies there at a later one is not its own.
    OrderJournal journal(machine.files, order);
    EXPECT_TRUE(journal.sendingBegins(Sender::Ftp, true));
    EXPECT_TRUE(folders().isEmpty());
    makeFolder(own);
    EXPECT_TRUE(journal.sendingBegins(Sender::Ftp, true));
    EXPECT_EQ(folders(), QStringList(own.leaf()));
    EXPECT_EQ(keep(OrderState::Phase::Prepared, OrderState::Way::Station), QStringList());
}

TEST_F(TheDoor, NeverTakesOnePictureForAnother) {
    kyoskNew& page = openWithTheFolder();
    waitForCells(page);
    const QStringList first = page.controls().List2.items();
    // Another card lies at the same place by now, and a file more.
    put(u"d.heic"_s, heif(patches(32, 48), {}));
    put(u"d.avif"_s, heif(picture, {.avif = true}));
    machine.dialogs.picks += u"C:\\p\\a.jpg"_path;
    page.Image5_Click();
    waitForCells(page);
    const QStringList second = page.controls().List2.items().sliced(1); // behind the last of the first time
    EXPECT_EQ(QSet<QString>(second.begin(), second.end()).size(), second.size());
    EXPECT_FALSE(second.contains(first[3])) << "the first card's";
    const QByteArray made = read(DrivePath(first[3]));

    // Nor where the order comes back, and a third card.
    page.Picture1_Click(0);
    page.Image7_Click();
    page.Command8_Click();
    state.handOver.back = true;
    chain.unload(PageId::kyoskNew);
    kyoskNew& again = open();
    put(u"d.heic"_s, heif(patches(64, 64), {}));
    pick(again, u"C:\\p\\a.jpg"_s);
    waitForCells(again);
    EXPECT_EQ(read(DrivePath(first[3])), made);
}

} // namespace
} // namespace lumora
