#include "platform/line/FtpListing.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

TEST(ParseFtpListing, ReadsALineByItsFieldsAndTheRestAsTheName) {
    const struct {
        const char* line;
        const char* name; // null: no entry
        bool folder;
    } cases[] = {
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47 a.jpp", "a.jpp", false},
        {"drwxr-xr-x    2 1        0            4096 Nov 21 03:47 .", ".", true},
        {"drwxr-xr-x    2 lab      lab          4096 Nov 21  2025 five     blanks", "five     blanks", true},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47   leading", "  leading", false},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47 trailing ", "trailing ", false},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47 1 Nov 21 03:47 x", "1 Nov 21 03:47 x", false},
        {"-rw-r--r--    1 lab      4096 Nov 21 03:47 no group", "no group", false},
        {"-rw-r--r--    1 0        0               4 21 Nov 03:47 day first", "day first", false},
        {"-rwxr-xr-x+   1 domain users 0            4 Nov  1 03:47 owner with a blank", "owner with a blank", false},
        {"lrwxrwxrwx    1 0        0               4 Nov 21 03:47 link -> ../target", "link", false},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47 total 12", "total 12", false},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47 \xf9\xec", "של", false},
        {"total 12", nullptr, false},
        {"", nullptr, false},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47", nullptr, false},
        {"-rw-r--r--    1 0        0               4 Nov 41 03:47 x", nullptr, false},
        {"11-21-26  03:47AM       <DIR>          a folder", "a folder", true},
        {"11-21-26  03:47PM       <DIR>            leading", "  leading", true},
        {"11-21-2026  03:47 PM             1,234 a  b.jpp", "a  b.jpp", false},
        {"2026-11-21  03:47                1234  leading", " leading", false},
        {"11-21-26  03:47AM                    x", nullptr, false},
    };
    for (const auto& each : cases) {
        const auto entries = ParseFtpListing(QByteArray(each.line) + "\r\n");
        ASSERT_EQ(entries.size(), each.name ? 1U : 0U) << each.line;
        if (!each.name)
            continue;
        EXPECT_EQ(entries[0].name.toStdString(), each.name) << each.line;
        EXPECT_EQ(entries[0].folder, each.folder) << each.line;
    }
}

} // namespace
} // namespace lumora
