#include "common/DrivePathText.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(DrivePathText, TakesPathsApart) {
    const struct {
        const char* path;
        const char* leaf;
        const char* parent;
        const char* folder;
    } cases[] = {
        {"C:\\pics\\a.jpg", "a.jpg", "C:\\pics", "C:\\pics"},
        {"C:\\pics\\", "", "C:", "C:\\pics"},
        {"C:\\", "", "***", "C:"},
        {"a.jpg", "***", "***", "***"},
        {"***", "***", "***", "***"},
        {"", "***", "***", "***"},
        {"\\a", "a", "", "***"},
    };
    for (const auto& each : cases) {
        const QString path = QString::fromLatin1(each.path);
        EXPECT_EQ(LeafName(path).toStdString(), each.leaf) << each.path;
        EXPECT_EQ(ParentFolder(path).toStdString(), each.parent) << each.path;
        EXPECT_EQ(FolderOfPath(path).toStdString(), each.folder) << each.path;
    }
}

TEST(DrivePathText, MakesFlatNamesAndJoins) {
    EXPECT_EQ(MangleFileName(u"C:\\תמונות\\a.jpg"_s), u"C;]תמונות]a.jpg"_s);
    EXPECT_EQ(JoinDrivePath(u"D:\\"_s, u"a"_s), u"D:\\a"_s);
    EXPECT_EQ(JoinDrivePath(u"D:\\b"_s, u"a"_s), u"D:\\b\\a"_s);
}

} // namespace
} // namespace lumora
