#include "common/DrivePathText.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

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
    EXPECT_EQ(MangleFileName(QStringLiteral("C:\\תמונות\\a.jpg")), QStringLiteral("C;]תמונות]a.jpg"));
    EXPECT_EQ(JoinDrivePath(QStringLiteral("D:\\"), QStringLiteral("a")), QStringLiteral("D:\\a"));
    EXPECT_EQ(JoinDrivePath(QStringLiteral("D:\\b"), QStringLiteral("a")), QStringLiteral("D:\\b\\a"));
}

} // namespace
} // namespace lumora
