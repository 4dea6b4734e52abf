#pragma once

#include "common/TlsFault.h"

#include <QString>

#include <cassert>
#include <optional>
#include <utility>
#include <variant>

namespace lumora {

// What went wrong. The message is shown to a person and says what happened, to which file or server, and why; the kind
// is for the code that decides what follows.
struct Failure {
    enum class Kind {
        NotFound,
        AccessDenied,
        NoSpace,
        Damaged,  // the data is not what its format says
        TooLarge, // beyond a bound that is checked before memory is taken
        Unsupported,
        Refused,      // the other side answered no
        Disconnected, // no line, or the line was cut
        TimedOut,
        InUse,     // another program has it
        NoProgram, // a program of ours can't be started
        Other,
    };
    Kind kind = Kind::Other;
    QString message;
    bool passing = false;             // the other side has said that it may answer otherwise later
    std::optional<TlsFault> tls = {}; // why a line that was to be encrypted was refused
};

// A value or the failure that stands in its place.
template <class T>
class [[nodiscard]] Result {
public:
    Result(T value)
        : m_content(std::in_place_index<0>, std::move(value)) {}
    Result(Failure failure)
        : m_content(std::in_place_index<1>, std::move(failure)) {}

    bool ok() const { return m_content.index() == 0; }
    explicit operator bool() const { return ok(); }

    T& value() {
        assert(ok());
        return *std::get_if<0>(&m_content);
    }
    const T& value() const {
        assert(ok());
        return *std::get_if<0>(&m_content);
    }
    T& operator*() { return value(); }
    const T& operator*() const { return value(); }
    T* operator->() { return &value(); }
    const T* operator->() const { return &value(); }

    const Failure& failure() const {
        assert(!ok());
        return *std::get_if<1>(&m_content);
    }

private:
    std::variant<T, Failure> m_content;
};

template <>
class [[nodiscard]] Result<void> {
public:
    Result() = default;
    Result(Failure failure)
        : m_failure(std::move(failure)) {}

    bool ok() const { return !m_failure; }
    explicit operator bool() const { return ok(); }
    const Failure& failure() const {
        assert(!ok());
        return *m_failure;
    }

private:
    std::optional<Failure> m_failure;
};

} // namespace lumora
