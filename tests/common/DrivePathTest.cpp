#include "common/DrivePath.h"

#include <gtest/gtest.h>

#include <array>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(DrivePath, TakesPathsApart) {
    const std::array<const char*, 4> cases[] = {
        {"C:\\pics\\a.jpg", "a.jpg", "a", "C:\\pics"},
        {"C:\\pics\\", "", "", "C:\\pics"},
        {"C:\\", "", "", "C:"},
        {"a.jpg", "***", "", "***"},
        {"***", "***", "", "***"},
        {"", "***", "", "***"},
        {"\\a", "a", "", "***"},
    };
    for (const auto& [text, leaf, stem, folder] : cases) {
        const DrivePath path(QString::fromLatin1(text));
        EXPECT_EQ(path.leaf().toStdString(), leaf) << text;
        EXPECT_EQ(path.stem().toStdString(), stem) << text;
        EXPECT_EQ(path.folder().text().toStdString(), folder) << text;
    }
}

TEST(DrivePath, JoinsAndMakesFlatNames) {
    EXPECT_EQ((DrivePath(u"D:\\"_s) / u"a").text(), u"D:\\a"_s);
    EXPECT_EQ((DrivePath(u"D:\\b"_s) / u"a").text(), u"D:\\b\\a"_s);
    EXPECT_EQ(MangleFileName(DrivePath(u"C:\\תמונות\\a.jpg"_s)), u"C;]תמונות]a.jpg"_s);
}

} // namespace
} // namespace lumora
