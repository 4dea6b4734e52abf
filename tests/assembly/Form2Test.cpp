#include "PlainOrder.h"

#include "assembly/OrderCheck.h"
#include "assembly/PaperResize.h"
#include "common/AnsiCodePage.h"

#include <QCoreApplication>
#include <QCryptographicHash>
#include <QDeadlineTimer>

namespace lumora {
namespace {

TEST_F(PreparingAPlainOrder, writesTheLogThatTheLabExpectsToTheByte) {
    givePicture(QStringLiteral("IMG_0012.jpg"));
    giveFile(QStringLiteral("IMG_0013.jpg"), "no picture");
    openWith({line(QStringLiteral("C:\\pics\\IMG_0012.jpg"), QStringLiteral("12")),
              line(QStringLiteral("C:\\pics\\IMG_0013.jpg"))})
        .Command6_Click();

    const Result<QByteArray> log = machine.files.read(logPath());
    ASSERT_TRUE(log);
    EXPECT_EQ(log->count('\n'), 35);
    EXPECT_EQ(log->size(), 900);
    EXPECT_EQ(QCryptographicHash::hash(*log, QCryptographicHash::Sha256).toHex().left(16), "445c4828f7ea94f5")
        << log->constData();
}

TEST_F(PreparingAPlainOrder, makesTheWholeFolderAndHandsItToTheSender) {
    const QString portrait = givePicture(QStringLiteral("תמונה 01.jpg"), 1500, 2000);
    const QString small = givePicture(QStringLiteral("small.JPG"));
    openWith({line(portrait, QStringLiteral("12")), line(small)}).Command3_Click();

    EXPECT_EQ(machine.files.names(folder(), QStringLiteral("*.*")),
              QStringList({QStringLiteral("!105_1234.jpp"), QStringLiteral("1 1015GNB0001_01736D616C6C.jpp"),
                           QStringLiteral("121015GNB0000_01FAEEE5F0E4203031.jpp"),
                           QStringLiteral("2026_11_21_KUP_1234^105.txt")}));
    const Result<PrintFileContent> print = unpacked(QStringLiteral("121015GNB0000_01FAEEE5F0E4203031.jpp"));
    ASSERT_TRUE(print);
    EXPECT_EQ(print->picture, *resizeToPaper(*machine.drives.toHost(portrait), {10, 15}));
    EXPECT_EQ(print->tail, "1 1 03-1234567Dana Levi 13 1051234      ");
    ASSERT_TRUE(giveFile(QStringLiteral("print.jpg"), print->picture).size() > 0);
    EXPECT_EQ(*readPictureSize(*machine.drives.toHost(QStringLiteral("C:\\pics\\print.jpg"))),
              (PictureSize{1200, 1600}));
    EXPECT_EQ(*readPictureSize(*machine.drives.toHost(folder() + QStringLiteral("\\!105_1234.jpp"))),
              (PictureSize{500, 480}));

    EXPECT_EQ(*machine.files.read(QStringLiteral("C:\\vedron\\mispar.txt")), "106\r\n");
    EXPECT_EQ(state.MisparHazmana, QStringLiteral("105")) << "the number in memory stays this order's";
    EXPECT_EQ(state.shemot.TotalPics, 13);
    EXPECT_EQ(state.transfer.OrderFolder, folder());
    EXPECT_EQ(state.transfer.OrderLogBase + QStringLiteral(".txt"), logPath());
    EXPECT_EQ(state.transfer.SugMishloah, 0) << "a resend before does not leak into a new order";
    EXPECT_TRUE(machine.files.fileExists(QStringLiteral("C:\\2000lumora\\!!000\\^^^.jpg")))
        << "stays for the next step to replace";
    EXPECT_EQ(front(), PageId::FtpFrm);
    EXPECT_EQ(chain.find(PageId::Form2), nullptr);
    EXPECT_TRUE(machine.dialogs.messages.isEmpty()) << machine.dialogs.messages.join(u'|').toStdString();
}

TEST_F(PreparingAPlainOrder, startsByItselfOnceItIsShownIfThePageBeforeAsksForIt) {
    state.handOver.pressStart = true;
    Form2& page = openWith({line(givePicture(QStringLiteral("IMG_1.jpg")))});
    EXPECT_FALSE(page.preparing) << "painted first";
    for (const QDeadlineTimer limit(20000); front() != PageId::FtpFrm && !limit.hasExpired();)
        QCoreApplication::processEvents();
    EXPECT_EQ(front(), PageId::FtpFrm);
    EXPECT_EQ(printFiles().size(), 1);
}

TEST_F(PreparingAPlainOrder, neverPrintsADamagedPictureAsTheOneBeforeIt) {
    for (const int deep : {0, 1}) {
        state.DchisaAmoka = static_cast<std::int16_t>(deep);
        state.MisparHazmana = QString::number(200 + deep);
        const QString first = givePicture(QStringLiteral("first.jpg"), 40, 30, Qt::red);
        const QString third = givePicture(QStringLiteral("third.jpg"), 40, 30, Qt::blue);
        QByteArray cutShort = *encodeJpeg(noisyPicture(60, 60, 1), 90);
        cutShort.truncate(cutShort.size() / 2);
        // What is copied as it is fails only where there is nothing to copy.
        const QString nothing = QStringLiteral("C:\\pics\\nothing.jpg");
        makeFolder(nothing);
        const QString second = deep == 1 ? nothing : giveFile(QStringLiteral("second.jpg"), cutShort);
        Form2& page = openWith({line(first), line(second), line(third)});
        const TextList& failed = page.List4fail;
        page.Command6_Click();

        const QString number = state.MisparHazmana;
        EXPECT_EQ(failed.items(), QStringList(second));
        EXPECT_TRUE(machine.dialogs.messages.isEmpty()) << "the order's own files are all written";
        ASSERT_EQ(printFiles(number), QStringList({QStringLiteral("1 1015GNB0000_016669727374.jpp"),
                                                   QStringLiteral("1 1015GNB0002_017468697264.jpp")}))
            << "the failed picture leaves a hole in the numbers";
        EXPECT_NE(unpacked(printFiles(number)[0], number)->picture, unpacked(printFiles(number)[1], number)->picture);
        const QByteArray log = *machine.files.read(logPath(number));
        EXPECT_TRUE(log.contains("\"-----------Total Failed\",\"1-----------\"\r\n"));
        EXPECT_TRUE(log.contains("\"More Comp = \"," + QByteArray::number(deep) + "\r\n"));
        EXPECT_EQ(front(), PageId::FtpFrm) << "one failed picture never stops an order";
        chain.unload(PageId::FtpFrm);
    }
}

TEST_F(PreparingAPlainOrder, copiesThePictureAsItIsWhenCompressionIsDeep) {
    state.DchisaAmoka = 1;
    const QByteArray original = *encodeJpeg(noisyPicture(301, 200, 7), 95);
    openWith({line(giveFile(QStringLiteral("large.jpg"), original))}).Command6_Click();
    ASSERT_EQ(printFiles().size(), 1);
    EXPECT_EQ(unpacked(printFiles()[0])->picture, original);
}

TEST_F(PreparingAPlainOrder, skipsShortNamesInSilenceAndFailsNamesOutsideTheCodePage) {
    const QString good = givePicture(QStringLiteral("abcde.jpg"));
    const QString tooShort = givePicture(QStringLiteral("ajpg"));
    const QString unknown = QStringLiteral("C:\\pics\\????.jpg");
    Form2& page = openWith({line(tooShort, QStringLiteral("5 ")), line(unknown, QStringLiteral("2 ")), line(good)});
    const TextList& failed = page.List4fail;
    page.Command6_Click();
    EXPECT_EQ(failed.items(), QStringList(unknown));
    EXPECT_EQ(printFiles(), QStringList(QStringLiteral("1 1015GNB0002_016162636465.jpp")));
    EXPECT_EQ(state.shemot.TotalPics, 8) << "skipped names count";
}

TEST_F(PreparingAPlainOrder, dropsWhatIsNoJpegInTwoWalksThatPassOverTheItemBehindARemovedOne) {
    const QString jpg = line(givePicture(QStringLiteral("a1.jpg")));
    const auto other = [](int i) { return line(QStringLiteral("C:\\pics\\x%1.png").arg(i)); };
    Form2& page = openWith({other(1), other(2), other(3), other(4), other(5), jpg});
    const TextList& left = page.List1;
    const TextList& removed = page.List4removed;
    page.Command3_Click();
    EXPECT_EQ(left.items(), QStringList({other(4), jpg}));
    EXPECT_EQ(removed.count(), 4);
    EXPECT_EQ(printFiles(), QStringList(QStringLiteral("1 1015GNB0001_016131.jpp")));
}

TEST_F(PreparingAPlainOrder, saysSoWhenNothingIsLeftAndTakesNoNumber) {
    Form2& page = openWith({});
    page.Command6_Click();
    EXPECT_EQ(machine.dialogs.messages, QStringList(QStringLiteral("לא נבחרו תמונות")));
    page.List1.append(QStringList({line(QStringLiteral("C:\\pics\\a.txt")), line(QStringLiteral("C:\\pics\\b.Jpg"))}));
    page.Command3_Click();
    EXPECT_EQ(machine.dialogs.messages.size(), 2) << "empty only in the second walk";
    EXPECT_FALSE(machine.files.fileExists(QStringLiteral("C:\\vedron\\mispar.txt")));
    EXPECT_FALSE(machine.files.folderExists(folder()));
    EXPECT_FALSE(page.preparing);
    EXPECT_TRUE(page.Command3.enabled);
}

TEST_F(PreparingAPlainOrder, takesNoSecondPressAndNoRemovalWhileItPrepares) {
    Form2& page =
        openWith({line(givePicture(QStringLiteral("one.jpg"))), line(givePicture(QStringLiteral("two.jpg")))});
    bool enabledMeanwhile = false;
    machine.pump.onPump = [&] {
        enabledMeanwhile = enabledMeanwhile || page.Command1.enabled || page.Command3.enabled || page.Command6.enabled;
        page.Command3_Click();
        page.Command6_Click();
        page.Command1_Click();
    };
    page.Command3_Click();
    machine.pump.onPump = {};
    page.Command6_Click();
    EXPECT_FALSE(enabledMeanwhile);
    EXPECT_EQ(printFiles().size(), 2);
    EXPECT_FALSE(machine.files.folderExists(folder(QStringLiteral("106"))));
    EXPECT_EQ(*machine.files.read(QStringLiteral("C:\\vedron\\mispar.txt")), "106\r\n");
}

TEST_F(PreparingAPlainOrder, endsTheProgramAtOnceWhenTheCustomerLeaves) {
    QStringList items;
    for (int i = 0; i < 8; ++i)
        items += line(givePicture(QStringLiteral("pic%1.jpg").arg(i)));
    Form2& page = openWith(items);
    machine.pump.onPump = [&] {
        if (page.Label17.text == QStringLiteral("3"))
            page.Command7_Click();
    };
    page.Command3_Click();
    EXPECT_TRUE(chain.hasEnded());
    EXPECT_LT(printFiles().size(), 5);
    EXPECT_FALSE(machine.files.fileExists(logPath()));
    EXPECT_FALSE(machine.files.fileExists(QStringLiteral("C:\\vedron\\mispar.txt")))
        << "an abandoned order burns no number";
}

TEST_F(PreparingAPlainOrder, clearsTheFolderOfAnAbandonedOrderAndNeverJoinsAFinishedOne) {
    makeFolder(folder());
    ASSERT_TRUE(machine.files.writeWhole(folder() + QStringLiteral("\\9 1015GNB0009_0161.jpp"), "old"));
    const QString picture = line(givePicture(QStringLiteral("one.jpg")));
    openWith({picture}).Command6_Click();
    EXPECT_EQ(printFiles(), QStringList(QStringLiteral("1 1015GNB0000_016F6E65.jpp")));

    // The counter is lost, and the number comes again.
    const QByteArray finished = *machine.files.read(logPath());
    chain.unload(PageId::FtpFrm);
    state.MisparHazmana = QStringLiteral("105");
    openWith({picture, picture}).Command6_Click();
    EXPECT_EQ(state.MisparHazmana, QStringLiteral("106"));
    EXPECT_EQ(printFiles().size(), 1);
    EXPECT_EQ(*machine.files.read(logPath()), finished);
    EXPECT_EQ(printFiles(QStringLiteral("106")).size(), 2);
    EXPECT_TRUE(machine.files.fileExists(folder(QStringLiteral("106")) + QStringLiteral("\\!106_1234.jpp")));
    EXPECT_TRUE(machine.files.read(logPath(QStringLiteral("106")))->contains("KUP_1234^106\""));
    EXPECT_EQ(*machine.files.read(QStringLiteral("C:\\vedron\\mispar.txt")), "107\r\n");
}

TEST_F(PreparingAPlainOrder, marksTheFolderOfAReopenedOrder) {
    state.transfer.HazmanaP = 1;
    openWith({line(givePicture(QStringLiteral("one.jpg")))}).Command6_Click();
    EXPECT_EQ(printFiles(QStringLiteral("105P")).size(), 1);
    EXPECT_TRUE(machine.files.fileExists(logPath(QStringLiteral("105P"))));
    EXPECT_TRUE(machine.files.fileExists(folder(QStringLiteral("105P")) + QStringLiteral("\\!105_1234.jpp")));
}

TEST_F(PreparingAPlainOrder, keepsTheOrderAtALocalStationAndTellsItsNumberOnTheStartPage) {
    state.TachanaMekomit = true;
    openWith({line(givePicture(QStringLiteral("one.jpg")))}).Command6_Click();
    EXPECT_EQ(front(), PageId::hatchala);
    EXPECT_TRUE(state.handOver.notice.contains(QStringLiteral("105")));
    EXPECT_TRUE(machine.files.fileExists(logPath()));
}

TEST_F(PreparingAPlainOrder, goesToTheFinishedOrdersWhereTheLabHasTheExtraStep) {
    chain.registerPage(PageId::MoogMeret, [] { return std::make_unique<Page>(PageId::MoogMeret); });
    state.TmunatPaar = 1;
    state.Optint = 3;
    openWith({line(givePicture(QStringLiteral("one.jpg")))}).Command6_Click();
    EXPECT_EQ(front(), PageId::MoogMeret);
    EXPECT_EQ(state.handOver.lines, QStringList(state.transfer.OrderLogBase));
}

TEST_F(PreparingAPlainOrder, tellsOfAPrintFileThatCanNotBeWrittenAndGoesOn) {
    const QString one = givePicture(QStringLiteral("one.jpg"));
    makeFolder(folder() + QStringLiteral("\\1 1015GNB0000_016F6E65.jpp"));
    Form2& page = openWith({line(one), line(givePicture(QStringLiteral("two.jpg")))});
    const TextList& failed = page.List4fail;
    page.Command6_Click();
    EXPECT_EQ(failed.items(), QStringList(one));
    ASSERT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_TRUE(machine.dialogs.messages[0].contains(QStringLiteral("1 1015GNB0000_016F6E65.jpp")));
    EXPECT_EQ(printFiles().size(), 1);
    EXPECT_EQ(front(), PageId::FtpFrm);
}

TEST_F(PreparingAPlainOrder, goesOnWithoutTheCounterButNotWithoutTheLog) {
    makeFolder(QStringLiteral("C:\\vedron\\mispar.txt"));
    makeFolder(logPath());
    Form2& page =
        openWith({line(givePicture(QStringLiteral("one.jpg"))), line(givePicture(QStringLiteral("two.jpg")))});
    page.Command6_Click();
    ASSERT_EQ(machine.dialogs.messages.size(), 2);
    EXPECT_TRUE(machine.dialogs.messages[0].contains(QStringLiteral("mispar.txt")));
    EXPECT_TRUE(machine.dialogs.messages[1].contains(QStringLiteral("KUP_1234^105.txt")));
    EXPECT_EQ(front(), PageId::Form2);
    EXPECT_EQ(printFiles().size(), 2) << "what was prepared is kept";

    std::filesystem::remove(*machine.drives.toHost(logPath()));
    page.Command3_Click();
    EXPECT_EQ(front(), PageId::FtpFrm);
    EXPECT_EQ(state.MisparHazmana, QStringLiteral("105")) << "the same number at the next press";
    EXPECT_EQ(printFiles().size(), 2);
}

TEST_F(PreparingAPlainOrder, saysItsTextsInTheLanguageOfTheSession) {
    Form2& page = openWith({line(givePicture(QStringLiteral("one.jpg")))});
    EXPECT_EQ(page.Label10.text, QStringLiteral("אל תמחק אותם עד אשר תקבל את התמונות מודפסות"));
    state.EnglishTips = 1;
    page.setTexts();
    for (const Caption* caption : {&page.Label1, &page.Label4Progress, &page.Label4fail, &page.Label4removed,
                                   &page.Label6, &page.Label10, &page.Command1, &page.Command3, &page.Command4,
                                   &page.Command5, &page.Command6, &page.Command7, &page.Command8, &page.Picture5}) {
        EXPECT_FALSE(caption->text.isEmpty());
        for (const QChar letter : caption->text)
            EXPECT_NE(letter.script(), QChar::Script_Hebrew) << caption->text.toStdString();
    }
}

class PreparingAnAlbum : public PreparingAPlainOrder {
protected:
    PreparingAnAlbum() {
        state.Optint = 10;
        state.DchisaAmoka = 1;
        state.shemot.n1 = state.shemot.n2 = QString();
        state.shemot.ppr = QStringLiteral("30/60");
        state.shemot.maat = QStringLiteral("M");
        state.shemot.FillFit = QStringLiteral("FFF");
        AlbumDetails& album = state.album;
        album.ShemZalam = QStringLiteral("סטודיו אור");
        album.ShemErooa = QStringLiteral("Wedding");
        album.TelZalam = QStringLiteral("03-7654321");
        album.MailZalam = QStringLiteral("studio@example.com");
        album.SoogLBM = QStringLiteral("פוטו גדול");
        album.SoogKricha = QStringLiteral("חום");
        album.SoogNiar = QStringLiteral("בחר סוג נייר");
        album.Tosafot1[0] = QStringLiteral("קנבס");
        album.Tosafot2 = {QStringLiteral("עוד=0"),          QStringLiteral("הטבעת שם בכריכה=0"),
                          QStringLiteral("פינות עגולות=1"), QStringLiteral("מזוודה=0"),
                          QStringLiteral("סובלימציה=0"),    QStringLiteral("פתיחה אנגלית=0")};
        album.GodelLBM = QStringLiteral("30/60");
        album.KamutHorim = QStringLiteral("2");
        album.SoogHorim = QStringLiteral("30/60");
    }
    static QString albumLine(const QString& path, const QString& copies = QStringLiteral("1 ")) {
        return copies + QStringLiteral("3060MNB") + path;
    }
};

TEST_F(PreparingAnAlbum, writesTheLogThatTheLabExpectsToTheByte) {
    openWith({albumLine(givePicture(QStringLiteral("one.jpg")), QStringLiteral("2 ")),
              albumLine(givePicture(QStringLiteral("two.jpg")))})
        .Command6_Click();
    QString wanted = QStringLiteral(R"("00","00"
"00","00"
"KeSherLaSharat","0"
"HitKasherDerech",""
"TaooyotBaHaShvaa",0
"------------","---------"
"Girsa","4.00"
"Time",#2026-11-21 14:05:09#
"Hazmana","2026_11_21_KUP_1234^105"
"Optint",10
"ser","1234"
"TotalPics",3
"GodelLBM","30/60"
"Hearot",""
"MailZalam","studio@example.com"
"ShemErooa","Wedding"
"ShemZalam","סטודיו אור"
"SoogKricha","חום"
"SoogLBM","פוטו גדול"
"SoogNiar","בחר סוג נייר"
"Tosafot1_1","קנבס"
"Tosafot1_2",""
"Tosafot1_3",""
"Tosafot1_4",""
"Tosafot2_1","עוד=0"
"Tosafot2_2","הטבעת שם בכריכה=0"
"Tosafot2_3","פינות עגולות=1"
"Tosafot2_4","מזוודה=0"
"Tosafot2_5","סובלימציה=0"
"Tosafot2_6","פתיחה אנגלית=0"
"Tosafot2_7",""
"Tosafot2_8",""
"More Comp = ",1
"***","*********************************************"
"-----------Total Failed","0-----------"
" "
" "
"-----------End","Of Failed List-------------"
" "
"-----------","------------------------------"
" "
"Shoora","2 3060MNBC:\pics\one.jpg"
"Shoora","1 3060MNBC:\pics\two.jpg"
)");
    wanted.replace(QStringLiteral("\n"), QStringLiteral("\r\n"));
    EXPECT_EQ(AnsiCodePage::decode(*machine.files.read(logPath())), wanted);
    EXPECT_EQ(machine.files.read(logPath())->size(), wanted.size()) << "a byte a character";
    EXPECT_EQ(printFiles(), QStringList({QStringLiteral("1 3060MNB0001_1074776F.jpp"),
                                         QStringLiteral("2 3060MNB0000_106F6E65.jpp")}));
}

TEST_F(PreparingAnAlbum, drawsItsOwnSheetWithTheContactSheetBelow) {
    openWith({albumLine(givePicture(QStringLiteral("one.jpg")))}).Command6_Click();
    const Result<Bitmap> sheet = loadPicture(*machine.drives.toHost(folder() + QStringLiteral("\\!105_1234.jpp")));
    ASSERT_TRUE(sheet);
    const auto near = [&](QPoint at, QColor wanted) {
        const QColor found = sheet->image().pixelColor(at);
        EXPECT_NEAR(found.red(), wanted.red(), 8);
        EXPECT_NEAR(found.green(), wanted.green(), 8);
        EXPECT_NEAR(found.blue(), wanted.blue(), 8);
    };
    near({490, 470}, {220, 220, 150});
    near({5 + 40, 80 + 282 + 30}, Qt::red); // row 1, column 0: the picture
    near({5 + 2 * 82 + 40, 80 + 282 + 30}, {220, 220, 150});
}

TEST_F(PreparingAnAlbum, sizesItsPicturesToTheAlbumUnlessTheyAreCompressedDeeply) {
    for (const int deep : {0, 1}) {
        state.DchisaAmoka = static_cast<std::int16_t>(deep);
        state.shemot.ppr = QStringLiteral("02/04");
        const QString source = givePicture(QStringLiteral("one.jpg"), 960, 640);
        openWith({albumLine(source)}).Command6_Click();
        const Result<PrintFileContent> print = unpacked(QStringLiteral("1 3060MNB0000_106F6E65.jpp"));
        ASSERT_TRUE(print);
        giveFile(QStringLiteral("print.jpg"), print->picture);
        EXPECT_EQ(*readPictureSize(*machine.drives.toHost(QStringLiteral("C:\\pics\\print.jpg"))),
                  deep == 1 ? (PictureSize{960, 640}) : (PictureSize{480, 320}));
        EXPECT_EQ(print->tail, "1 1                     1  1051234      ") << "the customer's fields are empty";
        std::filesystem::remove_all(*machine.drives.toHost(folder()));
        chain.unload(PageId::FtpFrm);
        state.MisparHazmana = QStringLiteral("105");
    }
}

TEST_F(PreparingAnAlbum, holdsTogetherForWhoReadsTheFolder) {
    state.DchisaAmoka = 0; // a copied file is not looked at
    for (const int marked : {0, 1}) {
        state.transfer.HazmanaP = static_cast<std::int16_t>(marked);
        const QString number = marked == 1 ? QStringLiteral("105P") : QStringLiteral("105");
        openWith({albumLine(givePicture(QStringLiteral("one.jpg")), QStringLiteral("2 ")),
                  albumLine(giveFile(QStringLiteral("bad.jpg"), "no picture"))})
            .Command6_Click();
        EXPECT_TRUE(machine.files.read(logPath(number))->contains("KUP_1234^105\"")) << "never with the P";
        chain.unload(PageId::FtpFrm);
        const Result<OrderFindings> report =
            checkOrderFolder(*machine.drives.toHost(folder(number)), PrintFileShape::of(state.profile));
        ASSERT_TRUE(report);
        EXPECT_EQ(report->faults.join(u'|'), QString());
        EXPECT_EQ(report->copies, 3);
    }
}

} // namespace
} // namespace lumora
