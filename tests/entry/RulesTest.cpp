#include "entry/details/DetailStore.h"
#include "entry/details/DetailsCheck.h"
#include "entry/details/TileMenu.h"
#include "entry/details/VolumeMark.h"

#include "common/FixedText.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

TEST(TileMenuTest, ShowsTheTilesOfEachKindOfClient) {
    const struct {
        QString letter;
        std::int16_t tmunatPaar;
        std::int16_t minuyPaar;
        QString tiles; // a digit for each tile that is there
    } cases[] = {
        {"B", 0, 1, "023458"},    {"C", 0, 1, "02458"},    {"D", 0, 1, "0258"},      {"CL", 0, 1, "024568"},
        {"AL", 0, 1, "0124568"},  {"AS", 0, 1, "0124589"}, {"ALL", 0, 1, "0123458"}, {"", 0, 1, "0123458"},
        {"AL", 1, 1, "01245678"}, {"AL", 0, 2, "024568"},  {"AS", 1, 2, "0245789"},
    };
    SessionState state;
    for (const auto& c : cases) {
        state.profile.ClientLetter = c.letter;
        state.TmunatPaar = c.tmunatPaar;
        state.MinuyPaar = c.minuyPaar;
        for (const bool careful : {false, true}) {
            state.Careful = careful;
            QString shown;
            const auto tiles = visibleTiles(state);
            for (std::size_t i = 0; i < tiles.size(); ++i) {
                if (tiles[i])
                    shown += QString::number(i);
            }
            EXPECT_EQ(shown, careful ? QString(c.tiles).remove(u'3') : c.tiles) << c.letter.toStdString();
        }
    }
}

TEST(VolumeMarkTest, TakesTheLastFourCharactersOfTheSerial) {
    EXPECT_EQ(volumeMark(u"-987651234"_s) + volumeMark(u"-12"_s), u"1234-12");
}

TEST(DetailsCheckTest, FindsTheFirstFaultInTheOrderOfThePage) {
    using Place = DetailsProblem::Place;
    SessionState good;
    takeDetails(good.shemot, u" Dana Levi "_s, u" call me "_s, QString());
    good.shemot.ppr = u"10/15"_s;
    good.shemot.maat = u"מט"_s;
    good.shemot.Bord = u"NB"_s;
    EXPECT_EQ(good.shemot.n1 + u',' + good.shemot.n2, u"Dana Levi,call me");
    EXPECT_FALSE(CheckDetails(good)) << "a telephone with letters passes";

    const std::pair<std::function<void(OrderDetails&)>, Place> cases[] = {
        {[](OrderDetails& d) { d = {}; }, Place::Name},
        {[](OrderDetails& d) { d.n2.clear(), d.ppr = notChosen; }, Place::Telephone},
        {[](OrderDetails& d) { d.ppr = d.maat = notChosen; }, Place::Size},
        {[](OrderDetails& d) { d.maat = notChosen, d.Bord.clear(); }, Place::Kind},
        {[](OrderDetails& d) { d.Bord.clear(); }, Place::Border},
    };
    for (const auto& [spoil, place] : cases) {
        SessionState state = good;
        spoil(state.shemot);
        ASSERT_TRUE(CheckDetails(state));
        EXPECT_EQ(CheckDetails(state)->place, place);
    }
    good.MishloachHabaita = true;
    ASSERT_TRUE(CheckDetails(good));
    EXPECT_EQ(CheckDetails(good)->place, Place::Address);
}

class DetailStoreTest : public ::testing::Test, protected PageRig {
protected:
    DetailStoreTest() { EXPECT_TRUE(Workspace(state, machine.files).MakeWorkspace().ok()); }
    DetailStore store{state, machine.files};
};

TEST_F(DetailStoreTest, KeepsNameAndTelephoneInFiveLines) {
    EXPECT_FALSE(*store.details());
    ASSERT_TRUE(store.SaveDetails({u"דנה \"לוי"_s, u"03-1"_s}).ok());
    EXPECT_EQ(take(machine.files.read(u"C:\\2000lumora\\pratim.txt"_path)),
              "0\r\n\"\xE3\xF0\xE4 \"\xEC\xE5\xE9\"\r\n\"03-1\"\r\n0\r\n0\r\n");
    EXPECT_EQ((**store.details()).name, u"דנה \"לוי");
    for (int again = 0; again < 2; ++again)
        EXPECT_TRUE(store.forgetDetails().ok() && !*store.details());
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
        const auto read = take(store.details());
        ASSERT_EQ(read.has_value(), c.found) << c.stored.toStdString();
        if (c.found) {
            EXPECT_EQ(read->name, c.name) << c.stored.toStdString();
            EXPECT_EQ(read->telephone, c.telephone);
        }
    }
}

TEST_F(DetailStoreTest, AnAlbumFieldThatIsMissingMovesTheOthersUp) {
    ASSERT_TRUE(store.SaveAlbumDetails({u"Studio"_s, QString(), u"x"_s}).ok());
    EXPECT_EQ(take(machine.files.read(u"C:\\2000lumora\\pratim2.txt"_path)), "0\r\n\"Studio\"\r\n\"x\"\r\n0\r\n");
    const auto read = take(store.albumDetails());
    ASSERT_TRUE(read);
    EXPECT_EQ(read->name, u"Studio");
    EXPECT_TRUE(read->telephone.isEmpty()) << "one character is too short to be taken";
    EXPECT_TRUE(read->mailName.isEmpty());
}

} // namespace
} // namespace lumora
