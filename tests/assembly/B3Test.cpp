#include "EditedOrder.h"

#include "assembly/OrderCheck.h"
#include "editing/EditedPicture.h"
#include "support/SmallDisk.h"

#include <QCoreApplication>
#include <QCryptographicHash>
#include <QDeadlineTimer>
#include <QPainter>

namespace lumora {
namespace {

TEST_F(PreparingAnEditedOrder, writesTheLogThatTheLabExpectsToTheByte) {
    const QString newPicture = EditRecord::newPicture();
    givePicture(QStringLiteral("IMG_0012.jpg"));
    giveFile(QStringLiteral("IMG_0013.jpg"), "no picture");
    prepare({edited(QStringLiteral("C:\\pics\\IMG_0012.jpg"), newPicture, QStringLiteral("12")),
             edited(QStringLiteral("C:\\pics\\IMG_0013.jpg"), newPicture)});

    const Result<QByteArray> log = machine.files.read(logPath());
    ASSERT_TRUE(log);
    EXPECT_EQ(log->count('\n'), 28);
    EXPECT_EQ(log->size(), 1220);
    EXPECT_EQ(QCryptographicHash::hash(*log, QCryptographicHash::Sha256).toHex().left(16), "a9e4f5e707d207c7")
        << log->constData();
}

TEST_F(PreparingAnEditedOrder, makesTheWholeFolderAndHandsItToTheSender) {
    state.SugTzad = 60;
    state.transfer.HazmanaP = 1;
    const QString portrait = givePicture(QStringLiteral("תמונה 01.jpg"), 300, 400, Qt::darkCyan);
    const QString other = givePicture(QStringLiteral("small.JPG"));
    const QString edits = record({{EditRecord::GainR, QStringLiteral("1.3")},
                                  {EditRecord::RotationCode, QStringLiteral("195")},
                                  {EditRecord::ZoomPercent, QStringLiteral("80")},
                                  {EditRecord::TextOn, QStringLiteral("1")},
                                  {EditRecord::TextX, QStringLiteral("40")},
                                  {EditRecord::TextY, QStringLiteral("50")},
                                  {EditRecord::TextBody, QStringLiteral("שלום \"2026\"")}});
    prepare({edited(portrait, edits, QStringLiteral("12")), edited(other)});

    EXPECT_EQ(machine.files.names(folder(), QStringLiteral("*.*")),
              QStringList({QStringLiteral("!105_1234.jpp"), QStringLiteral("1 1015GNB0001_02736D616C6C.jpp"),
                           QStringLiteral("121015GNB0000_02FAEEE5F0E4203031.jpp"),
                           QStringLiteral("2026_11_21_KUP_1234^105.txt")}));
    const Result<PrintFileContent> content = unpacked(QStringLiteral("121015GNB0000_02FAEEE5F0E4203031.jpp"));
    ASSERT_TRUE(content);
    EXPECT_EQ(content->tail, "1 1 03-1234567Dana Levi 13 1051234      ") << "the short tail, whatever SugTzad says";
    EditFields fields;
    UnpackEditState(edits, fields);
    EditedPrint request;
    request.file = *machine.drives.toHost(portrait);
    request.paper = {10, 15};
    EXPECT_EQ(content->picture, *renderEditedPrintToJpeg(request, fields));

    EXPECT_EQ(*readPictureSize(*machine.drives.toHost(folder() + QStringLiteral("\\!105_1234.jpp"))),
              (PictureSize{450, 580}));
    EXPECT_EQ(machine.files.names(jobFolder, QStringLiteral("*.*")),
              QStringList({QStringLiteral("1 ~small.bmp"), QStringLiteral("12~תמונה 01.bmp")}));
    EXPECT_EQ(*readPictureSize(*machine.drives.toHost(jobFolder + QStringLiteral("\\12~תמונה 01.bmp"))),
              (PictureSize{300, 450}));
    EXPECT_FALSE(exists(QStringLiteral("C:\\2000lumora\\!!000\\^^^.jpg"))) << "goes at the end of each step";
    EXPECT_EQ(*machine.files.read(QStringLiteral("C:\\vedron\\mispar.txt")), "106\r\n");
    EXPECT_EQ(state.transfer.OrderLogBase + QStringLiteral(".txt"), logPath());
    EXPECT_EQ(front(), PageId::FtpFrm);
    EXPECT_EQ(chain.find(PageId::B3), nullptr);
    EXPECT_TRUE(machine.dialogs.messages.isEmpty()) << machine.dialogs.messages.join(u'|').toStdString();
    const Result<OrderFindings> report = checkOrderFolder(*machine.drives.toHost(folder()), {56, 30});
    ASSERT_TRUE(report);
    EXPECT_EQ(report->faults, QStringList());
    EXPECT_EQ(report->prints, 2);
}

TEST_F(PreparingAnEditedOrder, startsOnceByItselfTwoSecondsAfterItIsShown) {
    B3& page = open({edited(givePicture(QStringLiteral("IMG_1.jpg")))});
    EXPECT_EQ(page.Timer2.interval(), 2000);
    page.Timer2.setInterval(1);
    for (const QDeadlineTimer limit(20000); front() != PageId::FtpFrm && !limit.hasExpired();)
        QCoreApplication::processEvents();
    EXPECT_EQ(front(), PageId::FtpFrm);
    EXPECT_EQ(printFiles().size(), 1);
}

// Flat pictures, so that one pixel tells which picture was printed and in which colours.
TEST_F(PreparingAnEditedOrder, printsTonesAndCorrectionsEachFromItsOwnPicture) {
    const QColor first(200, 80, 20), second(20, 160, 120), fixed(60, 60, 200);
    const auto grey = [](QColor colour) {
        const int level = 3 * (colour.red() + colour.green() + colour.blue()) / 10;
        return QColor(level, level, level);
    };
    const QStringList paths = {givePicture(QStringLiteral("plain1.jpg"), 40, 30, first),
                               givePicture(QStringLiteral("toned2.jpg"), 40, 30, second),
                               givePicture(QStringLiteral("fixed3.jpg"), 40, 30, first),
                               givePicture(QStringLiteral("both_4.jpg"), 40, 30, first),
                               givePicture(QStringLiteral("toned5.jpg"), 40, 30, first),
                               givePicture(QStringLiteral("sepia6.jpg"), 40, 30, first)};
    giveCorrected(paths[2], second);
    giveCorrected(paths[3], fixed);
    const Changes sepia = toned + Changes{{EditRecord::GainB, QStringLiteral("0.5")}};
    const QStringList failed =
        prepare({edited(paths[0]), edited(paths[1], record(toned)), edited(paths[2], record(redEyesCorrected)),
                 edited(paths[3], record(both)), edited(paths[4], record(toned)), edited(paths[5], record(sepia))});
    EXPECT_EQ(failed, QStringList());
    const QPoint middle(750, 500);
    expectColour(print(0), middle, first);
    expectColour(print(1), middle, grey(second));
    expectColour(print(2), middle, second);
    expectColour(print(3), middle, grey(fixed));
    expectColour(print(4), middle, grey(first));
    expectColour(print(5), middle, {grey(first).red(), grey(first).green(), grey(first).blue() / 2});

    // The last picture's copy; the corrected picture's is found under its own name too.
    const auto copyOf = [this](const QString& path) { return loadPicture(*machine.drives.toHost(path)); };
    ASSERT_TRUE(copyOf(bw));
    EXPECT_EQ(copyOf(bw)->width(), 40) << "the size of the picture";
    expectColour(copyOf(bw)->image(), {20, 15}, grey(first));
    ASSERT_TRUE(copyOf(correctedPath(bw)));
    expectColour(copyOf(correctedPath(bw))->image(), {20, 15}, grey(fixed));
    EXPECT_EQ(machine.files.names(QStringLiteral("C:\\2000lumora"), QStringLiteral("*.bmp")),
              QStringList(QStringLiteral("bw.bmp")));
}

TEST_F(PreparingAnEditedOrder, neverPrintsOnePictureAsAnother) {
    const QString good = givePicture(QStringLiteral("toned1.jpg"), 40, 30, Qt::green);
    const QString damaged = giveFile(QStringLiteral("damaged2.jpg"), "no picture");
    const QString vanished = givePicture(QStringLiteral("vanished3.jpg"));
    const QString both4 = givePicture(QStringLiteral("both4.jpg"));
    const QString missing = QStringLiteral("C:\\pics\\missing5.jpg");
    const QString unknown = QStringLiteral("C:\\pics\\????.jpg");
    // What an earlier customer's order left behind.
    ASSERT_TRUE(Bitmap(40, 30, Qt::blue).image().save(hostText(bw), "BMP"));
    giveCorrected(bw, Qt::blue);
    makeFolder(folder().left(21));
    giveFile(QStringLiteral("old.jpg"), *encodeJpeg(Bitmap(40, 30, Qt::blue), 90));
    ASSERT_TRUE(
        machine.files.copyFile(QStringLiteral("C:\\pics\\old.jpg"), QStringLiteral("C:\\2000lumora\\!!000\\^^^.jpg")));
    const QStringList failed = prepare({edited(damaged, record(toned)), edited(good, record(toned)),
                                        edited(damaged, record(toned)), edited(vanished, record(redEyesCorrected)),
                                        edited(both4, record(both)), edited(missing), edited(unknown)});
    EXPECT_EQ(failed, QStringList({damaged, damaged, vanished, both4, missing, unknown}));
    EXPECT_EQ(printFiles(), QStringList(QStringLiteral("1 1015GNB0001_02746F6E656431.jpp")))
        << "failed pictures leave holes in the numbers";
    EXPECT_EQ(front(), PageId::FtpFrm) << "a failed picture never stops an order";
    EXPECT_TRUE(machine.dialogs.messages.isEmpty()) << "the order's own files are all written";
    EXPECT_TRUE(machine.files.read(logPath())->contains("\"Failed  \",\"C:\\pics\\vanished3.jpg\"\r\n"));
}

TEST_F(PreparingAnEditedOrder, stretchesAPictureThatWasNeverOpenedToThePaper) {
    Bitmap halves(400, 100, Qt::blue);
    QPainter(&halves.image()).fillRect(0, 0, 200, 100, Qt::red);
    const QString path = giveFile(QStringLiteral("halves.jpg"), *encodeJpeg(halves, 95));
    prepare({edited(path, EditRecord::newPicture())});
    const QImage paper = print(0);
    ASSERT_EQ(paper.size(), QSize(1500, 1000));
    for (const int y : {2, 500, 997}) {
        expectColour(paper, {2, y}, Qt::red);
        expectColour(paper, {700, y}, Qt::red);
        expectColour(paper, {800, y}, Qt::blue);
        expectColour(paper, {1497, y}, Qt::blue);
    }
}

TEST_F(PreparingAnEditedOrder, skipsShortNamesInSilenceAndFailsWhatHasNoPaper) {
    const QString tooShort = givePicture(QStringLiteral("ajpg"));
    const QString good = givePicture(QStringLiteral("abcde.jpg"));
    EXPECT_EQ(prepare({edited(tooShort, record(), QStringLiteral("5 ")), edited(good)}), QStringList());
    EXPECT_EQ(printFiles(), QStringList(QStringLiteral("1 1015GNB0001_026162636465.jpp")));
    EXPECT_EQ(state.shemot.TotalPics, 6) << "skipped names count";

    chain.unload(PageId::FtpFrm);
    state.MisparHazmana = QStringLiteral("106");
    state.shemot.ppr = QStringLiteral("zz/zz");
    EXPECT_EQ(prepare({edited(good)}), QStringList(good));
    EXPECT_TRUE(printFiles(QStringLiteral("106")).isEmpty());
}

TEST_F(PreparingAnEditedOrder, drawsTheSheetFromTheRenderedPrints) {
    // The second picture of the same name and copies takes the first one's thumbnail.
    makeFolder(QStringLiteral("C:\\pics\\more"));
    const QString red = givePicture(QStringLiteral("picture.jpg"), 40, 30, Qt::red);
    const QString green = givePicture(QStringLiteral("more\\picture.jpg"), 40, 30, Qt::green);
    const QString upright = givePicture(QStringLiteral("upright.jpg"), 30, 40, Qt::red);
    const Changes turnedRed = {{EditRecord::GainR, QStringLiteral("0")}};
    prepare({edited(red), edited(green), edited(upright, record(turnedRed))});
    EXPECT_EQ(printFiles().size(), 3);
    const QImage sheet = loadPicture(*machine.drives.toHost(folder() + QStringLiteral("\\!105_1234.jpp")))->image();
    // Cells lie every 82 pixels from 5, the first row at 161; a thumbnail is 80 wide and 53 high, also an upright one.
    expectColour(sheet, {5 + 40, 161 + 26}, Qt::green);
    expectColour(sheet, {87 + 76, 161 + 26}, Qt::black);
    expectColour(sheet, {87 + 40, 161 + 49}, Qt::black);
    expectColour(sheet, {169 + 40, 161 + 26}, Qt::white);
}

TEST_F(PreparingAnEditedOrder, savesTheSheetAsItsReceiverWantsIt) {
    struct Case {
        int sender;
        bool local;
        QStringList sheets;
        bool hasUploadForm;
        PageId front;
        bool notice;
    };
    const QString jpp = QStringLiteral("!%1_1234.jpp"), jpg = QStringLiteral("!%1_1234.jpg");
    const QString picture = edited(givePicture(QStringLiteral("one_1.jpg")));
    int number = 200;
    for (const Case& c :
         {Case{0, false, {jpp}, false, PageId::FtpFrm, false}, Case{0, true, {jpg, jpp}, false, PageId::hatchala, true},
          Case{1, true, {jpg}, false, PageId::hatchala, true}, Case{1, false, {jpg}, false, PageId::hatchala, true},
          Case{1, false, {jpg}, true, PageId::UploadForm, false}}) {
        state.MisparHazmana = QString::number(++number);
        state.transfer.SugSheliach = static_cast<std::int16_t>(c.sender);
        state.TachanaMekomit = c.local;
        state.handOver.notice.clear();
        machine.dialogs.messages.clear();
        if (c.hasUploadForm)
            chain.registerPage(PageId::UploadForm, [] { return std::make_unique<OtherPage>(PageId::UploadForm); });
        prepare({picture});
        QStringList wanted;
        for (const QString& name : c.sheets)
            wanted += name.arg(number);
        const QString place = folder(state.MisparHazmana);
        EXPECT_EQ(machine.files.names(place, QStringLiteral("!*")), wanted) << number;
        EXPECT_EQ(checkOrderFolder(*machine.drives.toHost(place), {56, 30})->faults, QStringList());
        EXPECT_EQ(front(), c.front) << number;
        EXPECT_EQ(state.handOver.notice.contains(state.MisparHazmana), c.notice) << number;
        EXPECT_EQ(machine.dialogs.messages.size(), c.notice && !c.local ? 1 : 0) << "no page to go on with";
        chain.unload(front());
    }
}

TEST_F(PreparingAnEditedOrder, saysSoWhenThereIsNothingToPrepare) {
    B3& page = open({});
    page.Timer2_Tick();
    EXPECT_EQ(machine.dialogs.messages, QStringList(QStringLiteral("לא נבחרו תמונות")));
    EXPECT_FALSE(machine.files.folderExists(folder()));
    EXPECT_FALSE(exists(QStringLiteral("C:\\vedron\\mispar.txt")));
    EXPECT_FALSE(page.preparing);
    EXPECT_TRUE(page.Command5.enabled && page.Command5.visible);
}

TEST_F(PreparingAnEditedOrder, takesNoSecondPressWhileItPreparesAndCountsAfterThePictures) {
    B3& page =
        open({edited(givePicture(QStringLiteral("one_1.jpg"))), edited(givePicture(QStringLiteral("two_2.jpg")))});
    bool countedEarly = false;
    QStringList positions;
    machine.pump.onPump = [&] {
        page.Command5_Click();
        page.Timer2_Tick();
        if (page.Label17.text.isEmpty())
            return;
        countedEarly = countedEarly || exists(QStringLiteral("C:\\vedron\\mispar.txt")) || exists(logPath());
        if (positions.value(positions.size() - 1) != page.Label17.text)
            positions += page.Label17.text;
        EXPECT_EQ(page.List2.currentIndex() + 1, page.Label17.text.toInt());
        EXPECT_EQ(page.Label16.text, QStringLiteral("2"));
    };
    page.Timer2_Tick();
    machine.pump.onPump = {};
    EXPECT_EQ(positions, QStringList({QStringLiteral("1"), QStringLiteral("2")}));
    EXPECT_FALSE(countedEarly);
    EXPECT_EQ(printFiles().size(), 2);
    EXPECT_FALSE(machine.files.folderExists(folder(QStringLiteral("106"))));
}

TEST_F(PreparingAnEditedOrder, endsTheProgramAtOnceWhenTheCustomerLeaves) {
    QStringList items;
    for (int i = 0; i < 8; ++i)
        items += edited(givePicture(QStringLiteral("picture%1.jpg").arg(i)), record(toned));
    B3& page = open(items);
    machine.pump.onPump = [&] {
        if (page.Label17.text == QStringLiteral("3"))
            page.Command2_Click();
    };
    page.Timer2_Tick();
    EXPECT_TRUE(chain.hasEnded());
    EXPECT_LT(printFiles().size(), 5);
    EXPECT_FALSE(exists(logPath()));
    EXPECT_FALSE(exists(QStringLiteral("C:\\vedron\\mispar.txt"))) << "an abandoned order burns no number";
    for (const auto& entry :
         std::filesystem::directory_iterator(*machine.drives.toHost(QStringLiteral("C:\\2000lumora"))))
        EXPECT_TRUE(entry.is_directory() || entry.path().filename() == "bw.bmp") << entry.path();
}

TEST_F(PreparingAnEditedOrder, keepsWhatWasPreparedWhenTheLogCanNotBeWritten) {
    makeFolder(logPath());
    B3& page = open({edited(givePicture(QStringLiteral("one_1.jpg")))});
    page.Timer2_Tick();
    ASSERT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_TRUE(machine.dialogs.messages[0].contains(QStringLiteral("KUP_1234^105.txt")));
    EXPECT_EQ(front(), PageId::B3);
    EXPECT_EQ(printFiles().size(), 1);
    std::filesystem::remove(*machine.drives.toHost(logPath()));
    page.Command5_Click();
    EXPECT_EQ(front(), PageId::FtpFrm);
    EXPECT_EQ(state.MisparHazmana, QStringLiteral("105")) << "the same number at the next press";
}

TEST_F(PreparingAnEditedOrder, losesNothingThatIsMadeWhenTheDiskRunsFull) {
    constexpr int pictures = 8;
    QStringList items;
    for (int i = 0; i < pictures; ++i) {
        const QByteArray bytes = *encodeJpeg(noisyPicture(60, 40, 5U + static_cast<unsigned>(i)), 90);
        items += edited(giveFile(QStringLiteral("picture%1.jpg").arg(i), bytes), i % 2 == 0 ? record() : record(toned));
    }
    const SmallDisk disk(1600);
    if (!disk.available())
        GTEST_SKIP() << "this user may not mount a small disk";
    std::filesystem::remove_all(*machine.drives.toHost(QStringLiteral("C:\\2000lumora")));
    std::filesystem::create_directory_symlink(disk.path(), *machine.drives.toHost(QStringLiteral("C:\\2000lumora")));
    makeFolder(QStringLiteral("C:\\2000lumora\\zmany"));
    const QStringList failed = prepare(items);
    ASSERT_FALSE(machine.dialogs.messages.isEmpty());
    EXPECT_TRUE(machine.dialogs.messages[0].contains(QStringLiteral("2000lumora")))
        << machine.dialogs.messages[0].toStdString();
    const QStringList made = printFiles();
    EXPECT_FALSE(made.isEmpty());
    EXPECT_LT(made.size(), pictures);
    EXPECT_EQ(made.size() + failed.size(), pictures) << "each picture is printed or named as failed";
    for (const QString& name : made)
        EXPECT_TRUE(unpacked(name)) << name.toStdString();
}

TEST_F(PreparingAnEditedOrder, saysItsTextsInTheLanguageOfTheSession) {
    B3& page = open({edited(givePicture(QStringLiteral("one_1.jpg")))});
    EXPECT_EQ(page.Label4Title.text, QStringLiteral("הכנת תמונות למשלוח"));
    EXPECT_TRUE(page.Command7.visible && !page.Command2.visible);
    state.EnglishTips = 1;
    page.setTexts();
    EXPECT_EQ(page.Command2.text, QStringLiteral(" Stop All and EXIT"));
    for (const Caption* caption :
         {&page.Label4Title, &page.Label4Progress, &page.Label4fail, &page.Label1, &page.Label2, &page.Command1,
          &page.Command2, &page.Command5, &page.Command7, &page.Picture5}) {
        EXPECT_FALSE(caption->text.isEmpty());
        for (const QChar letter : caption->text)
            EXPECT_NE(letter.script(), QChar::Script_Hebrew) << caption->text.toStdString();
    }
}

} // namespace
} // namespace lumora
