#include "ThePage.h"

#include "assembly/edited/B3.h"
#include "assembly/plain/Form2.h"
#include "editing/editor/gdisave.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "order/PrintFile.h"
#include "order/UnfinishedOrders.h"
#include "platform/media/MediaFolders.h"
#include "support/ExampleOrder.h"

#include <fstream>

namespace lumora {
namespace {

namespace fs = std::filesystem;

const QString safe = u"You may take the card out now"_s;
const OrderFolder ordered(u"C:\\2000lumora\\!!000\\2026_11_21_KUP_1234^105"_path);
const DrivePath doorFolders = u"C:\\2000lumora\\zmany\\door"_path;
constexpr std::uintmax_t large = 256 << 20; // copied while a test looks

// A page that watches a folder of cards. With deep compression a print has the very bytes of its picture.
class PulledCards : public ThePage {
protected:
    PulledCards() {
        begin();
        registerHere<kyoskNew>(PageId::kyoskNew);
        registerHere<Form2>(PageId::Form2);
        registerHere<B3>(PageId::B3);
        registerPage<gdisave>(PageId::gdisave);
        registerBare({PageId::FtpFrm});
        makeFolder(u"C:\\vedron"_path);
    }
    // The page watches the cards, which go before the chain of the rig does.
    void TearDown() override {
        chain.unload(PageId::kyoskNew);
        QGuiApplication::processEvents();
    }
    template <class P>
    void registerHere(PageId id) {
        chain.registerPage(id, [this] { return std::make_unique<P>(state, platform, chain); });
    }
    void begin() {
        state = exampleOrder();
        state.DiskRoot = machine.drives.programRoot();
        state.Optint = OrderKind::Print;
        state.EnglishTips = state.MediniyutDchisa = 1;
        state.shemot.ppr = u"50/70"_s;
    }
    static QByteArray jpeg(QColor colour) { return *encodeJpeg(Bitmap(60, 40, colour), 92); }
    void put(const char* name, QColor colour, std::uintmax_t size = 0) const {
        fs::create_directories(card);
        std::ofstream(card / name, std::ios::binary) << jpeg(colour).toStdString();
        if (size > 0)
            fs::resize_file(card / name, size);
    }
    void pull() const { fs::rename(card, pulled); }
    kyoskNew& openCard() {
        kyoskNew& page = open();
        QObject::connect(&page, &Page::changed, [this, &page] {
            const auto there = machine.files.collect(doorFolders, Files::Depth::WithSubfolders);
            EXPECT_TRUE(page.controls().cardCopies.text != safe || there.size() >= page.controls().List1.count());
        });
        pick(page, machine.drives.toDrive(card / "1.jpg").text());
        waitUntil([this] { return !cards.all().empty(); });
        return page;
    }
    void waitFor(const kyoskNew& page, const QString& words) {
        waitUntil([&] { return page.controls().cardCopies.text == words; });
    }
    void finish(kyoskNew& page) {
        page.Image7_Click();
        waitUntil([&] { return page.controls().Frame4.visible; });
    }
    static void handOver(kyoskNew& page) {
        page.Command21_Click();
        page.Command7_Click();
    }
    void prepare() {
        auto* plain = dynamic_cast<Form2*>(chain.front());
        plain ? plain->Command3_Click() : dynamic_cast<B3&>(*chain.front()).Command5_Click();
        EXPECT_EQ(chain.front()->id(), PageId::FtpFrm);
    }
    QList<QByteArray> prints() const {
        QList<QByteArray> pictures;
        for (const QString& name : machine.files.names(ordered.path(), u"0*.jpp;1*.jpp"_s))
            pictures += take(readPrintFile(read(ordered.filePath(name)), PrintFileShape::of(state.profile))).picture;
        return pictures;
    }

