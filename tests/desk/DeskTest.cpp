#include "common/HostFile.h"
#include "desk/ArrivedOrder.h"
#include "desk/Book.h"
#include "desk/DeskReport.h"
#include "desk/DeskWatch.h"
#include "desk/HotFolder.h"
#include "desk/PrintLayout.h"
#include "imaging/files/PictureFile.h"
#include "order/OrderLog.h"
#include "order/OrderTail.h"
#include "order/PrintFileName.h"
#include "platform/files/HostPath.h"
#include "support/ExampleOrder.h"
#include "support/Take.h"

#include <QDateTime>
#include <QTemporaryDir>
#include <QThread>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sys/resource.h>
#include <unistd.h>

#include <algorithm>
#include <fstream>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;
using State = DeskOrder::State;
using testing::ElementsAre;
using testing::HasSubstr;

const QString orderName = u"2026_11_21_KUP_1234^105"_s;
const char* const one = "2 1015GNB0000_016F6E65.jpp";
const char* const two = "1 1015GNB0001_0174776F.jpp";
const char* const sheet = "!105_1234.jpp";

class TheDesk : public testing::Test {
protected:
    TheDesk() { fs::create_directory(arrived); }

    void write(const fs::path& file, const QByteArray& bytes) { take(writeWholeFile(file, bytes)); }
    QByteArray read(const fs::path& file) { return take(readHostFile(file)); }

    // An order of two prints, three copies.
    fs::path giveOrder(const QString& name = orderName) {
        SessionState state = exampleOrder();
        state.Optint = OrderKind::Print;
        state.shemot.TotalPics = 3;
        const fs::path folder = arrived / toHostPath(name);
        fs::create_directory(folder);
        const QByteArray tail = "1 1 03-1234567Dana Levi 3  1051234      ";
        for (const char* print : {one, two})
            write(folder / print, take(packPrintFile(picture, {}, tail)));
        write(folder / sheet, picture);
        const auto items = QStringList{u"2 1015GNBC:\\pics\\one.jpg"_s, u"1 1015GNBC:\\pics\\two.jpg"_s};
        write(folder / toHostPath(name + u".txt"_s),
              OrderLog::of(state, OrderLog::Layout::Plain, items, {}, QDateTime::currentDateTime()).write());
        return folder;
    }

    // Cuts the file into pieces of the size; that many lie in the folder in its stead.
    void cut(const fs::path& file, qsizetype size, QList<int> numbers, const char* total) {
        const QByteArray bytes = read(file);
        for (const int number : numbers) {
            const std::string stem = file.stem().native() + "_jpp_00" + std::to_string(number) + '_' + total + ".prk";
            write(file.parent_path() / stem, bytes.mid((number - 1) * size, size));
        }
        fs::remove(file);
    }

    // All files but hidden ones and lists.
    std::vector<std::string> placed() const {
        std::vector<std::string> files;
        for (auto at = fs::recursive_directory_iterator(hot); at != fs::recursive_directory_iterator(); ++at) {
            if (at->path().filename() == ".desk")
                at.disable_recursion_pending();
            else if (at->path().extension() == ".jpg")
                files.push_back(at->path().lexically_relative(hot).native());
        }
        std::sort(files.begin(), files.end());
        return files;
    }

    DeskWatch watch(Book& book, const HotFolder& hotFolder, qint64 quiet = 0) {
        return DeskWatch({arrived, take(PrintLayout::parse(u"size-paper/copies"_s)), {}, quiet}, book, hotFolder,
                         [this](DeskWatch::Tone, const QString& text) { told += text; });
    }
    // Looks and works until the order is in the state, for ten seconds at most.
    State workUntil(Book& book, DeskWatch& desk, State wanted) {
        for (int i = 0; i < 500; ++i) {
            take(desk.look());
            while (take(desk.step())) {
                if (const auto found = take(book.list({wanted})); !found.isEmpty())
                    return wanted;
            }
            QThread::msleep(20);
        }
        return State::Waiting;
    }

    QTemporaryDir scratch;
    const fs::path root = toHostPath(scratch.path());
    const fs::path arrived = root / "arrived", hot = root / "hot";
    const QString bookFile = toText(root / "book.sqlite");
    const QByteArray picture = take(encodeJpeg(Bitmap(40, 30, Qt::gray), 90));
    QStringList told;

