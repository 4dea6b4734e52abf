#pragma once

#include "platform/files/HostPath.h"
#include "platform/line/Internet.h"

#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace lumora {

// Puts files by several connections at once. A thread holds a connection and a file, for one call; everything else
// belongs to the thread that uses this. A line that can't be opened is left out, and no word is lost about it: many a
// server lets an address in once. A line whose put has failed is opened anew, but for one that failed before its third
// file, so that a server that ends sessions early is not asked again and again.
class UploadLines {
public:
    // Called on threads of their own.
    using Open = std::function<Result<std::unique_ptr<FtpConnection>>()>;

    // first: stands where the files go. The others are opened at once.
    UploadLines(Open open, int lines, std::unique_ptr<FtpConnection> first);
    // No line is opened any more.
    void close() { m_closed = true; }
    // Waits for the calls under way.
    ~UploadLines();
    UploadLines(const UploadLines&) = delete;
    UploadLines& operator=(const UploadLines&) = delete;

    bool canTake() const;   // a file
    bool isPutting() const; // at least one
    bool isOpening() const; // at least one line
    // By a line that is free. number: the caller's own.
    void put(int number, const HostPath& local, const QString& remoteName);

    struct Ended {
        int number;
        Result<void> result;
        bool second; // of its session, whose first one went well
    };
    // Waits so long at most for the end of a put.
    std::optional<Ended> wait(std::chrono::milliseconds most);

    // A connection that still stands, for which no call is under way; none where each line has failed.
    std::unique_ptr<FtpConnection> takeOne();

private:
    struct Line;
    struct Calls;

    void open(Line& line);
    template <class Work>
    void begin(Line& line, Work work);

    Open m_open;
    std::unique_ptr<Calls> m_calls;
    std::vector<std::unique_ptr<Line>> m_lines;
    bool m_closed = false;
};

} // namespace lumora
