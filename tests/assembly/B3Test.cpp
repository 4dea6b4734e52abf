#include "EditedOrder.h"

#include "editing/render/EditedPicture.h"
#include "imaging/files/PictureFile.h"
#include "order/OrderCheck.h"
#include "order/OrderState.h"
#include "support/JpegQuality.h"

#include <QPainter>

#include <tuple>

namespace lumora {
namespace {

TEST_F(PreparingAnEditedOrder, makesTheWholeFolderAndHandsItToTheSender) {
    state.SugTzad = 60;
    state.transfer.HazmanaP = 1;
    const QString portrait = givePicture(u"תמונה 01.jpg"_s, 300, 400, Qt::darkCyan);
    const QString other = givePicture(u"small.JPG"_s);
    const QString edits = record({{EditRecord::GainR, u"1.3"_s},
                                  {EditRecord::RotationCode, u"195"_s},
                                  {EditRecord::ZoomPercent, u"80"_s},
                                  {EditRecord::TextOn, u"1"_s},
                                  {EditRecord::TextX, u"40"_s},
                                  {EditRecord::TextY, u"50"_s},
                                  {EditRecord::TextBody, u"שלום \"2026\""_s}});
    prepare({edited(portrait, edits, u"12"_s), edited(other)});

    EXPECT_EQ(machine.files.names(folder(), u"*.*"_s),
              QStringList({u"!105_1234.jpp"_s, u"1 1015GNB0001_02736D616C6C.jpp"_s,
                           u"121015GNB0000_02FAEEE5F0E4203031.jpp"_s, u"2026_11_21_KUP_1234^105.txt"_s}));
    const PrintFileContent content = take(unpacked(u"121015GNB0000_02FAEEE5F0E4203031.jpp"_s));
    EXPECT_EQ(content.tail, "1 1 03-1234567Dana Levi 13 1051234      ") << "the short tail, whatever SugTzad says";
    EditFields fields;
    UnpackEditState(edits, fields);
    EditedPrint request;
    request.file = host(portrait);
    request.paper = {10, 15};
    EXPECT_EQ(content.picture, take(renderEditedPrintToJpeg(request, fields)));
    EXPECT_EQ(jpegQuality(content.picture), 90);

    EXPECT_EQ(take(readPictureSize(host(folder() / u"!105_1234.jpp"))), (PictureSize{450, 580}));
    EXPECT_EQ(machine.files.names(jobFolder, u"*.*"_s), QStringList({u"1 ~small.bmp"_s, u"12~תמונה 01.bmp"_s}));
    EXPECT_EQ(take(readPictureSize(host(jobFolder / u"12~תמונה 01.bmp"))), (PictureSize{300, 450}));
    EXPECT_FALSE(exists(u"C:\\2000lumora\\!!000\\^^^.jpg"_path)) << "goes at the end of each step";
    EXPECT_EQ(front(), PageId::FtpFrm);
    EXPECT_TRUE(machine.dialogs.messages.isEmpty()) << machine.dialogs.messages.join(u'|').toStdString();
    const OrderFindings report = take(checkOrderFolder(host(folder()), {56, 30}));
    EXPECT_EQ(report.faults, QStringList());
    EXPECT_EQ(report.prints, 2);
}

TEST_F(PreparingAnEditedOrder, keepsItsCorrectionsAndNoThumbnailsOnTheWayBack) {
    registerBare({PageId::kyoskNew});
    state.TachanaMekomit = true;
    const QString good = givePicture(u"good.jpg"_s);
    giveCorrected(good, Qt::blue);
    state.handOver.basket = {edited(good, record(redEyesCorrected)), edited(giveFile(u"bad.jpg"_s, "no picture"))};
    B3& page = open(state.handOver.basket);
    start(page);
    EXPECT_EQ(machine.files.names(jobFolder, u"*.bmp"_s).size(), 1);
    page.Command4Hazor_Click();
    EXPECT_TRUE(exists(correctedPath(good))) << "no clean-up";
    EXPECT_EQ(machine.files.names(jobFolder, u"*.bmp"_s), QStringList());
}

// Flat pictures, so that one pixel tells which picture was printed and in which colours.
TEST_F(PreparingAnEditedOrder, printsTonesAndCorrectionsEachFromItsOwnPicture) {
    const QColor first(200, 80, 20), second(20, 160, 120), fixed(60, 60, 200);
    const auto grey = [](QColor colour) {
        const int level = 3 * (colour.red() + colour.green() + colour.blue()) / 10;
        return QColor(level, level, level);
    };
    const QStringList paths = {
        givePicture(u"plain1.jpg"_s, 40, 30, first), givePicture(u"toned2.jpg"_s, 40, 30, second),
        givePicture(u"fixed3.jpg"_s, 40, 30, first), givePicture(u"both_4.jpg"_s, 40, 30, first),
        givePicture(u"toned5.jpg"_s, 40, 30, first), givePicture(u"sepia6.jpg"_s, 40, 30, first)};
    giveCorrected(paths[2], second);
    giveCorrected(paths[3], fixed);
    const Changes sepia = toned + Changes{{EditRecord::GainB, u"0.5"_s}};
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
    const auto copyOf = [this](const DrivePath& path) { return take(loadPicture(host(path))); };
    EXPECT_EQ(copyOf(bw).width(), 40) << "the size of the picture";
    expectColour(copyOf(bw).image(), {20, 15}, grey(first));
    expectColour(copyOf(correctedPath(bw.text())).image(), {20, 15}, grey(fixed));
    EXPECT_EQ(machine.files.names(u"C:\\2000lumora"_path, u"*.bmp"_s), QStringList(u"bw.bmp"_s));
}

TEST_F(PreparingAnEditedOrder, neverPrintsOnePictureAsAnother) {
    const QString good = givePicture(u"toned1.jpg"_s, 40, 30, Qt::green);
    const QString damaged = giveFile(u"damaged2.jpg"_s, "no picture");
    const QString vanished = givePicture(u"vanished3.jpg"_s);
    const QString both4 = givePicture(u"both4.jpg"_s);
    const QString missing = u"C:\\pics\\missing5.jpg"_s;
    const QString unknown = u"C:\\pics\\????.jpg"_s;
    const QString tooShort = givePicture(u"ajpg"_s);
    // What an earlier customer's order left behind.
    ASSERT_TRUE(Bitmap(40, 30, Qt::blue).image().save(hostText(bw), "BMP"));
    giveCorrected(bw.text(), Qt::blue);
    makeFolder(folder().folder());
    giveFile(u"old.jpg"_s, *encodeJpeg(Bitmap(40, 30, Qt::blue), 90));
    ASSERT_TRUE(machine.files.copyFile(u"C:\\pics\\old.jpg"_path, u"C:\\2000lumora\\!!000\\^^^.jpg"_path));
    const QStringList failed =
        prepare({edited(damaged, record(toned)), edited(good, record(toned)), edited(damaged, record(toned)),
                 edited(vanished, record(redEyesCorrected)), edited(both4, record(both)), edited(missing),
                 edited(unknown), edited(tooShort)});
    EXPECT_EQ(failed, QStringList({damaged, damaged, vanished, both4, missing, unknown}));
    EXPECT_EQ(printFiles(), QStringList(u"1 1015GNB0001_02746F6E656431.jpp"_s))
        << "failed pictures leave holes in the numbers";
    EXPECT_EQ(front(), PageId::FtpFrm) << "a failed picture never stops an order";
    EXPECT_TRUE(machine.dialogs.messages.isEmpty()) << "the order's own files are all written";
    EXPECT_TRUE(read(logPath()).contains("\"Failed  \",\"C:\\pics\\vanished3.jpg\"\r\n"));
    EXPECT_EQ(state.shemot.TotalPics, 8) << "a name too short for a picture is skipped in silence, and counted";

    chain.unload(PageId::FtpFrm);
    state.shemot.ppr = u"zz/zz"_s;
    EXPECT_EQ(prepare({edited(good)}), QStringList(good)) << "no paper";
}

TEST_F(PreparingAnEditedOrder, carefullyPrintsAPictureThatWasNeverOpenedAsTheEditorWouldShowIt) {
    // A disc in the middle of a picture that is slimmer than its paper.
    Bitmap disc(800, 600, Qt::white);
    QPainter painter(&disc.image());
    painter.setBrush(Qt::black);
    painter.drawEllipse(QPoint(400, 300), 150, 150);
    painter.end();
    const QString lying = givePicture(u"lying.jpg"_s), upright = givePicture(u"upright.jpg"_s, 30, 40);
    ASSERT_TRUE(saveJpeg(disc, host(lying), 95));
    const QString damaged = giveFile(u"damaged.jpg"_s, "no picture");
    makeFolder(u"C:\\2000lumora\\misgarot\\aa"_s);
    struct Case {
        bool careful;
        const char *border, *record, *lying, *upright; // what becomes of the record's place and of its frame
    };
    for (const Case& c :
         {Case{false, "NB", "new", "999 999 000", "999 999 000"}, Case{true, "NB", "new", "225 150 000", "150 225 000"},
          Case{true, "NB", "", "225 150 000", "150 225 000"}, Case{true, "WB", "new", "225 150 001", "150 225 001"}}) {
        SCOPED_TRACE(c.border);
        state.Careful = c.careful;
        state.shemot.Bord = QString::fromLatin1(c.border);
        const QString none = *c.record == 'n' ? EditRecord::newPicture() : QString(200, u' ');
        EXPECT_EQ(prepare({edited(lying, none), edited(upright, none), edited(damaged, none)}), QStringList(damaged));
        const QString log = QString::fromLatin1(read(logPath()));
        const qsizetype line = log.indexOf(u"\"Shoora\",\"1 1015GNB"_s) + 19;
        const auto shown = [&](qsizetype at) { return log.mid(at + 18, 8) + log.mid(at + 32, 3); };
        EXPECT_EQ(shown(line), QLatin1String(c.lying));
        EXPECT_EQ(shown(log.indexOf(u"1 1015GNB"_s, line) + 9), QLatin1String(c.upright));
        QRect ink;
        const QImage made = print(0);
        for (int at = 0; at < made.width() * made.height(); ++at) {
            if (qGray(made.pixel(at % made.width(), at / made.width())) < 128)
                ink |= QRect(at % made.width(), at / made.width(), 1, 1);
        }
        EXPECT_NEAR(double(ink.width()) / ink.height(), c.careful ? 1 : 1.125, 0.005);
        chain.unload(PageId::FtpFrm);
        std::filesystem::remove_all(host(folder()));
        state.MisparHazmana = u"105"_s;
    }
}

TEST_F(PreparingAnEditedOrder, drawsTheSheetFromTheRenderedPrints) {
    // The second picture of the same name and copies takes the first one's thumbnail.
    makeFolder(u"C:\\pics\\more"_s);
    const QString red = givePicture(u"picture.jpg"_s, 40, 30, Qt::red);
    const QString green = givePicture(u"more\\picture.jpg"_s, 40, 30, Qt::green);
    const QString upright = givePicture(u"upright.jpg"_s, 30, 40, Qt::red);
    const Changes turnedRed = {{EditRecord::GainR, u"0"_s}};
    prepare({edited(red), edited(green), edited(upright, record(turnedRed))});
    EXPECT_EQ(printFiles().size(), 3);
    const QImage sheet = take(loadPicture(host(folder() / u"!105_1234.jpp"))).image();
    // Cells lie every 82 pixels from 5, the first row at 161; a thumbnail is 80 wide and 53 high, also an upright one.
    expectColour(sheet, {5 + 40, 161 + 26}, Qt::green);
    expectColour(sheet, {87 + 76, 161 + 26}, Qt::black);
    expectColour(sheet, {87 + 40, 161 + 49}, Qt::black);
    expectColour(sheet, {169 + 40, 161 + 26}, Qt::white);
}

TEST_F(PreparingAnEditedOrder, savesSheetTailAndWayAsTheirReceiverWantsThem) {
    const QString jpp = u"!105_1234.jpp"_s, jpg = u"!105_1234.jpg"_s;
    const QString path = givePicture(u"one_1.jpg"_s);
    const QByteArray tail = "1 1 03-1234567Dana Levi 1  1051234      ";
    using Way = OrderState::Way;
    state.SugTzad = 60;
    for (const auto& [edits, sender, local, sheets, way, next, messages] :
         std::initializer_list<std::tuple<bool, Sender, bool, QStringList, Way, PageId, int>>{
             {true, Sender::Ftp, false, {jpp}, Way::Ftp, PageId::FtpFrm, 0},
             {true, Sender::Ftp, true, {jpg, jpp}, Way::Station, PageId::hatchala, 0},
             {true, Sender::Http, true, {jpg}, Way::Station, PageId::hatchala, 0},
             {true, Sender::Http, false, {jpg}, Way::Http, PageId::hatchala, 1}, // no page to go on with
             {true, Sender::Http, false, {jpg}, Way::Http, PageId::UploadForm, 0},
             {false, Sender::Http, false, {jpp}, Way::Ftp, PageId::FtpFrm, 0}}) { // its sheet and its sender are FTP's
        SCOPED_TRACE(edits ? static_cast<int>(next) : -1);
        state.MisparHazmana = u"105"_s;
        state.transfer.SugSheliach = sender;
        state.TachanaMekomit = local;
        state.handOver.kept = {};
        machine.dialogs.messages.clear();
        if (next == PageId::UploadForm)
            registerBare({PageId::UploadForm});
        start(openEither(edits, {edits ? edited(path) : line(path)}));
        EXPECT_EQ(machine.files.names(folder(), u"!*"_s), sheets);
        EXPECT_EQ(take(checkOrderFolder(host(folder()), {56, 30})).faults, QStringList());
        const PrintFileContent made = take(unpacked(printFiles().value(0)));
        EXPECT_EQ(made.tail, edits ? tail : tail + "^one_1              ") << "an edited order's is always short";
        EXPECT_EQ(take(ReadOrderState(machine.files, OrderFolder(folder()))).way, way);
        EXPECT_EQ(front(), next);
        EXPECT_EQ(state.handOver.kept.number == u"105", next == PageId::hatchala);
        EXPECT_EQ(machine.dialogs.messages.size(), messages);
        chain.unload(front());
        std::filesystem::remove_all(host(folder()));
    }
}

} // namespace
} // namespace lumora
