#include "finished/mail/MailResult.h"

#include <QStringList>

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(MailResultTest, OnlyTheCodesWithoutWordsGiveNone) {
    for (const bool english : {false, true}) {
        for (const int silent : {16, 17, 19, 20, 22, 23, 24, 26})
            EXPECT_EQ(MailResultText(silent, english), QString()) << silent;
        for (const int unclear : {7, 15, 25, 27, 1000})
            EXPECT_EQ(MailResultText(unclear, english), MailResultText(-1, english)) << unclear;
    }
    EXPECT_EQ(MailResultText(3, false), u" תוכנת הדואר לא הוגדרה כראוי"_s + u"המחשב לא יצר קשר עם שרת הדואר שלך"_s);
}

TEST(MailResultTest, EveryEndOfAnExchangeHasItsOwnWords) {
    QStringList texts;
    for (int end = int(MailEnd::Sent); end <= int(MailEnd::Refused); ++end)
        texts += MailResultText(MailResultCode(MailEnd(end)), false);
    EXPECT_EQ(texts.removeDuplicates(), 0);
    EXPECT_FALSE(texts.contains(QString()));
    EXPECT_FALSE(texts.contains(MailResultText(-1, false)));
}

} // namespace
} // namespace lumora
