#include "platform/QueuePrinter.h"

#include "support/Take.h"
#include "support/TestPlatform.h"

#include <QFile>
#include <QTest>

#include <gtest/gtest.h>

namespace lumora {
namespace {

TEST(AQueuePrinter, TellsWhatBecameOfThePaper) {
    const QTemporaryDir folder;
    const QString program = folder.filePath(u"lp"_s);
    const QByteArray paper(200000, 'x'); // more than a pipe holds
    using Kind = Failure::Kind;
    const struct {
        const char* does;
        std::optional<Kind> kind;
        const char* words = "";
        int limit = 60000; // milliseconds
    } cases[] = {{"test \"$*\" = '-d slips -' && cat >\"$0.paper\"", {}},
                 {"echo 'lp: no such queue' >&2; exit 1", Kind::Refused, "lp: no such queue"},
                 {"exit 0", {}},
                 {"exec sleep 600", Kind::TimedOut, "gave no answer", 100},
                 {nullptr, Kind::NoProgram, "can't be started"}};
    for (const auto& c : cases) {
        SCOPED_TRACE(c.does ? c.does : "no program");
        QFile script(program);
        script.remove();
        if (c.does) {
            ASSERT_TRUE(script.open(QIODevice::WriteOnly));
            script.write(QByteArray("#!/bin/sh\n") + c.does + '\n');
            script.setPermissions(QFile::ReadOwner | QFile::ExeOwner);
            script.close();
        }
        QueuePrinter printer(program, std::chrono::milliseconds(c.limit));
        int told = 0;
        Result<void> outcome;
        printer.print(u"slips"_s, paper, [&](const Result<void>& done) { ++told, outcome = done; });
        ASSERT_TRUE(QTest::qWaitFor([&] { return told > 0; }, 30000));
        QTest::qWait(0);
        EXPECT_EQ(told, 1);
        ASSERT_EQ(outcome.ok(), !c.kind);
        EXPECT_TRUE(outcome || (outcome.failure().kind == c.kind &&
                                outcome.failure().message.contains(QString::fromLatin1(c.words))));
    }
    QFile taken(program + u".paper"_s);
    EXPECT_TRUE(taken.open(QIODevice::ReadOnly) && taken.readAll() == paper);
    QueuePrinter leaves(u"sleep"_s, std::chrono::minutes(1));
    leaves.print(u"600"_s, paper, [](const Result<void>&) { ADD_FAILURE() << "it has gone"; });
}

} // namespace
} // namespace lumora
