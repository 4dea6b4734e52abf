#include "order/OrderState.h"

#include "order/EditRecord.h"
#include "order/OrderChoices.h"
#include "order/OrderFolder.h"
#include "support/ExampleOrder.h"
#include "support/Take.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using Phase = OrderState::Phase;

OrderState unfinished() {
    SessionState session = exampleOrder();
    session.Optint = OrderKind::EditedPrint;
    session.TachanaMekomit = true;
    session.transfer.SugSheliach = Sender::Http;
    session.shemot.Hearot = u"100 %0A \"to\r\nthe\"\r\nend\""_s;
    session.album.Tosafot2[8] = u"last"_s;
    OrderState state;
    state.number = u"105"_s;
    state.serial = u"1234"_s;
    state.kind = OrderKind::EditedPrint;
    state.way = OrderState::Way::Http;
    state.items = {u"1 1015GNB"_s + EditRecord::newPicture() + u"C:\\תמונות\\a.jpg"_s,
                   u"2 1015GNBa caption \"in\"\r\ntwo lines"_s};
    state.choices = ChoicesOf(session);
    return state;
}

OrderState parsed(const OrderState& state) {
    return take(OrderState::parse(state.write()));
}

TEST(AnOrderState, keepsEachStepOfTheSendingAndDropsTheBasketWhenItBegins) {
    for (const Phase phase : {Phase::Preparing, Phase::Prepared, Phase::Sending, Phase::Arrived, Phase::Reported}) {
        OrderState state = unfinished();
        state.phase = phase;
        state.way = OrderState::Way::Station;
        state.folderMadeByUs = state.provenByNameOnly = state.fewerAgreed = state.sentBefore = true;
        state.folderAsked = Sender::Http;
        if (phase == Phase::Sending)
            state.filesSent = 3, state.filesInAll = 7;
        state.filesInHand = {u"C:\\a.jpp"_s, u"C:\\ב.jpp"_s};
        state.replaces = u"2026_11_21_KUP_1234^104"_s;
        state.lengths = {{u"a b.jpp"_s, 5'000'000'000}, {u"c.jpp"_s, 0}};
        state.report = OrderState::Report::Begun;
        const OrderState back = parsed(state);
        if (phase >= Phase::Sending)
            state.items.clear();
        if (phase == Phase::Reported) // what the report says is known until it is sent
            state.choices.clear();
        EXPECT_TRUE(back == state) << static_cast<int>(phase);
        SessionState session;
        TakeChoices(back.choices, session);
        EXPECT_TRUE(state.choices.isEmpty() || ChoicesOf(session) == state.choices);
    }
}

TEST(AnOrderState, isClearlyDamagedWhereverItIsCut) {
    const QByteArray whole = unfinished().write();
    for (qsizetype length = 0; length < whole.size(); ++length) {
        const Result<OrderState> read = OrderState::parse(whole.left(length));
        ASSERT_FALSE(read) << "cut at " << length;
        ASSERT_EQ(read.failure().kind, Failure::Kind::Damaged);
    }
    const QByteArray lacksALine =
        QByteArray(whole).remove(whole.indexOf("\"Way\""), int(strlen("\"Way\",\"http\"\r\n")));
    const QByteArray damaged[] = {lacksALine,
                                  whole + "\"Phase\",\"arrived\"\r\n",
                                  "\"End\",0\r\n",
                                  "\"Phase\",\"arrived\"\r\n\"Length\",\"x a.jpp\"\r\n\"End\",2\r\n",
                                  "\"Phase\",\"lost\"\r\n\"End\",1\r\n",
                                  "\"Phase\",\"arrived\"\r\n\"FolderMadeByUs\",\"-1\"\r\n\"End\",2\r\n",
                                  QByteArray(4096, '\0'),
                                  QByteArray(4096, '"')};
    for (const QByteArray& bytes : damaged)
        EXPECT_FALSE(OrderState::parse(bytes)) << bytes.left(60).toStdString();
}

TEST(AnOrderState, keepsTheKeysOfALaterVersion) {
    const OrderState again =
        parsed(take(OrderState::parse("\"Phase\",\"sending\"\r\n\"Kiosk\",7\r\n\"Kiosk\",\"a%0Db\"\r\n\"End\",3\r\n")));
    ASSERT_EQ(again.further.size(), 2);
    EXPECT_EQ(again.further[0].value, u"7"_s);
    EXPECT_EQ(again.further[1].key + again.further[1].value, u"Kioska\rb"_s);
}

TEST(AnOrderState, liesHiddenInItsFolderAndIsMissedWhereThereIsNone) {
    TestPlatform test;
    const OrderFolder folder(u"C:\\2026_11_21_KUP_1234^105"_path);
    EXPECT_FALSE(WriteOrderState(test.files, folder, unfinished())) << "no folder";
    ASSERT_TRUE(test.files.makeFolder(folder.path()));
    EXPECT_EQ(ReadOrderState(test.files, folder).failure().kind, Failure::Kind::NotFound);
    ASSERT_TRUE(WriteOrderState(test.files, folder, unfinished()));
    EXPECT_EQ(take(ReadOrderState(test.files, folder)).items.size(), 2);
    EXPECT_TRUE(test.files.names(folder.path(), u"*.*"_s).isEmpty());
    ASSERT_TRUE(test.files.writeWhole(folder.filePath(u".order"_s), "rubbish"));
    const Result<OrderState> damaged = ReadOrderState(test.files, folder);
    ASSERT_FALSE(damaged);
    EXPECT_TRUE(damaged.failure().message.contains(u"KUP_1234^105\\.order"_s))
        << damaged.failure().message.toStdString();
}

} // namespace
} // namespace lumora
