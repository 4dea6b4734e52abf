#include "order/CustomerTraces.h"

#include "order/KioskOffer.h"
#include "order/OrderFolder.h"
#include "order/OrderState.h"
#include "support/ExampleOrder.h"
#include "support/PageRig.h"

#include <gmock/gmock.h>

namespace lumora {
namespace {

struct AKioskBetweenCustomers : ::testing::Test, PageRig {
    void give(std::initializer_list<const char*> paths) {
        for (const char* path : paths) {
            const DrivePath file(u"C:\\"_s + QString::fromLatin1(path));
            makeFolder(file.folder());
            write(file, "x");
        }
    }
    std::vector<std::string> files() const {
        std::vector<std::string> found;
        const HostPath data = machine.drives.dataFolder();
        for (const auto& entry : std::filesystem::recursive_directory_iterator(data)) {
            if (entry.is_regular_file())
                found.push_back(entry.path().lexically_relative(data).string());
        }
        return found;
    }
};

TEST_F(AKioskBetweenCustomers, HasNothingOfTheOneBeforeButTheOrder) {
    state = exampleOrder();
    state.DiskRoot = machine.drives.programRoot();
    const OrderFolder order(u"C:\\2000lumora\\!!000\\2026_11_21_KUP_1234^105"_path);
    makeFolder(order.path());
    OrderState preparing;
    preparing.items = {u"1 1015GNBC:\\2000lumora\\zmany\\door\\aaaaaaaaaaaa\\0\\needed.jpg"_s};
    EXPECT_TRUE(WriteOrderState(machine.files, order, preparing));
    give({"2000lumora\\zmany\\door\\aaaaaaaaaaaa\\0\\needed.jpg", "2000lumora\\misgarot\\a\\k1.bmp",
          "2000lumora\\!!000\\mana.txt", "2000lumora\\client.txt", "vedron\\mispar.txt"});
    const std::vector<std::string> stays = files();
    give({"2000lumora\\0.bmp", "2000lumora\\bw.bmp", "2000lumora\\000.jpg", "2000lumora\\001.jpg",
          "2000lumora\\filelisthom2.txt", "2000lumora\\pratim.txt", "2000lumora\\pratim2.txt",
          "2000lumora\\pratim3.txt", "2000lumora\\Tik4txt\\all_list.txt", "2000lumora\\Tik4txt\\07onepic.txt",
          "2000lumora\\zmany\\any.ending", "2000lumora\\zmany\\ktanim\\C;]a.bmp", "2000lumora\\zmany\\tempred\\000.bmp",
          "2000lumora\\zmany\\job_folder\\red_folder\\deep\\a.tif", "2000lumora\\zmany\\door\\bbbbbbbbbbbb\\0\\a.jpg",
          "2000lumora\\!!000\\^^^.jpg", "2000lumora\\!!000\\111.jpg"});
    state.staff = true;
    state.EnglishTips = 1;
    state.handOver.kept.number = u"104"_s;
    machine.shell.clipboard = u"105"_s;

    ASSERT_TRUE(CustomerTraces(state, machine.platform).clear());
    EXPECT_THAT(files(), ::testing::UnorderedElementsAreArray(stays));
    EXPECT_TRUE(machine.shell.clipboard.isEmpty());
    EXPECT_TRUE(state.shemot.n1.isEmpty() && state.shemot.n2.isEmpty());
    EXPECT_FALSE(state.staff || state.english());
    EXPECT_EQ(state.handOver.kept.number, u"104") << "said to the one who comes";
}

TEST(AnOrderOnAKiosk, OpensByTheLastThreeDigitsOfItsTelephonesAlone) {
    const auto opens = [](const QString& customers, const QString& photographers, const QString& digits) {
        OrderState order;
        order.choices = {{u"Shemot.n2"_s, customers}, {u"TelZalam"_s, photographers}, {u"Shemot.n1"_s, u"Dana 777"_s}};
        return IsEndOfTelephone(order, digits);
    };
    EXPECT_TRUE(opens(u"052-765 4321"_s, {}, u"321"_s));
    EXPECT_TRUE(opens({}, u"03-1234567"_s, u"567"_s));
    EXPECT_FALSE(opens(u"052-7654321"_s, {}, u"210"_s));
    EXPECT_FALSE(opens(u"052-7654321"_s, {}, u"777"_s));
    EXPECT_FALSE(opens({}, {}, {}));
    EXPECT_FALSE(opens(u"12"_s, {}, u"12"_s));
}

} // namespace
} // namespace lumora
