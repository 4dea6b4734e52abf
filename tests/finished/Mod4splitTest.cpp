#include "finished/Mod4split.h"

#include "common/PieceName.h"
#include "support/SmallDisk.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

#include <random>

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

struct Mod4splitTest : ::testing::Test {
    TestPlatform test;
    bool goOn = true;
    Mod4split pieces{test.files, [this](int, int) { return goOn; }};

    Mod4splitTest() {
        for (const char* folder : {"C:\\order", "C:\\order\\meforakim"})
            (void)test.files.makeFolder(QString::fromLatin1(folder));
    }
    static QString source() { return QStringLiteral("C:\\order\\02a.jpp"); }
    static QString piece(const char* numbers) {
        return QStringLiteral("C:\\order\\meforakim\\02a_jpp_%1.prk").arg(QLatin1StringView(numbers));
    }
    static QString whole() { return QStringLiteral("C:\\order\\meforakim\\moorkavim\\02a.jpp"); }
    void write(const QString& path, const QByteArray& bytes) {
        ASSERT_TRUE(test.files.writeWhole(path, bytes).ok()) << path.toStdString();
    }
    Cut cut(const QString& segment) {
        return pieces.SplitFile(source(), segment, Mod4split::Target::Meforakim, QStringLiteral("jpp"));
    }
    QByteArray read(const QString& path) const {
        const auto bytes = test.files.read(path);
        return bytes ? *bytes : QByteArrayLiteral("can't be read");
    }
    QStringList cutNames() const { return test.files.names(QStringLiteral("C:\\order\\meforakim"), {u'*'}); }
};

TEST_F(Mod4splitTest, CuttingAndJoiningGivesTheSameBytesForEveryLengthUpToThreeSegments) {
    constexpr int segment = 7;
    for (qsizetype length = 0; length <= 3 * segment + 1; ++length) {
        SCOPED_TRACE(length);
        std::filesystem::remove_all(*test.drives.toHost(QStringLiteral("C:\\order\\meforakim")));
        const QByteArray bytes = bytesOf(length);
        write(source(), bytes);
        const Cut made = cut(QString::number(segment));
        ASSERT_FALSE(made.failure);
        EXPECT_EQ(made.declared, length / segment + 1);
        EXPECT_EQ(made.pieces, (length + segment - 1) / segment);
        EXPECT_EQ(cutNames().size(), made.pieces);
        EXPECT_EQ(read(source()), bytes);
        if (length == 0)
            continue;
        const Joined joined = pieces.MergeFamily(made.folder + u'\\' + cutNames().first());
        ASSERT_FALSE(joined.failure);
        EXPECT_EQ(joined.file, whole());
        EXPECT_EQ(joined.bytes, length);
        EXPECT_EQ(read(whole()), bytes);
    }
}

TEST_F(Mod4splitTest, NamesAndSizesFollowTheLength) {
    const struct {
        qsizetype length;
        std::vector<std::pair<const char*, qint64>> pieces;
    } cases[] = {{900000, {{"001_003", 400000}, {"002_003", 400000}, {"003_003", 100000}}},
                 {800000, {{"001_003", 400000}, {"002_003", 400000}}},
                 {400001, {{"001_002", 400000}, {"002_002", 1}}},
                 {400000, {{"001_002", 400000}}},
                 {399999, {{"001_001", 399999}}},
                 {0, {}}};
    for (const auto& c : cases) {
        SCOPED_TRACE(c.length);
        for (const QString& name : cutNames())
            ASSERT_TRUE(test.files.removeFile(QStringLiteral("C:\\order\\meforakim\\") + name).ok());
        write(source(), bytesOf(c.length));
        EXPECT_FALSE(cut(QStringLiteral("400000")).failure);
        ASSERT_EQ(cutNames().size(), static_cast<qsizetype>(c.pieces.size()));
        for (const auto& [numbers, size] : c.pieces)
            EXPECT_EQ(*test.files.size(piece(numbers)), size) << numbers;
    }
}

TEST_F(Mod4splitTest, AFileOf40MebibytesComesBackAsItWas) {
    const QByteArray bytes = bytesOf(40 << 20);
    write(source(), bytes);
    const Cut made = cut(QStringLiteral("400000"));
    EXPECT_EQ(made.pieces, 105);
    EXPECT_EQ(made.declared, 105);
    const Joined joined = pieces.MergeFamily(piece("003_105"));
    EXPECT_EQ(joined.pieces, 105);
    EXPECT_TRUE(read(whole()) == bytes);
    EXPECT_TRUE(read(source()) == bytes);
}