    const std::vector<std::string> whole{"10x15-glossy/1/2026_11_21_KUP_1234-105_1-1015GNB0001_0174776F.jpg",
                                         "10x15-glossy/2/2026_11_21_KUP_1234-105_2-1015GNB0000_016F6E65.jpg",
                                         "sheets/2026_11_21_KUP_1234-105.jpg"};
};

TEST_F(TheDesk, NamesFoldersByWhatThePrintCodeSays) {
    const struct {
        const char* layout;
        const char* code;
        const char* folder; // nullptr: the layout is refused
    } cases[] = {
        {"size-paper-border/copies", "121015MWB", "10x15-matte-white/12"},
        {"size_paper/copies", "1 9/13GNB", "9x13_glossy/1"},
        {"order/border", "3 1318 BK", "a-b/black"},
        {"size/paper/border", "1     GNN", "nosize/glossy/unasked"},
        {"border", "1 1015G/.", "-."},
        {"size/../copies", "", nullptr},
        {"/size", "", nullptr},
        {"size paper", "", nullptr},
        {"", "", nullptr},
    };
    for (const auto& c : cases) {
        const Result<PrintLayout> layout = PrintLayout::parse(QLatin1String(c.layout));
        ASSERT_EQ(layout.ok(), c.folder != nullptr) << c.layout;
        if (layout) {
            const PrintWords words = PrintWords::of({QLatin1String(c.code), 0, 1, u"a"_s});
            EXPECT_EQ(layout->folderOf(words, u"a^b"_s).toStdString(), c.folder) << c.layout;
        }
    }
}

TEST_F(TheDesk, TellsWhatAnOrderLacksAndJoinsItsPieces) {
    const QString inPieces = orderName + u'P';
    const qsizetype length = take(packPrintFile(picture, {}, QByteArray(40, ' '))).size();
    const qsizetype half = length / 2;
    const struct {
        const char* what;
        QString name;
        std::function<void(const fs::path&)> change;
        const char* missing; // nullptr: whole
    } cases[] = {
        {"whole", orderName, [](const fs::path&) {}, nullptr},
        {"no print", orderName, [](const fs::path& in) { fs::remove(in / two); }, "two.jpg"},
        {"no sheet", orderName, [](const fs::path& in) { fs::remove(in / sheet); }, "the order sheet is missing"},
        {"an exact multiple", inPieces, [&](const fs::path& in) { cut(in / two, length, {1}, "002"); }, nullptr},
        {"the sheet too", inPieces,
         [&](const fs::path& in) {
             cut(in / sheet, 100, {1, 2, 3, 4, 5, 6, 7, 8, 9}, "009");
         },
         nullptr},
        {"log without the P, a list beside", inPieces,
         [&](const fs::path& in) {
             fs::rename(in / toHostPath(inPieces + u".txt"_s), in / toHostPath(orderName + u".txt"_s));
             write(in / "filelisthom.txt", "x");
         },
         nullptr},
        {"a piece is missing", inPieces,
         [&](const fs::path& in) {
             cut(in / two, half - 1, {1, 3}, "003");
         },
         "of its 003 pieces these are missing: 2"},
        {"the last one is", inPieces,
         [&](const fs::path& in) {
             cut(in / two, half - 1, {1, 2}, "003");
         },
         two},
        {"two cuts", inPieces,
         [&](const fs::path& in) {
             const QByteArray bytes = read(in / two);
             cut(in / two, half, {1, 2}, "003");
             write(in / two, bytes);
             cut(in / two, half - 1, {1, 2, 3}, "004");
         },
         "pieces of two cuts"},
        {"a piece beside the whole file", inPieces,
         [this](const fs::path& in) { write(in / "1 1015GNB0001_0174776F_jpp_002_009.prk", "x"); }, nullptr},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.what);
        QTemporaryDir room;
        const fs::path in = giveOrder(c.name);
        c.change(in);
        const ArrivedOrder order = take(ArrivedOrder::judge(in, {}, toHostPath(room.path())));
        EXPECT_EQ(order.missing.isEmpty(), c.missing == nullptr) << order.missing.join(u'|').toStdString();
        EXPECT_THAT(order.missing.join(u'|').toStdString(), HasSubstr(c.missing ? c.missing : ""));
        if (!c.missing) {
            ASSERT_EQ(order.prints.size(), 2U);
            for (const auto& print : order.prints)
                EXPECT_EQ(take(readPrintFile(read(print.path), {})).picture, picture);
            EXPECT_EQ(read(order.sheet), picture);
        }
        fs::remove_all(in);
    }
}

