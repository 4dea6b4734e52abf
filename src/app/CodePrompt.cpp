#include "app/CodePrompt.h"

#include "kiosk/StaffCode.h"

#include <array>
#include <cstdio>
#include <optional>

#include <termios.h>
#include <unistd.h>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// While it lives, a terminal does not show what is typed.
class NoEcho {
public:
    NoEcho() {
        m_isTerminal = ::tcgetattr(STDIN_FILENO, &m_before) == 0;
        if (!m_isTerminal)
            return;
        termios silent = m_before;
        silent.c_lflag &= ~static_cast<tcflag_t>(ECHO | ISIG); // an interrupt would leave the terminal silent
        m_isTerminal = ::tcsetattr(STDIN_FILENO, TCSAFLUSH, &silent) == 0;
    }
    ~NoEcho() {
        if (m_isTerminal)
            ::tcsetattr(STDIN_FILENO, TCSAFLUSH, &m_before);
    }
    NoEcho(const NoEcho&) = delete;
    NoEcho& operator=(const NoEcho&) = delete;

    bool isTerminal() const { return m_isTerminal; }

private:
    termios m_before{};
    bool m_isTerminal = false;
};

std::optional<QString> readLine() {
    std::array<char, 200> line{};
    if (!std::fgets(line.data(), static_cast<int>(line.size()), stdin))
        return std::nullopt;
    return QString::fromUtf8(line.data()).trimmed();
}

std::optional<QString> typedCode() {
    const NoEcho silent;
    const auto ask = [&](const char* words) {
        if (!silent.isTerminal())
            return readLine();
        std::fputs(words, stderr);
        const std::optional<QString> line = readLine();
        std::fputs("\n", stderr);
        return line;
    };
    const std::optional<QString> code = ask("The staff's code, 4 to 12 digits (they are not shown): ");
    if (code && silent.isTerminal() && IsStaffCode(*code) && ask("The same once more: ") != code) {
        std::fputs("lumora: the two codes are not the same.\n", stderr);
        return std::nullopt;
    }
    if (!code || !IsStaffCode(*code)) {
        std::fputs("lumora: a code has 4 to 12 digits.\n", stderr);
        return std::nullopt;
    }
    return code;
}

} // namespace

int promptForStaffCode() {
    const std::optional<QString> code = typedCode();
    if (!code)
        return 2;
    std::printf("Code = %s\n", qPrintable(NewStaffCodeLine(*code)));
    return 0;
}

} // namespace lumora
