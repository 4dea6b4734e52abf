#pragma once

#include "session/TextList.h"

#include <utility>
#include <vector>

namespace lumora {

// The working lists of the FTP sender, under the names that the lab's people use.
struct FtpLists {
    TextList File1;          // names in the order's folder on this machine
    TextList List1;          // names in the FTP home directory
    TextList List2;          // names after a make-dir or a manual operation
    TextList List3;          // full local paths of the files of the present pass
    TextList List4;          // names in the first remote folder
    TextList List5;          // names in the second remote folder: the order folders
    TextList List6;          // names in the order's folder on the server
    TextList List7;          // all paths whose put failed
    TextList List8;          // leaf names for counting the pictures
    TextList List9;          // never filled; its count is shown
    TextList List4Makor;     // all files of the order
    TextList List4Broken;    // full local paths whose put failed; their remains on the server must be deleted
    TextList List4BrokenB;   // working copy of their leaf names
    TextList LogList;        // failures with the time
    TextList ListRezefFiles; // order folders of a chain; no page fills it
    TextList List4Tikiyot;   // folders of Command27; no page fills it

    std::vector<std::pair<const char16_t*, const TextList*>> named() const {
        return {{u"File1", &File1},
                {u"List1", &List1},
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
