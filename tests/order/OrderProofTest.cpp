#include "order/ArrivalProof.h"
#include "order/LineEnds.h"
#include "order/OrderCompleteness.h"
#include "order/OrderFolder.h"
#include "order/OrderLog.h"
#include "order/PrintFileName.h"
#include "support/ExampleOrder.h"
#include "support/Take.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

// "a.jpp=9 b": names with a length in bytes, or without one.
QList<RemoteFile> filesOf(const char* text) {
    QList<RemoteFile> files;
    for (const QString& file : QString::fromLatin1(text).split(u' ', Qt::SkipEmptyParts)) {
        const auto equals = file.indexOf(u'=');
        files += equals < 0 ? RemoteFile{file, {}} : RemoteFile{file.left(equals), file.mid(equals + 1).toLongLong()};
    }
    return files;
}

TEST(AnArrival, isProvenByEachNameAndEachLength) {
    constexpr auto exact = ArrivalProof::Names::Exact;
    constexpr auto anyCase = ArrivalProof::Names::WithoutCase;
    const char* const two = "a.txt=10 B.jpp=900";
    const struct {
        const char* what;
        const char* here;
        const char* there;
        ArrivalProof::Names names;
        const char* found; // missing | broken | by length | by name | common
    } cases[] = {
        {"whole", two, "B.jpp=900 a.txt=10", exact, "||a.txt,B.jpp||"},
        {"another customer's names beside", two, "a.txt=10 x=1 B.jpp=900 ..", exact, "||a.txt,B.jpp||"},
        {"count equal, a name missing", two, "a.txt=10 b.jpp=900", exact, "B.jpp||a.txt||"},
        {"letter case of a web server", two, "A.TXT=10 b.jpp", anyCase, "||a.txt|B.jpp|"},
        {"a part of a name", two, "a . B.jpp.part=900", anyCase, "a.txt,B.jpp||||"},
        {"cut short and emptied", two, "a.txt=0 B.jpp=899", exact, "|a.txt,B.jpp|||"},
        {"longer", two, "a.txt=11 B.jpp=900", exact, "|a.txt|B.jpp||"},
        {"no length told", two, "a.txt B.jpp", exact, "|||a.txt,B.jpp|"},
        {"the proof picture of another order", "000.jpg=5", "000.jpg=7", exact, "||||000.jpg"},
        {"no proof picture", "000.jpg=5", "", exact, "000.jpg||||"},
        {"both letter cases there, ours is cut", "a.jpp=9", "A.jpp=9 a.jpp=4", anyCase, "|a.jpp|||"},
        {"a name told twice, once with its length", "a.jpp=9", "a.jpp a.jpp=8", exact, "|a.jpp|||"},
        {"cut and sent again under another letter case", "a.jpp=9", "A.jpp=4 A.JPP=9", anyCase, "||a.jpp||"},
        {"no length told of one alone", "A.jpp=9 B.jpp=9", "A.jpp=9 B.jpp", exact, "B.jpp||A.jpp||"},
        {"a file of the order twice", "a=1 a=1", "a=1", exact, "||a||"},
        {"an empty file and an empty server", "a=0", "", exact, "a||||"},
        {"an empty file that arrived", "a=0", "a=0", exact, "||a||"},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.what);
        QList<LocalFile> here;
        for (const RemoteFile& file : filesOf(c.here))
            here += {file.name, *file.length};
        const ArrivalProof proof = ArrivalProof::of(here, filesOf(c.there), c.names);
        QStringList found;
        for (const QStringList& list : {proof.missing, proof.broken, proof.byLength, proof.byName, proof.commonName})
            found += list.join(u',');
        EXPECT_EQ(found.join(u'|').toStdString(), c.found);
        EXPECT_EQ(proof.proven(), found[0].isEmpty() && found[1].isEmpty());
        EXPECT_EQ(proof.provenByNameOnly(), proof.proven() && !found[3].isEmpty());
    }
}

TEST(LineEnds, tellAServerThatChangesFilesFromOneThatCutsThem) {
    // 4 pairs, a CR alone, 3 LF alone.
    const QByteArray bytes = QByteArray(88, 'x') + "\r\n\r\n\r\n\r\r\n\n\n\n";
    LineEnds ends;
    ends.add(QByteArrayView(bytes).first(93)); // a pair that is cut by the parts that are read
    ends.add(QByteArrayView(bytes).sliced(93));
    EXPECT_EQ(ends.cr, 5);
    EXPECT_EQ(ends.crlf, 4);
    EXPECT_EQ(ends.lf, 7);
    EXPECT_EQ(ends.changes(), (std::array<qint64, 4>{-5, -4, 7, 3}));

    TestPlatform test;
    const QByteArray large = QByteArray(65535, 'x') + "\r\n\r";
    ASSERT_TRUE(test.files.writeWhole(u"C:\\large"_path, large));
    const LineEnds read = take(LineEndsOf(test.files, u"C:\\large"_path));
    EXPECT_TRUE(read.cr == 2 && read.lf == 1 && read.crlf == 1);
    EXPECT_FALSE(LineEndsOf(test.files, u"C:\\none"_path));
}

// An order of so many pictures, of which some failed and one has a name that no print file can have.
OrderLog logOf(OrderLog::Layout layout, int pictures, int failed) {
    OrderLog log;
    log.layout = layout;
    log.Hazmana = u"2026_11_21_KUP_1234^105"_s;
    const QString code = u"1 1015GNB"_s + (layout == OrderLog::Layout::Edited ? QString(200, u' ') : QString());
    for (int i = 0; i < pictures; ++i) {
        log.items += code + u"C:\\p\\pic%1.jpg"_s.arg(i);
        if (i < failed)
            log.failed += u"C:\\p\\pic%1.jpg"_s.arg(i);
    }
    log.items += code + u"C:\\p\\.jpg"_s;
    return log;
}