TEST_F(Mod4splitTest, AnOldPieceKeepsItsTailAndAnOldJoinedFileDoesNot) {
    ASSERT_TRUE(test.files.makeFolder(QStringLiteral("C:\\order\\meforakim\\moorkavim")).ok());
    write(piece("002_002"), "0123456789");
    write(whole(), QByteArray(100, 'o'));
    write(source(), "abcdefg");
    ASSERT_FALSE(cut(QStringLiteral("5")).failure);
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
    const Mod4split stopped(test.files, [&](int, int) { return ++steps % 3 != 0; });
    const Cut made =
        stopped.SplitFile(source(), QStringLiteral("10"), Mod4split::Target::Meforakim, QStringLiteral("jpp"));
    EXPECT_TRUE(made.stopped);
    EXPECT_EQ(made.pieces, 2);
    EXPECT_EQ(cutNames().size(), 2);
    ASSERT_FALSE(cut(QStringLiteral("10")).failure);
    EXPECT_TRUE(stopped.MergeFamily(piece("001_011")).stopped);
    EXPECT_FALSE(test.files.fileExists(whole()));
    EXPECT_EQ(test.files.collect(QStringLiteral("C:\\order"), Files::Depth::WithSubfolders).size(), 11);
}

TEST_F(Mod4splitTest, WhatCanNotBeCutIsRefusedAndNothingIsTouched) {
    const QByteArray bytes = bytesOf(1998);
    write(source(), bytes);
    const struct {
        const char* segment;
        const char* path;
        Failure::Kind kind;
    } cases[] = {{"", nullptr, Failure::Kind::Unsupported},
                 {" ", nullptr, Failure::Kind::Unsupported},
                 {"0", nullptr, Failure::Kind::Unsupported},
                 {"-5", nullptr, Failure::Kind::Unsupported},
                 {"400 000", nullptr, Failure::Kind::Unsupported},
                 {"4e5", nullptr, Failure::Kind::Unsupported},
                 {"many", nullptr, Failure::Kind::Unsupported},
                 {"2147483648", nullptr, Failure::Kind::Unsupported},
                 {"2", nullptr, Failure::Kind::TooLarge}, // would declare 1000
                 {"2.5", nullptr, Failure::Kind::Unsupported},
                 {"10", "C:\\order\\gone.jpp", Failure::Kind::NotFound},
                 {"10", "C:\\order\\a?.jpp", Failure::Kind::NotFound},
                 {"10", "Q:\\02a.jpp", Failure::Kind::NotFound}};
    for (const auto& c : cases) {
        SCOPED_TRACE(c.segment);
        const QString path = c.path ? QString::fromLatin1(c.path) : source();
        const Cut made =
            pieces.SplitFile(path, QString::fromLatin1(c.segment), Mod4split::Target::Meforakim, QStringLiteral("jpp"));
        ASSERT_TRUE(made.failure);
        EXPECT_EQ(made.failure->kind, c.kind) << made.failure->message.toStdString();
        EXPECT_FALSE(made.failure->message.isEmpty());
        EXPECT_EQ(cutNames(), QStringList());
        EXPECT_EQ(read(source()), bytes);
    }
    EXPECT_FALSE(cut(QStringLiteral(" 2147483647 ")).failure);
    EXPECT_EQ(cutNames(), QStringList(QStringLiteral("02a_jpp_001_001.prk")));

    const QString longName = QStringLiteral("C:\\order\\") + QString(245, u'n') + QStringLiteral(".jpp");
    write(longName, bytes);
    EXPECT_TRUE(
        pieces.SplitFile(longName, QStringLiteral("10"), Mod4split::Target::Meforakim, QStringLiteral("jpp")).failure);
    EXPECT_TRUE(pieces.SplitFile(source(), QString(), Mod4split::Target::Meforakim, QStringLiteral("prk")).passedOver);
}

TEST_F(Mod4splitTest, WhatCanNotBeJoinedIsRefusedAndLeavesNoFolder) {
    write(QStringLiteral("C:\\order\\a.prk"), "x");
    write(QStringLiteral("C:\\order\\_001_001.prk"), "x");
    write(QStringLiteral("C:\\order\\holiday pictures.prk"), "x");
    for (const char* name : {"a.prk", "_001_001.prk", "holiday pictures.prk", "gone_jpp_001_001.prk"}) {
        const Joined joined = pieces.MergeFamily(QStringLiteral("C:\\order\\") + QString::fromLatin1(name));
        ASSERT_TRUE(joined.failure) << name;
        EXPECT_TRUE(joined.failure->message.contains(QStringLiteral("C:\\order\\"))) << name;
        EXPECT_EQ(joined.file, QString());
    }
    EXPECT_FALSE(test.files.folderExists(QStringLiteral("C:\\order\\moorkavim")));
    // Fewer than 4 characters before the tail leave the base empty.
    write(QStringLiteral("C:\\order\\jpp_001_001.prk"), "x");
    EXPECT_EQ(pieces.MergeFamily(QStringLiteral("C:\\order\\jpp_001_001.prk")).file,
              QStringLiteral("C:\\order\\moorkavim\\.jpp"));
}

