#include "finished/pieces/Mod4split.h"

#include "order/PieceName.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

#include <random>
#include <tuple>

namespace lumora {
namespace {

// Every byte value, in an order of its own for each length.
QByteArray bytesOf(qsizetype length) {
    std::mt19937 random(static_cast<unsigned>(length) + 1);
    QByteArray bytes(length, Qt::Uninitialized);
    for (char& byte : bytes)
        byte = static_cast<char>(random());
    return bytes;
}

struct Mod4splitTest : ::testing::Test, PageRig {
    bool goOn = true;
    Mod4split pieces{machine.files, [this](int, int) { return goOn; }};

    Mod4splitTest() { makeFolder(u"C:\\order\\meforakim"_s); }
    static DrivePath source() { return u"C:\\order\\02a.jpp"_path; }
    static DrivePath piece(const char* numbers) {
        return u"C:\\order\\meforakim"_path / u"02a_jpp_%1.prk"_s.arg(QLatin1StringView(numbers));
    }
    static DrivePath whole() { return u"C:\\order\\meforakim\\moorkavim\\02a.jpp"_path; }
    Cut cut(const QString& segment) {
        return pieces.SplitFile(source(), segment, Mod4split::Target::Meforakim, u"jpp"_s);
    }
    QStringList cutNames() const { return machine.files.names(u"C:\\order\\meforakim"_path, {u'*'}); }
};

// Each length up to three segments, and a file of 105 pieces that no buffer holds whole.
TEST_F(Mod4splitTest, CuttingAndJoiningGivesTheSameBytesForEveryLength) {
    for (qsizetype length = 0; length <= 23; ++length) {
        if (length == 23)
            length = 40 << 20;
        const qsizetype segment = length > 22 ? 400000 : 7;
        SCOPED_TRACE(length);
        std::filesystem::remove_all(host(u"C:\\order\\meforakim"_path));
        const QByteArray bytes = bytesOf(length);
        write(source(), bytes);
        const Cut made = cut(QString::number(segment));
        ASSERT_FALSE(made.failure);
        EXPECT_EQ(made.declared, length / segment + 1);
        EXPECT_EQ(made.pieces, (length + segment - 1) / segment);
        EXPECT_EQ(cutNames().size(), made.pieces);
        EXPECT_TRUE(read(source()) == bytes);
        if (length == 0)
            continue;
        const Joined joined = pieces.MergeFamily(made.folder / cutNames().first());
        ASSERT_FALSE(joined.failure);
        EXPECT_EQ(joined.file, whole());
        EXPECT_EQ(joined.bytes, length);
        EXPECT_TRUE(read(whole()) == bytes);
    }
}

TEST_F(Mod4splitTest, AnOldPieceKeepsItsTailAndAnOldJoinedFileDoesNot) {
    makeFolder(u"C:\\order\\meforakim\\moorkavim"_path);
    write(piece("002_002"), "0123456789");
    write(whole(), QByteArray(100, 'o'));
    write(source(), "abcdefg");
    ASSERT_FALSE(cut(u"5"_s).failure);
    EXPECT_EQ(read(piece("001_002")), "abcde");
    EXPECT_EQ(read(piece("002_002")), "fg23456789");
    ASSERT_FALSE(pieces.MergeFamily(piece("001_002")).failure);
    EXPECT_EQ(read(whole()), "abcdefg23456789");
}

TEST_F(Mod4splitTest, AJoinStopsAtTheFirstGapAndTellsHowFarItCame) {
    for (const char* numbers : {"001_004", "002_004", "004_004", "003_005"})
        write(piece(numbers), numbers);
    const Joined joined = pieces.MergeFamily(piece("004_004"));
    EXPECT_FALSE(joined.failure);
    EXPECT_EQ(joined.pieces, 2);
    EXPECT_EQ(joined.declared, 4);
    EXPECT_EQ(read(whole()), "001_004002_004");
}

TEST_F(Mod4splitTest, AStopLeavesWholePiecesAndNoJoinedFile) {
    write(source(), bytesOf(100));
    int steps = 0;
    const Mod4split stopped(machine.files, [&](int, int) { return ++steps % 3 != 0; });
    const Cut made = stopped.SplitFile(source(), u"10"_s, Mod4split::Target::Meforakim, u"jpp"_s);
    EXPECT_TRUE(made.stopped);
    EXPECT_EQ(made.pieces, 2);
    EXPECT_EQ(cutNames().size(), 2);
    ASSERT_FALSE(cut(u"10"_s).failure);
    EXPECT_TRUE(stopped.MergeFamily(piece("001_011")).stopped);
    EXPECT_FALSE(machine.files.fileExists(whole()));
    EXPECT_EQ(machine.files.collect(u"C:\\order"_path, Files::Depth::WithSubfolders).size(), 11);
}

TEST_F(Mod4splitTest, ASourceThatShrinksMeanwhileIsAFaultAndGivesNoShortPiece) {
    const QByteArray bytes = bytesOf(100);
    write(source(), bytes);
    const Mod4split shrinking(machine.files, [&](int made, int) {
        if (made == 2)
            std::filesystem::resize_file(host(source()), 25);
        return true;
    });
    const Cut made = shrinking.SplitFile(source(), u"10"_s, Mod4split::Target::Meforakim, u"jpp"_s);
    ASSERT_TRUE(made.failure);
    EXPECT_EQ(made.failure->kind, Failure::Kind::Damaged);
    EXPECT_EQ(cutNames().size(), 2);
    EXPECT_EQ(read(piece("001_011")) + read(piece("002_011")), bytes.left(20));
}

TEST_F(Mod4splitTest, WhatCanNotBeCutIsRefusedAndNothingIsTouched) {
    const QByteArray bytes = bytesOf(1998);
    write(source(), bytes);
    struct Case {
        const char* segment;
        Failure::Kind kind;
        const char* path = "C:\\order\\02a.jpp";
    };
    std::vector<Case> cases = {{"2", Failure::Kind::TooLarge}, // would declare 1000
                               {"10", Failure::Kind::NotFound, "C:\\order\\gone.jpp"},
                               {"10", Failure::Kind::NotFound, "C:\\order\\a?.jpp"},
                               {"10", Failure::Kind::NotFound, "Q:\\02a.jpp"}};
    for (const char* segment : {"", " ", "0", "-5", "400 000", "4e5", "many", "2147483648", "2.5"})
        cases.push_back({segment, Failure::Kind::Unsupported});
    for (const auto& c : cases) {
        SCOPED_TRACE(c.segment);
        const DrivePath path(QString::fromLatin1(c.path));
        const Cut made = pieces.SplitFile(path, QString::fromLatin1(c.segment), Mod4split::Target::Meforakim, u"jpp"_s);
        ASSERT_TRUE(made.failure);
        EXPECT_EQ(made.failure->kind, c.kind) << made.failure->message.toStdString();
        EXPECT_FALSE(made.failure->message.isEmpty());
        EXPECT_EQ(cutNames(), QStringList());
        EXPECT_EQ(read(source()), bytes);
    }
    EXPECT_FALSE(cut(u" 2147483647 "_s).failure);
    EXPECT_EQ(cutNames(), QStringList(u"02a_jpp_001_001.prk"_s));

    const DrivePath longName = u"C:\\order"_path / (QString(245, u'n') + u".jpp"_s);
    write(longName, bytes);
    EXPECT_TRUE(pieces.SplitFile(longName, u"10"_s, Mod4split::Target::Meforakim, u"jpp"_s).failure);
    EXPECT_TRUE(pieces.SplitFile(source(), QString(), Mod4split::Target::Meforakim, u"prk"_s).passedOver);
}

TEST_F(Mod4splitTest, WhatCanNotBeJoinedIsRefusedAndLeavesNoFolder) {
    write(u"C:\\order\\a.prk"_path, "x");
    write(u"C:\\order\\_001_001.prk"_path, "x");
    write(u"C:\\order\\holiday pictures.prk"_path, "x");
    for (const char* name : {"a.prk", "_001_001.prk", "holiday pictures.prk", "gone_jpp_001_001.prk"}) {
        const Joined joined = pieces.MergeFamily(u"C:\\order"_path / QString::fromLatin1(name));
        ASSERT_TRUE(joined.failure) << name;
        EXPECT_TRUE(joined.failure->message.contains(u"C:\\order\\"_s)) << name;
        EXPECT_EQ(joined.file, DrivePath());
    }
    EXPECT_FALSE(machine.files.folderExists(u"C:\\order\\moorkavim"_path));
    // Fewer than 4 characters before the tail leave the base empty.
    write(u"C:\\order\\jpp_001_001.prk"_path, "x");
    EXPECT_EQ(pieces.MergeFamily(u"C:\\order\\jpp_001_001.prk"_path).file, u"C:\\order\\moorkavim\\.jpp"_path);
}

TEST(PieceFamilies, AreToldByTheNumbersInTheirNames) {
    // What was found, the verdict, and how many members.
    const std::tuple<const char*, QStringList, int, qsizetype> cases[] = {
        {"complete", {"a_jpp_001_002.prk", "a_jpp_002_002.prk"}, 1, 2},
        {"one missing", {"a_jpp_001_003.prk", "a_jpp_003_003.prk"}, -1, 2},
        {"an exact multiple", {"a_jpp_001_002.prk"}, -1, 1},
        {"two too many", {"a_jpp_001_001.prk", "a_jpp_001_002.prk", "a_jpp_002_002.prk"}, 12, 3},
        {"listed twice", {"a_jpp_001_001.prk", "a_jpp_001_001.prk"}, 11, 2},
        {"another family and folder beside it",
         {"a_jpp_001_001.prk", "b_jpp_001_001.prk", "sub\\a_jpp_001_001.prk", "A_jpp_001_001.prk"},
         1,
         1},
        {"a total that is no number", {"a_jpp_001_xyz.prk"}, 11, 1},
        {"a name that is too short", {"a.prk"}, 11, 1},
    };
    for (const auto& [what, leaves, verdict, members] : cases) {
        SCOPED_TRACE(what);
        TextList found;
        for (const QString& leaf : leaves)
            found.append(u"C:\\pieces\\"_s + leaf);
        found.append(u"C:\\pieces\\0 no piece.jpp"_s);
        TextList families;
        families.append(u"from before"_s);
        ListSingles(found, families);
        ASSERT_FALSE(families.isEmpty());
        EXPECT_EQ(families.item(0), found.item(0));
        EXPECT_FALSE(families.contains(found.items().last()));
        families.setCurrentIndex(0);
        TextList family;
        family.append(u"from before"_s);
        EXPECT_EQ(CollectFamily(families, found, family), verdict);
        EXPECT_EQ(family.count(), members);
    }
}

} // namespace
} // namespace lumora