TEST_F(TheDesk, MovesAPrintOnceAlsoWhenTheMinilabHasTakenItAway) {
    const HotFolder hotFolder = take(HotFolder::open(hot));
    EXPECT_EQ(take(HotFolder::open(hot)).id(), hotFolder.id());
    const PrintLayout layout = take(PrintLayout::parse(u"size-paper/copies"_s));
    const ArrivedOrder order = take(ArrivedOrder::judge(giveOrder(), {}, root));
    const QString room = take(hotFolder.makeRoom(orderName));
    take(hotFolder.makeReady(room, order, layout, {}));
    EXPECT_THAT(placed(), ElementsAre());
    rlimit usual{};
    ::getrlimit(RLIMIT_NOFILE, &usual);
    const int next = ::dup(STDERR_FILENO);
    ::close(next);
    const rlimit few{static_cast<rlim_t>(next) + 1, usual.rlim_max}; // the room can be opened, no folder in it can
    ::setrlimit(RLIMIT_NOFILE, &few);
    EXPECT_FALSE(hotFolder.place(room));
    ::setrlimit(RLIMIT_NOFILE, &usual);
    fs::create_symlink("loop", arrived / toHostPath(orderName) / "loop");
    EXPECT_FALSE(ArrivedOrder::judge(arrived / toHostPath(orderName), {}, root)) << "a file of it can't be read";
    // The desk is killed in the middle: the first print has moved, and the minilab has it.
    fs::create_directories((hot / whole[0]).parent_path());
    fs::rename(hotFolder.pathOf(room) / "out" / whole[0], hot / whole[0]);
    fs::remove(hot / whole[0]);
    take(hotFolder.place(room));
    EXPECT_THAT(placed(), ElementsAre(whole[1], whole[2]));
    EXPECT_EQ(read(hot / whole[1]), picture);

    // What waits for the minilab is never replaced.
    write(hot / whole[1], "another");
    const QString again = take(hotFolder.makeRoom(orderName));
    EXPECT_EQ(hotFolder.rooms().size(), 2) << "another process may have made the order ready in the first one";
    EXPECT_EQ(hotFolder.makeReady(again, order, layout, {}).failure().kind, Failure::Kind::InUse);
    const fs::path late = hotFolder.pathOf(again) / "out" / whole[1];
    fs::create_directories(late.parent_path());
    write(late, picture);
    EXPECT_FALSE(hotFolder.place(again));
    EXPECT_EQ(read(hot / whole[1]), "another");
    EXPECT_TRUE(fs::exists(late));
    hotFolder.clear(again);
    EXPECT_FALSE(hotFolder.place(again)) << "a room that somebody has removed does not count as placed";

    fs::rename(hot, root / "share"); // it is unmounted, and another one is there
    take(HotFolder::open(hot));
    EXPECT_FALSE(hotFolder.makeRoom(orderName) || hotFolder.place(room) || hotFolder.addLine(u"l.csv"_s, "", "1,a"));
}

TEST_F(TheDesk, ListsAnOrderOnceAndMendsALineThatWasCut) {
    const HotFolder hotFolder = take(HotFolder::open(hot));
    for (const char* line : {"1,\"a\",x", "2,\"b\",x", "3,\"a\",x"})
        take(hotFolder.addLine(u"l.csv"_s, "head", line));
    EXPECT_EQ(read(hot / "l.csv"), "head\r\n1,\"a\",x\r\n2,\"b\",x\r\n");
    std::ofstream(hot / "l.csv", std::ios::app) << "4,\"c\",";
    take(hotFolder.addLine(u"l.csv"_s, "head", "4,\"c\",x"));
    EXPECT_EQ(read(hot / "l.csv"), "head\r\n1,\"a\",x\r\n2,\"b\",x\r\n4,\"c\",x\r\n");
}