TEST_F(Mod4splitTest, AFullDiskLeavesWholePiecesAndTheOldJoinedFile) {
    const SmallDisk disk(64);
    if (!disk.available())
        GTEST_SKIP() << "no right to mount a disk";
    std::filesystem::create_directory_symlink(disk.path(), *test.drives.toHost(QStringLiteral("C:\\small")));
    const QString small = QStringLiteral("C:\\small\\02a.jpp");
    const QByteArray bytes = bytesOf(40000);
    write(small, bytes);
    const QString older = QStringLiteral("C:\\small\\moorkavim\\02a.jpp");
    ASSERT_TRUE(test.files.makeFolder(QStringLiteral("C:\\small\\moorkavim")).ok());
    write(older, "the older one");
    const auto leaves = [&] {
        QStringList names;
        for (const auto& entry : std::filesystem::recursive_directory_iterator(disk.path())) {
            if (entry.is_regular_file())
                names += toText(entry.path().filename());
        }
        names.sort();
        return names;
    };
    const Cut made =
        pieces.SplitFile(small, QStringLiteral("8000"), Mod4split::Target::FolderOfSource, QStringLiteral("jpp"));
    ASSERT_TRUE(made.failure);
    EXPECT_EQ(made.failure->kind, Failure::Kind::NoSpace);
    EXPECT_EQ(made.pieces, 2);
    EXPECT_EQ(leaves(), (QStringList{QStringLiteral("02a.jpp"), QStringLiteral("02a.jpp"),
                                     QStringLiteral("02a_jpp_001_006.prk"), QStringLiteral("02a_jpp_002_006.prk")}));
    EXPECT_EQ(read(small), bytes);

    const Joined joined = pieces.MergeFamily(QStringLiteral("C:\\small\\02a_jpp_001_006.prk"));
    ASSERT_TRUE(joined.failure);
    EXPECT_EQ(joined.failure->kind, Failure::Kind::NoSpace);
    EXPECT_EQ(leaves().size(), 4) << "no half file:" << leaves().join(u' ').toStdString();
    EXPECT_EQ(read(older), "the older one");
    EXPECT_EQ(read(QStringLiteral("C:\\small\\02a_jpp_001_006.prk")), bytes.left(8000));
}

TEST_F(Mod4splitTest, AFolderThatMayNotBeWrittenIsTold) {
    SmallDisk disk(64);
    if (!disk.available())
        GTEST_SKIP() << "no right to mount a disk";
    std::filesystem::create_directory_symlink(disk.path(), *test.drives.toHost(QStringLiteral("C:\\locked")));
    write(QStringLiteral("C:\\locked\\02a.jpp"), "bytes");
    write(QStringLiteral("C:\\locked\\03a_jpp_001_001.prk"), "bytes");
    ASSERT_TRUE(disk.makeReadOnly());
    const Cut made = pieces.SplitFile(QStringLiteral("C:\\locked\\02a.jpp"), QStringLiteral("10"),
                                      Mod4split::Target::Meforakim, QStringLiteral("jpp"));
    ASSERT_TRUE(made.failure);
    EXPECT_EQ(made.failure->kind, Failure::Kind::AccessDenied);
    const Joined joined = pieces.MergeFamily(QStringLiteral("C:\\locked\\03a_jpp_001_001.prk"));
    ASSERT_TRUE(joined.failure);
    EXPECT_EQ(joined.failure->kind, Failure::Kind::AccessDenied);
}

TEST(PieceFamilies, AreToldByTheNumbersInTheirNames) {
    const struct {
        const char* fault;
        QStringList found; // leaves without "C:\p\"
        int verdict;
        int members;
    } cases[] = {
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
    for (const auto& c : cases) {
        SCOPED_TRACE(c.fault);
        TextList found;
        for (const QString& leaf : c.found)
            found.append(QStringLiteral("C:\\pieces\\") + leaf);
        found.append(QStringLiteral("C:\\pieces\\0 no piece.jpp"));
        TextList families;
        families.append(QStringLiteral("from before"));
        ListSingles(found, families);
        ASSERT_FALSE(families.isEmpty());
        EXPECT_EQ(families.item(0), found.item(0));
        families.setCurrentIndex(0);
        TextList family;
        family.append(QStringLiteral("from before"));
        EXPECT_EQ(CollectFamily(families, found, family), c.verdict);
        EXPECT_EQ(family.count(), c.members);
    }
}

} // namespace
} // namespace lumora
