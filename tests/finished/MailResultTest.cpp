#include "finished/mail/MailResult.h"

#include <QList>
#include <QStringList>

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(MailResultTest, OnlyTheCodesWithoutWordsGiveNone) {
    const QList<int> silent = {16, 17, 19, 20, 22, 23, 24, 26};
    const QList<int> unclear = {-1, 7, 15, 25, 27, 1000};
    for (const bool english : {false, true}) {
        for (int code = -1; code <= 1000; code = code == 30 ? 1000 : code + 1) {
            const QString text = MailResultText(code, english);
            EXPECT_EQ(text.isEmpty(), silent.contains(code)) << code;
            EXPECT_EQ(text == MailResultText(-1, english), unclear.contains(code) || code > 26) << code;
        }
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
