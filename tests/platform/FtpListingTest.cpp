#include "platform/line/FtpListing.h"

#include <QStringList>

#include <gtest/gtest.h>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

TEST(ParseFtpListing, ReadsALineByItsFieldsAndTheRestAsTheName) {
    const struct {
        const char* line;
        const char* name; // null: no entry
        bool folder;
        qint64 length = -1; // -1: not told
    } cases[] = {
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47 a.jpp", "a.jpp", false, 4},
        {"drwxr-xr-x    2 1        0            4096 Nov 21 03:47 .", ".", true},
        {"drwxr-xr-x    2 lab      lab          4096 Nov 21  2025 five     blanks", "five     blanks", true},
        {"-rw-r--r--    1 0        0      9424170000 Nov 21 03:47   leading", "  leading", false, 9424170000},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47 trailing ", "trailing ", false, 4},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47 1 Nov 21 03:47 x", "1 Nov 21 03:47 x", false, 4},
        {"-rw-r--r--    1 lab      4096 Nov 21 03:47 no group", "no group", false, 4096},
        {"-rw-r--r--    1 0        0               4 21 Nov 03:47 day first", "day first", false, 4},
        {"-rwxr-xr-x+   1 domain users 0            4 Nov  1 03:47 owner with a blank", "owner with a blank", false, 4},
        {"lrwxrwxrwx    1 0        0               4 Nov 21 03:47 link -> ../target", "link", false},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47 total 12", "total 12", false, 4},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47 \xf9\xec", "של", false, 4},
        {"-rw-r--r-- 1 lab lab 942417 2026-11-22 01:02 iso date", "iso date", false, 942417},
        {"-rw-r--r-- 1 lab lab 942417 2026-11-22 01:02:03.000000000 +0200 a.jpp", "a.jpp", false, 942417},
        {"-rw-r--r-- 1 lab lab 942417 22. M\xe4rz 2026 a.jpp", "a.jpp", false, 942417},
        {"-rw-r--r-- 1 lab lab 942417 d\xe9"
         "c. 22 01:02 a.jpp",
         "a.jpp", false, 942417},
        {"-rw-r--r-- 1 lab lab 942417 22 \xf0\xe5\xe1 01:02 a.jpp", "a.jpp", false, 942417},
        {"-rw-r--r-- 1 lab lab 942417 11\xe6\x9c\x88 22\xe6\x97\xa5 01:02 a.jpp", "a.jpp", false, 942417},
        {"d [RWCEAFMS] lab               512 Nov 21 03:47 orders", "orders", true},
        {"- [RWCEAFMS] lab            942417 Nov 21 03:47 a.jpp", "a.jpp", false, 942417},
        {"type=dir;modify=20261121034700; a folder", "a folder", true},
        {"type=cdir;modify=20261121034700; .", ".", true},
        {"Type=file;Size=942417;Modify=20261121034700; a.jpp", "a.jpp", false, 942417},
        {"+i8388621.48594,m825718503,/,\ta folder", "a folder", true},
        {"+i8388621.48594,m825718503,r,s942417,\ta.jpp", "a.jpp", false, 942417},
        {"11-21-26  03:47AM       <DIR>          a folder", "a folder", true},
        {"11-21-26  03:47PM       <DIR>            leading", "  leading", true},
        {"11-21-2026  03:47 PM             1,234 a  b.jpp", "a  b.jpp", false, 1234},
        {"2026-11-21  03:47                1234  leading", " leading", false, 1234},
        {"-rw-r--r--    1 0        0               4 Nov 21 03:47", nullptr, false},
        {"-rw-r--r--    1 0        0               4 Nov 41 03:47 x", nullptr, false},
        {"11-21-26  03:47AM                    x", nullptr, false},
    };
    for (const auto& each : cases) {
        const FtpListing listing = ParseFtpListing(QByteArray(each.line) + "\r\n");
        EXPECT_EQ(listing.unread.isEmpty(), each.name != nullptr) << each.line;
        ASSERT_EQ(listing.entries.size(), each.name ? 1U : 0U) << each.line;
        if (!each.name)
            continue;
        EXPECT_EQ(listing.entries[0].name.toStdString(), each.name) << each.line;
        EXPECT_EQ(listing.entries[0].folder, each.folder) << each.line;
        EXPECT_EQ(listing.entries[0].length.value_or(-1), each.length) << each.line;
    }
}

TEST(ParseFtpListing, TellsTheLineThatItCannotRead) {
    const QByteArray line = "-rw-r--r-- 1 0 0 4 Nov 21 03:47 a.jpp\r\n";
    const struct {
        QByteArray listing;
        QStringList names;
        const char* unread = "";
    } cases[] = {
        {"", {}},
        {"total 0\r\n", {}},
        {"\r\ninsgesamt 12\r\n" + line, {u"a.jpp"_s}},
        {line + "total 12\r\n", {u"a.jpp"_s}, "total 12"},
        {line + "b.jpp\r\n", {u"a.jpp"_s}, "b.jpp"},
        {"000.jpg\r\n2026 of ^105\n", {u"000.jpg"_s, u"2026 of ^105"_s}},
        {"000.jpg\r\nls: not found\r\n", {}, "000.jpg"},
        {"No files found.\r\n", {}, "No files found."},
        {"my picture.jpg\r\n", {u"my picture.jpg"_s}},
        {"orders/000.jpg\r\n", {}, "orders/000.jpg"},
        {"A.TXT;1   12/34   21-NOV-2026 03:47\r\n", {}, "A.TXT;1   12/34   21-NOV-2026 03:47"},
    };
    for (const auto& each : cases) {
        const FtpListing listing = ParseFtpListing(each.listing);
        QStringList names;
        for (const FtpEntry& entry : listing.entries)
            names += entry.name;
        EXPECT_EQ(names, each.names) << each.listing.toStdString();
        EXPECT_EQ(listing.unread.toStdString(), each.unread) << each.listing.toStdString();
    }
}

} // namespace
} // namespace lumora
