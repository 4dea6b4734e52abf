#include "order/EditRecord.h"
#include "selection/Basket.h"
#include "selection/CardWords.h"
#include "selection/CopiesEntry.h"
#include "selection/FolderPager.h"
#include "selection/OrderSpace.h"
#include "selection/PictureChoice.h"
#include "selection/PlaceNames.h"
#include "selection/PrintQuality.h"
#include "session/SessionState.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

const QString path = u"C:\\pics\\תמונה.jpg"_s;

QString plainLine(int copies, const QString& of) {
    return BasketLine{PrintCode{copies, u"1015"_s, u'G', u"NB"_s}.compose(), {}, DrivePath(of)}.compose(
        LineForm::Short);
}

TEST(ABasket, findsTheFirstLineOfAPathAfterEachKindOfChange) {
    for (const LineForm form : {LineForm::Short, LineForm::Full}) {
        Basket basket;
        basket.setForm(form);
        const auto add = [&](int copies, const QString& of) {
            basket.append(BasketLine{PrintCode{copies, u"1015"_s, u'G', u"NB"_s}.compose(), EditRecord::newPicture(),
                                     DrivePath(of)}
                              .compose(form));
        };
        const auto find = [&](const char* of) { return basket.FindByPath(QString::fromLatin1(of)); };
        add(1, u"C:\\a.jpg"_s);
        add(2, u"C:\\b.jpg"_s);
        add(3, u"C:\\a.jpg"_s);
        EXPECT_EQ(find("C:\\a.jpg"), 0);
        EXPECT_EQ(find("C:\\c.jpg"), -1);
        basket.removeAt(0);
        EXPECT_EQ(find("C:\\a.jpg"), 1);
        EXPECT_EQ(find("C:\\b.jpg"), 0);
        basket.replaceAt(0, QString(basket.item(1)).replace(u"a.jpg"_s, u"c.jpg"_s));
        EXPECT_EQ(find("C:\\b.jpg"), -1);
        EXPECT_EQ(find("C:\\c.jpg"), 0);
        EXPECT_EQ(basket.SumCopies(), 6);
        basket.clear();
        EXPECT_EQ(find("C:\\a.jpg"), -1);
        EXPECT_EQ(basket.SumCopies(), 0);
    }
}

TEST(ABasket, stopsItsSearchAtALineThatIsTooShort) {
    Basket basket;
    basket.append(plainLine(1, u"C:\\a.jpg"_s));
    basket.append(u"1 1015GNBC:"_s);
    basket.append(plainLine(1, u"C:\\b.jpg"_s));
    EXPECT_EQ(basket.FindByPath(u"C:\\a.jpg"_s), 0);
    EXPECT_EQ(basket.FindByPath(u"C:\\b.jpg"_s), -1);
    basket.removeAt(1);
    EXPECT_EQ(basket.FindByPath(u"C:\\b.jpg"_s), 1);
}

QStringList names(int count) {
    QStringList list;
    for (int i = 1; i <= count; ++i)
        list += u"%1.jpg"_s.arg(i, 2, 10, QLatin1Char('0'));
    return list;
}

TEST(AFolderPager, beginsBehindASecondFolderWithTheLastPictureOfTheFirst) {
    FolderPager pager;
    pager.addFolder(u"C:\\p"_path, names(3));
    pager.FillPageList();
    pager.addFolder(u"C:\\q"_path, names(5));
    EXPECT_EQ(pager.FillPageList(), QStringList(u"C:\\p\\03.jpg"_s) + pager.paths().items().mid(3));
}

TEST(AFolderPager, doublesAnOrdinaryFolderButNoDriveRoot) {
    FolderPager pager;
    pager.addFolder(u"C:\\p"_path, {u"a01.jpg"_s});
    const struct {
        DrivePath folder;
        int added;
    } cases[] = {{u"C:\\p\\a"_path, 4}, {u"C:\\p\\a"_path, 4}, {u"E:\\"_path, 4}, {u"E:\\"_path, 0}};
    for (const auto& c : cases) {
        const int position = pager.currentIndex();
        EXPECT_EQ(pager.addFolder(c.folder, names(4)), c.added) << c.folder.text().toStdString();
        EXPECT_TRUE(c.added > 0 || pager.currentIndex() == position);
    }
    EXPECT_EQ(pager.item(9), u"E:\\01.jpg"_s);
}