TEST_F(TheDesk, GivesAnOrderToOneProcessAtATime) {
    auto first = take(Book::open(bookFile));
    const auto second = take(Book::open(bookFile));
    take(first->enter({u"a"_s, u"b"_s}));
    take(second->enter({u"b"_s, u"a"_s}));
    DeskOrder a = *take(first->claim(u"x"_s));
    DeskOrder b = *take(second->claim(u"x"_s));
    EXPECT_NE(a.name, b.name);
    b.due = take(second->now()) + 3600000;
    EXPECT_TRUE(take(second->save(b, Book::Then::Drop)));
    EXPECT_FALSE(take(second->claim(u"x"_s))) << "one is not due, the other is claimed";
    EXPECT_TRUE(take(first->save(a, Book::Then::Hold)));
    EXPECT_FALSE(take(second->claim(u"x"_s))) << "it is still held";
    first.reset(); // as when its process is killed
    DeskOrder taken = *take(second->claim(u"x"_s));
    EXPECT_EQ(taken.name, a.name);
    --taken.version;
    EXPECT_FALSE(take(second->save(taken, Book::Then::Drop))) << "another one has saved it since";

    // A ready order belongs to the hot folder that has its files; a time far ahead comes from a wrong clock.
    taken = *take(second->claim(u"x"_s));
    taken.state = State::Ready;
    taken.desk = u"x"_s;
    taken.due += qint64(40) * 86400000;
    EXPECT_TRUE(take(second->save(taken, Book::Then::Drop)));
    EXPECT_FALSE(take(second->claim(u"y"_s)));
    EXPECT_TRUE(take(second->claim(u"x"_s)));
    EXPECT_EQ(Book::open(u"mysql://a/b"_s).failure().kind, Failure::Kind::Unsupported);
}

TEST_F(TheDesk, TakesAFaultyOrderWhenItIsMendedAndAGoneOneWhenItIsBack) {
    const auto book = take(Book::open(bookFile));
    const HotFolder hotFolder = take(HotFolder::open(hot));
    const fs::path in = giveOrder();
    fs::create_directory(arrived / "holiday");
    const QByteArray print = read(in / two);
    write(in / two, print.chopped(1));
    DeskWatch patient = watch(*book, hotFolder, 3600000);
    take(patient.begin());
    take(patient.look());
    EXPECT_TRUE(take(patient.step()));
    EXPECT_FALSE(take(patient.step())) << "nothing is judged before it was quiet";
    EXPECT_EQ(told.join(u'|').toStdString(), "holiday: not the name of an order, passed over");
    EXPECT_FALSE(take(patient.allDone()));

    const auto fresh = take(Book::open(toText(root / "second.sqlite"))); // of a desk without patience
    DeskWatch desk = watch(*fresh, hotFolder);
    told.clear();
    EXPECT_EQ(workUntil(*fresh, desk, State::Faulty), State::Faulty);
    ASSERT_EQ(told.size(), 2);
    EXPECT_THAT(told[1].toStdString(), HasSubstr(two));
    for (int i = 0; i < 20; ++i) {
        take(desk.step());
        QThread::msleep(20);
    }
    EXPECT_EQ(told.size(), 2) << "the same fault is told once";
    EXPECT_TRUE(take(desk.allDone()));

    fs::rename(in, root / "elsewhere");
    EXPECT_EQ(workUntil(*fresh, desk, State::Gone), State::Gone);
    take(hotFolder.makeRoom(orderName));
    const QString killed = take(hotFolder.makeRoom(u"a~export"_s));
    const QString busy = take(hotFolder.makeRoom(u"a~export"_s));
    fs::last_write_time(hotFolder.pathOf(killed), fs::file_time_type::clock::now() - std::chrono::hours(25));
    take(desk.begin());
    EXPECT_EQ(hotFolder.rooms(), QStringList(busy));
    take(hotFolder.makeRoom(orderName)); // of a try that was killed
    write(root / "elsewhere" / two, print);
    fs::rename(root / "elsewhere", in);
    EXPECT_EQ(workUntil(*fresh, desk, State::Placed), State::Placed);
    EXPECT_EQ(placed(), whole);
    EXPECT_THAT(told.last().toStdString(), HasSubstr("placed, 2 prints, 3 copies"));
    EXPECT_EQ(hotFolder.rooms(), QStringList(busy));
    // What changes behind that prints nothing.
    fs::remove_all(hot / "10x15-glossy");
    write(in / two, print);
    take(desk.look());
    EXPECT_FALSE(take(desk.step()));

    const QDate today = QDate::currentDate();
    const DeskReport report = take(DeskReport::of(*fresh, today.addDays(-1), today));
    EXPECT_EQ(QList({report.orders(), qsizetype(report.copies()), report.faults()}), QList<qsizetype>({1, 3, 1}));
    EXPECT_THAT(report.csv().toStdString(), HasSubstr(",,10x15,glossy,noborder,2,3,\r\n"));
    EXPECT_THAT(report.csv().toStdString(), HasSubstr("mended: "));
    EXPECT_THAT(report.html().toStdString(), HasSubstr(": 3</title></rect>"));
    EXPECT_EQ(take(DeskReport::of(*fresh, today.addDays(1), today.addDays(2))).orders(), 0);
}

