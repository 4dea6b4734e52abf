#include "EditedOrder.h"

#include "order/UnfinishedOrders.h"

namespace lumora {
namespace {

namespace fs = std::filesystem;

class GoingOnWithAnOrder : public PreparingAnEditedOrder {
protected:
    // Prepares an order, and puts back what a kill during its third picture would have left. The next order's clean-up
    // has run.
    void prepareAndKill(bool edits, const QStringList& items) {
        const HostPath aside = host(u"C:\\aside"_s);
        fs::remove_all(aside);
        PreparationPage& page = openEither(edits, items);
        machine.pump.onPump = [&] {
            if (page.controls().Label17.text == u"3"_s && !fs::exists(aside))
                fs::copy(host(folder()), aside, fs::copy_options::recursive);
        };
        start(page);
        machine.pump.onPump = {};
        ASSERT_EQ(front(), PageId::FtpFrm);
        undisturbed = content();
        fs::remove_all(host(folder()));
        fs::copy(aside, host(folder()), fs::copy_options::recursive);
        QString number;
        ASSERT_TRUE(Workspace(state, machine.files).CleanWorkspace(number));
        chain.unload(PageId::FtpFrm);
    }

    // The order goes on in a program that has just begun.
    UnfinishedOrder goOn() {
        SessionState next;
        next.DiskRoot = state.DiskRoot;
        next.profile = state.profile;
        state = next;
        const QList<UnfinishedOrder> found = UnfinishedOrders(state, machine.files);
        EXPECT_EQ(found.size(), 1);
        const bool edits = TakeUpOrder(found.first(), state, machine.files) == Outcome::EditedTakenUp;
        chain.show(edits ? PageId::B3 : PageId::Form2);
        start(*dynamic_cast<PreparationPage*>(chain.front()));
        EXPECT_EQ(front(), PageId::FtpFrm);
        return found.first();
    }

    OrderState stored() const { return take(ReadOrderState(machine.files, OrderFolder(folder()))); }

    QMap<QString, QByteArray> undisturbed;
};

TEST_F(GoingOnWithAnOrder, MakesTheSameOrderAndNoPrintTwice) {
    for (const bool edits : {false, true}) {
        QStringList paths, items;
        for (int i = 0; i < 4; ++i)
            paths += givePicture(u"picture%1.jpg"_s.arg(i), 60 + i, 40, QColor(40 * i, 90, 120));
        giveCorrected(paths[3], Qt::darkGreen);
        for (const QString& path : paths)
            items += edits ? edited(path, record(path == paths[3] ? redEyesCorrected : toned)) : line(path);
        state = exampleOrder();
        state.DiskRoot = machine.drives.programRoot();
        prepareAndKill(edits, items);
        fs::remove(host(paths[0])); // its print is there
        if (edits) {                // between print and thumbnail
            EXPECT_TRUE(exists(folder() / u".kept\\job_folder\\1 ~picture1.bmp"));
            fs::remove(host(folder() / u".kept\\job_folder\\1 ~picture1.bmp"));
        }
        const UnfinishedOrder before = goOn();
        EXPECT_GE(before.prepared, 2);
        EXPECT_LT(before.prepared, 4);
        EXPECT_EQ(before.gone, 0);
        EXPECT_EQ(content(), undisturbed) << edits;
        EXPECT_EQ(stored().phase, OrderState::Phase::Prepared);
        EXPECT_EQ(read(u"C:\\vedron\\mispar.txt"_path), "106\r\n");
        EXPECT_TRUE(machine.dialogs.messages.isEmpty()) << machine.dialogs.messages.join(u'|').toStdString();
        chain.unload(PageId::FtpFrm);
        fs::remove_all(host(folder()));
    }
}

TEST_F(GoingOnWithAnOrder, TellsAPrintThatGivesTheSheetNoThumbnail) {
    QStringList items;
    for (int i = 0; i < 4; ++i)
        items += edited(givePicture(u"picture%1.jpg"_s.arg(i)));
    prepareAndKill(true, items);
    const QString cut = printFiles().value(1);
    write(folder() / cut, "cut");
    fs::remove(host(folder() / u".kept\\job_folder\\1 ~picture1.bmp"));
    goOn();
    EXPECT_TRUE(machine.dialogs.messages.value(0).contains(cut)) << machine.dialogs.messages.join(u'|').toStdString();
}

TEST_F(GoingOnWithAnOrder, MakesAllPrintsAnewInAnotherShapeAndCountsAPictureThatIsGoneAsFailed) {
    QStringList paths;
    for (int i = 0; i < 4; ++i)
        paths += givePicture(u"picture%1.jpg"_s.arg(i));
    prepareAndKill(false, {line(paths[0]), line(paths[1]), line(paths[2]), line(paths[3]), line(u"C:\\x.png"_s)});
    fs::remove(host(paths[3]));
    state.profile.JppChunks = 40;
    const UnfinishedOrder before = goOn();
    EXPECT_EQ(before.prepared, 0);
    EXPECT_EQ(before.gone, 1);
    EXPECT_EQ(printFiles().size(), 3);
    for (const QString& name : printFiles())
        EXPECT_TRUE(unpacked(name)) << name.toStdString();
    OrderLog log;
    log.read(read(logPath()));
    EXPECT_EQ(log.failed, QStringList(paths[3]));
    EXPECT_EQ(state.transfer.leftOut.value(0).picture, u"C:\\x.png"_path) << "it stands in no line and not in the log";
}

TEST_F(GoingOnWithAnOrder, TakesTheReplacedOrderAwayOnceTheNewOneIsWhole) {
    const QString picture = givePicture(u"one.jpg"_s);
    openWith({line(picture)}).Command3_Click();
    ASSERT_EQ(front(), PageId::FtpFrm);
    chain.unload(PageId::FtpFrm);
    state.MisparHazmana = u"107"_s;
    state.handOver.replaced = folder();
    openWith({line(picture)}).Command3_Click();
    EXPECT_FALSE(machine.files.folderExists(folder()));
    EXPECT_EQ(printFiles(u"107"_s).size(), 1);
    EXPECT_EQ(take(ReadOrderState(machine.files, OrderFolder(folder(u"107"_s)))).replaces, QString()) << "it is gone";
}

} // namespace
} // namespace lumora
