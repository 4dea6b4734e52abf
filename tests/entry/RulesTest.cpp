#include "entry/details/DetailStore.h"
#include "entry/details/DetailsCheck.h"
#include "entry/details/TileMenu.h"
#include "entry/details/VolumeMark.h"

#include "common/FixedText.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

TEST(TileMenuTest, ShowsTheTilesOfEachKindOfClient) {
    const struct {
        QString letter;
        int tmunatPaar;
        int minuyPaar;
        QString tiles; // a digit for each tile that is there
    } cases[] = {
        {"B", 0, 1, "023458"},    {"C", 0, 1, "02458"},    {"D", 0, 1, "0258"},      {"CL", 0, 1, "024568"},
        {"AL", 0, 1, "0124568"},  {"AS", 0, 1, "0124589"}, {"ALL", 0, 1, "0123458"}, {"", 0, 1, "0123458"},
        {"AL", 1, 1, "01245678"}, {"AL", 0, 2, "024568"},  {"AS", 1, 2, "0245789"},
    };
    for (const auto& c : cases) {
        QString shown;
        const auto tiles = visibleTiles(c.letter, c.tmunatPaar, c.minuyPaar);
        for (std::size_t i = 0; i < tiles.size(); ++i) {
            if (tiles[i])
                shown += QString::number(i);
        }
        EXPECT_EQ(shown, c.tiles) << c.letter.toStdString() << c.tmunatPaar << c.minuyPaar;
    }
}

TEST(VolumeMarkTest, TakesTheLastFourCharactersOfTheSerial) {
    FixedVolume volume;
    EXPECT_EQ(volumeMark(*ReadVolumeSerial(volume, u"C:\\"_path)), u"1234");
    volume.number = -12;
    EXPECT_EQ(volumeMark(*ReadVolumeSerial(volume, u"C:\\"_path)), u"-12");
    volume.fails = true;
    EXPECT_FALSE(ReadVolumeSerial(volume, u"C:\\"_path).ok());
}

TEST(DetailsCheckTest, FindsTheFirstFaultInTheOrderOfThePage) {
    using Place = DetailsProblem::Place;
    SessionState good;
    takeDetails(good.shemot, u" Dana Levi "_s, u"call me"_s, QString());
    good.shemot.ppr = u"10/15"_s;
    good.shemot.maat = u"מט"_s;
    good.shemot.Bord = u"NB"_s;
    EXPECT_EQ(good.shemot.n1, u"Dana Levi");
    EXPECT_FALSE(CheckDetails(good)) << "a telephone with letters passes";

    const struct {
        std::function<void(OrderDetails&)> spoil;
        Place place;
        QString told;
    } cases[] = {
        {[](OrderDetails& d) { d = {}; }, Place::Name, u"First & Last Name"_s},
        {[](OrderDetails& d) { d.n2.clear(), d.ppr = notChosen; }, Place::Telephone, u"Phone"_s},
        {[](OrderDetails& d) { d.ppr = d.maat = notChosen; }, Place::Size, u"paper size"_s},
        {[](OrderDetails& d) { d.maat = notChosen, d.Bord.clear(); }, Place::Kind, u"matte or glossy"_s},
        {[](OrderDetails& d) { d.Bord.clear(); }, Place::Border, u"border"_s},
    };
    good.EnglishTips = 1;
    for (const auto& c : cases) {
        SessionState state = good;
        c.spoil(state.shemot);
        const auto problem = CheckDetails(state);
        ASSERT_TRUE(problem) << c.told.toStdString();
        EXPECT_TRUE(problem->message.contains(c.told)) << problem->message.toStdString();
        EXPECT_EQ(problem->place, c.place);
    }
    good.MishloachHabaita = true;
    ASSERT_TRUE(CheckDetails(good));
    EXPECT_EQ(CheckDetails(good)->place, Place::Address);
}

class DetailStoreTest : public ::testing::Test {
protected:
    DetailStoreTest() {
        state.DiskRoot = machine.drives.programRoot();
        EXPECT_TRUE(Workspace(state, machine.files).MakeWorkspace().ok());
    }
    TestPlatform machine;
    SessionState state;
    DetailStore store{state, machine.files};
};

TEST_F(DetailStoreTest, KeepsNameAndTelephoneInFiveLines) {
    EXPECT_FALSE(*store.details());
    ASSERT_TRUE(store.SaveDetails({u"דנה \"לוי"_s, u"03-1"_s}).ok());
    EXPECT_EQ(*machine.files.read(u"C:\\2000lumora\\pratim.txt"_path),
              "0\r\n\"\xE3\xF0\xE4 \"\xEC\xE5\xE9\"\r\n\"03-1\"\r\n0\r\n0\r\n");
    const auto read = store.details();
    ASSERT_TRUE(read.ok() && *read);
    EXPECT_EQ((*read)->name, u"דנה \"לוי");
    EXPECT_EQ((*read)->telephone, u"03-1");
    EXPECT_TRUE(store.forgetDetails().ok());
    EXPECT_FALSE(*store.details());
    EXPECT_TRUE(store.forgetDetails().ok());
}

TEST_F(DetailStoreTest, ReadsShortAndForeignStoresWithoutHarm) {
    const struct {
        QByteArray stored;
        bool found;
        QString name;
        QString telephone;
    } cases[] = {
        {"", false, {}, {}},
        {"0\r\n", false, {}, {}},
        {"0\n\"Dana\"\n", true, "Dana", ""},
        {"0\r\nD\r\n\"", true, "", ""},
        {"0\n\"Dana\"\n\"03\"\n0\n0\n", true, "Dana", "03"},
    };
    for (const auto& c : cases) {
        ASSERT_TRUE(machine.files.writeWhole(u"C:\\2000lumora\\pratim.txt"_path, c.stored).ok());
        const auto read = store.details();
        ASSERT_TRUE(read.ok());
        ASSERT_EQ(read->has_value(), c.found) << c.stored.toStdString();
        if (c.found) {
            EXPECT_EQ((*read)->name, c.name) << c.stored.toStdString();
            EXPECT_EQ((*read)->telephone, c.telephone);
        }
    }
}

TEST_F(DetailStoreTest, AnAlbumFieldThatIsMissingMovesTheOthersUp) {
    ASSERT_TRUE(store.SaveAlbumDetails({u"Studio"_s, QString(), u"x"_s}).ok());
    EXPECT_EQ(*machine.files.read(u"C:\\2000lumora\\pratim2.txt"_path), "0\r\n\"Studio\"\r\n\"x\"\r\n0\r\n");
    const auto read = store.albumDetails();
    ASSERT_TRUE(read.ok() && *read);
    EXPECT_EQ((*read)->name, u"Studio");
    EXPECT_TRUE((*read)->telephone.isEmpty()) << "one character is too short to be taken";
    EXPECT_TRUE((*read)->mailName.isEmpty());
}

} // namespace
} // namespace lumora
