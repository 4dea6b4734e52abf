#pragma once

#include "common/Result.h"

#include <QStringList>

namespace lumora {

class Files;
struct SessionState;

// The texts that record the basket outside the page's memory, in 2000lumora\Tik4txt: the whole list, and the line of
// the picture that was stored last in a file with its index in front ("07onepic.txt"). Nothing in the program reads
// them.
class HandOverFiles {
public:
    HandOverFiles(const SessionState& state, const Files& files)
        : m_state(state)
        , m_files(files) {}

    // The folder is made when it is missing.
    Result<void> write(const QStringList& lines, int index) const;

    // The index with at least two digits, then "onepic.txt".
    static QString onePicName(int index);

private:
    const SessionState& m_state;
    const Files& m_files;
};

} // namespace lumora
