#include "PlainOrder.h"

#include "support/SmallDisk.h"

#include <csignal>
#include <sys/resource.h>

namespace lumora {
namespace {

// The workspace on a disk that runs full in the middle of the order. Where this user may not mount one, files that may
// not grow beyond a limit stand in for it.
TEST_F(PreparingAPlainOrder, losesNothingThatIsMadeWhenTheDiskRunsFull) {
    constexpr int pictures = 8;
    QStringList items;
    for (int i = 0; i < pictures; ++i) {
        const int side = i % 2 == 0 ? 60 : 200;
        items += line(giveFile(u"pic%1.jpg"_s.arg(i), *encodeJpeg(noisyPicture(side, side, 5U + i), 90)));
    }
    rlimit before{};
    ASSERT_EQ(::getrlimit(RLIMIT_FSIZE, &before), 0);
    {
        const SmallDisk disk(200);
        std::filesystem::create_directory_symlink(disk.path(), host(u"C:\\2000lumora"_s));
        if (!disk.available()) {
            std::signal(SIGXFSZ, SIG_IGN);
            const rlimit limit{20000, before.rlim_max};
            ASSERT_EQ(::setrlimit(RLIMIT_FSIZE, &limit), 0);
        }
        Form2& page = openWith(items);
        const TextList& failed = page.controls().List4fail;
        page.Command3_Click();
        ASSERT_EQ(::setrlimit(RLIMIT_FSIZE, &before), 0);

        ASSERT_FALSE(machine.dialogs.messages.isEmpty());
        EXPECT_TRUE(machine.dialogs.messages[0].contains(u"C:\\2000lumora\\!!000\\"_s))
            << machine.dialogs.messages[0].toStdString();
        const QStringList made = printFiles();
        EXPECT_FALSE(made.isEmpty());
        EXPECT_LT(made.size(), pictures);
        EXPECT_EQ(made.size() + failed.count(), pictures) << "each picture is printed or named as failed";
        for (const QString& name : made)
            EXPECT_TRUE(unpacked(name)) << name.toStdString();
        for (int i = 0; i < pictures; ++i)
            EXPECT_TRUE(machine.files.fileExists(DrivePath(u"C:\\pics\\pic%1.jpg"_s.arg(i))));
    }
}

} // namespace
} // namespace lumora