TEST_F(TheDesk, ExportsAnOrderByHandOrTellsWhatItLacks) {
    const HotFolder hotFolder = take(HotFolder::open(hot));
    const PrintLayout layout = take(PrintLayout::parse(u"size-paper/copies"_s));
    const fs::path in = giveOrder();
    EXPECT_EQ(take(exportOrder(in, hotFolder, layout, {})).copies, 3);
    EXPECT_EQ(placed(), whole);
    fs::remove(in / one);
    fs::remove_all(hot / "10x15-glossy");
    EXPECT_THAT(exportOrder(in, hotFolder, layout, {}).failure().message.toStdString(), HasSubstr("one.jpg"));
    EXPECT_EQ(placed().size(), 1U);
    EXPECT_TRUE(hotFolder.rooms().isEmpty());
}

TEST_F(TheDesk, GoesOnWithAnExportThatWasCutOff) {
    const HotFolder hotFolder = take(HotFolder::open(hot));
    const PrintLayout layout = take(PrintLayout::parse(u"size-paper/copies"_s));
    const fs::path in = giveOrder();
    const QString room = take(hotFolder.makeRoom(orderName + u"~export"_s));
    take(hotFolder.makeReady(room, take(ArrivedOrder::judge(in, {}, root)), layout, {}));
    const auto book = take(Book::open(bookFile));
    take(watch(*book, hotFolder).begin());
    EXPECT_THAT(told.join(u'|').toStdString(), HasSubstr("its export was cut off"));
    {
        const Descriptor other = take(hotFolder.hold(room));
        EXPECT_EQ(exportOrder(in, hotFolder, layout, {}).failure().kind, Failure::Kind::InUse);
    }
    // It was killed behind the first move, and the minilab has taken that print; now its line can't be written.
    fs::create_directories((hot / whole[0]).parent_path());
    fs::rename(hotFolder.pathOf(room) / "out" / whole[0], hot / whole[0]);
    fs::remove(hot / whole[0]);
    const fs::path list = hot / toHostPath(u"orders-%1.csv"_s.arg(QDate::currentDate().toString(Qt::ISODate)));
    fs::create_directory(list);
    EXPECT_THAT(exportOrder(in, hotFolder, layout, {}).failure().message.toStdString(), HasSubstr("repeat the export"));
    EXPECT_THAT(placed(), ElementsAre(whole[1], whole[2]));
    fs::remove(list);
    fs::remove(hot / whole[1]);
    EXPECT_EQ(take(exportOrder(in, hotFolder, layout, {})).copies, 3);
    EXPECT_THAT(placed(), ElementsAre(whole[2])) << "what has moved is not placed again";
    EXPECT_EQ(read(list).count('\n'), 2);
    EXPECT_TRUE(hotFolder.rooms().isEmpty());
}

TEST_F(TheDesk, ReportsAnOrderThatIsPutOffUntilItIsPlaced) {
    const auto book = take(Book::open(bookFile));
    const HotFolder hotFolder = take(HotFolder::open(hot));
    giveOrder();
    fs::create_directories(hot / whole[2]); // what waits there is never replaced
    DeskWatch desk = watch(*book, hotFolder);
    for (int i = 0; i < 100 && told.isEmpty(); ++i) {
        take(desk.look());
        take(desk.step());
        QThread::msleep(20);
    }
    EXPECT_THAT(told.join(u'|').toStdString(), HasSubstr("put off: "));
    const QDate today = QDate::currentDate();
    const auto faults = [&] { return take(DeskReport::of(*book, today.addDays(-1), today)).csv().toStdString(); };
    EXPECT_THAT(faults(), HasSubstr("open: "));
    fs::remove(hot / whole[2]);
    EXPECT_EQ(workUntil(*book, desk, State::Placed), State::Placed);
    EXPECT_THAT(faults(), HasSubstr("mended: "));
}

} // namespace
} // namespace lumora
