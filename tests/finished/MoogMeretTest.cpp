#include "finished/orders/MoogMeret.h"

#include "common/ListOutput.h"
#include "finished/mail/MailResult.h"
#include "order/OrderFolder.h"
#include "order/OrderLog.h"
#include "order/OrderState.h"
#include "support/ExampleOrder.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

#include <tuple>

namespace lumora {

namespace {

QDateTime at(const char* time) {
    return {QDate(2026, 11, 21), QTime::fromString(QString::fromLatin1(time), u"HH:mm:ss"_s)};
}

QString leaves(const QStringList& paths) {
    QStringList names;
    for (const QString& path : paths)
        names += path.mid(path.lastIndexOf(u'\\') + 1);
    return names.join(u' ');
}

// Two orders on the disk, one of them in pieces, and the page over them.
class FinishedOrders : public ::testing::Test, protected PageRig {
protected:
    static inline const QString orders = u"C:\\2000lumora\\!!000"_s;
    static inline const QString whole = u"2026_11_20_KUP_1234^104"_s;
    static inline const QString pieces = u"2026_11_21_KUP_1234^105P"_s;
    static QString in(const QString& order, const QString& leaf) { return orders + u'\\' + order + u'\\' + leaf; }

    FinishedOrders() {
        state.shemot.n1 = u"***"_s;
        makeFolder(DrivePath(orders) / whole);
        makeFolder(DrivePath(orders) / pieces);
        for (const char* leaf : {"!104_1234.jpp", "02a.jpp", "11b.JPG", "x.txt"})
            write(whole, QString::fromLatin1(leaf));
        ListOutput log;
        log.pair(u"Shemot.n1"_s, u"דנה לוי"_s).pair(u"Shemot.n2"_s, u"03-1234567"_s).pair(u"Shemot.ppr"_s, u"10/15"_s);
        PageRig::write(DrivePath(in(whole, whole + u".txt"_s)), log.bytes());
        for (const char* leaf :
             {"!105_1234.jpp", "02a_jpp_001_002.prk", "02a_jpp_002_002.prk", "02a.jpp", "kashloo.txt", "z.jpg"})
            write(pieces, QString::fromLatin1(leaf));
        write(pieces, pieces + u".txt"_s);
        registerBare({PageId::hatchala, PageId::FtpFrm, PageId::UploadForm, PageId::SpltForm, PageId::Form2});
        registerPage<MoogMeret>(PageId::MoogMeret);
    }

