// Stands in for lumora-door with a decoder that an attacker has taken over: it does what the name in its source's bytes
// says.

#include "door/DoorChild.h"

#include <fcntl.h>
#include <sys/mman.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <map>
#include <semaphore>
#include <string>
#include <vector>

using namespace lumora;

namespace {

volatile bool forEver = true;

void write(const char* bytes, std::size_t count) {
    if (::write(doorTargetNumber, bytes, count) < 0)
        _exit(1);
}

const std::map<std::string, void (*)()> deeds{
    {"loops",
     [] {
         while (forEver) {
         }
     }},
    {"waits", [] { std::binary_semaphore(0).acquire(); }},
    {"eats memory",
     [] {
         std::vector<std::vector<char>> eaten;
         while (forEver)
             eaten.emplace_back(1 << 20, 'x');
     }},
    {"writes a file", [] { ::close(::open("/tmp/door-was-here", O_CREAT | O_WRONLY, 0600)); }},
    {"reads a file", [] { ::close(::open("/etc/passwd", O_RDONLY)); }},
    {"opens the net", [] { ::close(::socket(AF_INET, SOCK_STREAM, 0)); }},
    {"begins a process",
     [] {
         if (::fork() == 0)
             _exit(0);
     }},
    {"begins a program", [] { ::execl("/bin/true", "true", nullptr); }},
    {"runs its own code", [] { ::mmap(nullptr, 4096, PROT_WRITE | PROT_EXEC, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0); }},
    {"says done", [] {}},
    {"says done of rubbish", [] { write("rubbish", 7); }},
    {"says done of half", [] { write("\xFF\xD8\xFF\xC0\0\x0B\x08\0\x08\0\x08\x01\x01\x11\0\xFF\xDA", 17); }},
};

} // namespace

int main(int argc, char** argv) {
    if (!limitDoorChild(argc, argv))
        return 1;
    std::string source(4096, '\0');
    source.resize(
        static_cast<std::size_t>(std::max<ssize_t>(0, ::pread(doorSourceNumber, source.data(), source.size(), 0))));
    if (!confineMyself())
        return 1;
    for (const auto& [name, deed] : deeds)
        if (source.ends_with('\n' + name))
            deed();
    _exit(0);
}
