#pragma once

#include "common/PaperSize.h"

#include <QStringList>

#include <optional>

namespace lumora {

class Files;
struct BasketLine;
struct SessionState;

// Gives each picture of an edited order that was never opened the record that the editor gives on opening: the place in
// the middle of the paper, and the frame of the order's border. As built in, its record puts it off the paper, and only
// the picture that is stretched over the paper prints.
class OpenedRecords {
public:
    OpenedRecords(const SessionState& state, const Files& files, std::optional<PaperSize> paper)
        : m_state(state)
        , m_files(files)
        , m_paper(paper) {}

    // The lines of the basket; those of pictures that can't be read, and all without a paper, stay as they are.
    QStringList of(const QStringList& lines) const;

private:
    QString recordOf(const BasketLine& line) const;

    const SessionState& m_state;
    const Files& m_files;
    const std::optional<PaperSize> m_paper;
};

} // namespace lumora
