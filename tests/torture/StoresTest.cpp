#include "DiskFault.h"

#include "common/HostFile.h"
#include "door/DoorDecoder.h"
#include "editing/render/StoredSmallView.h"
#include "entry/details/DetailStore.h"
#include "finished/pieces/Mod4split.h"
#include "imaging/files/PictureFile.h"
#include "kiosk/OrderKeeping.h"
#include "order/BrokenFiles.h"
#include "order/OrderFolder.h"
#include "order/OrderState.h"
#include "selection/HandOverFiles.h"
#include "session/TextList.h"
#include "session/Workspace.h"
#include "support/PageRig.h"

namespace lumora {
namespace {

struct StoresOnAFailingDisk : ::testing::Test, PageRig {};

TEST_F(StoresOnAFailingDisk, HoldTheOldContentOrTheNewAndTellEachFailure) {
    const Files& files = machine.files;
    const DrivePath root = WorkspacePaths::root(state);
    const DrivePath picture = root / u"one.jpg", piece = root / u"a_jpp_001_001.prk";
    const OrderFolder order(u"C:\\2000lumora\\!!000\\2026_11_21_KUP_1234^105"_path);
    const DetailStore details(state, files);
    const Mod4split pieces(files, [](int, int) { return true; });
    state.MisparHazmana = u"105"_s;
    state.kiosk.on = true;
    TextList broken;
    broken.append(picture.text());
    makeFolder(root);
    write(piece, "a whole print");
    write(root / u"b.jpp", "another print");
    const HostPath upright = host(root / u"upright.jpg"), behindTheDoor = host(root / u"door.jpg");
    ASSERT_TRUE(saveJpeg(Bitmap(9, 9, Qt::red), upright, 90));
    const auto failureOf = [](const auto& done) { return done.failure ? Result<void>(*done.failure) : Result<void>(); };
    const struct {
        DrivePath path;
        std::function<Result<void>()> write;
        int syncedFiles = 1;
    } stores[] = {
        {WorkspacePaths::counter(state), [&] { return Workspace(state, files).writeCounter(); }},
        {root / u"pratim.txt",
         [&] {
             return details.SaveDetails({u"Dana"_s, u"03"_s});
         }},
        {root / u"pratim2.txt",
         [&] {
             return details.SaveAlbumDetails({u"Dana"_s, u"03"_s, u"d"_s});
         }},
        {root / u"Tik4txt\\all_list.txt", [&] { return writeHandOverFiles(state, files, {u"a"_s}, 0); }, 0},
        {StoredSmallView::path(state, picture),
         [&] { return StoredSmallView::store(state, files, picture, Bitmap(9, 9, Qt::red)); }},
        {order.statePath(), [&] { return WriteOrderState(files, order, {}); }},
        {order.brokenFilesPath(), [&] { return WriteBrokenFiles(files, order, broken); }},
        {picture, [&] { return saveJpeg(Bitmap(9, 9, Qt::red), host(picture), 90); }},
        {root / u"door.jpg",
         [&] {
             const auto made = DoorDecoder({}).make(upright, behindTheDoor);
             return made ? Result<void>() : made.failure();
         }},
        {u"C:\\vedron\\keeping.txt"_path, [&] { return OrderKeeping(state, machine.platform).look(); }},
        {root / u"copy", [&] { return files.copyFile(piece, root / u"copy"); }},
        {root / u"b_jpp_003_003.prk",
         [&] {
             const auto here = Mod4split::Target::FolderOfSource;
             return failureOf(pieces.SplitFile(root / u"b.jpp", u"5"_s, here, u"jpp"_s));
         },
         3},
        {root / u"moorkavim\\a.jpp", [&] { return failureOf(pieces.MergeFamily(piece)); }},
    };
    for (const auto& store : stores) {
        makeFolder(store.path.folder());
        QByteArray after;
        int call = 0;
        for (bool failed = true; failed; ++call) {
            SCOPED_TRACE(store.path.text().toStdString() + ", call " + std::to_string(call));
            write(store.path, "7\r\n");
            const DiskFault fault(call);
            const Result<void> written = store.write();
            failed = call == 0 || fault.met();
            const QByteArray now = read(store.path);
            EXPECT_EQ(written.ok(), call == 0 || !failed);
            EXPECT_TRUE(written.ok() || (written.failure().kind == Failure::Kind::NoSpace) == (call % 2 == 1));
            if (call == 0) {
                after = now;
                EXPECT_EQ(fault.syncs(), 2 * store.syncedFiles) << "file and folder";
            }
            EXPECT_TRUE(now == after || (!written.ok() && now == "7\r\n")) << now.toStdString();
            EXPECT_EQ(removeLeftovers(host(u"C:\\"_s), std::filesystem::file_time_type::max()), 0);
        }
        EXPECT_NE(after, "7\r\n");
        EXPECT_GT(call, 5) << "open, write, close and rename";
    }
}

} // namespace
} // namespace lumora
