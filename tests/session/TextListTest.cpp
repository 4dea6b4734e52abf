#include "session/TextList.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

TEST(TextList, KeepsTheMarkOnItsLineWhileOthersComeAndGo) {
    TextList list;
    list.append({u"a"_s, u"b"_s, u"c"_s});
    list.setCurrentIndex(1);
    list.insert(0, u"0"_s);
    EXPECT_EQ(list.currentItem(), u"b");
    list.removeAt(0);
    list.removeAt(2);
    EXPECT_EQ(list.currentItem(), u"b");
    list.removeAt(1);
    EXPECT_EQ(list.currentIndex(), -1) << "its line is gone";
}

} // namespace
} // namespace lumora
