#pragma once

#include "session/TextList.h"

#include <utility>
#include <vector>

namespace lumora {

// The working lists of the FTP sender, under the names that the lab's people know.
struct FtpLists {
    TextList List1;          // names in the FTP home directory
    TextList List2;          // names after a make-dir or a manual operation
    TextList List3;          // full local paths of the files of the present pass
    TextList List4;          // names inside the first remote folder
    TextList List5;          // names inside the second: the order folders on the server
    TextList List6;          // names inside the order's folder on the server
    TextList List7;          // every path whose put failed
    TextList List8;          // leaf names used to count pictures
    TextList List9;          // shown as a count and never filled
    TextList List4Makor;     // the whole order; never shrinks
    TextList List4Broken;    // full local paths whose put failed and whose remains must leave the server
    TextList List4BrokenB;   // working copy of their leaf names
    TextList LogList;        // time-stamped lines of trouble
    TextList ListRezefFiles; // order folders of a chain; no page fills it
    TextList List4Tikiyot;   // folders of Command27; no page fills it

    std::vector<std::pair<const char16_t*, const TextList*>> named() const {
        return {{u"List1", &List1},
                {u"List2", &List2},
                {u"List3", &List3},
                {u"List4", &List4},
                {u"List5", &List5},
                {u"List6", &List6},
                {u"List7", &List7},
                {u"List8", &List8},
                {u"List9", &List9},
                {u"List4Makor", &List4Makor},
                {u"List4Broken", &List4Broken},
                {u"List4BrokenB", &List4BrokenB},
                {u"LogList", &LogList},
                {u"ListRezefFiles", &ListRezefFiles},
                {u"List4Tikiyot", &List4Tikiyot}};
    }
};

} // namespace lumora
