#include "common/PaperSize.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(APaperSize, isReadFromTheEndsOfItsTextOrFromFourDigits) {
    struct Case {
        const char16_t *paper, *code;
        std::optional<PaperSize> size;
        bool digitsTell;
    };
    for (const auto& [paper, code, size, digitsTell] : {
             Case{u"10/15", u"1015", PaperSize{10, 15}, true},
             Case{u"09/13", u"0913", PaperSize{9, 13}, true},
             Case{u"9/13", u"9/13", PaperSize{9, 13}, true},
             Case{u"", u"", {}, false},
             Case{u"***", u"****", {}, false},
             Case{u"zz/zz", u"zzzz", {}, false},
             Case{u"10/zz", u"10zz", {}, false},
             Case{u"00/15", u"0015", {}, false},
             Case{u"-1/15", u"-115", {}, false},
             Case{u"5", u"55", PaperSize{5, 5}, false},
         }) {
        const QString text = QString::fromUtf16(paper);
        EXPECT_EQ(SizeCode(text), QString::fromUtf16(code));
        EXPECT_EQ(PaperSize::ofText(text), size) << text.toStdString();
        EXPECT_EQ(PaperSize::ofDigits(SizeCode(text)), digitsTell ? size : std::nullopt) << text.toStdString();
    }
    EXPECT_EQ(SizeCode(u"9/5"_s, u"_"_s), u"9/_/5"_s) << "a short text repeats its ends";
}

} // namespace
} // namespace lumora
