#include "session/SharedWords.h"
#include "session/SessionState.h"
#include "support/DrivePathLiteral.h"

#include <gtest/gtest.h>

namespace lumora {

using namespace Qt::StringLiterals;

TEST(SharedWords, SpeakOfACardOnlyWhereTheFileMayLieOnOne) {
    SessionState state;
    state.DiskRoot = u"C:\\"_path;
    state.EnglishTips = 1;
    for (const auto& [file, ofCard] :
         {std::pair(u"D:\\DCIM\\a.jpg"_path, true), {u"C:\\p\\a.jpg"_path, false}, {u"Z:\\home\\a.jpg"_path, false}}) {
        for (const Failure::Kind kind : {Failure::Kind::NotFound, Failure::Kind::AccessDenied})
            EXPECT_EQ(failureWords(state, {kind, {}}, file).contains(u"card"_s), ofCard) << qPrintable(file.text());
    }
}

} // namespace lumora
