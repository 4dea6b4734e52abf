#pragma once

namespace lumora {

class Files;
class FtpConnection;
class OrderJournal;
struct FtpListing;
struct SessionState;

// Whose order the folder on the server is that bears an order's name: two data folders with one serial make one name.
// As built in, whatever is there counts as the order's own.
class FtpFolderOwner {
public:
    enum class Owner {
        NotAsked, // as built in
        Ours,     // made by this order, or holds this order's log byte for byte; an empty one only where the answer to
                  // its making is not known, or an older version may have made it
        Foreign,
        NotKnown, // the listing could not be read, or the line was cut
    };

    FtpFolderOwner(const SessionState& state, const Files& files)
        : m_state(state)
        , m_files(files) {}

    // True when the owner is asked for; a folder is then never joined without its listing.
    bool asks() const;
    // The connection stands in the folder, whose listing this is; a refused one proves nothing. Fetches the log into a
    // hidden file beside the order's own, which is removed.
    Owner of(const OrderJournal& order, FtpConnection& connection, const FtpListing& listing) const;

private:
    enum class Log { Same, Other, None, NotKnown };
    Log logThere(const OrderJournal& order, FtpConnection& connection) const;

    const SessionState& m_state;
    const Files& m_files;
};

} // namespace lumora
