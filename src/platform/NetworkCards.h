#pragma once

#include "platform/files/HostPath.h"

#include <QStringList>

namespace lumora {

// The permanent hardware addresses of the network cards that are built into this machine, sorted, as
// "52:54:00:12:34:56". Cards on a USB plug move from machine to machine and count only if there is no other card. Empty
// if no card has an address. devices: the kernel's folder with an entry for each card.
QStringList NetworkCards(const HostPath& devices = "/sys/class/net");

} // namespace lumora
