// Stands in for lumora-door with a decoder that an attacker has taken over: it does what the name in its source's bytes
// says.

#include "door/Confinement.h"
#include "door/DoorChild.h"
#include "door/DoorStatus.h"

#include <fcntl.h>
#include <signal.h>
#include <sys/mman.h>
#include <sys/socket.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <map>
#include <semaphore>
#include <string>
#include <string_view>
#include <vector>

using namespace lumora;

namespace {

volatile bool forEver = true;
const pid_t parent = ::getppid();

void end(std::string_view bytes) {
    _exit(::write(doorTargetNumber, bytes.data(), bytes.size()) < 0 ? 1 : 0);
}

void loop() {
    while (forEver) {
    }
}

void eat() try {
    for (std::vector<std::vector<char>> eaten; forEver;)
        eaten.emplace_back(1 << 20, 'x');
} catch (const std::bad_alloc&) {
    _exit(static_cast<int>(DoorStatus::TooLarge));
}

const std::map<std::string, void (*)()> deeds{
    {"behaves", [] {}},
    {"loops", loop},
    {"waits", [] { std::binary_semaphore(0).acquire(); }},
    {"eats memory", eat},
    {"reads a file", [] { (void)::open("/etc/passwd", O_RDONLY); }},
    {"opens the net", [] { (void)::socket(AF_INET, SOCK_STREAM, 0); }},
    {"begins a process", [] { (void)::fork(); }},
    {"runs its own code", [] { ::mmap(nullptr, 4096, PROT_EXEC, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0); }},
    {"aborts", std::abort},
    {"aborts its parent", [] { ::syscall(SYS_tgkill, parent, parent, SIGABRT); }},
    {"says that it read nothing", [] { _exit(static_cast<int>(DoorStatus::NotRead)); }},
    {"says done of a PNG",
     [] {
         end({"\x89PNG\r\n\x1A\n\0\0\0\x0DIHDR\0\0\0\x08\0\0\0\x08\xFF\xD9", 26});
     }},
    {"says done of rubbish", [] { end("rubbish\xFF\xD9"); }},
    {"says done of half",
     [] {
         end({"\xFF\xD8\xFF\xC0\0\x0B\x08\0\x08\0\x08\x01\x01\x11\0\xFF\xDA", 17});
     }},
};

} // namespace

int main(int argc, char** argv) {
    if (!limitDoorChild(argc, argv))
        return 1;
    std::string source(4096, '\0');
    source.resize(
        static_cast<std::size_t>(std::max<ssize_t>(0, ::pread(doorSourceNumber, source.data(), source.size(), 0))));
    if (source.ends_with("\nis killed"))
        ::raise(SIGKILL);
    if (!enterSandbox())
        return 1;
    const std::size_t name = source.rfind('\n');
    deeds.at(source.substr(name + 1))();
    // Where it got away with that, it shows the picture that it carries.
    const std::size_t picture = source.find("\xFF\xD8\xFF");
    end(std::string_view(source).substr(picture, name - picture));
}
