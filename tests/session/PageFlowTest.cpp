#include "session/PageFlow.h"

#include <QFile>
#include <QRegularExpression>
#include <QStringList>

#include <gtest/gtest.h>

#include <set>

namespace lumora {

using namespace Qt::StringLiterals;

TEST(PageFlow, isTheTableOfTheHandbook) {
    QFile handbook(QStringLiteral(LUMORA_SOURCE_DIR "/docs/architecture.md"));
    ASSERT_TRUE(handbook.open(QIODevice::ReadOnly));
    static const QRegularExpression row(u"^\\| `(\\w+)` \\| [^|]+ \\| `(\\w+)` \\| (is left|waits) \\|$"_s,
                                        QRegularExpression::MultilineOption);
    QStringList written;
    for (auto rows = row.globalMatch(QString::fromUtf8(handbook.readAll())); rows.hasNext();)
        written += rows.next().capturedTexts().mid(1).join(u' ');
    QStringList built;
    for (const PageWay& way : pageFlow())
        built += u"%1 %2 %3"_s.arg(pageName(way.from), pageName(way.to),
                                   way.then == PageWay::From::Waits ? u"waits"_s : u"is left"_s);
    EXPECT_EQ(written, built);
}

TEST(PageFlow, hasOneWayForWhatHappensOnAPage) {
    std::set<std::pair<PageId, Outcome>> seen;
    for (const PageWay& way : pageFlow())
        EXPECT_TRUE(seen.emplace(way.from, way.outcome).second) << qPrintable(pageName(way.from));
}

} // namespace lumora