// Fourteen pictures, the first twelve of them in the cells.
struct Choosing {
    explicit Choosing(LineForm form = LineForm::Short) {
        order.ppr = u"10/15"_s;
        order.maat = u"מבריק"_s;
        order.Bord = u"NB"_s;
        choice.setForm(form);
        choice.addFolder(u"C:\\p"_path, names(14));
        choice.nextPage();
    }
    QStringList lines() const { return choice.basket().lines().items(); }

    SessionState state;
    OrderDetails& order = state.shemot;
    PictureChoice choice{state};
};

TEST(AChoice, keepsCopiesAndPlaceOfAPictureThatIsChosenAgain) {
    Choosing at;
    at.choice.choose(2, {});
    at.choice.choose(0, {});
    at.choice.setCopies(2, 12);
    at.order.ppr = u"13/18"_s;
    EXPECT_EQ(at.lines(), QStringList({u"121015GNBC:\\p\\03.jpg"_s, u"1 1015GNBC:\\p\\01.jpg"_s}));
    at.choice.choose(2, {});
    EXPECT_EQ(at.lines().first(), u"121318GNBC:\\p\\03.jpg"_s);
    at.choice.setCopies(2, 100);
    EXPECT_EQ(at.lines().first(), u"991318GNBC:\\p\\03.jpg"_s);
    at.choice.setCopies(2, 0);
    EXPECT_EQ(at.lines(), QStringList(u"1 1015GNBC:\\p\\01.jpg"_s));
    at.choice.choose(2, {});
    EXPECT_EQ(at.choice.copies(2), 1);
}

TEST(AChoice, ofAPictureThatStandsInTwoCellsIsOneChoice) {
    Choosing at(LineForm::Full);
    at.choice.clear();
    for (int i = 0; i < 2; ++i)
        at.choice.addFolder(u"C:\\q"_path, names(1));
    at.choice.nextPage();
    const QString edited = QString(EditRecord::newPicture()).replace(15, 3, u"130"_s);
    EXPECT_EQ(at.choice.storeRecord(u"C:\\q\\01.jpg"_s, edited), -1);
    at.choice.choose(0, EditRecord::newPicture());
    at.choice.setCopies(0, 5);
    EXPECT_EQ(at.choice.storeRecord(u"C:\\q\\01.jpg"_s, edited), 0);
    EXPECT_EQ(at.lines(), QStringList(u"5 1015GNB"_s + edited + u"C:\\q\\01.jpg"_s));
    EXPECT_EQ(at.choice.recordOf(u"C:\\q\\01.jpg"_s), edited);
    EXPECT_EQ(at.choice.copies(1), 5);
    at.choice.setCopies(1, 0);
    EXPECT_TRUE(at.lines().isEmpty() && !at.choice.chosen(0));
    at.choice.setCopies(1, 2);
    EXPECT_EQ(at.lines(), QStringList(u"2 1015GNB"_s + EditRecord::newPicture() + u"C:\\q\\01.jpg"_s));
    EXPECT_TRUE(at.choice.chosen(0));
}

