#include "platform/NetworkCards.h"

#include "common/HostFile.h"

#include <linux/ethtool.h>
#include <linux/sockios.h>
#include <net/if.h>
#include <sys/ioctl.h>
#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <fstream>
#include <new>
#include <string>

namespace lumora {
namespace {

namespace fs = std::filesystem;

constexpr int addressLength = 6; // bytes

// The address that the manufacturer gave the card: the present one may be random while a wireless card looks for
// networks.
QString permanentAddress(const std::string& card) {
    // Command and length, then room for the longest address.
    alignas(ethtool_perm_addr) std::array<char, sizeof(ethtool_perm_addr) + 32> room = {};
    auto* asked = new (room.data()) ethtool_perm_addr;
    asked->cmd = ETHTOOL_GPERMADDR;
    asked->size = 32;
    ifreq request = {};
    card.copy(request.ifr_name, sizeof(request.ifr_name) - 1);
    request.ifr_data = room.data();
    const Descriptor socket(::socket(AF_INET, SOCK_DGRAM | SOCK_CLOEXEC, 0));
    if (!socket.valid() || ::ioctl(socket.number(), SIOCETHTOOL, &request) != 0 || asked->size != addressLength)
        return {};
    return QString::fromLatin1(QByteArray(room.data() + sizeof(ethtool_perm_addr), addressLength).toHex(':'));
}

QString presentAddress(const HostPath& card) {
    std::ifstream file(card / "address");
    std::string line;
    std::getline(file, line);
    return QString::fromStdString(line).trimmed().toLower();
}

bool isNone(const QString& address) {
    return std::all_of(address.begin(), address.end(), [](QChar c) { return c == u'0' || c == u':'; });
}

} // namespace

QStringList NetworkCards(const HostPath& devices) {
    QStringList builtIn;
    QStringList plugged;
    std::error_code error;
    for (fs::directory_iterator at(devices, error), end; !error && at != end; at.increment(error)) {
        std::error_code none;
        const HostPath device = at->path() / "device";
        if (!fs::exists(device, none)) // bridges, tunnels and container interfaces have no hardware
            continue;
        QString address = permanentAddress(at->path().filename().native());
        if (isNone(address))
            address = presentAddress(at->path());
        if (isNone(address))
            continue;
        const HostPath bus = fs::canonical(device / "subsystem", none).filename();
        (bus == "usb" ? plugged : builtIn) += address;
    }
    QStringList& cards = builtIn.isEmpty() ? plugged : builtIn;
    cards.sort();
    return cards;
}

} // namespace lumora