QString printName(int index) {
    return PrintFileName{u"1 1015GNB"_s, index, 1, u"pic%1"_s.arg(index)}.text();
}

QString piece(int index, const char* tail) {
    return printName(index).chopped(4) + u"_jpp_"_s + QString::fromLatin1(tail) + u".prk"_s;
}

TEST(AnOrder, isWholeWhenEveryPrintOfItsLogIsThereAndMarked) {
    using Verdict = OrderCompleteness::Verdict;
    using Layout = OrderLog::Layout;
    const QStringList three = {printName(0), printName(1), printName(2)};
    const QStringList besides = {u"!105_1234.jpp"_s, u"2026_11_21_KUP_1234^105.txt"_s, u"000.jpg"_s, u"kashloo.txt"_s};
    const QStringList pieces = three.mid(0, 2) << piece(2, "001_003") << piece(2, "002_003") << piece(2, "003_003");
    struct Case {
        const char* what;
        int failed;
        QStringList present;
        QStringList marked;
        Verdict verdict;
    };
    const Case cases[] = {
        {"whole", 0, three + besides, three + besides, Verdict::Whole},
        {"a failed picture has no print", 1, three.mid(1) + besides, three.mid(1), Verdict::Whole},
        {"all failed", 3, besides, besides, Verdict::None},
        {"sheet and text alone are marked", 0, three + besides, besides, Verdict::None},
        {"the choice was cancelled", 0, three, {}, Verdict::None},
        {"the prints were cleaned away", 0, besides, three, Verdict::None},
        {"one is not marked", 0, three, three.mid(1), Verdict::Fewer},
        {"one is lost", 0, three.mid(1), three, Verdict::Fewer},
        {"pieces in place of a print", 0, pieces, pieces, Verdict::Whole},
        {"a piece is not marked", 0, pieces, pieces.mid(0, 3) << pieces.last(), Verdict::Fewer},
    };
    for (const Layout layout : {Layout::Plain, Layout::Edited, Layout::Album}) {
        for (const Case& c : cases) {
            OrderLog log; // as a reader finds it
            log.read(logOf(layout, 3, c.failed).write());
            const OrderCompleteness counts = OrderCompleteness::of(&log, c.present, c.marked);
            EXPECT_EQ(counts.named, 3 - c.failed) << c.what;
            EXPECT_EQ(counts.verdict(), c.verdict) << c.what << ": " << counts.present << " " << counts.marked;
        }
    }
    EXPECT_EQ(OrderCompleteness::of(nullptr, three, three).verdict(), Verdict::Unknown);
    EXPECT_EQ(OrderCompleteness::of(nullptr, three, besides).verdict(), Verdict::None);
}

TEST(AFamilyOfPieces, isWholeWithoutAGapAndWithAllThatItsNameDeclaresLessOne) {
    const struct {
        QList<const char*> tails;
        bool whole;
    } cases[] = {
        {{"001_001"}, true},
        {{"001_002"}, true}, // an exact multiple
        {{"001_003", "002_003"}, true},
        {{"002_002"}, false},
        {{"001_003", "003_003"}, false},
        {{"001_004", "002_004"}, false},
        {{"001_003", "002_004"}, false}, // of two families
        {{"000_001"}, false},
        {{"00x_001"}, false},
    };
    for (const auto& [tails, whole] : cases) {
        QStringList names;
        for (const char* tail : tails)
            names += piece(0, tail);
        EXPECT_EQ(PrintsAmong(names), whole ? QStringList(printName(0)) : QStringList())
            << names.join(u' ').toStdString();
    }
    EXPECT_EQ(PrintsAmong({printName(0), piece(0, "001_001"), printName(0)}).size(), 1) << "one print in two forms";
    EXPECT_TRUE(PrintsAmong({u"!105_1234_jpp_001_001.prk"_s, u"_001_001.prk"_s, u".prk"_s}).isEmpty());
}

TEST(AnOrderNumber, belongsToTheFirstThatMakesItsFolder) {
    TestPlatform test;
    SessionState one = exampleOrder();
    one.DiskRoot = u"C:\\"_path;
    SessionState two = one;
    const OrderFolder first = take(claimOrderFolder(one, test.files, OrderFolder::Ending::Plain));
    const OrderFolder second = take(claimOrderFolder(two, test.files, OrderFolder::Ending::BySession));
    EXPECT_EQ(one.MisparHazmana + two.MisparHazmana, u"105106"_s);
    EXPECT_NE(first.path(), second.path());

    // An unfinished order of yesterday, in pieces, has the next number; a finished one of yesterday has none to keep.
    const DrivePath orders = u"C:\\2000lumora\\!!000"_path;
    ASSERT_TRUE(test.files.makeFolder(orders / u"2026_11_20_KUP_1234^107P"));
    const OrderFolder finished(orders / u"2026_11_20_KUP_1234^108");
    ASSERT_TRUE(test.files.makeFolder(finished.path()));
    ASSERT_TRUE(test.files.writeWhole(finished.logPath(), "x"));
    ASSERT_TRUE(claimOrderFolder(one, test.files, OrderFolder::Ending::Plain));
    EXPECT_EQ(one.MisparHazmana, u"108"_s);

    ASSERT_TRUE(test.files.writeWhole(u"C:\\blocked"_path, "x"));
    one.DiskRoot = u"C:\\blocked\\"_path;
    EXPECT_FALSE(claimOrderFolder(one, test.files, OrderFolder::Ending::Plain));
    EXPECT_EQ(one.MisparHazmana, u"108"_s);
}

} // namespace
} // namespace lumora
