#include "common/DrivePath.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(DrivePath, TakesPathsApart) {
    const struct {
        const char* path;
        const char* leaf;
        const char* stem;
        const char* folder;
    } cases[] = {
        {"C:\\pics\\a.jpg", "a.jpg", "a", "C:\\pics"},
        {"C:\\pics\\", "", "", "C:\\pics"},
        {"C:\\", "", "", "C:"},
        {"a.jpg", "***", "", "***"},
        {"***", "***", "", "***"},
        {"", "***", "", "***"},
        {"\\a", "a", "", "***"},
    };
    for (const auto& each : cases) {
        const DrivePath path(QString::fromLatin1(each.path));
        EXPECT_EQ(path.leaf().toStdString(), each.leaf) << each.path;
        EXPECT_EQ(path.stem().toStdString(), each.stem) << each.path;
        EXPECT_EQ(path.folder().text().toStdString(), each.folder) << each.path;
    }
}

TEST(DrivePath, JoinsAndMakesFlatNames) {
    EXPECT_EQ((DrivePath(u"D:\\"_s) / u"a").text(), u"D:\\a"_s);
    EXPECT_EQ((DrivePath(u"D:\\b"_s) / u"a").text(), u"D:\\b\\a"_s);
    EXPECT_EQ(MangleFileName(DrivePath(u"C:\\תמונות\\a.jpg"_s)), u"C;]תמונות]a.jpg"_s);
}

} // namespace
} // namespace lumora