    QTemporaryDir media;
    const HostPath card = toHostPath(media.path()) / "EOS.card";
    const HostPath pulled = toHostPath(media.path()) / "pulled";
    Cards cards{[this] {
        return std::make_unique<MediaFolders>(std::vector{toHostPath(media.path())},
                                              [](const HostPath& path) { return path.extension() == ".card"; });
    }};
    Platform platform{machine.files, machine.dialogs, machine.noInternet, machine.mail, machine.shell,   machine.clock,
                      machine.pump,  machine.volume,  machine.instances,  cards,        machine.printer, LUMORA_DOOR};
};

enum class At { Listed, Copying, HalfCopied, Finish, Copied, Editor, Compression, Preparing, TakenUp };
struct Pull {
    const char* name;
    At at;
    const char* lost = "";
};

class PulledAt : public PulledCards, public testing::WithParamInterface<Pull> {};

TEST_P(PulledAt, LosesNothingThatWasSafeAndNamesWhatItLoses) {
    const At at = GetParam().at;
    const QString lost = QString::fromLatin1(GetParam().lost);
    const bool slow = at == At::Copying || at == At::HalfCopied || at == At::Finish;
    state.Optint = at == At::Editor ? OrderKind::EditedPrint : OrderKind::Print;
    put("1.jpg", Qt::red);
    put("2.jpg", Qt::blue, slow ? large : 0);
    kyoskNew& page = openCard();
    if (at == At::Listed)
        pull();
    page.Command12_Click(0);
    page.Command12_Click(1);
    if (at != At::Listed)
        waitFor(page, slow ? u"Please leave the card in: 1 of 2 copied"_s : safe);
    if (at == At::HalfCopied)
        fs::resize_file(card / "2.jpg", large / 2);
    if (at == At::Editor)
        page.Picture1_Click(0);
    machine.dialogs.answers = {true}; // the customer does without
    if (at == At::Finish)
        page.Image7_Click();
    if (at != At::Listed && at < At::Compression)
        pull();
    if (at == At::Editor) {
        chain.find<tFrmNew>()->openPicture();
        EXPECT_TRUE(chain.find<tFrmNew>()->pictureOpen());
    } else if (!lost.isEmpty() && at != At::Finish) {
        waitUntil([this] { return !machine.dialogs.messages.isEmpty(); });
        EXPECT_TRUE(machine.dialogs.messages.takeFirst().contains(u":\n"_s + lost + u"\nPlease"_s));
        page.Image7_Click();
    }
    if (at == At::Listed) {
        waitUntil([this] { return !machine.dialogs.messages.isEmpty(); });
        EXPECT_EQ(machine.dialogs.messages, QStringList(u"No pictures were chosen"_s));
        return;
    }
    at == At::Finish ? waitUntil([&] { return page.controls().Frame4.visible; }) : finish(page);
    EXPECT_EQ(machine.dialogs.questions.value(0).contains(u":\n"_s + lost + u"\nGo"_s), !lost.isEmpty());
    if (at == At::Compression)
        pull();
    handOver(page);
    if (at == At::Preparing)
        machine.pump.onPump = [this] { fs::exists(card) ? pull() : void(); };
    if (at == At::TakenUp) {
        makeFolder(ordered.path());
        EXPECT_TRUE(OrderJournal(machine.files, ordered).begin(state, OrderState::Way::Ftp, state.handOver.basket));
        chain.unload(PageId::Form2);
        pull();
        begin();
        TidyOrders(state, machine.files);
        const QList<UnfinishedOrder> unfinished = UnfinishedOrders(state, machine.files);
        EXPECT_TRUE(unfinished.size() == 1 && unfinished[0].gone == 0);
        TakeUpOrder(unfinished[0], state, machine.files);
        chain.show(PageId::Form2);
    }
    prepare();
    const QList<QByteArray> printed = prints();
    EXPECT_EQ(printed.size(), lost.isEmpty() ? 2 : 1);
    EXPECT_TRUE(at == At::Editor || printed == QList({jpeg(Qt::red), jpeg(Qt::blue)}).first(printed.size()));
    EXPECT_EQ(machine.dialogs.messages, QStringList());
    EXPECT_TRUE(OrderJournal(machine.files, ordered).sendingBegins(Sender::Ftp, true));
    EXPECT_EQ(machine.files.folders(doorFolders), QStringList()) << "the copies go with the order";
}

INSTANTIATE_TEST_SUITE_P(Steps, PulledAt,
                         testing::Values(Pull{"Listed", At::Listed, "1.jpg\n2.jpg"},
                                         Pull{"Copying", At::Copying, "2.jpg"},
                                         Pull{"HalfCopied", At::HalfCopied, "2.jpg"},
                                         Pull{"Finish", At::Finish, "2.jpg"}, Pull{"Copied", At::Copied},
                                         Pull{"Editor", At::Editor}, Pull{"Compression", At::Compression},
                                         Pull{"Preparing", At::Preparing}, Pull{"TakenUp", At::TakenUp}),
                         [](const testing::TestParamInfo<Pull>& step) { return std::string(step.param.name); });

TEST_F(PulledCards, AreToldApartAtOnePath) {
    put("1.jpg", Qt::red);
    kyoskNew& page = openCard();
    page.Command12_Click(0);
    waitFor(page, safe);
    pull();
    put("1.jpg", Qt::green);
    pick(page, machine.drives.toDrive(card / "1.jpg").text());
    EXPECT_EQ(page.controls().Label4[0].text, u"0"_s) << "the other card's is not chosen";
    page.Command12_Click(0);
    finish(page);
    handOver(page);
    prepare();
    EXPECT_EQ(prints(), QList({jpeg(Qt::red), jpeg(Qt::green)}));
}

// The first card's copy is in hand when the customer has given it up for the second one's.
TEST_F(PulledCards, LeaveNoCopyToThePictureOfAnotherCard) {
    put("1.jpg", Qt::red);
    const QString path = machine.drives.toDrive(card / "1.jpg").text();
    const PictureSource first{card / "1.jpg", stampOf(card / "1.jpg")};
    CardCopies copies(machine.files, doorFolders / u"1");
    const KeptPictures kept(machine.files, doorFolders / u"1");
    makeFolder(doorFolders);
    copies.want({{path, first}}, false);
    pull();
    put("1.jpg", Qt::green, 100);
    const PictureSource second{card / "1.jpg", stampOf(card / "1.jpg")};
    copies.want({{path, second}}, false);
    waitUntil([&] { return copies.stateOf(path) == CardCopies::State::Kept; });
    EXPECT_EQ(kept.copiedStamp(DrivePath(path)), second.stamp);
}

TEST_F(PulledCards, GoOnOncePutInAgainOrWhereTheDiskTakesNoCopy) {
    put("1.jpg", Qt::red, large);
    kyoskNew& page = openCard();
    page.Command12_Click(0);
    pull();
    waitFor(page, u"1 picture is missing: please put the card in again"_s);
    page.Image7_Click(); // and stays: the answer is no
    fs::rename(pulled, card);
    waitFor(page, safe);
    machine.dialogs.messages.clear();
    put("2.jpg", Qt::blue);
    EXPECT_TRUE(machine.files.removeTree(state.keptFolder));
    write(state.keptFolder, "in the way");
    pick(page, machine.drives.toDrive(card / "2.jpg").text());
    int cell = 0;
    while (cell < 11 && page.controls().Picture1[static_cast<std::size_t>(cell)].name != u"2.jpg"_s)
        ++cell;
    page.Command12_Click(cell);
    waitFor(page, u"Please leave the card in"_s);
    EXPECT_EQ(machine.dialogs.messages.size(), 1);
    finish(page);
}

} // namespace
} // namespace lumora
