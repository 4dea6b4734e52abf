#include "transfer/ftp/UploadLines.h"

#include <algorithm>
#include <condition_variable>
#include <deque>
#include <mutex>
#include <thread>
#include <utility>

namespace lumora {

namespace {

constexpr int enoughPuts = 2; // of a session that is worth another one

} // namespace

struct UploadLines::Line {
    enum class Does { Nothing, Opens, Puts };

    std::unique_ptr<FtpConnection> connection;
    std::thread thread;
    Does does = Does::Nothing;
    int number = 0; // of the file
    int puts = 0;   // of its session, that went well
    Result<void> result;
};

// The lines whose call has ended, in that order.
struct UploadLines::Calls {
    std::mutex mutex;
    std::condition_variable told;
    std::deque<Line*> ended;
};

UploadLines::UploadLines(Open open, int lines, std::unique_ptr<FtpConnection> first)
    : m_open(std::move(open))
    , m_calls(std::make_unique<Calls>()) {
    for (int i = 0; i < lines; ++i)
        m_lines.push_back(std::make_unique<Line>());
    if (!m_lines.empty())
        m_lines.front()->connection = std::move(first);
    for (std::size_t i = 1; i < m_lines.size(); ++i)
        this->open(*m_lines[i]);
}

UploadLines::~UploadLines() {
    for (const auto& line : m_lines) {
        if (line->thread.joinable())
            line->thread.join();
    }
}

template <class Work>
void UploadLines::begin(Line& line, Work work) {
    line.thread = std::thread([&line, calls = m_calls.get(), work = std::move(work)] {
        line.result = work();
        const std::lock_guard lock(calls->mutex);
        calls->ended.push_back(&line);
        calls->told.notify_one();
    });
}

void UploadLines::open(Line& line) {
    line.does = Line::Does::Opens;
    line.puts = 0;
    begin(line, [&line, open = m_open]() -> Result<void> {
        auto opened = open();
        if (!opened)
            return opened.failure();
        line.connection = std::move(*opened);
        return {};
    });
}

void UploadLines::put(int number, const HostPath& local, const QString& remoteName) {
    const auto free = std::find_if(m_lines.begin(), m_lines.end(), [](const auto& line) {
        return line->does == Line::Does::Nothing && line->connection;
    });
    if (free == m_lines.end())
        return;
    Line& line = **free;
    line.does = Line::Does::Puts;
    line.number = number;
    begin(line, [&line, local, remoteName] { return line.connection->put(local, remoteName); });
}

bool UploadLines::canTake() const {
    return std::any_of(m_lines.begin(), m_lines.end(),
                       [](const auto& line) { return line->does == Line::Does::Nothing && line->connection; });
}

bool UploadLines::isPutting() const {
    return std::any_of(m_lines.begin(), m_lines.end(), [](const auto& line) { return line->does == Line::Does::Puts; });
}

bool UploadLines::isOpening() const {
    return std::any_of(m_lines.begin(), m_lines.end(),
                       [](const auto& line) { return line->does == Line::Does::Opens; });
}

std::optional<UploadLines::Ended> UploadLines::wait(std::chrono::milliseconds most) {
    Line* ended = nullptr;
    {
        std::unique_lock lock(m_calls->mutex);
        if (!m_calls->told.wait_for(lock, most, [this] { return !m_calls->ended.empty(); }))
            return std::nullopt;
        ended = m_calls->ended.front();
        m_calls->ended.pop_front();
    }
    Line& line = *ended;
    line.thread.join();
    if (std::exchange(line.does, Line::Does::Nothing) == Line::Does::Opens)
        return std::nullopt;
    Ended told{line.number, line.result, line.puts == 1};
    if (line.result) {
        ++line.puts;
        return told;
    }
    line.connection.reset();
    if (line.puts >= enoughPuts && !m_closed)
        open(line);
    return told;
}

std::unique_ptr<FtpConnection> UploadLines::takeOne() {
    for (const auto& line : m_lines) {
        if (line->does == Line::Does::Nothing && line->connection)
            return std::move(line->connection);
    }
    return nullptr;
}

} // namespace lumora