TEST(AChoice, ofAnotherPaperKeepsWhatIsSeenWhereItIs) {
    const auto record = [](int panX, int panY, int textY, const QString& frame) {
        EditFields edit;
        UnpackEditState(EditRecord::newPicture(), edit);
        edit.PanX = static_cast<std::int16_t>(panX);
        edit.PanY = static_cast<std::int16_t>(panY);
        edit.TextX = 40;
        edit.TextY = static_cast<std::int16_t>(textY);
        edit.FrameName = frame;
        PackEditState(edit, u"NB"_s, {});
        return edit.EditState;
    };
    const struct {
        const char* what;
        std::optional<PictureSize> picture;
        QString ppr;
        QString before; // border
        QString now;
        QString record;
        QString after;
    } cases[] = {
        // The box of 10/15 is 450 by 300, or 300 by 450; that of 20/20 has equal sides.
        {"lying", PictureSize{40, 30}, u"20/20"_s, u"NB"_s, u"NB"_s, record(225, 150, 100, u"000"_s),
         record(225, 225, 150, u"000"_s)},
        {"upright", PictureSize{30, 40}, u"20/20"_s, u"NB"_s, u"NB"_s, record(-10, 225, -90, u"A1"_s),
         record(-10, 150, -60, u"A1"_s)},
        {"at the ends", PictureSize{40, 30}, u"20/20"_s, u"NB"_s, u"NB"_s, record(0, 700, 900, u"000"_s),
         record(0, 780, 999, u"000"_s)},
        {"can't be read", std::nullopt, u"20/20"_s, u"NB"_s, u"NB"_s, record(225, 150, 100, u"000"_s),
         record(225, 150, 100, u"000"_s)},
        {"frame of the border", PictureSize{40, 30}, u"10/15"_s, u"WB"_s, u"NB"_s, record(5, 5, 5, u"001"_s),
         record(5, 5, 5, u"000"_s)},
        {"no edits", PictureSize{40, 30}, u"20/20"_s, u"WB"_s, u"NB"_s, EditRecord::newPicture(),
         EditRecord::newPicture()},
    };
    for (const auto& each : cases) {
        Choosing at(LineForm::Full);
        at.order.Bord = each.before;
        at.choice.choose(0, each.record);
        at.choice.setCopies(0, 7);
        const OrderDetails before = at.order;
        at.order.ppr = each.ppr;
        at.order.maat = u"Matte"_s;
        at.order.Bord = each.now;
        at.choice.changePaper(before, [&](const QString&) { return each.picture; });
        const QString code = u"7 "_s + QString(each.ppr).remove(u'/') + u'M' + each.now;
        EXPECT_EQ(at.lines(), QStringList(code + each.after + u"C:\\p\\01.jpg"_s)) << each.what;
        EXPECT_EQ(at.choice.copies(0), 7);
    }
}

TEST(AChoice, ofTheWholeFolderKeepsCopiesAndKnowsTheEnglishWordsCarefully) {
    struct Case {
        bool careful;
        int copies;
        QString first, last;
    };
    for (const Case& c : {Case{false, 14, u"1 1015GNBC:\\p\\04.jpg"_s, u"1 1015GNBC:\\p\\14.jpg"_s},
                          Case{true, 20, u"7 1015MNBC:\\p\\04.jpg"_s, u"1 1015MNBC:\\p\\14.jpg"_s}}) {
        Choosing at;
        at.state.Careful = c.careful;
        at.choice.choose(3, {});
        at.choice.setCopies(3, 7);
        at.order.maat = u"Matte"_s;
        at.choice.chooseAll();
        EXPECT_EQ(at.lines().size(), 14);
        EXPECT_EQ(at.choice.basket().SumCopies(), c.copies);
        EXPECT_EQ(at.lines().first() + at.lines().last(), c.first + c.last) << "built in the letter before";
    }
}

