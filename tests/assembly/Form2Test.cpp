#include "PlainOrder.h"

#include "assembly/PaperResize.h"
#include "order/OrderCheck.h"
#include "support/JpegQuality.h"

namespace lumora {
namespace {

TEST_F(PreparingAPlainOrder, makesTheWholeFolderAndHandsItToTheSender) {
    const QString portrait = givePicture(u"תמונה 01.jpg"_s, 1500, 2000);
    const QString small = givePicture(u"small.JPG"_s);
    openWith({line(portrait, u"12"_s), line(small)}).Command3_Click();

    EXPECT_EQ(machine.files.names(folder(), u"*.*"_s),
              QStringList({u"!105_1234.jpp"_s, u"1 1015GNB0001_01736D616C6C.jpp"_s,
                           u"121015GNB0000_01FAEEE5F0E4203031.jpp"_s, u"2026_11_21_KUP_1234^105.txt"_s}));
    const PrintFileContent print = take(unpacked(u"121015GNB0000_01FAEEE5F0E4203031.jpp"_s));
    EXPECT_EQ(print.picture, *resizeToPaper(host(portrait), {10, 15}));
    EXPECT_EQ(print.tail, "1 1 03-1234567Dana Levi 13 1051234      ");
    EXPECT_EQ(QImage::fromData(print.picture).size(), QSize(1200, 1600));
    EXPECT_EQ(jpegQuality(print.picture), 90);
    EXPECT_EQ(jpegQuality(read(folder() / u"!105_1234.jpp")), 90);
    EXPECT_EQ(take(readPictureSize(host(folder() / u"!105_1234.jpp"))), (PictureSize{500, 480}));

    EXPECT_EQ(read(u"C:\\vedron\\mispar.txt"_path), "106\r\n");
    EXPECT_EQ(state.MisparHazmana, u"105"_s) << "the number in memory stays this order's";
    EXPECT_EQ(state.shemot.TotalPics, 13);
    EXPECT_EQ(state.transfer.OrderFolder, folder());
    EXPECT_EQ(state.transfer.OrderLogBase.text() + u".txt"_s, logPath().text());
    EXPECT_EQ(state.transfer.SugMishloah, Sending::NewOrder) << "a resend before does not leak into a new order";
    EXPECT_TRUE(machine.files.fileExists(u"C:\\2000lumora\\!!000\\^^^.jpg"_path))
        << "stays for the next step to replace";
    EXPECT_EQ(front(), PageId::FtpFrm);
    EXPECT_EQ(chain.find(PageId::Form2), nullptr);
    EXPECT_TRUE(machine.dialogs.messages.isEmpty()) << machine.dialogs.messages.join(u'|').toStdString();
}

TEST_F(PreparingAPlainOrder, PrintsEachPictureAsItselfAlsoWhereTheSheetIsFull) {
    QStringList paths, items;
    for (int i = 0; i < 92; ++i) // 88 cells
        paths += givePicture(u"abc%1.jpg"_s.arg(i), 40 + i, 30, QColor(2 * i, 90, 120));
    for (const QString& path : paths)
        items += line(path);
    std::filesystem::remove(host(paths[3]));
    write(DrivePath(paths[90]), "no picture");
    openWith(items).Command6_Click();
    ASSERT_EQ(front(), PageId::FtpFrm);
    EXPECT_EQ(state.transfer.leftOut.size(), 2);
    const QStringList prints = printFiles();
    paths.remove(90);
    paths.remove(3);
    ASSERT_EQ(prints.size(), paths.size());
    for (int i = 0; i < prints.size(); ++i)
        EXPECT_EQ(take(unpacked(prints[i])).picture, take(resizeToPaper(host(paths[i]), {10, 15}))) << i;
}

TEST_F(PreparingAPlainOrder, neverPrintsADamagedPictureAsTheOneBeforeIt) {
    for (const int deep : {0, 1}) {
        state.DchisaAmoka = static_cast<std::int16_t>(deep);
        state.MisparHazmana = QString::number(200 + deep);
        const QString first = givePicture(u"first.jpg"_s, 40, 30, Qt::red);
        const QString third = givePicture(u"third.jpg"_s, 40, 30, Qt::blue);
        QByteArray cutShort = *encodeJpeg(noisyPicture(60, 60, 1), 90);
        cutShort.truncate(cutShort.size() / 2);
        // What is copied as it is fails, as built in, only where there is nothing to copy.
        const QString nothing = u"C:\\pics\\nothing.jpg"_s;
        makeFolder(nothing);
        const QString second = deep == 1 ? nothing : giveFile(u"second.jpg"_s, cutShort);
        const QString odd = u"C:\\pics\\caf?.jpg"_s; // its own name can't be told to the lab
        Form2& page = openWith({line(first), line(odd), line(second), line(third)});
        const TextList& failed = page.controls().List4fail;
        page.Command6_Click();

        const QString number = state.MisparHazmana;
        EXPECT_EQ(failed.items(), QStringList({odd, second}));
        EXPECT_TRUE(machine.dialogs.messages.isEmpty()) << "the order's own files are all written";
        ASSERT_EQ(printFiles(number),
                  QStringList({u"1 1015GNB0000_016669727374.jpp"_s, u"1 1015GNB0003_017468697264.jpp"_s}))
            << "a failed picture leaves a hole in the numbers";
        EXPECT_NE(take(unpacked(printFiles(number)[0], number)).picture,
                  take(unpacked(printFiles(number)[1], number)).picture);
        const QByteArray log = read(logPath(number));
        EXPECT_TRUE(log.contains("\"-----------Total Failed\",\"2-----------\"\r\n"));
        EXPECT_TRUE(log.contains("\"More Comp = \"," + QByteArray::number(deep) + "\r\n"));
        EXPECT_EQ(front(), PageId::FtpFrm) << "failed pictures never stop an order";
        chain.unload(PageId::FtpFrm);
    }
}

TEST_F(PreparingAPlainOrder, carefullyDecodesWhatItCopiesAndPassesOverWarnings) {
    state.DchisaAmoka = 1;
    QByteArray spoilt = *encodeJpeg(noisyPicture(60, 60, 1), 90);
    spoilt.replace(spoilt.size() / 2, 2, "\xFF\xD5"); // a marker where data is expected
    const QStringList paths = {giveFile(u"spoilt.jpg"_s, spoilt),
                               giveFile(u"cut_1.jpg"_s, spoilt.left(spoilt.size() / 2)),
                               giveFile(u"words.jpg"_s, "no picture")};
    EXPECT_FALSE(loadPicture(host(paths[0])));
    for (const bool careful : {false, true}) {
        state.Careful = careful;
        state.MisparHazmana = careful ? u"202"_s : u"201"_s;
        Form2& page = openWith({line(paths[0]), line(paths[1]), line(paths[2])});
        const TextList& failed = page.controls().List4fail;
        page.Command6_Click();
        EXPECT_EQ(failed.items(), careful ? paths.mid(1) : QStringList());
        EXPECT_EQ(take(unpacked(u"1 1015GNB0000_0173706F696C74.jpp"_s, state.MisparHazmana)).picture, spoilt);
        chain.unload(PageId::FtpFrm);
    }
}

TEST_F(PreparingAPlainOrder, dropsWhatIsNoJpegInTwoWalksThatPassOverTheItemBehindARemovedOne) {
    const QString jpg = line(givePicture(u"a1.jpg"_s));
    const auto other = [](int i) { return line(u"C:\\pics\\x%1.png"_s.arg(i)); };
    Form2& page = openWith({other(1), other(2), other(3), other(4), other(5), jpg});
    const TextList& left = page.controls().List1;
    const TextList& removed = page.controls().List4removed;
    page.Command3_Click();
    EXPECT_EQ(left.items(), QStringList({other(4), jpg}));
    EXPECT_EQ(removed.count(), 4);
    EXPECT_EQ(printFiles(), QStringList(u"1 1015GNB0001_016131.jpp"_s));

    for (const bool careful : {false, true}) {
        chain.unload(PageId::FtpFrm);
        state.Careful = careful;
        state.MisparHazmana = careful ? u"202"_s : u"201"_s;
        openWith({line(givePicture(u"b2.Jpg"_s)), line(givePicture(u"c3.jPG"_s)), jpg}).Command3_Click();
        EXPECT_EQ(printFiles(state.MisparHazmana).size(), careful ? 3 : 1);
    }
}

TEST_F(PreparingAPlainOrder, saysSoWhenNothingIsLeftAndTakesNoNumber) {
    openWith({}).Command6_Click();
    EXPECT_EQ(machine.dialogs.messages, QStringList(u"לא נבחרו תמונות"_s));
    chain.unload(PageId::Form2);
    Form2& page = openWith({line(u"C:\\pics\\a.txt"_s), line(u"C:\\pics\\b.Jpg"_s)});
    page.Command3_Click();
    EXPECT_EQ(machine.dialogs.messages.size(), 2) << "empty only in the second walk";
    EXPECT_FALSE(machine.files.fileExists(u"C:\\vedron\\mispar.txt"_path));
    EXPECT_FALSE(machine.files.folderExists(folder()));
    EXPECT_FALSE(page.isPreparing());
    EXPECT_TRUE(page.controls().Command3.enabled);
}

TEST_F(PreparingAPlainOrder, takesNoSecondPressAndNoRemovalWhileItPrepares) {
    Form2& page = openWith({line(givePicture(u"one.jpg"_s)), line(givePicture(u"two.jpg"_s))});
    machine.pump.onPump = [&] {
        page.Command3_Click();
        page.Command6_Click();
        page.Command1_Click();
    };
    page.Command3_Click();
    machine.pump.onPump = {};
    page.Command6_Click();
    EXPECT_EQ(printFiles().size(), 2);
    EXPECT_FALSE(machine.files.folderExists(folder(u"106"_s)));
    EXPECT_EQ(read(u"C:\\vedron\\mispar.txt"_path), "106\r\n");
}

TEST_F(PreparingAPlainOrder, endsTheProgramAtOnceWhenTheCustomerLeaves) {
    QStringList items;
    for (int i = 0; i < 8; ++i)
        items += line(givePicture(u"pic%1.jpg"_s.arg(i)));
    Form2& page = openWith(items);
    machine.pump.onPump = [&] {
        if (page.controls().Label17.text == u"3"_s)
            page.Command7_Click();
    };
    page.Command3_Click();
    EXPECT_TRUE(chain.hasEnded());
    EXPECT_LT(printFiles().size(), 5);
    EXPECT_FALSE(machine.files.fileExists(logPath()));
    EXPECT_FALSE(machine.files.fileExists(u"C:\\vedron\\mispar.txt"_path)) << "an abandoned order burns no number";
}

TEST_F(PreparingAPlainOrder, leavesTheNumberAndTheFilesOfUnfinishedOrders) {
    // One was given up today, one yesterday, before the counter was written.
    const DrivePath unfinished[] = {folder(), u"C:\\2000lumora\\!!000\\2026_11_20_KUP_1234^106"_path};
    for (const DrivePath& left : unfinished) {
        makeFolder(left);
        ASSERT_TRUE(machine.files.writeWhole(left / u"9 1015GNB0009_0161.jpp", "old"));
    }
    const QString picture = line(givePicture(u"one.jpg"_s));
    openWith({picture}).Command6_Click();
    EXPECT_EQ(printFiles(u"107"_s), QStringList(u"1 1015GNB0000_016F6E65.jpp"_s));
    for (const DrivePath& left : unfinished)
        EXPECT_EQ(machine.files.names(left, u"*"_s), QStringList(u"9 1015GNB0009_0161.jpp"_s))
            << qPrintable(left.text());
}

TEST_F(PreparingAPlainOrder, namesWhatItLeavesOutAndGoesOnWithoutItOrBackToThePictures) {
    registerBare({PageId::kyoskNew});
    const QString good = line(givePicture(u"good.jpg"_s)), bad = line(giveFile(u"bad.jpg"_s, "no picture"));
    const QStringList mixed = {good, bad, line(u"C:\\pics\\caf?.jpg"_s), line(u"C:\\pics\\gone.jpg"_s),
                               line(u"C:\\x.png"_s)};
    const QString named = u"x.png: סיומת הקובץ אינה jpg או JPG|bad.jpg: לא ניתן לקרוא את הקובץ|"
                          u"caf?.jpg: בשם הקובץ יש אות שאינה נתמכת|gone.jpg: הקובץ לא נמצא"_s;
    enum class Answer { None, GoOn, Back };
    const struct {
        bool careful, station;
        QStringList items;
        QString named;
        Answer answer;
        PageId front;
        bool counted;
        int leftOut;
    } cases[] = {{false, false, mixed, {}, Answer::None, PageId::FtpFrm, true, 4}, // the sending page asks
                 {true, false, mixed, {}, Answer::None, PageId::FtpFrm, true, 4},
                 {false, true, {good}, {}, Answer::None, PageId::hatchala, true, 0},
                 {false, true, mixed, named, Answer::GoOn, PageId::hatchala, true, 4},
                 {false, true, mixed, named, Answer::Back, PageId::kyoskNew, true, 0},
                 {false, false, {bad}, {}, Answer::None, PageId::FtpFrm, true, 1},
                 {true, false, {bad}, named.section(u'|', 1, 1), Answer::Back, PageId::kyoskNew, false, 0},
                 {true, false, {bad}, named.section(u'|', 1, 1), Answer::GoOn, PageId::Form2, false, 1}};
    for (const auto& c : cases) {
        SCOPED_TRACE(&c - cases);
        state.Careful = c.careful;
        state.TachanaMekomit = c.station;
        state.handOver.basket = c.items;
        state.handOver.details = state.shemot;
        Form2& page = openWith(c.items);
        page.setTexts();
        page.Command3_Click();
        if (front() == PageId::Form2) {
            const LeftOutControls& shown = page.controls().leftOut;
            EXPECT_TRUE(shown.Pic4Hasserot.visible);
            QStringList told;
            for (int i = 0; i < shown.List4Hasserot.count(); ++i)
                told += shown.List4Hasserot.item(i) + u": "_s + shown.List4Siba.item(i);
            EXPECT_EQ(told.join(u'|'), c.named);
            page.Command3_Click(); // nothing is prepared behind the box
            c.answer == Answer::GoOn ? page.Command4Bli_Click() : page.Command4Hazor_Click();
        }
        EXPECT_EQ(front(), c.front);
        EXPECT_EQ(machine.files.fileExists(u"C:\\vedron\\mispar.txt"_path), c.counted);
        EXPECT_EQ(machine.files.folderExists(folder()), c.answer != Answer::Back);
        EXPECT_EQ(state.transfer.leftOut.size(), c.leftOut);
        EXPECT_EQ(state.handOver.back, c.answer == Answer::Back);
        EXPECT_EQ(state.handOver.kept.leftOut == 4, c.answer == Answer::GoOn && c.station);
        EXPECT_EQ(state.handOver.basket, c.items);
        EXPECT_EQ(state.MisparHazmana, u"105"_s);
        for (const PageId id : {PageId::FtpFrm, PageId::kyoskNew, PageId::hatchala, PageId::Form2})
            chain.unload(id);
        std::filesystem::remove_all(host(folder()));
        std::filesystem::remove(host(u"C:\\vedron\\mispar.txt"_path));
        state.handOver = {};
    }
}

TEST_F(PreparingAPlainOrder, goesToTheFinishedOrdersWhereTheLabHasTheExtraStep) {
    registerBare({PageId::MoogMeret});
    state.TmunatPaar = 1;
    state.Optint = OrderKind::Sequence;
    openWith({line(givePicture(u"one.jpg"_s))}).Command6_Click();
    EXPECT_EQ(front(), PageId::MoogMeret);
    EXPECT_EQ(state.handOver.lines, QStringList(state.transfer.OrderLogBase.text()));
}

class PreparingAnAlbum : public PreparingAPlainOrder {
protected:
    PreparingAnAlbum() {
        state.Optint = OrderKind::Album;
        state.shemot.n1 = state.shemot.n2 = QString();
        state.shemot.ppr = u"30/60"_s;
        state.album.ShemZalam = u"סטודיו אור"_s;
        state.album.GodelLBM = u"30/60"_s;
    }
    static QString albumLine(const QString& path, const QString& copies = u"1 "_s) {
        return copies + u"3060MNB"_s + path;
    }
};

TEST_F(PreparingAnAlbum, drawsItsOwnSheetWithTheContactSheetBelow) {
    openWith({albumLine(givePicture(u"one.jpg"_s))}).Command6_Click();
    const Bitmap sheet = take(loadPicture(host(folder() / u"!105_1234.jpp")));
    const QColor ground(220, 220, 150);
    for (const auto& [at, wanted] : {std::pair(QPoint(490, 470), ground),
                                     {QPoint(5 + 40, 80 + 282 + 30), QColor(Qt::red)}, // row 1, column 0
                                     {QPoint(5 + 2 * 82 + 40, 80 + 282 + 30), ground}}) {
        const QColor found = sheet.image().pixelColor(at);
        EXPECT_LE(std::abs(found.red() - wanted.red()), 8) << at.x();
        EXPECT_LE(std::abs(found.blue() - wanted.blue()), 8) << at.x();
    }
}

TEST_F(PreparingAnAlbum, holdsTogetherForWhoReadsTheFolder) {
    for (const int marked : {0, 1}) {
        state.transfer.HazmanaP = static_cast<std::int16_t>(marked);
        const QString number = marked == 1 ? u"105P"_s : u"105"_s;
        openWith({albumLine(givePicture(u"one.jpg"_s), u"2 "_s), albumLine(giveFile(u"bad.jpg"_s, "no picture"))})
            .Command6_Click();
        EXPECT_TRUE(read(logPath(number)).contains("KUP_1234^105\"")) << "never with the P";
        chain.unload(PageId::FtpFrm);
        const OrderFindings report = take(checkOrderFolder(host(folder(number)), PrintFileShape::of(state.profile)));
        EXPECT_EQ(report.faults.join(u'|'), QString());
        EXPECT_EQ(report.copies, 3);
    }
}

} // namespace
} // namespace lumora