    void write(const QString& order, const QString& leaf) const {
        PageRig::write(DrivePath(in(order, leaf)), leaf.toUtf8());
    }
    MoogMeret& start() {
        chain.show(PageId::MoogMeret);
        return page();
    }
    MoogMeret& startWith(const QString& order) {
        start().List3_Click(page().controls().List3.find(order));
        return page();
    }
    MoogMeret& page() { return static_cast<MoogMeret&>(*chain.find(PageId::MoogMeret)); }
    static std::string marked(const MoogMeret& page) {
        QStringList names;
        for (int i = 0; i < page.files().names().size(); ++i) {
            if (page.files().isMarked(i))
                names += page.files().names()[i];
        }
        return names.join(u' ').toStdString();
    }
    void tick(const char* time) {
        machine.clock.time = at(time);
        page().Timer3_Tick();
    }
    // Index and minutes of the package in hand, or "over".
    std::string walk() {
        return page().phase() == MoogMeret::Phase::Walking
                   ? (QString::number(page().controls().List1.currentIndex()) + u' ' + page().controls().Label13.text)
                         .toStdString()
                   : "over";
    }
};

} // namespace

TEST_F(FinishedOrders, AreListedAndThePickedOneShowsItsFilesMarkedByItsKind) {
    MoogMeret& page = start();
    EXPECT_EQ(page.controls().List3.items(), QStringList({whole, pieces}));
    EXPECT_EQ(page.controls().List2.items(), QStringList({orders + u'\\' + whole, orders + u'\\' + pieces}));
    EXPECT_EQ(page.orderRow(whole).text, u"מס' 104   20.11.2026"_s);
    EXPECT_TRUE(page.orderRow(whole).hint.isEmpty() && !page.orderRow(pieces).hint.isEmpty());
    EXPECT_EQ(page.orderRow(u"2026_13_21_KUP_1234^105"_s).text, u"2026_13_21_KUP_1234^105"_s) << "no such month";

    const std::tuple<QString, const char*, int, int, int> cases[] = {
        {whole, "!104_1234.jpp 02a.jpp 11b.JPG", 3, 13, 0},
        {pieces, "!105_1234.jpp 02a_jpp_001_002.prk 02a_jpp_002_002.prk", 6, 4, 1},
        {whole, "!104_1234.jpp", 4, 0, 1}, // neither the flag nor the pattern goes back, and texts are listed too
    };
    for (const auto& [order, names, count, pictures, travel] : cases) {
        page.List3_Click(page.controls().List3.find(order));
        EXPECT_TRUE(page.controls().Picture2.visible);
        EXPECT_EQ(state.transfer.OrderFolder.text(), orders + u'\\' + order);
        EXPECT_EQ(marked(page), names);
        EXPECT_EQ(page.controls().Label1.text, QString::number(count));
        EXPECT_EQ(page.controls().Label5.text, QString::number(pictures));
        EXPECT_EQ(state.shemot.TotalPics, pictures);
        EXPECT_EQ(state.transfer.Mefurak, static_cast<Travel>(travel));
        EXPECT_EQ(page.controls().Label4Pieces.visible, travel > 0);
        EXPECT_EQ(page.controls().Label4Pieces.text.startsWith(u"ההזמנה נשלחת בחלקים"), order == pieces);
    }
    EXPECT_EQ(page.controls().Label4Lakoach.text, u"לקוח: דנה לוי 03-1234567");
    page.File1_Click(0);
    page.File1_Click(page.controls().File1.find(whole + u".txt"_s));
    EXPECT_EQ(page.controls().Label5.text, u"0") << "the year in a text's name is no number of pictures";
    page.Command21_Click();
    EXPECT_EQ(page.files().markedCount(), 0);
}

TEST_F(FinishedOrders, ThatAreNoneOrHoldNothingAreToldAndSendNothing) {
    const QString empty = u"2026_11_19_KUP_1234^103"_s;
    makeFolder(DrivePath(orders) / empty);
    machine.dialogs.answers = {true}; // it has no details, and is looked at all the same
    MoogMeret& page = startWith(empty);
    EXPECT_EQ(page.controls().Label1.text, u"0");
    EXPECT_TRUE(page.controls().Label4Reka.visible);
    EXPECT_FALSE(page.controls().Label4Lakoach.visible) << "no text tells whose it is";
    EXPECT_TRUE(page.controls().Picture1.isNull());
    page.Command4_Click();
    page.Command2_Click();
    EXPECT_EQ(machine.dialogs.messages, QStringList({u"לא בחרת קבצים למשלוח מתוך החלון הצהב\rקרא הנחיות שלב שני"_s,
                                                     u"לא בחרת קבצים למשלוח מתוך החלון הצהב"_s}));
    EXPECT_TRUE(page.controls().Command4.visible && page.controls().Command2.visible);
    EXPECT_EQ(chain.front(), &page);

    std::filesystem::remove_all(host(DrivePath(orders)));
    page.List3_Click(1);
    EXPECT_TRUE(machine.dialogs.messages.last().contains(page.controls().List2.item(1))) << "gone since it was listed";
    page.Command5_Click();
    EXPECT_TRUE(page.controls().Label4Rek.visible);
    EXPECT_FALSE(page.controls().Picture2.visible);
}

TEST_F(FinishedOrders, GoOutAgainAsAListThatBeginsWithTheText) {
    const QString text = whole + u".txt "_s;
    // The mark of a file turns over, after all is chosen or after nothing is.
    const std::tuple<QString, const char*, bool, QString, const char*> cases[] = {
        {whole, "", true, text + u"!104_1234.jpp 02a.jpp 11b.JPG"_s, "!104_1234.jpp 02a.jpp 11b.JPG"},
        {whole, "02a.jpp", false, text + u"02a.jpp !104_1234.jpp"_s, "!104_1234.jpp 02a.jpp"},
        {whole, "", false, text + u"!104_1234.jpp"_s, "!104_1234.jpp"},
        {pieces, "kashloo.txt", true, pieces + u".txt !105_1234.jpp 02a_jpp_001_002.prk 02a_jpp_002_002.prk"_s,
         "!105_1234.jpp 02a_jpp_001_002.prk 02a_jpp_002_002.prk"},
    };
    for (const auto& [order, touched, all, sent, mailed] : cases) {
        MoogMeret& page = startWith(order);
        if (!all)
            page.Command21_Click();
        page.File1_Click(page.controls().File1.find(QString::fromLatin1(touched)));
        EXPECT_EQ(leaves(page.files().mailList()).toStdString(), mailed);
        state.transfer.SugMishloah = Sending::NewOrder;
        page.Command4_Click();
        ASSERT_EQ(chain.front()->id(), PageId::FtpFrm);
        EXPECT_EQ(leaves(state.handOver.lines).toStdString(), sent.toStdString());
        EXPECT_EQ(state.handOver.lines.value(0), in(order, order + u".txt"_s));
        EXPECT_EQ(state.transfer.SugMishloah, Sending::Resend);
        EXPECT_EQ(chain.find(PageId::MoogMeret), nullptr);
        chain.unload(PageId::FtpFrm);
    }
    // The order's text may be marked as well, and travels once.
    MoogMeret& page = startWith(pieces);
    page.File1_Click(page.controls().File1.find(pieces + u".txt"_s));
    EXPECT_EQ(page.files().resendList().count(in(pieces, pieces + u".txt"_s)), 1);

    state.transfer.SugSheliach = Sender::Http;
    state.handOver.lines.clear();
    page.Command4_Click();
    EXPECT_EQ(chain.front()->id(), PageId::UploadForm);
    EXPECT_TRUE(state.handOver.lines.isEmpty()) << "that sender takes the folder whole";
    EXPECT_EQ(state.transfer.OrderFolder.text(), orders + u'\\' + pieces);
    chain.unload(PageId::UploadForm);

    state.Careful = true;
    startWith(whole).Command4_Click();
    EXPECT_EQ(chain.front()->id(), PageId::FtpFrm) << "its sheet is a print file: it was made for FTP";
}

TEST_F(FinishedOrders, ThatAreNotFinishedAreMarkedAndOfferedBeforeTheyArePicked) {
    state.profile.JppChunks = 56;
    const QString name = u"2026_11_22_KUP_1234^106"_s;
    const OrderFolder folder{DrivePath(orders) / name};
    const auto give = [&](bool withState, const QStringList& basket) {
        makeFolder(folder.path());
        PageRig::write(folder.filePath(u"1 1015GNB0000_016F6E65.jpp"_s), examplePrint(state.profile));
        OrderState order;
        order.number = u"106"_s;
        order.kind = OrderKind::Print;
        order.items = basket;
        if (withState) {
            EXPECT_TRUE(WriteOrderState(machine.files, folder, order));
        }
    };
    const QStringList complete = {u"1 1015GNBC:\\one.jpg"_s};
    const QStringList lacking = complete + QStringList{u"1 1015GNBC:\\gone.jpg"_s};
    const struct {
        bool withState;
        QStringList basket;
        QList<bool> answers;
        bool picked, there, goesOn;
    } cases[] = {
        {true, complete, {true}, false, true, true},
        {true, lacking, {true, true}, false, true, true},
        {true, lacking, {true, false}, false, true, false}, // it waits for the pictures
        {true, complete, {false, false}, false, true, false},
        {true, complete, {false, true}, false, false, false},
        {false, {}, {true}, true, true, false},
        {false, {}, {false, false}, false, true, false},
        {false, {}, {false, true}, false, false, false},
    };
    for (const auto& c : cases) {
        give(c.withState, c.basket);
        MoogMeret& page = start();
        EXPECT_EQ(page.orderRow(name).mark, u"לא הושלמה");
        EXPECT_TRUE(page.orderRow(pieces).mark.isEmpty());
        machine.dialogs.answers = c.answers;
        page.List3_Click(page.controls().List3.find(name));
        EXPECT_TRUE(machine.dialogs.answers.isEmpty()) << (&c - cases);
        EXPECT_EQ(chain.front()->id(), c.goesOn ? PageId::Form2 : PageId::MoogMeret) << (&c - cases);
        EXPECT_EQ(machine.files.folderExists(folder.path()), c.there) << (&c - cases);
        if (!c.goesOn) {
            EXPECT_EQ(page.phase(), c.picked ? MoogMeret::Phase::Picked : MoogMeret::Phase::Orders);
            EXPECT_EQ(page.controls().List3.count(), c.there ? 3 : 2);
        } else {
            EXPECT_EQ(state.handOver.takenUp, folder.path());
        }
        chain.unload(chain.front()->id());
        chain.unload(PageId::MoogMeret);
        std::filesystem::remove_all(host(folder.path()));
    }
    // Prepared again under another number.
    give(true, complete);
    const OrderFolder again(DrivePath(orders) / u"2026_11_22_KUP_1234^107"_s);
    makeFolder(again.path());
    OrderState order;
    order.replaces = name;
    ASSERT_TRUE(WriteOrderState(machine.files, again, order));
    MoogMeret& page = start();
    page.List3_Click(page.controls().List3.find(name));
    EXPECT_EQ(page.phase(), MoogMeret::Phase::Orders);
    EXPECT_TRUE(machine.dialogs.messages.last().contains(u"107"_s));
}

TEST_F(FinishedOrders, AnOrderFromThePreparationIsPickedAlready) {
    state.transfer.OrderFolder = DrivePath(orders + u'\\' + whole);
    state.shemot.n1 = u"Dana"_s;
    state.handOver.lines = {in(whole, whole)};
    MoogMeret& page = start();
    EXPECT_EQ(page.controls().List3.currentItem(), whole);
    EXPECT_EQ(marked(page), "!104_1234.jpp 02a.jpp 11b.JPG");
    EXPECT_EQ(leaves(page.controls().List1.items()), whole + u" !104_1234.jpp 02a.jpp 11b.JPG"_s);
    EXPECT_TRUE(state.handOver.lines.isEmpty());
    EXPECT_EQ(page.controls().Label23.text, u"Dana");
}

TEST_F(FinishedOrders, AskBeforeASecondRunOfTheProgramGoesOn) {
    for (const bool yes : {true, false}) {
        const Instances other(machine.drives.dataFolder());
        machine.dialogs.answers = {yes};
        start();
        EXPECT_TRUE(machine.dialogs.questions.takeFirst().startsWith(u"Create another instance of this project"));
        EXPECT_EQ(machine.dialogs.questionTitles.takeFirst(), u"Send E-Mail Project");
        EXPECT_EQ(chain.hasEnded(), !yes);
        chain.unload(PageId::MoogMeret);
    }
}

TEST_F(FinishedOrders, EachPackageStaysUntilTheClockHasCountedThreeMinutes) {
    MoogMeret& page = startWith(whole);
    machine.clock.time = at("10:00:59");
    page.Command2_Click();
    EXPECT_FALSE(page.controls().Command2.visible || page.controls().Command4.visible ||
                 page.controls().Command18.visible);
    EXPECT_TRUE(page.controls().Label24.visible && page.clockRuns());
    EXPECT_EQ(page.controls().Label4Mana.text, u"מנה 1 מתוך 3");

    const std::pair<const char*, const char*> cases[] = {
        {"10:00:59", "0 0"}, {"10:01:00", "0 1"}, // a border of a minute, a second later
        {"10:02:59", "0 2"}, {"10:03:00", "0 3"},  {"10:03:01", "1 0"},  {"10:05:59", "1 2"},
        {"10:06:00", "1 3"}, {"10:06:00", "2 0"},  {"09:30:00", "2 0"}, // the clock was set back
        {"09:33:00", "2 3"}, {"09:33:00", "over"}, {"09:50:00", "over"},
    };
    for (const auto& [time, stands] : cases) {
        tick(time);
        EXPECT_EQ(walk(), stands) << time;
    }
    EXPECT_TRUE(page.controls().Command18.visible && page.controls().Command2.visible &&
                page.phase() == MoogMeret::Phase::Walked && page.clockRuns());
    EXPECT_FALSE(page.controls().Label24.visible);
    EXPECT_EQ(page.controls().Label4Shaa.text, u"09:50:00") << "the timer runs on";
    EXPECT_TRUE(machine.mail.messages.isEmpty()) << "no mail server is set up";

    chain.unload(PageId::MoogMeret);
    state.Careful = true;
    MoogMeret& careful = startWith(whole);
    EXPECT_TRUE(careful.controls().Label4EinDoar.visible && !careful.controls().Command2.enabled);
    careful.Command2_Click();
    EXPECT_EQ(careful.phase(), MoogMeret::Phase::Picked) << "nothing is played that is not sent";
}

TEST_F(FinishedOrders, AWalkThatIsStoppedStandsAndBeginsAnewWithTheFilesMarkedThen) {
    MoogMeret& page = startWith(whole);
    machine.clock.time = at("10:00:00");
    page.Command2_Click();
    tick("10:03:00");
    page.Label13_Click();
    EXPECT_EQ(page.controls().Label13.text, u"0");
    tick("10:03:00");
    EXPECT_EQ(walk(), "0 3") << "counted from the start of the package again";
    tick("10:03:00");
    EXPECT_EQ(walk(), "1 0");
    page.Command4_Click();
    page.List3_Click(1);
    page.Command5_Click();
    EXPECT_EQ(page.controls().List3.currentItem(), whole) << "nothing is picked while packages go";
    page.Command19_Click();
    EXPECT_FALSE(page.clockRuns());
    EXPECT_EQ(page.controls().List1.currentIndex(), 1);

    page.File1_Click(0);
    page.File1_Click(1);
    page.Command2_Click();
    EXPECT_EQ(leaves(page.controls().List1.items()), u"!104_1234.jpp 11b.JPG");
    EXPECT_EQ(page.controls().List1.currentIndex(), 0);
}

// Of four packages two have gone when the customer stops.
TEST_F(FinishedOrders, AStoppedWalkGoesOnWithWhatIsUnsentWhereTheLabIsCareful) {
    state.profile.mail.host = u"192.0.2.25"_s;
    const QString order = u"2026_11_22_KUP_1234^106"_s;
    const OrderFolder folder{DrivePath(orders) / order};
    makeFolder(folder.path());
    const QStringList prints = {u"1 1015GNB0000_016F6E65.jpp"_s, u"1 1015GNB0001_016F6E65.jpp"_s,
                                u"1 1015GNB0002_016F6E65.jpp"_s};
    for (const QString& leaf : prints + QStringList{u"!106_1234.jpp"_s})
        write(order, leaf);
    state.MisparHazmana = u"106"_s;
    const QStringList basket(3, u"1 1015GNBC:\\pics\\one.jpg"_s);
    PageRig::write(folder.logPath(),
                   OrderLog::of(state, OrderLog::Layout::Plain, basket, {}, machine.clock.time).write());
    MoogMeret& part = startWith(order);
    part.File1_Click(part.controls().File1.find(prints[0]));
    machine.clock.time = at("10:00:00");
    part.Command2_Click();
    for (int minute = 3; part.phase() == MoogMeret::Phase::Walking; minute += 3)
        tick(u"10:%1:00"_s.arg(minute, 2, 10, QChar(u'0')).toLatin1().constData());
    EXPECT_TRUE(part.walk().allSent());
    EXPECT_FALSE(ReadOrderState(machine.files, folder)) << "a part is not the order";
    chain.unload(PageId::MoogMeret);
    for (const bool careful : {false, true}) {
        state.Careful = careful;
        machine.mail.messages.clear();
        MoogMeret& page = startWith(order);
        machine.clock.time = at("10:00:00");
        page.Command2_Click();
        for (const char* time : {"10:03:00", "10:03:00"})
            tick(time);
        page.Command19_Click();
        ASSERT_EQ(machine.mail.messages.size(), 2);
        machine.dialogs.answers = {true};
        page.Command2_Click();
        EXPECT_EQ(page.controls().List1.currentIndex(), careful ? 2 : 0);
        for (int minute = 20; page.phase() == MoogMeret::Phase::Walking; minute += 3)
            tick(u"10:%1:00"_s.arg(minute).toLatin1().constData());
        EXPECT_EQ(machine.mail.messages.size(), careful ? 4 : 6);
        EXPECT_TRUE(page.walk().allSent());
        EXPECT_EQ(take(ReadOrderState(machine.files, folder)).way, OrderState::Way::Mail);
        chain.unload(PageId::MoogMeret);
    }
    // Careful: fewer prints than the log names go only if the customer wants it, and none not at all.
    machine.dialogs.answers.clear();
    machine.dialogs.questions.clear();
    MoogMeret& page = startWith(order);
    page.File1_Click(page.controls().File1.find(prints[0]));
    page.Command2_Click();
    EXPECT_TRUE(machine.dialogs.questions.value(0).contains(u"3")) << "the log's number";
    EXPECT_EQ(page.phase(), MoogMeret::Phase::Picked);
    page.Command21_Click();
    page.File1_Click(page.controls().File1.find(u"!106_1234.jpp"_s));
    page.Command2_Click();
    EXPECT_EQ(machine.dialogs.messages.last(), u"אין בהזמנה זו אף תמונה להדפסה, ולכן לא נשלח דבר.");
    EXPECT_EQ(machine.mail.messages.size(), 4);
}

TEST_F(FinishedOrders, ThePackagesGoByMailAsTheyAreSelected) {
    state.profile.mail.host = u"192.0.2.25"_s;
    machine.mail.outcomes = {{}, {MailEnd::NoContact, u"no route"_s}};
    MoogMeret& page = startWith(whole);
    machine.clock.time = at("10:00:00");
    page.Command2_Click();
    ASSERT_EQ(machine.mail.messages.size(), 1) << "the first one at once";
    EXPECT_EQ(machine.mail.messages[0].subject, whole);
    EXPECT_EQ(machine.mail.messages[0].attachment, host(DrivePath(in(whole, u"!104_1234.jpp"_s))));
    for (const char* word : {"דנה לוי", "03-1234567", "10/15", "!104_1234.jpp", "מנה 1 מתוך 3"})
        EXPECT_TRUE(machine.mail.messages[0].body.contains(QString::fromUtf8(word))) << word;
    EXPECT_EQ(page.controls().Label4Doar.text, MailResultText(0, false).trimmed());

    for (const char* time : {"10:03:00", "10:03:00", "10:06:00", "10:06:00", "10:09:00", "10:09:00"})
        tick(time);
    EXPECT_EQ(walk(), "over");
    ASSERT_EQ(machine.mail.messages.size(), 3);
    EXPECT_EQ(page.walk().fate(1), PackageWalk::Fate::Failed);
    EXPECT_EQ(page.walk().nextUnsent(-1), 1);
    EXPECT_TRUE(page.controls().Label4Sof.text.startsWith(u"נשלחו 2 מתוך 3"));
    EXPECT_TRUE(machine.files.fileExists(DrivePath(in(whole, u"02a.jpp"_s))));

    machine.mail.outcomes = {{MailEnd::RecipientRefused, {}}};
    page.List1_Click(0);
    EXPECT_EQ(machine.mail.messages.size(), 3) << "the server has it";
    page.List1_Click(1);
    EXPECT_EQ(page.controls().Label4Doar.text, MailResultText(14, false));
    page.List1_Click(1);
    EXPECT_EQ(machine.mail.messages.size(), 5);
    EXPECT_EQ(machine.mail.messages.last().attachment, host(DrivePath(in(whole, u"02a.jpp"_s))));
    EXPECT_EQ(page.controls().Label4Sof.text, u"כל 3 המנות נשלחו בדואר.");
}

TEST_F(FinishedOrders, NothingElseHappensWhileAMessageIsBeingSent) {
    state.profile.mail.host = u"192.0.2.25"_s;
    machine.mail.onSend = [&] {
        MoogMeret& busy = page();
        EXPECT_TRUE(busy.answer() == MoogMeret::Answer::Sending);
        tick("10:09:00");
        busy.Command2_Click();
        busy.Command13_Click();
        busy.Command4_Click();
        busy.Command28_Click();
        busy.List1_Click(1);
        busy.List3_Click(1);
        busy.Command5_Click();
    };
    MoogMeret& page = startWith(whole);
    machine.clock.time = at("10:00:00");
    page.Command2_Click();
    EXPECT_EQ(machine.mail.messages.size(), 1);
    EXPECT_EQ(page.controls().List1.currentIndex(), 0);
    EXPECT_EQ(chain.front(), &page);
    EXPECT_EQ(page.controls().Label13.text, u"0") << "the minutes begin when the message is gone";

    // Stopped in the middle of a message: that one is finished, and none follows.
    machine.mail.onSend = [&] { this->page().Command19_Click(); };
    page.Command19_Click();
    page.Command2_Click();
    EXPECT_FALSE(page.phase() == MoogMeret::Phase::Walking || page.clockRuns());
    EXPECT_EQ(page.walk().fate(0), PackageWalk::Fate::Sent);
    EXPECT_TRUE(page.controls().Command2.visible);
}

TEST(MailResultTest, EveryEndOfAnExchangeHasItsOwnWords) {
    QStringList texts;
    for (int end = int(MailEnd::Sent); end <= int(MailEnd::Refused); ++end)
        texts += MailResultText(MailResultCode(MailEnd(end)), false);
    EXPECT_EQ(texts.removeDuplicates(), 0);
    EXPECT_FALSE(texts.contains(QString()));
    EXPECT_FALSE(texts.contains(MailResultText(-1, false)));
}

} // namespace lumora
