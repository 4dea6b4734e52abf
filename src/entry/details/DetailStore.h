#pragma once

#include "common/Result.h"
#include "platform/files/Files.h"

#include <QString>

#include <cstddef>
#include <optional>

namespace lumora {

struct SessionState;

// The details that a customer asked to be remembered: pratim.txt, pratim2.txt and pratim3.txt in the root of the
// workspace. The tables are in docs/formats.md.
class DetailStore {
public:
    DetailStore(const SessionState& state, const Files& files)
        : m_state(state)
        , m_files(files) {}

    struct Customer {
        QString name;
        QString telephone;
    };
    // pratim.txt. Reading gives nothing when there is no file, or one that ends before the name; a missing telephone is
    // empty.
    Result<void> SaveDetails(const Customer& customer) const;
    Result<std::optional<Customer>> details() const;
    // Removes the file, so that the next customer at this machine does not see it. A missing file is no failure.
    Result<void> forgetDetails() const;

    struct Photographer {
        QString name;
        QString telephone;
        QString mailName; // the part before the "@"
    };
    // pratim2.txt. An empty field leaves out its line, so that the following lines move up, and the reader does not
    // correct for it: it takes lines 1 to 3 as they come, and only those of more than four characters. Others are left
    // empty.
    Result<void> SaveAlbumDetails(const Photographer& photographer) const;
    Result<std::optional<Photographer>> albumDetails() const;

    // pratim3.txt, which this program never writes.
    Result<void> forgetQuickDetails() const;

private:
    DrivePath path(std::size_t store) const;
    Result<std::optional<QStringList>> lines(std::size_t store) const;
    Result<void> forget(std::size_t store) const;

    const SessionState& m_state;
    const Files& m_files;
};

} // namespace lumora
