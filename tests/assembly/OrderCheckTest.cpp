#include "order/OrderCheck.h"

#include "PlainOrder.h"

namespace lumora {
namespace {

class CheckingAnOrder : public PreparingAPlainOrder {
protected:
    CheckingAnOrder() {
        const QString bad = giveFile(u"bad.jpg"_s, "no picture");
        openWith({line(givePicture(u"תמונה 01.jpg"_s), u"12"_s), line(bad), line(givePicture(u"ajpg"_s)),
                  line(givePicture(u"two.jpg"_s))})
            .Command6_Click();
    }

    QStringList faults() const {
        const Result<OrderFindings> report = checkOrderFolder(host(folder()), PrintFileShape::of(state.profile));
        return report ? report->faults : QStringList(report.failure().message);
    }
    // The faults after a change to a file of the folder; the file is put back.
    QStringList faultsWith(const QString& name, const std::function<void(QByteArray&)>& change) const {
        const DrivePath path = folder() / name;
        const QByteArray before = *machine.files.read(path);
        QByteArray changed = before;
        change(changed);
        EXPECT_TRUE(machine.files.writeWhole(path, changed));
        const QStringList found = faults();
        EXPECT_TRUE(machine.files.writeWhole(path, before));
        return found;
    }

    const QString two = u"1 1015GNB0003_0174776F.jpp"_s;
    const QString log = u"2026_11_21_KUP_1234^105.txt"_s;
};

TEST_F(CheckingAnOrder, findsAWholeOrderWhole) {
    const Result<OrderFindings> report = checkOrderFolder(host(folder()), {56, 30});
    ASSERT_TRUE(report);
    EXPECT_EQ(report->faults, QStringList());
    EXPECT_EQ(report->order, u"2026_11_21_KUP_1234^105"_s);
    EXPECT_EQ(report->items, 4);
    EXPECT_EQ(report->prints, 2);
    EXPECT_EQ(report->failed, 1);
    EXPECT_EQ(report->copies, 15);
}

TEST_F(CheckingAnOrder, namesTheFileAtFault) {
    const auto oneFault = [](const QStringList& faults, const QString& about) {
        EXPECT_EQ(faults.size(), 1) << faults.join(u'|').toStdString();
        EXPECT_TRUE(faults.join(u'|').contains(about)) << faults.join(u'|').toStdString();
    };
    oneFault(faultsWith(two, [](QByteArray& bytes) { bytes.chop(1); }), two);
    oneFault(faultsWith(two, [](QByteArray& bytes) { bytes.replace("Dana", "Dora"); }), u"Dora"_s);
    oneFault(faultsWith(u"!105_1234.jpp"_s, [](QByteArray& bytes) { bytes.truncate(bytes.size() / 2); }),
             u"!105_1234.jpp"_s);
    oneFault(
        faultsWith(log, [](QByteArray& bytes) { bytes.replace("fail_\",\"C:\\pics\\bad", "fail_\",\"C:\\pics\\bed"); }),
        u"bad.jpg"_s);
    EXPECT_EQ(
        faultsWith(log, [](QByteArray& bytes) { bytes.replace("\"Shemot.TotalPics\",15", "\"Shemot.TotalPics\",16"); })
            .size(),
        3)
        << "the total and the tails of both print files";
    // A print file whose picture is cut short still falls into its pieces.
    const QByteArray tail = readPrintFile(*machine.files.read(folder() / two), {56, 30})->tail;
    QByteArray picture = *encodeJpeg(noisyPicture(60, 60, 1), 90);
    picture.chop(picture.size() / 2);
    oneFault(faultsWith(two, [&](QByteArray& bytes) { bytes = *packPrintFile(picture, {56, 30}, tail); }), two);

    ASSERT_TRUE(machine.files.removeFile(folder() / two));
    oneFault(faults(), u"two.jpg"_s);
    ASSERT_TRUE(machine.files.removeFile(folder() / log));
    oneFault(faults(), u"no order log"_s);
}

} // namespace
} // namespace lumora