// n next, p previous, c the chosen alone, a one picture alone, x nothing chosen behind the fifth; then the first
// picture and the number of pictures of the page.
TEST(AChoice, carefullyShowsThePagesThatWereSeen) {
    const struct {
        bool careful;
        const char* presses;
        QString first;
        int count;
    } cases[] = {{false, "nnn", u"40"_s, 1},   {true, "nnn", u"37"_s, 4},    {false, "nnp", u"16"_s, 12},
                 {true, "nnp", u"25"_s, 12},   {true, "nnpp", u"13"_s, 12},  {true, "pp", u"01"_s, 12},
                 {false, "ccc", u"14"_s, 1},   {true, "cc", u"13"_s, 2},     {true, "ccc", u"01"_s, 12},
                 {true, "cccp", u"13"_s, 12},  {true, "ccp", u"01"_s, 12},   {true, "ncp", u"25"_s, 12},
                 {true, "cnp", u"01"_s, 12},   {true, "na", u"07"_s, 1},     {true, "nap", u"25"_s, 12},
                 {true, "naapp", u"13"_s, 12}, {true, "ccnxpp", u"13"_s, 12}};
    const auto keepFive = [](PictureChoice& choice) {
        while (choice.basket().count() > 5)
            choice.remove(BasketLine::split(choice.basket().lines().items().back(), LineForm::Short).path.text());
    };
    for (const auto& c : cases) {
        Choosing at;
        at.state.Careful = c.careful;
        at.choice.clear();
        at.choice.addFolder(u"C:\\p"_path, names(40));
        at.choice.nextPage();
        for (int page = 0; page < 2; ++page) {
            for (int cell = 0; cell < (page == 0 ? 12 : 2); ++cell)
                at.choice.choose(cell, {});
            at.choice.nextPage();
        }
        at.choice.previousPage();
        for (const char press : std::string_view(c.presses))
            press == 'n'   ? at.choice.nextPage()
            : press == 'p' ? at.choice.previousPage()
            : press == 'x' ? keepFive(at.choice)
            : press == 'a' ? at.choice.showAlone({u"C:\\p\\07.jpg"_s})
                           : at.choice.chosenPage();
        EXPECT_EQ(at.choice.path(0), u"C:\\p\\"_s + c.first + u".jpg"_s) << c.careful << c.presses;
        EXPECT_EQ(at.choice.page().count(), c.count) << c.careful << c.presses;
        EXPECT_EQ(at.choice.hasNextPage(), !c.careful || at.choice.path(c.count - 1) != u"C:\\p\\40.jpg"_s);
        const auto range = at.choice.range();
        EXPECT_EQ(range ? range->start + 1 : 7, c.first.toInt()) << c.careful << c.presses;
        EXPECT_EQ(range ? range->count : 1, c.count) << c.careful << c.presses;
        const int all = range && range->of == SeenPages::Of::Folders ? 40 : at.choice.basket().count();
        EXPECT_EQ(range ? range->all : all, all) << c.careful << c.presses;
        const bool hasPrevious = at.choice.hasPreviousPage();
        at.choice.previousPage();
        EXPECT_EQ(hasPrevious, at.choice.path(0) != u"C:\\p\\"_s + c.first + u".jpg"_s) << c.careful << c.presses;
    }
}

TEST(Copies, areTypedOnDigitsUpTo99AndGoWith0) {
    const struct {
        int before;
        QString keys, shown; // < takes back
    } cases[] = {{1, u""_s, u"1"_s},     {1, u"7"_s, u"7"_s}, {3, u"12"_s, u"12"_s}, {3, u"123"_s, u"12"_s},
                 {1, u"99"_s, u"99"_s},  {5, u"0"_s, u"0"_s}, {5, u"07"_s, u"7"_s},  {12, u"<"_s, u"1"_s},
                 {12, u"<5"_s, u"15"_s}, {5, u"<"_s, u""_s},  {5, u"<<8"_s, u"8"_s}};
    for (const auto& one : cases) {
        CopiesEntry entry;
        entry.begin(one.before);
        for (const QChar key : one.keys)
            key == u'<' ? entry.takeBack() : entry.type(key.digitValue());
        EXPECT_EQ(entry.text(), one.shown) << qPrintable(one.keys);
        EXPECT_EQ(entry.copies(), one.shown.isEmpty() ? std::nullopt : std::optional(one.shown.toInt()));
        EXPECT_EQ(entry.removes(), one.shown == u"0"_s);
    }
}

TEST(APrintGrade, goesByThePixelCountAlone) {
    struct Case {
        PictureSize size;
        PrintGrade grade;
        QString text;
    };
    for (const Case& c :
         {Case{{1600, 1200}, PrintGrade::Good, u"  איכות  1200 / 1600"_s}, Case{{1000, 800}, PrintGrade::Unmarked, {}},
          Case{{799999, 1}, PrintGrade::Borderline, u"  איכות גבולית  1 / 799999"_s},
          Case{{500, 800}, PrintGrade::Borderline, u"  איכות גבולית  800 / 500"_s},
          Case{{1, 399999}, PrintGrade::VeryLow, u"  איכות נמוכה מאוד  399999 / 1"_s},
          Case{{65500, 65500}, PrintGrade::Good, u"  איכות  65500 / 65500"_s}}) {
        EXPECT_EQ(printGrade(c.size), c.grade);
        EXPECT_EQ(printGradeText(c.grade, c.size, false), c.text);
    }
}

