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
        const QByteArray before = read(path);
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

TEST_F(CheckingAnOrder, namesTheFileAtFault) {
    const OrderFindings report = take(checkOrderFolder(host(folder()), {56, 30}));
    ASSERT_TRUE(report.faults.isEmpty());
    EXPECT_EQ(QList({report.items, report.prints, report.failed, report.copies}), QList({4, 2, 1, 15}));
    // A print file whose picture is cut short still falls into its pieces.
    const QByteArray tail = take(readPrintFile(read(folder() / two), {56, 30})).tail;
    QByteArray picture = *encodeJpeg(noisyPicture(60, 60, 1), 90);
    picture.chop(picture.size() / 2);
    const QString sheet = u"!105_1234.jpp"_s;
    const struct {
        QString file;
        std::function<void(QByteArray&)> change;
        qsizetype faults;
        QString about;
    } cases[] = {
        {two, [](QByteArray& bytes) { bytes.chop(1); }, 1, two},
        {two, [](QByteArray& bytes) { bytes.replace("Dana", "Dora"); }, 1, u"Dora"_s},
        {two,
         [&](QByteArray& bytes) {
             bytes = *packPrintFile(picture, {56, 30}, tail);
         },
         1, two},
        {sheet, [](QByteArray& bytes) { bytes.truncate(bytes.size() / 2); }, 1, sheet},
        {log, [](QByteArray& bytes) { bytes.replace("fail_\",\"C:\\pics\\bad", "fail_\",\"C:\\pics\\bed"); }, 1,
         u"bad.jpg"_s},
        // Its print file has another name then, and it lacks one.
        {log, [](QByteArray& bytes) { bytes.replace("1 1015GNBC:\\pics\\two", "1 1015 NBC:\\pics\\two"); }, 3,
         u"no paper letter"_s},
        // The total and the tails of both print files.
        {log, [](QByteArray& bytes) { bytes.replace("TotalPics\",15", "TotalPics\",16"); }, 3, two},
    };
    for (const auto& c : cases) {
        const QStringList found = faultsWith(c.file, c.change);
        EXPECT_EQ(found.size(), c.faults) << found.join(u'|').toStdString();
        EXPECT_TRUE(found.join(u'|').contains(c.about)) << found.join(u'|').toStdString();
    }
    for (const auto& [gone, count, about] : {std::tuple(two, 1, u"two.jpg"_s),
                                             {u"121015GNB0000_01FAEEE5F0E4203031.jpp"_s, 3, u"no print file"_s},
                                             {log, 1, u"no order log"_s}}) {
        ASSERT_TRUE(machine.files.removeFile(folder() / gone));
        EXPECT_EQ(faults().size(), count);
        EXPECT_TRUE(faults().join(u'|').contains(about)) << faults().join(u'|').toStdString();
    }
}

} // namespace
} // namespace lumora
