#include "EditedOrder.h"

#include "common/ListOutput.h"
#include "order/OrderCheck.h"

#include <QDir>
#include <QMap>
#include <QProcess>
#include <QTemporaryDir>

namespace lumora {
namespace {

class PrintingAgain : public PreparingAnEditedOrder {
protected:
    QString giveNoise(const QString& name, int width, int height) {
        return giveFile(name, *encodeJpeg(noisyPicture(width, height, static_cast<unsigned>(qHash(name, 7))), 92));
    }

    QStringList eight() {
        makeFolder(u"C:\\pics\\more"_s);
        const DrivePath frames = u"C:\\2000lumora\\misgarot\\demo"_path;
        makeFolder(frames);
        Bitmap frame(60, 40, Qt::black);
        for (int x = 0; x < 60; ++x)
            frame.image().setPixelColor(x, x % 40, QColor(90, 20, 160));
        EXPECT_TRUE(frame.image().save(hostText(frames / u"007.bmp"), "BMP"));

        using namespace EditRecord;
        const Changes framed = {{FrameName, u"007"_s}, {FrameFolder, u"demo"_s}};
        const auto words = [](const QString& text) {
            return Changes{{TextOn, u"1"_s}, {TextFont, u"David"_s}, {TextFontSize, u"30"_s}, {TextX, u"60"_s},
                           {TextY, u"90"_s}, {TextRed, u"255"_s},    {TextBody, text}};
        };
        const QString turned = record({{GainR, u"1.3"_s}, {RotationCode, u"195"_s}, {ZoomPercent, u"80"_s}});
        const QString fixed = giveNoise(u"eyes1.jpg"_s, 80, 60);
        const QString fixedGrey = giveNoise(u"eyes2.jpg"_s, 80, 60);
        giveCorrected(fixed, Qt::darkGreen);
        EXPECT_TRUE(noisyPicture(90, 60, 5).image().save(hostText(correctedPath(fixedGrey)), "BMP"));
        return {
            edited(giveNoise(u"more\\IMG_0001.jpg"_s, 200, 300), turned),
            edited(giveNoise(u"grey1.jpg"_s, 2400, 1800), record(toned + Changes{{GainB, u"0.5"_s}})),
            edited(fixed, record(redEyesCorrected)),
            edited(fixedGrey, record(both)),
            edited(giveNoise(u"תמונה של סבתא.JPG"_s, 300, 200), record(words(u"חג שמח,\r\n2026 All"_s)), u"12"_s),
            edited(giveNoise(u"never opened.jpg"_s, 500, 100), EditRecord::newPicture()),
            edited(giveNoise(u"a \"quoted\" name.jpg"_s, 300, 200), record(framed + toned + words(u"all \"of\" it"_s))),
            edited(giveNoise(u"no such frame.jpg"_s, 300, 200),
                   record({{FrameName, u"099"_s}, {FrameFolder, u".."_s}}))};
    }

    // The packed pictures in the order of the list.
    QMap<int, QByteArray> packed() const {
        QMap<int, QByteArray> pictures;
        for (const QString& name : printFiles(state.MisparHazmana))
            pictures[name.mid(9, 4).toInt()] = take(unpacked(name, state.MisparHazmana)).picture;
        return pictures;
    }
};

// What support does when a print was spoilt: the line of the order log and the picture are all that is needed.
TEST_F(PrintingAgain, givesTheVeryBytesOfThePackedPrintFromTheLineOfTheLog) {
    const QStringList items = eight();
    ASSERT_EQ(prepare(items), QStringList());
    const QMap<int, QByteArray> first = packed();
    ASSERT_EQ(first.size(), 8);
    EXPECT_EQ(take(checkOrderFolder(host(folder()), {56, 30})).faults, QStringList());
    const QByteArray log = take(machine.files.read(logPath()));

    chain.unload(PageId::FtpFrm);
    ASSERT_EQ(prepare(items), QStringList());
    const QMap<int, QByteArray> second = packed();
    ASSERT_EQ(second.size(), 8);

    QStringList lines;
    for (const ListOutputEntry& entry : ReadListOutput(log)) {
        if (entry.key == QLatin1String("Shoora"))
            lines += entry.value;
    }
    ASSERT_EQ(lines.join(u'|').toStdString(), items.join(u'|').toStdString());
    for (int i = 0; i < 8; ++i) {
        SCOPED_TRACE(lines[i].toStdString());
        EXPECT_TRUE(first[i] == second[i]) << "whatever was under way beside it";
        const BasketLine item = BasketLine::split(lines[i], LineForm::Full);
        const bool isCorrected = item.editState.contains(QLatin1String("RED"));
        const QString source = hostText(isCorrected ? correctedPath(item.path.text()) : item.path);
        const QTemporaryDir out;
        QProcess render;
        render.start(QStringLiteral(LUMORA_RENDER),
                     {u"print"_s, u"--paper"_s, u"10/15"_s, u"--record"_s, item.editState, u"--frames"_s,
                      hostText(u"C:\\2000lumora\\misgarot"_path), u"--out"_s, out.path(), source});
        ASSERT_TRUE(render.waitForFinished(60000));
        ASSERT_EQ(render.exitCode(), 0) << render.readAllStandardError().constData();
        const QStringList made = QDir(out.path()).entryList(QDir::Files);
        ASSERT_EQ(made.size(), 1);
        EXPECT_TRUE(take(readHostFile(toHostPath(out.filePath(made[0])))) == first[i]);
    }
}

} // namespace
} // namespace lumora