TEST(ACard, isOfferedInTheWordsOfItsLanguage) {
    using enum Medium::Kind;
    const QDate today(2026, 11, 21);
    const struct {
        Medium::Kind kind;
        std::optional<CardSummary> card;
        QString english;
        QString hebrew;
    } cases[] = {
        {SdCard, CardSummary{true, 214, false, today, {}, {}}, u"SD card: 214 pictures · newest today"_s,
         u"כרטיס SD: 214 תמונות · החדשה מהיום"_s},
        {Stick, CardSummary{true, 1, false, today.addDays(-1), {}, {}}, u"USB stick: 1 picture · newest yesterday"_s,
         u"התקן USB: תמונה אחת · החדשה מאתמול"_s},
        {Other, CardSummary{true, 9, true, today.addDays(-2), {}, {}},
         u"EOS: more than 9 pictures · newest 19.11.2026"_s, u"EOS: יותר מ-9 תמונות · החדשה מ-19.11.2026"_s},
        {Card, CardSummary{true, 0, false, {}, {}, {}}, u"Memory card: no pictures"_s, u"כרטיס זיכרון: אין תמונות"_s},
        {Card, CardSummary(), u"Memory card: can't be read"_s, u"כרטיס זיכרון: לא ניתן לקריאה"_s},
        {Card, {}, u"Memory card: counting the pictures…"_s, u"כרטיס זיכרון: סופר את התמונות…"_s},
    };
    for (const auto& [kind, card, english, hebrew] : cases) {
        for (const bool inEnglish : {true, false}) {
            const CardWords words = cardWords({{{}, kind, u"EOS"_s, {}}, card}, today, inEnglish);
            EXPECT_EQ(words.head + u": "_s + words.note, inEnglish ? english : hebrew);
            EXPECT_EQ(words.opens, card && card->pictures > 0);
        }
    }
}

TEST(APlace, isToldFromAnotherOfItsKind) {
    using enum Medium::Kind;
    const std::vector<Cards::Card> cards = {{{{}, Stick, u"TOM"_s, "/m/a"}, {}}, {{{}, Stick, {}, "/m/b"}, {}}};
    const std::vector<Place> places = {
        {u"This computer"_s, {}, "/"}, placeOf("/m/a", cards, true), placeOf("/m/b", cards, true)};
    EXPECT_EQ(whereIs("/m/a/DCIM", places), u"USB stick · \u2068TOM\u2069 \u203A \u2068DCIM\u2069"_s);
    EXPECT_EQ(whereIs("/m/b", places), u"USB stick · \u2068b\u2069"_s);
    EXPECT_EQ(whereIs("/m/bc", places), u"This computer \u203A \u2068m\u2069 \u203A \u2068bc\u2069"_s);
}

TEST(OrderSpace, IsReckonedByPaperOrPictureAndToldInFigures) {
    PageRig rig;
    rig.write(u"C:\\large.jpg"_path, "x");
    std::filesystem::resize_file(rig.host(u"C:\\large.jpg"_s), 90000000);
    SessionState state;
    state.Optint = OrderKind::Print;
    const auto needed = [&](const QString& line) {
        return OrderSpace::neededFor({line, line}, state, rig.machine.files) -
               OrderSpace::neededFor({line}, state, rig.machine.files);
    };
    EXPECT_EQ(needed(u"1 1015GNBC:\\large.jpg"_s), 90000000);
    EXPECT_NEAR(needed(u"1 3045GNBC:\\gone.jpg"_s), 9 * needed(u"1 1015GNBC:\\gone.jpg"_s), 9);
    EXPECT_FALSE(OrderSpace::words(state, 1000, 1000));
    EXPECT_TRUE(OrderSpace::words(state, 240000001, 80999999)->contains(u"241"_s));
}

} // namespace
} // namespace lumora
