#include "EditedOrder.h"

#include "assembly/OrderCheck.h"
#include "common/ListOutput.h"

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

    QStringList dozen() {
        makeFolder(QStringLiteral("C:\\pics\\more"));
        const QString frames = QStringLiteral("C:\\2000lumora\\misgarot\\demo");
        makeFolder(frames);
        Bitmap frame(60, 40, Qt::black);
        frame.image().fill(Qt::black);
        for (int x = 0; x < 60; ++x)
            frame.image().setPixelColor(x, x % 40, QColor(90, 20, 160));
        EXPECT_TRUE(frame.image().save(hostText(frames + QStringLiteral("\\007.bmp")), "BMP"));

        using namespace EditRecord;
        const Changes framed = {{FrameName, QStringLiteral("007")}, {FrameFolder, QStringLiteral("demo")}};
        const auto words = [](const QString& text) {
            return Changes{{TextOn, QStringLiteral("1")},
                           {TextFont, QStringLiteral("David")},
                           {TextFontSize, QStringLiteral("30")},
                           {TextX, QStringLiteral("60")},
                           {TextY, QStringLiteral("90")},
                           {TextRed, QStringLiteral("255")},
                           {TextBody, text}};
        };
        const QString turned = record({{GainR, QStringLiteral("1.3")},
                                       {RotationCode, QStringLiteral("195")},
                                       {ZoomPercent, QStringLiteral("80")}});
        const QString fixed = giveNoise(QStringLiteral("eyes1.jpg"), 80, 60);
        const QString fixedGrey = giveNoise(QStringLiteral("eyes2.jpg"), 80, 60);
        giveCorrected(fixed, Qt::darkGreen);
        EXPECT_TRUE(noisyPicture(90, 60, 5).image().save(hostText(correctedPath(fixedGrey)), "BMP"));
        return {edited(giveNoise(QStringLiteral("IMG_0001.jpg"), 300, 200)),
                edited(giveNoise(QStringLiteral("more\\IMG_0001.jpg"), 200, 300), turned),
                edited(giveNoise(QStringLiteral("grey1.jpg"), 2400, 1800), record(toned)),
                edited(giveNoise(QStringLiteral("grey2.jpg"), 300, 400),
                       record(toned + Changes{{GainB, QStringLiteral("0.5")}})),
                edited(fixed, record(redEyesCorrected)),
                edited(fixedGrey, record(both)),
                edited(giveNoise(QStringLiteral("תמונה של סבתא.JPG"), 300, 200),
                       record(words(QStringLiteral("חג שמח,\r\n2026 All")))),
                edited(giveNoise(QStringLiteral("framed.jpg"), 200, 300), record(framed), QStringLiteral("12")),
                edited(giveNoise(QStringLiteral("never opened.jpg"), 500, 100), EditRecord::newPicture()),
                edited(giveNoise(QStringLiteral("far out.jpg"), 300, 200),
                       record({{ZoomPercent, QStringLiteral("250")}, {PanX, QStringLiteral("-30")}})),
                edited(giveNoise(QStringLiteral("a \"quoted\" name.jpg"), 300, 200),
                       record(framed + toned + words(QStringLiteral("all \"of\" it")))),
                edited(giveNoise(QStringLiteral("no such frame.jpg"), 300, 200),
                       record({{FrameName, QStringLiteral("099")}, {FrameFolder, QStringLiteral("..")}}))};
    }

    // The packed pictures in the order of the list.
    QMap<int, QByteArray> packed() const {
        QMap<int, QByteArray> pictures;
        for (const QString& name : printFiles(state.MisparHazmana))
            pictures[name.mid(9, 4).toInt()] = unpacked(name, state.MisparHazmana)->picture;
        return pictures;
    }
};

// What support does when a print was spoilt: the line of the order log and the picture are all that is needed.
TEST_F(PrintingAgain, givesTheVeryBytesOfThePackedPrintFromTheLineOfTheLog) {
    const QStringList items = dozen();
    ASSERT_EQ(prepare(items), QStringList());
    const QMap<int, QByteArray> first = packed();
    ASSERT_EQ(first.size(), 12);
    const Result<OrderFindings> report = checkOrderFolder(*machine.drives.toHost(folder()), {56, 30});
    ASSERT_TRUE(report);
    EXPECT_EQ(report->faults.join(u'\n').toStdString(), "");
    const Result<QByteArray> log = machine.files.read(logPath());
    ASSERT_TRUE(log);

    chain.unload(PageId::FtpFrm);
    ASSERT_EQ(prepare(items), QStringList());
    EXPECT_NE(state.MisparHazmana, QStringLiteral("105")) << "a folder of its own";
    const QMap<int, QByteArray> second = packed();
    ASSERT_EQ(second.size(), 12);

    QStringList lines;
    for (const ListOutputEntry& entry : ReadListOutput(*log)) {
        if (entry.key == QLatin1String("Shoora"))
            lines += entry.value;
    }
    ASSERT_EQ(lines.join(u'|').toStdString(), items.join(u'|').toStdString());
    for (int i = 0; i < 12; ++i) {
        SCOPED_TRACE(lines[i].toStdString());
        EXPECT_TRUE(first[i] == second[i]) << "whatever was under way beside it";
        const OrderItem item = OrderItem::split(lines[i], OrderItem::Form::Edited);
        const bool isCorrected = item.record.contains(QLatin1String("RED"));
        const QString source = hostText(isCorrected ? correctedPath(item.path) : item.path);
        const QTemporaryDir out;
        QProcess render;
        render.start(QStringLiteral(LUMORA_RENDER),
                     {QStringLiteral("print"), QStringLiteral("--paper"), QStringLiteral("10/15"),
                      QStringLiteral("--record"), item.record, QStringLiteral("--frames"),
                      hostText(QStringLiteral("C:\\2000lumora\\misgarot")), QStringLiteral("--out"), out.path(),
                      source});
        ASSERT_TRUE(render.waitForFinished(60000));
        ASSERT_EQ(render.exitCode(), 0) << render.readAllStandardError().constData();
        const QStringList made = QDir(out.path()).entryList(QDir::Files);
        ASSERT_EQ(made.size(), 1);
        EXPECT_TRUE(*readHostFile(toHostPath(out.filePath(made[0]))) == first[i]);
    }
}

} // namespace
} // namespace lumora
